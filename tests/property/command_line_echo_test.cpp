// SPDX-License-Identifier: Apache-2.0
//
// What --show_cmdline says is a command line that does the same. Both are run by the tool, in
// folders that are alike. The seeds are fixed: a failure comes back.
//
// Words have blanks, tabs, wildcards, separators and bytes above 127 in them, which is what an echo
// could get wrong.

#include "tests/support/object_builder.h"
#include "tests/support/tool_folder.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <map>
#include <optional>
#include <random>
#include <string>
#include <string_view>
#include <vector>

namespace quarn {

namespace {

using testsupport::ToolFolder;
using testsupport::ToolRun;

using Words = std::vector<std::string>;
using Files = std::map<std::string, std::string>;

constexpr int LinesOfASeed = 60;

// The line of the echo, as no word here holds a line end. In one of the styles the tool's name
// stands in front.
struct Echo {
  std::string before; // what was said of the words themselves
  std::string text;   // without the brackets and the tool's name
  std::string after;
};

std::optional<Echo> findEcho(const std::string& errors) {
  static constexpr std::string_view Location = "quarn : ";
  static constexpr std::string_view Begin = "[quarn ";
  size_t end = 0;
  for (size_t begin = 0; (end = errors.find('\n', begin)) != std::string::npos; begin = end + 1) {
    std::string_view line(errors.data() + begin, end - begin);
    if (line.starts_with(Location)) line.remove_prefix(Location.size());
    if (!line.starts_with(Begin) || !line.ends_with(']')) continue;
    line.remove_prefix(Begin.size());
    line.remove_suffix(1);
    return Echo{errors.substr(0, begin), std::string(line), errors.substr(end)};
  }
  return std::nullopt;
}

// Words are divided by blanks and tabs; double quotes keep these and are removed.
Words splitEcho(const std::string& echo) {
  Words words;
  bool isQuoted = false;
  bool isInWord = false;
  for (const char character : echo) {
    const bool isBlank = character == ' ' || character == '\t';
    if (isBlank && !isQuoted) {
      isInWord = false;
      continue;
    }
    if (!isInWord) words.emplace_back();
    isInWord = true;
    if (character == '"') {
      isQuoted = !isQuoted;
    } else {
      words.back() += character;
    }
  }
  return words;
}

class CommandLineMaker {
public:
  explicit CommandLineMaker(uint32_t seed) : m_Random(seed) {
    std::shuffle(m_Diagnostics.begin(), m_Diagnostics.end(), m_Random);
  }

  Words make() {
    Words words = {"--show_cmdline"};
    addAction(words);
    for (uint32_t count = pick(4); count > 0; --count)
      addOption(words);
    // The day of the test must not show in what is written.
    words.push_back("--normalise=" + std::to_string(1 + pick(2'000'000'000)));
    // What was said of the words before is in English.
    static const Words Locales = {"ja_JP", "UTF-8", "en_US.65001"};
    if (pick(4) == 0) words.push_back("--message_locale=" + oneOf(Locales));
    if (pick(3) == 0) words.push_back("--");
    static const Words Archives = {"lib.a", "lib.a", "my lib.a", "caf\xC3\xA9\xFF.a", "new.a"};
    words.push_back(oneOf(Archives));
    for (uint32_t count = pick(4); count > 0; --count)
      words.push_back(text());
    return words;
  }

private:
  uint32_t pick(size_t bound) { return static_cast<uint32_t>(m_Random() % bound); }

  const std::string& oneOf(const Words& words) { return words[pick(words.size())]; }

  // Quotes are left out, as the echo doesn't protect them, and so are control characters, which are
  // shown as numbers.
  std::string text() {
    static const Words Names = {"a.txt", "a b", "\xC3\xA9\xFF", "%s'n", "tab\tx", "o.o", "*.txt",
                                "*",     "?*"};
    if (pick(2) == 0) return oneOf(Names);
    static constexpr std::string_view Characters = "atvx=,-. \t\\%#(;1A\xC3\xFF'$]";
    std::string result;
    for (uint32_t count = pick(5); count > 0; --count)
      result += Characters[pick(Characters.size())];
    return result;
  }

  void addAction(Words& words) {
    static const Words Actions = {
        "-t",      "-tv",       "-r", "-q",   "-rv",  "--create", "-d",
        "-dv",     "-m",        "-p", "-x",   "-xvC", "--zs",     "--zt",
        "--sizes", "--entries", "-s", "-tsn", "-td",  "-h",       "--vsn",
        "-V",      "--cre.",    "-c", "-zs",  "-X",   "--ver.",   "--version_number"};
    words.push_back(oneOf(Actions));
  }

  // Of the lists of diagnostics the last word on a message counts, and the echo doesn't keep the
  // order between lists: each message is spoken of once.
  void addDiagnostic(Words& words) {
    static const Words Lists = {"--diag_error", "--diag_warning", "--diag_remark",
                                "--diag_suppress"};
    if (m_Diagnostics.size() < 2) return;
    const std::string first = m_Diagnostics.back();
    m_Diagnostics.pop_back();
    const std::string second = m_Diagnostics.back();
    m_Diagnostics.pop_back();
    const char* divider = pick(2) == 0 ? "=" : ",";
    words.push_back(oneOf(Lists) + divider + first + "," + second);
  }

  void addOption(Words& words) {
    static const Words Flags = {"-v",
                                "-C",
                                "-T",
                                "-c",
                                "-n",
                                "-u",
                                "-s",
                                "-w",
                                "-N",
                                "-vv",
                                "-cTv",
                                "--no_u.",
                                "--new-files-only",
                                "-new_files_only",
                                "--debug_symbols",
                                "--no_debug_symbols",
                                "--unique_symbols",
                                "--qobix_buildattr"};
    static const Words Values = {
        "--diag_style=GNU",  "--diag_style=list",  "--diag_style=zev", "--diag_style=Devstudio",
        "--no_normalise=-3", "--normalise=0x10",   "--normalise=+7",   "--db_check=show,high",
        "--db_check=",       "--libattrmap=a map", "--libattrmap,none"};
    static const Words TextOptions = {"-a", "-b", "-i", "-A", "--libattrmap", "--db_check"};
    switch (pick(5)) {
    case 0:
      words.push_back(oneOf(Values));
      return;
    case 1:
      words.push_back(oneOf(TextOptions) + "=");
      words.back() += text();
      return;
    case 2:
      words.push_back(oneOf(TextOptions));
      words.push_back(text());
      return;
    case 3:
      return addDiagnostic(words);
    default:
      words.push_back(oneOf(Flags));
    }
  }

  std::mt19937 m_Random;
  Words m_Diagnostics = {"6875", "L6831", "l6841E", "L6833 ", "6835,", "warning", "error", "Q12",
                         "",     "0",     "L6840",  "6836",   "x y",   "-1",      "L6832", "6974"};
};

class EchoedCommandLine : public testing::TestWithParam<uint32_t> {
protected:
  void SetUp() override {
    m_Start = {{"a.txt", "a"},
               {"a b", "blank"},
               {"\xC3\xA9\xFF", "bytes"},
               {"%s'n", "percent"},
               {"tab\tx", "tab"},
               {"o.o", testsupport::objectThatDefines("main").bytes()},
               {"a map", "*_x* $IEEE1$ZEV_ISAv4\n"}};
    for (const char* archive : {"lib.a", "my lib.a", "caf\xC3\xA9\xFF.a"}) {
      restart();
      const ToolRun made = m_Folder.run({"--create", "--normalise=1", archive, "a.txt", "a b",
                                         "\xC3\xA9\xFF", "%s'n", "tab\tx", "o.o"});
      ASSERT_EQ(made.status, 0) << made.errors;
      m_Start[archive] = m_Folder.read(archive);
    }
  }

  void restart() const {
    m_Folder.removeAllBut({});
    for (const auto& [name, bytes] : m_Start)
      m_Folder.write(name, bytes);
  }

  ToolRun run(const Words& words) const {
    restart();
    return m_Folder.run(words);
  }

  Files filesNow() const {
    Files files;
    for (const std::string& leaf : m_Folder.leaves())
      files[leaf] = m_Folder.read(leaf);
    return files;
  }

  ToolFolder m_Folder;
  Files m_Start;
};

} // namespace

TEST_P(EchoedCommandLine, DoesTheSame) {
  uint32_t accepted = 0;
  for (uint32_t i = 0; i < LinesOfASeed; ++i) {
    const Words words = CommandLineMaker(GetParam() * 1000 + i).make();
    SCOPED_TRACE(testing::PrintToString(words));
    const ToolRun first = run(words);
    const std::optional<Echo> echo = findEcho(first.errors);
    // A fault in the command line ends the run, and so does a warning of it that counts as error.
    if (!echo || echo->before.find("rror") != std::string::npos) continue;
    ++accepted;
    const Files filesAfterFirst = filesNow();
    const ToolRun second = run(splitEcho(echo->text));
    const std::optional<Echo> again = findEcho(second.errors);
    ASSERT_TRUE(again) << second.errors;
    EXPECT_EQ(again->text, echo->text);
    EXPECT_THAT(again->before, testing::Not(testing::ContainsRegex("L3910|L9962")));
    EXPECT_EQ(again->after, echo->after);
    EXPECT_EQ(second.output, first.output);
    EXPECT_EQ(second.status, first.status);
    EXPECT_TRUE(filesNow() == filesAfterFirst);
    if (HasFailure()) return;
  }
  EXPECT_GT(accepted, LinesOfASeed / 2u);
}

INSTANTIATE_TEST_SUITE_P(Seeds, EchoedCommandLine, testing::Range(0u, 10u));

} // namespace quarn
