// SPDX-License-Identifier: Apache-2.0
//
// Names in JSON. There a text is UTF-8, and in archives and objects a name is any bytes: one that
// is no UTF-8 comes twice, as a text to be read, in which the sign U+FFFD stands for what is none,
// and as all of its bytes in hexadecimal, by which it can be told from any other.
#pragma once

#include <nlohmann/json_fwd.hpp>

#include <string>
#include <string_view>

namespace quarn_json {

// Fields stay in the order in which they were put.
using Json = nlohmann::ordered_json;

// As the standard has it: no longer form than needed, no surrogates, nothing above U+10FFFF.
[[nodiscard]] bool isUtf8(std::string_view bytes);

// Puts the field, and where it is needed the field "<field>Bytes" behind it.
void putName(Json& object, const std::string& field, std::string_view bytes);

// The value as one line, without the line's end.
[[nodiscard]] std::string lineOf(const Json& value);

} // namespace quarn_json
