// SPDX-License-Identifier: Apache-2.0
//
// Libraries as the limit program reads and writes them: the members are found by their headers
// alone, and what stays as it is goes over in as few pieces as it lies in.
//
// It shares the archive format's get and put with the tool (archive_format.h), and nothing else of
// the archive library: what that costs beyond the format is what is measured.

#pragma once

#include "bench/compare/limit_files.h"
#include "bench/compare/limit_object.h"

#include "arlib/interface/archive_format.h"

#include <array>
#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

namespace bench {

using MemberHeader = std::array<char, arlib::MemberHeaderSize>;

// The number in a field of the header, which a good library has there.
uint32_t headerNumber(const MemberHeader& header, arlib::HeaderField field, uint32_t base = 10);

struct Member {
  std::string name;
  MemberHeader header = {};   // unknown yet if it comes from a file that has not been opened
  uint64_t offset = 0;        // of the header, in the old library
  std::string path = {};      // of the file that it comes from, if it is not in the old library
  std::string_view kept = {}; // that file's bytes, if they are in memory

  [[nodiscard]] bool isOld() const { return path.empty(); }
  [[nodiscard]] uint64_t getSize() const { return headerNumber(header, arlib::SizeField); }
  [[nodiscard]] uint64_t getEnd() const { return arlib::nextHeaderOffset(offset, getSize()); }
  [[nodiscard]] uint64_t getContentsOffset() const { return offset + arlib::MemberHeaderSize; }
};

// A library as its headers tell it: found by reading each header once, in order.
struct Library {
  explicit Library(const std::string& path);

  InputFile file;
  std::vector<Member> members;

  // Its bytes; none if there is none.
  [[nodiscard]] std::string readSymbolTable() const;
  // Looks at all of them, as one must before the library can be called good, and keeps nothing.
  void checkSymbolTable() const;

private:
  uint64_t m_SymbolTableOffset = 0;
  size_t m_SymbolTableSize = 0;
};

struct CheckedLibrary : Library {
  explicit CheckedLibrary(const std::string& path) : Library(path) { checkSymbolTable(); }
};

// What a file is as a member. Its size, date, owner and mode are those of the file.
Member memberFromFile(const std::string& path);
void describe(Member& member, const InputFile& file);

// Puts a library at the path, in one step. Without names it has no symbol table. `old` is where
// old members come from.
void writeLibrary(const std::string& path, std::vector<Member>& members,
                  const PublishedNames* names, const InputFile* old);

} // namespace bench
