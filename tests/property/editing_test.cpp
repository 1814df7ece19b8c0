// SPDX-License-Identifier: Apache-2.0
//
// Random editing sequences against a plain list of names and bytes. The seeds are fixed: a failure
// comes back.
//
// Each written file is taken apart by the strict parser of the archive builder, which knows nothing
// of the library, and compared with the list; and a second write, or a rewrite with nothing to do,
// gives the same bytes.

#include "arlib/interface/archive.h"
#include "arlib/interface/archive_file_reader.h"
#include "arlib/interface/archive_file_writer.h"
#include "arlib/interface/name_order.h"
#include "tests/support/archive_builder.h"
#include "tests/support/memory_host.h"
#include "tests/support/object_builder.h"
#include "tests/support/recording_handler.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <memory>
#include <random>
#include <utility>

namespace arlib {

namespace {

using testsupport::MemoryHost;
using testsupport::parseArchive;
using testsupport::ParsedMember;
using testsupport::RecordingHandler;

using Model = std::vector<std::pair<std::string, std::string>>;

constexpr int StepsOfASequence = 120;

class Editing {
public:
  explicit Editing(uint32_t seed) : m_Random(seed) { open(); }

  void run() {
    for (int i = 0; i < StepsOfASequence && !testing::Test::HasFailure(); ++i) {
      SCOPED_TRACE("step " + std::to_string(i));
      step();
    }
    save();
    reload();
    // Random bytes may look like an object, and be none that can be read.
    EXPECT_THAT(m_Handler.reports, testing::Each(testing::HasSubstr("Unable to read symbols")));
    EXPECT_EQ(m_Host.openHandles(), 0u);
  }

private:
  uint32_t pick(uint32_t bound) { return static_cast<uint32_t>(m_Random() % bound); }

  std::string name() {
    static const std::vector<std::string> Names = {
        "a",
        "A",
        "b.o",
        "B.O",
        "fifteen_chars.o",
        "sixteen_chars_.o",
        "SIXTEEN_chars_.o",
        "a name with blanks ",
        "member_with_a_long_name.o",
        "a",
        "\xC3\xA9\xFF.o",
        "'\"%s\n.o",
        "another_member_with_a_long_name_that_goes_on_and_on_and_on.o"};
    return Names[pick(static_cast<uint32_t>(Names.size()))];
  }

  std::string bytes() {
    static const std::vector<size_t> Sizes = {0, 1, 2, 3, 60, 61, 4096, 40'001};
    std::string text(Sizes[pick(static_cast<uint32_t>(Sizes.size()))], '\0');
    for (char& byte : text)
      byte = static_cast<char>(m_Random());
    return pick(3) == 0 ? testsupport::object().tail(text).bytes() : text;
  }

  void open() {
    m_Archive = std::make_unique<Archive>(m_Host);
    m_Archive->setErrorHandler(&m_Handler);
    m_Archive->setFileName("lib.a");
  }

  // The members without the tables, which is what the model holds.
  std::vector<ArchiveMember*> members() {
    std::vector<ArchiveMember*> all;
    for (ArchiveMember* member : m_Archive->getMembers()) {
      if (!member->isAuxiliary()) all.push_back(member);
    }
    return all;
  }

  uint32_t tableCount() {
    return static_cast<uint32_t>(m_Archive->getMembers().size() - m_Model.size());
  }

  std::string inputFile(const std::string& memberName, const std::string& contents) {
    const std::string file = "in/" + std::to_string(m_InputCount++) + "/" + memberName;
    m_Host.addFile(file, contents);
    return file;
  }

  void add() {
    m_Model.emplace_back(name(), bytes());
    const auto& [memberName, contents] = m_Model.back();
    if (pick(4) == 0) {
      ArchiveMember* member = m_Archive->addMember(memberName, 1, 2, 3, 0100644);
      member->setContents(contents.data(), static_cast<uint32_t>(contents.size()));
    } else {
      m_Archive->addMemberFromFile(inputFile(memberName, contents).c_str());
    }
  }

  void replace(uint32_t index) {
    ArchiveMember* member = members()[index];
    const std::string contents = bytes();
    const auto size = static_cast<uint32_t>(contents.size());
    m_Model[index].second = contents;
    switch (pick(3)) {
    case 0:
      member->setContents(contents.data(), size);
      break;
    case 1:
      EXPECT_TRUE(member->setContentsFromFile(inputFile("x", contents).c_str()));
      break;
    default:
      EXPECT_TRUE(member->setContentsFromFileRegion(
          inputFile("x", "abc" + contents + "def").c_str(), 3, size));
    }
  }

  void remove(uint32_t index) {
    std::vector<ArchiveMember*> gone = {members()[index]};
    const uint32_t other = pick(static_cast<uint32_t>(m_Model.size()));
    if (pick(2) == 0 && other != index) gone.push_back(members()[other]);
    m_Archive->removeMembers(gone);
    m_Model.erase(m_Model.begin() + index);
    if (gone.size() == 2) m_Model.erase(m_Model.begin() + other - (other > index ? 1 : 0));
  }

  void move(uint32_t index) {
    const uint32_t target = pick(static_cast<uint32_t>(m_Model.size()));
    // With the tables in front, a place in the model is a place behind them.
    m_Archive->updateAuxiliaryMembers();
    m_Archive->moveMember(members()[index], target + tableCount());
    const auto moved = m_Model[index];
    m_Model.erase(m_Model.begin() + index);
    m_Model.insert(m_Model.begin() + target, moved);
  }

  void moveMany() {
    std::vector<uint32_t> indices;
    for (uint32_t i = 0; i < m_Model.size(); ++i) {
      if (pick(3) == 0) indices.push_back(i);
    }
    std::shuffle(indices.begin(), indices.end(), m_Random);
    m_Archive->updateAuxiliaryMembers();
    const auto rest = static_cast<uint32_t>(m_Model.size() - indices.size());
    const uint32_t target = pick(rest + 1);
    std::vector<ArchiveMember*> block;
    Model moved;
    for (const uint32_t index : indices) {
      block.push_back(members()[index]);
      moved.push_back(m_Model[index]);
    }
    m_Archive->moveMembers(block, target + tableCount());
    std::sort(indices.rbegin(), indices.rend());
    for (const uint32_t index : indices)
      m_Model.erase(m_Model.begin() + index);
    m_Model.insert(m_Model.begin() + target, moved.begin(), moved.end());
  }

  void rename(uint32_t index) {
    m_Model[index].first = name();
    members()[index]->setName(m_Model[index].first);
  }

  // Where the bytes are makes no difference.
  void shiftContents(uint32_t index) {
    ArchiveMember* member = members()[index];
    EXPECT_TRUE(pick(2) == 0 ? member->loadContents() : member->discardContents());
  }

  void changeMode() { m_Archive->setSymbolTableMode(static_cast<SymbolTableMode>(pick(3))); }

  void find() {
    const std::string wanted = name();
    ArchiveMemberList list;
    m_Archive->findMembers(wanted, list);
    std::vector<ArchiveMember*> expected;
    for (ArchiveMember* member : m_Archive->getMembers()) {
      if (compareIgnoringCase(member->getName(), wanted) == 0) expected.push_back(member);
    }
    ASSERT_EQ(list.getSize(), expected.size());
    for (uint32_t i = 0; i < list.getSize(); ++i)
      EXPECT_EQ(list[i], expected[i]);
  }

  static void compare(const Model& model, const std::vector<ParsedMember>& parsed) {
    Model found;
    for (const ParsedMember& member : parsed) {
      if (member.nameField != "/" && member.nameField != "//") {
        found.emplace_back(member.name, member.contents);
      }
    }
    ASSERT_EQ(found.size(), model.size());
    for (size_t i = 0; i < model.size(); ++i) {
      EXPECT_EQ(found[i].first, model[i].first) << i;
      EXPECT_TRUE(found[i].second == model[i].second) << i;
    }
  }

  void save() {
    ASSERT_TRUE(writeFile("lib.a", *m_Archive));
    const std::string written = m_Host.read("lib.a");
    std::string error;
    const std::vector<ParsedMember> parsed = parseArchive(written, error);
    EXPECT_EQ(error, "");
    compare(m_Model, parsed);
    ASSERT_EQ(parsed.size(), m_Archive->getMembers().size());
    for (size_t i = 0; i < parsed.size(); ++i)
      EXPECT_EQ(parsed[i].offset, m_Archive->getMembers()[i]->getOffset());
    // Input files and temporaries are wanted no longer.
    for (const std::string& file : m_Host.getNames()) {
      if (file != "lib.a") {
        EXPECT_EQ(m_Host.remove(file.c_str()), 0);
      }
    }
    ASSERT_TRUE(writeFile("lib.a", *m_Archive));
    EXPECT_TRUE(m_Host.read("lib.a") == written) << "the second write differs";
  }

  // Reading and writing with nothing to do changes nothing.
  void reload() {
    if (!m_Host.has("lib.a")) return;
    save();
    const std::string written = m_Host.read("lib.a");
    open();
    ASSERT_TRUE(readFile("lib.a", *m_Archive));
    ASSERT_TRUE(writeFile("lib.a", *m_Archive));
    EXPECT_TRUE(m_Host.read("lib.a") == written) << "a rewrite with nothing to do differs";
  }

  void step() {
    const uint32_t action = pick(20);
    if (m_Model.empty() || action < 6) return add();
    const uint32_t index = pick(static_cast<uint32_t>(m_Model.size()));
    if (action < 8) return replace(index);
    if (action < 10) return remove(index);
    if (action < 12) return move(index);
    if (action < 13) return moveMany();
    if (action < 15) return rename(index);
    if (action < 16) return shiftContents(index);
    if (action < 17) return changeMode();
    if (action < 18) return find();
    if (action < 19) return save();
    reload();
  }

  std::mt19937 m_Random;
  MemoryHost m_Host;
  RecordingHandler m_Handler;
  std::unique_ptr<Archive> m_Archive;
  Model m_Model;
  uint32_t m_InputCount = 0;
};

class RandomEditing : public testing::TestWithParam<uint32_t> {};

} // namespace

TEST_P(RandomEditing, AgreesWithAPlainList) {
  for (uint32_t i = 0; i < 25 && !HasFailure(); ++i) {
    const uint32_t seed = GetParam() * 1000 + i;
    SCOPED_TRACE("seed " + std::to_string(seed));
    Editing(seed).run();
  }
}

INSTANTIATE_TEST_SUITE_P(Seeds, RandomEditing, testing::Range(0u, 8u));

// An archive of anybody's making that can be read and is written twice comes out the same twice.
TEST(Rewriting, IsSettledAfterTheFirstTime) {
  std::mt19937 random(4711);
  for (int i = 0; i < 200; ++i) {
    testsupport::ArchiveBuilder builder;
    const bool hasNames = random() % 2 == 0;
    if (random() % 2 == 0) builder.symbolTable({}).blankNumbers();
    if (hasNames)
      builder.longNames({"dir/a_long_name_of_a_member.o", "unused", "b_name_of_16.o__"});
    builder.member("first", "x");
    for (uint32_t count = static_cast<uint32_t>(random() % 5); count != 0; --count) {
      const std::string body(random() % 70, 'b');
      switch (random() % 4) {
      case 0:
        builder.member("m", body);
        break;
      case 1:
        builder.memberWithNameField(hasNames ? "/4" : "n/", body);
        break;
      case 2:
        builder.memberWithNameField("/", body).blankNumbers();
        break;
      default:
        builder.member("o", body).numbers(5, 6, 7, "777").badPadding(body.size() % 2 ? '?' : '\n');
        if (body.size() % 2 == 0) builder.noPadding();
      }
    }
    MemoryHost host;
    host.addFile("lib.a", builder.bytes());
    RecordingHandler handler;
    Archive first(host);
    first.setErrorHandler(&handler);
    ASSERT_TRUE(readFile("lib.a", first)) << handler.reports.front();
    ASSERT_TRUE(writeFile("lib.a", first));
    const std::string written = host.read("lib.a");
    handler.take();
    Archive second(host);
    second.setErrorHandler(&handler);
    ASSERT_TRUE(readFile("lib.a", second));
    ASSERT_TRUE(writeFile("lib.a", second));
    EXPECT_EQ(host.read("lib.a"), written);
    EXPECT_TRUE(handler.reports.empty());
  }
}

} // namespace arlib
