// SPDX-License-Identifier: Apache-2.0
//
// Decides which bytes of an object are read from its file, and when. The tables and, later on, the
// buffers of a model ask for views; what nobody looks at is never read. A view is made only of an
// extent that lies in the image, compared by subtraction, so offsets and sizes may come from the
// file as they are. Memory is asked for without exceptions: an image whose claimed size can't be
// had is a failure to be told, and not the end of the program.
#include "elfext/src/bytes/image_bytes.h"

#include <algorithm>
#include <new>
#include <utility>

namespace elfext {

namespace {

// A page of the host's file cache, below which a smaller read saves nothing.
constexpr uint64_t BlockSize = 0x1000;
// Who looks behind what is loaded will mostly look on: so many blocks are read at once then.
constexpr size_t BlocksAhead = 16;

} // namespace

uint8_t* ImageMemory::reserve() {
  if (bytes == nullptr) bytes.reset(new (std::nothrow) uint8_t[LargestImage]);
  return bytes.get();
}

ImageBytes::ImageBytes(std::span<const uint8_t> bytes)
    : m_Bytes(bytes.data()), m_Size(bytes.size()) {}

ImageBytes::ImageBytes(std::shared_ptr<support::SourceFile> file, uint64_t offset, uint64_t size)
    : m_Size(size), m_File(std::move(file)), m_FileOffset(offset) {
  // What is in memory already is viewed there.
  const std::span<const uint8_t> kept = m_File->getKept();
  if (kept.data() != nullptr && offset <= kept.size() && size <= kept.size() - offset)
    m_Bytes = kept.data() + offset;
}

ImageBytes::ImageBytes(support::Host& host, support::FileHandle file, uint64_t offset,
                       uint64_t size, bool closesFile)
    : m_Size(size), m_Host(&host), m_Handle(file), m_FileOffset(offset), m_ClosesFile(closesFile) {}

ImageBytes::~ImageBytes() {
  // What was read is right whatever a close says of it now.
  if (m_ClosesFile && m_Handle.isOpen()) static_cast<void>(m_Host->close(m_Handle));
}

bool ImageBytes::fail(ImageFailure failure, support::HostError error) {
  m_Failure = failure;
  m_HostError = error;
  return false;
}

bool ImageBytes::prepare() {
  if (m_Bytes != nullptr || m_Size == 0) return m_Failure == ImageFailure::None;
  // Left as it comes: pages that nothing is read into never cost memory.
  m_OwnMemory.reset(new (std::nothrow) uint8_t[m_Size]);
  return beginLoading(m_OwnMemory.get());
}

bool ImageBytes::prepare(ImageMemory& memory) {
  if (m_Bytes != nullptr || m_Size > ImageMemory::LargestImage) return prepare();
  if (m_Size > WholeReadLimit) return beginLoading(memory.reserve());
  support::HostError error = 0;
  const std::span<const uint8_t> bytes =
      memory.window.fetch(m_FileOffset, static_cast<size_t>(m_Size), error);
  if (bytes.size() < m_Size) return fail(ImageFailure::Unreadable, error);
  m_Bytes = bytes.data();
  return true;
}

bool ImageBytes::beginLoading(uint8_t* memory) {
  if (memory == nullptr) return fail(ImageFailure::NoMemory);
  m_Loaded = memory;
  m_Bytes = memory;
  m_MissingBlocks = (m_Size - 1) / BlockSize + 1;
  // One bit a block, where a list of loaded ranges would have to be searched at each look.
  m_IsBlockLoaded.resize(m_MissingBlocks);
  return m_Size > WholeReadLimit || loadBlocks(0, m_MissingBlocks);
}

bool ImageBytes::loadAll() {
  return m_MissingBlocks == 0 || load(0, m_Size);
}

const uint8_t* ImageBytes::view(uint64_t offset, uint64_t size) {
  // The only way to a view, and so the one place where an extent is compared with what there is.
  if (!contains(offset, size)) {
    static_cast<void>(fail(ImageFailure::Outside));
    return nullptr;
  }
  if (m_MissingBlocks != 0 && size != 0 && !load(offset, size)) return nullptr;
  return m_Bytes + offset;
}

bool ImageBytes::load(uint64_t offset, uint64_t size) {
  const size_t end = (offset + size - 1) / BlockSize + 1;
  size_t block = offset / BlockSize;
  while (block < end) {
    if (m_IsBlockLoaded[block]) {
      ++block;
      continue;
    }
    // Looking right behind the last read is how tables are walked through; elsewhere, one look at a
    // header costs only its own block.
    const bool readsOn = block > 0 && m_IsBlockLoaded[block - 1];
    const size_t wanted = readsOn ? std::max(end, block + BlocksAhead) : end;
    const size_t runEnd = endOfMissing(block, std::min(wanted, m_IsBlockLoaded.size()));
    if (!loadBlocks(block, runEnd)) return false;
    block = runEnd;
  }
  return true;
}

size_t ImageBytes::endOfMissing(size_t first, size_t end) const {
  while (first < end && !m_IsBlockLoaded[first])
    ++first;
  return first;
}

support::HostError ImageBytes::readAt(std::span<uint8_t> bytes, uint64_t offset, size_t& done) {
  done = 0;
  if (m_File != nullptr) return m_File->readAt(bytes, offset, done);
  return m_Handle.isOpen() ? m_Host->readAt(m_Handle, bytes, offset, done) : 0;
}

bool ImageBytes::loadBlocks(size_t first, size_t end) {
  const uint64_t offset = first * BlockSize;
  const uint64_t size = std::min(end * BlockSize, m_Size) - offset;
  size_t done = 0;
  // A short read is a failure: the file has been cut since its size was taken.
  const support::HostError error = readAt({m_Loaded + offset, size}, m_FileOffset + offset, done);
  if (error != 0 || done < size) return fail(ImageFailure::Unreadable, error);
  std::fill(m_IsBlockLoaded.begin() + static_cast<ptrdiff_t>(first),
            m_IsBlockLoaded.begin() + static_cast<ptrdiff_t>(end), true);
  m_MissingBlocks -= end - first;
  return true;
}

} // namespace elfext
