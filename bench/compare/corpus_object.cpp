// SPDX-License-Identifier: Apache-2.0
//
// One object of a corpus, laid out as compilers do: code, data, notes, debug information, the
// symbol table with the local symbols in front, the string tables, and last, whatever their
// indices, the relocations.
//
// The numbers that shape an object come from one stream for all builds of its module, those that
// fill its bytes from another for each build: builds of a module define the same symbols at the
// same places, and differ in their code. The object builder of the tests puts it together, so what
// a good object is stands in one place.

#include "bench/compare/corpus.h"
#include "bench/compare/numbers.h"

#include "elfext/interface/elf_constants.h"
#include "tests/support/attribute_bytes.h"
#include "tests/support/object_builder.h"

#include <algorithm>
#include <array>
#include <vector>

namespace bench {

namespace {

using namespace elfext;
using namespace testsupport;

// Names share beginnings and words, as those of real libraries do: sorting and comparing them then
// costs what it does there.
constexpr std::array<const char*, 16> Words = {
    "buffer", "clock", "device", "entry",  "filter", "graph", "handle", "index",
    "lexer",  "merge", "node",   "option", "parser", "queue", "record", "stream"};

// How many inline functions there are in headers, for objects to share. No object has as many.
constexpr uint32_t HeaderFunctions = 8192;

// A larger function of class 32 has a pool of literals behind its code.
constexpr uint32_t LargestWithoutPool = 48;

// What the builds of a module need of their target: the first is the base of the others.
constexpr std::array<const char*, 3> BuildTexts = {"$ZEV_ISAv4$IEEE1", "$ZEV_ISAv5$IEEE1",
                                                   "$ZEV_ISAv4$IEEE1$IW"};

// How debug information is shared out among its sections.
struct DebugSection {
  const char* name;
  uint32_t flags;
  uint32_t percentOfBytes;
  uint32_t percentOfRelocations;
};
// Both columns add up to 100. Debug information is mostly entries that refer to others, and each
// reference to a section or to code is a relocation.
constexpr DebugSection DebugSections[] = {
    {".debug_abbrev", 0, 1, 0}, {".debug_info", 0, 49, 60},
    {".debug_loc", 0, 15, 25},  {".debug_ranges", 0, 5, 10},
    {".debug_line", 0, 10, 5},  {".debug_str", SHF_MERGE | SHF_STRINGS, 20, 0},
};

// Of 2^32. However many objects there are, their places are evenly apart: each comes a golden
// section of the circle behind the one before.
uint32_t spread(uint32_t number) {
  return number * 2654435769U;
}

// A few objects are far larger than most: the place raised to the eighth power.
uint32_t functionCount(const Corpus& corpus, uint32_t module) {
  uint64_t place = spread(module);
  // Three squares are the eighth power; the upper half of each product keeps it a part of 2^32.
  for (int i = 0; i < 3; ++i)
    place = place * place >> 32;
  return corpus.fewestFunctions +
         static_cast<uint32_t>((corpus.mostFunctions - corpus.fewestFunctions) * place >> 32);
}

// From three quarters of the average to five.
uint32_t aroundAverage(uint32_t average, uint32_t number) {
  return average / 4 * 3 + static_cast<uint32_t>(uint64_t{average} / 2 * spread(number) >> 32);
}

// Different for each module and function, so that no two objects define one name but builds of a
// module and inline functions.
std::string functionName(uint32_t module, uint32_t function) {
  const std::string verb = Words[(module * 7 + function) % Words.size()];
  const std::string noun = Words[(module + function / 5) % Words.size()];
  return verb + "_" + noun + std::to_string(module) + "_" + std::to_string(function);
}

// A nested name as C++ compilers write it.
std::string nestedName(uint32_t module, uint32_t function) {
  const auto part = [](const std::string& text) { return std::to_string(text.size()) + text; };
  const std::string scope = Words[module % Words.size()];
  const std::string type =
      "Basic_" + std::string(Words[function % Words.size()]) + std::to_string(module);
  const std::string operation = Words[function / 16 % Words.size()] + std::to_string(function);
  return "_ZN" + part(scope) + part(type) + "IjE" + part(operation) + "ERKNS_6OptionE";
}

class ObjectMaker {
public:
  ObjectMaker(const Corpus& corpus, uint64_t seed, uint32_t number)
      : m_Corpus(corpus), m_Module(number / corpus.builds), m_Build(number % corpus.builds),
        m_FunctionCount(functionCount(corpus, m_Module)), m_Shape(seed, m_Module * 2ULL),
        m_Contents(seed, number * 2ULL + 1),
        m_Object(corpus.isWide ? ElfClass::Class64 : ElfClass::Class32, ElfData::Little) {
    m_Object.separateTexts().relocationsLast().machine(corpus.isWide ? EM_ZEV64 : EM_ZEV);
  }

  std::string make();

private:
  // A section of code that is being filled, and what goes in the relocation section behind it.
  struct Code {
    uint32_t section = 0;
    std::string name;
    uint32_t group = 0;    // the flag, if it is in one
    bool isMarked = false; // as code, at the end of its bytes
    std::string bytes;
    std::vector<RelocationSpec> relocations;
  };

  // A section that names a symbol or the symbol table, which come later.
  struct OpenGroup {
    SectionBuilder* section;
    size_t signature; // among the global symbols
  };

  SectionBuilder& addSection(const std::string& name, uint32_t type, uint64_t flags,
                             uint64_t alignment);
  void addAllCode();
  void addSeparateFunction(uint32_t function);
  void addGroup();
  Code startCode(const std::string& name, uint32_t groupFlag);
  void appendFunction(Code& code, const std::string& name, uint8_t binding);
  void finishCode(const Code& code);
  void addRelocations(const std::string& name, uint32_t target, uint32_t groupFlag,
                      const std::vector<RelocationSpec>& rows);
  void addData();
  void addAttributes();
  void addDebug();
  void addDebugSection(const DebugSection& row, uint32_t bytes, uint32_t relocations);
  void addUndefined();
  void addSymbolTable();

  uint32_t addLocal(SymbolSpec symbol) {
    symbol.binding = STB_LOCAL;
    m_Locals.push_back(std::move(symbol));
    return static_cast<uint32_t>(m_Locals.size()); // symbol 0 is the null symbol
  }
  uint32_t addSectionSymbol(uint32_t section) {
    return addLocal({.section = static_cast<uint16_t>(section), .type = STT_SECTION});
  }
  // The machines' numbers of a relocation by the whole address.
  [[nodiscard]] uint32_t getAbsoluteType() const { return m_Corpus.isWide ? 257 : 2; }

  const Corpus& m_Corpus;
  uint32_t m_Module;
  uint32_t m_Build;
  uint32_t m_FunctionCount;
  Numbers m_Shape;    // the same for all builds
  Numbers m_Contents; // another one for each
  testsupport::ObjectBuilder m_Object;
  uint32_t m_LastSection = 0;
  uint32_t m_TextSymbol = 0; // that of the first section of code
  std::vector<SymbolSpec> m_Locals;
  std::vector<SymbolSpec> m_Globals;
  std::vector<SectionBuilder*> m_NeedingSymbolTable;
  // A group's signature is a global symbol, whose index is known when all local ones are.
  std::vector<OpenGroup> m_Groups;
};

std::string ObjectMaker::make() {
  addLocal({.name = functionName(m_Module, 0) + ".c", .section = SHN_ABS, .type = STT_FILE});
  addAllCode();
  addData();
  addAttributes();
  addDebug();
  addUndefined();
  addSymbolTable();
  return m_Object.bytes();
}

SectionBuilder& ObjectMaker::addSection(const std::string& name, uint32_t type, uint64_t flags,
                                        uint64_t alignment) {
  ++m_LastSection;
  return m_Object.section(name, type).flags(flags).alignment(alignment);
}

void ObjectMaker::addAllCode() {
  Code text = startCode(".text", 0);
  m_TextSymbol = addSectionSymbol(text.section);
  const uint32_t inText = m_Corpus.hasInlineFunctions ? 0 : m_FunctionCount;
  for (uint32_t i = 0; i < inText; ++i)
    appendFunction(text, functionName(m_Module, i), STB_GLOBAL);
  finishCode(text);
  for (uint32_t i = inText; i < m_FunctionCount; ++i)
    addSeparateFunction(i);
}

// Two of three come from headers, and stand in groups of which a linker keeps one.
void ObjectMaker::addSeparateFunction(uint32_t function) {
  const bool isFromHeader = function % 3 != 0;
  // 577 is prime to the number of functions: modules begin at different places and still share.
  const uint32_t number = (m_Module * 577 + function) % HeaderFunctions;
  const std::string name =
      isFromHeader ? nestedName(number / 64, number) : nestedName(1000 + m_Module, function);
  if (isFromHeader) addGroup();
  Code code = startCode(".text." + name, isFromHeader ? SHF_GROUP : 0);
  appendFunction(code, name, isFromHeader ? STB_WEAK : STB_GLOBAL);
  finishCode(code);
}

// The function's code and its relocations are the next two sections; its symbol is the next one.
void ObjectMaker::addGroup() {
  SectionBuilder& group = addSection(".group", SHT_GROUP, 0, 4);
  group.word(GRP_COMDAT).word(m_LastSection + 1).word(m_LastSection + 2);
  // The symbol table is behind all others, so that its index is not known yet.
  m_NeedingSymbolTable.push_back(&group);
  m_Groups.push_back({&group, m_Globals.size()});
}

ObjectMaker::Code ObjectMaker::startCode(const std::string& name, uint32_t groupFlag) {
  return {m_LastSection + 1, name, groupFlag, false, {}, {}};
}

void ObjectMaker::appendFunction(Code& code, const std::string& name, uint8_t binding) {
  const auto section = static_cast<uint16_t>(code.section);
  const uint64_t start = code.bytes.size();
  const uint32_t size = 16 + m_Shape.below((m_Corpus.codeBytes - 16) / 2) * 4;
  if (!code.isMarked)
    addLocal({.name = m_Corpus.isWide ? "$x" : "$a", .section = section, .value = start});
  code.isMarked = m_Corpus.isWide || size <= LargestWithoutPool;
  if (!code.isMarked) addLocal({.name = "$d", .section = section, .value = start + size - 4});
  // Any local symbol will do as a target: what a relocation means is nobody's question here, only
  // that its symbol is one.
  for (uint64_t place = start; place < start + size; place += m_Corpus.codePerRelocation) {
    const uint32_t symbol = 1 + m_Shape.below(static_cast<uint32_t>(m_Locals.size()));
    code.relocations.push_back({.offset = place, .symbol = symbol, .type = getAbsoluteType()});
  }
  code.bytes += m_Contents.bytes(size);
  m_Globals.push_back({.name = name,
                       .section = section,
                       .value = start,
                       .size = size,
                       .type = STT_FUNC,
                       .binding = binding});
}

void ObjectMaker::finishCode(const Code& code) {
  addSection(code.name, SHT_PROGBITS, SHF_ALLOC | SHF_EXECINSTR | code.group, 4).bytes(code.bytes);
  if (!code.relocations.empty())
    addRelocations(code.name, code.section, code.group, code.relocations);
}

void ObjectMaker::addRelocations(const std::string& name, uint32_t target, uint32_t groupFlag,
                                 const std::vector<RelocationSpec>& rows) {
  SectionBuilder& section =
      addSection((m_Corpus.isWide ? ".rela" : ".rel") + name, m_Corpus.isWide ? SHT_RELA : SHT_REL,
                 SHF_INFO_LINK | groupFlag, m_Corpus.isWide ? 8 : 4);
  section.info(target);
  for (const RelocationSpec& row : rows)
    section.relocation(row);
  m_NeedingSymbolTable.push_back(&section);
}

void ObjectMaker::addData() {
  const uint32_t half = m_Corpus.dataBytes / 2;
  addSection(".rodata", SHT_PROGBITS, SHF_ALLOC, 4).bytes(m_Contents.bytes(half));
  addSection(".data", SHT_PROGBITS, SHF_ALLOC | SHF_WRITE, 4).bytes(m_Contents.bytes(half));
  for (uint32_t i = 0; i < 4; ++i) {
    m_Globals.push_back({.name = functionName(m_Module, i) + "_state",
                         .section = static_cast<uint16_t>(m_LastSection),
                         .value = half / 4 * i,
                         .size = half / 4,
                         .type = STT_OBJECT});
  }
  addSection(".bss", SHT_NOBITS, SHF_ALLOC | SHF_WRITE, 4).size(64 + m_Shape.below(64) * 4);
  addSection(".comment", SHT_PROGBITS, SHF_MERGE | SHF_STRINGS, 1).bytes("made by no compiler");
  // An empty section, as most objects have one.
  addSection(".note.GNU-stack", SHT_PROGBITS, 0, 1);
}

// Builds say by a symbol what they need of their target, other objects of class 32 by a section.
void ObjectMaker::addAttributes() {
  if (m_Corpus.builds > 1) {
    addLocal({.name = "BuildAttributes$" + std::string(BuildTexts[m_Build]), .section = SHN_ABS});
    return;
  }
  if (m_Corpus.isWide) return;
  const std::string file = tag(Tag_CPU_name, "zevcore1") + tag(Tag_CPU_arch, 2) +
                           tag(Tag_ZEV_ISA_use, 1) + tag(Tag_ABI_PCS_wchar_t, 4) +
                           tag(Tag_ABI_FP_denormal, 1) + tag(Tag_ABI_FP_exceptions, 1);
  addSection(".ZEV.attributes", SHT_ZEV_ATTRIBUTES, 0, 1)
      .bytes(attributeSection({vendorPart("qobix", {filePart(file)})}));
}

void ObjectMaker::addDebug() {
  if (m_Corpus.debugBytes == 0) return;
  const uint32_t bytes = aroundAverage(m_Corpus.debugBytes, m_Module);
  const uint32_t relocations = aroundAverage(m_Corpus.debugRelocations, m_Module);
  for (const DebugSection& row : DebugSections)
    addDebugSection(row, bytes / 100 * row.percentOfBytes,
                    relocations / 100 * row.percentOfRelocations);
}

void ObjectMaker::addDebugSection(const DebugSection& row, uint32_t bytes, uint32_t relocations) {
  addSection(row.name, SHT_PROGBITS, row.flags, 1).bytes(m_Contents.bytes(bytes));
  if (relocations == 0) return;
  const uint32_t section = m_LastSection;
  const uint32_t sectionSymbol = addSectionSymbol(section);
  const uint32_t distance = bytes / relocations;
  std::vector<RelocationSpec> rows;
  for (uint32_t i = 0; i < relocations; ++i)
    rows.push_back({.offset = uint64_t{i} * distance,
                    .symbol = i % 4 == 0 ? m_TextSymbol : sectionSymbol,
                    .type = getAbsoluteType()});
  addRelocations(row.name, section, 0, rows);
}

// Functions of other modules.
void ObjectMaker::addUndefined() {
  // Half as many as it defines: the reader passes these rows and publishes none of them.
  const uint32_t count = 4 + m_FunctionCount / 2;
  for (uint32_t i = 0; i < count; ++i)
    m_Globals.push_back({.name = functionName(m_Module + 1 + i, m_Shape.below(8))});
}

void ObjectMaker::addSymbolTable() {
  const auto locals = static_cast<uint32_t>(m_Locals.size());
  SectionBuilder& table = addSection(".symtab", SHT_SYMTAB, 0, m_Corpus.isWide ? 8 : 4);
  table.link(m_LastSection + 1).info(locals + 1);
  for (const SymbolSpec& symbol : m_Locals)
    table.symbol(symbol);
  for (const SymbolSpec& symbol : m_Globals)
    table.symbol(symbol);
  for (SectionBuilder* section : m_NeedingSymbolTable)
    section->link(m_LastSection);
  for (const OpenGroup& group : m_Groups)
    group.section->info(locals + 1 + static_cast<uint32_t>(group.signature));
  addSection(".strtab", SHT_STRTAB, 0, 1);
}

} // namespace

std::string objectBytes(const Corpus& corpus, uint64_t seed, uint32_t number) {
  return ObjectMaker(corpus, seed, number).make();
}

} // namespace bench
