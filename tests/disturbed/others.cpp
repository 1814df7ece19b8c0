// SPDX-License-Identifier: Apache-2.0
//
// Everything that is changed gets a date of its own: between two looks at a file no clock may stand
// still.
#include "tests/disturbed/others.h"

#include "tests/disturbed/folder.h"

#include <filesystem>
#include <fstream>
#include <system_error>

namespace disturbed {

namespace fs = std::filesystem;

namespace {

constexpr int64_t DayOfChange = 1000000500;

void writeFile(const std::string& path, const std::string& bytes) {
  std::ofstream(path, std::ios::binary) << bytes;
}

// The middle, where an object has what it says, and a library a member.
void patchFile(const std::string& path) {
  std::fstream file(path, std::ios::binary | std::ios::in | std::ios::out);
  file.seekp(static_cast<std::streamoff>(fs::file_size(path) / 2));
  file << "patched";
}

void changeThere(const std::string& path, FaultKind kind, const std::string& replacement) {
  if (kind == FaultKind::Truncate) fs::resize_file(path, fs::file_size(path) / 2);
  if (kind == FaultKind::Grow) std::ofstream(path, std::ios::binary | std::ios::app) << "more";
  if (kind == FaultKind::Empty) fs::resize_file(path, 0);
  if (kind == FaultKind::Overwrite) writeFile(path, replacement);
  if (kind == FaultKind::Patch) patchFile(path);
  if (kind == FaultKind::Remove) fs::remove(path);
}

} // namespace

void changeFile(const std::string& folder, const Fault& fault, const std::string& replacement) {
  const std::string path = folder + "/" + fault.name;
  if (fault.kind == FaultKind::Replace) {
    // Made outside, so that nobody sees it come.
    const std::string aside = folder + "-replacement";
    writeFile(aside, replacement);
    std::error_code error; // where a folder is in the place, it stays
    fs::rename(aside, path, error);
    if (error) fs::remove(aside);
  } else if (fault.kind == FaultKind::MakeFolder) {
    fs::remove_all(path);
    fs::create_directory(path);
  } else if (fs::is_regular_file(path)) {
    changeThere(path, fault.kind, replacement);
  }
  if (fs::exists(path)) setDate(path, DayOfChange);
}

} // namespace disturbed
