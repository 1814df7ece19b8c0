// SPDX-License-Identifier: Apache-2.0
//
// A value that may not be there, in the room of a pointer: for what few of many objects have. A
// copy is a copy of the value. No value and an empty one are different states.
//
// Sets of build attributes have four lists that most of them never fill, and that cost a pointer
// each then.
#pragma once

#include <cstddef>
#include <memory>
#include <utility>

namespace elfext {

template <class T>
class OwnedValue {
public:
  OwnedValue() = default;
  OwnedValue(const OwnedValue& other)
      : m_Value(other ? std::make_unique<T>(*other) : std::unique_ptr<T>()) {}
  OwnedValue(OwnedValue&&) noexcept = default;
  OwnedValue& operator=(const OwnedValue& other) {
    *this = OwnedValue(other);
    return *this;
  }
  OwnedValue& operator=(OwnedValue&&) noexcept = default;
  ~OwnedValue() = default;

  explicit operator bool() const { return m_Value != nullptr; }
  T& operator*() { return *m_Value; }
  const T& operator*() const { return *m_Value; }
  T* operator->() { return m_Value.get(); }
  const T* operator->() const { return m_Value.get(); }

  /// The value, made now if there is none.
  T& make() {
    if (m_Value == nullptr) m_Value = std::make_unique<T>();
    return *m_Value;
  }

  friend bool operator==(const OwnedValue& left, std::nullptr_t) { return left.m_Value == nullptr; }
  friend bool operator==(const OwnedValue& left, const OwnedValue& right) {
    if (!left || !right) return !left && !right;
    return *left == *right;
  }

private:
  std::unique_ptr<T> m_Value;
};

} // namespace elfext
