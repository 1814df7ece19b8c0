// SPDX-License-Identifier: Apache-2.0
//
// Streams for programs of which nobody reads what they say.
#pragma once

#include "alloclib/interface/region.h"
#include "messages/interface/output.h"
#include "messages/interface/process_end.h"

#include <cstdlib>
#include <string_view>

namespace fuzzing {

class Silence final : public messages::OutputSink {
public:
  int write(std::string_view) override { return 0; }
};

inline Silence silence;

// Once for the process, in front of the first run. No run may want to end the process.
inline bool silenceMessages() {
  alloclib::initialise();
  messages::setOutputSinks(&silence, &silence);
  messages::setExitHandler([](int) { std::abort(); });
  return true;
}

} // namespace fuzzing
