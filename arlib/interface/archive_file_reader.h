// SPDX-License-Identifier: Apache-2.0
//
// Reads an archive file: every member header in one forward pass, the bytes of the two tables, and
// of all other members only where they lie.
#pragma once

namespace arlib {

class Archive;

// Loads a file into an archive. True means that the archive now mirrors the file. False means that
// the failure has been reported through the archive's handler, and that the archive is empty and
// usable again, with the file's name kept.
bool readFile(const char* fileName, Archive& archive);

} // namespace arlib
