// SPDX-License-Identifier: Apache-2.0
//
// What a job costs at least: find the members, read each object's headers, symbol table, strings
// and relocations and the library's symbol table, write everything once. This program does that
// and nothing else, with plain reads and writes, in one thread, and with no checks but those for
// which there is something to be read. (Mapping the files was measured and is no faster, and a
// mapped file that somebody cuts short ends the program that looks.) What it writes is what quarn
// does, byte for byte, but for the decorations of the names of builds of one module. The comparison
// runs it beside the archivers.
//
//   limit JOB LIBRARY [FILE...]
//
// The jobs stand at the end of this file.
#include "bench/compare/limit_files.h"
#include "bench/compare/limit_library.h"
#include "bench/compare/limit_object.h"

#include <algorithm>
#include <array>
#include <cstdio>
#include <cstring>
#include <ctime>
#include <memory>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace {

using namespace bench;

using Words = std::vector<std::string>;

// Files of up to this size are read once and kept, as long as there is room.
constexpr uint64_t SmallFile = 64 * 1024;
constexpr uint64_t RoomForFiles = 64 * 1024 * 1024;

// The window is on the library's file. What it holds is read in one piece.
ObjectPlace placeOf(const InputFile& library, Window& window, const Member& member) {
  ObjectPlace place = {&library, member.getContentsOffset(), {}};
  if (window.holds(member.getSize())) place.whole = window.at(place.offset, member.getSize());
  return place;
}

// Publishes the names of members, wherever they come from.
class Publisher {
public:
  // The file is that of the members which are in a library already, if there is one.
  explicit Publisher(const InputFile* library) : m_Library(library) {
    if (library != nullptr) m_Window.emplace(*library);
  }

  void publish(Member& member) { member.isOld() ? publishOld(member) : publishFile(member); }
  [[nodiscard]] const PublishedNames& getNames() const { return m_Names; }

private:
  void publishOld(const Member& member) {
    publishNames(placeOf(*m_Library, *m_Window, member), m_Buffers, m_Names);
  }

  void publishFile(Member& member) {
    const InputFile file(member.path);
    describe(member, file);
    if (file.getSize() <= SmallFile && m_Kept + file.getSize() <= RoomForFiles) {
      const auto& room = m_Files.emplace_back(makeRoom(file.getSize()));
      file.read(room.get(), 0, file.getSize());
      m_Kept += file.getSize();
      member.kept = {room.get(), file.getSize()};
    }
    publishNames({&file, 0, member.kept}, m_Buffers, m_Names);
  }

  const InputFile* m_Library;
  std::optional<Window> m_Window; // on the library
  // A small file is read for its names and written from memory later, as the tool does it.
  std::vector<std::unique_ptr<char[]>> m_Files;
  uint64_t m_Kept = 0;
  ObjectBuffers m_Buffers;
  PublishedNames m_Names;
};

void writeWithTable(const std::string& path, std::vector<Member>& members, const InputFile* old) {
  Publisher publisher(old);
  for (Member& member : members)
    publisher.publish(member);
  writeLibrary(path, members, &publisher.getNames(), old);
}

std::vector<Member> membersFromFiles(const Words& files) {
  std::vector<Member> members;
  members.reserve(files.size());
  std::transform(files.begin(), files.end(), std::back_inserter(members), memberFromFile);
  return members;
}

Member& memberNamed(std::vector<Member>& members, const std::string& name) {
  const auto found = std::ranges::find(members, name, &Member::name);
  if (found == members.end()) fail(name);
  return *found;
}

void createWithoutTable(const std::string& path, const Words& files) {
  std::vector<Member> members = membersFromFiles(files);
  writeLibrary(path, members, nullptr, nullptr);
}

void create(const std::string& path, const Words& files) {
  std::vector<Member> members = membersFromFiles(files);
  writeWithTable(path, members, nullptr);
}

void regenerate(const std::string& path, const Words&) {
  CheckedLibrary library(path);
  writeWithTable(path, library.members, &library.file);
}

void replaceOne(const std::string& path, const Words& files) {
  CheckedLibrary library(path);
  Member member = memberFromFile(files.front());
  memberNamed(library.members, member.name) = member;
  writeWithTable(path, library.members, &library.file);
}

void deleteOne(const std::string& path, const Words& names) {
  CheckedLibrary library(path);
  const Member& member = memberNamed(library.members, names.front());
  library.members.erase(library.members.begin() + (&member - library.members.data()));
  writeWithTable(path, library.members, &library.file);
}

void list(const std::string& path, const Words&) {
  const CheckedLibrary library(path);
  OutputFile output("-");
  for (const Member& member : library.members) {
    output.put(member.name);
    output.put('\n');
  }
  output.flush();
}

std::string modeText(uint32_t mode) {
  std::string text = "rwxrwxrwx";
  for (size_t i = 0; i < text.size(); ++i) {
    if ((mode >> (8 - i) & 1) == 0) text[i] = '-';
  }
  return text;
}

// Broken down once for each date that differs from the one before: members of a library mostly have
// one date, and breaking it down costs more than the rest of the line.
class DateText {
public:
  std::string_view of(uint32_t date) {
    if (m_Text[0] != '\0' && date == m_Date) return m_Text.data();
    m_Date = date;
    const std::time_t seconds = date;
    std::strftime(m_Text.data(), m_Text.size(), "%b %d %H:%M %Y", std::localtime(&seconds));
    return m_Text.data();
  }

private:
  uint32_t m_Date = 0;
  std::array<char, 32> m_Text = {};
};

void listLong(const std::string& path, const Words&) {
  const CheckedLibrary library(path);
  OutputFile output("-");
  DateText date;
  for (const Member& member : library.members) {
    output.put(modeText(headerNumber(member.header, arlib::ModeField, 8)));
    output.putNumber(headerNumber(member.header, arlib::UidField), 6);
    output.put('/');
    output.putNumber(headerNumber(member.header, arlib::GidField), 6);
    output.putNumber(member.getSize(), 7);
    output.put(' ');
    output.put(date.of(headerNumber(member.header, arlib::DateField)));
    output.put(' ');
    output.put(member.name);
    output.put(" (offset ");
    output.putNumber(member.offset, 6);
    output.put(")\n");
  }
  output.flush();
}

void extract(const std::string& path, const Words&) {
  const CheckedLibrary library(path);
  Window window(library.file);
  for (const Member& member : library.members) {
    const bool isSmall = window.holds(member.getSize());
    // A small member goes out as it lies in the window.
    OutputFile output(member.name, isSmall ? 0 : BufferSize);
    if (isSmall)
      output.put(window.at(member.getContentsOffset(), member.getSize()));
    else
      output.copy(library.file, member.getContentsOffset(), member.getSize());
    output.flush();
  }
}

void putSizes(OutputFile& output, const ObjectSizes& sizes, std::string_view name) {
  output.putNumber(sizes.code, 10);
  for (const uint64_t size : {sizes.readOnly, sizes.readWrite, sizes.zero, sizes.debug}) {
    output.put(' ');
    output.putNumber(size, 10);
  }
  output.put("   ");
  output.put(name);
  output.put('\n');
}

void sizes(const std::string& path, const Words&) {
  const CheckedLibrary library(path);
  Window window(library.file);
  ObjectBuffers buffers;
  ObjectSizes total;
  OutputFile output("-");
  output.put("\n      Code    RO Data    RW Data    ZI Data      Debug   Object Name\n");
  for (const Member& member : library.members) {
    const ObjectSizes each = computeSizes(placeOf(library.file, window, member), buffers);
    putSizes(output, each, member.name);
    total.code += each.code;
    total.readOnly += each.readOnly;
    total.readWrite += each.readWrite;
    total.zero += each.zero;
    total.debug += each.debug;
  }
  putSizes(output, total, "TOTAL\n");
  output.flush();
}

void putPadded(OutputFile& output, std::string_view text, size_t width) {
  output.put(text);
  for (size_t count = text.size(); count < width; ++count)
    output.put(' ');
}

void symbols(const std::string& path, const Words&) {
  const Library library(path);
  const std::string bytes = library.readSymbolTable();
  const auto* table = reinterpret_cast<const uint8_t*>(bytes.data());
  const uint32_t count = arlib::getBigEndian32(table);
  const char* name = bytes.data() + 4 + 4 * size_t{count};
  OutputFile output("-");
  for (uint32_t i = 0; i < count; ++i) {
    const uint32_t offset = arlib::getBigEndian32(table += 4);
    // Members ascend by their offsets, so the one that a symbol names is found by halves.
    const auto member = std::ranges::lower_bound(library.members, offset, {}, &Member::offset);
    putPadded(output, name, 20);
    output.put(" from ");
    putPadded(output, member->name, 10);
    output.put(" at offset ");
    output.putNumber(offset, 6);
    output.put('\n');
    name += std::strlen(name) + 1;
  }
  output.flush();
}

struct Job {
  std::string_view name;
  void (*run)(const std::string& library, const Words& files);
};

constexpr Job Jobs[] = {
    {"create", create},
    {"create-without-table", createWithoutTable},
    {"delete", deleteOne},
    {"extract", extract},
    {"list", list},
    {"list-long", listLong},
    {"regenerate", regenerate},
    {"replace", replaceOne},
    {"sizes", sizes},
    {"symbols", symbols},
};

} // namespace

int main(int argc, char** argv) {
  const auto job = std::ranges::find(Jobs, argc < 3 ? "" : argv[1], &Job::name);
  if (job == std::end(Jobs)) {
    std::fprintf(stderr, "usage: limit JOB LIBRARY [FILE...]\n");
    return 2;
  }
  job->run(argv[2], Words(argv + 3, argv + argc));
  return 0;
}
