// SPDX-License-Identifier: Apache-2.0
//
// The table of contents and the symbol table, as lines on stdout.
#include "quarn/listing.h"

#include "arlib/interface/archive_format.h"
#include "checking/interface/checking.h"
#include "elfext/interface/attribute_string.h"
#include "elfext/interface/attribute_text_cache.h"
#include "quarn/actions.h"
#include "quarn/local_dates.h"
#include "quarn/member_selection.h"
#include "quarn/reporting.h"

#include <string>
#include <string_view>

namespace quarn {

using arlib::ArchiveMember;

std::string modeText(uint32_t mode) {
  std::string text = "rwxrwxrwx";
  for (size_t i = 0; i < text.size(); ++i) {
    if ((mode >> (text.size() - 1 - i) & 1) == 0) text[i] = '-';
  }
  return text;
}

namespace {

class Listing final : public MemberRoutine {
public:
  explicit Listing(bool isLong) : m_IsLong(isLong) {}

  void operator()(ArchiveMember& member) override {
    if (!m_IsLong) {
      messages::listingMessage(messages::ListedMember, member.getName());
      return;
    }
    messages::listingMessage(
        messages::ListedMemberLong, modeText(member.getMode()), member.getUid(), member.getGid(),
        member.getSize(), m_Dates.textOf(member.getDate()), member.getName(), member.getOffset());
  }

private:
  bool m_IsLong;
  LocalDates m_Dates;
};

// Attributes are shown in their own order and spelling, whatever those of the table.
std::string reprinted(std::string_view attributeText) {
  return elfext::printAttributeString(elfext::parseAttributeString(attributeText));
}

} // namespace

void listMembers(Run& run) {
  Listing listing(run.settings.verbose);
  forEachSelectedMember(run.archive, run.settings.fileList, listing);
}

void listSymbolTable(Run& run) {
  run.archive.updateAuxiliaryMembers();
  if (run.archive.getSymbolTable() == nullptr) {
    reportMessage(messages::RemarkWord, messages::NoSymbolTable, run.getArchiveName());
    return;
  }
  elfext::AttributeTextCache<std::string> attributes(reprinted);
  std::string shownName;
  run.archive.visitSymbols([&](const arlib::Symbol& symbol) {
    shownName = symbol.getName();
    if (symbol.hasBuildAttributes()) {
      shownName += arlib::AttributeMarker;
      shownName += attributes.get(symbol.getAttributeText());
    }
    const ArchiveMember* member = symbol.getDefiningMember();
    messages::listingMessage(messages::ListedSymbol, shownName, member->getName(),
                             member->getOffset());
  });
}

} // namespace quarn
