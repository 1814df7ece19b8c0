// SPDX-License-Identifier: Apache-2.0
//
// What the lowest layer of reading answers, and which report each answer becomes.
//
// The layer is what hands out bytes of the image and the file header. Of hostile files it sees
// extents that leave the image, counts that no memory could hold, and files that became shorter.
#pragma once

#include <cstdint>

namespace elfext {

class ReadReporter;

enum class LowLevelResult : uint8_t {
  Success = 0,
  // Bytes that are not in the image. Reported as an error in writing, which is what users know.
  OutsideImage = 1,
  // The host failed while the image was read.
  LayerFailure = 2,
  WrongMagic = 3,
  WrongClass = 5,
  NoMemory = 6,
};

// Reports the failure, if it is one, to the handler. True for success only.
[[nodiscard]] bool mapLowLevelResult(const ReadReporter& reporter, LowLevelResult result);

} // namespace elfext
