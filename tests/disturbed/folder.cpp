// SPDX-License-Identifier: Apache-2.0
//
// A file that is put back is a new file with its old date: runs see nothing of the one before.
#include "tests/disturbed/folder.h"

#include <array>
#include <cstdlib>
#include <fcntl.h>
#include <filesystem>
#include <sys/stat.h>
#include <unistd.h>
#include <utility>

namespace disturbed {

namespace fs = std::filesystem;

namespace {

constexpr int64_t DayOfAllFiles = 1000000000;

std::string makeFolder() {
  const char* const places[] = {"/dev/shm", std::getenv("TMPDIR"), "/tmp"};
  for (const char* place : places) {
    if (place == nullptr) continue;
    std::string name = std::string(place) + "/disturbed.XXXXXX";
    if (mkdtemp(name.data()) != nullptr) return name;
  }
  std::abort();
}

std::string readAll(const std::string& path) {
  std::string bytes;
  const int file = open(path.c_str(), O_RDONLY | O_CLOEXEC);
  std::array<char, 65536> piece;
  for (ssize_t count = 0; (count = read(file, piece.data(), piece.size())) > 0;)
    bytes.append(piece.data(), static_cast<size_t>(count));
  close(file);
  return bytes;
}

void writeAll(const std::string& path, const std::string& bytes, mode_t mode) {
  const int file = open(path.c_str(), O_WRONLY | O_CREAT | O_TRUNC | O_CLOEXEC, 0600);
  const bool isWhole =
      write(file, bytes.data(), bytes.size()) == static_cast<ssize_t>(bytes.size());
  if (!isWhole || fchmod(file, mode) != 0) std::abort();
  close(file);
}

Entry takeOne(const std::string& path, const struct stat& status) {
  Entry entry;
  entry.mode = status.st_mode & 07777;
  if (S_ISDIR(status.st_mode)) {
    entry.kind = EntryKind::Folder;
    return entry;
  }
  entry.links = status.st_nlink;
  if (S_ISLNK(status.st_mode)) {
    entry.kind = EntryKind::Link;
    entry.bytes = fs::read_symlink(path).string();
    return entry;
  }
  entry.bytes = readAll(path);
  return entry;
}

} // namespace

void setDate(const std::string& path, int64_t seconds) {
  const timespec time = {.tv_sec = seconds, .tv_nsec = 0};
  const timespec times[] = {time, time};
  utimensat(AT_FDCWD, path.c_str(), times, AT_SYMLINK_NOFOLLOW);
}

Folder::Folder() : m_Name(makeFolder()) {}

Folder::~Folder() {
  fs::remove_all(m_Name);
}

void Folder::putOne(const std::string& name, const Entry& entry) const {
  const std::string path = m_Name + "/" + name;
  if (entry.kind == EntryKind::Folder) {
    fs::create_directory(path);
  } else if (entry.kind == EntryKind::Link) {
    fs::create_symlink(entry.bytes, path);
  } else if (!entry.sameAs.empty()) {
    fs::create_hard_link(m_Name + "/" + entry.sameAs, path);
  } else {
    writeAll(path, entry.bytes, entry.mode);
  }
  setDate(path, DayOfAllFiles);
}

void Folder::put(const Entries& entries) const {
  for (const auto& entry : fs::directory_iterator(m_Name))
    fs::remove_all(entry.path());
  for (const auto& [name, entry] : entries)
    putOne(name, entry);
}

Entries Folder::take() const {
  Entries entries;
  std::map<ino_t, std::string> firstNames;
  for (const auto& found : fs::directory_iterator(m_Name))
    entries[found.path().filename().string()];
  for (auto& [name, entry] : entries) {
    const std::string path = m_Name + "/" + name;
    struct stat status;
    if (lstat(path.c_str(), &status) != 0) continue;
    entry = takeOne(path, status);
    if (entry.kind != EntryKind::File) continue;
    const auto [first, isFirst] = firstNames.try_emplace(status.st_ino, name);
    if (!isFirst) entry.sameAs = first->second;
  }
  return entries;
}

} // namespace disturbed
