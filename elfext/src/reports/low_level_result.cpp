// SPDX-License-Identifier: Apache-2.0
#include "elfext/src/reports/low_level_result.h"

#include "elfext/src/reports/go_on.h"

namespace elfext {

namespace {

template <class Teller>
bool mapResult(const Teller& teller, LowLevelResult result) {
  switch (result) {
  case LowLevelResult::Success:
    return true;
  case LowLevelResult::OutsideImage:
    return refuse(teller, &ErrorHandler::ioErrorWriting, -1);
  case LowLevelResult::LayerFailure:
    return refuse(teller, &ErrorHandler::ioErrorReading, -1);
  case LowLevelResult::WrongMagic:
    return refuse(teller, &ErrorHandler::wrongMagic);
  case LowLevelResult::WrongClass:
    return refuse(teller, &ErrorHandler::wrongClass);
  case LowLevelResult::NoMemory:
    return refuse(teller, &ErrorHandler::outOfMemory);
  }
  QUARN_ASSERT(1, !"Should never get here");
  return false;
}

} // namespace

bool mapLowLevelResult(const ReadReporter& reporter, LowLevelResult result) {
  return mapResult(reporter, result);
}

bool mapLowLevelResult(const ObjectModule& module, LowLevelResult result) {
  return mapResult(module, result);
}

} // namespace elfext
