// SPDX-License-Identifier: Apache-2.0
//
// What is done with one member whose contents are wanted: a file of its name, or its bytes on
// stdout.
#pragma once

#include "arlib/interface/contents_reader.h"
#include "quarn/member_selection.h"
#include "quarn/run.h"

#include <string>
#include <string_view>

namespace quarn {

// Each member goes to a file of its name in the current directory.
class Extraction final : public MemberRoutine {
public:
  explicit Extraction(const Run& run);

  void operator()(arlib::ArchiveMember& member) override;

private:
  [[nodiscard]] std::string outputName(std::string_view name) const;
  // All three are false after a report.
  [[nodiscard]] bool open(const arlib::ArchiveMember& member, const std::string& name,
                          support::FileHandle& file);
  [[nodiscard]] bool mayWrite(const arlib::ArchiveMember& member, const std::string& name) const;
  static bool failToOverwrite(const std::string& name);
  static bool failToWrite(const arlib::ArchiveMember& member, int error);
  bool copy(const arlib::ArchiveMember& member, support::FileHandle file, int& writeError);
  void restoreStatus(const arlib::ArchiveMember& member, support::FileHandle file);
  void write(const arlib::ArchiveMember& member, const std::string& name, support::FileHandle file);

  const Settings& m_Settings;
  support::SourceFiles& m_Files;
  support::Host& m_Host;
  const support::FileStatus& m_ArchiveStatus;
  arlib::ContentsReader m_Contents;
};

// Members' contents go to stdout unchanged.
class ContentsPrinter {
public:
  explicit ContentsPrinter(arlib::Archive& archive) : m_Contents(archive) {}

  void print(const arlib::ArchiveMember& member);
  // Reports what has changed meanwhile: too late to take anything back, but not to tell.
  void finish() { m_Contents.finish(); }

private:
  arlib::ContentsReader m_Contents;
};

} // namespace quarn
