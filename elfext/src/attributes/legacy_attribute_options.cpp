// SPDX-License-Identifier: Apache-2.0
//
// The options of older compilers, in which tags still say how flags and accesses change.
//
// An option string is clauses of "-" or "/", perhaps "no", and a name; an access string is scopes
// joined by "+", ":" and names with signs. Both end at the first thing that they don't know, and
// change nothing from there on. The strings in use are constants of this room, so no file can
// choose them.
#include "elfext/interface/attribute_string.h"

#include "elfext/src/attributes/attribute_tokens.h"
#include "elfext/src/attributes/attribute_words.h"
#include "support/interface/letters.h"

#include <iterator>

namespace elfext {

namespace {

struct FlagOption {
  std::string_view name;
  uint64_t set;
  uint64_t clear;
};

// clang-format off
// A name that begins another one stands behind it.
constexpr FlagOption FlagOptions[] = {
    {"interwork",    Flag_Interwork,                             Flag_NoInterwork},
    {"inter",        Flag_Interwork,                             Flag_NoInterwork},
    {"ropi",         Flag_Ropi,                                  0},
    {"pic",          Flag_Ropi,                                  0},
    {"rwpiclient",   0,                                          Flag_Rwpi | Flag_UsesV6},
    {"rwpi",         Flag_Rwpi,                                  Flag_UsesV6},
    {"pid",          Flag_Rwpi,                                  Flag_UsesV6},
    {"usev6",        Flag_UsesV6,                                0},
    {"hardfp",       Flag_HardFp,                                Flag_SoftFp},
    {"softfp",       Flag_SoftFp,                                Flag_HardFp},
    {"swstna",       0,                                          0},
    {"swstackcheck", 0,                                          0},
    {"krell2lib",    Flag_Krell2Library,                         0},
    {"swst",         0,                                          0},
    {"usev7",        0,                                          0},
    {"ospace",       Flag_OptimizeSpace,                         Flag_OptimizeTime},
    {"otime",        Flag_OptimizeTime,                          Flag_OptimizeSpace},
    {"ieee_full",    Flag_IeeeFull,                              0},
    {"ieee_part",    Flag_IeeePart,                              0},
    {"ieee_java",    Flag_IeeeJava,                              0},
    {"8byte",        Flag_Align8,                                Flag_Align4},
    {"fpic",         Flag_Indirect | Flag_FpicCode | Flag_Ropi,  0},
    {"indirect",     Flag_Indirect,                              0},
    {"standardlib",  Flag_StandardLibrary,                       0},
    {"microlib",     Flag_MicroLibrary,                          0},
    {"threadedcxx",  Flag_ThreadedCxx,                           0},
};

struct ScopeName {
  std::string_view name;
  bool code;
  bool readOnlyData;
  bool data;
};

constexpr ScopeName ScopeNames[] = {
    {"code",   true,  false, false},
    {"text",   true,  false, false},
    {"rodata", false, true,  true},
    {"ro",     true,  true,  true},
    {"rw",     false, false, true},
    {"data",   false, false, true},
    {"all",    true,  true,  true},
};
// clang-format on

bool startsWith(std::string_view text, std::string_view beginning) {
  return support::equalIgnoringCase(text.substr(0, beginning.size()), beginning);
}

// Steps over the beginning, if it is there.
bool take(std::string_view& text, std::string_view beginning) {
  if (!startsWith(text, beginning)) return false;
  text.remove_prefix(beginning.size());
  return true;
}

// Steps over the first row's name that the text begins with; null if there is none.
template <class Rows>
auto takeName(std::string_view& text, const Rows& rows) -> decltype(&rows[0]) {
  for (const auto& row : rows) {
    if (take(text, row.name)) return &row;
  }
  return nullptr;
}

void negate(uint64_t& flags, const FlagOption& option) {
  flags &= ~option.set;
  uint64_t gained = option.clear;
  if ((flags & Flag_Rwpi) != 0) gained &= ~uint64_t{Flag_UsesV6};
  flags |= gained;
  // Without the alignment to 8 nothing is known, not even that to 4.
  if ((option.set & Flag_Align8) != 0) flags &= ~uint64_t{Flag_Align4};
}

// The scope in front of the items; without one, all words.
ScopeName takeScope(std::string_view& text) {
  ScopeName scope = {};
  const ScopeName* row = takeName(text, ScopeNames);
  if (row == nullptr) return {{}, true, true, true};
  while (row != nullptr) {
    scope.code = scope.code || row->code;
    scope.readOnlyData = scope.readOnlyData || row->readOnlyData;
    scope.data = scope.data || row->data;
    std::string_view rest = text;
    row = take(rest, "+") ? takeName(rest, ScopeNames) : nullptr;
    if (row != nullptr) text = rest;
  }
  take(text, ":");
  return scope;
}

void putBits(uint16_t& word, uint16_t bits, bool areAdded) {
  word = static_cast<uint16_t>(areAdded ? word | bits : word & ~bits);
}

// "/" and a number, which says nothing any more.
void skipWeight(std::string_view& text) {
  if (!take(text, "/")) return;
  while (!text.empty() && text.front() >= '0' && text.front() <= '9')
    text.remove_prefix(1);
}

// The number of the name that the text begins with, or that of all names.
uint32_t takeAccessName(std::string_view& text) {
  const uint32_t name = findAccessName(text);
  if (name != std::size(AccessNames)) text.remove_prefix(AccessNames[name].size());
  return name;
}

} // namespace

void applyFlagString(uint64_t& flags, std::string_view options) {
  while (take(options, "-") || take(options, "/")) {
    const bool isNegated = take(options, "no");
    const FlagOption* option = takeName(options, FlagOptions);
    if (option == nullptr) return;
    if (isNegated)
      negate(flags, *option);
    else
      flags = (flags & ~option->clear) | option->set;
  }
}

void applyAccessString(AccessWords& access, std::string_view options) {
  const ScopeName scope = takeScope(options);
  while (!options.empty()) {
    const bool isAdded = !take(options, "-");
    if (isAdded) take(options, "+");
    const uint32_t name = takeAccessName(options);
    if (name == std::size(AccessNames)) return;
    // Stores have the bits of the loads of the same kind.
    const auto bit = static_cast<uint16_t>(1u << name % LoadNameCount);
    // Scopes are of loads: there is one word for all stores.
    if (name >= LoadNameCount) {
      putBits(access.stores, bit, isAdded);
    } else {
      if (scope.code) putBits(access.code, bit, isAdded);
      if (scope.readOnlyData) putBits(access.readOnlyData, bit, isAdded);
      if (scope.data) putBits(access.data, bit, isAdded);
    }
    skipWeight(options);
  }
}

AccessWords defaultAccessWords(uint32_t architecture, std::string_view targetName) {
  // Values of Tag_CPU_arch: from here on hardware loads from any address.
  constexpr uint32_t FirstUnaligned = 6;
  constexpr uint32_t LastUnaligned = 17;
  if (architecture >= FirstUnaligned && architecture <= LastUnaligned)
    return AccessWords::all(AccessWord_Unaligned);
  if (architecture != 0) return AccessWords::all(AccessWord_Halves);
  if (targetName == "v6") return AccessWords::all(AccessWord_Unaligned);
  AccessWords access = AccessWords::all(AccessWord_Bytes);
  if (targetName == "Krell") access.code = AccessWord_Halves;
  return access;
}

} // namespace elfext
