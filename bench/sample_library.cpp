// SPDX-License-Identifier: Apache-2.0
//
// Files of one letter, of slightly different sizes so that some end at odd places, in a folder that
// nobody else has. An archiver doesn't look into what is no object, so their bytes don't matter;
// names do, as a quarter of them goes through the long-name table.

#include "bench/sample_library.h"

#include <algorithm>
#include <filesystem>
#include <fstream>
#include <stdexcept>

namespace bench {

SampleFolder::SampleFolder() {
  std::string pattern = (std::filesystem::temp_directory_path() / "quarn_bench.XXXXXX").string();
  if (mkdtemp(pattern.data()) == nullptr) throw std::runtime_error("no temporary folder");
  m_Path = pattern;
}

SampleFolder::~SampleFolder() {
  std::filesystem::remove_all(m_Path);
}

std::vector<std::string> SampleFolder::makeFiles(const std::string& prefix, uint32_t count,
                                                 uint64_t size) const {
  std::vector<std::string> names;
  const std::string piece(64 * 1024, 'x');
  for (uint32_t i = 0; i < count; ++i) {
    const std::string number = std::to_string(100000 + i).substr(1);
    names.push_back(path(prefix + number + (i % 4 == 0 ? "_with_a_long_name.o" : ".o")));
    std::ofstream file(names.back(), std::ios::binary);
    // In pieces: a file of several megabytes needs no memory of its size.
    for (uint64_t left = size + i % 7; left > 0;) {
      const uint64_t part = std::min<uint64_t>(left, piece.size());
      file.write(piece.data(), static_cast<std::streamsize>(part));
      left -= part;
    }
  }
  return names;
}

} // namespace bench
