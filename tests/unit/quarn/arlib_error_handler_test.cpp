// SPDX-License-Identifier: Apache-2.0
//
// What the archive library's failures read like to the user, as far as no command leads to them.
// With the user's leave each clash is listed; without it the warnings stand alone.

#include "quarn/arlib_error_handler.h"

#include "arlib/interface/archive.h"
#include "elfext/interface/attribute_string.h"
#include "messages/interface/catalogue.h"
#include "tests/support/memory_host.h"
#include "tests/support/messages_fixture.h"

#include <cerrno>
#include <vector>

namespace quarn {

namespace {

class ArlibErrorHandlerTest : public messages::MessagesTest {
protected:
  void SetUp() override {
    MessagesTest::SetUp();
    for (const char* name : {"a.o", "b.o"})
      m_Members.push_back(m_Archive.addMember(name, 0, 0, 0, 0));
  }

  testsupport::MemoryHost m_Host;
  arlib::Archive m_Archive{m_Host};
  std::vector<const arlib::ArchiveMember*> m_Members;
};

} // namespace

TEST_F(ArlibErrorHandlerTest, TellsWhatClashesInTheAttributesOfAGroup) {
  const elfext::FullAttr attributes = elfext::parseAttributeString(
      "$ZEV_ISAv4$M_PROFILE$KRL_ISAv3M$HFUv1$PE$ME$A:L44UL41$IEEE1$STKCKD$~STKCKD$EBA4$EBA8");
  ArlibErrorHandler(true).reportCommonAttributesClash(m_Archive, m_Members, attributes);
  EXPECT_EQ(getErrorText(),
            "Warning: L6878W: Common attributes of minor variant group beginning with 'a.o' are "
            "incompatible with library attributes.\n"
            " * pure-endian double clashes with mixed-endian double\n\n"
            " * zev-isa clashes with m-profile\n\n"
            " * stack-checked clashes with not-stack-checked\n\n"
            " * require 4-byte alignment of 8-byte datatypes clashes with require 8-byte alignment "
            "of 8-byte datatypes\n\n");
}

TEST_F(ArlibErrorHandlerTest, TellsWhatClashesInThoseOfAMember) {
  const elfext::FullAttr attributes = elfext::parseAttributeString("$KCPv3$HFUi1$A:L84UL41$IEEE1");
  EXPECT_TRUE(
      ArlibErrorHandler(true).reportMemberAttributesClash(m_Archive, *m_Members[1], attributes));
  EXPECT_EQ(getErrorText(), "Warning: L6879W: Attributes of minor variant member object 'b.o' are "
                            "incompatible with library attributes.\n"
                            " * KCP clashes with HFU\n\n"
                            " * L/S clashes with UL/US\n\n");
}

TEST_F(ArlibErrorHandlerTest, KeepsTheClashesToItselfUnlessAsked) {
  const elfext::FullAttr attributes = elfext::parseAttributeString("$IEEE1$STKCKD$~STKCKD");
  EXPECT_TRUE(
      ArlibErrorHandler(false).reportCommonAttributesClash(m_Archive, m_Members, attributes));
  EXPECT_TRUE(
      ArlibErrorHandler(false).reportMemberAttributesClash(m_Archive, *m_Members[0], attributes));
  EXPECT_EQ(getErrorText(),
            "Warning: L6878W: Common attributes of minor variant group beginning with "
            "'a.o' are incompatible with library attributes.\n"
            "Warning: L6879W: Attributes of minor variant member object 'a.o' are "
            "incompatible with library attributes.\n");
}

TEST_F(ArlibErrorHandlerTest, TellsOfAPlaceInAFileThatCannotBeReached) {
  m_Archive.setFileName("lib.a");
  EXPECT_FALSE(ArlibErrorHandler(false).reportSeekError(m_Archive, "a.o", EINVAL));
  EXPECT_EQ(getErrorText(), "Error: L6976E: Seeking in file 'lib.a' : Invalid argument\n");
}

// The run ends there: what is missing would be missing in what it does next.
TEST_F(ArlibErrorHandlerTest, EndsTheRunWithoutMemory) {
  EXPECT_EQ(statusOf([this] { ArlibErrorHandler(false).reportOutOfMemory(m_Archive); }), 1);
  EXPECT_EQ(getErrorText(), "Fatal error: L6800U: Out of memory\n");
}

} // namespace quarn
