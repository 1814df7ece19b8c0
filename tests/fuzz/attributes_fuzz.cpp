// SPDX-License-Identifier: Apache-2.0
//
// Any bytes taken for an attribute section in both byte orders, for a run of attributes of either
// vendor, for the text of attributes, and for options of older compilers. What is read is put into
// bytes or text again, and must be the same when that is read.
#include "elfext/interface/attribute_relations.h"
#include "elfext/interface/attribute_string.h"
#include "elfext/interface/build_attributes.h"
#include "elfext/interface/build_attributes_parsers.h"
#include "tests/support/bytes.h"

#include <cstdlib>
#include <string>
#include <string_view>

namespace {

using namespace elfext;

using testsupport::bytesOf;

BuildAttributes decodeQobix(AttributeBytes run) {
  BuildAttributes attributes;
  QobixBuildAttributesDecodingParser(attributes).parse(run);
  return attributes;
}

std::string encodeQobix(const BuildAttributes& attributes) {
  std::string bytes;
  attributes.encodeQobix(bytes);
  return bytes;
}

std::string encodeZev(const BuildAttributes& attributes) {
  std::string bytes;
  attributes.encodeZev(bytes);
  return bytes;
}

// The first reading drops what has no good form.
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
  const AttributeBytes bytes(data, size);
  const std::string_view text(reinterpret_cast<const char*>(data), size);
  Reader reader;
  reader.parse(bytes, true);
  reader.parse(bytes, false);
  readQobix(bytes);
  readZev(bytes);
  readText(text);
  readOptions(text);
  return 0;
}
