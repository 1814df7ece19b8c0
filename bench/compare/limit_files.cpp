// SPDX-License-Identifier: Apache-2.0
//
// Plain reads and writes, and nothing kept that nobody needs. A file that ends too soon, or a disk
// that is full, ends the program with the host's reason: it works on libraries that the comparison
// has made itself, and a figure of a run that failed is none.

#include "bench/compare/limit_files.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <cstdio>
#include <cstdlib>
#include <fcntl.h>
#include <unistd.h>

namespace bench {

namespace {

// A pipe or a full disk takes less than it is given.
void writeAll(int file, std::string_view bytes) {
  while (!bytes.empty()) {
    const ssize_t count = write(file, bytes.data(), bytes.size());
    if (count <= 0) fail("write");
    bytes.remove_prefix(static_cast<size_t>(count));
  }
}

} // namespace

void fail(const std::string& what) {
  std::perror(("limit: " + what).c_str());
  std::exit(1);
}

InputFile::InputFile(const std::string& path) : m_File(open(path.c_str(), O_RDONLY | O_CLOEXEC)) {
  if (m_File < 0 || fstat(m_File, &m_Status) != 0) fail(path);
}

InputFile::~InputFile() {
  close(m_File);
}

void InputFile::read(char* place, uint64_t offset, size_t count) const {
  if (pread(m_File, place, count, static_cast<off_t>(offset)) != static_cast<ssize_t>(count))
    fail("read");
}

std::string_view Window::at(uint64_t offset, size_t count) {
  // Filled from the place that is asked for: who reads on in order finds what follows in it.
  if (offset < m_Start || offset + count > m_Start + m_Filled) {
    m_Start = offset;
    m_Filled = std::min<uint64_t>(m_Size, m_File.getSize() - offset);
    m_File.read(m_Bytes.get(), offset, m_Filled);
    if (count > m_Filled) fail("unexpected end");
  }
  return {m_Bytes.get() + (offset - m_Start), count};
}

OutputFile::OutputFile(const std::string& path, size_t bufferSize)
    : m_File(path == "-" ? STDOUT_FILENO
                         : open(path.c_str(), O_WRONLY | O_CREAT | O_TRUNC | O_CLOEXEC, 0666)),
      m_Size(bufferSize), m_Bytes(makeRoom(bufferSize)) {
  if (m_File < 0) fail(path);
}

OutputFile::~OutputFile() {
  if (m_File != STDOUT_FILENO) close(m_File);
}

void OutputFile::put(std::string_view bytes) {
  if (bytes.size() > m_Size - m_Filled) flush();
  if (bytes.size() > m_Size) return writeAll(m_File, bytes);
  std::copy(bytes.begin(), bytes.end(), m_Bytes.get() + m_Filled);
  m_Filled += bytes.size();
}

void OutputFile::putNumber(uint64_t number, size_t width) {
  std::array<char, 20> digits;
  const auto end = std::to_chars(digits.begin(), digits.end(), number).ptr;
  for (auto count = static_cast<size_t>(end - digits.begin()); count < width; ++count)
    put(' ');
  put(std::string_view(digits.begin(), end));
}

void OutputFile::copy(const InputFile& from, uint64_t offset, uint64_t count) {
  // As large writes as the buffer allows, without a copy of what lies in it already.
  while (count > 0) {
    if (m_Filled == m_Size || (m_Filled > 0 && count > m_Size)) flush();
    const size_t part = std::min<uint64_t>(count, m_Size - m_Filled);
    from.read(m_Bytes.get() + m_Filled, offset, part);
    m_Filled += part;
    offset += part;
    count -= part;
  }
}

void OutputFile::flush() {
  writeAll(m_File, {m_Bytes.get(), m_Filled});
  m_Filled = 0;
}

} // namespace bench
