// SPDX-License-Identifier: Apache-2.0
//
// The program of a project that takes this one in: how many members has an archive?
#include "alloclib/interface/session.h"
#include "arlib/interface/archive.h"
#include "arlib/interface/archive_file_reader.h"
#include "support/interface/host.h"

#include <cstdio>

int main(int, char** arguments) {
  const alloclib::Session session;
  arlib::Archive archive(support::getNativeHost());
  if (!arlib::readFile(arguments[1], archive)) return 1;
  std::printf("%zu members\n", archive.getMembers().size());
  return 0;
}
