// SPDX-License-Identifier: Apache-2.0
//
// Brings the bytes and symbols in which a module states its build attributes up to date with what
// its objects have, for those who write modules.
#pragma once

namespace elfext {

class ObjectModule;

/// Makes the blocks of the module, its sections and its symbols say what their attributes do. An
/// object that says the same as what is around it has none.
void updateBuildAttributesBlocks(ObjectModule& module);

/// Makes the contents of the attribute section anew from the blocks, if they are not up to date.
/// Surplus attribute sections go; one is made if there is none.
void updateBuildAttributesSection(ObjectModule& module);

/// The other way to state attributes: symbols that are not right go, missing ones are made.
void updateDecorationSymbols(ObjectModule& module);

} // namespace elfext
