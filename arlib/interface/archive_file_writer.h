// SPDX-License-Identifier: Apache-2.0
//
// Puts an archive on disk. The target is never overwritten in place: the new archive is built in a
// temporary file beside it, since unchanged members are read out of the old one meanwhile, and then
// takes its place in one step.
#pragma once

namespace arlib {

class Archive;

// True means that the file now holds the archive, and that every member's location points into it.
// False means that the failure has been reported; the file is then as it was, and no temporary file
// is left.
bool writeFile(const char* fileName, Archive& archive);

} // namespace arlib
