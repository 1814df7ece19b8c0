// SPDX-License-Identifier: Apache-2.0
//
// The rows of a relocation section that was read and checked but whose relocations nobody has
// asked for. An object may have a hundred thousand of them, and most questions need none.
//
// The reader supplies them; the section that the rows are for asks for them once.
#pragma once

namespace elfext {

class Section;

class RelocationRows {
public:
  /// Makes the relocations: `target.addRelocation` for each row, in order. Called once at most. The
  /// rows' symbols still have the places in the symbol tables that they were read at. Neither
  /// whether the target may be relocated nor whether indexes are frozen matters here.
  virtual void appendTo(Section& target) = 0;

protected:
  /// Rows live in a region of the module and have nothing to give back.
  ~RelocationRows() = default;
};

} // namespace elfext
