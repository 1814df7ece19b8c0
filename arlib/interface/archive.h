// SPDX-License-Identifier: Apache-2.0
//
// One archive in memory: the ordered list of its members and the decoded symbol table.
//
// A program that uses archives has an alloclib::Session (alloclib/interface/session.h) for as long
// as it does: their members and names live in regions.
//
// Reading a file into it is archive_file_reader.h, writing it out archive_file_writer.h. Edits only
// mark derived data as stale; updateAuxiliaryMembers brings it up to date, and the writer calls it.
#pragma once

#include "alloclib/interface/region_objects.h"
#include "arlib/interface/archive_member.h"
#include "arlib/interface/error_handler.h"
#include "arlib/interface/file_probe.h"
#include "arlib/interface/name_index.h"
#include "arlib/interface/result_list.h"
#include "arlib/interface/symbol.h"
#include "checking/interface/checking.h"
#include "elfext/interface/fast_array.h"
#include "elfext/interface/full_attr.h"
#include "elfext/interface/object_outline.h"
#include "support/interface/source_file.h"

#include <cstdint>
#include <functional>
#include <memory>
#include <optional>
#include <span>
#include <string_view>
#include <utility>
#include <vector>

namespace arlib {

class ReadSymbolTable;
class TableText;
struct DerivedTable;
struct DerivedTables;
struct MemberLayout;

enum class SymbolTableMode : uint32_t {
  Always = 0,    ///< keep a symbol table, even an empty one
  Never = 1,     ///< never keep one
  IfSymbols = 2, ///< keep one only if some member has symbols to publish
  IfObjects = 3, ///< the same, or if some member is an object, though it publishes nothing
};

/// What is done to an archive, as far as it makes derived data stale. The table that says which is
/// in arlib/src/archive.cpp.
enum class Edit : uint8_t {
  Publishing,  ///< what the symbol table is to hold, and whether there is to be one
  EmptyMember, ///< a member without bytes comes to the end
  FileMember,  ///< a member that holds a file comes to the end
  NewName,
  NewBytes, ///< a member's, in memory
  NewFile,  ///< a member's bytes are those of another file
  Move,
  Removal,
  ReadSymbols, ///< another symbol table was read
  TableChange, ///< a table comes or goes
};

/// The names of one archive's long-name table that another one has taken over. Thousands of names
/// may share their bytes there: they do so in the copy, too. The source must
/// outlive the copying.
class CopiedNames {
public:
  CopiedNames() = default; ///< each name is copied for itself
  explicit CopiedNames(const Archive& source);

private:
  friend class Archive;
  std::string_view m_Table; ///< the source's
  const char* m_Copy = nullptr;
};

class Archive {
public:
  static constexpr uint32_t NotFound = 0x80000000;

  /// Empty and up to date. The host must outlive the archive.
  explicit Archive(support::Host& host);
  /// Members' temporary files that no write has released stay on disk.
  ~Archive();
  Archive(const Archive&) = delete;
  Archive& operator=(const Archive&) = delete;

  /// Not owned. Null means that failures are silent.
  void setErrorHandler(ErrorHandler* handler) { m_ErrorHandler = handler; }
  [[nodiscard]] ErrorHandler* getErrorHandler() const { return m_ErrorHandler; }

  /// How symbols are published.
  void setIncludeDebugSymbols(bool include) { m_IncludeDebugSymbols = include; }
  [[nodiscard]] bool getIncludeDebugSymbols() const { return m_IncludeDebugSymbols; }
  void setUniqueSymbolsOnly(bool unique) { m_UniqueSymbolsOnly = unique; }
  [[nodiscard]] bool getUniqueSymbolsOnly() const { return m_UniqueSymbolsOnly; }
  void setUseObjectBuildAttributes(bool use) { m_UseObjectBuildAttributes = use; }
  [[nodiscard]] bool getUseObjectBuildAttributes() const { return m_UseObjectBuildAttributes; }

  /// Whose objects publish their symbols. Of foreign ones no build is told from another.
  void setMachines(elfext::ObjectOutline::Machines machines) { m_Machines = machines; }
  [[nodiscard]] elfext::ObjectOutline::Machines getMachines() const { return m_Machines; }

  /// Whether members keep the folders of their names, when they are read and when they are added.
  /// Without this, a name is cut to its last component.
  void setKeepFolders(bool keep) { m_KeepFolders = keep; }

  /// Whether the file that is read may have a date, an owner and a group that no header could hold.
  /// They go into none.
  void setTakeAnyNumbers(bool take) { m_TakeAnyNumbers = take; }

  /// Whether getSymbols and what builds on it will be called, as they may be unless somebody says
  /// no before the read: then the table is checked as ever, and its bytes are not kept.
  void setSymbolsWanted(bool wanted) { m_AreSymbolsWanted = wanted; }

  /// What the library as a whole needs of its target; null for nothing. It stays when the archive
  /// is cleared. Set it before a read: it makes the symbol table stale, until one is read.
  void setLibraryAttributes(const elfext::FullAttr& attributes);
  [[nodiscard]] const elfext::FullAttr* getLibraryAttributes() const {
    return m_LibraryAttributes ? &*m_LibraryAttributes : nullptr;
  }

  /// Only on an archive that may be written. Marks the symbol table as stale.
  void setSymbolTableMode(SymbolTableMode mode);
  [[nodiscard]] SymbolTableMode getSymbolTableMode() const { return m_SymbolTableMode; }

  /// A pointer of the client's own.
  void setClientData(void* data) { m_ClientData = data; }
  [[nodiscard]] void* getClientData() const { return m_ClientData; }

  /// Copies the name, which may be null. Clears the read-only mark, unless it is the pointer that
  /// is stored already.
  void setFileName(const char* name);
  [[nodiscard]] const char* getFileName() const { return m_FileName; }

  [[nodiscard]] bool isReadOnly() const { return m_ReadOnly; }
  [[nodiscard]] support::Host& getHost() const { return m_SourceFiles.getHost(); }

  /// The files that members' bytes come from. Each is opened once and stays the one that it was,
  /// whatever its name leads to later; see support/interface/source_file.h.
  [[nodiscard]] support::SourceFiles& getSourceFiles() { return m_SourceFiles; }
  /// The file that the archive was read from, or that it is to replace unread; null if there is
  /// none. When the archive is written, its name must still lead to this file.
  [[nodiscard]] const std::shared_ptr<support::SourceFile>& getOwnFile() const { return m_OwnFile; }
  void setOwnFile(std::shared_ptr<support::SourceFile> file) { m_OwnFile = std::move(file); }
  /// Makes sure that nobody has written to that file since: what was read of it could be old in one
  /// place and new in another. False after a report.
  bool checkOwnFile();
  /// Closes all of them; who wants bytes of them opens them again. False after a report of a close
  /// that failed, now or since the last call.
  bool closeFiles();

  /// Removes all members, lets go of the files, and releases what members hold outside the regions,
  /// and the bytes of the tables.
  void clear();

  /// All members in file order, auxiliary ones included.
  [[nodiscard]] std::span<ArchiveMember* const> getMembers() const {
    return {m_ArchiveMembers.begin(), m_ArchiveMembers.getSize()};
  }
  /// The symbol table's contents as read, in table order. They are made when somebody first asks.
  [[nodiscard]] std::span<Symbol* const> getSymbols() const {
    QUARN_ASSERT(1, m_AreSymbolsWanted);
    if (m_ReadSymbolTable != nullptr) makeSymbols();
    return {m_Symbols.begin(), m_Symbols.getSize()};
  }
  /// Hands the same symbols to the visitor, one after the other, wanted or not; each is gone when
  /// the next one comes. Where they are not wanted, a write of the archive leaves none. False after
  /// a report, if the table's bytes can't be had any more.
  bool visitSymbols(const std::function<void(const Symbol&)>& visit) const;
  [[nodiscard]] const ArchiveMember* getSymbolTable() const { return m_SymbolTable; }
  [[nodiscard]] const ArchiveMember* getFileNameTable() const { return m_FileNameTable; }

  /// Appends an empty member.
  ArchiveMember* addMember(std::string_view name, int64_t date, uint32_t uid, uint32_t gid,
                           uint32_t mode);

  /// Appends a member that holds a file, named by the part behind the last separator. The file is
  /// read when the archive is written. Null after a report.
  ArchiveMember* addMemberFromFile(const char* fileName);
  ArchiveMember* addMemberFromFile(const char* fileName, const FileProbe& probe);

  /// The same for a piece of a file. `reportedName` is the name to use in the report of a piece
  /// that is not inside the file.
  ArchiveMember* addMemberFromFileRegion(std::string_view memberName, const char* fileName,
                                         uint32_t offset, uint32_t size,
                                         std::optional<std::string_view> reportedName);

  /// Appends a member with the bytes and the header's numbers of a member of another archive, which
  /// are read through the file that that archive was read from. Who takes many members of one
  /// archive has their names copied together.
  ArchiveMember* addMemberFromMember(const ArchiveMember& source);
  ArchiveMember* addMemberFromMember(const ArchiveMember& source, CopiedNames& names);

  /// Removes a member, and its symbols from the list of symbols; the order of the rest stays.
  void removeMember(ArchiveMember* archiveMember);
  /// The same for many members at the cost of one pass; any order, no member twice.
  void removeMembers(std::span<ArchiveMember* const> archiveMembers);

  /// Takes the member out and puts it back at `newIndex`, which counts without it.
  void moveMember(ArchiveMember* archiveMember, uint32_t newIndex);
  /// The same for many members at the cost of one pass: they then stand together, in the order
  /// given. No member twice.
  void moveMembers(std::span<ArchiveMember* const> archiveMembers, uint32_t newIndex);

  /// Position in the list, or NotFound.
  [[nodiscard]] uint32_t getMemberIndex(const ArchiveMember* archiveMember) const;
  [[nodiscard]] uint32_t getSymbolIndex(const Symbol* symbol) const;

  /// All members of a name, in file order, ignoring ASCII case. False and an empty list if there is
  /// none. Auxiliary members have the empty name.
  bool findMembers(std::string_view name, ArchiveMemberList& list);

  /// All symbols of a name, in table order, letter case counting.
  bool findSymbols(std::string_view name, SymbolList& list);

  /// Of the symbols of a name those that fit code with the required attributes best: of the builds
  /// that need no more, the one that uses most. False if none fits.
  bool findBestSymbols(std::string_view name, const elfext::FullAttr& required, SymbolList& list);

  /// The symbols that the table as read ascribes to a member: in table order, or sorted by name.
  /// The view holds until the archive changes.
  [[nodiscard]] std::span<Symbol* const> getDefinedSymbols(const ArchiveMember* archiveMember);
  [[nodiscard]] std::span<Symbol* const>
  getSortedDefinedSymbols(const ArchiveMember* archiveMember);

  /// Rebuilds what is stale: the long-name table, the symbol table, their places at the front of
  /// the list, and every member's offset. False if one of the tables could not be rebuilt.
  bool updateAuxiliaryMembers();

  /// File size as laid out, in 64 bits, so that a layout too large for the format can be told.
  [[nodiscard]] uint64_t computeFileSize() const;

  /// Report-and-fail in one expression: whether there is a handler and it says to go on.
  template <class... P, class... A>
  [[nodiscard]] bool goOn(bool (ErrorHandler::*operation)(const Archive&, P...),
                          A&&... details) const {
    return m_ErrorHandler != nullptr &&
           (m_ErrorHandler->*operation)(*this, std::forward<A>(details)...);
  }

  /// The same for a failure that ends the operation whatever the handler says. Always false.
  template <class... P, class... A>
  bool stop(bool (ErrorHandler::*operation)(const Archive&, P...), A&&... details) const {
    static_cast<void>(goOn(operation, std::forward<A>(details)...));
    return false;
  }

  /// For failures with nothing to go on with: the handler must answer false. Always false.
  template <class... P, class... A>
  bool fail(bool (ErrorHandler::*operation)(const Archive&, P...), A&&... details) const {
    [[maybe_unused]] const bool err_response = goOn(operation, std::forward<A>(details)...);
    QUARN_ASSERT(1, !err_response);
    return false;
  }

private:
  friend class ArchiveMember;
  friend class ArchiveFileReader;
  friend class ArchiveFileWriter;

  /// An entry of the symbol views: sorted by member, so that each member's symbols lie together.
  struct SymbolView {
    elfext::FastArray<Symbol*> byMember;
    elfext::FastArray<Symbol*> byMemberAndName;
  };

  /// Looks at a piece of a file that is to become a member's contents, which is cut as by
  /// cutToFile. False after a report.
  bool openRegion(const char* fileName, std::optional<std::string_view> reportedName,
                  uint32_t& offset, uint32_t& size, FileProbe& probe);
  /// All but the archive's own, which may be locked. The error number that was reported, or 0.
  int closeInputs();
  int reportCloseErrors();
  /// Keeps the file for the members whose bytes it has.
  support::SourceFile* hold(const std::shared_ptr<support::SourceFile>& file);
  ArchiveMember* appendMember(std::string_view regionName);
  /// What a member is called that comes with this name.
  [[nodiscard]] std::string_view memberNameOf(std::string_view name) const;
  /// Date, uid, gid and mode are those of the file.
  ArchiveMember* appendFileMember(std::string_view regionName,
                                  const std::shared_ptr<support::SourceFile>& file, uint32_t offset,
                                  uint32_t size);
  /// Cuts a piece that reaches beyond the end of its file to what is there, if the handler says so.
  /// False after a report that ends the operation.
  bool cutToFile(const char* fileName, std::optional<std::string_view> reportedName,
                 uint32_t& offset, uint32_t& size, int64_t fileSize) const;
  /// Frees what the members hold outside the regions, and their bytes.
  static void letGo(std::span<ArchiveMember* const> archiveMembers);
  /// The two places where data becomes stale, and where the tables and offsets stop being so.
  void noteEdit(Edit edit);
  void noteTablesUpToDate();
  [[nodiscard]] Symbol symbolOf(std::string_view name, ArchiveMember* member) const;
  void makeSymbols() const;
  void sortSymbols();
  void groupSymbols();
  void takeOut(std::span<ArchiveMember* const> sortedMembers);
  void forgetSymbolsOf(std::span<ArchiveMember* const> sortedMembers);
  /// The members by address: only to find them fast, that order shows nowhere.
  std::vector<ArchiveMember*> sortedByAddress(std::span<ArchiveMember* const> archiveMembers) const;
  /// The steps of updateAuxiliaryMembers. All but the last leave the archive as it is.
  [[nodiscard]] bool rebuildLongNames(DerivedTables& tables);
  [[nodiscard]] bool rebuildSymbols(DerivedTables& tables);
  [[nodiscard]] bool isLaidOutAs(const MemberLayout& layout) const;
  void takeTables(DerivedTables& tables);
  void takeTable(ArchiveMember*& table, const ArchiveMemberType* type, DerivedTable& derived);
  void dropMadeTables();
  void takeLayout(const MemberLayout& layout);
  void putTablesInPlace();
  void forgetTable(ArchiveMember*& table);
  const char* copyToRegion(std::string_view text);
  [[nodiscard]] std::string_view copyName(std::string_view name, CopiedNames& names);
  static std::span<Symbol* const> symbolsOf(const elfext::FastArray<Symbol*>& symbols,
                                            const ArchiveMember* archiveMember);

  support::SourceFiles m_SourceFiles;
  /// All that members' locations refer to, and perhaps some to which none refers any more.
  std::vector<std::shared_ptr<support::SourceFile>> m_HeldFiles;
  std::shared_ptr<support::SourceFile> m_OwnFile;
  /// Members, symbols and names. Declared before what lives in them, so destroyed after it.
  alloclib::RegionOwner m_ObjectRegion;
  /// The arrays below, and the members' bytes.
  alloclib::RegionOwner m_ContainerRegion;
  ErrorHandler* m_ErrorHandler = nullptr;
  const char* m_FileName = nullptr;
  void* m_ClientData = nullptr;
  SymbolTableMode m_SymbolTableMode = SymbolTableMode::IfSymbols;
  bool m_ReadOnly = false;
  bool m_IncludeDebugSymbols = false;
  bool m_UniqueSymbolsOnly = false;
  bool m_UseObjectBuildAttributes = false;
  bool m_AreSymbolsWanted = true;
  bool m_KeepFolders = false;
  bool m_TakeAnyNumbers = false;
  elfext::ObjectOutline::Machines m_Machines = elfext::ObjectOutline::Machines::Own;
  std::optional<elfext::FullAttr> m_LibraryAttributes;

  /// Bytes of tables that were read and then replaced: names and symbols are views of them.
  std::vector<std::span<uint8_t>> m_ViewedBytes;
  /// Tables that a rebuild has taken out of the list; clients may still hold them.
  std::vector<ArchiveMember*> m_ForgottenTables;
  /// What the bytes of tables are made from that a rebuild has made, until they are written.
  std::vector<std::unique_ptr<TableText>> m_MadeTables;

  elfext::FastArray<ArchiveMember*> m_ArchiveMembers;
  NameIndex m_MembersByName;
  /// The table that was read, until its symbols are made, and then these.
  mutable std::unique_ptr<ReadSymbolTable> m_ReadSymbolTable;
  mutable elfext::FastArray<Symbol*> m_Symbols;
  elfext::FastArray<Symbol*> m_SortedSymbols;
  SymbolView m_DefinedSymbols;
  ArchiveMember* m_FileNameTable = nullptr;
  ArchiveMember* m_SymbolTable = nullptr;

  /// Cleared by noteEdit, and set by who brings it up to date.
  bool m_MembersByNameUpToDate = true;        ///< findMembers
  bool m_SortedSymbolsUpToDate = true;        ///< findSymbols
  bool m_DefinedSymbolsUpToDate = true;       ///< getDefinedSymbols
  bool m_ArchiveMemberOffsetsUpToDate = true; ///< updateAuxiliaryMembers, as the next two
  bool m_FileNameTableUpToDate = true;
  bool m_SymbolTableUpToDate = true;
};

} // namespace arlib
