// SPDX-License-Identifier: Apache-2.0
//
// Letters and options are rows of tables; what no row knows, and what a row can't do for the
// operation, is refused. Options may stand anywhere in front of "--". Operands come in one order:
// letters (if they have no dash), the place, the count, the archive, the files.
#include "quarn-ar/command_line.h"

#include "messages/interface/diagnostic_control.h"
#include "quarn-ar/refusal.h"
#include "quarn-ar/response_file.h"
#include "quarn/option_table.h"
#include "quarn/reporting.h"

#include <algorithm>
#include <charconv>
#include <span>

namespace quarn_ar {

namespace {

constexpr std::string_view Operations = "dmpqrstx";

bool holds(std::string_view letters, char letter) {
  return letters.find(letter) != std::string_view::npos;
}

// What has been read so far.
class CommandLine {
public:
  CommandLine(Program program, Request& request) : m_Program(program), m_Request(request) {}

  [[nodiscard]] bool read(std::span<const std::string> words);
  [[nodiscard]] Answer finish();

  void answer(Answer answer) { m_Answer = answer; }
  bool setOperation(char letter);
  [[nodiscard]] Request& getRequest() { return m_Request; }

private:
  [[nodiscard]] bool readOption(std::span<const std::string>& words);
  [[nodiscard]] bool readLetters(std::string_view letters, const std::string& word);
  [[nodiscard]] bool readOperand(const std::string& word);
  [[nodiscard]] bool checkLetters() const;
  [[nodiscard]] bool takeOperands();
  [[nodiscard]] bool takeCount();
  [[nodiscard]] bool has(char letter) const { return holds(m_Letters, letter); }
  void chooseSettings();

  Program m_Program;
  Request& m_Request;
  Answer m_Answer = Answer::Run;
  std::string m_Letters;        // all that there were
  bool m_HasLetterWord = false; // without a dash
  bool m_OptionsEnd = false;
  std::vector<std::string> m_Operands;
};

struct LetterRow {
  char letter;
  std::string_view operations; // with which it can be honoured; empty for all
  void (*apply)(CommandLine& line);
};

void doNothing(CommandLine&) {}

// clang-format off
constexpr LetterRow ArLetters[] = {
    {'a', "mr",       [](CommandLine& line) { line.getRequest().place = Place::After; }},
    {'b', "mr",       [](CommandLine& line) { line.getRequest().place = Place::Before; }},
    {'i', "mr",       [](CommandLine& line) { line.getRequest().place = Place::Before; }},
    {'c', "",         [](CommandLine& line) { line.getRequest().settings.warnOnCreate = false; }},
    {'C', "x",        [](CommandLine& line) { line.getRequest().settings.overwriteOnExtract = false; }},
    {'D', "",         [](CommandLine& line) { line.getRequest().realNumbers = false; }},
    {'f', "",         [](CommandLine& line) { line.getRequest().shortNames = true; }},
    {'h', "",         [](CommandLine& line) { line.answer(Answer::Help); }},
    {'l', "",         doNothing},
    {'N', "dx",       doNothing},
    {'o', "x",        [](CommandLine& line) { line.getRequest().settings.restoreDates = true; }},
    {'P', "dmpqrst",  [](CommandLine& line) { line.getRequest().fullNames = true; }},
    {'s', "",         [](CommandLine& line) { line.getRequest().settings.suppressSymbolTable = false; }},
    {'S', "dmqrptx",  [](CommandLine& line) { line.getRequest().settings.suppressSymbolTable = true; }},
    {'T', "x",        [](CommandLine& line) { line.getRequest().settings.truncateNames = true; }},
    {'u', "r",        [](CommandLine& line) { line.getRequest().newerOnly = true; }},
    {'U', "",         [](CommandLine& line) { line.getRequest().realNumbers = true; }},
    {'v', "",         [](CommandLine& line) { line.getRequest().settings.verbose = true; }},
    {'V', "",         [](CommandLine& line) { line.answer(Answer::Version); }},
};
constexpr LetterRow RanlibLetters[] = {
    {'D', "", doNothing},
    {'h', "", [](CommandLine& line) { line.answer(Answer::Help); }},
    {'t', "", doNothing}, // an archive that is written again is newer than its members
    {'U', "", doNothing},
    {'v', "", [](CommandLine& line) { line.answer(Answer::Version); }},
    {'V', "", [](CommandLine& line) { line.answer(Answer::Version); }},
};
// clang-format on

struct LongOption {
  std::string_view name;
  bool takesValue;
  bool (*apply)(CommandLine& line, std::string_view value);
};

bool applyTarget(CommandLine&, std::string_view value) {
  if (value.starts_with("elf") || value == "default" || value == "binary") return true;
  return refuse("archives for the target '%s' are not made", value);
}

bool applyStyle(CommandLine&, std::string_view value) {
  const auto& definition = quarn::getOptionDefinitions()[quarn::Option_DiagnosticStyle];
  for (const tabledrivenparser::MatchString& style : definition.constraint.enumeration->entries) {
    if (style.name != value) continue;
    messages::applyDiagnosticStyle(style.id);
    return true;
  }
  return refuse("there is no diagnostic style '%s'", value);
}

// Elements between commas. A bad one is warned of, and no reason to stop.
template <uint32_t SeverityWord>
bool applySeverity(CommandLine&, std::string_view numbers) {
  while (!numbers.empty()) {
    const size_t length = std::min(numbers.find(','), numbers.size());
    static_cast<void>(messages::applyDiagnosticOption(SeverityWord, numbers.substr(0, length)));
    numbers.remove_prefix(std::min(length + 1, numbers.size()));
  }
  return true;
}

// The words outlive the run.
bool applyAttributeMap(CommandLine& line, std::string_view value) {
  line.getRequest().settings.libraryAttributeMap = value.data();
  return true;
}

bool applyAttributeSections(CommandLine& line, std::string_view) {
  line.getRequest().settings.useObjectBuildAttributes = true;
  return true;
}

// The response files are read already; from one of them it comes too late, but is no less a word.
bool checkQuoting(CommandLine&, std::string_view value) {
  return quotingNamed(value).has_value();
}

bool acceptValue(CommandLine&, std::string_view) {
  return true;
}

// clang-format off
constexpr LongOption LongOptions[] = {
    {"diag_error",      true,  applySeverity<messages::DiagnosticError>},
    {"diag_remark",     true,  applySeverity<messages::DiagnosticRemark>},
    {"diag_style",      true,  applyStyle},
    {"diag_suppress",   true,  applySeverity<messages::DiagnosticSuppress>},
    {"diag_warning",    true,  applySeverity<messages::DiagnosticWarning>},
    {"help",            false, [](CommandLine& line, std::string_view) { line.answer(Answer::Help); return true; }},
    {"libattrmap",      true,  applyAttributeMap},
    {"plugin",          true,  acceptValue}, // symbols are read without one
    {"qobix_buildattr", false, applyAttributeSections},
    {"rsp-quoting",     true,  checkQuoting},
    {"target",          true,  applyTarget},
    {"thin",            false, [](CommandLine&, std::string_view) { return refuse("thin archives are not made"); }},
    {"version",         false, [](CommandLine& line, std::string_view) { line.answer(Answer::Version); return true; }},
};
// clang-format on

template <class Row, class Key>
const Row* findRow(std::span<const Row> rows, Key Row::*field, const Key& key) {
  const auto row = std::find_if(rows.begin(), rows.end(),
                                [&](const Row& candidate) { return candidate.*field == key; });
  return row == rows.end() ? nullptr : &*row;
}

bool CommandLine::setOperation(char letter) {
  const auto operation = static_cast<Operation>(letter);
  if (m_Request.operation != Operation::None && m_Request.operation != operation) {
    return refuse("two operations: '%c' and '%c'", static_cast<char>(m_Request.operation), letter);
  }
  m_Request.operation = operation;
  return true;
}

bool CommandLine::readLetters(std::string_view letters, const std::string& word) {
  const std::span<const LetterRow> rows =
      m_Program == Program::Ar ? std::span<const LetterRow>(ArLetters) : RanlibLetters;
  for (const char letter : letters) {
    const bool isOperation = m_Program == Program::Ar && letter != 's' && holds(Operations, letter);
    if (isOperation && !setOperation(letter)) return false;
    if (isOperation) continue;
    if (letter == 'M' && m_Program == Program::Ar)
      return refuse("scripts are not read ('M'): give the operations as words");
    const LetterRow* row = findRow(rows, &LetterRow::letter, letter);
    if (row == nullptr) return refuse("there is no letter '%c', as in '%s'", letter, word);
    row->apply(*this);
    m_Letters += letter;
  }
  return true;
}

// The words begin with one that begins with "--"; those that are read are taken off.
bool CommandLine::readOption(std::span<const std::string>& words) {
  const std::string_view whole = words.front();
  const std::string_view text = whole.substr(2);
  const size_t nameEnd = std::min(text.find('='), text.size());
  const LongOption* option =
      findRow(std::span<const LongOption>(LongOptions), &LongOption::name, text.substr(0, nameEnd));
  if (option == nullptr) return refuse("there is no option '%s'", whole.substr(0, nameEnd + 2));
  words = words.subspan(1);
  const bool hasValue = nameEnd < text.size();
  if (!option->takesValue)
    return hasValue ? refuse("the option '--%s' takes no value", option->name)
                    : option->apply(*this, {});
  if (hasValue) return option->apply(*this, text.substr(nameEnd + 1));
  if (words.empty()) return refuse("the option '--%s' wants a value", option->name);
  const std::string& value = words.front();
  words = words.subspan(1);
  return option->apply(*this, value);
}

// The first operand is letters, unless the operation has been told before.
bool CommandLine::readOperand(const std::string& word) {
  const bool isOperationTold = m_Request.operation != Operation::None || has('s');
  if (m_Program == Program::Ranlib || isOperationTold || m_HasLetterWord) {
    m_Operands.push_back(word);
    return true;
  }
  m_HasLetterWord = true;
  return readLetters(word, word);
}

bool CommandLine::read(std::span<const std::string> words) {
  while (!words.empty()) {
    const std::string& word = words.front();
    const bool isOption = !m_OptionsEnd && word.size() > 1 && word.front() == '-';
    if (isOption && word[1] == '-' && word.size() > 2) {
      if (!readOption(words)) return false;
      continue;
    }
    words = words.subspan(1);
    if (word == "--" && !m_OptionsEnd)
      m_OptionsEnd = true;
    else if (!(isOption ? readLetters(std::string_view(word).substr(1), word) : readOperand(word)))
      return false;
  }
  return true;
}

bool CommandLine::checkLetters() const {
  if (m_Program == Program::Ranlib) return true;
  const char operation = static_cast<char>(m_Request.operation);
  if (has('T') && (operation == 'r' || operation == 'q'))
    return refuse("thin archives are not made ('T')");
  for (const char letter : m_Letters) {
    const LetterRow* row =
        findRow(std::span<const LetterRow>(ArLetters), &LetterRow::letter, letter);
    if (!row->operations.empty() && !holds(row->operations, operation))
      return refuse("'%c' can't be honoured with the operation '%c'", letter, operation);
  }
  if (has('a') && (has('b') || has('i'))) return refuse("two places: 'a' and 'b'");
  return true;
}

bool CommandLine::takeCount() {
  const std::string text = m_Operands.empty() ? std::string() : m_Operands.front();
  const char* end = text.data() + text.size();
  const auto [rest, error] = std::from_chars(text.data(), end, m_Request.instance);
  if (error != std::errc() || rest != end || m_Request.instance == 0)
    return refuse("'N' wants a number from 1 on in front of the archive, not '%s'", text);
  m_Operands.erase(m_Operands.begin());
  return true;
}

bool CommandLine::takeOperands() {
  if (m_Request.place != Place::End) {
    if (m_Operands.empty())
      return refuse("'%c' wants a member's name in front of the archive", has('a') ? 'a' : 'b');
    m_Request.placeName = m_Operands.front();
    m_Operands.erase(m_Operands.begin());
  }
  if (has('N') && !takeCount()) return false;
  const bool isMissing = m_Operands.empty() || m_Operands.front().empty();
  if (isMissing) {
    quarn::reportMessage(messages::ErrorWord, messages::NoArchiveSpecified);
    return false;
  }
  const bool areArchives = m_Program == Program::Ranlib;
  const auto firstFile = areArchives ? m_Operands.end() : m_Operands.begin() + 1;
  m_Request.archives.assign(m_Operands.begin(), firstFile);
  m_Request.files.assign(firstFile, m_Operands.end());
  if (m_Request.operation == Operation::Index && !m_Request.files.empty())
    return refuse("'s' alone takes one archive, and no '%s'", m_Request.files.front());
  return true;
}

void CommandLine::chooseSettings() {
  quarn::Settings& settings = m_Request.settings;
  settings.machines = elfext::ObjectOutline::Machines::Any;
  // Linkers look for another compiler's intermediate code themselves where there is no table.
  settings.symbolTableMode = arlib::SymbolTableMode::IfObjects;
  settings.keepFolders = true;
  settings.takeAnyNumbers = true;
  settings.restoreModes = true;
  const auto operation = m_Request.operation;
  const bool writes = operation != Operation::List && operation != Operation::Print &&
                      operation != Operation::Extract;
  settings.accessMode = writes ? quarn::Access_Write : quarn::Access_Members;
  if (!writes) settings.suppressSymbolTable = false;
}

Answer CommandLine::finish() {
  if (m_Answer != Answer::Run) return m_Answer;
  const bool isIndex = m_Program == Program::Ranlib || has('s');
  if (m_Request.operation == Operation::None && isIndex) m_Request.operation = Operation::Index;
  if (m_Request.operation == Operation::None) {
    quarn::reportMessage(messages::ErrorWord, messages::NoActionSpecified, Operations);
    return Answer::Refused;
  }
  if (!checkLetters() || !takeOperands()) return Answer::Refused;
  chooseSettings();
  return Answer::Run;
}

} // namespace

Answer readCommandLine(Program program, const std::vector<std::string>& words, Request& request) {
  CommandLine line(program, request);
  return line.read(words) ? line.finish() : Answer::Refused;
}

} // namespace quarn_ar
