// SPDX-License-Identifier: Apache-2.0
//
// Hears --message_locale while the command line is parsed, so that the language holds for all later
// messages. The driver's own listener passes that option on to this one.

#pragma once

#include "messages/interface/message_key.h"
#include "tabledrivenparser/interface/listener.h"

#include <string_view>

namespace messages {

/// Belongs to the client, and must outlive the parser that calls it.
class LocaleListener final : public tabledrivenparser::Listener {
public:
  /// Reports a message at fatal severity, with the name of the locale as its argument.
  using FatalReporter = void (*)(Key key, std::string_view locale);

  /// Without a reporter a bad locale is told on stderr in plain words.
  explicit LocaleListener(FatalReporter reporter) : m_Reporter(reporter) {}

  /// Takes the text of the value, whatever the id. A bad locale ends the process with status 1.
  /// False: the value is stored as well.
  bool onOption(tabledrivenparser::Parser& parser, uint32_t id,
                const tabledrivenparser::Value& value) override;

private:
  FatalReporter m_Reporter;
};

} // namespace messages
