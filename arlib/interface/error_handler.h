// SPDX-License-Identifier: Apache-2.0
//
// How the archive library fails.
//
// The library prints nothing, throws nothing and ends nothing: for each kind of failure there is
// one operation here, and the library calls it at the moment it meets the failure, with the place
// and with what it found there. The answer is the client's decision, `err_response`:
//
//   true   carry on with the value that the failed step implies (the number is 0, the name is
//          empty, the entry is left out);
//   false  give up: the operation that met the failure returns false or null.
//
// Some failures leave nothing to carry on with (an unreadable file, a size that is no number). On
// those the handler must answer false, and the library asserts that it did. The library may also
// have no handler at all; it then fails in silence, as if the answer had been false.
//
// The base class words every failure and passes the text to
// `report` with a severity: 0 is fatal to the operation, 1 and 2 are tolerable. So a client that
// overrides `report` alone hears of everything.
#pragma once

#include <cstdint>
#include <optional>
#include <span>
#include <string_view>

namespace elfext {
struct FullAttr;
}

namespace arlib {

class Archive;
class ArchiveMember;

/// Members that are builds of one module, in file order; never empty. The first gives the group its
/// name.
using MinorVariantGroup = std::span<const ArchiveMember* const>;

enum class Severity : uint32_t {
  Fatal = 0,    ///< the operation can't go on
  Doubtful = 1, ///< a value is not what it should be
  Partial = 2,  ///< something is missing, the rest is usable
};

class ErrorHandler {
public:
  virtual ~ErrorHandler() = default;

  virtual bool report(const Archive& archive, Severity severity, std::string_view text) = 0;
  virtual bool reportOutOfMemory(const Archive& archive);

  /// Host failures. `fileName` may be null: the archive's own file. `errorNumber` 0 means that the
  /// host gave no reason (a file that ended too early).
  virtual bool reportReadError(const Archive& archive, const char* fileName, int errorNumber);
  virtual bool reportSeekError(const Archive& archive, const char* fileName, int errorNumber);
  virtual bool reportCloseError(const Archive& archive, const char* fileName, int errorNumber);
  virtual bool reportDeleteError(const Archive& archive, const char* fileName, int errorNumber);
  virtual bool reportWriteError(const Archive& archive, const char* fileName, int errorNumber);
  virtual bool reportReadOnlyOutput(const Archive& archive, const char* fileName);

  /// The file's format. `offset` is the file offset of the member's header, `field` the characters
  /// of a header field as they stand there.
  virtual bool reportBadArchiveMagic(const Archive& archive);
  virtual bool reportTruncatedMemberHeader(const Archive& archive, uint64_t offset);
  virtual bool reportBadDate(const Archive& archive, uint64_t offset, std::string_view field);
  virtual bool reportBadUid(const Archive& archive, uint64_t offset, std::string_view field);
  virtual bool reportBadGid(const Archive& archive, uint64_t offset, std::string_view field);
  virtual bool reportBadMode(const Archive& archive, uint64_t offset, std::string_view field);
  virtual bool reportBadSize(const Archive& archive, uint64_t offset, std::string_view field);
  virtual bool reportBadMemberMagic(const Archive& archive, uint64_t offset);
  virtual bool reportNoLongNameTable(const Archive& archive, uint64_t offset);
  virtual bool reportBadLongNameIndex(const Archive& archive, uint64_t offset,
                                      std::string_view text);
  virtual bool reportLongNameIndexOutOfRange(const Archive& archive, uint64_t offset,
                                             uint32_t index, uint32_t tableSize);
  virtual bool reportNoNameTerminator(const Archive& archive, uint64_t offset);
  virtual bool reportTrailingNameCharacter(const Archive& archive, uint64_t offset);
  /// `offset` is that of the padding byte; `value` is shown as a signed decimal.
  virtual bool reportBadPadding(const Archive& archive, uint64_t offset, int value);
  /// Without a `memberName` the region is no member. All numbers in bytes.
  virtual bool reportRegionOutsideFile(const Archive& archive, const char* fileName,
                                       std::optional<std::string_view> memberName, uint64_t offset,
                                       uint64_t size, uint64_t fileSize);

  /// The symbol table. `index` counts all entries from 0; positions are positions in its contents.
  virtual bool reportSymbolTableTooShort(const Archive& archive, uint32_t size);
  virtual bool reportSymbolTableCountTooLarge(const Archive& archive, uint32_t size, uint32_t count,
                                              uint64_t required);
  virtual bool reportSymbolNameUnterminated(const Archive& archive, uint32_t index, uint32_t count);
  virtual bool reportSymbolAtNoMember(const Archive& archive, uint32_t index, std::string_view name,
                                      uint32_t offset);
  virtual bool reportSymbolInNonObject(const Archive& archive, uint32_t index,
                                       std::string_view name, uint32_t offset);
  virtual bool reportSymbolTableTrailingData(const Archive& archive, uint32_t offset,
                                             uint32_t expectedEnd);

  /// What the members hold. An empty reason is left out of the text.
  virtual bool reportUnreadableMemberSymbols(const Archive& archive, const ArchiveMember& member,
                                             std::string_view reason);

  /// Minor variants. With several base variants, `baseVariants` are those alone.
  virtual bool reportNoBaseVariant(const Archive& archive, MinorVariantGroup group);
  virtual bool reportMultipleBaseVariants(const Archive& archive, MinorVariantGroup baseVariants);
  virtual bool reportUndecoratableDifference(const Archive& archive, const ArchiveMember& member,
                                             MinorVariantGroup group);
  virtual bool reportCommonAttributesIncompatible(const Archive& archive, MinorVariantGroup group,
                                                  const elfext::FullAttr& attributes);
  virtual bool reportMemberAttributesIncompatible(const Archive& archive,
                                                  const ArchiveMember& member,
                                                  const elfext::FullAttr& attributes);
};

} // namespace arlib
