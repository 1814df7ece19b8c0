// SPDX-License-Identifier: Apache-2.0
//
// What goes when a module is pruned: one question for each kind of object.
//
// The module marks what goes, takes along what hangs on it, and sweeps all lists once; see
// ObjectModule's deletions. A criterion only answers, in any order, and must not change the module.
#pragma once

namespace elfext {

class Group;
class LibrarySearchPath;
class NeededLibrary;
class Preemption;
class Section;
class Segment;
class Symbol;

/// Each operation is asked at most once for each object and answers whether it goes; by default
/// nothing does.
class PruneCriterion {
public:
  [[nodiscard]] virtual bool goes(const Section&) const { return false; }
  [[nodiscard]] virtual bool goes(const Group&) const { return false; }
  [[nodiscard]] virtual bool goes(const Segment&) const { return false; }
  /// Static and dynamic symbols.
  [[nodiscard]] virtual bool goes(const Symbol&) const { return false; }
  [[nodiscard]] virtual bool goes(const NeededLibrary&) const { return false; }
  [[nodiscard]] virtual bool goes(const LibrarySearchPath&) const { return false; }
  [[nodiscard]] virtual bool goes(const Preemption&) const { return false; }

protected:
  ~PruneCriterion() = default;
};

} // namespace elfext
