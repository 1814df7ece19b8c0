// SPDX-License-Identifier: Apache-2.0
//
// A second, independent walk over the format of build_attributes_parsers.h: it shows each step in
// words and so tells of a corrupted part where a read only gives up. Lengths are compared with what
// is left before anything is stepped over; what lies within a part is read by a reader of that part
// alone.
//
// Its table keeps runs, and for each owner their numbers, so it grows with the section and not with
// owners times attributes.
#include "elfext/interface/attribute_trace.h"

#include "elfext/interface/build_attributes_names.h"
#include "elfext/src/bytes/checked_reader.h"

#include <utility>

namespace elfext {

namespace {

constexpr uint8_t Signature = 'A';
constexpr uint32_t LengthSize = 4;
// A length, and the end of the vendor's name.
constexpr uint32_t SmallestSubsection = LengthSize + 1;

// ---- Names

std::string unnamedTag(uint32_t tag) {
  return "<tag:" + std::to_string(tag) + ">";
}

std::string qobixName(uint32_t tag) {
  switch (tag) {
  case 0:
    return unnamedTag(tag);
  case Tag_File:
    return "File";
  case Tag_Section:
    return "Section";
  case Tag_Symbol:
    return "Symbol";
  default:
    if (tag > LastIrregularTag) return unnamedTag(tag);
    return getQobixTagName(tag).substr(std::string_view("Tag_").size());
  }
}

// Not the names that these tags have elsewhere.
std::string zevName(uint32_t tag) {
  switch (tag) {
  case 4:
    return "PCS_interworking";
  case 5:
    return "unaligned";
  case 6:
    return "uses_exceptions";
  default:
    return unnamedTag(tag);
  }
}

// ---- The table in words

void showAttribute(std::string& trace, std::string_view vendor, const TracedAttribute& attribute) {
  trace += "      ";
  trace += vendor == ZevVendor ? zevName(attribute.tag) : qobixName(attribute.tag);
  if (attribute.number) trace += " " + std::to_string(*attribute.number);
  if (attribute.text) trace.append(" \"").append(*attribute.text).append("\"");
  trace += '\n';
}

// Runs are shown, and not the set of each owner: a thousand owners may share a long run, as a
// thousand runs may share a vendor of a long name.
void showTable(std::string& trace, const AttributeTable& table) {
  const char* shownVendor = nullptr;
  for (const TracedRun& run : table.runs) {
    // By address: vendors are views of the section, so runs of one subsection have the same one.
    if (shownVendor != run.vendor.data())
      trace.append("  Vendor \"").append(run.vendor).append("\":\n");
    shownVendor = run.vendor.data();
    trace += "    " + qobixName(run.scope);
    for (const uint32_t owner : run.owners)
      trace += " " + std::to_string(owner);
    trace += " (" + std::to_string(run.bytes.size()) + " bytes):\n";
    for (const TracedAttribute& attribute : run.attributes)
      showAttribute(trace, run.vendor, attribute);
  }
}

// ---- One attribute

TracedAttribute readQobixAttribute(CheckedReader& reader) {
  using Classifier = BuildAttributesTagClassifier;
  TracedAttribute attribute = {.tag = reader.readUleb(), .number = {}, .text = {}};
  const auto tag = static_cast<int32_t>(attribute.tag);
  const bool isBoth = Classifier::isQobixNumericAndStringTag(tag);
  if (isBoth || Classifier::isQobixNumericTag(tag)) attribute.number = reader.readUleb();
  if (isBoth || Classifier::isQobixStringTag(tag)) attribute.text = reader.readText();
  return attribute;
}

TracedAttribute readZevAttribute(CheckedReader& reader) {
  using Classifier = BuildAttributesTagClassifier;
  TracedAttribute attribute = {.tag = reader.readUleb(), .number = {}, .text = {}};
  if (Classifier::isZevNumericTag(attribute.tag)) attribute.number = reader.readUleb();
  if (Classifier::isZevStringTag(attribute.tag)) attribute.text = reader.readText();
  return attribute;
}

// ---- The walk

class SectionTracer {
public:
  SectionTracer(AttributeTable& table, std::string& trace) : m_Table(table), m_Trace(trace) {}

  // Whether all was well formed.
  bool run(std::span<const uint8_t> section, bool isLittleEndian) {
    say("\nDecoding attribute buffer, ", section.size(), " bytes...\n");
    say("Build attributes before decode:\n");
    showTable(m_Trace, m_Table);
    if (section.empty() || section.front() != Signature)
      return corrupt("  Signature 'A' not present\n");
    const size_t consumed = makePasses(CheckedReader(section.subspan(1), isLittleEndian)) + 1;
    if (consumed != section.size())
      say("ABI: attributes section not all consumed: ", consumed, " != ", section.size(), "\n");
    say("Decoded build attributes:\n");
    showTable(m_Trace, m_Table);
    return m_IsWellFormed;
  }

private:
  static std::string_view textOf(std::string_view text) { return text; }
  static std::string textOf(size_t number) { return std::to_string(number); }
  template <class... Pieces>
  void say(const Pieces&... pieces) {
    (m_Trace.append(textOf(pieces)), ...);
  }

  // Always false.
  bool corrupt(std::string_view text) {
    say(text);
    m_IsWellFormed = false;
    return false;
  }

  // How many bytes behind the signature each of the passes reads.
  size_t makePasses(const CheckedReader& section) {
    size_t consumed = 0;
    do {
      m_HasLaterScope = false;
      ++m_Pass;
      say("Build attributes decode pass ", m_Pass, ":\n");
      CheckedReader rest = section;
      while (!rest.isAtEnd() && takeSubsection(rest)) {
      }
      consumed = section.getRemaining() - rest.getRemaining();
      // Kinds are numbered in the order in which they are read: file, section, symbol.
    } while (m_HasLaterScope && m_Pass < Tag_Symbol);
    return consumed;
  }

  // False where no further subsection can be found.
  bool takeSubsection(CheckedReader& section) {
    constexpr std::string_view BadLength = "    ** corrupt (bad length) **\n";
    if (section.getRemaining() < LengthSize) return corrupt(BadLength);
    const uint32_t length = CheckedReader(section).readWord();
    say("  Subsection length: ", length, " out of ", section.getRemaining(), "\n");
    if (length < SmallestSubsection || length > section.getRemaining()) return corrupt(BadLength);
    CheckedReader subsection = section.takePart(length);
    subsection.readWord();
    // The others may still be good.
    if (!subsection.isAtText())
      corrupt(BadLength);
    else
      walkSubsection(subsection);
    return true;
  }

  void walkSubsection(CheckedReader& subsection) {
    const std::string_view vendor = subsection.readText();
    say("  Vendor \"", vendor, "\" subsection:\n");
    while (!subsection.isAtEnd() && takeSubSubsection(subsection, vendor)) {
    }
  }

  // False where no further one can be found in the subsection.
  bool takeSubSubsection(CheckedReader& subsection, std::string_view vendor) {
    // A copy: the size counts from the kind on, and must be known before the part is taken.
    CheckedReader ahead = subsection;
    const uint32_t scope = ahead.readUleb();
    say("    ", qobixName(scope), " subsubsection");
    if (ahead.getRemaining() < LengthSize)
      return corrupt("\n      ** corrupt (missing length) **\n");
    const uint32_t size = ahead.readWord();
    say(" (size ", size, " out of ", subsection.getRemaining(), ")");
    const size_t headerSize = subsection.getRemaining() - ahead.getRemaining();
    if (size < headerSize || size > subsection.getRemaining())
      return corrupt("\n      ** corrupt (bad size) **\n");
    CheckedReader part = subsection.takePart(size);
    part.takePart(headerSize);
    if (scope == m_Pass) {
      say(":\n");
      decode(part, vendor, static_cast<AttributeScope>(scope));
    } else {
      skip(scope);
    }
    return true;
  }

  // Also a kind that there is not, which has been told by its line.
  void skip(uint32_t scope) {
    m_HasLaterScope = m_HasLaterScope || scope > m_Pass;
    m_IsWellFormed = m_IsWellFormed && isAttributeScope(scope);
    say(" (skipped)\n");
  }

  void decode(CheckedReader& part, std::string_view vendor, AttributeScope scope) {
    TracedRun run = {.vendor = vendor, .scope = scope, .owners = {}, .bytes = {}, .attributes = {}};
    if (scope != Tag_File) readOwners(part, run.owners);
    run.bytes = part.getRest();
    enter(run);
    if (vendor == QobixVendor) readAttributes(part, readQobixAttribute, run.attributes);
    if (vendor == ZevVendor) readAttributes(part, readZevAttribute, run.attributes);
    m_Table.runs.push_back(std::move(run));
  }

  static void readOwners(CheckedReader& part, std::vector<uint32_t>& owners) {
    while (const uint32_t owner = part.readUleb())
      owners.push_back(owner);
  }

  // Gives those for whom the next run holds its number.
  void enter(const TracedRun& run) {
    // The number that the run will have: it is appended when its attributes have been read.
    const size_t number = m_Table.runs.size();
    if (run.scope == Tag_File) m_Table.global.push_back(number);
    auto& sets = run.scope == Tag_Section ? m_Table.sections : m_Table.symbols;
    for (const uint32_t owner : run.owners) {
      say("      Reading for index ", owner, ":\n");
      sets[owner].push_back(number);
    }
  }

  template <class Read>
  void readAttributes(CheckedReader& part, Read readOne, std::vector<TracedAttribute>& attributes) {
    while (!part.isAtEnd()) {
      const TracedAttribute attribute = readOne(part);
      // Smaller numbers are kinds of parts; behind one, nothing can be told apart any more.
      if (attribute.tag < FirstAttributeTag) {
        m_IsWellFormed = false;
        return;
      }
      attributes.push_back(attribute);
    }
  }

  AttributeTable& m_Table;
  std::string& m_Trace;
  uint32_t m_Pass = 0;
  bool m_HasLaterScope = false; // the pass has skipped what a later one may read
  bool m_IsWellFormed = true;
};

} // namespace

bool traceAttributeSection(AttributeTable& table, std::span<const uint8_t> section,
                           bool isLittleEndian, std::string& trace) {
  return SectionTracer(table, trace).run(section, isLittleEndian);
}

} // namespace elfext
