// SPDX-License-Identifier: Apache-2.0
//
// The five libraries of the comparison, a row each, and how their objects are numbered and named.
// Each row is a kind of library that costs an archiver something else: many small objects (what is
// done for each member), C++ with a section for each function (sections and groups), builds of one
// module (attributes and decorated names), debug information (relocations), few and large ones
// (copying).
//
// The last column is what make_corpus tells of the size before anything is made; a test compares it
// with the first objects of each row.

#include "bench/compare/corpus.h"

#include <algorithm>
#include <cmath>

namespace bench {

namespace {

// clang-format off
constexpr Corpus Corpora[] = {
    // name     objects builds  wide   inline  fewest   most  code  per reloc.     data    debug  debug reloc.      bytes
    {"small",    10000,     1, false, false,      22,    50,    24,       48,       64,       0,            0,   30000000},
    {"cxx",        303,     1, true,  true,      375,  7500,    56,       48,      400,       0,            0,  184000000},
    {"variants",  6000,     3, false, false,      22,    50,    40,       48,      200,       0,            0,   24000000},
    {"debug",      200,     1, false, false,     150,   600,   160,       48,     4000, 1468000,       165000,  572000000},
    {"big",        140,     1, true,  false,    3000, 12000,  1000,      512,  2540000,       0,            0, 1000000000},
};
// clang-format on

} // namespace

std::span<const Corpus> getAllCorpora() {
  return Corpora;
}

const Corpus* findCorpus(std::string_view name) {
  const auto found = std::ranges::find(Corpora, name, &Corpus::name);
  return found == std::end(Corpora) ? nullptr : found;
}

uint32_t objectCount(const Corpus& corpus, double scale) {
  // An empty library would measure the start of a process.
  return std::max(1U, static_cast<uint32_t>(std::lround(corpus.objects * scale)));
}

std::string objectName(const Corpus& corpus, uint32_t number) {
  const uint32_t module = number / corpus.builds;
  // 100000 and the number, without the 1: five digits, so that names sort as numbers do.
  std::string name = std::string(corpus.name) + "_" + std::to_string(100000 + module).substr(1);
  // Then it is longer than the 15 characters that a header has room for.
  if (module % 4 == 0) name += "_implementation";
  if (corpus.builds > 1) name += {'_', static_cast<char>('a' + number % corpus.builds)};
  return name + ".o";
}

} // namespace bench
