// SPDX-License-Identifier: Apache-2.0
//
// What else the Windows host can do for its neighbours.
#pragma once

namespace support {

/// Behind installSignalCleanUp this removes the temporaries and ends the process with a status of
/// failure, without a word: what the signal for a pipe that nobody reads does elsewhere.
void endWithoutReader();

} // namespace support
