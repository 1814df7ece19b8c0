// SPDX-License-Identifier: Apache-2.0
//
// Reads an ELF file into an object module. All forms return true on success; the module is then
// filled, and what it held before is gone. On failure the module is empty, and what was wrong has
// been told to its error handler, except that a handler which lets a foreign machine pass gets true
// and the module as it was, or empty where the read has named it.
//
// A range that the file does not have fails the read, also where nobody would look at its end.
//
// Section contents that nobody looks at are not read in the forms that open a file by its name, or
// that share one that is open: the module holds on to the file until it is cleared or destroyed.
// The host must live as long. Bytes that can't be had when somebody does look are told to the
// module's handler then, as a read error; see Buffer. The forms for a caller's handle have read
// everything when they return, but for what was deferred.
//
// The selector may be null. It is asked only in the first and the fourth form, for files larger
// than 0x100000 bytes.
//
// These are the ways to a model. The tool finds names in an object's tables without one
// (object_outline.h), by the same checks. Reads share no state, so any number of modules may be
// read one after the other, or be alive at once.
#pragma once

#include "support/interface/source_file.h"

#include <cstdint>
#include <memory>
#include <span>

namespace elfext {

class DeferredContentsSelector;
class ObjectModule;

/// A whole file, whose name becomes the module's file name.
[[nodiscard]] bool readElfFile(support::Host& host, const char* fileName, ObjectModule& module,
                               DeferredContentsSelector* selector);

/// `size` bytes at `offset` of a file: a member of an archive. Offsets inside are relative to it.
[[nodiscard]] bool readElfFile(support::Host& host, const char* fileName, uint64_t offset,
                               uint64_t size, ObjectModule& module,
                               DeferredContentsSelector* selector);

/// Bytes in memory, which must outlive the module's contents: nothing of them is copied. The name
/// becomes the module's file name.
[[nodiscard]] bool readElfFile(support::Host& host, const char* fileName,
                               std::span<const uint8_t> bytes, ObjectModule& module,
                               DeferredContentsSelector* selector);

/// A whole open file. With deferred contents the module closes the file when the last of them is
/// loaded or dropped. Without, and after a failure, it remains the caller's to close, at any time.
[[nodiscard]] bool readElfFile(support::Host& host, support::FileHandle elfFile,
                               ObjectModule& module, DeferredContentsSelector* selector);

/// The second form for an open file, which remains the caller's to close, at any time.
[[nodiscard]] bool readElfFile(support::Host& host, support::FileHandle elfFile, uint64_t offset,
                               uint64_t size, ObjectModule& module,
                               DeferredContentsSelector* selector);

/// The second form for a file that others read as well, all through its one opening.
[[nodiscard]] bool readElfFile(const std::shared_ptr<support::SourceFile>& file, uint64_t offset,
                               uint64_t size, ObjectModule& module,
                               DeferredContentsSelector* selector);

} // namespace elfext
