// SPDX-License-Identifier: Apache-2.0
//
// Both roads are taken over one file in memory, four times: with a handler that refuses and one
// that goes on, with attributes and without. Compared are the answer, every report in its order,
// sections, symbols, the entry, the eight totals of sizes, and the attributes. Since the tool goes
// by tables and other users by the model, whatever differs here would make the tool say something
// else of an object than the library.

#include "tests/systematic/two_roads.h"

#include "alloclib/interface/session.h"
#include "elfext/interface/build_attributes.h"
#include "elfext/interface/error_handler.h"
#include "elfext/interface/object_module.h"
#include "elfext/interface/object_outline.h"
#include "elfext/interface/read_elf_file.h"
#include "support/interface/source_file.h"
#include "tests/support/memory_host.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <array>
#include <bit>
#include <cstring>
#include <vector>

namespace testsupport {

namespace {

using namespace elfext;

constexpr char ObjectName[] = "x.o";
// Of names that are ends of one long text there may be thousands.
constexpr size_t ComparedNameSize = 1000;

class Listener final : public ErrorHandler {
public:
  explicit Listener(bool goesOn) : m_GoesOn(goesOn) {}

  bool report(const ObjectModule& module, uint32_t section, const std::string& text) override {
    EXPECT_STREQ(module.getObjectName(), ObjectName);
    reports.push_back(std::to_string(section) + " " + text);
    return m_GoesOn && !hasOneAnswer(text);
  }

  std::vector<std::string> reports;

private:
  // To these the only answer is no; a foreign machine may pass.
  static bool hasOneAnswer(const std::string& text) {
    if (text.find("unsupported machine") != text.npos) return false;
    const std::array<const char*, 4> starts = {"I/O error", "Out of memory", "File is not",
                                               "ELF file has"};
    return std::any_of(starts.begin(), starts.end(),
                       [&text](const char* start) { return text.starts_with(start); });
  }

  bool m_GoesOn;
};

bool isSameName(const char* left, const char* right) {
  if (left == nullptr || right == nullptr) return left == right;
  return std::strncmp(left, right, ComparedNameSize) == 0;
}

void expectSameSections(const ObjectModule& module, const ObjectOutline& outline) {
  const std::vector<ObjectOutline::OutlinedSection> sections = outline.getSections();
  ASSERT_EQ(sections.size(), module.getSectionCount());
  for (uint32_t i = 0; i < module.getSectionCount(); ++i) {
    const Section& section = *module.getSection(i);
    const bool isSame = isSameName(section.getName(), sections[i].name) &&
                        section.getType() == sections[i].type &&
                        section.getFlags() == static_cast<uint32_t>(sections[i].flags);
    ASSERT_TRUE(isSame) << "section " << i;
  }
}

const char* sectionNameOf(const Symbol& symbol) {
  return symbol.getCategory() == Symbol::Category_Hosted
             ? symbol.getHostedSymbolSection()->getName()
             : nullptr;
}

void expectSameSymbols(const ObjectModule& module, ObjectOutline& outline) {
  const std::span<const ObjectOutline::OutlinedSymbol> symbols = outline.getSymbols();
  ASSERT_EQ(symbols.size(), module.getSymbols().size());
  for (size_t i = 0; i < symbols.size(); ++i) {
    const Symbol& symbol = *module.getSymbols()[i];
    const bool isSame = isSameName(symbol.getName(), symbols[i].name) &&
                        symbol.getCategory() == symbols[i].category &&
                        symbol.getBinding() == symbols[i].binding &&
                        isSameName(sectionNameOf(symbol), symbols[i].sectionName);
    ASSERT_TRUE(isSame) << "symbol " << i + 1;
  }
}

void expectSameAttributes(const ObjectModule& module, const ObjectOutline& outline) {
  const BuildAttributes* own = module.getOwnBuildAttributes();
  const FullAttr* outlined = outline.getOwnAttributes();
  ASSERT_EQ(own == nullptr, outlined == nullptr);
  const bool isSame = own == nullptr || own->getFullAttr() == *outlined;
  EXPECT_TRUE(isSame);
}

void expectSameSizes(ObjectModule& module, ObjectOutline& outline) {
  using Totals = std::array<uint64_t, 8>;
  const std::optional<SizesStatistics> sizes = outline.computeSizes();
  ASSERT_TRUE(sizes.has_value());
  EXPECT_EQ(std::bit_cast<Totals>(computeSizesStatistics(&module)), std::bit_cast<Totals>(*sizes));
}

void expectSame(const std::shared_ptr<support::SourceFile>& file, bool goesOn,
                bool wantsAttributes) {
  const auto size = static_cast<uint64_t>(file->getStatus().size);
  Listener modelListener(goesOn);
  Listener outlineListener(goesOn);
  ObjectModule module;
  module.setObjectName(ObjectName);
  module.setErrorHandler(&modelListener);
  ObjectOutline outline;
  const bool isRead = readElfFile(file, 0, size, module, nullptr);
  ASSERT_EQ(outline.read(file, 0, size, &outlineListener, ObjectName, wantsAttributes), isRead);
  ASSERT_EQ(outlineListener.reports, modelListener.reports);
  expectSameSections(module, outline);
  expectSameSymbols(module, outline);
  if (!isRead) return;
  EXPECT_EQ(outline.getEntry(), module.getEntry());
  expectSameSizes(module, outline);
  if (wantsAttributes) expectSameAttributes(module, outline);
}

} // namespace

void expectSameOnBothRoads(const std::string& object) {
  // Not longer: other tests of the program run the tool in a child that has a session of its own.
  const alloclib::Session session;
  MemoryHost host;
  host.addFile(ObjectName, object);
  support::SourceFiles files(host);
  std::shared_ptr<support::SourceFile> file;
  ASSERT_EQ(files.open(ObjectName, file), 0);
  for (const bool goesOn : {false, true}) {
    for (const bool wantsAttributes : {false, true}) {
      SCOPED_TRACE(std::string(goesOn ? "going on" : "refusing") +
                   (wantsAttributes ? " with attributes" : " without attributes"));
      expectSame(file, goesOn, wantsAttributes);
    }
  }
}

} // namespace testsupport
