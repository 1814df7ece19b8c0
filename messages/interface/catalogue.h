// SPDX-License-Identifier: Apache-2.0
//
// The texts of all messages, by key, in the chosen language. A new language is one more file with a
// table and one more row in the list of catalogues. Looking up never fails: a key without a text
// gives a text that says so, since a report that is itself missing must not hide what it was about.

#pragma once

#include "messages/interface/message_key.h"

#include <cstdint>
#include <span>
#include <string_view>

namespace messages {

/// One message in one language. Rows are constants, or belong to who installs them.
struct CatalogueRow {
  Key key;
  std::string_view text; ///< UTF-8; a printf format if the message has arguments
};

inline constexpr uint32_t EnglishCatalogue = 0;
inline constexpr uint32_t JapaneseCatalogue = 1;
inline constexpr uint32_t CatalogueCount = 2;

/// The rows of a built-in catalogue, ascending by key; index is below CatalogueCount.
[[nodiscard]] std::span<const CatalogueRow> getCatalogueRows(uint32_t index);

/// The text of a key: from the external catalogue if there is one that has it, else from the chosen
/// built-in one. An unknown key gives "<NotFound Code=... key=...>", good until the next such call;
/// every other text lives as long as its catalogue.
[[nodiscard]] std::string_view getMessageText(Key key);

/// A catalogue that is looked at before the built-in one; its rows must ascend by key and belong to
/// the caller. An empty span takes it away.
void setExternalCatalogue(std::span<const CatalogueRow> rows);

/// Chooses the built-in catalogue and the output code page by a name such as "ja_JP", "UTF-8",
/// "ja_JP.932" or "1252": a page goes by its number, if the host has it. False if the name is not
/// valid; then nothing has changed.
[[nodiscard]] bool setLocale(std::string_view name);

/// For initialise: English, in UTF-8.
void resetLocale();

/// EnglishCatalogue or JapaneseCatalogue.
[[nodiscard]] uint32_t getCurrentCatalogue();

/// The code page of the output by its number: 65001 is UTF-8, the default.
[[nodiscard]] uint32_t getOutputCodePage();

} // namespace messages
