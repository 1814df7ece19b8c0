// SPDX-License-Identifier: Apache-2.0
//
// The long-name table as headers refer to it. An index may lead into the middle of a name, and
// thousands of headers may lead into one: what ends a name, and where its last component begins, is
// known for each block of the table, and not looked for through the whole name once more for each
// header.
#pragma once

#include <cstddef>
#include <cstdint>
#include <optional>
#include <string_view>
#include <vector>

namespace arlib {

class LongNames {
public:
  LongNames() = default;
  // The text must outlive all that is taken of it.
  explicit LongNames(std::string_view table);

  [[nodiscard]] size_t getSize() const { return m_Table.size(); }

  // The name at an index, up to a NUL. Nothing behind the table, on the newline behind an entry, or
  // where no entry ends behind it.
  [[nodiscard]] std::optional<std::string_view> nameAt(size_t index);

  // The last component of a name that was taken of this table.
  [[nodiscard]] std::string_view leafOf(std::string_view name);

private:
  [[nodiscard]] size_t endBehind(size_t index);
  void findEnds();
  void findLeaves();

  std::string_view m_Table;
  size_t m_LastTerminator = std::string_view::npos;
  // By block, and made when the first name is met that is longer than one: where the first name
  // ends that ends in it or behind, and the place behind the last separator in front of it.
  std::vector<uint32_t> m_Ends;
  std::vector<uint32_t> m_Leaves;
};

} // namespace arlib
