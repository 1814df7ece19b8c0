// SPDX-License-Identifier: Apache-2.0
//
// Each failure of the archive library as a message of the catalogue. What it answers decides
// whether the library goes on: what is wrong with an archive in small things is a warning, and the
// run goes on; what would lose members or write wrong ones is an error, and keeps the old file.
#include "quarn/arlib_error_handler.h"

#include "arlib/interface/archive.h"
#include "elfext/interface/attribute_relations.h"
#include "messages/interface/catalogue.h"
#include "quarn/reporting.h"

namespace quarn {

using arlib::Archive;
using arlib::ArchiveMember;
using arlib::MinorVariantGroup;
using messages::ErrorWord;
using messages::FatalWord;
using messages::Key;
using messages::RemarkWord;
using messages::WarningWord;

namespace {

bool reportHostError(Key key, const Archive& archive, int errorNumber) {
  reportMessage(ErrorWord, key, archive.getFileName(), hostErrorText(errorNumber));
  return false;
}

} // namespace

bool ArlibErrorHandler::report(const Archive& archive, arlib::Severity severity,
                               std::string_view text) {
  const bool isTolerable = severity != arlib::Severity::Fatal;
  reportMessage(isTolerable ? WarningWord : ErrorWord,
                isTolerable ? messages::MalformedArchiveWarning : messages::MalformedArchive,
                archive.getFileName(), text);
  return isTolerable;
}

bool ArlibErrorHandler::reportOutOfMemory(const Archive&) {
  reportMessage(FatalWord, messages::OutOfMemory);
  return false;
}

bool ArlibErrorHandler::reportReadError(const Archive& archive, const char*, int errorNumber) {
  return reportHostError(messages::ReadingFile, archive, errorNumber);
}

bool ArlibErrorHandler::reportSeekError(const Archive& archive, const char*, int errorNumber) {
  return reportHostError(messages::SeekingFile, archive, errorNumber);
}

bool ArlibErrorHandler::reportCloseError(const Archive& archive, const char*, int errorNumber) {
  return reportHostError(messages::ClosingFile, archive, errorNumber);
}

bool ArlibErrorHandler::reportDeleteError(const Archive& archive, const char*, int errorNumber) {
  return reportHostError(messages::DeletingFile, archive, errorNumber);
}

bool ArlibErrorHandler::reportWriteError(const Archive& archive, const char*, int errorNumber) {
  return reportHostError(messages::WritingArchive, archive, errorNumber);
}

bool ArlibErrorHandler::reportReadOnlyOutput(const Archive& archive, const char*) {
  reportMessage(ErrorWord, messages::OutputReadOnly, archive.getFileName());
  return false;
}

bool ArlibErrorHandler::reportBadArchiveMagic(const Archive& archive) {
  reportMessage(ErrorWord, messages::NotInArchiveFormat, archive.getFileName());
  return false;
}

bool ArlibErrorHandler::reportNoBaseVariant(const Archive&, MinorVariantGroup group) {
  reportMessage(WarningWord, messages::NoBaseVariant, group.front()->getName());
  showGroup(group);
  return true;
}

bool ArlibErrorHandler::reportMultipleBaseVariants(const Archive&, MinorVariantGroup baseVariants) {
  reportMessage(WarningWord, messages::MultipleBaseVariants, baseVariants.front()->getName());
  showGroup(baseVariants);
  return true;
}

bool ArlibErrorHandler::reportUndecoratableDifference(const Archive&, const ArchiveMember& member,
                                                      MinorVariantGroup group) {
  reportMessage(WarningWord, messages::UndecoratableDifference, member.getName(),
                group.front()->getName());
  showGroup(group);
  return true;
}

bool ArlibErrorHandler::reportCommonAttributesClash(const Archive&, MinorVariantGroup group,
                                                    const elfext::FullAttr& attributes) {
  reportMessage(WarningWord, messages::CommonAttributesIncompatible, group.front()->getName());
  showClashes(attributes);
  return true;
}

bool ArlibErrorHandler::reportMemberAttributesClash(const Archive&, const ArchiveMember& member,
                                                    const elfext::FullAttr& attributes) {
  reportMessage(WarningWord, messages::MemberAttributesIncompatible, member.getName());
  showClashes(attributes);
  return true;
}

void ArlibErrorHandler::showClashes(const elfext::FullAttr& attributes) const {
  if (!m_ShowDetails) return;
  const std::string_view format = messages::getMessageText(messages::AttributeClash);
  elfext::FullAttr remaining = attributes;
  elfext::Clash clash;
  while (elfext::takeClash(remaining, clash))
    messages::reportFormat(RemarkWord, nullptr, format, clash.first, clash.second);
}

// The lines have a severity of their own, so that they also come when the warning is silenced.
void ArlibErrorHandler::showGroup(MinorVariantGroup group) const {
  if (!m_ShowDetails) return;
  const std::string_view format = messages::getMessageText(messages::VariantGroupMember);
  for (size_t i = 0; i < group.size(); ++i) {
    messages::reportFormat(RemarkWord, nullptr, format, group.front()->getName(), i,
                           group[i]->getName());
  }
}

} // namespace quarn
