// SPDX-License-Identifier: Apache-2.0
//
// quarn-ar and quarn-ranlib on a host in memory, as the driver's tests have it.
#pragma once

#include "quarn-ar/ar_main.h"
#include "tests/unit/quarn/driver_fixture.h"

namespace quarn_ar {

using quarn::RunOutcome;
using quarn::Words;
using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;

class ArTest : public quarn::DriverTest {
protected:
  RunOutcome ar(const Words& words) { return runWork(arMain, "quarn-ar", words); }
  RunOutcome ranlib(const Words& words) { return runWork(arMain, "quarn-ranlib", words); }

  // The one sentence of a run that is refused.
  std::string refusal(const Words& words) {
    const RunOutcome outcome = ar(words);
    EXPECT_EQ(outcome.status, 1);
    EXPECT_EQ(outcome.output, "");
    return outcome.errors;
  }
};

} // namespace quarn_ar
