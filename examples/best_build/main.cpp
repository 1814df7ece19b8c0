// SPDX-License-Identifier: Apache-2.0
//
// best_build library.a symbol attributes: which members define the symbol for a target that offers
// these attributes, as "$ZEV_ISAv3$IEEE1"? A library may hold several builds of one module; of
// those that need no more than there is, the one that uses most of it is the answer.
#include "alloclib/interface/session.h"
#include "arlib/interface/archive.h"
#include "arlib/interface/archive_file_reader.h"
#include "elfext/interface/attribute_string.h"
#include "support/interface/host.h"

#include <iostream>

int main(int count, char** words) {
  if (count != 4) {
    std::cerr << "usage: best_build library.a symbol attributes\n";
    return 2;
  }

  const alloclib::Session session; // lives longer than all archives
  arlib::Archive archive(support::getNativeHost());
  if (!arlib::readFile(words[1], archive)) {
    std::cerr << words[1] << " can't be read\n";
    return 1;
  }

  const elfext::FullAttr target = elfext::parseAttributeString(words[3]);
  arlib::SymbolList found;
  if (!archive.findBestSymbols(words[2], target, found)) {
    std::cerr << "no build of " << words[2] << " fits\n";
    return 1;
  }
  for (uint32_t i = 0; i < found.getSize(); ++i)
    std::cout << found[i]->getDefiningMember()->getName() << '\n';
  return 0;
}
