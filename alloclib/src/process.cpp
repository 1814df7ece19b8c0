// SPDX-License-Identifier: Apache-2.0
//
// The one place that holds state of the process for the region system. The default parents are a
// stack of small records in the root region, so that the root must see them popped before it can
// end in balance.
//
// The end goes from the top down: pages, parents, the records of the regions, the root. Faults show
// on the way: a region that still lives by its record, and memory that somebody has kept by the
// balance of the root.

#include "alloclib/interface/process.h"

#include "alloclib/interface/handlers.h"
#include "alloclib/interface/region_large_block.h"
#include "alloclib/interface/region_malloc_free.h"
#include "alloclib/interface/region_stats.h"

#include <new>

namespace alloclib {
namespace {

struct DefaultParent {
  Region* region;
  DefaultParent* next;
};

struct ProcessState {
  RegionMallocFree* root = nullptr;
  RegionLargeBlock* largeBlock = nullptr;
  DefaultParent* defaultParents = nullptr;
};

ProcessState state;
int debugMode = Debug_Off;
uint32_t traceLevel = 0;

void mustBeInitialised() {
  if (state.root == nullptr) internalError("Alloclib not initialised");
}

void destroyLargeBlock() {
  if (state.largeBlock == nullptr) return;
  state.largeBlock->Destroy(true);
  state.largeBlock = nullptr;
}

} // namespace

void initialise() {
  if (state.root != nullptr) internalError("Alloclib cannot be initialised more than once");
  state.root = RegionMallocFree::Create("System region");
  pushDefaultParent(state.root);
}

void shutDown(bool freeMemory) {
  mustBeInitialised();
  // The process exits: giving back page by page what the host takes as a whole is time lost.
  if (!freeMemory) return;
  destroyLargeBlock();
  while (state.defaultParents != nullptr)
    popDefaultParent();
  RegionStats::freeAll();
  state.root->Destroy(true);
  state.root = nullptr;
  // The root's own record has come to the finished ones only now.
  RegionStats::freeAll();
}

void pushDefaultParent(Region* parent) {
  mustBeInitialised();
  void* memory = state.root->AllocFull(sizeof(DefaultParent), alignof(DefaultParent), nullptr);
  state.defaultParents = ::new (memory) DefaultParent{parent, state.defaultParents};
}

Region* popDefaultParent() {
  DefaultParent* top = state.defaultParents;
  if (top == nullptr) internalError("No Default Parent to pop from stack");
  Region* parent = top->region;
  state.defaultParents = top->next;
  state.root->DiscardFull(top, sizeof(DefaultParent), alignof(DefaultParent));
  return parent;
}

Region* getDefaultParent() {
  mustBeInitialised();
  if (state.defaultParents == nullptr) return state.root;
  return state.defaultParents->region;
}

RegionLargeBlock* getProcessLargeBlock() {
  if (state.largeBlock == nullptr) state.largeBlock = RegionFastOld::Create("Process pages");
  return state.largeBlock;
}

size_t getSystemSize() {
  return state.root == nullptr ? 0 : state.root->getCurrentSize();
}

int getDebugMode() {
  return debugMode;
}

void setDebugMode(int mode) {
  debugMode = mode;
}

uint32_t getTraceLevel() {
  return traceLevel;
}

void setTraceLevel(uint32_t level) {
  traceLevel = level;
}

} // namespace alloclib
