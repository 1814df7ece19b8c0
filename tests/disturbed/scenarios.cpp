// SPDX-License-Identifier: Apache-2.0
//
// A row is enough for a further scenario; what it needs besides is a file of the store.
#include "tests/disturbed/scenarios.h"

#include "tests/support/object_builder.h"

#include <filesystem>
#include <fstream>
#include <iterator>
#include <sstream>

namespace disturbed {

namespace {

// A column that names no file is "-".
// clang-format off
constexpr Scenario Scenarios[] = {
    {"create",         Effect::Archive,   "lib.a",   "a.o",                      "a.o b.o text.txt",               "quarn --create lib.a a.o b.o text.txt"},
    {"create_new",     Effect::Archive,   "lib.a",   "a.o",                      "a.o b.o",                        "quarn -r lib.a a.o b.o"},
    {"create_over",    Effect::Archive,   "lib.a",   "a.o",                      "lib.a a.o b.o",                  "quarn --create lib.a a.o b.o"},
    {"replace",        Effect::Archive,   "many.a",  "a.o",                      "many.a a.o",                     "quarn -r many.a a.o"},
    {"replace_in_two", Effect::Archive,   "lib.a",   "b.o",                      "lib.a b.o=variant.o",                      "quarn -rv lib.a b.o"},
    {"add",            Effect::Archive,   "lib.a",   "c.o",                      "lib.a c.o",                      "quarn -r lib.a c.o"},
    {"add_text",       Effect::Archive,   "lib.a",   "text.txt",                 "lib.a text.txt",                 "quarn -r lib.a text.txt"},
    {"add_large",      Effect::Archive,   "lib.a",   "large.o",                  "lib.a large.o",                  "quarn -r lib.a large.o"},
    {"keep_large",     Effect::Archive,   "large.a", "a.o",                      "large.a a.o",                    "quarn -r large.a a.o"},
    {"add_before",     Effect::Archive,   "lib.a",   "c.o",                      "lib.a c.o",                      "quarn -r -b b.o lib.a c.o"},
    {"add_newer",      Effect::Archive,   "lib.a",   "c.o",                      "lib.a a.o c.o",                  "quarn -r -u lib.a a.o c.o"},
    {"add_by_pattern", Effect::Archive,   "lib.a",   "c.o",                      "lib.a a.o c.o",                  "quarn -r lib.a *.o"},
    {"delete",         Effect::Archive,   "lib.a",   "-",                        "lib.a",                          "quarn -d lib.a a.o"},
    {"move",           Effect::Archive,   "lib.a",   "-",                        "lib.a",                          "quarn -m -a b.o lib.a a.o"},
    {"table",          Effect::Archive,   "bare.a",  "-",                        "bare.a",                         "quarn -s bare.a"},
    {"no_table",       Effect::Archive,   "lib.a",   "-",                        "lib.a",                          "quarn -t -n lib.a"},
    {"long_names",     Effect::Archive,   "lib.a",   "a_name_of_many_letters.o", "lib.a a_name_of_many_letters.o=plain.o", "quarn -r lib.a a_name_of_many_letters.o"},
    {"archive",        Effect::Archive,   "lib.a",   "many.a",                   "lib.a many.a",                   "quarn -r lib.a many.a"},
    {"variants",       Effect::Archive,   "lib.a",   "variant.o",                "lib.a variant.o plain.o",        "quarn -r lib.a plain.o variant.o"},
    {"via_file",       Effect::Archive,   "lib.a",   "words.via",                "lib.a a.o c.o words.via",        "quarn --via=words.via"},
    {"attributes",     Effect::Archive,   "lib.a",   "map",                      "lib.a plain.o variant.o map",    "quarn -r --libattrmap=map lib.a plain.o variant.o"},
    {"hard_link",      Effect::Archive,   "lib.a",   "c.o",                      "lib.a lib2.a=lib.a c.o",         "quarn -r lib.a c.o"},
    {"symbolic_link",  Effect::Archive,   "lib.a",   "c.o",                      "lib.a link.a>lib.a c.o",         "quarn -r link.a c.o"},
    {"list",           Effect::None,      "many.a",  "-",                        "many.a",                         "quarn -t many.a"},
    {"list_long",      Effect::None,      "lib.a",   "-",                        "lib.a",                          "quarn -tv lib.a"},
    {"print",          Effect::None,      "lib.a",   "-",                        "lib.a",                          "quarn -p lib.a"},
    {"symbols",        Effect::None,      "lib.a",   "-",                        "lib.a",                          "quarn --zs lib.a"},
    {"sizes",          Effect::None,      "lib.a",   "-",                        "lib.a",                          "quarn --sizes lib.a"},
    {"entries",        Effect::None,      "lib.a",   "-",                        "lib.a",                          "quarn --entries lib.a"},
    {"summary",        Effect::None,      "lib.a",   "-",                        "lib.a",                          "quarn --zt lib.a"},
    {"extract",        Effect::Extracted, "lib.a",   "-",                        "lib.a",                          "quarn -x lib.a"},
    {"extract_large",  Effect::Extracted, "large.a", "-",                        "large.a",                        "quarn -x large.a"},
    {"extract_over",   Effect::Extracted, "lib.a",   "a.o",                      "lib.a a.o=text.txt",             "quarn -x lib.a"},
    {"ar_replace",     Effect::Archive,   "lib.a",   "c.o",                      "lib.a c.o",                      "quarn-ar rcs lib.a c.o"},
    {"ar_create",      Effect::Archive,   "lib.a",   "a.o",                      "a.o b.o",                        "quarn-ar rcs lib.a a.o b.o"},
    {"ar_delete",      Effect::Archive,   "lib.a",   "-",                        "lib.a",                          "quarn-ar d lib.a a.o"},
    {"ar_extract",     Effect::Extracted, "lib.a",   "-",                        "lib.a",                          "quarn-ar xo lib.a"},
    {"ar_print",       Effect::None,      "lib.a",   "-",                        "lib.a",                          "quarn-ar p lib.a"},
    {"ranlib",         Effect::Archive,   "bare.a",  "-",                        "bare.a",                         "quarn-ranlib bare.a"},
};
// clang-format on

namespace fs = std::filesystem;

constexpr int MembersOfManyLibrary = 40;
constexpr size_t LargeSize = 700000; // some pieces of what is copied at a time

Entry fileOf(std::string bytes) {
  Entry entry;
  entry.bytes = std::move(bytes);
  return entry;
}

std::string example(const std::string& leaf) {
  std::ifstream stream(fs::path(QUARN_EXAMPLES) / leaf, std::ios::binary);
  return {std::istreambuf_iterator<char>(stream), {}};
}

std::string largeObject() {
  testsupport::ObjectBuilder builder = testsupport::object();
  builder.section(".text", 1).flags(6).bytes(std::string(LargeSize, 'x'));
  return builder.bytes();
}

std::vector<std::string> wordsOf(const std::string& line) {
  std::istringstream stream(line);
  return {std::istream_iterator<std::string>(stream), {}};
}

// What the line makes of a folder with these files.
Entries made(const Tracer& tracer, const Entries& files, const std::string& line) {
  const Folder folder;
  folder.put(files);
  const Scenario scenario = {"", Effect::Archive, "", "", "", line.c_str()};
  const TracedRun run = tracer.run(commandOf(scenario, folder.getName()), {}, [] {});
  return folder.take();
}

} // namespace

std::span<const Scenario> getScenarios() {
  return Scenarios;
}

Command commandOf(const Scenario& scenario, const std::string& folder) {
  Command command;
  command.words = wordsOf(scenario.line);
  const std::string program = command.words.front();
  command.file = program == "quarn" ? QUARN_PROGRAM : QUARN_AR_PROGRAM;
  command.folder = folder;
  return command;
}

Store::Store(const Tracer& tracer) {
  addObjects();
  addLibraries(tracer);
}

void Store::addObjects() {
  m_Files["a.o"] = fileOf(example("bignum_debug.o"));
  m_Files["b.o"] = fileOf(example("matrix_sections.o"));
  m_Files["c.o"] = fileOf(example("calendar_plain.o"));
  m_Files["a_name_of_many_letters.o"] = fileOf(example("wide_sections.o"));
  m_Files["plain.o"] = fileOf(example("wide_plain.o"));
  m_Files["variant.o"] = fileOf(example("wide_build_b.o"));
  m_Files["large.o"] = fileOf(largeObject());
  m_Files["text.txt"] = fileOf("No object, but a member all the same.\n");
  m_Files["words.via"] = fileOf("-r lib.a\na.o c.o\n");
  m_Files["map"] = fileOf("* $IEEE1\n");
}

// The library that the line makes of these files. Its permissions are not those that a new
// file gets, since they shall be kept.
void Store::addLibrary(const Tracer& tracer, const Entries& files, const std::string& name,
                       const std::string& line) {
  Entry library = made(tracer, files, line).at(name);
  library.mode = 0640;
  m_Files[name] = std::move(library);
}

void Store::addLibraries(const Tracer& tracer) {
  const Entries files = m_Files;
  const std::string members = " a.o b.o a_name_of_many_letters.o";
  addLibrary(tracer, files, "lib.a", "quarn --create lib.a" + members);
  addLibrary(tracer, files, "bare.a", "quarn --create -n bare.a" + members);
  addLibrary(tracer, files, "large.a", "quarn --create large.a b.o large.o");
  Entries many;
  for (int i = 0; i < MembersOfManyLibrary; ++i)
    many["member_with_number_" + std::to_string(i) + ".o"] = m_Files["c.o"];
  many["a.o"] = m_Files["plain.o"];
  addLibrary(tracer, many, "many.a", "quarn --create many.a *.o");
}

// "name" is the file of the store, "name=other" one more name of it where that one stands in the
// folder, and one with its bytes where it does not; "name>other" leads to it.
Entries Store::entriesOf(const Scenario& scenario) const {
  Entries entries;
  for (const std::string& word : wordsOf(scenario.files)) {
    const size_t sign = word.find_first_of("=>");
    const std::string name = word.substr(0, sign);
    Entry& entry = entries[name];
    if (sign == std::string::npos) {
      entry = m_Files.at(name);
      continue;
    }
    const std::string other = word.substr(sign + 1);
    if (word[sign] == '>') {
      entry.kind = EntryKind::Link;
      entry.bytes = other;
      continue;
    }
    entry = m_Files.at(other);
    if (entries.contains(other)) entry.sameAs = other;
  }
  return entries;
}

const std::string& Store::replacementOf(const std::string& name) const {
  const bool isArchive = name.ends_with(".a");
  if (isArchive) return m_Files.at(name == "lib.a" ? "many.a" : "lib.a").bytes;
  return m_Files.at(name == "c.o" ? "plain.o" : "c.o").bytes;
}

} // namespace disturbed
