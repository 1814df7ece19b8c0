// SPDX-License-Identifier: Apache-2.0
//
// The bytes of one object file: in memory that somebody lends, or in a range of a file, of which
// only those blocks are read that somebody looks at. A small image is read whole, in one host call,
// which may bring its neighbours along.
//
// The bytes of a file keep one address, in one array that has room for the whole image and whose
// untouched pages cost nothing. So a thousand overlapping views need no more memory than one.
#pragma once

#include "elfext/interface/image_source.h"
#include "support/interface/read_window.h"
#include "support/interface/source_file.h"

#include <cstdint>
#include <memory>
#include <span>
#include <vector>

namespace elfext {

// Why a view was not to be had.
enum class ImageFailure : uint8_t {
  None,
  Outside,    // beyond the end of the image
  Unreadable, // the host failed, or its file has become shorter
  NoMemory,
};

// What serves the images of one object after the other, where each is gone when the next comes.
struct ImageMemory {
  // Larger images get memory of their own, so that only what is looked at of them costs anything.
  static constexpr uint64_t LargestImage = 0x800000;

  support::ReadWindow window;
  // Of that size once there is any: what is never looked at costs nothing.
  std::unique_ptr<uint8_t[]> bytes;

  // Null if there is no memory.
  [[nodiscard]] uint8_t* reserve();
};

class ImageBytes final : public ImageSource {
public:
  // Images up to this size, in bytes, are read whole.
  static constexpr uint64_t WholeReadLimit = 0x10000;

  // Bytes that outlive this object.
  explicit ImageBytes(std::span<const uint8_t> bytes);
  // `size` bytes at `offset` of a file that others may read as well.
  ImageBytes(std::shared_ptr<support::SourceFile> file, uint64_t offset, uint64_t size);
  // The same for a handle, which must stay open as long as somebody looks for bytes; with
  // `closesFile` it is this object that closes it.
  ImageBytes(support::Host& host, support::FileHandle file, uint64_t offset, uint64_t size,
             bool closesFile);
  ~ImageBytes() override;
  ImageBytes(const ImageBytes&) = delete;
  ImageBytes& operator=(const ImageBytes&) = delete;

  // Gets the memory for a file's bytes, and those of a small image; once is enough. False for a
  // failure.
  [[nodiscard]] bool prepare();
  // The same with memory of the caller's, which stays as it is as long as somebody looks for bytes:
  // a small image is viewed in its window, which is one of this file.
  [[nodiscard]] bool prepare(ImageMemory& memory);

  // Reads all that was not looked at yet. False for a failure.
  [[nodiscard]] bool loadAll();
  // From now on the handle is somebody else's to close.
  void leaveFileOpen() { m_ClosesFile = false; }
  // Somebody else closes the handle now: what was not read can't be had any more.
  void forgetFile() { m_Handle = {}; }

  // Bytes.
  [[nodiscard]] uint64_t getSize() const { return m_Size; }
  // Whether the range lies in the image, whatever the two numbers are.
  [[nodiscard]] bool contains(uint64_t offset, uint64_t size) const {
    return offset <= m_Size && size <= m_Size - offset;
  }

  [[nodiscard]] const uint8_t* view(uint64_t offset, uint64_t size) override;

  // What the last failed operation failed for, with the host's error number; 0 where it has none.
  [[nodiscard]] ImageFailure getFailure() const { return m_Failure; }
  [[nodiscard]] support::HostError getHostError() const override { return m_HostError; }

private:
  [[nodiscard]] bool beginLoading(uint8_t* memory);
  [[nodiscard]] bool fail(ImageFailure failure, support::HostError error = 0);
  [[nodiscard]] bool load(uint64_t offset, uint64_t size);
  [[nodiscard]] bool loadBlocks(size_t first, size_t end);
  [[nodiscard]] size_t endOfMissing(size_t first, size_t end) const;
  [[nodiscard]] support::HostError readAt(std::span<uint8_t> bytes, uint64_t offset, size_t& done);

  const uint8_t* m_Bytes = nullptr;
  uint64_t m_Size;
  std::shared_ptr<support::SourceFile> m_File;
  // Or the handle that there is in its place.
  support::Host* m_Host = nullptr;
  support::FileHandle m_Handle;
  uint64_t m_FileOffset = 0;
  bool m_ClosesFile = false;
  // Where blocks are read to: memory of its own, or lent.
  uint8_t* m_Loaded = nullptr;
  std::unique_ptr<uint8_t[]> m_OwnMemory;
  std::vector<bool> m_IsBlockLoaded;
  size_t m_MissingBlocks = 0;
  ImageFailure m_Failure = ImageFailure::None;
  support::HostError m_HostError = 0;
};

} // namespace elfext
