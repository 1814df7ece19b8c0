// SPDX-License-Identifier: Apache-2.0
//
// From files and ranges of files to one image, which the steps of the read then work on.
#include "elfext/interface/read_elf_file.h"

#include "elfext/interface/raw_data_block.h"
#include "elfext/interface/reference_counted_file.h"
#include "elfext/interface/section.h"
#include "elfext/src/object_module_reader.h"

namespace elfext {

namespace {

// Only what is larger may have contents that stay in the file.
constexpr uint64_t LargestEagerFile = 0x100000;

void mustBeOpen(const support::FileHandle& file) {
  const support::FileHandle* elfFile = file.isOpen() ? &file : nullptr;
  QUARN_ASSERT(1, elfFile != NULL);
}

bool reportReadError(ObjectModule& module, support::HostError error) {
  module.clear();
  return refuse(module, &ErrorHandler::ioErrorReading, error);
}

// The core of every form. The image goes to the module, unless the read fails.
bool readImage(ObjectModule& module, std::unique_ptr<ImageBytes> image, DeferralFile* deferral,
               const uint8_t* lentBytes = nullptr) {
  const alloclib::RegionOwner region(
      alloclib::RegionGeneral::Create(0x100000, "readElfFile() region"));
  ReadContext context = {.module = module,
                         .image = *image,
                         .region = *region,
                         .lentBytes = lentBytes,
                         .deferral = deferral};
  const bool isRead =
      image->prepare() ? readObjectModule(context, std::move(image)) : context.failRead();
  if (isRead) return true;
  module.clear();
  module.setReadBuffer(nullptr);
  return false;
}

// A range of a file that this read has opened.
bool readOwnFile(support::Host& host, support::FileHandle file, uint64_t offset, uint64_t size,
                 ObjectModule& module) {
  auto image = std::make_unique<ImageBytes>(host, file, offset, size, true);
  // A small image is in memory as a whole, and the file is not needed any more.
  if (size <= ImageBytes::WholeReadLimit && image->prepare()) {
    const support::HostError error = image->closeFile();
    if (error != 0) return reportReadError(module, error);
  }
  return readImage(module, std::move(image), nullptr);
}

// What is not deferred is loaded, so that the deferred sections alone decide when the file closes.
bool loadWhatIsNotDeferred(const ObjectModule& module, const ImageBytes& image) {
  for (const Section* section : module.getSections()) {
    if (!section->isContentsDeferred()) static_cast<void>(section->getContents());
  }
  for (RawDataBlock* block : module.getRawDataBlocks())
    static_cast<void>(block->getBuffer().getContents());
  return image.getFailure() == ImageFailure::None;
}

// A large file whose sections may be deferred. The first deferred section makes the record that
// closes the file from then on, in place of the image; a failed read leaves the caller's file open.
bool readDeferring(DeferralFile& deferral, uint64_t size, bool isOwnFile, ObjectModule& module) {
  auto image = std::make_unique<ImageBytes>(deferral.host, deferral.file, 0, size, isOwnFile);
  ImageBytes& bytes = *image;
  bool isRead = readImage(module, std::move(image), &deferral);
  if (deferral.shared == nullptr) return isRead;
  if (isRead && !loadWhatIsNotDeferred(module, bytes))
    isRead = reportReadError(module, bytes.getHostError());
  if (isRead)
    bytes.forgetFile();
  else if (!isOwnFile)
    deferral.shared->leaveFileOpen();
  const support::HostError error = deferral.shared->release();
  return error == 0 || !isRead ? isRead : reportReadError(module, error);
}

bool readWholeFile(support::Host& host, support::FileHandle file, bool isOwnFile,
                   ObjectModule& module, DeferredContentsSelector* selector) {
  support::FileStatus status;
  const support::HostError error = host.statusOf(file, status);
  if (error != 0) {
    if (isOwnFile) static_cast<void>(host.close(file));
    return reportReadError(module, error);
  }
  const auto size = static_cast<uint64_t>(status.size);
  if (selector != nullptr && size > LargestEagerFile) {
    DeferralFile deferral = {.host = host, .file = file, .selector = *selector};
    return readDeferring(deferral, size, isOwnFile, module);
  }
  if (isOwnFile) return readOwnFile(host, file, 0, size, module);
  return readImage(module, std::make_unique<ImageBytes>(host, file, 0, size, false), nullptr);
}

} // namespace

bool readElfFile(support::Host& host, const char* fileName, ObjectModule& module,
                 DeferredContentsSelector* selector) {
  QUARN_ASSERT(1, fileName != NULL);
  module.setFileName(fileName);
  support::FileHandle file;
  const support::HostError error = host.openForReading(fileName, file);
  if (error != 0) return reportReadError(module, error);
  return readWholeFile(host, file, /*isOwnFile=*/true, module, selector);
}

bool readElfFile(support::Host& host, const char* fileName, uint64_t offset, uint64_t size,
                 ObjectModule& module, DeferredContentsSelector*) {
  QUARN_ASSERT(1, fileName != NULL);
  support::FileHandle file;
  const support::HostError error = host.openForReading(fileName, file);
  if (error != 0) return reportReadError(module, error);
  return readOwnFile(host, file, offset, size, module);
}

bool readElfFile(support::Host&, const char* fileName, std::span<const uint8_t> bytes,
                 ObjectModule& module, DeferredContentsSelector*) {
  const uint8_t* readBuffer = bytes.data();
  QUARN_ASSERT(1, fileName != NULL && readBuffer != NULL);
  module.setFileName(fileName);
  return readImage(module, std::make_unique<ImageBytes>(bytes), nullptr, readBuffer);
}

bool readElfFile(support::Host& host, support::FileHandle elfFile, ObjectModule& module,
                 DeferredContentsSelector* selector) {
  mustBeOpen(elfFile);
  return readWholeFile(host, elfFile, /*isOwnFile=*/false, module, selector);
}

bool readElfFile(support::Host& host, support::FileHandle elfFile, uint64_t offset, uint64_t size,
                 ObjectModule& module, DeferredContentsSelector*) {
  mustBeOpen(elfFile);
  return readImage(module, std::make_unique<ImageBytes>(host, elfFile, offset, size, false),
                   nullptr);
}

} // namespace elfext
