// SPDX-License-Identifier: Apache-2.0
//
// Which report each failure of the lowest layer becomes. None of them leaves anything to go on
// with, so a handler that answers "go on" to one of them is at fault.
#include "elfext/src/reports/low_level_result.h"

#include "elfext/src/reports/go_on.h"

namespace elfext {

bool mapLowLevelResult(const ReadReporter& reporter, LowLevelResult result) {
  switch (result) {
  case LowLevelResult::Success:
    return true;
  case LowLevelResult::OutsideImage:
    return refuse(reporter, &ErrorHandler::ioErrorWriting, -1);
  case LowLevelResult::LayerFailure:
    return refuse(reporter, &ErrorHandler::ioErrorReading, -1);
  case LowLevelResult::WrongMagic:
    return refuse(reporter, &ErrorHandler::wrongMagic);
  case LowLevelResult::WrongClass:
    return refuse(reporter, &ErrorHandler::wrongClass);
  case LowLevelResult::NoMemory:
    return refuse(reporter, &ErrorHandler::outOfMemory);
  }
  QUARN_ASSERT(1, !"Should never get here");
  return false;
}

} // namespace elfext
