// SPDX-License-Identifier: Apache-2.0
//
// The half of the validation that looks at places in the file and in memory. It stands apart, as it
// is about laid-out files and the other half about all.
#pragma once

namespace elfext {

class ObjectModule;

// The checks of how a linked file is laid out; false at the first answer not to go on.
[[nodiscard]] bool validatePlacement(ObjectModule& module);

} // namespace elfext
