// SPDX-License-Identifier: Apache-2.0
#include "arlib/interface/contents_reader.h"

#include "arlib/src/read_window.h"

#include <algorithm>

namespace arlib {

ContentsReader::ContentsReader(Archive& archive)
    : m_Archive(archive), m_Host(archive.getHost()),
      m_Window(std::make_unique<ReadWindow>(m_Host)) {}

ContentsReader::~ContentsReader() {
  if (m_File.isOpen()) [[maybe_unused]]
    const int error = m_Host.close(m_File);
}

bool ContentsReader::finish() {
  if (!m_File.isOpen()) return true;
  m_Error = m_Host.close(m_File);
  m_File = {};
  if (m_Error == 0) return true;
  return m_Archive.fail(&ErrorHandler::reportCloseError, m_FileName.c_str(), m_Error);
}

bool ContentsReader::openFile(const char* fileName) {
  if (m_File.isOpen() && m_FileName == fileName) return true;
  if (!finish()) return false;
  m_FileName = fileName;
  if (const int error = m_Host.openForReading(fileName, m_File); error != 0) {
    m_File = {};
    return failToRead(error);
  }
  m_Window->setFile(m_File);
  return true;
}

bool ContentsReader::failToRead(int error) {
  m_Error = error;
  return m_Archive.fail(&ErrorHandler::reportReadError, m_FileName.c_str(), error);
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
