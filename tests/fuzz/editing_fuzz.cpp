// SPDX-License-Identifier: Apache-2.0
//
// Any archive, and a sequence of runs of the tool on it, held against a plain list of members. The
// input is read as it looks: lines up to the archive's magic, each one run, and the archive.
//
//   r a.o in.a       inserts files; any word is one, but in.a is the archive itself
//   ra first.o a.o   ... behind a position; rb in front of it
//   d *.o            deletes; m moves, also with a position; s makes the symbol table anew
//
// A run that succeeds leaves what the list says and nothing beside it; one that fails leaves the
// old archive. Who writes it once more with nothing to do gets the same bytes.
#include "alloclib/interface/region_objects.h"
#include "arlib/interface/name_order.h"
#include "messages/interface/messages.h"
#include "quarn/quarn_main.h"
#include "quarn/reporting.h"
#include "support/interface/path.h"
#include "support/interface/pattern.h"
#include "tests/fuzz/memory_bound.h"
#include "tests/fuzz/silence.h"
#include "tests/support/archive_builder.h"
#include "tests/support/memory_host.h"

#include <algorithm>
#include <cstdlib>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace {

constexpr size_t MostRuns = 12;
constexpr size_t MostWords = 20; // of a run
constexpr size_t MostLetters = 40;
constexpr std::string_view Magic = "!<arch>\n";
constexpr std::string_view Wildcards = "*?";
constexpr std::string_view NoLetters("/\\\0", 3); // of a name that the tool writes

using Words = std::vector<std::string>;

void expect(bool condition) {
  if (!condition) std::abort();
}

// ---- What is to be done

struct Edit {
  char action = 's';
  char side = '\0'; // a or b, if there is a position
  std::string position;
  Words words;
};

// Names alone: what would be an option, a folder or a drive is none.
std::string nameFrom(std::string_view text) {
  std::string name(text.substr(0, MostLetters));
  std::erase_if(name, [](char letter) {
    return std::string_view("/\\:\0", 4).find(letter) != std::string_view::npos;
  });
  return name.starts_with('-') ? "" : name;
}

Words wordsOf(std::string_view line) {
  Words words;
  while (!line.empty() && words.size() < MostWords) {
    const size_t end = std::min(line.find(' '), line.size());
    std::string name = nameFrom(line.substr(0, end));
    if (!name.empty()) words.push_back(std::move(name));
    line.remove_prefix(std::min(end + 1, line.size()));
  }
  return words;
}

Edit editFrom(std::string_view line) {
  Edit edit;
  if (line.empty() || std::string_view("rdms").find(line[0]) == std::string_view::npos) return edit;
  edit.action = line[0];
  edit.words = wordsOf(line.substr(std::min(line.find(' '), line.size())));
  if (line.size() > 1 && std::string_view("ab").find(line[1]) != std::string_view::npos &&
      !edit.words.empty()) {
    edit.side = line[1];
    edit.position = edit.words.front();
    edit.words.erase(edit.words.begin());
  }
  // Patterns would be looked for on the disk there.
  if (edit.action != 'r' && edit.side == '\0') return edit;
  for (std::string& word : edit.words)
    std::replace_if(
        word.begin(), word.end(),
        [](char letter) { return Wildcards.find(letter) != std::string_view::npos; }, 'x');
  return edit;
}

// ---- The list

struct Member {
  std::string name;
  std::string contents;
  bool isTable = false;
  bool isNew = false; // made or replaced by this run
};
using MemberList = std::vector<Member>;

// Nothing for an archive that is read with some good will: its tables are in odd places, or its
// names are none that this tool would write.
std::optional<MemberList> findList(const std::string& archive) {
  std::string error;
  MemberList list;
  for (testsupport::ParsedMember& member : testsupport::parseArchive(archive, error)) {
    const bool isTable = member.nameField == "/" || member.nameField == "//";
    if (member.nameField == "/" && !list.empty()) return std::nullopt;
    if (member.name.find_first_of(NoLetters) != std::string::npos) return std::nullopt;
    list.push_back({std::move(member.name), std::move(member.contents), isTable});
  }
  if (!error.empty()) return std::nullopt;
  return list;
}

MemberList listFrom(const std::string& archive) {
  std::optional<MemberList> list = findList(archive);
  expect(list.has_value());
  return std::move(*list);
}

bool isNamed(const Member& member, std::string_view word) {
  const std::string_view name = std::string_view(member.name);
  if (word.find_first_of(Wildcards) == std::string_view::npos)
    return arlib::compareIgnoringCase(name, word) == 0;
  return support::matchesPattern(word, name.substr(0, support::LongestPathComponent), false);
}

void put(MemberList& list, const std::string& name, const std::string& contents) {
  const auto old = std::find_if(list.begin(), list.end(), [&name](const Member& member) {
    return !member.isTable && !member.isNew && arlib::compareIgnoringCase(member.name, name) == 0;
  });
  if (old == list.end()) {
    list.push_back({name, contents, false, true});
    return;
  }
  old->contents = contents;
  old->isNew = true;
}

void putFile(MemberList& list, const std::string& name, const std::string& bytes) {
  if (!bytes.starts_with(Magic)) return put(list, name, bytes);
  for (const Member& member : listFrom(bytes)) {
    if (!member.isTable) put(list, member.name, member.contents);
  }
}

// False if there is no member of the name.
bool moveTo(MemberList& list, size_t& place, std::string_view word) {
  const auto found = std::find_if(list.begin(), list.end(), [word](const Member& member) {
    return !member.isTable && isNamed(member, word);
  });
  if (found == list.end()) return false;
  Member moved = std::move(*found);
  if (static_cast<size_t>(found - list.begin()) < place) --place;
  list.erase(found);
  list.insert(list.begin() + static_cast<ptrdiff_t>(place++), std::move(moved));
  return true;
}

// Tables count, and have the empty name.
std::optional<size_t> placeOf(const MemberList& list, const Edit& edit) {
  if (edit.side == '\0') return list.size();
  const auto found = std::find_if(list.begin(), list.end(), [&edit](const Member& member) {
    return isNamed(member, edit.position);
  });
  if (found == list.end()) return std::nullopt;
  return static_cast<size_t>(found - list.begin()) + (edit.side == 'a' ? 1 : 0);
}

// Nothing if the run has to fail.
std::optional<MemberList> edited(MemberList list, const Edit& edit,
                                 const testsupport::MemoryHost& host) {
  std::optional<size_t> place = placeOf(list, edit);
  if (!place) return std::nullopt;
  const auto oldCount = static_cast<ptrdiff_t>(list.size());
  for (const std::string& word : edit.words) {
    if (edit.action == 'r') putFile(list, word, host.read(word));
    if (edit.action == 'm' && !moveTo(list, *place, word)) return std::nullopt;
    if (edit.action == 'd')
      std::erase_if(list,
                    [&](const Member& member) { return !member.isTable && isNamed(member, word); });
  }
  if (edit.action == 'r')
    std::rotate(list.begin() + static_cast<ptrdiff_t>(*place), list.begin() + oldCount, list.end());
  return list;
}

void expectSame(MemberList left, MemberList right) {
  for (MemberList* list : {&left, &right})
    std::erase_if(*list, [](const Member& member) { return member.isTable; });
  expect(std::equal(left.begin(), left.end(), right.begin(), right.end(),
                    [](const Member& one, const Member& other) {
                      return one.name == other.name && one.contents == other.contents;
                    }));
}

// ---- The tool

// False if an error was told of.
bool run(testsupport::MemoryHost& host, const Edit& edit) {
  Words words = {"quarn", std::string("-") + edit.action};
  if (edit.side != '\0') words.insert(words.end(), {std::string("-") + edit.side, edit.position});
  words.push_back("lib.a");
  words.insert(words.end(), edit.words.begin(), edit.words.end());
  std::vector<const char*> arguments;
  for (const std::string& word : words)
    arguments.push_back(word.c_str());
  arguments.push_back(nullptr);
  const alloclib::RegionOwner memory(alloclib::RegionGeneral::Create(1024, "fuzz"));
  messages::initialise();
  const Words filesBefore = host.getNames();
  const std::string before = host.read("lib.a");
  quarn::quarnMain(static_cast<int>(words.size()), arguments.data(), "quarn", host, *memory);
  expect(host.openHandles() == 0 && host.getNames() == filesBefore);
  expect(!quarn::hasErrors() || host.read("lib.a") == before);
  return !quarn::hasErrors();
}

void addFiles(testsupport::MemoryHost& host, const Edit& edit, size_t number) {
  const std::string text = "file of run " + std::to_string(number);
  for (const std::string& word : edit.words) {
    if (edit.action == 'r' && !host.has(word)) host.addFile(word, text);
  }
}

void doEdit(testsupport::MemoryHost& host, const Edit& edit) {
  const std::optional<MemberList> expected = edited(listFrom(host.read("lib.a")), edit, host);
  expect(run(host, edit) == expected.has_value());
  if (expected) expectSame(*expected, listFrom(host.read("lib.a")));
}

void doEdits(testsupport::MemoryHost& host, std::string_view script) {
  const bool isWellFormed = findList(host.read("lib.a")).has_value();
  for (size_t i = 0; i < MostRuns && !script.empty(); ++i) {
    const size_t end = std::min(script.find('\n'), script.size());
    const Edit edit = editFrom(script.substr(0, end));
    addFiles(host, edit, i);
    if (isWellFormed)
      doEdit(host, edit);
    else
      run(host, edit);
    script.remove_prefix(std::min(end + 1, script.size()));
  }
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size) {
  static const bool IsInitialised = fuzzing::silenceMessages();
  if (!IsInitialised) return 0;
  const fuzzing::MemoryBound bound(size);
  const std::string_view text(reinterpret_cast<const char*>(data), size);
  const size_t start = std::min(text.find(Magic), text.size());
  testsupport::MemoryHost host;
  host.addFile("lib.a", text.substr(start));
  // What is no archive, or has an object that can't be read, is left as it is.
  const Edit nothing = {.action = 'm'};
  if (!run(host, nothing)) return 0;
  host.addFile("in.a", host.read("lib.a"));
  doEdits(host, text.substr(0, start));
  expect(run(host, nothing));
  const std::string settled = host.read("lib.a");
  expect(run(host, nothing) && host.read("lib.a") == settled);
  return 0;
}
