// SPDX-License-Identifier: Apache-2.0
//
// The dump of the tables, to the letter, with values of every type, set and unset, and a type that
// there is not.

#include "type_table.h"

#include "tabledrivenparser/interface/call_back_handler.h"
#include "tabledrivenparser/interface/option_report.h"
#include "tabledrivenparser/interface/text_sink.h"

namespace tabledrivenparser::types {

using testing::HasSubstr;

TEST(TableDump, ShowsEveryIdAndEveryRow) {
  Session session;
  EXPECT_EQ(session.dump(),
            "  0: STRING_VECTOR unset:<none>\n"
            "\"\" no-flags parameter required\n"
            "  1: BOOLEAN unset:false\n"
            "\"bool\" no-flags parameter required\n"
            "\"x\" no-flags implied parameter:true\n"
            "  2: ENUM unset:green\n"
            "\"enum\" no-flags parameter required\n"
            "\"red\" no-flags implied parameter:Red\n"
            "\"redder\" no-flags implied parameter:77\n"
            "  3: ADDRESS unset:0x10\n"
            "\"addr\" no-flags parameter required\n"
            "\"address\" public implied parameter:0xABCDEF (optional)\n"
            "  4: ADDRESS64 unset:0x0\n"
            "\"add64\" no-flags parameter required\n"
            "  5: INT unset:-1\n"
            "\"int\" no-flags parameter required\n"
            "\"int1\" oldSyntax,public implied parameter:1\n"
            "  6: INT_VECTOR unset:<none>\n"
            "\"many\" no-flags parameter required separator=','\n"
            "\"many5\" no-flags parameter required\n"
            "\"many6\" no-flags implied parameter:6 separator=','\n"
            "  7: INT64_VECTOR unset:<none>\n"
            "\"long\" no-flags parameter required separator=':'\n"
            "\"long_max\" no-flags implied parameter:9223372036854775807\n"
            "  8: STRING unset:<null>\n"
            "\"text_x\" deprecated implied parameter:x\n"
            "\"text\" no-flags parameter required\n"
            "  9: STRING_VECTOR unset:<none>\n"
            "\"texts\" no-flags parameter required separator=','\n"
            "\"texts_y\" no-flags implied parameter:y soft restriction: 0x2 separator=','\n"
            "\"u\" no-flags parameter required\n"
            " 10: CALL_BACK unset:<call back>\n"
            "\"call\" no-flags parameter required\n"
            "\"k\" no-flags implied parameter:<call back>\n"
            " 11: VIA_FILE unset:<none>\n"
            "\"via\" no-flags parameter required separator=','\n"
            "\"via0\" no-flags implied parameter:<null> separator=','\n"
            " 12: [BAD TYPE!] unset:<none>\n"
            "\"bad\" no-flags parameter required\n");
}

TEST(TableDump, ShowsWhereASetValueCameFrom) {
  Session session;
  session.parse({"-x", "--enum=red", "--add64=255", "--int=5", "--many=1,2", "--long=3", "--text=t",
                 "--texts=a b,c"});
  const std::string dump = session.dump();
  EXPECT_THAT(dump, HasSubstr("  1: BOOLEAN set from:false to:true\n"));
  EXPECT_THAT(dump, HasSubstr("  2: ENUM set from:green to:Red\n"));
  EXPECT_THAT(dump, HasSubstr("  4: ADDRESS64 set from:<none> to:0xFF\n"));
  EXPECT_THAT(dump, HasSubstr("  5: INT set from:-1 to:5\n"));
  EXPECT_THAT(dump, HasSubstr("  6: INT_VECTOR set from:<none> to:1,2\n"));
  EXPECT_THAT(dump, HasSubstr("  7: INT64_VECTOR set from:<none> to:3\n"));
  EXPECT_THAT(dump, HasSubstr("  8: STRING set from:<null> to:t\n"));
  EXPECT_THAT(dump, HasSubstr("  9: STRING_VECTOR set from:<none> to:a b,c\n"));
}

TEST(TableDump, NamesDefaultsWithoutAPrintForm) {
  const DefaultNode node{nullptr, {.integer = 4}, nullptr};
  Session session;
  session.m_Definitions[Id_Int].defaultKind = Default_List;
  session.m_Definitions[Id_Int].defaultValue.defaults = &node;
  session.m_Definitions[Id_String].defaultKind = Default_Computed;
  EXPECT_THAT(session.dump(), HasSubstr("  5: INT unset:4\n"));
  session.parse({"--int=5", "--text=t"});
  EXPECT_THAT(session.dump(), HasSubstr("  5: INT set from:<list> to:5\n"));
  EXPECT_THAT(session.dump(), HasSubstr("  8: STRING set from:<call back> to:t\n"));
}

TEST(TableDump, JoinsSeveralMasksAndFlags) {
  static constexpr uint32_t Masks[] = {0x1, 0xABC, 0};
  static constexpr MatchString SpecialRows[] = {
      {"odd", 0, Kind_Implied, {}, Masks, 0, Flag_OldSyntax | Flag_Deprecated | Flag_Public}};
  static constexpr auto OddRows = rowsNamed(SpecialRows, "odd");
  static constexpr ValueDefinition SpecialDefinitions[] = {
      {Type_Boolean, Default_Fixed, {}, {}, OddRows.data()}};
  const OptionTable special{SpecialRows, indexByFirstLetter(SpecialRows)};
  ParserSession session(special, SpecialDefinitions);
  EXPECT_EQ(session.dump(), "  0: BOOLEAN unset:false\n"
                            "\"odd\" oldSyntax,deprecated,public implied parameter:false soft "
                            "restriction: 0x1,0xABC\n");
}

TEST(TableDump, HasNoValueOfATypeThatThereIsNot) {
  static constexpr MatchString OddRow[] = {{"odd", 0, Kind_Implied, {}, nullptr, 0, 0}};
  static constexpr auto OddRows = rowsNamed(OddRow, "odd");
  static constexpr ValueDefinition OddDefinitions[] = {
      {static_cast<ValueType>(11), Default_Fixed, {}, {}, OddRows.data()}};
  const OptionTable odd{OddRow, indexByFirstLetter(OddRow)};
  ParserSession session(odd, OddDefinitions);
  EXPECT_THAT(session.dump(), HasSubstr("\"odd\" no-flags implied parameter:<none>\n"));
}

TEST(TableDump, TellsTheSizeNeeded) {
  Session session;
  const size_t size = session.dump().size() + 1;
  TextSink sink({}, TextSink::QuoteMode::Never, ',');
  EXPECT_EQ(dumpTables(session.parser(), sink), size);
}

} // namespace tabledrivenparser::types
