// SPDX-License-Identifier: Apache-2.0
//
// What attribute texts come to, computed once for each: the members and symbols of a library have
// thousands, of which few differ.
//
//   AttributeTextCache<FullAttr> records(parseAttributeString);
//   elfext::mergeFullAttr(attributes, attributes, records.get(text));
//
// A hostile library can't fill the memory with texts of its own: long ones are not kept, and when
// there are too many the cache starts again. It is for one thread.
#pragma once

#include <cstddef>
#include <functional>
#include <string>
#include <string_view>
#include <unordered_map>
#include <utility>

namespace elfext {

template <class Value>
class AttributeTextCache {
public:
  static constexpr size_t LongestText = 1024; ///< bytes; all words there are need fewer
  static constexpr size_t MostTexts = 1024;

  /// Has no effect but its value, which depends on the text alone.
  using Compute = Value (*)(std::string_view text);

  explicit AttributeTextCache(Compute compute) : m_Compute(compute) {}
  AttributeTextCache(const AttributeTextCache&) = delete;
  AttributeTextCache& operator=(const AttributeTextCache&) = delete;

  /// Good until the next call.
  [[nodiscard]] const Value& get(std::string_view text) {
    if (text.size() > LongestText) return m_Unkept = m_Compute(text);
    if (m_Last == nullptr || m_Last->first != text) m_Last = &find(text);
    return m_Last->second;
  }

private:
  struct Hash {
    using is_transparent = void;
    size_t operator()(std::string_view text) const { return std::hash<std::string_view>{}(text); }
  };

  using Values = std::unordered_map<std::string, Value, Hash, std::equal_to<>>;
  using Entry = typename Values::value_type;

  const Entry& find(std::string_view text) {
    const auto found = m_Values.find(text);
    if (found != m_Values.end()) return *found;
    Value value = m_Compute(text);
    if (m_Values.size() == MostTexts) {
      m_Last = nullptr;
      m_Values.clear();
    }
    return *m_Values.emplace(text, std::move(value)).first;
  }

  Compute m_Compute;
  Values m_Values;
  const Entry* m_Last = nullptr; ///< neighbours mostly have the same text
  Value m_Unkept;                ///< for a text that is too long
};

} // namespace elfext
