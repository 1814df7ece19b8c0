// SPDX-License-Identifier: Apache-2.0
//
// The bridge from the archive library's failures to the catalogue. What the library words itself
// (malformed headers and tables) comes through `report`; what names a file names the archive,
// whichever file the library was at, since that is the one the user asked for.
//
// False makes the library give up; the counted error then keeps the archive from being written.
#pragma once

#include "arlib/interface/error_handler.h"

namespace quarn {

class ArlibErrorHandler final : public arlib::ErrorHandler {
public:
  // With `showDetails` (-v) the warnings about minor variants are followed by their members.
  explicit ArlibErrorHandler(bool showDetails) : m_ShowDetails(showDetails) {}

  bool report(const arlib::Archive& archive, arlib::Severity severity,
              std::string_view text) override;
  bool reportOutOfMemory(const arlib::Archive& archive) override;
  bool reportReadError(const arlib::Archive& archive, const char* fileName,
                       int errorNumber) override;
  bool reportSeekError(const arlib::Archive& archive, const char* fileName,
                       int errorNumber) override;
  bool reportCloseError(const arlib::Archive& archive, const char* fileName,
                        int errorNumber) override;
  bool reportDeleteError(const arlib::Archive& archive, const char* fileName,
                         int errorNumber) override;
  bool reportWriteError(const arlib::Archive& archive, const char* fileName,
                        int errorNumber) override;
  bool reportReadOnlyOutput(const arlib::Archive& archive, const char* fileName) override;
  bool reportBadArchiveMagic(const arlib::Archive& archive) override;
  bool reportNoBaseVariant(const arlib::Archive& archive, arlib::MinorVariantGroup group) override;
  bool reportMultipleBaseVariants(const arlib::Archive& archive,
                                  arlib::MinorVariantGroup baseVariants) override;
  bool reportUndecoratableDifference(const arlib::Archive& archive,
                                     const arlib::ArchiveMember& member,
                                     arlib::MinorVariantGroup group) override;
  // What excludes each other in the attributes follows with -v. The library itself reports less of
  // the same, through the base class's operations.
  virtual bool reportCommonAttributesClash(const arlib::Archive& archive,
                                           arlib::MinorVariantGroup group,
                                           const elfext::FullAttr& attributes);
  virtual bool reportMemberAttributesClash(const arlib::Archive& archive,
                                           const arlib::ArchiveMember& member,
                                           const elfext::FullAttr& attributes);

private:
  void showClashes(const elfext::FullAttr& attributes) const;
  void showGroup(arlib::MinorVariantGroup group) const;

  bool m_ShowDetails;
};

} // namespace quarn
