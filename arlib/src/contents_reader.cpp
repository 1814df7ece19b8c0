// SPDX-License-Identifier: Apache-2.0
//
// A member's bytes in pieces, for who writes, prints or extracts: memory stays the same for a
// member of a kilobyte and of a gigabyte. A file that somebody writes to meanwhile would give half
// old and half new bytes, so it is checked when the reader turns to the next file, and at the end.
#include "arlib/interface/contents_reader.h"

#include "arlib/src/table_text.h"
#include "support/interface/read_window.h"
#include "support/interface/source_file.h"

#include <algorithm>
#include <vector>

namespace arlib {

struct ContentsReader::MadePieces {
  explicit MadePieces(const TableText& made) : text(made) {}

  const TableText& text;
  TableText::Place place = {};
  std::vector<uint8_t> bytes = std::vector<uint8_t>(PieceSize);

  std::span<const uint8_t> take(size_t count) {
    text.take(std::span(bytes).first(count), place);
    return std::span(bytes).first(count);
  }
};

ContentsReader::ContentsReader(Archive& archive)
    : m_Archive(archive), m_Window(std::make_unique<support::ReadWindow>()) {}

ContentsReader::~ContentsReader() = default;

bool ContentsReader::finish() {
  if (m_File == nullptr) return true;
  if (const int error = m_File->checkUnchanged(); error != 0) return failToRead(error);
  return true;
}

bool ContentsReader::turnTo(support::SourceFile* file) {
  if (m_File == file) return true;
  const bool isFinished = finish();
  m_File = file;
  m_Window->setFile(file);
  return isFinished;
}

bool ContentsReader::failToRead(int error) {
  m_Error = error;
  return m_Archive.fail(&ErrorHandler::reportReadError, m_File->getName(), error);
}

bool ContentsReader::start(const ArchiveMember& member) {
  m_Remaining = member.getSize();
  m_Memory = nullptr;
  m_Made.reset();
  if (member.hasContents()) {
    const std::span<const uint8_t> bytes = member.getContents();
    m_Memory = bytes.data();
    m_Remaining = std::min<uint64_t>(m_Remaining, bytes.size());
    return true;
  }
  if (member.m_Made != nullptr) {
    m_Made = std::make_unique<MadePieces>(*member.m_Made);
    return true;
  }
  const ArchiveMember::ContentsLocation& location = *member.getContentsLocation();
  m_Offset = location.offset;
  if (!turnTo(location.file)) return false;
  if (location.file->isKept()) m_Memory = location.file->getKept().subspan(m_Offset).data();
  return true;
}

bool ContentsReader::read(std::span<const uint8_t>& piece) {
  const auto wanted = static_cast<size_t>(std::min(m_Remaining, PieceSize));
  piece = {};
  if (wanted == 0) return true;
  if (m_Memory != nullptr) {
    piece = {m_Memory, wanted};
    m_Memory += wanted;
  } else if (m_Made != nullptr) {
    piece = m_Made->take(wanted);
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
