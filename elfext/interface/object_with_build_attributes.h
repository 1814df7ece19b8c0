// SPDX-License-Identifier: Apache-2.0
//
// What can have build attributes: the module as a whole, each section and each symbol. Those
// without attributes of their own have what holds around them.
#pragma once

namespace elfext {

class BuildAttributes;
class ObjectModule;

class ObjectWithBuildAttributes {
public:
  [[nodiscard]] ObjectModule* getObjectModule() const { return m_ObjectModule; }

  // Whether what holds around the object holds for it.
  [[nodiscard]] virtual bool inheritsBuildAttributes() const = 0;
  // What holds around the object; null if nothing is known.
  [[nodiscard]] virtual const BuildAttributes* getInheritedBuildAttributes() const = 0;

  // The object's own; null if it has none.
  [[nodiscard]] const BuildAttributes* getOwnBuildAttributes() const { return m_BuildAttributes; }
  // They must live as long as the module.
  void setOwnBuildAttributes(const BuildAttributes* attributes) { m_BuildAttributes = attributes; }

  // What holds for the object: its own attributes, else the inherited ones.
  [[nodiscard]] const BuildAttributes* getBuildAttributesInForce() const {
    return m_BuildAttributes != nullptr ? m_BuildAttributes : getInheritedBuildAttributes();
  }

protected:
  explicit ObjectWithBuildAttributes(ObjectModule* objectModule) : m_ObjectModule(objectModule) {}
  // Lives and dies with the module's region.
  ~ObjectWithBuildAttributes() = default;

  friend class ObjectModule;
  friend class Relocation;
  friend class Section;
  friend class Symbol;

  ObjectModule* m_ObjectModule;

private:
  const BuildAttributes* m_BuildAttributes = nullptr;
};

} // namespace elfext
