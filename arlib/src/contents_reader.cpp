// SPDX-License-Identifier: Apache-2.0
#include "arlib/interface/contents_reader.h"

#include "arlib/src/kept_file.h"
#include "arlib/src/read_window.h"

#include <algorithm>

namespace arlib {

ContentsReader::ContentsReader(Archive& archive)
    : m_Archive(archive), m_File(std::make_unique<KeptFile>(archive.getHost())),
      m_Window(std::make_unique<ReadWindow>(archive.getHost())) {}

ContentsReader::~ContentsReader() = default;

bool ContentsReader::finish() {
  m_Error = m_File->close();
  if (m_Error == 0) return true;
  return m_Archive.fail(&ErrorHandler::reportCloseError, m_File->getFileName(), m_Error);
}

bool ContentsReader::openFile(const char* fileName) {
  if (m_File->isOpen(fileName)) return true;
  if (!finish()) return false;
  if (const int error = m_File->open(fileName); error != 0) return failToRead(error);
  m_Window->setFile(m_File->getFile());
  return true;
}

bool ContentsReader::failToRead(int error) {
  m_Error = error;
  return m_Archive.fail(&ErrorHandler::reportReadError, m_File->getFileName(), error);
}

bool ContentsReader::begin(const ArchiveMember& member) {
  m_Remaining = member.getSize();
  m_Memory = nullptr;
  if (member.hasContents()) {
    const std::span<const uint8_t> bytes = member.getContents();
    m_Memory = bytes.data();
    m_Remaining = std::min<uint64_t>(m_Remaining, bytes.size());
    return true;
  }
  m_Offset = member.getContentsLocation()->offset;
  return openFile(member.getContentsLocation()->fileName);
}

bool ContentsReader::read(std::span<const uint8_t>& piece) {
  const auto wanted = static_cast<size_t>(std::min(m_Remaining, PieceSize));
  piece = {};
  if (wanted == 0) return true;
  if (m_Memory != nullptr) {
    piece = {m_Memory, wanted};
    m_Memory += wanted;
  } else {
    int error = 0;
    piece = m_Window->fetch(m_Offset, wanted, error);
    if (piece.size() < wanted) return failToRead(error);
    m_Offset += wanted;
  }
  m_Remaining -= wanted;
  return true;
}

} // namespace arlib
