// SPDX-License-Identifier: Apache-2.0
//
// What a search of the archive fills for its caller.
#pragma once

#include "checking/interface/checking.h"
#include "elfext/interface/result_list.h"

namespace arlib {

class ArchiveMember;
class Symbol;

constexpr uint32_t InlineResults = 3;

class ArchiveMemberList : public elfext::ResultList<ArchiveMember, InlineResults> {
public:
  void set(uint32_t index, ArchiveMember* archiveMember) {
    QUARN_ASSERT(1, archiveMember != NULL);
    store(index, archiveMember);
  }
};

class SymbolList : public elfext::ResultList<Symbol, InlineResults> {
public:
  void set(uint32_t index, Symbol* symbol) {
    QUARN_ASSERT(1, symbol != NULL);
    store(index, symbol);
  }
};

} // namespace arlib
