// SPDX-License-Identifier: Apache-2.0
//
// Files for the limit program: an input that is read by place, and an output that gathers small
// pieces into large writes. What fails ends the program.
//
// On tmpfs, copying through a buffer of this size, by copy_file_range, by sendfile and from a
// mapping take the same time within a few hundredths: the new pages are what costs.
#pragma once

#include <cstdint>
#include <memory>
#include <string>
#include <string_view>
#include <sys/stat.h>

namespace bench {

// As large as the tool's own, so that what is compared is what stands around it.
constexpr size_t BufferSize = 256 * 1024;

// Room for bytes that are all written before they are read.
inline std::unique_ptr<char[]> makeRoom(size_t size) {
  return std::make_unique_for_overwrite<char[]>(size);
}

// Says what failed, and the host's reason, and ends the program with status 1.
[[noreturn]] void fail(const std::string& what);

class InputFile {
public:
  explicit InputFile(const std::string& path);
  ~InputFile();
  InputFile(const InputFile&) = delete;
  InputFile& operator=(const InputFile&) = delete;

  [[nodiscard]] const struct stat& getStatus() const { return m_Status; }
  [[nodiscard]] uint64_t getSize() const { return static_cast<uint64_t>(m_Status.st_size); }

  // Fills the place with bytes that must be there.
  void read(char* place, uint64_t offset, size_t count) const;

private:
  int m_File;
  struct stat m_Status;
};

// A view of some stretch of a file that follows the reader.
class Window {
public:
  explicit Window(const InputFile& file, size_t size = BufferSize)
      : m_File(file), m_Size(size), m_Bytes(makeRoom(size)) {}

  [[nodiscard]] bool holds(size_t count) const { return count <= m_Size; }
  // Valid until the next call. The count is one that the window holds.
  std::string_view at(uint64_t offset, size_t count);

private:
  const InputFile& m_File;
  size_t m_Size;
  std::unique_ptr<char[]> m_Bytes;
  uint64_t m_Start = 0;
  size_t m_Filled = 0;
};

class OutputFile {
public:
  // Empty or made new; "-" is standard output. With a buffer of no bytes, nothing can be copied.
  explicit OutputFile(const std::string& path, size_t bufferSize = BufferSize);
  ~OutputFile();
  OutputFile(const OutputFile&) = delete;
  OutputFile& operator=(const OutputFile&) = delete;

  void put(std::string_view bytes);
  void put(char byte) { put(std::string_view(&byte, 1)); }
  // Right-aligned with blanks.
  void putNumber(uint64_t number, size_t width);
  void copy(const InputFile& from, uint64_t offset, uint64_t count);
  void flush();

private:
  int m_File;
  size_t m_Size;
  std::unique_ptr<char[]> m_Bytes;
  size_t m_Filled = 0;
};

} // namespace bench
