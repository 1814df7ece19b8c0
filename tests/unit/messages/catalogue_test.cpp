// SPDX-License-Identifier: Apache-2.0
//
// Keys, texts and the choice of a language. Both catalogues are held against each other, row by
// row: the same keys, the same arguments, the same lines and options in the help. Texts that
// scripts read are compared to the letter.

#include "messages/interface/catalogue.h"

#include "messages/interface/format.h"
#include "messages/src/catalogues.h"
#include "tests/support/messages_fixture.h"

#include <gmock/gmock.h>

#include <algorithm>
#include <map>
#include <string>
#include <vector>

namespace messages {

namespace {

using testing::ElementsAre;
using testing::Pair;

struct CatalogueTest : MessagesTest {};

std::string textOf(Key key) {
  return std::string(KeyText(key).getText());
}

// What a format does with each of its arguments, counted from 1.
std::map<unsigned, std::string> argumentsOf(std::string_view format) {
  std::map<unsigned, std::string> arguments;
  unsigned next = 1;
  for (size_t at = format.find('%'); at != format.npos; at = format.find('%', at)) {
    const size_t end = format.find_first_of("%cdsu", at + 1);
    std::string conversion(format.substr(at + 1, end - at));
    at = end + 1;
    if (conversion == "%") continue;
    unsigned position = next++;
    if (const size_t dollar = conversion.find('$'); dollar != conversion.npos) {
      position = static_cast<unsigned>(std::stoul(conversion));
      conversion.erase(0, dollar + 1);
    }
    arguments[position] = conversion;
  }
  return arguments;
}

// Arguments of the kinds that a format asks for.
std::vector<Argument> exampleArguments(std::string_view format) {
  std::vector<Argument> examples;
  for (const auto& [position, conversion] : argumentsOf(format)) {
    switch (conversion.back()) {
    case 's':
      examples.emplace_back("text");
      break;
    case 'c':
      examples.emplace_back('?');
      break;
    default:
      examples.emplace_back(7);
    }
  }
  return examples;
}

bool isAbove127(char character) {
  return static_cast<unsigned char>(character) > 127;
}

// Whether every first byte of a character is followed by as many others as it says.
bool isUtf8(std::string_view text) {
  while (!text.empty()) {
    const auto first = static_cast<unsigned char>(text.front());
    const size_t length = first < 0x80 ? 1 : first >> 5 == 6 ? 2 : first >> 4 == 14 ? 3 : 0;
    if (length == 0 || length > text.size()) return false;
    const auto isFollower = [](char byte) { return (static_cast<unsigned char>(byte) >> 6) == 2; };
    if (!std::all_of(text.begin() + 1, text.begin() + length, isFollower)) return false;
    text.remove_prefix(length);
  }
  return true;
}

std::vector<std::string_view> linesOf(std::string_view text) {
  std::vector<std::string_view> lines;
  for (size_t end = text.find('\n'); end != text.npos; end = text.find('\n')) {
    lines.push_back(text.substr(0, end));
    text.remove_prefix(end + 1);
  }
  lines.push_back(text);
  return lines;
}

} // namespace

TEST(MessageKey, PacksLetterNumberAndSeverityLetter) {
  EXPECT_EQ(valueOf(makeKey('L', 6839, 'E')), 20032374u);
  EXPECT_EQ(valueOf(makeKey('X', 3900, 'U')), 23131082u);
}

TEST(MessageKey, GivesBackItsParts) {
  constexpr Key Largest = makeKey('X', 16383, 'W');
  EXPECT_EQ(letterOf(Largest), 'X');
  EXPECT_EQ(numberOf(Largest), 16383u);
  EXPECT_EQ(severityLetterOf(Largest), 'W');
}

TEST(MessageKey, PrintsAsLetterFourDigitsAndLetter) {
  EXPECT_EQ(textOf(NoActionSpecified), "L6839E");
  EXPECT_EQ(textOf(UnrecognizedOption), "X3900U");
  EXPECT_EQ(textOf(makeKey('L', 7, 'I')), "L0007I");
  EXPECT_EQ(textOf(makeKey('L', 16383, 'I')), "L16383I");
}

TEST(MessageKey, PrintsAQuestionMarkForWhatIsNoLetter) {
  EXPECT_EQ(textOf(makeKey('5', 1, 'E')), "?0001E");
  EXPECT_EQ(textOf(makeKey('L', 1, 'Q')), "L0001?");
  EXPECT_EQ(textOf(Key{}), "?0000?");
  EXPECT_EQ(textOf(Key{0xFFFFFFFF}), "?16383?");
}

TEST(Catalogue, AscendsByKeyInEveryLanguageWithTheSameKeys) {
  const auto english = getCatalogueRows(EnglishCatalogue);
  for (uint32_t index = 0; index < CatalogueCount; ++index) {
    const auto rows = getCatalogueRows(index);
    ASSERT_EQ(rows.size(), english.size());
    for (size_t i = 0; i < rows.size(); ++i)
      EXPECT_EQ(rows[i].key, english[i].key);
    for (size_t i = 1; i < rows.size(); ++i)
      EXPECT_LT(rows[i - 1].key, rows[i].key);
  }
}

TEST(Catalogue, HasTheSameArgumentsInEveryLanguage) {
  EXPECT_THAT(argumentsOf("%s: %2d of %%"), ElementsAre(Pair(1, "s"), Pair(2, "2d")));
  EXPECT_THAT(argumentsOf("%2$-5u %1$s"), ElementsAre(Pair(1, "s"), Pair(2, "-5u")));
  const auto english = getCatalogueRows(EnglishCatalogue);
  const auto japanese = getCatalogueRows(JapaneseCatalogue);
  ASSERT_EQ(japanese.size(), english.size());
  for (size_t i = 0; i < english.size(); ++i)
    EXPECT_EQ(argumentsOf(japanese[i].text), argumentsOf(english[i].text))
        << textOf(english[i].key);
}

// A text that names some arguments by position and others in turn would be a fault when printed.
TEST(Catalogue, HasOnlyGoodFormats) {
  const auto english = getCatalogueRows(EnglishCatalogue);
  for (uint32_t index = 0; index < CatalogueCount; ++index) {
    const auto rows = getCatalogueRows(index);
    ASSERT_EQ(rows.size(), english.size());
    for (size_t i = 0; i < rows.size(); ++i) {
      const std::vector<Argument> arguments = exampleArguments(english[i].text);
      std::string text;
      EXPECT_EQ(appendFormatted(text, rows[i].text, arguments), FormatStatus::Done)
          << textOf(rows[i].key);
      EXPECT_FALSE(text.empty());
    }
  }
}

// The compiler read the formats: each row has the pieces of its own text.
TEST_F(CatalogueTest, FillsThePiecesOfEachTextInEveryLanguage) {
  for (const char* locale : {"en_US", "ja_JP"}) {
    ASSERT_TRUE(setLocale(locale));
    for (const CatalogueRow& row : getCatalogueRows(EnglishCatalogue)) {
      const MessageFormat format = getMessageFormat(row.key);
      const std::vector<Argument> arguments = exampleArguments(row.text);
      std::string filled;
      std::string expected;
      EXPECT_EQ(appendPieces(filled, format.pieces, arguments), FormatStatus::Done);
      EXPECT_EQ(appendFormatted(expected, format.text, arguments), FormatStatus::Done);
      EXPECT_EQ(filled, expected) << textOf(row.key);
    }
  }
}

TEST(Catalogue, IsUtf8InEveryLanguage) {
  EXPECT_TRUE(isUtf8("a\xc3\xa9\xe3\x81\x82"));
  EXPECT_FALSE(isUtf8("\x82\xa0"));
  EXPECT_FALSE(isUtf8("\xe3\x81"));
  for (uint32_t index = 0; index < CatalogueCount; ++index) {
    for (const CatalogueRow& row : getCatalogueRows(index))
      EXPECT_TRUE(isUtf8(row.text)) << textOf(row.key);
  }
}

TEST(Catalogue, IsJapaneseWhereverThereAreWords) {
  std::vector<Key> withoutWords;
  for (const CatalogueRow& row : getCatalogueRows(JapaneseCatalogue)) {
    if (std::none_of(row.text.begin(), row.text.end(), isAbove127)) withoutWords.push_back(row.key);
  }
  EXPECT_THAT(withoutWords, ElementsAre(ListedMember, AddedMember, ReplacedMember, DeletedMember,
                                        MovedMember, ExtractedMember, PrintedMember, SizesRow,
                                        CommandLineEcho, VariantGroupMember));
}

TEST(Catalogue, IsEnglishInPlainAscii) {
  for (const CatalogueRow& row : getCatalogueRows(EnglishCatalogue))
    EXPECT_TRUE(std::none_of(row.text.begin(), row.text.end(), isAbove127)) << textOf(row.key);
}

// What a program that reads the output looks for stays, and so do the ends of lines.
TEST(Catalogue, HasTheSameLinesAndOptionsInEveryLanguage) {
  const auto english = getCatalogueRows(EnglishCatalogue);
  const auto japanese = getCatalogueRows(JapaneseCatalogue);
  for (size_t i = 0; i < english.size(); ++i) {
    const std::vector<std::string_view> lines = linesOf(english[i].text);
    const std::vector<std::string_view> translated = linesOf(japanese[i].text);
    ASSERT_EQ(translated.size(), lines.size()) << textOf(english[i].key);
    for (size_t line = 0; line < lines.size(); ++line) {
      EXPECT_EQ(translated[line].empty(), lines[line].empty());
      if (lines[line].starts_with('-') || lines[line].starts_with(" -")) {
        EXPECT_EQ(translated[line].substr(0, 12), lines[line].substr(0, 12));
      }
    }
  }
}

TEST(Catalogue, HasTheTextsOfTheDiagnostics) {
  const std::pair<const char*, const char*> expected[] = {
      {"L6800U", "Out of memory"},
      {"L6826E", "'%s' not in archive format"},
      {"L6829E", "'%s': malformed archive: %s"},
      {"L6830E", "Writing file '%s' : %s"},
      {"L6831E", "'%s' not present in archive '%s'"},
      {"L6832E", "Archive '%s' not found : %s"},
      {"L6833E", "File '%s' does not exist"},
      {"L6835E", "Reading file '%s' : %s"},
      {"L6836E", "'%s' already exists, so will not be extracted"},
      {"L6838E", "No archive specified"},
      {"L6839E", "One of the actions -[%s] must be specified"},
      {"L6840E", "Only one action option may be specified"},
      {"L6841E", "Position '%s' not found"},
      {"L6842E", "Filename '%s' too long for file system"},
      {"L6843E", "Writing file '%s' : %s"},
      {"L6872I", "Archive '%s' does not have a symbol table"},
      {"L6873I", "Creating archive '%s'"},
      {"L6874W", "Minor variants of archive member '%s' include no base variant"},
      {"L6875W", "Adding non-ELF object '%s' to archive '%s'"},
      {"L6876W", "Minor variants of archive member '%s' include multiple base variants"},
      {"L6877W", "Attribute difference of archive member '%s' in minor variant group beginning "
                 "with '%s' includes attribute(s) with no symbol decoration representation"},
      {"L6878W", "Common attributes of minor variant group beginning with '%s' are incompatible "
                 "with library attributes."},
      {"L6879W", "Attributes of minor variant member object '%s' are incompatible with library "
                 "attributes."},
      {"L6974W", "'%s': malformed archive: %s"},
      {"L6976E", "Seeking in file '%s' : %s"},
      {"L6977E", "Closing file '%s' : %s"},
      {"L6978E", "Deleting file '%s' : %s"},
      {"L6979E", "Output file '%s' is read-only"},
      {"L6980E", "No archive members specified with --create"},
      {"X3900U", "Unrecognized option '%s%s'."},
      {"X3901U", "Missing argument for option '%s'."},
      {"X3902U", "Recursive via file inclusion depth of %d reached in file '%s'."},
      {"X3903U", "Argument '%s' not permitted for option '%s'."},
      {"X3904U", "Could not open via file '%s'."},
      {"X3905U", "Error when reading from via file '%s'."},
      {"X3906U", "Malformed via file '%s'."},
      {"X3907U", "Via file '%s' command too long for buffer."},
      {"X3908U", "Overflow: '%s' will not fit in an integer."},
      {"X3910W", "Old syntax, please use '%s%s%s%s'."},
      {"X3912W", "Option '%s' is deprecated."},
      {"X3913W", "Could not close via file '%s'."},
      {"X3914I", "The following arguments to option '%s' can be selected:\n %s"},
      {"X3915W", "Argument '%s' to option '%s' is deprecated"},
      {"X3916U", "Unexpected argument for option '%s%s'"},
      {"X3917U", "Concatenated options cannot have arguments: -%s %s"},
      {"X3918U", "'\\0' character found in via file '%s' - possible binary file.  Aborting via "
                 "file parse."},
      {"X3919I", "Possible matches for '%s' include '%s' and '%s'."},
      {"X3920W", "Option '-%s' repeated in concatenated options '-%s%s%s'."},
      {"X9780E", "Could not initialise message locale %s"},
      {"X9962I", "Unknown diagnostic number %s"},
  };
  for (const auto& [code, text] : expected) {
    const Key key = makeKey(code[0], static_cast<uint32_t>(std::stoul(code + 1)), code[5]);
    EXPECT_EQ(textOf(key), code);
    EXPECT_EQ(getMessageText(key), text) << code;
  }
}

TEST_F(CatalogueTest, PrintsTheListingLinesToTheLetter) {
  listingMessage(ListedMember, "a.o");
  listingMessage(ListedMemberLong, "rw-r--r--", 1, 22u, 333, "Jan  1 00:00 1970", "a.o", 8u);
  listingMessage(AddedMember, "a.o");
  listingMessage(ReplacedMember, "a.o");
  listingMessage(DeletedMember, "a.o");
  listingMessage(MovedMember, "a.o");
  listingMessage(ExtractedMember, "a.o");
  listingMessage(PrintedMember, "a.o");
  listingMessage(SizesHeader);
  listingMessage(SizesRow, 1u, 22u, 333u, 4444u, 55555u, "TOTAL\n");
  listingMessage(EntryPoint, 32768u, "ER_RO", "a.o");
  listingMessage(NoEntryPoints);
  listingMessage(ListedSymbol, "main", "a.o", 68u);
  EXPECT_EQ(outputText(), "a.o\n"
                          "rw-r--r--     1/    22    333 Jan  1 00:00 1970 a.o (offset      8)\n"
                          "a - a.o\nr - a.o\nd - a.o\nm - a.o\nx - a.o\n\n<a.o>\n\n"
                          "\n      Code    RO Data    RW Data    ZI Data      Debug   Object Name\n"
                          "         1         22        333       4444      55555   TOTAL\n\n"
                          "ENTRY at offset 32768 in section ER_RO of a.o\n"
                          "No ENTRY points found.\n"
                          "main                 from a.o        at offset     68\n");
}

TEST_F(CatalogueTest, GrowsListingColumnsWithTheirValues) {
  listingMessage(ListedMemberLong, "rwxrwxrwx", 12345678, 12345678, 123456789u, "d", "m", 1234567);
  EXPECT_EQ(outputText(), "rwxrwxrwx12345678/12345678123456789 d m (offset 1234567)\n");
}

TEST_F(CatalogueTest, PrintsTheHelpToTheLetter) {
  listingMessage(HelpCommandFormat, "quarn");
  listingMessage(HelpWildcards, '?');
  listingMessage(HelpEditOptions);
  listingMessage(HelpOtherOptions);
  listingMessage(HelpExamples, "quarn", "quarn", '?', "quarn", "quarn");
  EXPECT_EQ(outputText(), R"(
Archive creation and maintenance tool

Command format:

quarn options archive [ file_list ]

Wildcards '?' and '*' may be used in file_list

Options:-

 -r         Insert files in <file_list>, replace existing members of the same name.
 -d         Delete the members in <file_list>.
 -x         Extract members in <file_list> placing in files of the same name.
 -m         Move files in <file_list>.
 -p         Print files to stdout.
 -a pos     Insert/move files after file named <pos>.
 -b pos     Insert/move files before file named <pos>.
 -u         Update older files only, used with -r.

 -n         Do not add a symbol table to an object archive.
 -s         Force regeneration of archive symbol table.
 -t         Print table of contents of archive.
--zs        Show the symbol table.
--zt        Summarize the archive contents (sizes + entries).
 -c         Suppress warning when a new archive is created.
 -C         Do not overwrite existing files when extracting.
 -T         Truncate file names to system maximum length.
 -v         Give verbose output.
--create    Force creation of a new archive.
--via file  Take additional arguments from via file.
--sizes     List the size of each member and the library total.
--entries   List sections containing ENTRY points.
--vsn       Print the current Quarn Version. )"
                          "\n--help      Print this message. \n"
                          R"(
Examples:-

        quarn -r  mylib.a obj1 obj2 obj3...
        quarn -x  mylib.a ?sort*
        quarn -d  mylib.a hash.o
        quarn -tv ansilib.a

)");
}

TEST_F(CatalogueTest, AMissingRowShowsItsKeyAndTheRunGoesOn) {
  const Key missing = makeKey('L', 1, 'E');
  EXPECT_EQ(getMessageText(missing), "<NotFound Code=L0001E key=0x01300016>");
  EXPECT_TRUE(report(ErrorWord, nullptr, missing, "unused"));
  EXPECT_EQ(getErrorText(), "Error: L0001E: <NotFound Code=L0001E key=0x01300016>\n");
  EXPECT_EQ(getErrorCount(), 1u);
}

TEST_F(CatalogueTest, AnExternalCatalogueComesFirst) {
  static constexpr CatalogueRow Rows[] = {{OutOfMemory, "No memory"},
                                          {makeKey('L', 6801, 'E'), "New text"}};
  setExternalCatalogue(Rows);
  EXPECT_EQ(getMessageText(OutOfMemory), "No memory");
  EXPECT_EQ(getMessageText(makeKey('L', 6801, 'E')), "New text");
  EXPECT_EQ(getMessageText(NoArchiveSpecified), "No archive specified");
  setExternalCatalogue({});
  EXPECT_EQ(getMessageText(OutOfMemory), "Out of memory");
}

TEST_F(CatalogueTest, AnExternalTextIsFilledLikeABuiltInOne) {
  static constexpr CatalogueRow Rows[] = {{FileDoesNotExist, "No file %s, 100%%"},
                                          {ListedMember, "<%1$s|%1$-6s>\n"}};
  listingMessage(ListedMember, "a.o");
  setExternalCatalogue(Rows);
  listingMessage(ListedMember, "a.o");
  listingMessage(AddedMember, "b.o");
  report(ErrorWord, nullptr, FileDoesNotExist, "%d");
  setExternalCatalogue({});
  listingMessage(ListedMember, "c.o");
  EXPECT_EQ(outputText(), "a.o\n<a.o|a.o   >\na - b.o\nc.o\n");
  EXPECT_EQ(getErrorText(), "Error: L6833E: No file %d, 100%\n");
}

TEST_F(CatalogueTest, AChangeOfLanguageHoldsForTheNextLine) {
  for (const char* locale : {"en_US", "ja_JP", "en_US"}) {
    ASSERT_TRUE(setLocale(locale));
    listingMessage(NoEntryPoints);
  }
  ASSERT_TRUE(setLocale("ja_JP"));
  const std::string japanese(getMessageText(NoEntryPoints));
  ASSERT_TRUE(setLocale("en_US"));
  const std::string text(getMessageText(NoEntryPoints));
  EXPECT_NE(japanese, text);
  EXPECT_EQ(outputText(), text + japanese + text);
}

TEST_F(CatalogueTest, ALocaleNameChoosesTableAndCodePage) {
  EXPECT_TRUE(setLocale("ja_JP.UTF-8"));
  EXPECT_EQ(getCurrentCatalogue(), JapaneseCatalogue);
  EXPECT_TRUE(setLocale("en_US"));
  EXPECT_EQ(getCurrentCatalogue(), EnglishCatalogue);
  EXPECT_TRUE(setLocale("ja_JP"));
  EXPECT_EQ(getCurrentCatalogue(), JapaneseCatalogue);
}

TEST_F(CatalogueTest, ACodePageAloneLeavesTheTable) {
  ASSERT_TRUE(setLocale("ja_JP"));
  for (const char* name : {"UTF-8", "utf-8", "UTF8", "utf8", "65001"}) {
    EXPECT_TRUE(setLocale(name)) << name;
    EXPECT_EQ(getOutputCodePage(), 65001u);
  }
  for (const char* name : {"gb2312", "20936"}) {
    EXPECT_TRUE(setLocale(name)) << name;
    EXPECT_EQ(getOutputCodePage(), 20936u);
  }
  EXPECT_EQ(getCurrentCatalogue(), JapaneseCatalogue);
}

TEST_F(CatalogueTest, ABadLocaleNameChangesNothing) {
  for (const char* name : {"fr_FR.UTF-8", "en_US.", "en_US.latin1", "C", "", ".", ".UTF-8",
                           "ja_JP.1200", "1200", "Utf-8", "en_US.UTF-8.x", "EN_US"}) {
    EXPECT_FALSE(setLocale(name)) << name;
  }
  EXPECT_EQ(getCurrentCatalogue(), EnglishCatalogue);
  EXPECT_EQ(getOutputCodePage(), 65001u);
}

TEST_F(CatalogueTest, APageOfTheHostGoesByItsNumber) {
  if (!setLocale("1252")) GTEST_SKIP() << "a host without code pages";
  EXPECT_EQ(getOutputCodePage(), 1252u);
  EXPECT_EQ(getCurrentCatalogue(), EnglishCatalogue);
  EXPECT_TRUE(setLocale("ja_JP.20127"));
  EXPECT_EQ(getOutputCodePage(), 20127u);
  EXPECT_EQ(getCurrentCatalogue(), JapaneseCatalogue);
  EXPECT_TRUE(setLocale("en_US"));
  EXPECT_EQ(getOutputCodePage(), 20127u);
}

TEST_F(CatalogueTest, APageIsANumberInPlainDigits) {
  for (const char* name : {"+1252", "-1", " 1252", "1252 ", "0x4e4", "1252x", "1252.0", "cp1252",
                           "4294968548", "18446744073709552868", "99999999999999999999"}) {
    EXPECT_FALSE(setLocale(name)) << name;
    EXPECT_FALSE(setLocale(std::string("ja_JP.") + name)) << name;
  }
  EXPECT_EQ(getCurrentCatalogue(), EnglishCatalogue);
  EXPECT_EQ(getOutputCodePage(), 65001u);
}

TEST_F(CatalogueTest, ALocaleThatIsRefusedLeavesThePage) {
  if (!setLocale("1252")) GTEST_SKIP() << "a host without code pages";
  for (const char* name : {"fr_FR", "ja_JP.1200", "65002", "fr_FR.UTF-8"})
    EXPECT_FALSE(setLocale(name)) << name;
  EXPECT_EQ(getOutputCodePage(), 1252u);
  writeText(Stream::Output, "\u00e9");
  EXPECT_EQ(outputText(), "\xe9");
}

TEST_F(CatalogueTest, AFreshStartIsUtf8) {
  if (!setLocale("1252")) GTEST_SKIP() << "a host without code pages";
  resetLocale();
  EXPECT_EQ(getOutputCodePage(), 65001u);
  writeText(Stream::Output, "\u00e9");
  EXPECT_EQ(outputText(), "\u00e9");
}

} // namespace messages
