// SPDX-License-Identifier: Apache-2.0
//
// What can have build attributes: the module as a whole, each section and each symbol. Those
// without attributes of their own have what holds around them.
//
// A section lies in its module, a symbol in its section, or in the module if it has none.
// Attributes and blocks are two forms of the same statement, of which the reader fills both and a
// writer makes the second from the first.
#pragma once

#include "elfext/interface/build_attributes_block.h"
#include "elfext/interface/fast_array.h"

#include <cstdint>
#include <span>
#include <string_view>

namespace elfext {

class BuildAttributes;
class ObjectModule;

class ObjectWithBuildAttributes {
public:
  [[nodiscard]] ObjectModule* getObjectModule() const { return m_ObjectModule; }

  /// Whether what holds around the object holds for it.
  [[nodiscard]] virtual bool inheritsBuildAttributes() const = 0;
  /// What holds around the object: fresh attributes for a module.
  virtual void getInheritedBuildAttributes(BuildAttributes& result) const = 0;
  /// What holds for the object: its own attributes, and where it has none, what holds around it.
  /// Attributes that say that nothing else holds stand alone.
  void getEffectiveBuildAttributes(BuildAttributes& result) const;

  /// The object's own; null if it has none.
  [[nodiscard]] const BuildAttributes* getOwnBuildAttributes() const { return m_BuildAttributes; }
  /// They must live as long as the module, as those of its cache do.
  void setOwnBuildAttributes(const BuildAttributes* attributes);

  /// The attributes as they stand in the file: at most one block a vendor, in the order in which
  /// they came. Each change makes the module's attribute section stale.
  [[nodiscard]] uint32_t getBlockCount() const;
  [[nodiscard]] const BuildAttributesBlock* getBlock(uint32_t index) const;
  /// Null if there is none of that vendor.
  [[nodiscard]] const BuildAttributesBlock* findBlock(std::string_view vendor) const;
  /// Takes the place of the vendor's block, if there is one. The bytes are copied.
  const BuildAttributesBlock* setBlock(std::string_view vendor, std::span<const uint8_t> data);
  /// The same with a block of the module's cache.
  void setBlock(const BuildAttributesBlock* block);
  /// False if there was nothing to remove.
  bool removeBlock(const BuildAttributesBlock* block);
  bool removeBlock(std::string_view vendor);

protected:
  explicit ObjectWithBuildAttributes(ObjectModule* objectModule) : m_ObjectModule(objectModule) {}
  /// Lives and dies with the module's region.
  ~ObjectWithBuildAttributes() = default;

  void forgetBuildAttributes();

  friend class ObjectModule;
  friend class Relocation;
  friend class Section;
  friend class Symbol;

  ObjectModule* m_ObjectModule;

private:
  [[nodiscard]] uint32_t findBlockIndex(std::string_view vendor) const;
  bool removeBlockAt(uint32_t index);

  /// In the module's container region; made for the first block.
  FastArray<const BuildAttributesBlock*>* m_Blocks = nullptr;
  const BuildAttributes* m_BuildAttributes = nullptr;
};

} // namespace elfext
