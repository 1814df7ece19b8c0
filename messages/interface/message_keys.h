// SPDX-License-Identifier: Apache-2.0
//
// The name of every message in the catalogue, in the order of the keys. The severity letter is a
// label: what a message does is said by the severity word that its reporter passes. 68xx and 69xx
// are the tool's own, 39xx the option parser's, 97xx and 99xx this library's.

#pragma once

#include "messages/interface/message_key.h"

namespace messages {

// clang-format off
inline constexpr Key OutOfMemory = makeKey('L', 6800, 'U');
inline constexpr Key NotInArchiveFormat = makeKey('L', 6826, 'E');
inline constexpr Key MalformedArchive = makeKey('L', 6829, 'E');
inline constexpr Key WritingArchive = makeKey('L', 6830, 'E');
inline constexpr Key NotPresentInArchive = makeKey('L', 6831, 'E');
inline constexpr Key ArchiveNotFound = makeKey('L', 6832, 'E');
inline constexpr Key FileDoesNotExist = makeKey('L', 6833, 'E');
inline constexpr Key ReadingFile = makeKey('L', 6835, 'E');
inline constexpr Key AlreadyExists = makeKey('L', 6836, 'E');
inline constexpr Key NoArchiveSpecified = makeKey('L', 6838, 'E');
inline constexpr Key NoActionSpecified = makeKey('L', 6839, 'E');
inline constexpr Key OnlyOneAction = makeKey('L', 6840, 'E');
inline constexpr Key PositionNotFound = makeKey('L', 6841, 'E');
inline constexpr Key FilenameTooLong = makeKey('L', 6842, 'E');
inline constexpr Key WritingExtractedFile = makeKey('L', 6843, 'E');
inline constexpr Key NoSymbolTable = makeKey('L', 6872, 'I');
inline constexpr Key CreatingArchive = makeKey('L', 6873, 'I');
inline constexpr Key NoBaseVariant = makeKey('L', 6874, 'W');
inline constexpr Key AddingNonElfObject = makeKey('L', 6875, 'W');
inline constexpr Key MultipleBaseVariants = makeKey('L', 6876, 'W');
inline constexpr Key UndecoratableDifference = makeKey('L', 6877, 'W');
inline constexpr Key CommonAttributesIncompatible = makeKey('L', 6878, 'W');
inline constexpr Key MemberAttributesIncompatible = makeKey('L', 6879, 'W');
inline constexpr Key HelpCommandFormat = makeKey('L', 6881, 'I');
inline constexpr Key HelpWildcards = makeKey('L', 6882, 'I');
inline constexpr Key HelpEditOptions = makeKey('L', 6883, 'I');
inline constexpr Key HelpOtherOptions = makeKey('L', 6884, 'I');
inline constexpr Key HelpExamples = makeKey('L', 6885, 'I');

// Lines of listings and reports; they are printed without a code.
inline constexpr Key ListedMember = makeKey('L', 6901, 'I');
inline constexpr Key ListedMemberLong = makeKey('L', 6902, 'I');
inline constexpr Key AddedMember = makeKey('L', 6903, 'I');
inline constexpr Key ReplacedMember = makeKey('L', 6904, 'I');
inline constexpr Key DeletedMember = makeKey('L', 6905, 'I');
inline constexpr Key MovedMember = makeKey('L', 6906, 'I');
inline constexpr Key ExtractedMember = makeKey('L', 6907, 'I');
inline constexpr Key PrintedMember = makeKey('L', 6908, 'I');
inline constexpr Key SizesHeader = makeKey('L', 6909, 'I');
inline constexpr Key SizesRow = makeKey('L', 6910, 'I');
inline constexpr Key EntryPoint = makeKey('L', 6911, 'I');
inline constexpr Key NoEntryPoints = makeKey('L', 6912, 'I');
inline constexpr Key ListedSymbol = makeKey('L', 6913, 'I');
inline constexpr Key CommandLineEcho = makeKey('L', 6914, 'I');
inline constexpr Key VariantGroupMember = makeKey('L', 6915, 'I');
inline constexpr Key AttributeClash = makeKey('L', 6916, 'I');

inline constexpr Key MalformedArchiveWarning = makeKey('L', 6974, 'W');
inline constexpr Key SeekingFile = makeKey('L', 6976, 'E');
inline constexpr Key ClosingFile = makeKey('L', 6977, 'E');
inline constexpr Key DeletingFile = makeKey('L', 6978, 'E');
inline constexpr Key OutputReadOnly = makeKey('L', 6979, 'E');
inline constexpr Key NoMembersForCreate = makeKey('L', 6980, 'E');

inline constexpr Key UnrecognizedOption = makeKey('X', 3900, 'U');
inline constexpr Key MissingArgument = makeKey('X', 3901, 'U');
inline constexpr Key RecursiveViaFile = makeKey('X', 3902, 'U');
inline constexpr Key ArgumentNotPermitted = makeKey('X', 3903, 'U');
inline constexpr Key ViaFileNotOpened = makeKey('X', 3904, 'U');
inline constexpr Key ViaFileReadError = makeKey('X', 3905, 'U');
inline constexpr Key MalformedViaFile = makeKey('X', 3906, 'U');
inline constexpr Key ViaFileCommandTooLong = makeKey('X', 3907, 'U');
inline constexpr Key IntegerOverflow = makeKey('X', 3908, 'U');
inline constexpr Key OldSyntax = makeKey('X', 3910, 'W');
inline constexpr Key DeprecatedOption = makeKey('X', 3912, 'W');
inline constexpr Key ViaFileNotClosed = makeKey('X', 3913, 'W');
inline constexpr Key SelectableArguments = makeKey('X', 3914, 'I');
inline constexpr Key DeprecatedArgument = makeKey('X', 3915, 'W');
inline constexpr Key UnexpectedArgument = makeKey('X', 3916, 'U');
inline constexpr Key ConcatenatedOptionArgument = makeKey('X', 3917, 'U');
inline constexpr Key NulInViaFile = makeKey('X', 3918, 'U');
inline constexpr Key PossibleMatches = makeKey('X', 3919, 'I');
inline constexpr Key RepeatedOption = makeKey('X', 3920, 'W');
inline constexpr Key LocaleNotInitialised = makeKey('X', 9780, 'E');
inline constexpr Key UnknownDiagnosticNumber = makeKey('X', 9962, 'I');
// clang-format on

} // namespace messages
