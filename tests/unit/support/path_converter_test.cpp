// SPDX-License-Identifier: Apache-2.0
//
// The dialogue with a converter that does as the test says, above all that no answer is ever taken
// for another name's, and that no converter makes the tool start or wait without end.

#include "support/interface/path_converter.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <functional>
#include <string>
#include <utility>
#include <vector>

namespace support {

namespace {

using testing::ElementsAre;
using testing::IsEmpty;

// A converter whose answers, or lack of them, are a function of the name.
class ScriptedProcess final : public ConverterProcess {
public:
  struct Answer {
    std::string line = {};
    ConverterReply reply = ConverterReply::Done;
  };
  using Script = std::function<Answer(const std::string& name)>;

  explicit ScriptedProcess(Script script) : m_Script(std::move(script)) {}

  bool start() override {
    EXPECT_FALSE(m_IsRunning);
    ++m_Starts;
    m_IsRunning = m_Starts <= m_MostStarts;
    return m_IsRunning;
  }
  ConverterReply send(std::string_view line, ConverterDeadline deadline) override {
    EXPECT_TRUE(m_IsRunning);
    m_Deadline = deadline;
    m_Sent.emplace_back(line);
    return m_SendReply;
  }
  ConverterReply readLine(std::string& line, size_t longest, ConverterDeadline deadline) override {
    EXPECT_TRUE(m_IsRunning);
    EXPECT_EQ(deadline, m_Deadline);
    const std::string& sent = m_Sent.back();
    const Answer answer = m_Script(sent.substr(0, sent.size() - 1));
    if (answer.line.size() > longest) return ConverterReply::Unusable;
    line = answer.line;
    return answer.reply;
  }
  void end() override { m_IsRunning = false; }

  void setMostStarts(int count) { m_MostStarts = count; }
  void setSendReply(ConverterReply reply) { m_SendReply = reply; }
  [[nodiscard]] int getStarts() const { return m_Starts; }
  [[nodiscard]] bool isRunning() const { return m_IsRunning; }
  [[nodiscard]] const std::vector<std::string>& getSent() const { return m_Sent; }
  [[nodiscard]] ConverterDeadline getDeadline() const { return m_Deadline; }

private:
  Script m_Script;
  ConverterReply m_SendReply = ConverterReply::Done;
  ConverterDeadline m_Deadline;
  std::vector<std::string> m_Sent;
  int m_Starts = 0;
  int m_MostStarts = 1000;
  bool m_IsRunning = false;
};

ScriptedProcess::Answer answerPlainly(const std::string& name) {
  return {"C:\\root" + name + "\n"};
}

// Breaks on names with "bad" in them, and answers others.
ScriptedProcess::Answer breakOnBadNames(const std::string& name) {
  if (name.find("bad") == std::string::npos) return answerPlainly(name);
  return {{}, ConverterReply::Broken};
}

std::string convertedWith(const std::string& answer, const std::string& name) {
  ScriptedProcess process([answer](const std::string&) { return ScriptedProcess::Answer{answer}; });
  return PathConverter(process).convert(name);
}

} // namespace

TEST(PathConverter, AsksForANameOnALine) {
  ScriptedProcess process(answerPlainly);
  PathConverter converter(process);
  EXPECT_EQ(converter.convert("/a b"), "C:\\root/a b");
  EXPECT_THAT(process.getSent(), ElementsAre("/a b\n"));
}

TEST(PathConverter, StartsNothingBeforeANameNeedsIt) {
  ScriptedProcess process(answerPlainly);
  PathConverter converter(process);
  EXPECT_EQ(converter.convert("C:\\a"), "C:\\a");
  EXPECT_EQ(process.getStarts(), 0);
}

TEST(PathConverter, StartsOneProcessForAllNames) {
  ScriptedProcess process(answerPlainly);
  PathConverter converter(process);
  EXPECT_EQ(converter.convert("/a"), "C:\\root/a");
  EXPECT_EQ(converter.convert("/b"), "C:\\root/b");
  EXPECT_EQ(process.getStarts(), 1);
}

TEST(PathConverter, NeverAsksForTheHostsOwnNames) {
  ScriptedProcess process(answerPlainly);
  PathConverter converter(process);
  for (const char* name : {"C:\\a", "c:/a", "z:\\", "\\\\server\\share\\a", "\"C:\\a b\"", "\"d:/a",
                           "\"\\\\server\\share\""})
    EXPECT_EQ(converter.convert(name), name);
  EXPECT_THAT(process.getSent(), IsEmpty());
}

TEST(PathConverter, AsksForAllOtherNames) {
  ScriptedProcess process(answerPlainly);
  PathConverter converter(process);
  for (const std::string name : {"a.o", "C:", "C:a", "1:\\a", "\\a", "//server/a", "\"\"C:\\a",
                                 "\"/a", "'C:\\a'", "a\\b", " C:\\a", "\xC3\xA9"})
    EXPECT_EQ(converter.convert(name), "C:\\root" + name);
}

TEST(PathConverter, AsksForANameOnceARun) {
  ScriptedProcess process(answerPlainly);
  PathConverter converter(process);
  EXPECT_EQ(converter.convert("/a"), "C:\\root/a");
  EXPECT_EQ(converter.convert("/a"), "C:\\root/a");
  EXPECT_THAT(process.getSent(), ElementsAre("/a\n"));
}

// A converter would see two names, and both answers would be for the first.
TEST(PathConverter, LeavesANameOfTwoLines) {
  ScriptedProcess process(answerPlainly);
  PathConverter converter(process);
  EXPECT_EQ(converter.convert("/a\n/b"), "/a\n/b");
  EXPECT_EQ(converter.convert("/a\n"), "/a\n");
  EXPECT_EQ(process.getStarts(), 0);
}

TEST(PathConverter, LeavesAnEmptyName) {
  ScriptedProcess process(answerPlainly);
  EXPECT_EQ(PathConverter(process).convert(""), "");
  EXPECT_EQ(process.getStarts(), 0);
}

TEST(PathConverter, TakesAnyLineEnd) {
  EXPECT_EQ(convertedWith("C:\\x\n", "/a"), "C:\\x");
  EXPECT_EQ(convertedWith("C:\\x\r\n", "/a"), "C:\\x");
  EXPECT_EQ(convertedWith("C:\\x\r\r\n", "/a"), "C:\\x");
}

TEST(PathConverter, TakesALineOf260Bytes) {
  const std::string longest(259, 'x');
  EXPECT_EQ(convertedWith(longest + "\n", "/a"), longest);
  EXPECT_EQ(convertedWith(longest + "y\n", "/a"), "/a");
}

TEST(PathConverter, LeavesANameWithoutAnAnswer) {
  EXPECT_EQ(convertedWith("\n", "/a"), "/a");
  EXPECT_EQ(convertedWith("\r\n", "/a"), "/a");
  EXPECT_EQ(convertedWith(std::string("C:\\\0x\n", 6), "/a"), "/a");
}

TEST(PathConverter, GivesAPatternItsWildcardsBack) {
  EXPECT_EQ(convertedWith("C:\\\xEF\x80\xAA.\xEF\x80\xBF\xEF\x80\xBF\n", "/*.??"), "C:\\*.??");
  EXPECT_EQ(convertedWith("C:\\\xEF\x80\xAA.\xEF\x80\xBF\n", "/?"), "C:\\*.?");
}

TEST(PathConverter, LeavesPrivateCharactersOfOtherNames) {
  EXPECT_EQ(convertedWith("C:\\\xEF\x80\xAA\xEF\x80\xBF\n", "/a"), "C:\\\xEF\x80\xAA\xEF\x80\xBF");
  EXPECT_EQ(convertedWith("C:\\\xEF\x80\xA2\n", "/*"), "C:\\\xEF\x80\xA2");
}

TEST(PathConverter, IsOffWhereThereIsNoConverter) {
  ScriptedProcess process(answerPlainly);
  process.setMostStarts(0);
  PathConverter converter(process);
  EXPECT_EQ(converter.convert("/a"), "/a");
  EXPECT_EQ(converter.convert("/b"), "/b");
  EXPECT_EQ(process.getStarts(), 1);
}

TEST(PathConverter, IsOffWhereThereIsNoConverterAnyMore) {
  ScriptedProcess process(breakOnBadNames);
  process.setMostStarts(1);
  PathConverter converter(process);
  EXPECT_EQ(converter.convert("/bad"), "/bad");
  EXPECT_EQ(converter.convert("/a"), "/a");
  EXPECT_EQ(process.getStarts(), 2);
}

TEST(PathConverter, AsksAFreshConverterWhereOneBreaks) {
  int asked = 0;
  ScriptedProcess process([&asked](const std::string& name) {
    ++asked;
    return asked % 3 == 0 ? ScriptedProcess::Answer{{}, ConverterReply::Broken}
                          : answerPlainly(name);
  });
  PathConverter converter(process);
  for (const std::string name : {"/a", "/b", "/c", "/d", "/e"})
    EXPECT_EQ(converter.convert(name), "C:\\root" + name);
  EXPECT_THAT(process.getSent(),
              ElementsAre("/a\n", "/b\n", "/c\n", "/c\n", "/d\n", "/e\n", "/e\n"));
  EXPECT_EQ(process.getStarts(), 3);
}

TEST(PathConverter, AsksAFreshConverterWhereOneDoesNotListen) {
  ScriptedProcess process(answerPlainly);
  process.setSendReply(ConverterReply::Broken);
  PathConverter converter(process);
  EXPECT_EQ(converter.convert("/a"), "/a");
  EXPECT_EQ(process.getStarts(), 2);
  process.setSendReply(ConverterReply::Done);
  EXPECT_EQ(converter.convert("/b"), "C:\\root/b");
}

// Half a line that a dying converter has left is no name.
TEST(PathConverter, TakesNothingFromABrokenConverter) {
  ScriptedProcess process([](const std::string&) {
    return ScriptedProcess::Answer{"C:\\ro", ConverterReply::Broken};
  });
  EXPECT_EQ(PathConverter(process).convert("/a"), "/a");
}

TEST(PathConverter, GoesOnBehindANameThatBreaksConverters) {
  ScriptedProcess process(breakOnBadNames);
  PathConverter converter(process);
  for (int i = 0; i < 5; ++i) {
    const std::string number = std::to_string(i);
    EXPECT_EQ(converter.convert("/bad" + number), "/bad" + number);
    EXPECT_EQ(converter.convert("/good" + number), "C:\\root/good" + number);
  }
  EXPECT_EQ(process.getStarts(), 11);
}

TEST(PathConverter, IsOffBehindThreeNamesThatBreakConverters) {
  ScriptedProcess process(breakOnBadNames);
  PathConverter converter(process);
  for (const std::string name : {"/bad1", "/bad2", "/bad3", "/good", "/bad4"})
    EXPECT_EQ(converter.convert(name), name);
  EXPECT_EQ(process.getStarts(), 6);
  EXPECT_FALSE(process.isRunning());
}

TEST(PathConverter, DoesNotAskAgainForANameThatBreaksConverters) {
  ScriptedProcess process(breakOnBadNames);
  PathConverter converter(process);
  for (int i = 0; i < 5; ++i)
    EXPECT_EQ(converter.convert("/bad"), "/bad");
  EXPECT_EQ(process.getStarts(), 2);
  EXPECT_EQ(converter.convert("/good"), "C:\\root/good");
}

TEST(PathConverter, AsksAFreshConverterForTheNameBehindAnUnusableAnswer) {
  ScriptedProcess process([](const std::string& name) {
    if (name == "/long") return ScriptedProcess::Answer{std::string(300, 'x') + "\n"};
    return answerPlainly(name);
  });
  PathConverter converter(process);
  EXPECT_EQ(converter.convert("/long"), "/long");
  EXPECT_FALSE(process.isRunning());
  EXPECT_EQ(process.getStarts(), 1);
  EXPECT_EQ(converter.convert("/a"), "C:\\root/a");
  EXPECT_EQ(process.getStarts(), 2);
}

TEST(PathConverter, IsOffBehindAHang) {
  ScriptedProcess process([](const std::string& name) {
    if (name == "/slow") return ScriptedProcess::Answer{{}, ConverterReply::Late};
    return answerPlainly(name);
  });
  PathConverter converter(process);
  EXPECT_EQ(converter.convert("/a"), "C:\\root/a");
  EXPECT_EQ(converter.convert("/slow"), "/slow");
  EXPECT_FALSE(process.isRunning());
  EXPECT_EQ(converter.convert("/b"), "/b");
  EXPECT_EQ(process.getStarts(), 1);
}

// The archive was opened under that name, and must be replaced under the same one.
TEST(PathConverter, KeepsWhatNamesMeantBeforeItIsOff) {
  ScriptedProcess process([](const std::string& name) {
    if (name == "/slow") return ScriptedProcess::Answer{{}, ConverterReply::Late};
    return answerPlainly(name);
  });
  PathConverter converter(process);
  EXPECT_EQ(converter.convert("/lib.a"), "C:\\root/lib.a");
  EXPECT_EQ(converter.convert("/slow"), "/slow");
  EXPECT_EQ(converter.convert("/lib.a"), "C:\\root/lib.a");
}

TEST(PathConverter, WaitsNoLongerForANameThanItIsTold) {
  using std::chrono::milliseconds;
  ScriptedProcess process(answerPlainly);
  PathConverter converter(process, milliseconds(1234));
  const ConverterDeadline before = std::chrono::steady_clock::now();
  EXPECT_EQ(converter.convert("/a"), "C:\\root/a");
  EXPECT_GE(process.getDeadline(), before + milliseconds(1234));
  EXPECT_LE(process.getDeadline(), std::chrono::steady_clock::now() + milliseconds(1234));
}

TEST(PathConverter, WaitsForThirtySeconds) {
  using std::chrono::seconds;
  ScriptedProcess process(answerPlainly);
  PathConverter converter(process);
  const ConverterDeadline before = std::chrono::steady_clock::now();
  EXPECT_EQ(converter.convert("/a"), "C:\\root/a");
  EXPECT_GE(process.getDeadline(), before + seconds(30));
  EXPECT_LE(process.getDeadline(), std::chrono::steady_clock::now() + seconds(30));
}

} // namespace support
