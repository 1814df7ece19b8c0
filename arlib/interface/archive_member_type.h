// SPDX-License-Identifier: Apache-2.0
//
// What kind of thing a member's bytes are, and how an object member tells its symbols without the
// archive knowing the object format. The types hold no data: each has one object in the process,
// and a member's type is compared by the address of that object.
#pragma once

#include "arlib/interface/symbol_name_list.h"
#include "elfext/interface/attribute_text_cache.h"
#include "elfext/interface/error_string_capture.h"
#include "elfext/interface/full_attr.h"
#include "elfext/interface/object_outline.h"

#include <cstdint>
#include <optional>
#include <span>
#include <string>

namespace arlib {

class ArchiveMember;

/// What decoration texts say: members of a library have thousands of them, of which few differ.
using AttributeRecords = elfext::AttributeTextCache<elfext::FullAttr>;

/// What serves all objects that are read one after the other, for one is like the next. It ends
/// with the last of them; the records may go on. What was read last may be asked for more: what
/// goes wrong then is told to `failure`, too.
struct ObjectReading {
  AttributeRecords& records;
  elfext::ElfextErrorStringCapture failure = {};
  elfext::ObjectOutline outline = {};
};

class ArchiveMemberType {
public:
  ArchiveMemberType() = default;
  ArchiveMemberType(const ArchiveMemberType&) = delete;
  ArchiveMemberType& operator=(const ArchiveMemberType&) = delete;
  virtual ~ArchiveMemberType() = default;

  [[nodiscard]] virtual bool isObjectModule() const { return false; }
  /// By the bytes. False, after a report, also if the host can't give them.
  [[nodiscard]] virtual bool isElfImage(const ArchiveMember*) const { return false; }
  [[nodiscard]] virtual bool isAuxiliaryType() const = 0;

  /// The one rule that decides a member's type: an ELF image by the test of its bytes, or unknown.
  /// The auxiliary types are set by the reader and by the rebuild of the tables alone. Null, after
  /// a report, if the host can't give the bytes.
  [[nodiscard]] static const ArchiveMemberType* decide(const ArchiveMember* archiveMember);

  /// The same rule for a caller that has the first elfext::RecognizedBytes at hand.
  [[nodiscard]] static const ArchiveMemberType* decide(std::span<const uint8_t> firstBytes);
};

/// Any file that the archive can't look into.
class UnknownArchiveMemberType final : public ArchiveMemberType {
public:
  [[nodiscard]] static const UnknownArchiveMemberType* getInstance();
  [[nodiscard]] bool isAuxiliaryType() const override { return false; }
};

class SymbolTableArchiveMemberType final : public ArchiveMemberType {
public:
  [[nodiscard]] static const SymbolTableArchiveMemberType* getInstance();
  [[nodiscard]] bool isAuxiliaryType() const override { return true; }
};

class FileNameTableArchiveMemberType final : public ArchiveMemberType {
public:
  [[nodiscard]] static const FileNameTableArchiveMemberType* getInstance();
  [[nodiscard]] bool isAuxiliaryType() const override { return true; }
};

/// An object whose symbols the symbol table publishes.
class ObjectModuleArchiveMemberType : public ArchiveMemberType {
public:
  [[nodiscard]] bool isObjectModule() const override { return true; }
  [[nodiscard]] bool isAuxiliaryType() const override { return false; }

  /// Fills `names` with what the symbol table should hold for this member. False if the object
  /// can't be read; `reason` then says why, or is empty if that has been reported already.
  virtual bool getSymbolNames(ArchiveMember* archiveMember, SymbolNameList& names,
                              std::string& reason) const = 0;

  /// What the member needs of its target: as its decoration symbols say, or with
  /// `useObjectAttributes` what the object as a whole has. False if the object can't be read, or
  /// says nothing; the handler hears only of what the host could not do.
  virtual bool getBuildAttributes(ArchiveMember* archiveMember, elfext::FullAttr& attributes,
                                  bool useObjectAttributes) const = 0;

  /// Both at the cost of one read, as the archive wants its objects' attributes. Without attributes
  /// the object says nothing.
  virtual bool getPublished(ArchiveMember* archiveMember, ObjectReading& reading,
                            SymbolNameList& names, std::optional<elfext::FullAttr>& attributes,
                            std::string& reason) const = 0;
};

class ElfImageArchiveMemberType final : public ObjectModuleArchiveMemberType {
public:
  [[nodiscard]] static const ElfImageArchiveMemberType* getInstance();
  [[nodiscard]] bool isElfImage(const ArchiveMember* archiveMember) const override;
  bool getSymbolNames(ArchiveMember* archiveMember, SymbolNameList& names,
                      std::string& reason) const override;
  bool getBuildAttributes(ArchiveMember* archiveMember, elfext::FullAttr& attributes,
                          bool useObjectAttributes) const override;
  bool getPublished(ArchiveMember* archiveMember, ObjectReading& reading, SymbolNameList& names,
                    std::optional<elfext::FullAttr>& attributes,
                    std::string& reason) const override;

  /// Reads what the member's object says of itself. False if that can't be had: `failure` then says
  /// what is wrong with the object, or is empty if it was the host, which has been reported. It
  /// must live as long as somebody asks the outline for sizes.
  static bool readOutline(ArchiveMember& archiveMember, elfext::ElfextErrorStringCapture& failure,
                          bool wantsAttributes, elfext::ObjectOutline& outline);

  /// What keeps the host from giving a member's bytes is no fault of the object: the archive's
  /// handler is told, and the failure is empty from then on. False if there was no such thing.
  static bool reportHostFailure(const ArchiveMember& archiveMember,
                                elfext::ElfextErrorStringCapture& failure);
};

} // namespace arlib
