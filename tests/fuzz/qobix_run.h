// SPDX-License-Identifier: Apache-2.0
//
// A run of attributes as a section holds it. The first reading drops what has no good form.
#pragma once

#include "elfext/interface/build_attributes.h"
#include "elfext/interface/build_attributes_parsers.h"

#include <string>

namespace fuzzing {

inline elfext::BuildAttributes decodeQobix(elfext::AttributeBytes run) {
  elfext::BuildAttributes attributes;
  elfext::QobixBuildAttributesDecodingParser(attributes).parse(run);
  return attributes;
}

inline std::string encodeQobix(const elfext::BuildAttributes& attributes) {
  std::string bytes;
  attributes.encodeQobix(bytes);
  return bytes;
}

} // namespace fuzzing
