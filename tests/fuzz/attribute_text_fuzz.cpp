// SPDX-License-Identifier: Apache-2.0
//
// Any bytes taken for the text of attributes, and for options of older compilers. What is read is
// put into text again, and must be the same when that is read; the same holds where it went through
// the bytes of an attribute section meanwhile.
#include "elfext/interface/attribute_relations.h"
#include "elfext/interface/attribute_string.h"
#include "tests/fuzz/memory_bound.h"
#include "tests/fuzz/qobix_run.h"
#include "tests/support/bytes.h"

#include <cstdlib>
#include <string>
#include <string_view>

namespace {

using namespace elfext;

using fuzzing::decodeQobix;
using fuzzing::encodeQobix;
using testsupport::bytesOf;

std::string reprinted(std::string_view text) {
  return printAttributeString(parseAttributeString(text));
}

// Some accesses are widened when they are read back, once.
void readText(std::string_view text) {
  const std::string printed = reprinted(reprinted(text));
  if (reprinted(printed) != printed) std::abort();
  const FullAttr record = parseAttributeString(text);
  if (record.m_Features != closeFeatures(record.m_Features)) std::abort();
  FullAttr merged;
  mergeFullAttr(merged, record, parseAttributeString(printed));
  Clash clash;
  while (takeClash(merged, clash)) {
  }
  BuildAttributes attributes(text);
  attributes.updateFullAttr();
  const std::string encoded = encodeQobix(attributes);
  if (encodeQobix(decodeQobix(bytesOf(encoded))) != encoded) std::abort();
}

void readOptions(std::string_view text) {
  uint64_t flags = 0;
  applyFlagString(flags, text);
  AccessWords access;
  applyAccessString(access, text);
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size) {
  const fuzzing::MemoryBound bound(size);
  const std::string_view text(reinterpret_cast<const char*>(data), size);
  readText(text);
  readOptions(text);
  return 0;
}
