// SPDX-License-Identifier: Apache-2.0
//
// Options whose handler takes the words itself: all it may answer, and what the parser makes of
// each answer.

#include "type_table.h"

#include "tabledrivenparser/interface/call_back_handler.h"
#include "tabledrivenparser/interface/text_sink.h"

namespace tabledrivenparser::types {

using testing::ElementsAre;
using testing::IsEmpty;

class Handler final : public CallBackHandler {
public:
  bool takeArgument(Parser&, const MatchString& row, const char* argument,
                    uint32_t& wordsUsed) override {
    m_Lines.push_back(std::string(row.name) + "/" + (argument != nullptr ? argument : "<null>") +
                      "/" + std::to_string(wordsUsed));
    if (m_WordsUsed) wordsUsed = *m_WordsUsed;
    return m_Answer;
  }
  void printCommandLine(const Parser&, TextSink& sink) const override {
    sink.startEntry();
    sink.put("--call=taken");
  }
  void releaseValues() override { m_Lines.clear(); }

  Lines m_Lines;
  bool m_Answer = true;
  std::optional<uint32_t> m_WordsUsed;
};

class CallBackOption : public testing::Test {
protected:
  CallBackOption() { m_Session.m_Definitions[Id_CallBack].defaultValue.handler = &m_Handler; }

  Handler m_Handler;
  Session m_Session;
};

TEST_F(CallBackOption, IsItsDefaultWhileTheHandlerIsTheSame) {
  EXPECT_TRUE(m_Session.parser().isDefault(Id_CallBack));
  m_Session.m_Records[Id_CallBack].value.handler = nullptr;
  EXPECT_FALSE(m_Session.parser().isDefault(Id_CallBack));
  m_Session.m_Definitions[Id_CallBack].defaultKind = Default_None;
  EXPECT_TRUE(m_Session.parser().isDefault(Id_CallBack));
}

// Who keeps nothing has nothing to write and to forget.
TEST_F(CallBackOption, MayLeaveNothingInTheCommandLine) {
  class Forgetful final : public CallBackHandler {
  public:
    bool takeArgument(Parser&, const MatchString&, const char*, uint32_t&) override { return true; }
  };
  Forgetful handler;
  m_Session.m_Definitions[Id_CallBack].defaultValue.handler = &handler;
  m_Session.parse({"--call=a", "-x"});
  EXPECT_EQ(m_Session.commandLine(), "-x");
  m_Session.parser().releaseValues();
  EXPECT_EQ(m_Session.commandLine(), "-x");
}

TEST_F(CallBackOption, HandsTheWordOver) {
  m_Session.parse({"--call=a", "--call", "b", "-k"});
  EXPECT_THAT(m_Handler.m_Lines, ElementsAre("call/a/1", "call/b/2", "k/<null>/1"));
  EXPECT_EQ(m_Session.parser().getRecord(Id_CallBack).firstSet, 1u);
  EXPECT_EQ(m_Session.parser().getRecord(Id_CallBack).lastSet, 3u);
  EXPECT_THAT(m_Session.m_Listener.m_Lines, IsEmpty());
}

TEST_F(CallBackOption, MayUseFewerWords) {
  m_Handler.m_WordsUsed = 1;
  m_Session.parse({"--call", "b"});
  EXPECT_THAT(m_Session.texts(Id_Words), ElementsAre("b"));
}

TEST_F(CallBackOption, MayRefuseTheArgument) {
  m_Handler.m_Answer = false;
  m_Session.parse({"--call=a"});
  EXPECT_THAT(m_Session.getReports(),
              ElementsAre("fatal: Argument 'a' not permitted for option 'call'."));
  EXPECT_FALSE(m_Session.parser().isSet(Id_CallBack));
}

TEST_F(CallBackOption, MayMakeTheWordUnknown) {
  m_Handler.m_Answer = false;
  m_Handler.m_WordsUsed = 0;
  m_Session.parse({"--call=a"});
  EXPECT_THAT(m_Session.getReports(), ElementsAre("fatal: Unrecognized option '--call=a'."));
}

TEST_F(CallBackOption, MayStandInAConcatenation) {
  m_Session.parse({"-kx"});
  EXPECT_THAT(m_Handler.m_Lines, ElementsAre("k/<null>/1"));
  EXPECT_TRUE(m_Session.parser().getBoolean(Id_Boolean));
}

TEST_F(CallBackOption, IsRefusedWithoutAHandler) {
  m_Session.m_Definitions[Id_CallBack].defaultValue.handler = nullptr;
  m_Session.parse({"--call=a"});
  EXPECT_THAT(m_Session.getReports(),
              ElementsAre("fatal: Argument 'a' not permitted for option 'call'."));
}

TEST_F(CallBackOption, PrintsItselfWhenSet) {
  EXPECT_EQ(m_Session.commandLine(), "");
  m_Session.parse({"-k", "-x"});
  EXPECT_EQ(m_Session.commandLine(), "-x --call=taken");
}

TEST_F(CallBackOption, IsReleased) {
  m_Session.parse({"-k"});
  m_Session.parser().releaseValues();
  EXPECT_THAT(m_Handler.m_Lines, IsEmpty());
}

} // namespace tabledrivenparser::types
