// SPDX-License-Identifier: Apache-2.0
#pragma once

namespace elfext {

class ObjectModule;

// The checks of how a linked file is laid out; false at the first answer not to go on.
[[nodiscard]] bool validatePlacement(ObjectModule& module);

} // namespace elfext
