// SPDX-License-Identifier: Apache-2.0
//
// Build attributes as text: tokens, each behind a "$", such as "$ZEV_ISAv4$A:L22$IEEE1$IW". It says
// all that the packed form can say, apart from a few features that have no token. A text never
// fails: one that doesn't begin with "$" is taken for the empty one, and unknown tokens say
// nothing.
#pragma once

#include "alloclib/interface/region_objects.h"
#include "elfext/interface/full_attr.h"

#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>

namespace elfext {

/// What the names of decoration symbols begin with; the text of the attributes follows.
constexpr std::string_view DecorationPrefix = "BuildAttributes$";
/// What stands between a symbol's name and the text of its attributes.
constexpr std::string_view DecorationMarker = "$$BuildAttributes$";

/// The record of a text alone, its features completed; the text is not kept. Time goes with its
/// length.
[[nodiscard]] FullAttr parseAttributeString(std::string_view text);

/// ORs in what the text says, and completes the features.
void addAttributeString(FullAttr& record, std::string_view text);

/// What parseAttributeString reads; features that have no token are left out.
[[nodiscard]] std::string printAttributeString(const FullAttr& record);
/// Writes as much as fits into `size` bytes, with a final zero if there is room for any. A null
/// buffer is as good as none. The length of the whole text.
size_t printAttributeString(const FullAttr& record, char* buffer, size_t size);

/// The name of a decoration symbol, in the region.
[[nodiscard]] const char* buildDecorationName(alloclib::RegionGeneral& region,
                                              const FullAttr& record);

/// Options of older compilers that say how code was built: "-otime", "/nointerwork/ropi". An
/// unknown name ends the text.
void applyFlagString(uint64_t& flags, std::string_view options);

/// Their way to say which accesses are used: "rodata:+UL41-US41". What is no access ends the text.
void applyAccessString(AccessWords& access, std::string_view options);

/// What a target is taken to use. The name decides where the architecture's number, that of
/// Tag_CPU_arch, is 0; it may be empty.
[[nodiscard]] AccessWords defaultAccessWords(uint32_t architecture, std::string_view targetName);

} // namespace elfext
