// SPDX-License-Identifier: Apache-2.0
//
// All operations but those that take files in. A word that means no member is an error where
// something was to be had of it, and a warning where it was to be gone.
#include "quarn-ar/operations.h"

#include "messages/interface/output.h"
#include "quarn-ar/named_members.h"
#include "quarn-ar/refusal.h"
#include "quarn/extraction.h"
#include "quarn/listing.h"
#include "quarn/local_dates.h"
#include "quarn/reporting.h"

#include <array>
#include <functional>

namespace quarn_ar {

using arlib::ArchiveMember;

namespace {

void reportMissing(const quarn::Run& run, uint32_t severityWord, const std::string& word) {
  quarn::reportMessage(severityWord, messages::NotPresentInArchive, word, run.getArchiveName());
}

void deleteMembers(quarn::Run& run, const Request& request) {
  NamedMembers members(run.archive, request);
  std::vector<ArchiveMember*> doomed;
  std::unordered_set<const ArchiveMember*> isDoomed;
  for (const std::string& word : request.files) {
    ArchiveMember* member = members.take(word);
    if (member == nullptr || !isDoomed.insert(member).second) {
      reportMissing(run, messages::WarningWord, word);
      continue;
    }
    doomed.push_back(member);
    quarn::verboseMessage(request.settings, messages::DeletedMember, word);
  }
  run.archive.removeMembers(doomed);
}

void moveMembers(quarn::Run& run, const Request& request) {
  NamedMembers members(run.archive, request);
  std::vector<ArchiveMember*> moved;
  for (const std::string& word : request.files) {
    ArchiveMember* member = members.take(word);
    if (member != nullptr) {
      moved.push_back(member);
      quarn::verboseMessage(request.settings, messages::MovedMember, word);
    } else if (members.find(word) == nullptr) {
      reportMissing(run, messages::ErrorWord, word);
    }
  }
  const auto place = findPlace(run.archive, request, {moved.begin(), moved.end()});
  if (place) run.archive.moveMembers(moved, *place);
}

// The members that the words mean, word by word, or all if there are no words.
void forEachMember(quarn::Run& run, const Request& request,
                   const std::function<void(ArchiveMember&)>& routine) {
  if (request.files.empty()) {
    for (ArchiveMember* member : run.archive.getMembers()) {
      if (!member->isAuxiliary()) routine(*member);
    }
    return;
  }
  NamedMembers members(run.archive, request);
  for (const std::string& word : request.files) {
    if (ArchiveMember* member = members.take(word); member != nullptr)
      routine(*member);
    else if (members.find(word) == nullptr)
      reportMissing(run, messages::ErrorWord, word);
  }
}

// As `ls` shows it: what stands for the right to execute also tells of three more bits.
std::string modeText(uint32_t mode) {
  struct Bit {
    uint32_t bit;
    size_t position;
    char letter; // in the place of an x, and as a capital in the place of a dash
  };
  constexpr std::array<Bit, 3> Bits = {{{04000, 2, 's'}, {02000, 5, 's'}, {01000, 8, 't'}}};
  std::string text = quarn::modeText(mode);
  for (const auto& [bit, position, letter] : Bits) {
    constexpr char ToCapital = 'A' - 'a';
    if ((mode & bit) == 0) continue;
    text[position] = text[position] == 'x' ? letter : static_cast<char>(letter + ToCapital);
  }
  return text;
}

// "Jan  1 00:00 1970", with a blank where a day has one digit.
std::string dateText(std::string_view date) {
  constexpr size_t DayPosition = 4;
  std::string text(date);
  if (text.size() > DayPosition && text[DayPosition] == '0') text[DayPosition] = ' ';
  return text;
}

void writeLine(std::string line) {
  messages::writeText(messages::Stream::Output, line += '\n');
}

void listMembers(quarn::Run& run, const Request& request) {
  quarn::LocalDates dates;
  forEachMember(run, request, [&](const ArchiveMember& member) {
    const std::string name(member.getName());
    if (!request.settings.verbose) return writeLine(name);
    std::string size = std::to_string(member.getSize());
    constexpr size_t SizeWidth = 6;
    if (size.size() < SizeWidth) size.insert(0, SizeWidth - size.size(), ' ');
    writeLine(modeText(member.getMode()) + " " + std::to_string(member.getUid()) + "/" +
              std::to_string(member.getGid()) + " " + size + " " +
              dateText(dates.textOf(member.getDate())) + " " + name);
  });
}

void printMembers(quarn::Run& run, const Request& request) {
  quarn::ContentsPrinter printer(run.archive);
  forEachMember(run, request, [&](const ArchiveMember& member) {
    if (request.settings.verbose) writeLine("\n<" + std::string(member.getName()) + ">\n");
    printer.print(member);
  });
  printer.finish();
}

void extractMembers(quarn::Run& run, const Request& request) {
  quarn::Extraction extraction(run);
  forEachMember(run, request, [&](ArchiveMember& member) { extraction(member); });
}

// Archives of other formats have names in places of their own. What was wrong with each has been
// told, and the first write would lose them all.
bool canKeepNames(const quarn::Run& run) {
  for (const ArchiveMember* member : run.archive.getMembers()) {
    if (member->isAuxiliary() || !member->getName().empty()) continue;
    return refuse("'%s' has a member without a name, as in another format", run.getArchiveName());
  }
  return true;
}

} // namespace

std::optional<uint32_t> findPlace(const arlib::Archive& archive, const Request& request,
                                  const std::unordered_set<const ArchiveMember*>& without) {
  const std::string_view name = memberNameOf(request.placeName, request);
  uint32_t inFront = 0;
  for (const ArchiveMember* member : archive.getMembers()) {
    const bool counts = !without.contains(member);
    if (request.place != Place::End && !member->isAuxiliary() && member->getName() == name)
      return inFront + (counts && request.place == Place::After ? 1 : 0);
    if (counts) ++inFront;
  }
  if (request.place == Place::End) return inFront;
  quarn::reportMessage(messages::ErrorWord, messages::PositionNotFound, request.placeName);
  return std::nullopt;
}

void doOperation(quarn::Run& run, const Request& request) {
  const Operation operation = request.operation;
  const bool mayCreate = operation == Operation::Append || operation == Operation::Replace;
  if (run.openStatus.missing && !mayCreate) {
    quarn::reportMessage(messages::ErrorWord, messages::ArchiveNotFound, run.getArchiveName(),
                         quarn::hostErrorText(run.openStatus.errorNumber));
    return;
  }
  if (!canKeepNames(run)) return;
  switch (operation) {
  case Operation::None:
  case Operation::Index: // the tables are made anew by every run that writes
    return;
  case Operation::Delete:
    return deleteMembers(run, request);
  case Operation::Move:
    return moveMembers(run, request);
  case Operation::Print:
    return printMembers(run, request);
  case Operation::Append:
  case Operation::Replace:
    return insertFiles(run, request);
  case Operation::List:
    return listMembers(run, request);
  case Operation::Extract:
    return extractMembers(run, request);
  }
}

} // namespace quarn_ar
