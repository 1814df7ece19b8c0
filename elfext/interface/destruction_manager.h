// SPDX-License-Identifier: Apache-2.0
//
// Objects in regions that must go together, and before their region: the tables that live exactly
// as long as one read.

#pragma once

#include "alloclib/interface/region_base.h"
#include "checking/interface/checking.h"

#include <memory>

namespace elfext {

class DestructionManager {
public:
  DestructionManager() = default;
  /// Runs what is left.
  ~DestructionManager() { run(); }
  DestructionManager(const DestructionManager&) = delete;
  DestructionManager& operator=(const DestructionManager&) = delete;

  /// Takes over an object that was allocated in the region as one T.
  template <class T>
  void add(alloclib::Region* region, T* object) {
    QUARN_ASSERT(1, region != NULL);
    QUARN_ASSERT(1, object != NULL);
    push(region, object, [](alloclib::Region* home, void* doomed) {
      std::destroy_at(static_cast<T*>(doomed));
      home->DiscardFull(doomed, sizeof(T), alignof(T));
    });
  }

  /// Destroys the objects, the last one added first, and gives their memory back.
  void run();

private:
  using Destroyer = void (*)(alloclib::Region* region, void* object);

  struct Record {
    alloclib::Region* region;
    void* object;
    Destroyer destroy;
    Record* next;
  };

  void push(alloclib::Region* region, void* object, Destroyer destroy);

  Record* m_Head = nullptr;
};

} // namespace elfext
