// SPDX-License-Identifier: Apache-2.0
//
// list_members library.a: the size and name of each member.
#include "alloclib/interface/session.h"
#include "arlib/interface/archive.h"
#include "arlib/interface/archive_file_reader.h"
#include "support/interface/host.h"

#include <iomanip>
#include <iostream>

namespace {

// The library prints nothing: it hands over what is wrong in words, and asks whether to go on.
class Complaints final : public arlib::ErrorHandler {
public:
  bool report(const arlib::Archive& archive, arlib::Severity severity,
              std::string_view text) override {
    std::cerr << archive.getFileName() << ": " << text << '\n';
    return severity != arlib::Severity::Fatal;
  }
};

} // namespace

int main(int count, char** words) {
  if (count != 2) {
    std::cerr << "usage: list_members library.a\n";
    return 2;
  }

  const alloclib::Session session; // lives longer than all archives
  Complaints complaints;
  arlib::Archive archive(support::getNativeHost());
  archive.setErrorHandler(&complaints);
  if (!arlib::readFile(words[1], archive)) return 1;

  for (const arlib::ArchiveMember* member : archive.getMembers()) {
    if (member->isAuxiliary()) continue; // the tables of symbols and of long names
    std::cout << std::setw(8) << member->getSize() << "  " << member->getName() << '\n';
  }
  return 0;
}
