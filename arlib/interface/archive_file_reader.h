// SPDX-License-Identifier: Apache-2.0
//
// Reads an archive file: every member header in one forward pass, the bytes of the two tables, and
// of all other members only where they lie.
#pragma once

#include <memory>

namespace support {
class SourceFile;
}

namespace arlib {

class Archive;

/// Loads a file into an archive. True means that the archive now mirrors the file. False means that
/// the failure has been reported through the archive's handler, and that the archive is empty and
/// usable again, with the file's name kept.
///
/// The archive keeps the file open: the members' bytes are read through the same opening later,
/// also when the name leads to another file by then. A file that is written to while it is read
/// fails the read. Whatever the handler answers to a report that ends the read, the read ends.
bool readFile(const char* fileName, Archive& archive);

/// The same for a file that is open already, and perhaps locked.
bool readFile(const std::shared_ptr<support::SourceFile>& file, Archive& archive);

} // namespace arlib
