// SPDX-License-Identifier: Apache-2.0
//
// The object is read as a member from the middle of a file, between other bytes, so that a read
// beyond its ends gives rubbish and not an error. Each failed read must leave an empty module; the
// tests of one fault read twice, with a handler that refuses and one that goes on, since both
// answers are part of the promise.

#include "tests/support/reader_fixture.h"

namespace elfext {

const char* const Truncated = "I/O error writing file 'a.o': Unknown error -1";

const std::vector<Form> AllForms = {{ElfClass::Class32, ElfData::Little},
                                    {ElfClass::Class32, ElfData::Big},
                                    {ElfClass::Class64, ElfData::Little},
                                    {ElfClass::Class64, ElfData::Big}};

std::string formName(const testing::TestParamInfo<Form>& info) {
  return std::string(info.param.isWide() ? "Class64" : "Class32") +
         (info.param.data == ElfData::Little ? "Little" : "Big");
}

// Bytes around the object show at once when a read goes beyond it.
ReadResult ReaderTest::readWith(const std::string& bytes, bool goesOn) {
  m_Host.addFile("lib.a", "<<" + bytes + std::string(100, '\xFF'));
  RecordingReports reports(goesOn);
  ReadResult result;
  result.module = std::make_unique<ObjectModule>();
  result.module->setObjectName("a.o");
  result.module->setErrorHandler(&reports);
  result.isRead = readElfFile(m_Host, "lib.a", 2, bytes.size(), *result.module, nullptr);
  result.module->setErrorHandler(nullptr);
  result.reports = reports.m_Texts;
  EXPECT_TRUE(result.isRead || result.module->isEmpty());
  return result;
}

ReadResult ReaderTest::read(const std::string& bytes) {
  return readWith(bytes, false);
}

ReadResult ReaderTest::readOn(const std::string& bytes) {
  return readWith(bytes, true);
}

ReadResult ReaderTest::readGood(const std::string& bytes) {
  ReadResult result = read(bytes);
  EXPECT_TRUE(result.isRead);
  EXPECT_THAT(result.reports, IsEmpty());
  return result;
}

void ReaderTest::expectFinal(const ObjectBuilder& file, const std::string& text) {
  const ReadResult refused = read(file);
  EXPECT_FALSE(refused.isRead);
  EXPECT_THAT(refused.reports, ElementsAre(text));
  const ReadResult accepted = readOn(file);
  EXPECT_FALSE(accepted.isRead);
  EXPECT_THAT(accepted.reports, ElementsAre(text));
}

ReadResult ReaderTest::expectMended(const ObjectBuilder& file, const std::string& text) {
  const ReadResult refused = read(file);
  EXPECT_FALSE(refused.isRead);
  EXPECT_THAT(refused.reports, ElementsAre(text));
  ReadResult accepted = readOn(file);
  EXPECT_TRUE(accepted.isRead);
  EXPECT_THAT(accepted.reports, ElementsAre(text));
  return accepted;
}

} // namespace elfext
