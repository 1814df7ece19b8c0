// SPDX-License-Identifier: Apache-2.0
//
// One entry of the archive symbol table, as read from the file.
#pragma once

#include "checking/interface/checking.h"
#include "elfext/interface/attribute_string.h"

#include <string_view>

namespace arlib {

class Archive;
class ArchiveMember;

/// Lives in the archive's object region and dies with it. The names are views of the symbol table's
/// bytes, which live as long.
class Symbol {
public:
  /// `attributeText` is what stands behind the attribute marker; null data if there is no marker.
  Symbol(std::string_view name, std::string_view attributeText, const Archive* archive,
         ArchiveMember* definingMember)
      : m_Name(name), m_AttributeText(attributeText), m_Archive(archive),
        m_DefiningMember(definingMember) {
    QUARN_ASSERT(1, archive != NULL && definingMember != NULL);
  }

  /// Without the attribute suffix. May be empty.
  [[nodiscard]] std::string_view getName() const { return m_Name; }

  /// Whether the entry stands for a build of a module that is not the base one.
  [[nodiscard]] bool hasBuildAttributes() const { return m_AttributeText.data() != nullptr; }

  /// The text of the attributes, as it stands in the table.
  [[nodiscard]] std::string_view getAttributeText() const { return m_AttributeText; }
  /// What it says; for an entry without a text, what the empty one says.
  [[nodiscard]] elfext::FullAttr getBuildAttributes() const {
    return elfext::parseAttributeString(m_AttributeText);
  }

  [[nodiscard]] const Archive* getArchive() const { return m_Archive; }
  [[nodiscard]] ArchiveMember* getDefiningMember() const { return m_DefiningMember; }

private:
  std::string_view m_Name;
  std::string_view m_AttributeText;
  const Archive* m_Archive;
  ArchiveMember* m_DefiningMember;
};

} // namespace arlib
