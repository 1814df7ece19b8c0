// SPDX-License-Identifier: Apache-2.0
//
// The real program, a process for each step, against a plain list of names and bytes. After each
// step the file is taken apart by the strict parser of the archive builder, which knows nothing of
// the product. And the bytes of a normalised archive depend on nothing but what is put into it.
//
// A failure tells its seed. QUARN_MODEL_SEED is the first seed, and QUARN_MODEL_SEQUENCES how many
// follow it, for a longer look than the suite takes (or the target model_long).

#include "tests/support/archive_builder.h"
#include "tests/support/object_builder.h"
#include "tests/support/tool_folder.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <chrono>
#include <cstdlib>
#include <fcntl.h>
#include <filesystem>
#include <random>
#include <sched.h>
#include <sys/stat.h>
#include <unistd.h>

namespace testsupport {

namespace {

using Words = std::vector<std::string>;

struct ListedMember {
  std::string name;
  std::string bytes;
  bool operator==(const ListedMember&) const = default;
};
using MemberList = std::vector<ListedMember>;

constexpr uint32_t SequencesOfTheSuite = 40;
constexpr int StepsOfASequence = 12;

uint32_t numberFrom(const char* variable, uint32_t otherwise) {
  const char* text = std::getenv(variable);
  return text == nullptr ? otherwise : static_cast<uint32_t>(std::strtoul(text, nullptr, 10));
}

class ProgramModel {
public:
  explicit ProgramModel(uint32_t seed) : m_Random(seed) {}

  void run() {
    create();
    for (int i = 0; i < StepsOfASequence && !testing::Test::HasFailure(); ++i) {
      SCOPED_TRACE("step " + std::to_string(i));
      step();
    }
  }

private:
  uint32_t pick(size_t bound) { return static_cast<uint32_t>(m_Random() % bound); }

  // No two are the same for who doesn't tell upper from lower case.
  std::string name() {
    static const Words Names = {"a",
                                "b.o",
                                "fifteen_chars.o",
                                "sixteen_chars_.o",
                                "two words.o",
                                "\xC3\xA9\xFF.o",
                                "with'quotes\".o",
                                "member_with_a_long_name.o",
                                "another_member_with_a_long_name_that_goes_on_and_on.o"};
    return Names[pick(Names.size())];
  }

  std::string bytes() {
    static const std::vector<size_t> Sizes = {0, 1, 2, 3, 59, 60, 61, 4096, 70'001};
    std::string text(Sizes[pick(Sizes.size())], '\0');
    for (char& byte : text)
      byte = static_cast<char>(m_Random());
    if (pick(2) == 0) return text;
    return objectThatDefines("symbol_" + std::to_string(m_Random())).bytes() + text;
  }

  MemberList::iterator find(const std::string& name) {
    return std::find_if(m_List.begin(), m_List.end(),
                        [&](const ListedMember& member) { return member.name == name; });
  }

  // Some files with new bytes, each name once.
  MemberList someFiles() {
    MemberList files;
    for (uint32_t count = pick(4) + 1; count != 0; --count) {
      const std::string leaf = name();
      const bool isTwice = std::any_of(files.begin(), files.end(),
                                       [&](const ListedMember& file) { return file.name == leaf; });
      if (isTwice) continue;
      files.push_back({leaf, bytes()});
      m_Folder.write(leaf, files.back().bytes);
    }
    return files;
  }

  ToolRun runWords(Words words, const MemberList& files = {}) {
    for (const ListedMember& file : files)
      words.push_back(file.name);
    const ToolRun result = m_Folder.runProgram(words);
    EXPECT_EQ(result.status, 0) << testing::PrintToString(words) << result.errors;
    return result;
  }

  void create() {
    m_List = someFiles();
    runWords({"--create", "lib.a"}, m_List);
    compare();
  }

  // Those that are there keep their places; the others come to the end, or beside a member.
  void insert() {
    const MemberList files = someFiles();
    Words words = {pick(2) == 0 ? "-r" : "-q"};
    size_t place = m_List.size();
    if (pick(2) == 0 && !m_List.empty()) {
      const uint32_t anchor = pick(m_List.size());
      const bool isBehind = pick(2) == 0;
      words.insert(words.end(), {isBehind ? "-a" : "-b", m_List[anchor].name});
      place = anchor + (isBehind ? 1 : 0);
    }
    words.emplace_back("lib.a");
    runWords(words, files);
    for (const ListedMember& file : files) {
      const auto found = find(file.name);
      if (found != m_List.end())
        found->bytes = file.bytes;
      else
        m_List.insert(m_List.begin() + static_cast<std::ptrdiff_t>(place++), file);
    }
  }

  void remove() {
    const std::string gone = m_List[pick(m_List.size())].name;
    runWords({"-d", "lib.a", gone});
    m_List.erase(find(gone));
  }

  void move() {
    const ListedMember moved = m_List[pick(m_List.size())];
    const std::string anchor = m_List[pick(m_List.size())].name;
    const bool hasAnchor = anchor != moved.name && pick(3) != 0;
    const bool isBehind = pick(2) == 0;
    Words words = {"-m"};
    if (hasAnchor) words.insert(words.end(), {isBehind ? "-a" : "-b", anchor});
    words.insert(words.end(), {"lib.a", moved.name});
    runWords(words);
    m_List.erase(find(moved.name));
    const auto place = hasAnchor ? find(anchor) + (isBehind ? 1 : 0) : m_List.end();
    m_List.insert(place, moved);
  }

  void extract() {
    for (const ListedMember& member : m_List)
      m_Folder.remove(member.name);
    runWords({"-x", "lib.a"});
    for (const ListedMember& member : m_List)
      EXPECT_TRUE(m_Folder.read(member.name) == member.bytes) << member.name;
  }

  void print() {
    std::string all;
    for (const ListedMember& member : m_List)
      all += member.bytes;
    EXPECT_TRUE(runWords({"-p", "lib.a"}).output == all);
  }

  // What was written, read and written once more is the same.
  void rewrite() {
    const Words words = pick(3) == 0 ? Words{"-n", "-s", "lib.a"} : Words{"-s", "lib.a"};
    runWords(words);
    const std::string written = m_Folder.read("lib.a");
    runWords(words);
    EXPECT_TRUE(m_Folder.read("lib.a") == written) << "a rewrite with nothing to do differs";
  }

  void compare() {
    std::string error;
    MemberList found;
    for (const ParsedMember& member : parseArchive(m_Folder.read("lib.a"), error)) {
      if (!member.name.empty()) found.push_back({member.name, member.contents});
    }
    EXPECT_EQ(error, "");
    ASSERT_EQ(found.size(), m_List.size());
    for (size_t i = 0; i < m_List.size(); ++i) {
      EXPECT_EQ(found[i].name, m_List[i].name);
      EXPECT_TRUE(found[i].bytes == m_List[i].bytes) << m_List[i].name;
    }
  }

  void step() {
    const uint32_t action = pick(12);
    if (m_List.empty() || action < 5)
      insert();
    else if (action < 7)
      remove();
    else if (action < 9)
      move();
    else if (action < 10)
      extract();
    else if (action < 11)
      print();
    else
      rewrite();
    compare();
  }

  std::mt19937 m_Random;
  ToolFolder m_Folder;
  MemberList m_List;
};

// What the run that follows finds around it; as it was when this is gone.
class Surroundings {
public:
  Surroundings(const char* zone, const char* locale, mode_t mask, bool isOnOneProcessor)
      : m_Mask(umask(mask)) {
    sched_getaffinity(0, sizeof m_Processors, &m_Processors);
    setenv("TZ", zone, 1);
    setenv("LC_ALL", locale, 1);
    setenv("USER", zone, 1);
    if (!isOnOneProcessor) return;
    int first = 0;
    while (!CPU_ISSET(first, &m_Processors))
      ++first;
    cpu_set_t one;
    CPU_ZERO(&one);
    CPU_SET(first, &one);
    sched_setaffinity(0, sizeof one, &one);
  }
  ~Surroundings() {
    sched_setaffinity(0, sizeof m_Processors, &m_Processors);
    umask(m_Mask);
    for (const char* variable : {"TZ", "LC_ALL", "USER"})
      unsetenv(variable);
  }
  Surroundings(const Surroundings&) = delete;
  Surroundings& operator=(const Surroundings&) = delete;

private:
  mode_t m_Mask;
  cpu_set_t m_Processors;
};

// Who may become another user is him meanwhile.
class SomebodyElse {
public:
  SomebodyElse() {
    constexpr uid_t Daemon = 1;
    m_MayBeHim = seteuid(Daemon) == 0;
  }
  ~SomebodyElse() { m_MayBeHim = m_MayBeHim && seteuid(m_User) == 0; }
  SomebodyElse(const SomebodyElse&) = delete;
  SomebodyElse& operator=(const SomebodyElse&) = delete;

  // The program may lie where only its builder can start it, and folders where only he makes some.
  static bool canStartIt() {
    return faccessat(AT_FDCWD, testing::TempDir().c_str(), W_OK, AT_EACCESS) == 0 &&
           ToolFolder().runProgram({"--vsn"}).status == 0;
  }

private:
  const uid_t m_User = geteuid();
  bool m_MayBeHim = false;
};

constexpr int FilesOfALibrary = 40;

// In the order that they are made in, which many file systems list them in.
void writeFiles(const ToolFolder& folder, uint32_t order) {
  std::vector<int> numbers;
  for (int i = 0; i < FilesOfALibrary; ++i)
    numbers.push_back(i);
  std::mt19937 random(order);
  if (order != 0) std::shuffle(numbers.begin(), numbers.end(), random);
  for (const int number : numbers) {
    const std::string text = std::to_string(number);
    const std::string leaf = (number % 3 == 0 ? "member_with_a_long_name_" : "m_") + text + ".o";
    ObjectBuilder builder = objectThatDefines("symbol_" + text);
    folder.write(leaf, builder.tail(std::string(static_cast<size_t>(number), 't')).bytes());
    const std::string path = folder.getName() + "/" + leaf;
    std::filesystem::permissions(path, std::filesystem::perms(order % 2 == 0 ? 0600 : 0755));
    std::filesystem::last_write_time(path, std::filesystem::file_time_type::clock::now() -
                                               std::chrono::hours(order * 1000));
    constexpr uid_t Nobody = 65534;
    // Who may not do that is somebody else himself.
    if (order % 2 == 1 && chown(path.c_str(), Nobody, Nobody) != 0) continue;
  }
}

std::string makeNormalised(uint32_t order, const Surroundings&) {
  const ToolFolder folder;
  writeFiles(folder, order);
  EXPECT_EQ(folder.runProgram({"--create", "--normalise=5", "lib.a", "*.o"}).status, 0);
  EXPECT_EQ(folder.runProgram({"-d", "lib.a", "m_4.o", "member_with_a_long_name_9.o"}).status, 0);
  EXPECT_EQ(folder.runProgram({"-r", "--normalise=5", "lib.a", "m_?.o"}).status, 0);
  return folder.read("lib.a");
}

// The same number whatever the build: those of the sanitizers shake what is sorted and hashed.
uint64_t digestOf(const std::string& bytes) {
  uint64_t digest = 14695981039346656037U;
  for (const char byte : bytes)
    digest = (digest ^ static_cast<unsigned char>(byte)) * 1099511628211U;
  return digest;
}

} // namespace

TEST(ProgramModel, EditsAsOneEditsAList) {
  const uint32_t first = numberFrom("QUARN_MODEL_SEED", 1);
  const uint32_t count = numberFrom("QUARN_MODEL_SEQUENCES", SequencesOfTheSuite);
  for (uint32_t seed = first; seed < first + count && !HasFailure(); ++seed) {
    SCOPED_TRACE("QUARN_MODEL_SEED=" + std::to_string(seed));
    ProgramModel(seed).run();
  }
}

TEST(ProgramSurroundings, ChangeNoByteOfANormalisedArchive) {
  constexpr uint64_t Digest = 15866430123380208960U;
  const std::string plain = makeNormalised(0, Surroundings("UTC0", "C", 022, false));
  EXPECT_EQ(digestOf(plain), Digest);
  EXPECT_TRUE(makeNormalised(1, Surroundings("Asia/Tokyo", "C.UTF-8", 077, true)) == plain);
  EXPECT_TRUE(makeNormalised(2, Surroundings("NST3:30NDT", "de_DE.UTF-8", 0, false)) == plain);
  EXPECT_TRUE(makeNormalised(3, Surroundings("", "ja_JP.SJIS", 0177, true)) == plain);
  const SomebodyElse user;
  if (!SomebodyElse::canStartIt()) return;
  EXPECT_TRUE(makeNormalised(4, Surroundings("UTC0", "C", 022, false)) == plain);
}

} // namespace testsupport
