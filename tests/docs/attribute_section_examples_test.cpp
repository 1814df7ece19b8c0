// SPDX-License-Identifier: Apache-2.0
//
// The attribute sections and decoration symbols of docs/formats.md, as the object library reads
// them: byte for byte in both byte orders, the table of tags, and what a whole object comes to
// whose sections or symbols say it. The test writes the document's text from what was found, and
// compares.

#include "elfext/interface/attribute_string.h"
#include "elfext/interface/build_attributes_names.h"
#include "elfext/interface/build_attributes_parsers.h"
#include "tests/docs/document.h"
#include "tests/support/attribute_bytes.h"
#include "tests/support/reader_fixture.h"

#include <sstream>

namespace documents {
namespace {

using elfext::AttributeBytes;

std::string numbered(const char* word, uint32_t number) {
  return word + (" " + std::to_string(number));
}

// ---- Byte for byte

// Tells of each attribute in a run, in the bytes that a writer gives it.
class QobixTeller final : public elfext::QobixBuildAttributesSubSubsectionParser {
public:
  explicit QobixTeller(DumpWriter& dump) : m_Dump(dump) {}

  bool numericTag(uint32_t tag, uint32_t value) override {
    return tell(testsupport::tag(tag, value), tag, std::to_string(value));
  }
  bool stringTag(uint32_t tag, std::string_view text) override {
    return tell(testsupport::tag(tag, text), tag, inQuotes(text));
  }
  bool numericAndStringTag(uint32_t tag, uint32_t value, std::string_view text) override {
    return tell(testsupport::tag(tag, value, text), tag,
                std::to_string(value) + ", " + inQuotes(text));
  }
  bool nestedNumericTag(uint32_t tag, uint32_t value) override {
    const std::string nested = testsupport::tag(tag, value) + std::string(value == 0 ? 0 : 1, '\0');
    return tellNested(nested, tag, std::to_string(value));
  }
  bool nestedStringTag(uint32_t tag, std::string_view text) override {
    return tellNested(testsupport::tag(tag, text), tag, inQuotes(text));
  }

private:
  bool tell(const std::string& bytes, uint32_t tag, const std::string& value) {
    m_Dump.tell(bytes.size(), elfext::getQobixTagName(tag) + ": " + value);
    return true;
  }
  bool tellNested(const std::string& nested, uint32_t tag, const std::string& value) {
    const std::string bytes = testsupport::uleb(elfext::Tag_also_compatible_with) + nested;
    return tell(bytes, elfext::Tag_also_compatible_with,
                elfext::getQobixTagName(tag) + ": " + value);
  }

  DumpWriter& m_Dump;
};

class ZevTeller final : public elfext::ZevBuildAttributesSubSubsectionParser {
public:
  explicit ZevTeller(DumpWriter& dump) : m_Dump(dump) {}

  bool numericTag(uint32_t tag, uint32_t value) override {
    m_Dump.tell(testsupport::tag(tag, value).size(),
                elfext::getZevTagName(tag) + ": " + std::to_string(value));
    return true;
  }

private:
  DumpWriter& m_Dump;
};

class SectionTeller final : public elfext::BuildAttributesSectionParser {
public:
  SectionTeller(std::string_view bytes, bool isLittle) : m_Dump(bytes), m_IsLittle(isLittle) {
    m_Dump.tell(1, "format version: \"A\"");
  }

  bool parseFileSubSubsection(std::string_view vendor, AttributeBytes run) override {
    return tell(vendor, "kind 1: the object", nullptr, {}, run);
  }
  bool parseSectionSubSubsection(std::string_view vendor, std::span<const uint32_t> indices,
                                 AttributeBytes run) override {
    return tell(vendor, "kind 2: sections", "section", indices, run);
  }
  bool parseSymbolSubSubsection(std::string_view vendor, std::span<const uint32_t> indices,
                                AttributeBytes run) override {
    return tell(vendor, "kind 3: symbols", "symbol", indices, run);
  }

  [[nodiscard]] const DumpWriter& dump() const { return m_Dump; }

private:
  // The reader hands over what it found between the lengths; these are looked at here.
  void tellLength(const char* word) {
    uint32_t length = 0;
    for (uint32_t i = 0; i < 4; ++i)
      length |= uint32_t{static_cast<uint8_t>(m_Dump.rest()[m_IsLittle ? i : 3 - i])} << 8 * i;
    m_Dump.tell(4, numbered(word, length));
  }

  void tellVendor(std::string_view vendor) {
    if (m_Vendor == vendor.data()) return;
    m_Vendor = vendor.data();
    tellLength("length of the subsection:");
    m_Dump.tell(vendor.size() + 1, "vendor: " + inQuotes(vendor));
  }

  void tellRun(std::string_view vendor, AttributeBytes run) {
    if (vendor == elfext::QobixVendor)
      EXPECT_TRUE(QobixTeller(m_Dump).parse(run));
    else if (vendor == elfext::ZevVendor)
      EXPECT_TRUE(ZevTeller(m_Dump).parse(run));
    else
      m_Dump.tell(run.size(), "in the vendor's own form: " + inQuotes(testsupport::textOf(run)));
  }

  bool tell(std::string_view vendor, const char* kind, const char* indexWord,
            std::span<const uint32_t> indices, AttributeBytes run) {
    tellVendor(vendor);
    m_Dump.tell(1, kind);
    tellLength("size:");
    for (const uint32_t index : indices)
      m_Dump.tell(testsupport::uleb(index).size(), numbered(indexWord, index));
    if (indexWord != nullptr) m_Dump.tell(1, "end of the indices");
    tellRun(vendor, run);
    return true;
  }

  DumpWriter m_Dump;
  bool m_IsLittle;
  const char* m_Vendor = nullptr;
};

void expectToldAsIn(const std::string& dump, bool isLittle) {
  const std::string bytes = bytesOfDump(dump);
  SectionTeller teller(bytes, isLittle);
  EXPECT_TRUE(teller.parse(testsupport::bytesOf(bytes), isLittle));
  EXPECT_EQ(teller.dump().rest(), "");
  EXPECT_EQ(teller.dump().text(), dump);
}

TEST(FormatsDocument, TellsOfEachByteOfAnAttributeSection) {
  expectToldAsIn(example("attribute-section"), true);
}

TEST(FormatsDocument, TellsOfEachByteOfABigEndianAttributeSection) {
  expectToldAsIn(example("attribute-section-big-endian"), false);
}

std::string formOf(uint32_t tag) {
  using Classifier = elfext::BuildAttributesTagClassifier;
  if (Classifier::isQobixNumericAndStringTag(tag)) return "number and text";
  return Classifier::isQobixNumericTag(tag) ? "number" : "text";
}

std::string tagLine(std::string_view vendor, uint32_t tag, std::string_view name,
                    std::string_view form) {
  const std::string number = std::to_string(tag);
  return padded(vendor, 6) + std::string(3 - number.size(), ' ') + number + "  " +
         padded(name, 31) + std::string(form) + "\n";
}

TEST(FormatsDocument, ListsTheTags) {
  constexpr uint32_t TagLimit = 128;
  std::string lines;
  for (uint32_t tag = elfext::FirstAttributeTag; tag < TagLimit; ++tag) {
    const std::string name = elfext::getQobixTagName(tag);
    if (name.starts_with("Tag_"))
      lines +=
          tagLine(elfext::QobixVendor, tag, name,
                  tag == elfext::Tag_also_compatible_with ? "text: an attribute" : formOf(tag));
  }
  for (uint32_t tag = elfext::FirstAttributeTag; tag < TagLimit; ++tag) {
    const std::string name = elfext::getZevTagName(tag);
    if (name.starts_with("Tag_")) lines += tagLine(elfext::ZevVendor, tag, name, "number");
  }
  EXPECT_EQ(lines, example("attribute-tags"));
}

// ---- In an object

class FormatsDocumentObject : public elfext::ReaderTest {
protected:
  // Sections 1 and 4 are code.
  static elfext::ObjectBuilder objectWith(std::vector<testsupport::SymbolSpec> symbols) {
    for (testsupport::SymbolSpec& symbol : symbols)
      symbol.binding = elfext::STB_LOCAL;
    elfext::ObjectBuilder file = testsupport::objectWithSymbols(symbols);
    file.section(".fast", elfext::SHT_PROGBITS).flags(elfext::SHF_ALLOC).zeros(8);
    return file;
  }

  // What an object has of its own, and what holds for it.
  static std::string ownTextOf(const elfext::ObjectWithBuildAttributes& object) {
    const elfext::BuildAttributes* own = object.getOwnBuildAttributes();
    return own == nullptr ? "none" : elfext::printAttributeString(own->getFullAttr());
  }
  static std::string textOf(const elfext::ObjectWithBuildAttributes& object) {
    elfext::BuildAttributes attributes;
    object.getEffectiveBuildAttributes(attributes);
    return elfext::printAttributeString(attributes.getFullAttr());
  }

  // The texts of the object, of both sections of code and of the first symbols.
  template <class Text>
  std::string toldOf(const elfext::ObjectBuilder& file, Text text) {
    const elfext::ReadResult result = readGood(file);
    std::string lines = "object     " + text(*result.module) + "\n";
    for (const uint32_t index : {1U, 4U})
      lines += numbered("section", index) + "  " + text(*result.section(index)) + "\n";
    for (const uint32_t index : {1U, 2U})
      lines += numbered("symbol", index) + "   " + text(*result.symbol(index)) + "\n";
    return lines;
  }
};

TEST_F(FormatsDocumentObject, SaysWhatAnAttributeSectionComesTo) {
  elfext::ObjectBuilder file =
      objectWith({{.name = "first", .section = 1}, {.name = "second", .section = 4}});
  file.section(".ZEV.attributes", elfext::SHT_ZEV_ATTRIBUTES)
      .bytes(bytesOfDump(example("attribute-section")));
  EXPECT_EQ(toldOf(file, textOf), example("attributes-of-the-section"));
}

// A line is the index of the symbol's section, "absolute" or not, and its name.
testsupport::SymbolSpec symbolOf(const std::string& line) {
  std::istringstream words(line);
  std::string section;
  std::string name;
  words >> section >> name;
  return {.name = name,
          .section = section == "absolute" ? uint16_t{elfext::SHN_ABS}
                                           : static_cast<uint16_t>(std::stoi(section))};
}

TEST_F(FormatsDocumentObject, SaysWhatDecorationSymbolsComeTo) {
  std::vector<testsupport::SymbolSpec> symbols;
  for (const std::string& line : linesOf(example("decoration-symbols")))
    symbols.push_back(symbolOf(line));
  EXPECT_EQ(toldOf(objectWith(symbols), ownTextOf), example("attributes-of-the-symbols"));
}

} // namespace
} // namespace documents
