// SPDX-License-Identifier: Apache-2.0
//
// The scanner of via files over a text that is already in memory. The text is taken as it stands:
// comments are removed when a file is read, so here "#" and ";" are plain characters. Nothing is
// refilled, so words of any length pass: the limit on a file's words comes from its buffer.

#pragma once

#include "tabledrivenparser/interface/via_file.h"

namespace tabledrivenparser {

/// A via file without a file: never opens, refills or closes anything.
class DummyViaFile final : public ViaFile {
public:
  /// text is NUL-terminated and must outlive this object.
  DummyViaFile(Parser& parser, const char* text) : ViaFile(parser, "", text) {}

protected:
  bool refill() override { return false; }
};

} // namespace tabledrivenparser
