// SPDX-License-Identifier: Apache-2.0
//
// A piece may end anywhere, also in the middle of a text.
#include "arlib/src/table_text.h"

#include <algorithm>
#include <cstring>

namespace arlib {

namespace {

// Copies what is left of the bytes from `at` on, as far as there is room.
size_t copyFrom(std::string_view bytes, size_t at, std::span<uint8_t> room) {
  if (at >= bytes.size()) return 0;
  const size_t count = std::min(bytes.size() - at, room.size());
  std::memcpy(room.data(), bytes.data() + at, count);
  return count;
}

} // namespace

void TableText::addTexts(std::span<const std::string_view> texts, uint64_t textSize,
                         std::string_view ending) {
  m_Runs.push_back({texts, ending});
  m_TextsSize += textSize + uint64_t{texts.size()} * ending.size();
}

size_t TableText::take(std::span<uint8_t> room, Place& place) const {
  const std::string_view head(reinterpret_cast<const char*>(m_Head.data()), m_Head.size());
  size_t done = copyFrom(head, place.headAt, room);
  place.headAt += done;
  for (; place.run < m_Runs.size(); ++place.run, place.text = 0) {
    const auto& [texts, ending] = m_Runs[place.run];
    for (; place.text < texts.size(); ++place.text, place.textAt = 0) {
      const std::string_view text = texts[place.text];
      const size_t before = done;
      done += copyFrom(text, place.textAt, room.subspan(done));
      const size_t inEnding = std::max(place.textAt, text.size()) - text.size();
      if (place.textAt + (done - before) >= text.size())
        done += copyFrom(ending, inEnding, room.subspan(done));
      place.textAt += done - before;
      if (place.textAt < text.size() + ending.size()) return done;
    }
  }
  return done;
}

} // namespace arlib
