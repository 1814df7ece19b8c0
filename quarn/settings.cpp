// SPDX-License-Identifier: Apache-2.0
//
// One action a run, and an access mode that is only raised: an option that reads can't make a run
// that writes forget to.
#include "quarn/settings.h"

#include "checking/interface/checking.h"
#include "quarn/reporting.h"

#include <algorithm>

namespace quarn {

void Settings::setAction(Action newAction) {
  QUARN_ASSERT(1, newAction != Action_None);
  if (action != Action_None && action != newAction) {
    reportMessage(messages::ErrorWord, messages::OnlyOneAction);
    return;
  }
  action = newAction;
}

void Settings::raiseAccessMode(AccessMode mode) {
  accessMode = std::max(accessMode, mode);
}

} // namespace quarn
