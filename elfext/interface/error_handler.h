// SPDX-License-Identifier: Apache-2.0
//
// Where the reader and `ObjectModule::validate()` report what is wrong with a file.
//
// There is one operation for each kind of problem. Each composes its text and passes it to
// `report`, the only operation that a client must supply; a client that wants the numbers instead
// of the text overrides the operation itself. The answer is always the same question's: go on?
// True asks the reader to carry on with the repair that the operation's comment tells; false ends
// the read. A module without a handler is as good as one whose handler always answers false.
// Operations marked "final" end the read whatever the answer. Of these, the I/O reports, out of
// memory, and the refusals of the header's type, encoding and version, class and magic leave
// nothing to go on with: an answer of true to them is a fault of the client.
//
// The numbers in the texts are decimal; "#" stands before what is an index. The operations stand
// in the order of their slots in the virtual table.
#pragma once

#include <cstdint>
#include <string>

namespace elfext {

class ObjectModule;

/// A row of a symbol table. Rows count from 0, the null symbol.
struct SymbolPlace {
  uint32_t symbol = 0;
  uint32_t tableSection = 0;
  bool isDynamic = false;
};

class ErrorHandler {
public:
  virtual ~ErrorHandler() = default;

  /// `sectionIndex` is the section to blame, 0 where the file as a whole is.
  virtual bool report(const ObjectModule& module, uint32_t sectionIndex,
                      const std::string& text) = 0;

  /// The file can't be had. Final. An error number of 0 leaves out the system's text, a module
  /// without object name the name.
  virtual bool outOfMemory(const ObjectModule& module);
  virtual bool ioErrorReading(const ObjectModule& module, int errorNumber);
  /// Also for bytes that should be inside the file and are not, with error number -1.
  virtual bool ioErrorWriting(const ObjectModule& module, int errorNumber);

  /// An index that should name a section. `lastSection` is the section count minus one. Final, but
  /// for the relocation, group and SHT_SYMTAB_SHNDX sections: these are passed over from then on,
  /// and of a group only the member is.
  virtual bool emptySectionHeaderTable(const ObjectModule& module);
  virtual bool sectionNameTableOutOfRange(const ObjectModule& module, uint32_t index,
                                          uint32_t lastSection);
  virtual bool symbolTableLinkOutOfRange(const ObjectModule& module, uint32_t section,
                                         uint32_t link, uint32_t lastSection);
  virtual bool relocationLinkOutOfRange(const ObjectModule& module, uint32_t section, uint32_t link,
                                        uint32_t lastSection);
  virtual bool groupLinkOutOfRange(const ObjectModule& module, uint32_t section, uint32_t link,
                                   uint32_t lastSection);
  virtual bool groupMemberOutOfRange(const ObjectModule& module, uint32_t section, uint32_t member,
                                     uint32_t lastSection);
  virtual bool relocationTargetOutOfRange(const ObjectModule& module, uint32_t section,
                                          uint32_t target, uint32_t lastSection);
  virtual bool shndxLinkOutOfRange(const ObjectModule& module, uint32_t section, uint32_t link,
                                   uint32_t lastSection);
  virtual bool hashLinkOutOfRange(const ObjectModule& module, uint32_t section, uint32_t link,
                                  uint32_t lastSection);
  virtual bool preemptionMapLinkOutOfRange(const ObjectModule& module, uint32_t section,
                                           uint32_t link, uint32_t lastSection);
  virtual bool dynamicLinkOutOfRange(const ObjectModule& module, uint32_t section, uint32_t link,
                                     uint32_t lastSection);
  virtual bool sectionLinkOutOfRange(const ObjectModule& module, uint32_t section, uint32_t link,
                                     uint32_t lastSection);

  /// The section that is named has another type than it should. Final, but for the relocation,
  /// group and SHT_SYMTAB_SHNDX sections: these are passed over from then on.
  virtual bool sectionNameTableOfWrongType(const ObjectModule& module, uint32_t index,
                                           uint32_t type);
  virtual bool symbolTableLinkOfWrongType(const ObjectModule& module, uint32_t section,
                                          uint32_t link, uint32_t type);
  virtual bool relocationLinkOfWrongType(const ObjectModule& module, uint32_t section,
                                         uint32_t link, uint32_t type);
  virtual bool groupLinkOfWrongType(const ObjectModule& module, uint32_t section, uint32_t link,
                                    uint32_t type);
  virtual bool shndxLinkOfWrongType(const ObjectModule& module, uint32_t section, uint32_t link,
                                    uint32_t type);
  virtual bool hashLinkOfWrongType(const ObjectModule& module, uint32_t section, uint32_t link,
                                   uint32_t type);
  virtual bool preemptionMapLinkOfWrongType(const ObjectModule& module, uint32_t section,
                                            uint32_t link, uint32_t type);
  virtual bool dynamicLinkOfWrongType(const ObjectModule& module, uint32_t section, uint32_t link,
                                      uint32_t type);

  /// Section names. True: no further names are looked up; this section has none.
  virtual bool nameWithoutNameTable(const ObjectModule& module, uint32_t section);
  virtual bool sectionNameOutOfRange(const ObjectModule& module, uint32_t section, uint32_t offset,
                                     uint64_t tableSize);

  /// Counts of rows that do not go together. Final. Row counts include the null symbol's.
  virtual bool groupSignatureOutOfRange(const ObjectModule& module, uint32_t section,
                                        uint32_t symbol, uint32_t tableSection, uint64_t rowCount);
  virtual bool secondShndxSection(const ObjectModule& module, uint32_t firstSection,
                                  uint32_t section, uint32_t tableSection);
  virtual bool shndxCountDiffers(const ObjectModule& module, uint32_t section, uint64_t wordCount,
                                 uint32_t tableSection, uint64_t rowCount);

  /// Symbols. Final in a read; sectionSymbolNotHosted also comes from the validation.
  virtual bool symbolNameOutOfRange(const ObjectModule& module, SymbolPlace place, uint32_t offset,
                                    uint32_t stringSection, uint64_t stringSize);
  virtual bool symbolWithoutShndxSection(const ObjectModule& module, SymbolPlace place);
  virtual bool symbolSectionOutOfRange(const ObjectModule& module, SymbolPlace place,
                                       uint32_t section, uint32_t lastSection);
  /// The table goes unnamed when its section is 0.
  virtual bool sectionSymbolNotHosted(const ObjectModule& module, SymbolPlace place);
  virtual bool sectionSymbolSizeDiffers(const ObjectModule& module, uint32_t symbol,
                                        uint32_t section, uint64_t size, uint64_t sectionSize);
  virtual bool sectionSymbolTooLarge(const ObjectModule& module, uint32_t symbol, uint32_t section,
                                     uint64_t size, uint64_t sectionSize);

  /// Final. Relocations count from 0.
  virtual bool relocationSymbolOutOfRange(const ObjectModule& module, uint64_t relocation,
                                          uint32_t section, uint32_t symbol, uint32_t tableSection,
                                          uint64_t rowCount);
  /// True: the section stays in the first group.
  virtual bool sectionInTwoGroups(const ObjectModule& module, uint32_t section,
                                  uint32_t groupSection, uint32_t otherGroupSection);
  /// True: all attributes are dropped.
  virtual bool corruptBuildAttributes(const ObjectModule& module, uint32_t section);
  /// String tables. True: a zero byte is added, or the bytes at the bad ends are made zero.
  virtual bool emptyStringTable(const ObjectModule& module, uint32_t section);
  virtual bool stringTableNotZeroEnded(const ObjectModule& module, uint32_t section, bool badStart,
                                       bool badEnd);

  /// The ELF header's refusals. Final; the answer to the machine is the result of the read.
  virtual bool unrecognisedFileType(const ObjectModule& module, uint32_t type);
  virtual bool invalidDataEncoding(const ObjectModule& module, uint32_t encoding);
  virtual bool unsupportedVersion(const ObjectModule& module, uint32_t version);
  virtual bool unsupportedMachine(const ObjectModule& module, uint32_t machine);

  /// True: the expected size counts; the size is rounded down.
  virtual bool wrongEntrySize(const ObjectModule& module, uint32_t section, uint64_t entrySize,
                              uint64_t expected);
  virtual bool sizeNotMultiple(const ObjectModule& module, uint32_t section, uint64_t size,
                               uint64_t entrySize);

  /// The validation's own. A true answer goes on to the next check, after the repair told.
  virtual bool mixedJumpSlotAddends(const ObjectModule& module);
  /// True: the section is blanked.
  virtual bool nullSectionNotNull(const ObjectModule& module, uint32_t section);
  /// True: a null section is put in front of it.
  virtual bool firstSectionNotNull(const ObjectModule& module, uint32_t type);
  /// Left out for a file in which it was so from the start.
  virtual bool auxiliarySectionHostsSymbol(const ObjectModule& module, uint32_t section);
  virtual bool auxiliarySectionRelocated(const ObjectModule& module, uint32_t section);
  /// Told for each relocation at whose offset the section has an earlier one of its kind.
  virtual bool repeatedDynamicRelocation(const ObjectModule& module, uint64_t offset,
                                         uint32_t section);
  virtual bool repeatedStaticRelocation(const ObjectModule& module, uint64_t offset,
                                        uint32_t section);
  /// Of a file that is not laid out. The checks of places are left out for it.
  virtual bool unexpectedSegments(const ObjectModule& module);
  virtual bool loadableSectionOutsideSegments(const ObjectModule& module, uint32_t section);
  virtual bool otherSectionInLoadableSegment(const ObjectModule& module, uint32_t section,
                                             uint32_t segment);
  /// The two are neighbours in the order of their file offsets.
  virtual bool loadableSegmentsOutOfOrder(const ObjectModule& module, uint32_t segment,
                                          uint32_t laterSegment);
  /// In memory. The lower index comes first.
  virtual bool loadableSegmentsOverlap(const ObjectModule& module, uint32_t segment,
                                       uint32_t otherSegment);
  /// Final in a read.
  virtual bool sectionsOverlap(const ObjectModule& module, uint32_t section, uint32_t otherSection);
  virtual bool secondInterpreterSegment(const ObjectModule& module, uint32_t segment,
                                        uint32_t otherSegment);
  virtual bool secondHeaderTableSegment(const ObjectModule& module, uint32_t segment,
                                        uint32_t otherSegment);
  /// The first segments of both kinds, by their places in the program header table.
  virtual bool loadableBeforeInterpreter(const ObjectModule& module, uint32_t loadable,
                                         uint32_t segment);
  virtual bool loadableBeforeHeaderTable(const ObjectModule& module, uint32_t loadable,
                                         uint32_t segment);
  /// Both sizes in bytes: p_filesz, and what the rows of the program header table come to.
  virtual bool headerTableSegmentTooSmall(const ObjectModule& module, uint32_t segment,
                                          uint64_t size, uint64_t tableSize);
  /// p_vaddr, p_offset and p_align.
  virtual bool segmentNotCongruent(const ObjectModule& module, uint32_t segment, uint64_t address,
                                   uint64_t offset, uint64_t alignment);
  /// sh_addr and sh_addralign.
  virtual bool sectionMisaligned(const ObjectModule& module, uint32_t section, uint64_t address,
                                 uint64_t alignment);
  virtual bool noLoadableSegments(const ObjectModule& module);
  /// Bytes of the first loadable segment in front of its first section, and how many of them the
  /// headers that it holds take.
  virtual bool noRoomForHeaders(const ObjectModule& module, uint32_t segment, uint64_t unmapped,
                                uint64_t needed);
  /// The SHF_... bits that the section should have and has not.
  virtual bool indexTableFlagsMissing(const ObjectModule& module, uint32_t section,
                                      uint32_t missingFlags);
  virtual bool indexTableLinkUnsuitable(const ObjectModule& module, uint32_t section);
  /// True: the flag is taken away; the flag is set.
  virtual bool groupFlagWithoutGroup(const ObjectModule& module, uint32_t section);
  virtual bool memberWithoutGroupFlag(const ObjectModule& module, uint32_t section,
                                      uint32_t groupSection);
  /// A row of a relocation section, from 0, against a local symbol of a group that the target
  /// section is not in. Relocations in no section are told with section 0 and their place in the
  /// target's list.
  virtual bool relocationLeavesGroup(const ObjectModule& module, uint64_t relocation,
                                     uint32_t section, uint32_t symbolSection,
                                     uint32_t targetSection);
  /// Once for each row, and with row 0 for a section without rows.
  virtual bool relocationNotAllowed(const ObjectModule& module, uint64_t relocation,
                                    uint32_t section, uint32_t targetSection);
  virtual bool localSymbolUndefined(const ObjectModule& module, uint32_t symbol, bool isDynamic);

  /// Neither form of header. Final.
  virtual bool wrongMagic(const ObjectModule& module);
  virtual bool wrongClass(const ObjectModule& module);

  /// For whoever lays out a file anew.
  virtual bool segmentAlignmentConflict(const ObjectModule& module, uint32_t segment,
                                        uint32_t otherSegment);
  virtual bool sectionAlignmentConflict(const ObjectModule& module, uint32_t segment,
                                        uint32_t section);
  virtual bool programHeaderTableAlignmentConflict(const ObjectModule& module, uint32_t segment);
  virtual bool sectionHeaderTableAlignmentConflict(const ObjectModule& module, uint32_t segment);
  virtual bool elfHeaderAlignmentConflict(const ObjectModule& module, uint32_t segment);

  /// Debug overlay records, from 0. True: the record is passed over.
  virtual bool overlayOfOtherSection(const ObjectModule& module, uint64_t record, uint32_t section,
                                     uint32_t named);
  virtual bool overlayOfNoSection(const ObjectModule& module, uint64_t record, uint32_t section,
                                  uint32_t named);
  /// The note that maps sections to segments. True: the section gets no segment.
  virtual bool segmentMapCountDiffers(const ObjectModule& module, uint32_t section,
                                      uint64_t entryCount, uint32_t allocatedSections);
  virtual bool segmentMapOutOfRange(const ObjectModule& module, uint32_t noteSection,
                                    uint32_t section, uint32_t segment);
};

} // namespace elfext
