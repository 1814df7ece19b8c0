// SPDX-License-Identifier: Apache-2.0
//
// Any bytes taken for an attribute section in both byte orders, and for a run of attributes of
// either vendor. What is read is put into bytes again, and must be the same when that is read.
#include "elfext/interface/build_attributes_parsers.h"
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

std::string encodeZev(const BuildAttributes& attributes) {
  std::string bytes;
  attributes.encodeZev(bytes);
  return bytes;
}

void readQobix(AttributeBytes run) {
  const std::string encoded = encodeQobix(decodeQobix(run));
  const BuildAttributes known = decodeQobix(bytesOf(encoded));
  const std::string again = encodeQobix(known);
  const BuildAttributes same = decodeQobix(bytesOf(again));
  if (!(same == known) || same.getHash() != known.getHash() || encodeQobix(same) != again)
    std::abort();
  BuildAttributes fixed = known;
  fixed.fixUpAfterDecoding();
  [[maybe_unused]] const FullAttr& record = fixed.getFullAttr();
}

void readZev(AttributeBytes run) {
  BuildAttributes attributes;
  ZevBuildAttributesDecodingParser(attributes).parse(run);
  const std::string encoded = encodeZev(attributes);
  BuildAttributes same;
  if (!ZevBuildAttributesDecodingParser(same).parse(bytesOf(encoded))) std::abort();
  if (encodeZev(same) != encoded) std::abort();
  [[maybe_unused]] const FullAttr& record = attributes.getFullAttr();
}

class Reader final : public BuildAttributesSectionParser {
public:
  bool parseFileSubSubsection(std::string_view vendor, AttributeBytes run) override {
    return read(vendor, run);
  }
  bool parseSectionSubSubsection(std::string_view vendor, std::span<const uint32_t> indices,
                                 AttributeBytes run) override {
    return areGood(indices) && read(vendor, run);
  }
  bool parseSymbolSubSubsection(std::string_view vendor, std::span<const uint32_t> indices,
                                AttributeBytes run) override {
    return areGood(indices) && read(vendor, run);
  }

private:
  static bool areGood(std::span<const uint32_t> indices) {
    for (const uint32_t index : indices) {
      if (index == 0) std::abort();
    }
    return true;
  }
  static bool read(std::string_view vendor, AttributeBytes run) {
    if (vendor == QobixVendor)
      readQobix(run);
    else if (vendor == ZevVendor)
      readZev(run);
    return true;
  }
};

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size) {
  const fuzzing::MemoryBound bound(size);
  const AttributeBytes bytes(data, size);
  Reader reader;
  reader.parse(bytes, true);
  reader.parse(bytes, false);
  readQobix(bytes);
  readZev(bytes);
  return 0;
}
