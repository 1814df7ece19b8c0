// SPDX-License-Identifier: Apache-2.0
//
// One read of an archive file. The order of the checks is the order in which a strictly forward
// reader would meet the bytes, since the first failure is the one that is told.
#pragma once

#include "arlib/interface/archive.h"
#include "arlib/interface/archive_format.h"
#include "arlib/src/long_names.h"
#include "arlib/src/table_cursor.h"
#include "support/interface/read_window.h"

#include <cstdint>
#include <memory>
#include <string_view>
#include <vector>

namespace arlib {

class ArchiveFileReader {
public:
  explicit ArchiveFileReader(Archive& archive) : m_Archive(archive), m_Host(archive.getHost()) {}

  // Opens the file by its name.
  bool read(const char* fileName);
  // Reads a file that is open already.
  bool read(const std::shared_ptr<support::SourceFile>& file);

private:
  using FieldReport = bool (ErrorHandler::*)(const Archive&, uint64_t, std::string_view);

  enum class Pass { Member, End, Failure };

  void start(const char* fileName);
  bool readOpenFile();
  bool readTables();
  bool readMagic();
  bool checkToldSize();
  bool readMembers();
  Pass readMember();
  Pass readHeader();
  bool parseHeader();
  bool parseNumber(HeaderField which, uint32_t base, FieldReport report, uint32_t& value);
  bool parseSize();
  bool parseName(std::string_view& name);
  bool parseLongName(std::string_view digits, std::string_view& name);
  bool parseShortName(std::string_view field, std::string_view& name);
  bool checkHostFile();
  ArchiveMember* addMember(std::string_view name);
  std::string_view memberNameOf(std::string_view name);
  [[nodiscard]] bool areContentsTaken(const ArchiveMember* member) const;
  bool takeAuxiliaryContents(ArchiveMember* member);
  bool skipContents();
  bool skipPadding();
  bool checkUnchanged();

  bool readSymbolTable();
  [[nodiscard]] TableSource getSymbolTableSource() const;

  [[nodiscard]] std::string_view field(HeaderField which) const {
    return m_Header.substr(which.position, which.width);
  }

  Archive& m_Archive;
  support::Host& m_Host;
  std::shared_ptr<support::SourceFile> m_File;
  support::ReadWindow m_Window;
  support::FileStatus m_Status; // as the file was when it was opened
  bool m_HostFileIsChecked = false;
  bool m_HasWideSymbols = false; // the table is none of those that are looked into

  // The member being read.
  uint64_t m_Offset = 0; // of its header
  uint32_t m_Counter = 0;
  char m_HeaderBytes[MemberHeaderSize] = {};
  std::string_view m_Header; // the same, as text
  std::vector<uint8_t> m_FirstBytes;
  bool m_MayBeBlank = false;
  bool m_IsWideSymbolTable = false;
  MemberHeaderNumbers m_Numbers;
  uint32_t m_LongNameIndex = ArchiveMember::NoFileNameTableOffset;
  bool m_HasFoldersInHeaders = false;

  LongNames m_LongNames; // of the table that has passed by
};

} // namespace arlib
