// SPDX-License-Identifier: Apache-2.0
//
// One member of an archive: its header's fields, and where its bytes are. The bytes stay on disk
// until somebody asks for them.
#pragma once

#include "arlib/interface/archive_member_type.h"
#include "support/interface/source_file.h"

#include <cstdint>
#include <memory>
#include <optional>
#include <span>
#include <string_view>

namespace elfext {
class DeferredContentsSelector;
class ObjectModule;
} // namespace elfext

namespace arlib {

class Archive;
class Symbol;
class TableText;
struct FileProbe;

/// Lives in the archive's object region. It is never freed by itself; what it holds outside the
/// region (a temporary file) is released by releaseContentsLocation.
///
/// It always has contents in memory, or a contents location, or both, and if both, the same bytes.
/// Only a table that updateAuxiliaryMembers has made may have neither until it is written:
/// loadContents gives its bytes nevertheless.
class ArchiveMember {
public:
  /// Where the bytes lie on disk; their number is the member's size.
  struct ContentsLocation {
    support::SourceFile* file = nullptr; ///< held by the archive
    const char* fileName = nullptr;      ///< its name
    uint32_t offset = 0;                 ///< of the contents, in that file
    bool isTemporary = false; ///< made by this run, deleted when the location is released
  };

  static constexpr uint32_t NoFileNameTableOffset = 0xFFFFFFFF;

  explicit ArchiveMember(Archive* archive);

  [[nodiscard]] std::string_view getName() const { return m_Name; }
  [[nodiscard]] uint32_t getFileNameTableOffset() const { return m_FileNameTableOffset; }
  [[nodiscard]] int64_t getDate() const { return m_Date; }
  [[nodiscard]] uint32_t getUid() const { return m_Uid; }
  [[nodiscard]] uint32_t getGid() const { return m_Gid; }
  [[nodiscard]] uint32_t getMode() const { return m_Mode; }
  [[nodiscard]] uint32_t getSize() const { return m_Size; }
  [[nodiscard]] const ArchiveMemberType* getType() const { return m_Type; }
  [[nodiscard]] Archive* getArchive() const { return m_Archive; }
  [[nodiscard]] bool isModified() const { return m_Modified; }

  /// File offset of the header. Only while the archive's offsets are up to date.
  [[nodiscard]] uint32_t getOffset() const;

  /// True for the symbol table and the long-name table.
  [[nodiscard]] bool isAuxiliary() const;

  void setDate(int64_t date);
  void setUid(uint32_t uid);
  void setGid(uint32_t gid);
  void setMode(uint32_t mode);

  /// Copies the name. Not for auxiliary members, whose names are the format's own.
  void setName(std::string_view name);

  /// The bytes in memory. They stay valid until they are discarded or replaced.
  [[nodiscard]] bool hasContents() const { return m_Contents.has_value(); }
  [[nodiscard]] std::span<const uint8_t> getContents() const;
  /// The same to edit in place: only behind clearType, since the type rests on the bytes.
  [[nodiscard]] std::span<uint8_t> getModifiableContents();

  [[nodiscard]] const std::optional<ContentsLocation>& getContentsLocation() const;

  /// Brings the bytes into memory. False after a report; there are then no contents in memory.
  bool loadContents();

  /// Gives a member that lives in memory alone a temporary file. False after a report.
  bool flushContents();

  /// Frees the bytes in memory, after having given them a location. Bytes that can't be flushed are
  /// lost, as the report has said. Always true.
  bool discardContents();

  /// Replaces the bytes.
  void setContents(const void* data, uint32_t size);

  /// Replaces the bytes by those of a file, or of a region of it, and takes date, uid, gid and mode
  /// from the file. The file is not read now. False after a report; nothing has then changed.
  bool setContentsFromFile(const char* fileName);
  bool setContentsFromFile(const char* fileName, const FileProbe& probe);
  bool setContentsFromFileRegion(const char* fileName, uint32_t offset, uint32_t size);

  /// Replaces the bytes and the header's numbers by those of a member of another archive, through
  /// the file that that archive was read from.
  void setContentsFromMember(const ArchiveMember& source);

  /// Date, uid, gid and mode become those of the other member.
  void takeHeaderNumbers(const ArchiveMember& source);

  /// Position of a symbol in the archive's list of symbols, or Archive::NotFound.
  [[nodiscard]] uint32_t getSymbolIndex(const Symbol* symbol) const;

  /// For a client that is about to edit the contents in place: loads them, and leaves the type to
  /// be determined anew. False if they could not be loaded.
  bool clearType();

  /// Only while the type is not known. False, after a report, if the bytes that tell can't be read:
  /// it is still not known then.
  [[nodiscard]] bool determineType();

  /// Reads the member's bytes as an object. A module of the caller's reports to its own handler, a
  /// new one to nobody. It must not outlive the archive's host. Null or false if the object can't
  /// be read.
  std::unique_ptr<elfext::ObjectModule>
  createObjectModule(elfext::DeferredContentsSelector* selector);
  bool readObjectModule(elfext::ObjectModule& module, elfext::DeferredContentsSelector* selector);

  /// Forgets where the bytes lie on disk, and deletes the file if it was a temporary one. False if
  /// that failed, after a report; the location is gone all the same.
  bool releaseContentsLocation();

private:
  friend class Archive;
  friend class ArchiveFileReader;
  friend class ArchiveFileWriter;
  friend class ContentsReader;
  friend class ElfImageArchiveMemberType;

  struct Contents {
    uint8_t* bytes;
    uint32_t size;
    uint32_t capacity; ///< at least 1
  };

  /// Uninitialised bytes in the archive's container region; the old ones are freed, except those of
  /// a table that came from the file, into which names point: they go when the archive is cleared.
  std::span<uint8_t> replaceContents(uint32_t size);
  /// The bytes are those of a table that the archive holds.
  void takeMade(const TableText* made);
  void freeContents();
  /// The archive holds the file from now on.
  void setLocation(const std::shared_ptr<support::SourceFile>& file, uint32_t offset,
                   bool isTemporary);
  void takeFile(const std::shared_ptr<support::SourceFile>& file, uint32_t offset, uint32_t size);
  bool readContents(std::span<uint8_t> bytes);
  /// From the location, which there must be, under the module's own handler.
  bool readInto(elfext::ObjectModule& module, elfext::DeferredContentsSelector* selector) const;

  std::string_view m_Name;
  uint32_t m_FileNameTableOffset = NoFileNameTableOffset;
  uint32_t m_Uid = 0;
  int64_t m_Date = 0;
  uint32_t m_Gid = 0;
  uint32_t m_Mode = 0;
  uint32_t m_Size = 0;
  uint32_t m_Offset = 0;
  const ArchiveMemberType* m_Type;
  Archive* m_Archive;
  std::optional<Contents> m_Contents;
  std::optional<ContentsLocation> m_ContentsLocation;
  const TableText* m_Made = nullptr; ///< of a table that has not been written yet
  bool m_NameIsLeaf = false;         ///< known without a look at the name
  bool m_Modified = false;
  bool m_ContentsAreViewed = false; ///< names or symbols are views of the bytes: never free them
};

} // namespace arlib
