// SPDX-License-Identifier: Apache-2.0
//
// The session behind the parser tests. Every word lies in a block of its own on the heap, so that a
// sanitizer sees a step beyond its end; what was reported is kept as a user would read it.

#include "parser_session.h"

#include "tabledrivenparser/interface/option_report.h"
#include "tabledrivenparser/interface/text_sink.h"

#include <algorithm>
#include <cstring>

namespace tabledrivenparser {

namespace {

std::string_view templateOf(OptionMessage message) {
  // clang-format off
  switch (message) {
  case OptionMessage::UnrecognizedOption:         return "Unrecognized option '%s%s'.";
  case OptionMessage::MissingArgument:            return "Missing argument for option '%s'.";
  case OptionMessage::RecursiveViaFile:           return "Recursive via file inclusion depth of %d reached in file '%s'.";
  case OptionMessage::ArgumentNotPermitted:       return "Argument '%s' not permitted for option '%s'.";
  case OptionMessage::CannotOpenViaFile:          return "Could not open via file '%s'.";
  case OptionMessage::ViaFileReadError:           return "Error when reading from via file '%s'.";
  case OptionMessage::MalformedViaFile:           return "Malformed via file '%s'.";
  case OptionMessage::ViaFileCommandTooLong:      return "Via file '%s' command too long for buffer.";
  case OptionMessage::IntegerOverflow:            return "Overflow: '%s' will not fit in an integer.";
  case OptionMessage::OldSyntax:                  return "Old syntax, please use '%s%s%s%s'.";
  case OptionMessage::DeprecatedOption:           return "Option '%s' is deprecated.";
  case OptionMessage::CannotCloseViaFile:         return "Could not close via file '%s'.";
  case OptionMessage::SelectableArguments:        return "The following arguments to option '%s' can be selected:\n %s";
  case OptionMessage::DeprecatedArgument:         return "Argument '%s' to option '%s' is deprecated";
  case OptionMessage::UnexpectedArgument:         return "Unexpected argument for option '%s%s'";
  case OptionMessage::ConcatenatedArgument:       return "Concatenated options cannot have arguments: -%s %s";
  case OptionMessage::NulInViaFile:               return "'\\0' character found in via file '%s' - possible binary file.  Aborting via file parse.";
  case OptionMessage::PossibleMatches:            return "Possible matches for '%s' include '%s' and '%s'.";
  case OptionMessage::RepeatedConcatenatedOption: return "Option '-%s' repeated in concatenated options '-%s%s%s'.";
  }
  // clang-format on
  return "?";
}

std::string textOf(const OptionMessageArgument& argument, char conversion) {
  if (conversion == 'd') return std::to_string(std::get<int>(argument));
  return std::string(std::get<std::string_view>(argument));
}

std::string textOf(const ValueDefinition& definition, const Value& value) {
  const bool isText = definition.type == Type_String || definition.type == Type_StringVector;
  if (!isText) return std::to_string(value.integer);
  return value.text != nullptr ? value.text : "<null>";
}

} // namespace

alloclib::RegionOwner makeRegion() {
  static const bool IsReady = (static_cast<void>(alloclib::initialise()), true);
  EXPECT_TRUE(IsReady);
  return alloclib::RegionOwner(alloclib::RegionGeneral::Create(4096, "tabledrivenparser tests"));
}

void RecordingReporter::reportOptionMessage(ReportLevel level, OptionMessage message,
                                            std::span<const OptionMessageArgument> arguments) {
  static const char* const Levels[] = {"remark: ", "warning: ", "error: ", "fatal: "};
  std::string line = Levels[static_cast<uint32_t>(level)];
  std::string_view text = templateOf(message);
  size_t used = 0;
  for (size_t at = 0; at < text.size(); ++at) {
    if (text[at] != '%') {
      line += text[at];
      continue;
    }
    line += used < arguments.size() ? textOf(arguments[used], text[++at]) : "<missing>";
    ++used;
  }
  EXPECT_EQ(used, arguments.size()) << line;
  m_Lines.push_back(line);
}

void* MemoryFiles::open(const char* name) {
  if (!m_Contents.contains(name)) return nullptr;
  ++m_OpenCount;
  return new OpenFile{name};
}

ptrdiff_t MemoryFiles::read(void* file, char* buffer, size_t size) {
  auto& open = *static_cast<OpenFile*>(file);
  const std::string& contents = m_Contents[open.name];
  const size_t count = std::min({size, contents.size() - open.position, m_PieceSize});
  if (count == 0 && open.name == m_FailingRead) return ReadError;
  std::memcpy(buffer, contents.data() + open.position, count);
  open.position += count;
  return static_cast<ptrdiff_t>(count);
}

bool MemoryFiles::close(void* file) {
  const std::unique_ptr<OpenFile> open(static_cast<OpenFile*>(file));
  --m_OpenCount;
  return open->name != m_FailingClose;
}

bool RecordingListener::onOption(Parser& parser, uint32_t id, const Value& value) {
  m_Lines.push_back(std::to_string(id) + "=" + textOf(parser.getDefinition(id), value));
  return m_Answer && m_Answer(parser, id, value);
}

ParserSession::ParserSession(const OptionTable& table, std::span<const ValueDefinition> definitions)
    : m_Records(definitions.size()), m_Options(table), m_DefinitionTable(definitions),
      m_Region(makeRegion()) {}

Parser& ParserSession::parser() {
  if (!m_Parser) {
    m_Parser = std::make_unique<Parser>(ParserTables{m_Options, m_DefinitionTable, m_Records},
                                        &m_Listener, m_Reporter, m_Files, *m_Region);
  }
  return *m_Parser;
}

void ParserSession::parse(std::initializer_list<const char*> words) {
  parse(Lines(words.begin(), words.end()));
}

// The words are copied to the heap, each on its own, so that a sanitizer sees every step outside.
void ParserSession::parse(const Lines& words) {
  std::vector<const char*> argv;
  for (const std::string& word : words) {
    m_Words.push_back(std::make_unique<std::string>(word));
    argv.push_back(m_Words.back()->c_str());
  }
  argv.push_back(nullptr);
  for (size_t at = 0; argv[at] != nullptr;)
    at += parser().parseWord(argv[at], argv[at + 1]);
}

Lines ParserSession::texts(uint32_t id) {
  Lines lines;
  const StrList* list = parser().getTexts(id);
  if (list == nullptr) return lines;
  for (const char* text : *list)
    lines.push_back(text);
  return lines;
}

std::vector<long long> ParserSession::numbers(uint32_t id) {
  std::vector<long long> result;
  const Value& value = parser().getRecord(id).value;
  if (parser().getDefinition(id).type == Type_IntVector && value.integers != nullptr) {
    for (int number : *value.integers)
      result.push_back(number);
  }
  if (parser().getDefinition(id).type == Type_Int64Vector && value.longIntegers != nullptr) {
    for (long long number : *value.longIntegers)
      result.push_back(number);
  }
  return result;
}

std::string ParserSession::commandLine() {
  std::vector<char> buffer(1024 * 1024);
  TextSink sink(buffer, TextSink::QuoteMode::Blanks, ' ');
  const size_t needed = printCommandLine(parser(), sink);
  EXPECT_EQ(buffer[needed - 1], '\0');
  return std::string(buffer.data(), needed - 1);
}

std::string ParserSession::dump() {
  std::vector<char> buffer(64 * 1024);
  TextSink sink(buffer, TextSink::QuoteMode::Never, ',');
  const size_t needed = dumpTables(parser(), sink);
  EXPECT_EQ(buffer[needed - 1], '\0');
  return std::string(buffer.data(), needed - 1);
}

} // namespace tabledrivenparser
