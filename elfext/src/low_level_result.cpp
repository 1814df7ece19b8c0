// SPDX-License-Identifier: Apache-2.0
#include "elfext/src/low_level_result.h"

#include "elfext/src/go_on.h"

namespace elfext {

bool mapLowLevelResult(const ObjectModule& module, LowLevelResult result) {
  switch (result) {
  case LowLevelResult::Success:
    return true;
  case LowLevelResult::OutsideImage:
    return refuse(module, &ErrorHandler::ioErrorWriting, -1);
  case LowLevelResult::LayerFailure:
    return refuse(module, &ErrorHandler::ioErrorReading, -1);
  case LowLevelResult::WrongMagic:
    return refuse(module, &ErrorHandler::wrongMagic);
  case LowLevelResult::WrongClass:
    return refuse(module, &ErrorHandler::wrongClass);
  case LowLevelResult::NoMemory:
    return refuse(module, &ErrorHandler::outOfMemory);
  }
  QUARN_ASSERT(1, !"Should never get here");
  return false;
}

} // namespace elfext
