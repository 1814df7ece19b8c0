// SPDX-License-Identifier: Apache-2.0
//
// What an object file says of itself, for who wants no more than its symbols' names, the sizes of
// its parts or its build attributes: found in its tables, where they lie, and no model is made. The
// checks, and so the reports, are those of readElfFile. A program that uses it has an
// alloclib::Session for as long as it does.
//
// This is the road that the tool takes, once for each member. Whatever a hostile object tries is
// stopped in `read`, by the checks of the tables; what the outline answers afterwards has been
// checked.
#pragma once

#include "elfext/interface/full_attr.h"
#include "elfext/interface/sizes_statistics.h"
#include "elfext/interface/symbol.h"
#include "support/interface/source_file.h"

#include <cstdint>
#include <memory>
#include <optional>
#include <span>
#include <string_view>
#include <vector>

namespace elfext {

class ErrorHandler;
struct ImageMemory;

/// One outline serves any number of objects, one after the other; that is quicker than a new one
/// for each.
class ObjectOutline {
public:
  struct OutlinedSection {
    const char* name; ///< null for none
    uint32_t type;
    uint64_t flags;
  };
  struct OutlinedSymbol {
    const char* name; ///< null for none
    Symbol::Category category;
    uint32_t binding;
    const char* sectionName; ///< of a hosted symbol; null for none
  };

  /// Whose objects are read.
  enum class Machines : uint8_t {
    Own, ///< all others are refused
    Any, ///< of others the symbols are read, as far as the ELF standard defines them, and of GCC's
         ///< objects for link-time optimisation alone, of whatever machine, what their records
         ///< define; what is no ELF file at all is an object about which nothing is known, and no
         ///< error
  };

  ObjectOutline();
  ~ObjectOutline();
  ObjectOutline(const ObjectOutline&) = delete;
  ObjectOutline& operator=(const ObjectOutline&) = delete;

  /// For the reads to come.
  void setMachines(Machines machines) { m_Machines = machines; }

  /// Takes `size` bytes at `offset` of a file in the place of what was there. False after a report
  /// to the handler, which may be null; the outline is then empty, as it is when the handler lets a
  /// foreign machine pass. The handler must live as long as somebody asks for sizes. The object's
  /// name, if there is one, goes with reports; it must be there until the next read. Attributes
  /// must be wanted beforehand.
  [[nodiscard]] bool read(std::shared_ptr<support::SourceFile> file, uint64_t offset, uint64_t size,
                          ErrorHandler* errorHandler, std::optional<std::string_view> objectName,
                          bool wantsAttributes = false);

  /// Whether nothing is known of what was read last, or nothing was read.
  [[nodiscard]] bool isEmpty() const { return m_Content == nullptr; }
  /// Texts live until the next read.
  [[nodiscard]] std::vector<OutlinedSection> getSections() const;
  /// The static ones, in their order, without the null symbol; good until the next read.
  [[nodiscard]] std::span<const OutlinedSymbol> getSymbols();
  /// Whether the object is of a machine that is none of ours. It has symbols, and no more; where
  /// they stand is not told.
  [[nodiscard]] bool isForeign() const;
  /// e_entry; 0 of an empty outline.
  [[nodiscard]] uint64_t getEntry() const;
  /// The attributes of the object as a whole; null if it has none, or if they were not wanted.
  [[nodiscard]] const FullAttr* getOwnAttributes() const;
  /// Nothing, after a report, if bytes that have to be looked at can't be had.
  [[nodiscard]] std::optional<SizesStatistics> computeSizes();

private:
  struct Content;

  void takeLtoSymbols();
  bool readForeign(std::unique_ptr<Content> content);
  bool readOwn(std::unique_ptr<Content> content, bool wantsAttributes);

  Machines m_Machines = Machines::Own;
  /// What serves one object after the other: objects of an archive are neighbours, and much alike.
  std::shared_ptr<support::SourceFile> m_File; ///< that was read last
  std::unique_ptr<ImageMemory> m_Memory;
  std::vector<OutlinedSymbol> m_Symbols;

  std::unique_ptr<Content> m_Content;
};

} // namespace elfext
