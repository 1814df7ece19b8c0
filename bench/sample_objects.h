// SPDX-License-Identifier: Apache-2.0
//
// Objects in the shapes that real libraries have: many small ones, ones with a section for each
// function, ones that are mostly relocations and bytes.
#pragma once

#include "bench/sample_library.h"

#include <cstdint>
#include <string>
#include <vector>

namespace bench {

struct ObjectShape {
  std::string name;
  uint32_t count;           // of objects
  uint32_t fewestSections;  // of code, each with one global function
  uint32_t mostSections;    // likewise; what is between is spread evenly
  uint32_t bytesPerSection; // of code
  uint32_t relocations;     // of all sections together
  uint32_t builds = 1;      // of each module: that many objects define the same functions
};

// Makes the objects of a shape in the folder, and returns their names. Every function of a module
// has a name of its own; its builds differ in their attributes.
std::vector<std::string> makeObjects(const SampleFolder& folder, const ObjectShape& shape);

} // namespace bench
