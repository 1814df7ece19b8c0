// SPDX-License-Identifier: Apache-2.0
//
// From files and ranges of files to one image, which the steps of the read then work on.
//
// Here it is decided who owns the file and when it is closed, which the six forms differ in: a file
// of the read's own, one lent for the call, one lent for good, bytes in memory. All failures of the
// host, and ranges that the file does not have, end here as one report, with the module empty.
// Ranges are held against the size of the open file.
#include "elfext/interface/read_elf_file.h"

#include "elfext/interface/raw_data_block.h"
#include "elfext/interface/reference_counted_file.h"
#include "elfext/interface/section.h"
#include "elfext/src/model/module_builder.h"
#include "elfext/src/reader/object_module_reader.h"

#include <string>

namespace elfext {

namespace {

// Only what is larger may have contents that stay in the file.
constexpr uint64_t LargestEagerFile = 0x100000;

void mustBeOpen(const support::FileHandle& file) {
  const support::FileHandle* elfFile = file.isOpen() ? &file : nullptr;
  QUARN_ASSERT(1, elfFile != NULL);
}

// Contents that stay in the file of an old name end with it. The new one, which may be a text of
// the module's contents, is answered as the module has it.
const char* nameModule(ObjectModule& module, const char* fileName) {
  const std::string name = fileName;
  module.clear();
  module.setFileName(name.c_str());
  return module.getFileName();
}

bool reportReadError(ObjectModule& module, support::HostError error) {
  module.clear();
  return refuse(module, &ErrorHandler::ioErrorReading, error);
}

// The core of every form. The image goes to the module, unless the read fails.
bool readImage(ObjectModule& module, std::unique_ptr<ImageBytes> image, DeferralFile* deferral,
               const uint8_t* lentBytes = nullptr) {
  const ReadReporter reporter(module);
  ReadContext context(reporter, *image, module, lentBytes, deferral);
  // The context refers to the image by reference, so the pointer may go on.
  const bool isRead =
      image->prepare() ? readObjectModule(context, std::move(image)) : context.failRead();
  if (isRead) return true;
  module.clear();
  ModuleBuilder::setReadBuffer(module, nullptr);
  return false;
}

// A range that the file has: a look at its end may come late, or never.
bool readShared(const std::shared_ptr<support::SourceFile>& file, uint64_t offset, uint64_t size,
                ObjectModule& module) {
  if (!file->getStatus().holds(offset, size)) return reportReadError(module, 0);
  return readImage(module, std::make_unique<ImageBytes>(file, offset, size), nullptr);
}

// A range of a file that this read has opened. A small image is in memory as a whole, and the file
// is not needed any more.
bool readOwnFile(support::SourceFiles& files, const std::shared_ptr<support::SourceFile>& file,
                 uint64_t offset, uint64_t size, ObjectModule& module) {
  // Larger ones are read where somebody looks, which keeps the file open with the image.
  if (size > ImageBytes::WholeReadLimit || !file->getStatus().holds(offset, size))
    return readShared(file, offset, size, module);
  auto image = std::make_unique<ImageBytes>(file, offset, size);
  if (image->prepare()) {
    file->close();
    std::string name;
    // A close that fails makes the read fail: the file was the read's own.
    if (const support::HostError error = files.takeCloseError(name); error != 0)
      return reportReadError(module, error);
  }
  return readImage(module, std::move(image), nullptr);
}

// A range of a file that the caller may close when the read is over.
bool readLentFile(support::Host& host, support::FileHandle file, const support::FileStatus& status,
                  uint64_t offset, uint64_t size, ObjectModule& module) {
  if (!status.holds(offset, size)) return reportReadError(module, 0);
  auto image = std::make_unique<ImageBytes>(host, file, offset, size, false);
  if (image->prepare() && !image->loadAll()) return reportReadError(module, image->getHostError());
  // All bytes are here now; a look at the handle after the call would be one at somebody else's
  // file.
  image->forgetFile();
  return readImage(module, std::move(image), nullptr);
}

// What is not deferred is loaded, so that the deferred sections alone decide when the file closes.
// False if some of it can't be had, which has been reported.
bool loadWhatIsNotDeferred(const ObjectModule& module) {
  for (const Section* section : module.getSections()) {
    if (!section->isContentsDeferred()) static_cast<void>(section->getContents());
  }
  for (RawDataBlock* block : module.getRawDataBlocks())
    static_cast<void>(ModuleBuilder::getBuffer(*block).getContents());
  return !module.hasLostContents();
}

// A large file whose sections may be deferred. The first deferred section makes the record that
// closes the file from then on, in place of the image; a failed read leaves the caller's file open.
bool readDeferring(DeferralFile& deferral, uint64_t size, bool isOwnFile, ObjectModule& module) {
  auto image = std::make_unique<ImageBytes>(deferral.host, deferral.file, 0, size, isOwnFile);
  ImageBytes& bytes = *image;
  bool isRead = readImage(module, std::move(image), &deferral);
  // A handler that lets a foreign machine pass leaves the module as it was, and the image is gone;
  // so its address is only compared.
  if (isRead && ModuleBuilder::getImageSource(module) != &bytes) return true;
  const bool isAnyDeferred = deferral.shared != nullptr;
  // Of a file of its own the image may load the rest when somebody wants it.
  if (isOwnFile && !isAnyDeferred) return isRead;
  if (isRead && !loadWhatIsNotDeferred(module)) {
    module.clear();
    isRead = false;
  }
  if (isRead) bytes.forgetFile();
  if (!isAnyDeferred) return isRead;
  if (!isRead && !isOwnFile) deferral.shared->leaveFileOpen();
  // The read's own reference; the sections that stay deferred keep theirs.
  const support::HostError error = deferral.shared->release();
  return error == 0 || !isRead ? isRead : reportReadError(module, error);
}

bool readWholeFile(support::Host& host, support::FileHandle file, const support::FileStatus& status,
                   ObjectModule& module, DeferredContentsSelector* selector) {
  const auto size = static_cast<uint64_t>(status.size);
  if (selector == nullptr || size <= LargestEagerFile)
    return readLentFile(host, file, status, 0, size, module);
  DeferralFile deferral = {.host = host, .file = file, .selector = *selector};
  return readDeferring(deferral, size, /*isOwnFile=*/false, module);
}

} // namespace

bool readElfFile(support::Host& host, const char* fileName, ObjectModule& module,
                 DeferredContentsSelector* selector) {
  QUARN_ASSERT(1, fileName != NULL);
  support::SourceFiles files(host);
  std::shared_ptr<support::SourceFile> file;
  const support::HostError error = files.open(nameModule(module, fileName), file);
  if (error != 0) return reportReadError(module, error);
  const auto size = static_cast<uint64_t>(file->getStatus().size);
  if (selector == nullptr || size <= LargestEagerFile)
    return readOwnFile(files, file, 0, size, module);
  DeferralFile deferral = {.host = host, .file = file->giveHandle(), .selector = *selector};
  return readDeferring(deferral, size, /*isOwnFile=*/true, module);
}

bool readElfFile(support::Host& host, const char* fileName, uint64_t offset, uint64_t size,
                 ObjectModule& module, DeferredContentsSelector*) {
  QUARN_ASSERT(1, fileName != NULL);
  support::SourceFiles files(host);
  std::shared_ptr<support::SourceFile> file;
  if (const support::HostError error = files.open(fileName, file); error != 0)
    return reportReadError(module, error);
  return readOwnFile(files, file, offset, size, module);
}

bool readElfFile(const std::shared_ptr<support::SourceFile>& file, uint64_t offset, uint64_t size,
                 ObjectModule& module, DeferredContentsSelector*) {
  QUARN_ASSERT(1, file != NULL);
  return readShared(file, offset, size, module);
}

bool readElfFile(support::Host&, const char* fileName, std::span<const uint8_t> bytes,
                 ObjectModule& module, DeferredContentsSelector*) {
  const uint8_t* readBuffer = bytes.data();
  QUARN_ASSERT(1, fileName != NULL && readBuffer != NULL);
  nameModule(module, fileName);
  return readImage(module, std::make_unique<ImageBytes>(bytes), nullptr, readBuffer);
}

bool readElfFile(support::Host& host, support::FileHandle elfFile, ObjectModule& module,
                 DeferredContentsSelector* selector) {
  mustBeOpen(elfFile);
  support::FileStatus status;
  const support::HostError error = host.statusOf(elfFile, status);
  if (error != 0) return reportReadError(module, error);
  return readWholeFile(host, elfFile, status, module, selector);
}

bool readElfFile(support::Host& host, support::FileHandle elfFile, uint64_t offset, uint64_t size,
                 ObjectModule& module, DeferredContentsSelector*) {
  mustBeOpen(elfFile);
  support::FileStatus status;
  const support::HostError error = host.statusOf(elfFile, status);
  if (error != 0) return reportReadError(module, error);
  return readLentFile(host, elfFile, status, offset, size, module);
}

} // namespace elfext
