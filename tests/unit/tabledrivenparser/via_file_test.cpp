// SPDX-License-Identifier: Apache-2.0
//
// Via files as a part of the command line: nesting and its bound, what an option at a file's end
// gets, every failure of a file and what was done before it, and a file of a hundred thousand
// words. Files are in memory, and on disk where the C library's streams are tested.

#include "tool_table.h"

#include "tabledrivenparser/interface/stdio_via_file_reader.h"

#include <cstdio>
#include <ctime>
#include <filesystem>
#include <iterator>
#include <utility>

namespace tabledrivenparser::tool {

using testing::ElementsAre;
using testing::IsEmpty;

class ViaOption : public testing::Test {
protected:
  std::map<std::string, std::string>& files() { return m_Session.m_Files.m_Contents; }

  Session m_Session;
};

TEST_F(ViaOption, ReadsWordsAtItsPlace) {
  files()["f"] = "-t b\n--diag_style=gnu c";
  m_Session.parse({"a", "--via", "f", "d"});
  EXPECT_TRUE(m_Session.parser().getBoolean(Id_List));
  EXPECT_THAT(m_Session.texts(Id_Words), ElementsAre("a", "b", "c", "d"));
  EXPECT_THAT(m_Session.texts(Id_Via), ElementsAre("f"));
  EXPECT_THAT(m_Session.getReports(), IsEmpty());
  EXPECT_THAT(m_Session.m_Listener.m_Lines,
              ElementsAre("24=a", "9=1", "24=b", "20=4", "24=c", "24=d"));
  EXPECT_EQ(m_Session.m_Files.m_OpenCount, 0);
}

TEST_F(ViaOption, AddsNothingFromAnEmptyFile) {
  files()["f"] = "";
  m_Session.parse({"--via=f"});
  EXPECT_THAT(m_Session.texts(Id_Via), ElementsAre("f"));
  EXPECT_THAT(m_Session.getReports(), IsEmpty());
}

TEST_F(ViaOption, WorksWithOneDashAndAWarning) {
  files()["f"] = "x";
  m_Session.parse({"-via", "f"});
  EXPECT_THAT(m_Session.texts(Id_Words), ElementsAre("x"));
  EXPECT_THAT(m_Session.getReports(), ElementsAre("warning: Old syntax, please use '--via'."));
}

TEST_F(ViaOption, ReadsEachFileOfAList) {
  files()["a"] = "1";
  files()["b"] = "2";
  m_Session.parse({"--via", "a,b", "--via=a"});
  EXPECT_THAT(m_Session.texts(Id_Words), ElementsAre("1", "2", "1"));
  EXPECT_THAT(m_Session.texts(Id_Via), ElementsAre("a", "b", "a"));
}

TEST_F(ViaOption, StopsAtTheFirstBadFileOfAList) {
  files()["b"] = "2";
  m_Session.parse({"--via", "a,b"});
  EXPECT_THAT(m_Session.getReports(), ElementsAre("fatal: Could not open via file 'a'."));
  EXPECT_THAT(m_Session.texts(Id_Via), ElementsAre("a"));
}

TEST_F(ViaOption, TakesArgumentsOfOptionsFromTheFile) {
  files()["f"] = "-a\n pos --db_check \"\" x";
  m_Session.parse({"--via", "f"});
  EXPECT_STREQ(m_Session.parser().getText(Id_After), "pos");
  EXPECT_STREQ(m_Session.parser().getText(Id_CheckLevel), "");
  EXPECT_THAT(m_Session.texts(Id_Words), ElementsAre("x"));
}

TEST_F(ViaOption, TakesNoArgumentFromOutsideTheFile) {
  files()["f"] = "x\n-a\n";
  m_Session.parse({"--via", "f", "pos"});
  EXPECT_THAT(m_Session.getReports(), ElementsAre("fatal: Missing argument for option 'a'."));
}

TEST_F(ViaOption, PassesTheEndOfOptionsOn) {
  files()["f"] = "-t -- -x";
  m_Session.parse({"--via", "f", "-v"});
  EXPECT_THAT(m_Session.texts(Id_Words), ElementsAre("-x", "-v"));
  EXPECT_TRUE(m_Session.parser().isEndOfOptions());
}

TEST_F(ViaOption, KeepsEmptyWordsAndSingleDashes) {
  files()["f"] = "\"\" - '=x'";
  m_Session.parse({"--via", "f"});
  EXPECT_THAT(m_Session.texts(Id_Words), ElementsAre("", "-", "=x"));
}

TEST_F(ViaOption, CopiesTextsThatOutliveTheBuffer) {
  std::string contents = "-a pos --diag_error=L1,L2 --diag_error L3 --via inner -b=q";
  for (int word = 0; word < 1000; ++word)
    contents += " word" + std::to_string(word);
  files()["f"] = contents;
  files()["inner"] = "--libattrmap map";
  m_Session.parse({"--via", "f"});
  EXPECT_STREQ(m_Session.parser().getText(Id_After), "pos");
  EXPECT_STREQ(m_Session.parser().getText(Id_Before), "q");
  EXPECT_STREQ(m_Session.parser().getText(Id_Map), "map");
  EXPECT_THAT(m_Session.texts(Id_DiagError), ElementsAre("L1", "L2", "L3"));
  EXPECT_THAT(m_Session.texts(Id_Via), ElementsAre("f", "inner"));
  EXPECT_EQ(m_Session.texts(Id_Words).front(), "word0");
  EXPECT_EQ(m_Session.texts(Id_Words).back(), "word999");
  EXPECT_EQ(m_Session.parser().getViaFileDepth(), 0u);
}

TEST_F(ViaOption, NestsNineLevels) {
  for (int level = 1; level < 9; ++level) {
    files()["f" + std::to_string(level)] =
        "--via f" + std::to_string(level + 1) + " back" + std::to_string(level);
  }
  files()["f9"] = "deepest";
  m_Session.parse({"--via", "f1"});
  EXPECT_THAT(m_Session.texts(Id_Words), ElementsAre("deepest", "back8", "back7", "back6", "back5",
                                                     "back4", "back3", "back2", "back1"));
  EXPECT_THAT(m_Session.getReports(), IsEmpty());
}

TEST_F(ViaOption, StopsAFileThatNamesItselfAtTheTenthLevel) {
  files()["f"] = "--via f";
  m_Session.parse({"--via", "f"});
  EXPECT_THAT(m_Session.getReports(),
              ElementsAre("fatal: Recursive via file inclusion depth of 10 reached in file 'f'."));
  EXPECT_EQ(m_Session.texts(Id_Via).size(), 9u);
  EXPECT_EQ(m_Session.m_Files.m_OpenCount, 0);
}

TEST_F(ViaOption, CountsTheSetBehindTheWordsOfTheFile) {
  files()["f"] = "-t -v";
  m_Session.parse({"--via", "f"});
  EXPECT_EQ(m_Session.parser().getRecord(Id_Via).firstSet, 3u);
}

TEST_F(ViaOption, ReportsAFileThatCannotBeOpened) {
  m_Session.parse({"--via", "no%s", "-t"});
  EXPECT_THAT(m_Session.getReports(), ElementsAre("fatal: Could not open via file 'no%s'."));
  EXPECT_FALSE(m_Session.parser().getBoolean(Id_List));
}

TEST_F(ViaOption, ReportsAnEmptyName) {
  m_Session.parse({"--via="});
  EXPECT_THAT(m_Session.getReports(), ElementsAre("fatal: Could not open via file ''."));
}

TEST_F(ViaOption, ReportsAReadError) {
  files()["f"] = "-t word";
  m_Session.m_Files.m_FailingRead = "f";
  m_Session.parse({"--via", "f"});
  EXPECT_THAT(m_Session.getReports(), ElementsAre("fatal: Error when reading from via file 'f'."));
  EXPECT_FALSE(m_Session.parser().getBoolean(Id_List));
}

TEST_F(ViaOption, ActsOnEarlierPiecesBeforeAReadError) {
  files()["f"] = "-t word" + std::string(2000, ' ') + "-v";
  m_Session.m_Files.m_FailingRead = "f";
  m_Session.parse({"--via", "f"});
  EXPECT_THAT(m_Session.getReports(), ElementsAre("fatal: Error when reading from via file 'f'."));
  EXPECT_TRUE(m_Session.parser().getBoolean(Id_List));
  EXPECT_FALSE(m_Session.parser().getBoolean(Id_Verbose));
}

TEST_F(ViaOption, WarnsOfAFailingCloseAndGoesOn) {
  files()["f"] = "-t";
  m_Session.m_Files.m_FailingClose = "f";
  m_Session.parse({"--via", "f", "-v"});
  EXPECT_THAT(m_Session.getReports(), ElementsAre("warning: Could not close via file 'f'."));
  EXPECT_TRUE(m_Session.parser().getBoolean(Id_Verbose));
}

TEST_F(ViaOption, SaysNothingOfTheCloseOnceAllHasFailed) {
  files()["f"] = "--nonsense";
  m_Session.m_Files.m_FailingClose = "f";
  m_Session.parse({"--via", "f"});
  EXPECT_THAT(m_Session.getReports(), ElementsAre("fatal: Unrecognized option '--nonsense'."));
  EXPECT_EQ(m_Session.m_Files.m_OpenCount, 0);
}

TEST_F(ViaOption, LooksOneWordAheadBeforeItActs) {
  files()["f"] = "-t \"open\n -v";
  m_Session.parse({"--via", "f"});
  EXPECT_THAT(m_Session.getReports(), ElementsAre("fatal: Malformed via file 'f'."));
  EXPECT_FALSE(m_Session.parser().getBoolean(Id_List));
}

TEST_F(ViaOption, HasActedOnAllButTheWordBeforeAMalformedOne) {
  files()["f"] = "-t -v (open";
  m_Session.parse({"--via", "f"});
  EXPECT_TRUE(m_Session.parser().getBoolean(Id_List));
  EXPECT_FALSE(m_Session.parser().getBoolean(Id_Verbose));
}

TEST_F(ViaOption, ReportsABadOptionOfTheFile) {
  files()["f"] = "--nonsense -t";
  m_Session.parse({"--via", "f"});
  EXPECT_THAT(m_Session.getReports(), ElementsAre("fatal: Unrecognized option '--nonsense'."));
  EXPECT_FALSE(m_Session.parser().getBoolean(Id_List));
}

TEST_F(ViaOption, TakesNoPartInConcatenation) {
  files()["f"] = "x";
  m_Session.parse({"-tvia=f"});
  EXPECT_THAT(m_Session.getReports(),
              ElementsAre("warning: Old syntax, please use '--via'.",
                          "fatal: Concatenated options cannot have arguments: -via =f"));
}

// Words of every kind, each with what it is to the parser.
constexpr std::pair<const char*, const char*> KindsOfWords[] = {
    {"plain", "plain"},           {"\"a b\"", "a b"},
    {"'c \"d\" e'", "c \"d\" e"}, {"dir\\file.o", "dir\\file.o"},
    {"\"q\\\"\\\\\"", "q\"\\"},   {"\\\\server\\x\\", "\\\\server\\x\\"},
    {"(f g)", "(f g)"},           {"\"\"", ""},
    {"h#comment\ni", "hi"},
};
constexpr const char* Dividers[] = {"\r\n", " ", "\n", "\t \r\n\r\n", "\v\f", " ;comment\r\n"};

// The file has no line end at its own end.
TEST_F(ViaOption, TakesAHundredThousandWords) {
  constexpr size_t WordCount = 100 * 1000;
  std::string& contents = files()["f"];
  Lines expected;
  for (size_t word = 0; word < WordCount; ++word) {
    const auto& [written, meant] = KindsOfWords[word % std::size(KindsOfWords)];
    contents += Dividers[word * 7 / 3 % std::size(Dividers)];
    contents += written;
    expected.push_back(meant);
  }
  m_Session.parse({"--via", "f"});
  EXPECT_TRUE(m_Session.texts(Id_Words) == expected);
  EXPECT_THAT(m_Session.getReports(), IsEmpty());
}

// One look at all earlier words for each word would take hours.
TEST_F(ViaOption, TakesTimeInProportionToTheWords) {
  constexpr size_t WordCount = 1000 * 1000;
  std::string& contents = files()["f"];
  for (size_t word = 0; word < WordCount / 4; ++word)
    contents += "lib.a \"a b\" --diag_error=L1,L2\n";
  const std::clock_t start = std::clock();
  m_Session.parse({"--via", "f"});
  EXPECT_LT((std::clock() - start) / CLOCKS_PER_SEC, 20);
  EXPECT_EQ(m_Session.texts(Id_Words).size(), WordCount / 2);
  EXPECT_EQ(m_Session.texts(Id_DiagError).size(), WordCount / 2);
}

// The reader of real files.

class StdioReader : public testing::Test {
protected:
  StdioReader() {
    m_Folder = std::filesystem::temp_directory_path() /
               ("via_" + std::to_string(::testing::UnitTest::GetInstance()->random_seed()) +
                testing::UnitTest::GetInstance()->current_test_info()->name() +
                std::to_string(reinterpret_cast<uintptr_t>(this)));
    std::filesystem::create_directory(m_Folder);
  }
  ~StdioReader() override { std::filesystem::remove_all(m_Folder); }

  Lines reportsOfReading(const std::string& path) {
    Session session;
    ValueRecord records[Id_Count];
    const auto region = makeRegion();
    Parser parser({Table, Definitions, records}, nullptr, session.m_Reporter, m_Reader, *region);
    parser.parseWord("--via", path.c_str());
    for (const StrList* words = parser.getTexts(Id_Words); words != nullptr; words = nullptr) {
      for (const char* word : *words)
        session.m_Reporter.m_Lines.push_back(word);
    }
    return session.getReports();
  }

  std::filesystem::path m_Folder;
  StdioViaFileReader m_Reader;
};

TEST_F(StdioReader, ReadsAFileInBinaryMode) {
  const std::string path = (m_Folder / "a file").string();
  std::FILE* file = std::fopen(path.c_str(), "wb");
  std::fputs("one\r\ntwo", file);
  std::fclose(file);
  EXPECT_THAT(reportsOfReading(path), ElementsAre("one", "two"));
}

TEST_F(StdioReader, CannotOpenWhatIsNotThere) {
  const std::string path = (m_Folder / "none").string();
  EXPECT_THAT(reportsOfReading(path),
              ElementsAre("fatal: Could not open via file '" + path + "'."));
}

TEST_F(StdioReader, CannotReadADirectory) {
  const std::string path = m_Folder.string();
  EXPECT_THAT(reportsOfReading(path),
              ElementsAre("fatal: Error when reading from via file '" + path + "'."));
}

TEST_F(StdioReader, StaysInErrorOnceAReadFailed) {
  void* file = m_Reader.open(m_Folder.string().c_str());
  ASSERT_NE(file, nullptr);
  char buffer[8];
  EXPECT_EQ(m_Reader.read(file, buffer, sizeof buffer), ViaFileReader::ReadError);
  EXPECT_EQ(m_Reader.read(file, buffer, sizeof buffer), ViaFileReader::ReadError);
  EXPECT_TRUE(m_Reader.close(file));
}

} // namespace tabledrivenparser::tool
