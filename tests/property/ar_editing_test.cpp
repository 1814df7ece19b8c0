// SPDX-License-Identifier: Apache-2.0
//
// Random command lines of quarn-ar against a plain list of names and texts, in which each word is
// looked for from the front. The seeds are fixed: a failure comes back.

#include "tests/unit/quarn-ar/ar_fixture.h"

#include <algorithm>
#include <functional>
#include <random>

namespace quarn_ar {

namespace {

constexpr int StepsOfASequence = 60;
constexpr size_t NoMember = SIZE_MAX;

struct ListedMember {
  std::string name;
  std::string text;
  size_t number = 0; // since the last step: no two are the same
  bool operator==(const ListedMember& other) const {
    return name == other.name && text == other.text;
  }
};
using MemberList = std::vector<ListedMember>;

class ArEditing : public ArTest, public testing::WithParamInterface<uint32_t> {
protected:
  void run() {
    for (int i = 0; i < StepsOfASequence && !HasFailure(); ++i)
      step();
  }

private:
  uint32_t pick(uint32_t bound) { return static_cast<uint32_t>(m_Random() % bound); }
  std::string name() {
    static const Words Names = {"a", "b", "c", "A", "two words", "a_name_of_more_than_15.o"};
    return Names[pick(static_cast<uint32_t>(Names.size()))];
  }
  Words someWords() {
    Words words(pick(5));
    for (std::string& word : words)
      word = (pick(3) == 0 ? "folder/" : "") + name();
    return words;
  }
  static std::string leafOf(const std::string& word) { return word.substr(word.rfind('/') + 1); }

  // The members that the words mean: each takes the next of its name. NoMember where there is none
  // left.
  static std::vector<size_t> taken(const MemberList& list, const Words& words) {
    std::vector<size_t> places;
    for (const std::string& word : words) {
      size_t place = 0;
      while (place < list.size() &&
             (list[static_cast<size_t>(place)].name != leafOf(word) ||
              std::find(places.begin(), places.end(), place) != places.end()))
        ++place;
      places.push_back(place == list.size() ? NoMember : place);
    }
    return places;
  }
  static bool hasName(const MemberList& list, const std::string& word) {
    return std::any_of(list.begin(), list.end(),
                       [&](const ListedMember& member) { return member.name == leafOf(word); });
  }

  // Puts the members with these numbers together, in this order. False if the place is nowhere.
  static bool gather(MemberList& list, const std::vector<size_t>& numbers, char side,
                     const std::string& placeName) {
    const auto isGathered = [&](const ListedMember& member) {
      return std::find(numbers.begin(), numbers.end(), member.number) != numbers.end();
    };
    auto anchor = std::find_if(list.begin(), list.end(), [&](const ListedMember& member) {
      return member.name == leafOf(placeName);
    });
    if (side == '\0') anchor = list.end();
    if (side != '\0' && anchor == list.end()) return false;
    const auto inFront = std::count_if(list.begin(), anchor, std::not_fn(isGathered));
    const bool isBehind = side == 'a' && !isGathered(*anchor);
    MemberList gathered;
    for (const size_t number : numbers) {
      gathered.push_back(*std::find_if(list.begin(), list.end(), [&](const ListedMember& member) {
        return member.number == number;
      }));
    }
    std::erase_if(list, isGathered);
    list.insert(list.begin() + inFront + (isBehind ? 1 : 0), gathered.begin(), gathered.end());
    return true;
  }

  // What the list is afterwards; nothing if the run fails.
  std::optional<MemberList> edited(char operation, char side, const std::string& placeName,
                                   const Words& words) {
    MemberList list = m_List;
    for (size_t i = 0; i < list.size(); ++i)
      list[i].number = i;
    std::vector<size_t> numbers;
    const std::vector<size_t> places = taken(m_List, operation == 'q' ? Words() : words);
    for (size_t i = 0; i < words.size(); ++i) {
      const size_t place = operation == 'q' ? NoMember : places[i];
      const bool isNew = operation == 'q' || (operation == 'r' && place == NoMember);
      if (operation == 'm' && !hasName(m_List, words[i])) return std::nullopt;
      if (operation == 'r' && !isNew) list[place].text = m_Host.read(words[i]);
      if (isNew) list.push_back({leafOf(words[i]), m_Host.read(words[i]), list.size()});
      if (isNew) numbers.push_back(list.size() - 1);
      if ((operation == 'm' || operation == 'd') && place != NoMember) numbers.push_back(place);
    }
    if (operation == 'd') {
      std::erase_if(list, [&](const ListedMember& member) {
        return std::find(numbers.begin(), numbers.end(), member.number) != numbers.end();
      });
      return list;
    }
    if (!gather(list, numbers, side, placeName)) return std::nullopt;
    return list;
  }

  void step() {
    const char operation = "rqdm"[pick(4)];
    const bool hasSide = (operation == 'r' || operation == 'm') && pick(2) == 0;
    const char side = hasSide ? "ab"[pick(2)] : '\0';
    const std::string placeName = name();
    const Words words = someWords();
    for (const std::string& word : words)
      m_Host.addFile(word, word + std::to_string(pick(1000)));
    std::string letters = std::string(pick(2), '-') + operation + (pick(2) == 0 ? "S" : "c");
    Words line = {hasSide ? letters + side : letters};
    if (hasSide) line.push_back(placeName);
    line.emplace_back("lib.a");
    line.insert(line.end(), words.begin(), words.end());
    SCOPED_TRACE(testing::PrintToString(line));
    const std::optional<MemberList> expected =
        m_Host.has("lib.a") || operation == 'r' || operation == 'q'
            ? edited(operation, side, placeName, words)
            : std::nullopt;
    EXPECT_EQ(ar(line).status, expected ? 0 : 1);
    if (expected) m_List = *expected;
    compare();
  }

  void compare() {
    if (!m_Host.has("lib.a")) {
      EXPECT_TRUE(m_List.empty());
      return;
    }
    MemberList found;
    std::string all;
    for (const testsupport::ParsedMember& member : members())
      found.push_back({member.name, member.contents});
    EXPECT_TRUE(found == m_List) << testing::PrintToString(names());
    for (const ListedMember& member : m_List)
      all += member.text;
    EXPECT_EQ(ar({"p", "lib.a"}).output, all);
    const std::string before = m_Host.read("lib.a");
    EXPECT_EQ(ar({"m", "lib.a"}).status, 0);
    EXPECT_EQ(m_Host.read("lib.a"), before);
  }

  std::mt19937 m_Random{GetParam()};
  MemberList m_List;
};

} // namespace

TEST_P(ArEditing, IsThatOfAPlainList) {
  run();
}

INSTANTIATE_TEST_SUITE_P(Seeds, ArEditing, testing::Range(1U, 41U));

} // namespace quarn_ar
