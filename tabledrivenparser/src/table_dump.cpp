// SPDX-License-Identifier: Apache-2.0
//
// The dump of the tables: a line for each id, then a line for each of its rows. It is for whoever
// writes tables, so it must get past bad ones too: an unknown type and a null text have words of
// their own, and a definition may lack its list of rows.

#include "tabledrivenparser/interface/option_report.h"
#include "tabledrivenparser/interface/parser.h"
#include "tabledrivenparser/interface/text_sink.h"
#include "tabledrivenparser/src/value_text.h"

#include <cstdio>
#include <string_view>

namespace tabledrivenparser {

namespace {

std::string_view typeName(ValueType type) {
  // clang-format off
  switch (type) {
  case Type_Boolean:      return "BOOLEAN";
  case Type_Enum:         return "ENUM";
  case Type_Address:      return "ADDRESS";
  case Type_Address64:    return "ADDRESS64";
  case Type_Int:          return "INT";
  case Type_IntVector:    return "INT_VECTOR";
  case Type_Int64Vector:  return "INT64_VECTOR";
  case Type_String:       return "STRING";
  case Type_StringVector: return "STRING_VECTOR";
  case Type_CallBack:     return "CALL_BACK";
  case Type_ViaFile:      return "VIA_FILE";
  }
  // clang-format on
  return "[BAD TYPE!]";
}

bool isKnown(ValueType type) {
  return type <= Type_ViaFile;
}

// A value that is no vector, or one element of one.
void dumpElement(TextSink& sink, const ValueDefinition& definition, const Value& value) {
  const bool isText = definition.type == Type_String || isVector(definition.type);
  const bool isNumber = definition.type == Type_IntVector || definition.type == Type_Int64Vector;
  if (isText && !isNumber && value.text == nullptr) return sink.put("<null>");
  constexpr uint32_t EveryEntryIsUsable = 0xFFFFFFFF;
  sink.put(argumentText(definition, value, EveryEntryIsUsable));
}

void dumpValue(TextSink& sink, const ValueDefinition& definition, const Value& value) {
  if (!isKnown(definition.type)) return sink.put("<none>");
  if (definition.type == Type_CallBack) return sink.put("<call back>");
  if (!isVector(definition.type)) return dumpElement(sink, definition, value);
  bool isEmpty = true;
  sink.startList();
  forEachElement(definition.type, value, [&](const Value& element) {
    sink.startEntry();
    dumpElement(sink, definition, element);
    isEmpty = false;
  });
  if (isEmpty) sink.put("<none>");
}

// Where the value came from: its default.
void dumpOrigin(TextSink& sink, const ValueDefinition& definition) {
  switch (definition.defaultKind) {
  case Default_None:
    return sink.put("<none>");
  case Default_List:
    return sink.put("<list>");
  case Default_Computed:
    return sink.put("<call back>");
  case Default_Fixed:
    break;
  }
  dumpValue(sink, definition, definition.defaultValue);
}

void dumpId(const Parser& parser, TextSink& sink, uint32_t id) {
  const ValueDefinition& definition = parser.getDefinition(id);
  char number[16];
  std::snprintf(number, sizeof number, "%3u: ", id);
  sink.put(number);
  sink.put(typeName(definition.type));
  if (parser.isSet(id)) {
    sink.put(" set from:");
    dumpOrigin(sink, definition);
    sink.put(" to:");
  } else {
    sink.put(" unset:");
  }
  dumpValue(sink, definition, parser.getRecord(id).value);
  sink.put('\n');
}

void dumpFlags(TextSink& sink, const MatchString& row) {
  sink.startList();
  const auto dumpFlag = [&](RowFlag flag, std::string_view name) {
    if (!row.has(flag)) return;
    sink.startEntry();
    sink.put(name);
  };
  dumpFlag(Flag_OldSyntax, "oldSyntax");
  dumpFlag(Flag_Deprecated, "deprecated");
  dumpFlag(Flag_Public, "public");
  if (row.flags == 0) sink.put("no-flags");
}

void dumpParameter(TextSink& sink, const ValueDefinition& definition, const MatchString& row) {
  if (row.kind == Kind_Required) return sink.put(" parameter required");
  sink.put(" implied parameter:");
  if (definition.type == Type_CallBack) {
    sink.put("<call back>");
  } else if (isKnown(definition.type)) {
    dumpElement(sink, definition, row.value);
  } else {
    sink.put("<none>");
  }
  if (row.kind == Kind_Optional) sink.put(" (optional)");
}

void dumpRestrictions(TextSink& sink, const uint32_t* masks) {
  if (masks == nullptr) return;
  sink.put(" soft restriction: ");
  sink.startList();
  for (; *masks != 0; ++masks) {
    char text[16];
    std::snprintf(text, sizeof text, "0x%X", *masks);
    sink.startEntry();
    sink.put(text);
  }
}

void dumpRow(TextSink& sink, const ValueDefinition& definition, const MatchString& row) {
  sink.put('"');
  sink.put(row.name);
  sink.put("\" ");
  dumpFlags(sink, row);
  dumpParameter(sink, definition, row);
  dumpRestrictions(sink, row.restrictions);
  if (row.separator != 0) {
    sink.put(" separator='");
    sink.put(row.separator);
    sink.put('\'');
  }
  sink.put('\n');
}

} // namespace

size_t dumpTables(const Parser& parser, TextSink& sink) {
  for (uint32_t id = 0; id < parser.getValueCount(); ++id) {
    const ValueDefinition& definition = parser.getDefinition(id);
    dumpId(parser, sink, id);
    for (auto row = definition.rows; row != nullptr && *row != nullptr; ++row) {
      dumpRow(sink, definition, **row);
    }
  }
  sink.put('\0');
  return sink.getUsed();
}

} // namespace tabledrivenparser
