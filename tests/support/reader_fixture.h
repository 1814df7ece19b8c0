// SPDX-License-Identifier: Apache-2.0
//
// Reads objects that a builder describes, and keeps what is reported of them: one fault in an
// otherwise good object, and the exact text that it costs. A fault is final, and reported alone
// whatever the handler answers, or mended, and then the object is there for who wants to go on.
// EachFormTest runs in both classes and byte orders.

#pragma once

#include "elfext/interface/auxiliary_sections.h"
#include "elfext/interface/elf_constants.h"
#include "elfext/interface/error_handler.h"
#include "elfext/interface/object_module.h"
#include "elfext/interface/read_elf_file.h"
#include "tests/support/memory_host.h"
#include "tests/support/object_builder.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <memory>
#include <string>
#include <string_view>
#include <vector>

namespace elfext {

using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;
using testing::SizeIs;
using testsupport::ElfClass;
using testsupport::ElfData;
using testsupport::HeaderField;
using testsupport::MemoryHost;
using testsupport::object;
using testsupport::ObjectBuilder;
using testsupport::SectionBuilder;

// Keeps all texts. Wants to go on or not, except where there is nothing to go on with.
class RecordingReports : public ErrorHandler {
public:
  explicit RecordingReports(bool goesOn) : m_GoesOn(goesOn) {}

  bool report(const ObjectModule&, uint32_t sectionIndex, const std::string& text) override {
    m_Texts.push_back(text);
    m_Sections.push_back(sectionIndex);
    return m_GoesOn;
  }

  bool outOfMemory(const ObjectModule& module) override {
    return refuse(ErrorHandler::outOfMemory(module));
  }
  bool ioErrorReading(const ObjectModule& module, int errorNumber) override {
    return refuse(ErrorHandler::ioErrorReading(module, errorNumber));
  }
  bool ioErrorWriting(const ObjectModule& module, int errorNumber) override {
    return refuse(ErrorHandler::ioErrorWriting(module, errorNumber));
  }
  bool unrecognisedFileType(const ObjectModule& module, uint32_t type) override {
    return refuse(ErrorHandler::unrecognisedFileType(module, type));
  }
  bool invalidDataEncoding(const ObjectModule& module, uint32_t encoding) override {
    return refuse(ErrorHandler::invalidDataEncoding(module, encoding));
  }
  bool unsupportedVersion(const ObjectModule& module, uint32_t version) override {
    return refuse(ErrorHandler::unsupportedVersion(module, version));
  }
  bool wrongMagic(const ObjectModule& module) override {
    return refuse(ErrorHandler::wrongMagic(module));
  }
  bool wrongClass(const ObjectModule& module) override {
    return refuse(ErrorHandler::wrongClass(module));
  }

  std::vector<std::string> m_Texts;
  std::vector<uint32_t> m_Sections;

private:
  static bool refuse(bool) { return false; }

  bool m_GoesOn;
};

// An object that was read, or not.
struct ReadResult {
  bool isRead = false;
  std::vector<std::string> reports;
  std::unique_ptr<ObjectModule> module;

  [[nodiscard]] Section* section(uint32_t index) const { return module->getSection(index); }
  [[nodiscard]] Symbol* symbol(uint32_t index) const { return module->getSymbol(index); }
};

// What a member that ends too soon is reported as.
extern const char* const Truncated;

class ReaderTest : public testing::Test {
protected:
  // As a member that is named "a.o", with a handler that refuses to go on, or that wants to.
  ReadResult read(const std::string& bytes);
  ReadResult read(const ObjectBuilder& file) { return read(file.bytes()); }
  ReadResult readOn(const std::string& bytes);
  ReadResult readOn(const ObjectBuilder& file) { return readOn(file.bytes()); }

  // The object reads without a report.
  ReadResult readGood(const std::string& bytes);
  ReadResult readGood(const ObjectBuilder& file) { return readGood(file.bytes()); }

  // The read fails with this text alone, whatever the handler answers.
  void expectFinal(const ObjectBuilder& file, const std::string& text);
  // The read fails with this text; a handler that wants to go on gets the object.
  ReadResult expectMended(const ObjectBuilder& file, const std::string& text);

  MemoryHost m_Host;

private:
  ReadResult readWith(const std::string& bytes, bool goesOn);
};

// For each class and byte order.
struct Form {
  ElfClass elfClass;
  ElfData data;

  [[nodiscard]] ObjectBuilder object() const { return {elfClass, data}; }
  [[nodiscard]] bool isWide() const { return elfClass == ElfClass::Class64; }
};

class EachFormTest : public ReaderTest, public testing::WithParamInterface<Form> {};

std::string formName(const testing::TestParamInfo<Form>& info);
extern const std::vector<Form> AllForms;

} // namespace elfext
