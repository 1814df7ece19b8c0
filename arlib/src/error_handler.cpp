// SPDX-License-Identifier: Apache-2.0
//
// The wording of failures for clients that only override `report`. Two texts have words run
// together ("witharchive", "nosymbol"); clients match them, so they stay.
#include "arlib/interface/error_handler.h"

#include "arlib/interface/archive.h"
#include "arlib/interface/archive_member.h"

#include <cstring>
#include <string>

namespace arlib {

namespace {

std::string number(uint64_t value) {
  return std::to_string(value);
}

std::string quoted(std::string_view text) {
  return "'" + std::string(text) + "'";
}

// "I/O error reading file 'x': reason"; the file's name and the reason are left out where unknown.
std::string hostFailure(const char* what, const char* fileName, int errorNumber) {
  std::string text = std::string("I/O error ") + what + " file";
  if (fileName != nullptr) text += " " + quoted(fileName);
  if (errorNumber != 0) text += std::string(": ") + support::hostErrorText(errorNumber);
  return text;
}

std::string atHeader(uint64_t offset) {
  return "Archive member header starting at offset " + number(offset);
}

std::string badField(uint64_t offset, const char* fieldName, std::string_view field) {
  return atHeader(offset) + " contains invalid " + fieldName + " string " + quoted(field);
}

// "archive member #3 'a.o'"
std::string indexed(const Archive& archive, const ArchiveMember& member) {
  return "archive member #" + number(archive.getMemberIndex(&member)) + " " +
         quoted(member.getName());
}

std::string symbolPlace(uint32_t index, std::string_view name, uint32_t offset) {
  return "Archive symbol table says symbol #" + number(index) + " " + quoted(name) +
         " is defined in the archive member starting at offset " + number(offset);
}

} // namespace

bool ErrorHandler::reportOutOfMemory(const Archive& archive) {
  return report(archive, Severity::Fatal, "Out of memory");
}

bool ErrorHandler::reportReadError(const Archive& archive, const char* fileName, int errorNumber) {
  return report(archive, Severity::Fatal, hostFailure("reading", fileName, errorNumber));
}

bool ErrorHandler::reportSeekError(const Archive& archive, const char* fileName, int errorNumber) {
  return report(archive, Severity::Fatal, hostFailure("seeking in", fileName, errorNumber));
}

bool ErrorHandler::reportCloseError(const Archive& archive, const char* fileName, int errorNumber) {
  return report(archive, Severity::Fatal, hostFailure("closing", fileName, errorNumber));
}

bool ErrorHandler::reportDeleteError(const Archive& archive, const char* fileName,
                                     int errorNumber) {
  return report(archive, Severity::Fatal, hostFailure("deleting", fileName, errorNumber));
}

bool ErrorHandler::reportWriteError(const Archive& archive, const char* fileName, int errorNumber) {
  return report(archive, Severity::Fatal, hostFailure("writing", fileName, errorNumber));
}

bool ErrorHandler::reportReadOnlyOutput(const Archive& archive, const char* fileName) {
  return report(archive, Severity::Fatal, "Output file " + quoted(fileName) + " is read-only");
}

bool ErrorHandler::reportBadArchiveMagic(const Archive& archive) {
  return report(archive, Severity::Fatal,
                "File does not begin with the archive magic number (not an archive file?)");
}

bool ErrorHandler::reportTruncatedMemberHeader(const Archive& archive, uint64_t offset) {
  return report(archive, Severity::Fatal,
                "End of file in the middle of archive member header starting at offset " +
                    number(offset));
}

bool ErrorHandler::reportBadDate(const Archive& archive, uint64_t offset, std::string_view field) {
  return report(archive, Severity::Doubtful, badField(offset, "date", field));
}

bool ErrorHandler::reportBadUid(const Archive& archive, uint64_t offset, std::string_view field) {
  return report(archive, Severity::Doubtful, badField(offset, "uid", field));
}

bool ErrorHandler::reportBadGid(const Archive& archive, uint64_t offset, std::string_view field) {
  return report(archive, Severity::Doubtful, badField(offset, "gid", field));
}

bool ErrorHandler::reportBadMode(const Archive& archive, uint64_t offset, std::string_view field) {
  return report(archive, Severity::Doubtful, badField(offset, "mode", field));
}

bool ErrorHandler::reportBadSize(const Archive& archive, uint64_t offset, std::string_view field) {
  return report(archive, Severity::Fatal, badField(offset, "size", field));
}

bool ErrorHandler::reportBadMemberMagic(const Archive& archive, uint64_t offset) {
  return report(archive, Severity::Fatal,
                atHeader(offset) + " contains incorrect archive-member magic number");
}

bool ErrorHandler::reportNoLongNameTable(const Archive& archive, uint64_t offset) {
  return report(archive, Severity::Partial,
                atHeader(offset) + " contains an index into the long name table, but this archive"
                                   " has no long name table");
}

bool ErrorHandler::reportBadLongNameIndex(const Archive& archive, uint64_t offset,
                                          std::string_view text) {
  return report(archive, Severity::Partial,
                atHeader(offset) + " contains invalid long-name index " + quoted(text));
}

bool ErrorHandler::reportLongNameIndexOutOfRange(const Archive& archive, uint64_t offset,
                                                 uint32_t index, uint32_t tableSize) {
  return report(archive, Severity::Partial,
                atHeader(offset) + " contains out-of-range long-name index " + number(index) +
                    " (the long-name table is " + number(tableSize) + " bytes long)");
}

bool ErrorHandler::reportNoNameTerminator(const Archive& archive, uint64_t offset) {
  return report(archive, Severity::Partial,
                atHeader(offset) + " has no '/' character in its name field");
}

bool ErrorHandler::reportTrailingNameCharacter(const Archive& archive, uint64_t offset) {
  return report(archive, Severity::Doubtful,
                atHeader(offset) + " has a trailing non-space character after the '/' character in"
                                   " its name field");
}

bool ErrorHandler::reportBadPadding(const Archive& archive, uint64_t offset, int value) {
  return report(archive, Severity::Doubtful,
                "Padding byte at offset " + number(offset) + " has value " + std::to_string(value) +
                    " and not 0x0A as it should be");
}

bool ErrorHandler::reportRegionOutsideFile(const Archive& archive, const char* fileName,
                                           std::optional<std::string_view> memberName,
                                           uint64_t offset, uint64_t size, uint64_t fileSize) {
  if (memberName) {
    return report(archive, Severity::Fatal,
                  "Error reading member " + quoted(*memberName) + ": archive member is at offset " +
                      number(offset) + " and has size " + number(size) +
                      " but archive file is only " + number(fileSize) + " bytes long");
  }
  return report(archive, Severity::Fatal,
                "Error reading region from file " + quoted(fileName) + " at offset " +
                    number(offset) + " with size " + number(size) + ": file is only " +
                    number(fileSize) + " bytes long");
}

bool ErrorHandler::reportSymbolTableTooShort(const Archive& archive, uint32_t size) {
  return report(archive, Severity::Fatal,
                "Archive symbol table is " + number(size) +
                    " bytes long, but should contain at least a 4-byte symbol count");
}

bool ErrorHandler::reportSymbolTableCountTooLarge(const Archive& archive, uint32_t size,
                                                  uint32_t count, uint64_t required) {
  return report(archive, Severity::Fatal,
                "Archive symbol table is " + number(size) + " bytes long, but claims to contain " +
                    number(count) + " symbols so it should be at least " + number(required) +
                    " bytes long");
}

bool ErrorHandler::reportSymbolNameUnterminated(const Archive& archive, uint32_t index,
                                                uint32_t count) {
  return report(archive, Severity::Fatal,
                "Archive symbol table ends in the middle of the name of symbol #" + number(index) +
                    " (out of " + number(count) + ")");
}

bool ErrorHandler::reportSymbolAtNoMember(const Archive& archive, uint32_t index,
                                          std::string_view name, uint32_t offset) {
  return report(archive, Severity::Partial,
                symbolPlace(index, name, offset) + " but no archive member starts there");
}

bool ErrorHandler::reportSymbolInNonObject(const Archive& archive, uint32_t index,
                                           std::string_view name, uint32_t offset) {
  return report(archive, Severity::Partial,
                symbolPlace(index, name, offset) + ", but that member is not an object file");
}

bool ErrorHandler::reportSymbolTableTrailingData(const Archive& archive, uint32_t offset,
                                                 uint32_t expectedEnd) {
  return report(archive, Severity::Doubtful,
                "Archive symbol table contains unexpected data at offset " + number(offset) +
                    ", after all the expected data has finished at offset " + number(expectedEnd));
}

bool ErrorHandler::reportUnreadableMemberSymbols(const Archive& archive,
                                                 const ArchiveMember& member,
                                                 std::string_view reason) {
  std::string text = "Unable to read symbols defined in " + indexed(archive, member);
  if (!reason.empty()) text += ": " + std::string(reason);
  return report(archive, Severity::Partial, text);
}

bool ErrorHandler::reportNoBaseVariant(const Archive& archive, MinorVariantGroup group) {
  return report(archive, Severity::Doubtful,
                "Minor variant group containing " + indexed(archive, *group.front()) +
                    " includes no base variant");
}

bool ErrorHandler::reportMultipleBaseVariants(const Archive& archive,
                                              MinorVariantGroup baseVariants) {
  return report(archive, Severity::Doubtful,
                "Minor variant group containing " + indexed(archive, *baseVariants.front()) +
                    " includes multiple base variants");
}

bool ErrorHandler::reportUndecoratableDifference(const Archive& archive,
                                                 const ArchiveMember& member,
                                                 MinorVariantGroup group) {
  return report(archive, Severity::Doubtful,
                "Member #" + number(archive.getMemberIndex(&member)) + " " +
                    quoted(member.getName()) + " of minor variant group beginning with" +
                    indexed(archive, *group.front()) +
                    " includes attribute(s) with nosymbol decoration representation");
}

bool ErrorHandler::reportCommonAttributesIncompatible(const Archive& archive,
                                                      MinorVariantGroup group,
                                                      const elfext::FullAttr&) {
  return report(archive, Severity::Doubtful,
                "Common attributes of minor variant group beginning with " +
                    indexed(archive, *group.front()) + " are incompatible with library attributes");
}

bool ErrorHandler::reportMemberAttributesIncompatible(const Archive& archive,
                                                      const ArchiveMember& member,
                                                      const elfext::FullAttr&) {
  return report(archive, Severity::Doubtful,
                "Attributes of minor variant member object " + quoted(member.getName()) +
                    " are incompatible with library attributes");
}

} // namespace arlib
