// SPDX-License-Identifier: Apache-2.0
#include "bench/sample_objects.h"

#include "elfext/interface/elf_constants.h"
#include "tests/support/object_builder.h"

#include <fstream>

namespace bench {

namespace {

using namespace elfext;
using testsupport::ElfClass;
using testsupport::ElfData;

std::string objectBytes(const ObjectShape& shape, uint32_t number) {
  const uint32_t module = number / shape.builds;
  const uint32_t spread = shape.mostSections - shape.fewestSections + 1;
  const uint32_t sections = shape.fewestSections + module * 7 % spread;
  const uint32_t symbolTable = sections + 1;
  testsupport::ObjectBuilder object(ElfClass::Class32, ElfData::Little);
  const std::string prefix = "function_" + std::to_string(module) + "_";
  for (uint32_t i = 0; i < sections; ++i) {
    object.section(".text." + prefix + std::to_string(i), SHT_PROGBITS)
        .flags(SHF_ALLOC | SHF_EXECINSTR)
        .alignment(4)
        .zeros(shape.bytesPerSection);
  }
  constexpr const char* Attributes[] = {"$ZEV_ISAv4$IEEE1", "$ZEV_ISAv5$IEEE1",
                                        "$ZEV_ISAv4$IEEE1$IW"};
  auto& symbols = object.section(".symtab", SHT_SYMTAB).link(symbolTable + 1).info(2);
  symbols.symbol({.name = "BuildAttributes$" + std::string(Attributes[number % shape.builds]),
                  .section = SHN_ABS,
                  .binding = STB_LOCAL});
  for (uint32_t i = 0; i < sections; ++i) {
    symbols.symbol({.name = prefix + std::to_string(i),
                    .section = static_cast<uint16_t>(i + 1),
                    .size = shape.bytesPerSection,
                    .type = STT_FUNC});
  }
  object.section(".strtab", SHT_STRTAB);
  if (shape.relocations != 0) {
    auto& rows = object.section(".rel.text", SHT_REL).link(symbolTable).info(1);
    for (uint32_t i = 0; i < shape.relocations; ++i)
      rows.relocation({.offset = i * 4 % shape.bytesPerSection, .symbol = 2, .type = 2});
  }
  return object.bytes();
}

} // namespace

std::vector<std::string> makeObjects(const SampleFolder& folder, const ObjectShape& shape) {
  std::vector<std::string> names;
  for (uint32_t number = 0; number < shape.count; ++number) {
    names.push_back(folder.path(shape.name + "_" + std::to_string(number) + ".o"));
    std::ofstream(names.back(), std::ios::binary) << objectBytes(shape, number);
  }
  return names;
}

} // namespace bench
