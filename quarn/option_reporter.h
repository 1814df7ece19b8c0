// SPDX-License-Identifier: Apache-2.0
//
// The bridge from the option parser's complaints to the catalogue.
#pragma once

#include "tabledrivenparser/interface/reporter.h"

namespace quarn {

class OptionReporter final : public tabledrivenparser::Reporter {
public:
  // Ends the process at the level Fatal.
  void
  reportOptionMessage(tabledrivenparser::ReportLevel level,
                      tabledrivenparser::OptionMessage message,
                      std::span<const tabledrivenparser::OptionMessageArgument> arguments) override;
};

} // namespace quarn
