// SPDX-License-Identifier: Apache-2.0
//
//   make_corpus                            lists the corpora: name, objects, builds, bytes about
//   make_corpus CORPUS SEED SCALE FOLDER   writes the first objects of one in an existing folder
//
// The second form prints the objects' names, in order.
//
// compare.py calls it, as a gigabyte of objects is not made by a script. A write that fails ends
// it: half a corpus would be measured as a fast one.

#include "bench/compare/corpus.h"

#include <cstdio>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <string>

namespace {

int listCorpora() {
  for (const bench::Corpus& corpus : bench::getAllCorpora()) {
    std::printf("%s %u %u %llu\n", std::string(corpus.name).c_str(), corpus.objects, corpus.builds,
                static_cast<unsigned long long>(corpus.bytes));
  }
  return 0;
}

void writeFile(const std::filesystem::path& path, const std::string& bytes) {
  std::ofstream file(path, std::ios::binary);
  file.write(bytes.data(), static_cast<std::streamsize>(bytes.size()));
  if (file.flush()) return;
  std::fprintf(stderr, "make_corpus: can't write %s\n", path.c_str());
  std::exit(1);
}

void makeCorpus(const bench::Corpus& corpus, uint64_t seed, uint32_t count,
                const std::filesystem::path& folder) {
  for (uint32_t i = 0; i < count; ++i) {
    const std::string name = objectName(corpus, i);
    writeFile(folder / name, objectBytes(corpus, seed, i));
    // In the order in which the comparison puts them into a library.
    std::puts(name.c_str());
  }
}

} // namespace

int main(int argc, char** argv) {
  if (argc == 1) return listCorpora();
  const bench::Corpus* corpus = argc == 5 ? bench::findCorpus(argv[1]) : nullptr;
  if (corpus == nullptr) {
    std::fprintf(stderr, "usage: make_corpus [CORPUS SEED SCALE FOLDER]\n");
    return 2;
  }
  makeCorpus(*corpus, std::strtoull(argv[2], nullptr, 10),
             objectCount(*corpus, std::strtod(argv[3], nullptr)), argv[4]);
  return 0;
}
