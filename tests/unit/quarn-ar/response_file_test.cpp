// SPDX-License-Identifier: Apache-2.0
//
// Words from response files: both ways of quoting, files that name others, and those that can't be
// taken.

#include "quarn-ar/response_file.h"

#include "tests/unit/quarn-ar/ar_fixture.h"

namespace quarn_ar {

namespace {

Words split(std::string_view text, Quoting quoting) {
  return splitWords(text, quoting).value_or(Words{"(no end)"});
}

struct Example {
  std::string_view text;
  Words posix;
  Words windows;
};

TEST(SplitWords, ReadsEitherQuoting) {
  const Words noEnd = {"(no end)"};
  const Example examples[] = {
      {"", {}, {}},
      {" \t\r\n\v\f", {}, {}},
      {"a b\nc", {"a", "b", "c"}, {"a", "b", "c"}},
      {"\"a b\" c", {"a b", "c"}, {"a b", "c"}},
      {"'a b'", {"a b"}, {"'a", "b'"}},
      {"a\"b c\"d", {"ab cd"}, {"ab cd"}},
      {"\"\" x", {"", "x"}, {"", "x"}},
      {"''", {""}, {"''"}},
      {"a\\ b", {"a b"}, {"a\\", "b"}},
      {"c:\\d\\e.o", {"c:de.o"}, {"c:\\d\\e.o"}},
      {"\\\\s\\x", {"\\sx"}, {"\\\\s\\x"}},
      {"a\\\"b", {"a\"b"}, {"a\"b"}},
      {"\"c:\\d e\\\\\"", {"c:d e\\"}, {"c:\\d e\\"}},
      {"\"a\\\\\\\"b\"", {"a\\\"b"}, {"a\\\"b"}},
      {"\"a\"\"b\"", {"ab"}, {"a\"b"}},
      {"'a\\'b'", {"a'b"}, {"'a\\'b'"}},
      {"'\"'", {"\""}, noEnd},
      {"\"'\"", {"'"}, {"'"}},
      {"\"open", noEnd, noEnd},
      {"'open", noEnd, {"'open"}},
      {"end\\", {"end"}, {"end\\"}},
  };
  for (const Example& example : examples) {
    EXPECT_EQ(split(example.text, Quoting::Posix), example.posix) << example.text;
    EXPECT_EQ(split(example.text, Quoting::Windows), example.windows) << example.text;
  }
}

class ResponseFileTest : public ArTest {};

TEST_F(ResponseFileTest, StandsForItsWords) {
  givenFile("a.o");
  givenFile("b c.o");
  m_Host.addFile("words", std::string_view("lib.a\n@more\n"));
  m_Host.addFile("more", std::string_view("a.o 'b c.o'"));
  EXPECT_EQ(ar({"rc", "@words"}).status, 0);
  EXPECT_THAT(names(), ElementsAre("a.o", "b c.o"));
}

TEST_F(ResponseFileTest, MayHoldOptionsAndTheOperation) {
  givenFile("a.o");
  m_Host.addFile("words", std::string_view("rc lib.a a.o"));
  EXPECT_EQ(ar({"@words"}).status, 0);
  EXPECT_THAT(names(), ElementsAre("a.o"));
}

TEST_F(ResponseFileTest, IsQuotedAsTheCommandLineSays) {
  givenFile("a\\b.o");
  m_Host.addFile("words", std::string_view("a\\b.o"));
  for (const Words& option : {Words{"--rsp-quoting=windows"}, Words{"--rsp-quoting", "windows"}}) {
    Words words = option;
    words.insert(words.end(), {"rc", "lib.a", "@words"});
    EXPECT_EQ(ar(words).status, 0);
    EXPECT_THAT(names(), ElementsAre("a\\b.o"));
    EXPECT_EQ(m_Host.remove("lib.a"), 0);
  }
  EXPECT_THAT(refusal({"rc", "lib.a", "@words"}), HasSubstr("File 'ab.o' does not exist"));
  EXPECT_EQ(refusal({"--rsp-quoting=odd", "rc", "lib.a", "@words"}),
            "quarn-ar: Error: there is no quoting 'odd'\n");
}

TEST_F(ResponseFileTest, IsNotQuotedAsTheNameOfAFileSays) {
  givenFile("--rsp-quoting-notes.o");
  EXPECT_EQ(ar({"rc", "lib.a", "--", "--rsp-quoting-notes.o"}).status, 0);
  EXPECT_THAT(names(), ElementsAre("--rsp-quoting-notes.o"));
}

TEST_F(ResponseFileTest, IsReadToItsEndWhateverSizeItTells) {
  std::string words = "rc lib.a a.o";
  words.append(100000, ' ');
  m_Host.addFile("words", words + "b.o").toldSize = 0;
  givenFile("a.o");
  givenFile("b.o");
  EXPECT_EQ(ar({"@words"}).status, 0);
  EXPECT_THAT(names(), ElementsAre("a.o", "b.o"));
}

TEST_F(ResponseFileTest, IsRefusedWhereItCannotBeRead) {
  m_Host.addFile("open", std::string_view("lib.a \"a.o"));
  m_Host.addFile("nul", std::string_view("lib.a a.o\0b.o", 13));
  m_Host.addFile("self", std::string_view("lib.a @self"));
  m_Host.addFile("one", std::string_view("lib.a @two"));
  m_Host.addFile("two", std::string_view("a.o @one"));
  EXPECT_EQ(refusal({"rc", "@gone"}), "quarn-ar: Error: the response file 'gone' can't be opened: "
                                      "No such file or directory\n");
  EXPECT_EQ(refusal({"rc", "@open"}),
            "quarn-ar: Error: the response file 'open' has a quote without an end\n");
  EXPECT_EQ(refusal({"rc", "@nul"}),
            "quarn-ar: Error: the response file 'nul' holds a NUL character\n");
  EXPECT_EQ(refusal({"rc", "@self"}),
            "quarn-ar: Error: the response file 'self' leads back to itself\n");
  EXPECT_EQ(refusal({"rc", "@one"}),
            "quarn-ar: Error: the response file 'one' leads back to itself\n");
  m_Host.addFile("cut", std::string_view("lib.a a.o")).toldSize = 100;
  EXPECT_EQ(refusal({"rc", "@cut"}), "quarn-ar: Error: the response file 'cut' can't be read: "
                                     "Unexpected end of file\n");
  m_Host.addFile("pipe", std::string_view("lib.a a.o")).kind = support::FileKind::Special;
  EXPECT_EQ(refusal({"rc", "@pipe"}),
            "quarn-ar: Error: the response file 'pipe' is no regular file\n");
  EXPECT_FALSE(m_Host.has("lib.a"));
}

// Each of them names the next one twice.
TEST_F(ResponseFileTest, CannotDoubleForEver) {
  for (int i = 0; i < 40; ++i) {
    const std::string next = " @" + std::to_string(i + 1);
    m_Host.addFile(std::to_string(i), next + next);
  }
  m_Host.addFile("40", std::string_view(""));
  EXPECT_EQ(refusal({"rc", "@0"}), "quarn-ar: Error: more than 2000 response files\n");
}

TEST_F(ResponseFileTest, IsAWordWhereNoNameFollows) {
  EXPECT_THAT(refusal({"rc", "lib.a", "@"}), HasSubstr("File '@' does not exist"));
}

} // namespace

} // namespace quarn_ar
