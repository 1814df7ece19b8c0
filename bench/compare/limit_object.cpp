// SPDX-License-Identifier: Apache-2.0
//
// From an object's bytes to its published names, or to its sizes, by the host's own ELF structures.
// Class is a template argument, as in the tool, so that the inner loops test nothing; the corpora
// are little-endian, as the machines that measure.
//
// An object that is in memory as a whole is viewed there. Of a larger one only the tables are read,
// each with one call, and its relocations pass by in pieces that stay in the cache.

#include "bench/compare/limit_object.h"

#include <algorithm>
#include <cstring>
#include <elf.h>
#include <optional>

namespace bench {

namespace {

// Objects of class 32 come without addends, and those of class 64 with them.
struct Class32 {
  using Header = Elf32_Ehdr;
  using Section = Elf32_Shdr;
  using Symbol = Elf32_Sym;
  using Relocation = Elf32_Rel;
  static constexpr uint32_t RelocationType = SHT_REL;
  static uint64_t symbolOf(const Relocation& row) { return ELF32_R_SYM(row.r_info); }
};

struct Class64 {
  using Header = Elf64_Ehdr;
  using Section = Elf64_Shdr;
  using Symbol = Elf64_Sym;
  using Relocation = Elf64_Rela;
  static constexpr uint32_t RelocationType = SHT_RELA;
  static uint64_t symbolOf(const Relocation& row) { return ELF64_R_SYM(row.r_info); }
};

// Relocations are read in pieces that stay in the nearest cache.
constexpr size_t RelocationWindow = 32 * 1024;

// Rows of a table, copied out one at a time, as they may stand at any address.
template <class Row>
class Rows {
public:
  explicit Rows(std::string_view bytes) : m_Bytes(bytes) {}

  [[nodiscard]] size_t count() const { return m_Bytes.size() / sizeof(Row); }
  [[nodiscard]] Row operator[](size_t index) const {
    Row row;
    std::memcpy(&row, m_Bytes.data() + index * sizeof(Row), sizeof(Row));
    return row;
  }

private:
  std::string_view m_Bytes;
};

std::string_view bytesOf(const ObjectPlace& object, uint64_t offset, uint64_t count,
                         std::string& buffer) {
  if (!object.whole.empty()) return object.whole.substr(offset, count);
  buffer.resize(count);
  object.file->read(buffer.data(), object.offset + offset, count);
  return buffer;
}

template <class Elf>
std::string_view contentsOf(const ObjectPlace& object, const typename Elf::Section& section,
                            std::string& buffer) {
  return bytesOf(object, section.sh_offset, section.sh_size, buffer);
}

template <class Elf>
Rows<typename Elf::Section> sectionsOf(const ObjectPlace& object, ObjectBuffers& buffers,
                                       std::string_view* names = nullptr) {
  const auto header = Rows<typename Elf::Header>(
      bytesOf(object, 0, sizeof(typename Elf::Header), buffers.header))[0];
  const Rows<typename Elf::Section> sections(bytesOf(
      object, header.e_shoff, uint64_t{header.e_shnum} * header.e_shentsize, buffers.sections));
  if (names != nullptr)
    *names = contentsOf<Elf>(object, sections[header.e_shstrndx], buffers.sectionNames);
  return sections;
}

template <class Elf>
struct SymbolTable {
  Rows<typename Elf::Symbol> rows;
  std::string_view names;
};

// Each object has one.
template <class Elf>
SymbolTable<Elf> symbolTableOf(const ObjectPlace& object, Rows<typename Elf::Section> sections,
                               ObjectBuffers& buffers) {
  // From the end, where compilers put it.
  size_t index = sections.count() - 1;
  while (sections[index].sh_type != SHT_SYMTAB)
    --index;
  return {Rows<typename Elf::Symbol>(contentsOf<Elf>(object, sections[index], buffers.symbols)),
          contentsOf<Elf>(object, sections[sections[index].sh_link], buffers.symbolNames)};
}

template <class Elf>
uint64_t largestSymbol(std::string_view bytes, uint64_t largest) {
  const Rows<typename Elf::Relocation> rows(bytes);
  for (size_t i = 0; i < rows.count(); ++i)
    largest = std::max(largest, Elf::symbolOf(rows[i]));
  return largest;
}

// Looks at each relocation: its symbol must be one.
template <class Elf>
void checkRelocations(const ObjectPlace& object, Rows<typename Elf::Section> sections,
                      size_t symbols) {
  // A piece is whole rows, so that none is cut in two.
  constexpr size_t RowSize = sizeof(typename Elf::Relocation);
  constexpr size_t PieceSize = RelocationWindow / RowSize * RowSize;
  std::optional<Window> window;
  if (object.whole.empty()) window.emplace(*object.file, RelocationWindow);
  const auto bytesAt = [&](uint64_t offset, size_t count) {
    return window ? window->at(object.offset + offset, count) : object.whole.substr(offset, count);
  };
  uint64_t largest = 0;
  for (size_t i = 1; i < sections.count(); ++i) {
    const auto section = sections[i];
    if (section.sh_type != Elf::RelocationType) continue;
    for (uint64_t done = 0; done < section.sh_size; done += PieceSize) {
      const size_t count = std::min<uint64_t>(PieceSize, section.sh_size - done);
      largest = largestSymbol<Elf>(bytesAt(section.sh_offset + done, count), largest);
    }
  }
  if (largest >= symbols) fail("a relocation without a symbol");
}

template <class Elf>
void publish(const ObjectPlace& object, ObjectBuffers& buffers, PublishedNames& names) {
  const auto sections = sectionsOf<Elf>(object, buffers);
  const auto table = symbolTableOf<Elf>(object, sections, buffers);
  checkRelocations<Elf>(object, sections, table.rows.count());
  uint32_t count = 0;
  for (size_t i = 1; i < table.rows.count(); ++i) {
    const auto row = table.rows[i];
    if (row.st_shndx == SHN_UNDEF || ELF32_ST_BIND(row.st_info) == STB_LOCAL) continue;
    const char* name = table.names.data() + row.st_name;
    names.texts.append(name, std::strlen(name) + 1);
    ++count;
  }
  names.counts.push_back(count);
}

// The tool's own rule for sections that are not loaded.
bool isDebug(std::string_view name) {
  return name.starts_with(".debug") || name.starts_with(".line") || name == "C$$fpmap";
}

// The total that an executable section's bytes go to behind a marker. Code and its literal pools
// are one.
uint64_t& destination(ObjectSizes& sizes, bool isData) {
  return isData ? sizes.readOnly : sizes.code;
}

// Shares out what the markers of code and data, in the symbol table, divide.
template <class Elf>
void addExecutable(const SymbolTable<Elf>& table, Rows<typename Elf::Section> sections,
                   ObjectBuffers& buffers, ObjectSizes& sizes) {
  // The markers of a section ascend, so one open stretch for each is enough.
  buffers.stretches.assign(sections.count(), {});
  for (size_t i = 1; i < table.rows.count(); ++i) {
    const auto row = table.rows[i];
    const char* name = table.names.data() + row.st_name;
    // Absolute symbols mark nothing.
    if (name[0] != '$' || row.st_shndx >= sections.count()) continue;
    ObjectBuffers::Stretch& stretch = buffers.stretches[row.st_shndx];
    destination(sizes, stretch.isData) += row.st_value - stretch.start;
    stretch = {row.st_value, std::strcmp(name, "$d.realdata") == 0};
  }
  for (size_t i = 1; i < sections.count(); ++i) {
    const auto section = sections[i];
    if ((section.sh_flags & SHF_ALLOC) == 0 || (section.sh_flags & SHF_EXECINSTR) == 0) continue;
    const ObjectBuffers::Stretch& stretch = buffers.stretches[i];
    destination(sizes, stretch.isData) += section.sh_size - stretch.start;
  }
}

template <class Elf>
ObjectSizes sizesOf(const ObjectPlace& object, ObjectBuffers& buffers) {
  std::string_view names;
  const auto sections = sectionsOf<Elf>(object, buffers, &names);
  ObjectSizes sizes;
  for (size_t i = 1; i < sections.count(); ++i) {
    const auto section = sections[i];
    if ((section.sh_flags & SHF_ALLOC) == 0) {
      if (isDebug(names.data() + section.sh_name)) sizes.debug += section.sh_size;
    } else if (section.sh_type == SHT_NOBITS) {
      sizes.zero += section.sh_size;
    } else if ((section.sh_flags & SHF_EXECINSTR) != 0) {
      continue;
    } else if ((section.sh_flags & SHF_WRITE) != 0) {
      sizes.readWrite += section.sh_size;
    } else {
      sizes.readOnly += section.sh_size;
    }
  }
  const auto table = symbolTableOf<Elf>(object, sections, buffers);
  checkRelocations<Elf>(object, sections, table.rows.count());
  addExecutable<Elf>(table, sections, buffers, sizes);
  return sizes;
}

bool isWide(const ObjectPlace& object, ObjectBuffers& buffers) {
  return bytesOf(object, 0, EI_NIDENT, buffers.header)[EI_CLASS] == ELFCLASS64;
}

} // namespace

void publishNames(const ObjectPlace& object, ObjectBuffers& buffers, PublishedNames& names) {
  isWide(object, buffers) ? publish<Class64>(object, buffers, names)
                          : publish<Class32>(object, buffers, names);
}

ObjectSizes computeSizes(const ObjectPlace& object, ObjectBuffers& buffers) {
  return isWide(object, buffers) ? sizesOf<Class64>(object, buffers)
                                 : sizesOf<Class32>(object, buffers);
}

} // namespace bench
