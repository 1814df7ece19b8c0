// SPDX-License-Identifier: Apache-2.0
//
// The libraries that the comparison measures with, told by what their objects are made of. An
// object follows from the corpus, the seed and its number alone, so that a part of a corpus is its
// first objects. The sizes of objects are spread so that each such part has the same mix.
//
// The objects are little-endian, as compilers lay them out: of class 32 with relocations without
// addends, or of class 64 with addends. The plain archivers index both.
//
// Who asks: make_corpus, which writes them for compare.py, and the test of the corpora. Figures of
// different machines can be compared because nothing here depends on one.

#pragma once

#include <cstdint>
#include <span>
#include <string>
#include <string_view>

namespace bench {

struct Corpus {
  std::string_view name;
  uint32_t objects;
  uint32_t builds;            // of each module: that many objects define the same symbols
  bool isWide;                // class 64
  bool hasInlineFunctions;    // a section for each function, and a group for those in headers
  uint32_t fewestFunctions;   // of an object
  uint32_t mostFunctions;     // likewise; few objects come near
  uint32_t codeBytes;         // of a function, on average
  uint32_t codePerRelocation; // bytes
  uint32_t dataBytes;         // of an object
  uint32_t debugBytes;        // of an object, on average
  uint32_t debugRelocations;  // likewise
  uint64_t bytes;             // of all objects together, about
};

std::span<const Corpus> getAllCorpora();

// Null if there is none of this name.
const Corpus* findCorpus(std::string_view name);

// How many objects a part of the corpus has, of 1 for the whole: at least one.
uint32_t objectCount(const Corpus& corpus, double scale);

// The file's name, and so the member's. A quarter needs the long-name table.
std::string objectName(const Corpus& corpus, uint32_t number);

std::string objectBytes(const Corpus& corpus, uint64_t seed, uint32_t number);

} // namespace bench
