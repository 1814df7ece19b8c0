// SPDX-License-Identifier: Apache-2.0
//
// Which options act at once, and on what. All others wait in the table of values.
#include "quarn/option_listeners.h"

#include "messages/interface/diagnostic_control.h"
#include "quarn/option_table.h"
#include "quarn/reporting.h"

#include <string_view>

namespace quarn {

using tabledrivenparser::Parser;
using tabledrivenparser::Value;

namespace {

void reportFatal(messages::Key key, std::string_view locale) {
  reportMessage(messages::FatalWord, key, locale);
}

std::string_view textOf(const Value& value) {
  return value.text == nullptr ? std::string_view() : std::string_view(value.text);
}

} // namespace

bool MsgLibListener::onOption(Parser&, uint32_t id, const Value& value) {
  switch (id) {
  case Option_DiagnosticStyle:
    messages::applyDiagnosticStyle(static_cast<uint32_t>(value.integer));
    return false;
  case Option_SuppressDiagnostics:
    return messages::applyDiagnosticOption(messages::DiagnosticSuppress, textOf(value));
  case Option_DiagnosticErrors:
    return messages::applyDiagnosticOption(messages::DiagnosticError, textOf(value));
  case Option_DiagnosticWarnings:
    return messages::applyDiagnosticOption(messages::DiagnosticWarning, textOf(value));
  case Option_DiagnosticRemarks:
    return messages::applyDiagnosticOption(messages::DiagnosticRemark, textOf(value));
  default:
    return false;
  }
}

QuarnListener::QuarnListener() : m_LocaleListener(reportFatal) {}

bool QuarnListener::onOption(Parser& parser, uint32_t id, const Value& value) {
  if (id == Option_MessageLocale) return m_LocaleListener.onOption(parser, id, value);
  return m_MsgLibListener.onOption(parser, id, value);
}

} // namespace quarn
