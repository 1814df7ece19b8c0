// SPDX-License-Identifier: Apache-2.0
//
// The list of catalogues, the look-up of a text, and the choice of a language. The look-up is a
// binary search: first in the external catalogue, if a client has set one, then in the built-in one
// of the language. The name of a language comes from the command line; one that is not known
// changes nothing, not even half of it.

#include "messages/interface/catalogue.h"

#include "messages/src/catalogues.h"
#include "messages/src/output_page.h"

#include <algorithm>
#include <charconv>
#include <cstdio>
#include <optional>

namespace messages {

namespace {

struct NamedCatalogue {
  std::string_view name;
  const BuiltInCatalogue& (*catalogue)();
};

constexpr NamedCatalogue Catalogues[CatalogueCount] = {
    {"en_US", getEnglishCatalogue},
    {"ja_JP", getJapaneseCatalogue},
};

struct NamedCodePage {
  std::string_view name;
  uint32_t number;
};

// All others go by their numbers alone.
constexpr NamedCodePage CodePages[] = {
    {"UTF-8", 65001}, {"utf-8", 65001}, {"UTF8", 65001}, {"utf8", 65001}, {"gb2312", 20936},
};

uint32_t catalogueIndex = EnglishCatalogue;
std::span<const CatalogueRow> externalCatalogue;
size_t lastIndex = 0; // of the built-in row that was said last

// Null if the rows don't have the key.
const CatalogueRow* findRow(std::span<const CatalogueRow> rows, Key key) {
  const auto row = std::lower_bound(
      rows.begin(), rows.end(), key,
      [](const CatalogueRow& candidate, Key wanted) { return candidate.key < wanted; });
  return row != rows.end() && row->key == key ? &*row : nullptr;
}

MessageFormat formatAt(const BuiltInCatalogue& catalogue, size_t index) {
  const size_t start = index == 0 ? 0 : catalogue.ends[index - 1];
  return {catalogue.rows[index].text,
          catalogue.pieces.subspan(start, catalogue.ends[index] - start)};
}

std::string_view notFoundText(Key key) {
  // In a buffer of the process: a look-up needs no memory, as "Out of memory" is looked up too.
  static char text[64];
  const KeyText keyText(key);
  const int length = std::snprintf(text, sizeof text, "<NotFound Code=%.*s key=0x%.8x>",
                                   static_cast<int>(keyText.getText().size()),
                                   keyText.getText().data(), static_cast<unsigned>(valueOf(key)));
  return {text, static_cast<size_t>(length)};
}

template <class Row>
const Row* findByName(std::span<const Row> rows, std::string_view name) {
  const auto row =
      std::find_if(rows.begin(), rows.end(), [name](const Row& r) { return r.name == name; });
  return row != rows.end() ? &*row : nullptr;
}

// Nothing if the text is neither a name nor a number.
std::optional<uint32_t> codePageNumber(std::string_view text) {
  if (const auto* const page = findByName(std::span<const NamedCodePage>(CodePages), text))
    return page->number;
  uint32_t number = 0;
  const char* const end = text.data() + text.size();
  const auto [stop, error] = std::from_chars(text.data(), end, number);
  if (error != std::errc() || stop != end) return std::nullopt;
  return number;
}

} // namespace

std::span<const CatalogueRow> getCatalogueRows(uint32_t index) {
  return Catalogues[index].catalogue().rows;
}

// A listing says the same thing thousands of times.
// So the row of the last look-up is tried first.
MessageFormat getMessageFormat(Key key) {
  if (const CatalogueRow* row = findRow(externalCatalogue, key)) return {row->text, {}};
  const BuiltInCatalogue& catalogue = Catalogues[catalogueIndex].catalogue();
  if (catalogue.rows[lastIndex].key != key) {
    const CatalogueRow* row = findRow(catalogue.rows, key);
    if (row == nullptr) return {notFoundText(key), {}};
    lastIndex = static_cast<size_t>(row - catalogue.rows.data());
  }
  return formatAt(catalogue, lastIndex);
}

std::string_view getMessageText(Key key) {
  return getMessageFormat(key).text;
}

void setExternalCatalogue(std::span<const CatalogueRow> rows) {
  externalCatalogue = rows;
}

bool setLocale(std::string_view name) {
  const size_t dot = name.find('.');
  const bool hasDot = dot != std::string_view::npos;
  const NamedCatalogue* catalogue =
      findByName(std::span<const NamedCatalogue>(Catalogues), name.substr(0, dot));
  const std::optional<uint32_t> codePage = codePageNumber(hasDot ? name.substr(dot + 1) : name);
  const bool isKnown = hasDot ? catalogue && codePage : catalogue || codePage;
  // The page first, as it may turn out that the host lacks it.
  if (!isKnown || (codePage && !setOutputPage(*codePage))) return false;
  if (catalogue) catalogueIndex = static_cast<uint32_t>(catalogue - Catalogues);
  return true;
}

void resetLocale() {
  catalogueIndex = EnglishCatalogue;
  resetOutputPage();
}

uint32_t getCurrentCatalogue() {
  return catalogueIndex;
}

uint32_t getOutputCodePage() {
  return getOutputPage();
}

} // namespace messages
