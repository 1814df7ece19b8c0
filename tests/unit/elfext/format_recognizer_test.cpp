// SPDX-License-Identifier: Apache-2.0
//
// Which bytes are an ELF image: class, byte order, magic and a whole header, in memory and in
// files. The answer decides what a member is, so the odd forms that count as images are held as
// well as those that don't.

#include "elfext/interface/format_recognizer.h"

#include "tests/support/bytes.h"
#include "tests/support/faulty_host.h"
#include "tests/support/memory_host.h"
#include "tests/support/object_builder.h"

#include <gtest/gtest.h>

#include <cerrno>
#include <string>

namespace elfext {

namespace {

using testsupport::ElfClass;
using testsupport::ElfData;
using testsupport::FaultyHost;
using testsupport::MemoryHost;
using testsupport::object;

bool isElf(std::string_view bytes) {
  return isElfData(testsupport::bytesOf(bytes));
}

} // namespace

TEST(FormatRecognizer, TakesBothClassesAndByteOrders) {
  for (const ElfClass elfClass : {ElfClass::Class32, ElfClass::Class64}) {
    for (const ElfData data : {ElfData::Little, ElfData::Big})
      EXPECT_TRUE(isElf(object(elfClass, data).bytes()));
  }
}

TEST(FormatRecognizer, LeavesTheRestOfTheHeaderToTheReader) {
  EXPECT_TRUE(isElf(object().machine(3).bytes()));
  EXPECT_TRUE(isElf(object().type(0).bytes()));
  EXPECT_TRUE(isElf(object().byteAt(5, 0).bytes()));               // EI_DATA
  EXPECT_TRUE(isElf(object().byteAt(6, 9).byteAt(20, 9).bytes())); // the two versions
}

TEST(FormatRecognizer, WantsAWholeHeader) {
  const std::string narrow = object(ElfClass::Class32).bytes();
  const std::string wide = object(ElfClass::Class64).bytes();
  for (size_t size = 0; size <= narrow.size(); ++size)
    EXPECT_EQ(isElf(narrow.substr(0, size)), size >= 52) << size;
  for (size_t size = 0; size <= wide.size(); ++size)
    EXPECT_EQ(isElf(wide.substr(0, size)), size >= 64) << size;
}

TEST(FormatRecognizer, WantsTheMagicOnThe32BitPath) {
  for (const uint8_t place : {uint8_t{0}, uint8_t{1}, uint8_t{2}, uint8_t{3}})
    EXPECT_FALSE(isElf(object().byteAt(place, 'x').tail(std::string(100, 0)).bytes()));
}

TEST(FormatRecognizer, TakesNoOtherMagicOnThe32BitPath) {
  const auto scrambled = object().byteAt(0, 0xF7).byteAt(1, 0x4F).byteAt(2, 0x52).byteAt(3, 0x43);
  EXPECT_FALSE(isElf(scrambled.bytes() + std::string(60, '\0')));
}

TEST(FormatRecognizer, WantsClassOneOnThe32BitPath) {
  for (int elfClass = 0; elfClass < 256; ++elfClass) {
    const bool expected = elfClass == 1 || elfClass == 2;
    const auto image = object(ElfClass::Class64).byteAt(4, static_cast<uint8_t>(elfClass));
    EXPECT_EQ(isElf(image.bytes()), expected) << elfClass;
  }
}

TEST(FormatRecognizer, LooksAtNothingButTheClassOnThe64BitPath) {
  std::string text(64, 'x');
  text[4] = '\2';
  EXPECT_TRUE(isElf(text));
  EXPECT_FALSE(isElf(text.substr(1)));
  EXPECT_FALSE(isElf(text.substr(0, 63)));
}

TEST(FormatRecognizer, TakesFilesAndPiecesOfFiles) {
  MemoryHost host;
  const std::string image = object(ElfClass::Class64).bytes();
  host.addFile("image", image);
  host.addFile("text", std::string(100, 'x'));
  host.addFile("empty", "");
  host.addFile("inside", "...." + image + "....");
  EXPECT_TRUE(isElfFile(host, "image"));
  EXPECT_FALSE(isElfFile(host, "text"));
  EXPECT_FALSE(isElfFile(host, "empty"));
  EXPECT_FALSE(isElfFile(host, "inside"));
  EXPECT_TRUE(isElfFile(host, "inside", 4, 64));
  EXPECT_FALSE(isElfFile(host, "inside", 4, 63));
  EXPECT_FALSE(isElfFile(host, "inside", 3, 64));
  EXPECT_FALSE(isElfFile(host, "inside", 100, 64));
  EXPECT_FALSE(isElfFile(host, "image", 0, 0));
  EXPECT_EQ(host.openHandles(), 0u);
}

TEST(FormatRecognizer, TakesOpenFilesAndLeavesThemOpen) {
  MemoryHost host;
  host.addFile("inside", "...." + object().bytes());
  host.addFile("image", object().bytes());
  support::FileHandle file;
  ASSERT_EQ(host.openForReading("inside", file), 0);
  EXPECT_FALSE(isElfFile(host, file));
  EXPECT_TRUE(isElfFile(host, file, 4, 52));
  EXPECT_EQ(host.close(file), 0);
  ASSERT_EQ(host.openForReading("image", file), 0);
  EXPECT_TRUE(isElfFile(host, file));
  EXPECT_EQ(host.openHandles(), 1u);
  EXPECT_EQ(host.close(file), 0);
}

TEST(FormatRecognizer, TakesNoFileOfFourGigabytes) {
  MemoryHost host;
  host.addFile("image", object().bytes()).toldSize = 0xFFFFFFFE;
  EXPECT_TRUE(isElfFile(host, "image"));
  host.at("image").toldSize = 0xFFFFFFFF;
  EXPECT_FALSE(isElfFile(host, "image"));
}

TEST(FormatRecognizer, TakesNothingThatCannotBeRead) {
  MemoryHost disk;
  disk.addFile("image", object().bytes());
  FaultyHost host(disk);
  EXPECT_FALSE(isElfFile(host, "gone"));
  EXPECT_FALSE(isElfFile(host, "gone", 0, 52));
  for (uint64_t call = 1; call <= 4; ++call) {
    host.failCall(call, EIO);
    EXPECT_FALSE(isElfFile(host, "image")) << call;
  }
  for (uint64_t call = 1; call <= 3; ++call) {
    host.failCall(call, EIO);
    EXPECT_FALSE(isElfFile(host, "image", 0, 52)) << call;
  }
  EXPECT_EQ(disk.openHandles(), 0u);
}

} // namespace elfext
