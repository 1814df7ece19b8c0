// SPDX-License-Identifier: Apache-2.0
//
// The driver on a host in memory. A test puts files and an archive "lib.a" there, runs a command
// line, and looks at what became of the archive and at what was said:
//
//   givenLibrary({"a.o", "b.o"});
//   givenFile("x.o");
//   EXPECT_EQ(run({"-r", "-a", "a.o", "lib.a", "x.o"}).status, 0);
//   EXPECT_THAT(names(), ElementsAre("a.o", "x.o", "b.o"));
//
// All files are small objects, told apart by a text behind them, so that nothing is said of members
// that are none.
#pragma once

#include "alloclib/interface/region_objects.h"
#include "quarn/quarn_main.h"
#include "quarn/reporting.h"
#include "quarn/start_up.h"
#include "tests/support/archive_builder.h"
#include "tests/support/memory_host.h"
#include "tests/support/messages_fixture.h"
#include "tests/support/object_builder.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <string>
#include <string_view>
#include <vector>

namespace quarn {

using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;

using Words = std::vector<std::string>;

// The words as a program gets them, its own name in front.
class Arguments {
public:
  explicit Arguments(const Words& words) : m_Words(words), m_Pointers{"quarn"} {
    for (const std::string& word : m_Words)
      m_Pointers.push_back(word.c_str());
    m_Pointers.push_back(nullptr);
  }
  [[nodiscard]] int count() const { return static_cast<int>(m_Words.size() + 1); }
  [[nodiscard]] const char* const* values() const { return m_Pointers.data(); }

private:
  Words m_Words;
  std::vector<const char*> m_Pointers;
};

struct RunOutcome {
  int status = 0;
  std::string output;
  std::string errors;
};

class DriverTest : public messages::MessagesTest {
protected:
  static constexpr int64_t OldDate = 1'000'000'000; // of each file and member, if nothing is said

  static std::string objectBytes(std::string_view text) {
    return testsupport::object().bytes() + std::string(text);
  }

  void givenFile(const std::string& name, std::string_view text = "", int64_t date = OldDate) {
    m_Host.addFile(name, objectBytes(text)).modificationTime = date;
  }

  // "lib.a" with a member of each name; its text is the name.
  void givenLibrary(const Words& names) {
    testsupport::ArchiveBuilder library = testsupport::archive();
    for (const std::string& name : names)
      library.member(name, objectBytes(name));
    m_Host.addFile("lib.a", library.bytes());
  }

  RunOutcome run(const Words& words) { return runWork(quarnMain, "quarn", words); }

  // Any program on the driver's road.
  RunOutcome runWork(Work work, const char* toolName, const Words& words) {
    return runWork(work, toolName, words, m_Host);
  }
  RunOutcome runWork(Work work, const char* toolName, const Words& words, support::Host& host) {
    messages::StringSink output;
    messages::StringSink errors;
    messages::setOutputSinks(&output, &errors);
    messages::initialise();
    const Arguments arguments(words);
    RunOutcome outcome;
    outcome.status = statusOf([&] {
      work(arguments.count(), arguments.values(), toolName, host, *m_Memory);
      messages::endProcess(hasErrors() ? 1 : 0);
    });
    messages::flushAll();
    outcome.output = output.getText();
    outcome.errors = errors.getText();
    messages::setOutputSinks(&m_Output, &m_Error);
    return outcome;
  }

  // The members of "lib.a" as they stand in the file, without the tables.
  [[nodiscard]] std::vector<testsupport::ParsedMember> members() const {
    std::string error;
    std::vector<testsupport::ParsedMember> all =
        testsupport::parseArchive(m_Host.read("lib.a"), error);
    EXPECT_EQ(error, "");
    std::erase_if(all, [](const auto& member) { return member.name.empty(); });
    return all;
  }
  [[nodiscard]] Words names() const {
    Words all;
    for (const testsupport::ParsedMember& member : members())
      all.push_back(member.name);
    return all;
  }
  // What is behind the object in each member.
  [[nodiscard]] Words texts() const {
    Words all;
    for (const testsupport::ParsedMember& member : members())
      all.push_back(member.contents.substr(testsupport::object().bytes().size()));
    return all;
  }

  testsupport::MemoryHost m_Host;
  alloclib::RegionOwner m_Memory{alloclib::RegionGeneral::Create(1024, "test memory")};
};

} // namespace quarn
