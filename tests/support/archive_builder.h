// SPDX-License-Identifier: Apache-2.0
//
// Archive files for tests, written as they read on disk:
//
//   archive().symbolTable({{"alpha", "a.o"}}).member("a.o", "bytes").badDate("12x").bytes()
//
// It knows the format on its own account, and shares no line with the writer that it tests.
//
// Each fault is one call behind a good member, so that a test shows what is wrong in the place
// where it says so. The unit tests of archives and driver and the systematic tests build with it.

#pragma once

#include "tests/support/bytes.h"

#include <array>
#include <cstdint>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace testsupport {

class ArchiveBuilder {
public:
  // An entry of the symbol table. The member is told by its name, or by an offset as it stands.
  struct Symbol {
    Symbol(std::string_view symbolName, std::string_view definingMember)
        : name(symbolName), member(definingMember) {}
    Symbol(std::string_view symbolName, uint32_t headerOffset)
        : name(symbolName), offset(headerOffset) {}
    std::string name;
    std::string member;
    uint32_t offset = 0; // if there is no member
  };

  // The first eight bytes, where they are not to be the right ones.
  ArchiveBuilder& badMagic(std::string_view magic);

  ArchiveBuilder& symbolTable(const std::vector<Symbol>& symbols);
  ArchiveBuilder& symbolTableBytes(std::string_view contents);
  ArchiveBuilder& longNames(const std::vector<std::string>& names);
  ArchiveBuilder& longNamesText(std::string_view contents);

  // A member dated 1000000000 of owner 1 and group 2, mode 100644. A name of more than 15
  // characters is looked up in the long-name table, which must stand in front.
  ArchiveBuilder& member(std::string_view name, std::string_view contents);
  // The same with the 16 bytes of the name field as they are given; blanks are added.
  ArchiveBuilder& memberWithNameField(std::string_view field, std::string_view contents);

  // What follows changes the last member. Texts are padded with blanks to their field.
  ArchiveBuilder& numbers(int64_t date, uint32_t uid, uint32_t gid, std::string_view octalMode);
  ArchiveBuilder& badDate(std::string_view text) { return setField(Field_Date, text); }
  ArchiveBuilder& badUid(std::string_view text) { return setField(Field_Uid, text); }
  ArchiveBuilder& badGid(std::string_view text) { return setField(Field_Gid, text); }
  ArchiveBuilder& badMode(std::string_view text) { return setField(Field_Mode, text); }
  ArchiveBuilder& badSize(std::string_view text) { return setField(Field_Size, text); }
  ArchiveBuilder& badMemberMagic(std::string_view text) { return setField(Field_Magic, text); }
  ArchiveBuilder& blankNumbers(); // all but the size
  ArchiveBuilder& badPadding(char padding);
  ArchiveBuilder& noPadding();

  // Behind everything else.
  ArchiveBuilder& tail(std::string_view bytes);

  [[nodiscard]] std::string bytes() const;

  // Header offset of the first member with this name.
  [[nodiscard]] uint32_t offsetOf(std::string_view name) const;

private:
  enum Field {
    Field_Name,
    Field_Date,
    Field_Uid,
    Field_Gid,
    Field_Mode,
    Field_Size,
    Field_Magic,
    Field_Count
  };

  struct Member {
    std::string name;
    std::array<std::string, Field_Count> fields;
    std::string contents;
    std::optional<std::vector<Symbol>> symbols;
    std::string padding;
  };

  ArchiveBuilder& append(std::string_view name, std::string_view nameField,
                         std::string_view contents);
  ArchiveBuilder& setField(Field field, std::string_view text);
  [[nodiscard]] std::string contentsOf(const Member& member) const;

  std::string m_Magic = "!<arch>\n";
  std::vector<Member> m_Members;
  std::string m_LongNames;
  std::string m_Tail;
};

inline ArchiveBuilder archive() {
  return {};
}

// What an independent look at an archive file finds.
struct ParsedMember {
  std::string nameField; // without the blanks behind it
  std::string name;      // short, or looked up in the long-name table; empty for the two tables
  std::array<std::string, 5> numbers; // date, uid, gid, mode, size, without blanks
  std::string contents;
  uint32_t offset = 0; // of the header
};

// Takes a file apart by the strict rules of a well-formed archive. On any deviation, `error` says
// which, and the list ends there.
std::vector<ParsedMember> parseArchive(std::string_view bytes, std::string& error);

} // namespace testsupport
