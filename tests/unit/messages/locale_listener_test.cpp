// SPDX-License-Identifier: Apache-2.0
//
// --message_locale on a real command line: it holds from its place on, and a name that is no
// language ends the run with that name in the message.

#include "messages/interface/locale_listener.h"

#include "alloclib/interface/process.h"
#include "alloclib/interface/region_objects.h"
#include "messages/interface/catalogue.h"
#include "tabledrivenparser/interface/parser.h"
#include "tabledrivenparser/interface/stdio_via_file_reader.h"
#include "tests/support/messages_fixture.h"

namespace messages {

namespace {

using tabledrivenparser::MatchString;
using tabledrivenparser::ValueDefinition;

constexpr MatchString Rows[] = {{.name = "message_locale"}};
constexpr auto RowList = tabledrivenparser::rowsNamed(Rows, "message_locale");
constexpr ValueDefinition Definitions[] = {
    {.type = tabledrivenparser::Type_String, .rows = RowList.data()}};

struct SilentReporter final : tabledrivenparser::Reporter {
  void reportOptionMessage(tabledrivenparser::ReportLevel, tabledrivenparser::OptionMessage,
                           std::span<const tabledrivenparser::OptionMessageArgument>) override {}
};

void reportFatal(Key key, std::string_view locale) {
  report(FatalWord, nullptr, key, locale);
}

struct LocaleListenerTest : MessagesTest {
  void SetUp() override {
    MessagesTest::SetUp();
    alloclib::initialise();
  }
  void TearDown() override {
    alloclib::shutDown();
    MessagesTest::TearDown();
  }

  // Whether the parser stored the option's value.
  bool parse(const char* word, LocaleListener::FatalReporter reporter) {
    const alloclib::RegionOwner region(alloclib::RegionGeneral::Create(0, "locale test"));
    const tabledrivenparser::OptionTable options{Rows, tabledrivenparser::indexByFirstLetter(Rows)};
    tabledrivenparser::ValueRecord values[1];
    LocaleListener listener(reporter);
    SilentReporter silent;
    tabledrivenparser::StdioViaFileReader files;
    tabledrivenparser::Parser parser({options, Definitions, values}, &listener, silent, files,
                                     *region);
    parser.parseWord(word, nullptr);
    return values[0].value.text != nullptr;
  }
};

} // namespace

TEST_F(LocaleListenerTest, ActsDuringTheParseAndLetsTheValueBeStored) {
  EXPECT_TRUE(parse("--message_locale=ja_JP.utf8", reportFatal));
  EXPECT_EQ(getCurrentCatalogue(), JapaneseCatalogue);
  EXPECT_EQ(getErrorText(), "");
}

TEST_F(LocaleListenerTest, ReportsABadLocaleWholeAndEndsTheRun) {
  EXPECT_EQ(statusOf([&] { parse("--message_locale=fr_FR.UTF-8", reportFatal); }), 1);
  EXPECT_EQ(getErrorText(),
            "Fatal error: L9780E: Could not initialise message locale fr_FR.UTF-8\n");
}

TEST_F(LocaleListenerTest, TellsABadLocaleInPlainWordsWithoutAReporter) {
  EXPECT_EQ(statusOf([&] { parse("--message_locale=C", nullptr); }), 1);
  EXPECT_EQ(getErrorText(), "*** Could not initialise message locale 'C'\n");
}

} // namespace messages
