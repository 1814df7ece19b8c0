// SPDX-License-Identifier: Apache-2.0
//
// A run in the wrong language would go on to the end with words that nobody asked for, so a bad
// locale is fatal. Without a reporter the words go to stderr as they are, from no catalogue. The
// name is the user's text, and only ever an argument.

#include "messages/interface/locale_listener.h"

#include "messages/interface/catalogue.h"
#include "messages/interface/process_end.h"
#include "messages/src/message_state.h"

namespace messages {

bool LocaleListener::onOption(tabledrivenparser::Parser&, uint32_t,
                              const tabledrivenparser::Value& value) {
  const std::string_view locale = value.text ? value.text : "";
  if (setLocale(locale)) return false;
  if (m_Reporter) {
    m_Reporter(LocaleNotInitialised, locale);
  } else {
    std::string& line = startLine();
    appendArguments(line, "*** Could not initialise message locale '%s'\n",
                    ArgumentArray<std::string_view>{locale});
    writeText(Stream::Error, line);
  }
  endProcess(1);
}

} // namespace messages
