// SPDX-License-Identifier: Apache-2.0
//
// What the limit program knows of an object: just enough to publish its names and to add up its
// sizes. Of a large object only the headers, the symbol table, the strings and the relocations are
// read. Relocations are read because each must be looked at before an object can be called good;
// all other checks are of bytes that are read anyway, and left out. It knows only what the corpora
// hold: little-endian objects in which no debug section has global symbols, and in which the
// symbols that mark code and data ascend.
#pragma once

#include "bench/compare/limit_files.h"

#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

namespace bench {

// An object in a file, at an offset. If all of its bytes are in memory, they are lent.
struct ObjectPlace {
  const InputFile* file = nullptr;
  uint64_t offset = 0;
  std::string_view whole;
};

// The published names of objects, one behind the other, each with its NUL.
struct PublishedNames {
  std::string texts;
  std::vector<uint32_t> counts; // for each object
};

struct ObjectSizes {
  uint64_t code = 0;
  uint64_t readOnly = 0;
  uint64_t readWrite = 0;
  uint64_t zero = 0;
  uint64_t debug = 0;
};

// Room that is used again for each object: what is measured is not the heap.
struct ObjectBuffers {
  std::string header;
  std::string sections;
  std::string sectionNames;
  std::string symbols;
  std::string symbolNames;
  struct Stretch {
    uint64_t start = 0;
    bool isData = false;
  };
  std::vector<Stretch> stretches; // for each section
};

// Adds the object's published names, and their count, to those of the objects before it.
void publishNames(const ObjectPlace& object, ObjectBuffers& buffers, PublishedNames& names);
ObjectSizes computeSizes(const ObjectPlace& object, ObjectBuffers& buffers);

} // namespace bench
