// SPDX-License-Identifier: Apache-2.0
//
// Who hears of a read. A model that is being made is its own carrier; for a read that makes none, a
// module with nothing but the object's name is made at the first report, so that sound objects,
// which are nearly all, never pay for one.
#include "elfext/src/reports/read_reporter.h"

#include "elfext/interface/object_module.h"

#include <string>

namespace elfext {

ReadReporter::ReadReporter(const ObjectModule& module)
    : m_Handler(module.getErrorHandler()), m_Module(&module) {}

ReadReporter::ReadReporter(ErrorHandler* handler, std::optional<std::string_view> objectName)
    : m_Handler(handler), m_ObjectName(objectName) {}

ReadReporter::~ReadReporter() = default;

const ObjectModule& ReadReporter::getModule() const {
  // Made once: all reports of one read carry the same module.
  if (m_Module != nullptr) return *m_Module;
  m_Carrier = std::make_unique<ObjectModule>();
  if (m_ObjectName) m_Carrier->setObjectName(std::string(*m_ObjectName).c_str());
  m_Module = m_Carrier.get();
  return *m_Module;
}

} // namespace elfext
