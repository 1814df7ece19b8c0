// SPDX-License-Identifier: Apache-2.0
//
// Who is told what is wrong with an object that is being read. Reports carry a module, of which
// only the object's name is ever shown. Where no module is being made, one that has nothing but
// that name stands for it, and is made when there is something to tell.
#pragma once

#include <memory>
#include <optional>
#include <string_view>

namespace elfext {

class ErrorHandler;
class ObjectModule;

class ReadReporter {
public:
  // Tells the module's handler.
  explicit ReadReporter(const ObjectModule& module);
  // A null handler refuses to go on. The name, if there is one, must outlive this object.
  ReadReporter(ErrorHandler* handler, std::optional<std::string_view> objectName);
  ~ReadReporter();
  ReadReporter(const ReadReporter&) = delete;
  ReadReporter& operator=(const ReadReporter&) = delete;

  [[nodiscard]] ErrorHandler* getErrorHandler() const { return m_Handler; }
  [[nodiscard]] const ObjectModule& getModule() const;

private:
  ErrorHandler* m_Handler;
  std::optional<std::string_view> m_ObjectName;
  mutable const ObjectModule* m_Module = nullptr;
  mutable std::unique_ptr<ObjectModule> m_Carrier;
};

} // namespace elfext
