// SPDX-License-Identifier: Apache-2.0
//
// The host that the process runs on, in a folder of its own, which is made and looked at by other
// means than the host's. A death test may begin its process anew: it finds the folder of the first
// one by a variable of the environment.

#pragma once

#include "support/interface/host.h"
#include "tests/support/test_host.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <random>
#include <string>
#include <vector>

namespace support {

class HostTest : public testing::Test {
protected:
  HostTest() {
    if (const char* folder = std::getenv(FolderVariable); folder != nullptr) {
      m_Folder = pathFrom(folder);
      m_IsBegunAnew = true;
      return;
    }
    do {
      m_Folder = std::filesystem::temp_directory_path() /
                 ("quarn-host." + std::to_string(std::random_device()()));
    } while (!std::filesystem::create_directory(m_Folder));
    testsupport::setEnvironment(FolderVariable, textFrom(m_Folder).c_str());
  }
  ~HostTest() override {
    if (m_IsBegunAnew) return;
    testsupport::setEnvironment(FolderVariable, nullptr);
    std::error_code ignored;
    std::filesystem::remove_all(m_Folder, ignored);
  }

  // Names are UTF-8, whatever the code page of the machine.
  static std::filesystem::path pathFrom(const std::string& name) {
    return {std::u8string(name.begin(), name.end())};
  }
  static std::string textFrom(const std::filesystem::path& path) {
    const std::u8string text = path.u8string();
    return {text.begin(), text.end()};
  }

  std::filesystem::path pathOf(const std::string& leaf) const { return m_Folder / pathFrom(leaf); }
  std::string at(const std::string& leaf) const { return textFrom(pathOf(leaf)); }
  std::string getFolder() const { return textFrom(m_Folder); }

  void make(const std::string& leaf, const std::string& text) const {
    std::ofstream(pathOf(leaf), std::ios::binary) << text;
  }

  std::string read(const std::string& leaf) const {
    std::ifstream stream(pathOf(leaf), std::ios::binary);
    return {std::istreambuf_iterator<char>(stream), {}};
  }

  std::vector<std::string> leaves() const {
    std::vector<std::string> names;
    for (const auto& entry : std::filesystem::directory_iterator(m_Folder))
      names.push_back(textFrom(entry.path().filename()));
    std::sort(names.begin(), names.end());
    return names;
  }

  FileKind kind(const std::string& leaf) {
    FileStatus status;
    const HostError error = m_Host.status(at(leaf).c_str(), status);
    EXPECT_EQ(error == 0, status.kind != FileKind::Nothing);
    return status.kind;
  }

  // A temporary that stands at its name from the beginning.
  HostError createNamed(const std::string& name, FileHandle& file) {
    constexpr uint32_t Mode = 0600;
    TemporaryFile temporary;
    HostError error = m_Host.createTemporary(name.c_str(), Mode, temporary);
    if (error == 0) error = m_Host.giveName(temporary, name.c_str());
    file = temporary.handle;
    return error;
  }

  // What can be read from there on, at most 4 bytes.
  std::string readAt(FileHandle file, uint64_t offset) {
    std::array<uint8_t, 4> bytes;
    size_t done = 99;
    EXPECT_EQ(m_Host.readAt(file, bytes, offset, done), 0);
    return {bytes.begin(), bytes.begin() + std::min(done, bytes.size())};
  }

  static constexpr const char* FolderVariable = "QUARN_HOST_TEST_FOLDER";

  std::filesystem::path m_Folder;
  bool m_IsBegunAnew = false;
  Host& m_Host = getNativeHost();
};

} // namespace support
