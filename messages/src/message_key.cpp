// SPDX-License-Identifier: Apache-2.0
//
// The text form of a key: "%c%.4d%c", a letter, at least four digits and the severity letter.
// Styles show parts of it: style 1 leaves the severity letter out, and each puts the tool's own
// letter in front.

#include "messages/interface/message_key.h"

#include <cstdio>

namespace messages {

KeyText::KeyText(Key key) {
  const unsigned number = numberOf(key);
  const int length = std::snprintf(m_Characters, sizeof m_Characters, "%c%.4u%c", letterOf(key),
                                   number, severityLetterOf(key));
  m_Length = static_cast<size_t>(length);
}

} // namespace messages
