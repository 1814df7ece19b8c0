// SPDX-License-Identifier: Apache-2.0
//
// What acts while the command line is still being read: the options that change how messages look
// hold for every word behind them, errors in the command line included.
#pragma once

#include "messages/interface/locale_listener.h"
#include "tabledrivenparser/interface/listener.h"

namespace quarn {

// --diag_style and the --diag_* lists.
class MsgLibListener final : public tabledrivenparser::Listener {
public:
  bool onOption(tabledrivenparser::Parser& parser, uint32_t id,
                const tabledrivenparser::Value& value) override;
};

// The one listener of the parser: passes on what concerns messages, and leaves the rest.
class QuarnListener final : public tabledrivenparser::Listener {
public:
  QuarnListener();
  bool onOption(tabledrivenparser::Parser& parser, uint32_t id,
                const tabledrivenparser::Value& value) override;

private:
  messages::LocaleListener m_LocaleListener;
  MsgLibListener m_MsgLibListener;
};

} // namespace quarn
