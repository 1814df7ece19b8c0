// SPDX-License-Identifier: Apache-2.0
//
// The folders of files that the benchmarks work on, made in a temporary place and removed again.
// They are of any bytes and no objects: what is measured with them is reading, copying and writing,
// and not the symbol table.

#pragma once

#include <cstdint>
#include <string>
#include <vector>

namespace bench {

class SampleFolder {
public:
  SampleFolder();
  ~SampleFolder();
  SampleFolder(const SampleFolder&) = delete;
  SampleFolder& operator=(const SampleFolder&) = delete;

  [[nodiscard]] std::string path(const std::string& leaf) const { return m_Path + "/" + leaf; }

  // Makes `count` files of about `size` bytes each, and returns their names. A quarter of the names
  // needs the long-name table.
  std::vector<std::string> makeFiles(const std::string& prefix, uint32_t count,
                                     uint64_t size) const;

private:
  std::string m_Path;
};

} // namespace bench
