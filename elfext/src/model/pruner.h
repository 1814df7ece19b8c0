// SPDX-License-Identifier: Apache-2.0
//
// Takes objects out of a module, with what hangs on them, and leaves all lists and indexes dense.
// Everything is marked first and then swept, list by list: the time does not depend on how much
// goes, only on what there is.
//
// The module's own deletions and its clearing are prunings too. The criterion is asked at most once
// for each object.
#pragma once

#include "elfext/interface/object_module.h"
#include "elfext/interface/prune_criterion.h"

#include <cstdint>

namespace elfext {

class Pruner {
public:
  Pruner(ObjectModule& objectModule, const PruneCriterion& criterion)
      : m_ObjectModule(objectModule), m_Criterion(criterion) {}

  void run();

private:
  template <class Object>
  bool mark(FastArray<Object*>& list);
  void markAll();
  void markDependentSections();
  bool markSymbols(FastArray<Symbol*>& table);

  void sweepRelocations();
  void sweepPlacement();
  static void sweepSection(Section& section);
  void sweepSections();
  void sweepOverlayRecords();
  void sweepSymbols();
  void sweepGroups();
  void sweepSegments();
  template <class Object>
  static void sweep(FastArray<Object*>& list);
  template <class Object>
  static void sweepAndNumber(FastArray<Object*>& list, uint32_t firstIndex);

  ObjectModule& m_ObjectModule;
  const PruneCriterion& m_Criterion;
  bool m_SectionsGo = false;
  bool m_SymbolsGo = false;
  bool m_GroupsGo = false;
  bool m_SegmentsGo = false;
};

} // namespace elfext
