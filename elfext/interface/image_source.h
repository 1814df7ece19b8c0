// SPDX-License-Identifier: Apache-2.0
//
// The bytes of an object file, wherever they are. A buffer that nobody looks into never asks for
// its bytes, so that code and debug information need not even be read.
//
// The reader's image is the one source of the product; buffers know it by this role alone. Ranges
// that are asked for have been compared with the image, but the file behind it may have been cut
// since.
#pragma once

#include "support/interface/host.h"

#include <cstdint>

namespace elfext {

class ImageSource {
public:
  virtual ~ImageSource() = default;

  /// `size` bytes at `offset` of the object, valid as long as the source; null if they can't be
  /// had. An object module owns the source that its buffers refer to.
  [[nodiscard]] virtual const uint8_t* view(uint64_t offset, uint64_t size) = 0;

  /// Why they could not be had the last time: the host's error number; 0 where it has none.
  [[nodiscard]] virtual support::HostError getHostError() const = 0;
};

} // namespace elfext
