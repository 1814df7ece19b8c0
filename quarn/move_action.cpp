// SPDX-License-Identifier: Apache-2.0
//
// Members move one after the other, each behind the one before it, and a word means the first
// member that matches in the order reached so far. So at any time the list is
//
//   members in front of the position | those moved, by their last move | the other members
//
// (without a position the third part is empty). That picture is enough to find each word's member;
// the list itself is put in order once, when all words are done. Thousands of members may have one
// name, and as many words: they wait in a queue.
#include "quarn/actions.h"

#include "quarn/member_selection.h"
#include "quarn/reporting.h"

#include <algorithm>
#include <functional>
#include <queue>
#include <span>
#include <unordered_map>
#include <utility>
#include <vector>

namespace quarn {

using arlib::ArchiveMember;

namespace {

class Movement {
public:
  explicit Movement(Run& run) : m_Run(run), m_Selection(run.archive) {
    const auto members = run.archive.getMembers();
    m_Position = run.position < 0 ? members.size() : static_cast<size_t>(run.position);
    for (size_t i = 0; i < members.size(); ++i) {
      m_Places[members[i]] = {i < m_Position ? Part::Front : Part::Back, i};
    }
  }

  // Null if the word matches nothing.
  ArchiveMember* move(const std::string& word);
  void reorder();

private:
  enum class Part { Front, Moved, Back };
  using Place = std::pair<Part, size_t>; // then the old index, or the number of the move
  // The first one on top; places that members have left stay in it until they come up.
  using Waiting = std::pair<Place, ArchiveMember*>;
  using Queue = std::priority_queue<Waiting, std::vector<Waiting>, std::greater<>>;

  ArchiveMember* findFirstNamed(const std::string& word);
  ArchiveMember* findFirstMatch(const std::string& word) const;

  Run& m_Run;
  MemberSelection m_Selection;
  size_t m_Position;
  size_t m_Moves = 0;
  std::unordered_map<const ArchiveMember*, Place> m_Places;
  std::unordered_map<ArchiveMember* const*, Queue> m_Queues; // by the members of a name
};

ArchiveMember* Movement::move(const std::string& word) {
  ArchiveMember* const member =
      MemberSelection::isName(word) ? findFirstNamed(word) : findFirstMatch(word);
  if (member == nullptr) return nullptr;
  const Place place = {Part::Moved, m_Moves++};
  m_Places[member] = place;
  const auto queue = m_Queues.find(m_Selection.findNamesakes(*member).data());
  if (queue != m_Queues.end()) queue->second.emplace(place, member);
  return member;
}

ArchiveMember* Movement::findFirstNamed(const std::string& word) {
  const std::span<ArchiveMember* const> named = m_Selection.findNamed(word);
  if (named.empty()) return nullptr;
  const auto [entry, isNew] = m_Queues.try_emplace(named.data());
  Queue& queue = entry->second;
  for (ArchiveMember* member : isNew ? named : std::span<ArchiveMember* const>())
    queue.emplace(m_Places.at(member), member);
  while (queue.top().first != m_Places.at(queue.top().second))
    queue.pop();
  return queue.top().second;
}

ArchiveMember* Movement::findFirstMatch(const std::string& word) const {
  const std::vector<ArchiveMember*> members = m_Selection.find(word);
  const auto first =
      std::min_element(members.begin(), members.end(),
                       [this](const ArchiveMember* left, const ArchiveMember* right) {
                         return m_Places.at(left) < m_Places.at(right);
                       });
  return first == members.end() ? nullptr : *first;
}

void Movement::reorder() {
  std::vector<std::pair<size_t, ArchiveMember*>> moved;
  size_t inFront = 0;
  for (ArchiveMember* member : m_Run.archive.getMembers()) {
    const auto [part, number] = m_Places.at(member);
    if (part == Part::Moved) moved.emplace_back(number, member);
    if (part == Part::Front) ++inFront;
  }
  std::sort(moved.begin(), moved.end());
  std::vector<ArchiveMember*> block;
  block.reserve(moved.size());
  for (const auto& [number, member] : moved)
    block.push_back(member);
  m_Run.archive.moveMembers(block, static_cast<uint32_t>(inFront));
}

} // namespace

void moveMembers(Run& run) {
  Movement movement(run);
  for (const std::string& word : run.settings.fileList) {
    const ArchiveMember* member = movement.move(word);
    if (member == nullptr) {
      reportMessage(messages::ErrorWord, messages::NotPresentInArchive, word, run.getArchiveName());
      continue;
    }
    verboseMessage(run.settings, messages::MovedMember, member->getName());
  }
  movement.reorder();
}

} // namespace quarn
