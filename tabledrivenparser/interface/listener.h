// SPDX-License-Identifier: Apache-2.0
//
// Who listens sees every option at its place in the command line, before it is stored. That is for
// options that must act on what comes after them: severities, style and language of messages hold
// for the complaints about the rest of the same command line. All other options only fill the
// table.

#pragma once

#include "tabledrivenparser/interface/value.h"

#include <cstdint>

namespace tabledrivenparser {

class Parser;

/// Belongs to the client and must outlive the parser.
class Listener {
public:
  virtual ~Listener() = default;
  /// For a vector option, value is the one element to be appended: integer for numbers, text for
  /// texts. Words that a call-back handler takes and names of via files are not offered. Returns
  /// true if the listener has taken the value: the parser then stores nothing, but the option still
  /// counts as set.
  [[nodiscard]] virtual bool onOption(Parser& parser, uint32_t id, const Value& value) = 0;
};

} // namespace tabledrivenparser
