// SPDX-License-Identifier: Apache-2.0
//
// The English texts, in the order of the keys. A text that is a format gets its arguments in the
// order in which it names them. Users' scripts read these lines: a text changes for a reason only.
//
// Sorting, uniqueness and the formats themselves are checked by the compiler at the end of the
// file.

#include "messages/src/catalogues.h"

#include "messages/interface/message_keys.h"
#include "messages/src/compiled_catalogue.h"

namespace messages {

namespace {

// clang-format off
constexpr CatalogueRow Rows[] = {
    {OutOfMemory,                  "Out of memory"},
    {NotInArchiveFormat,           "'%s' not in archive format"},
    {MalformedArchive,             "'%s': malformed archive: %s"},
    {WritingArchive,               "Writing file '%s' : %s"},
    {NotPresentInArchive,          "'%s' not present in archive '%s'"},
    {ArchiveNotFound,              "Archive '%s' not found : %s"},
    {FileDoesNotExist,             "File '%s' does not exist"},
    {ReadingFile,                  "Reading file '%s' : %s"},
    {AlreadyExists,                "'%s' already exists, so will not be extracted"},
    {NoArchiveSpecified,           "No archive specified"},
    {NoActionSpecified,            "One of the actions -[%s] must be specified"},
    {OnlyOneAction,                "Only one action option may be specified"},
    {PositionNotFound,             "Position '%s' not found"},
    {FilenameTooLong,              "Filename '%s' too long for file system"},
    {WritingExtractedFile,         "Writing file '%s' : %s"},
    {NoSymbolTable,                "Archive '%s' does not have a symbol table"},
    {CreatingArchive,              "Creating archive '%s'"},
    {NoBaseVariant,                "Minor variants of archive member '%s' include no base variant"},
    {AddingNonElfObject,           "Adding non-ELF object '%s' to archive '%s'"},
    {MultipleBaseVariants,         "Minor variants of archive member '%s' include multiple base variants"},
    {UndecoratableDifference,      "Attribute difference of archive member '%s' in minor variant group beginning with '%s' includes attribute(s) with no symbol decoration representation"},
    {CommonAttributesIncompatible, "Common attributes of minor variant group beginning with '%s' are incompatible with library attributes."},
    {MemberAttributesIncompatible, "Attributes of minor variant member object '%s' are incompatible with library attributes."},
    {HelpCommandFormat,            "\n"
                                   "Archive creation and maintenance tool\n"
                                   "\n"
                                   "Command format:\n"
                                   "\n"
                                   "%s options archive [ file_list ]\n"
                                   "\n"},
    {HelpWildcards,                "Wildcards '%c' and '*' may be used in file_list\n"
                                   "\n"},
    {HelpEditOptions,              "Options:-\n"
                                   "\n"
                                   " -r         Insert files in <file_list>, replace existing members of the same name.\n"
                                   " -d         Delete the members in <file_list>.\n"
                                   " -x         Extract members in <file_list> placing in files of the same name.\n"
                                   " -m         Move files in <file_list>.\n"
                                   " -p         Print files to stdout.\n"
                                   " -a pos     Insert/move files after file named <pos>.\n"
                                   " -b pos     Insert/move files before file named <pos>.\n"
                                   " -u         Update older files only, used with -r.\n"
                                   "\n"},
    {HelpOtherOptions,             " -n         Do not add a symbol table to an object archive.\n"
                                   " -s         Force regeneration of archive symbol table.\n"
                                   " -t         Print table of contents of archive.\n"
                                   "--zs        Show the symbol table.\n"
                                   "--zt        Summarize the archive contents (sizes + entries).\n"
                                   " -c         Suppress warning when a new archive is created.\n"
                                   " -C         Do not overwrite existing files when extracting.\n"
                                   " -T         Truncate file names to system maximum length.\n"
                                   " -v         Give verbose output.\n"
                                   "--create    Force creation of a new archive.\n"
                                   "--via file  Take additional arguments from via file.\n"
                                   "--sizes     List the size of each member and the library total.\n"
                                   "--entries   List sections containing ENTRY points.\n"
                                   "--vsn       Print the current Quarn Version. \n"
                                   "--help      Print this message. \n"
                                   "\n"},
    {HelpExamples,                 "Examples:-\n"
                                   "\n"
                                   "        %s -r  mylib.a obj1 obj2 obj3...\n"
                                   "        %s -x  mylib.a %csort*\n"
                                   "        %s -d  mylib.a hash.o\n"
                                   "        %s -tv ansilib.a\n"
                                   "\n"},
    {ListedMember,                 "%s\n"},
    {ListedMemberLong,             "%s%6d/%6d%7u %s %s (offset %6d)\n"},
    {AddedMember,                  "a - %s\n"},
    {ReplacedMember,               "r - %s\n"},
    {DeletedMember,                "d - %s\n"},
    {MovedMember,                  "m - %s\n"},
    {ExtractedMember,              "x - %s\n"},
    {PrintedMember,                "\n<%s>\n\n"},
    {SizesHeader,                  "\n      Code    RO Data    RW Data    ZI Data      Debug   Object Name\n"},
    {SizesRow,                     "%10u %10u %10u %10u %10u   %s\n"},
    {EntryPoint,                   "ENTRY at offset %d in section %s of %s\n"},
    {NoEntryPoints,                "No ENTRY points found.\n"},
    {ListedSymbol,                 "%-20s from %-10s at offset %6d\n"},
    {CommandLineEcho,              "[%s %s]"},
    {VariantGroupMember,           " * %s [%u] : %s"},
    {AttributeClash,               " * %s clashes with %s\n"},
    {MalformedArchiveWarning,      "'%s': malformed archive: %s"},
    {SeekingFile,                  "Seeking in file '%s' : %s"},
    {ClosingFile,                  "Closing file '%s' : %s"},
    {DeletingFile,                 "Deleting file '%s' : %s"},
    {OutputReadOnly,               "Output file '%s' is read-only"},
    {NoMembersForCreate,           "No archive members specified with --create"},
    {UnrecognizedOption,           "Unrecognized option '%s%s'."},
    {MissingArgument,              "Missing argument for option '%s'."},
    {RecursiveViaFile,             "Recursive via file inclusion depth of %d reached in file '%s'."},
    {ArgumentNotPermitted,         "Argument '%s' not permitted for option '%s'."},
    {ViaFileNotOpened,             "Could not open via file '%s'."},
    {ViaFileReadError,             "Error when reading from via file '%s'."},
    {MalformedViaFile,             "Malformed via file '%s'."},
    {ViaFileCommandTooLong,        "Via file '%s' command too long for buffer."},
    {IntegerOverflow,              "Overflow: '%s' will not fit in an integer."},
    {OldSyntax,                    "Old syntax, please use '%s%s%s%s'."},
    {DeprecatedOption,             "Option '%s' is deprecated."},
    {ViaFileNotClosed,             "Could not close via file '%s'."},
    {SelectableArguments,          "The following arguments to option '%s' can be selected:\n %s"},
    {DeprecatedArgument,           "Argument '%s' to option '%s' is deprecated"},
    {UnexpectedArgument,           "Unexpected argument for option '%s%s'"},
    {ConcatenatedOptionArgument,   "Concatenated options cannot have arguments: -%s %s"},
    {NulInViaFile,                 "'\\0' character found in via file '%s' - possible binary file.  Aborting via file parse."},
    {PossibleMatches,              "Possible matches for '%s' include '%s' and '%s'."},
    {RepeatedOption,               "Option '-%s' repeated in concatenated options '-%s%s%s'."},
    {LocaleNotInitialised,         "Could not initialise message locale %s"},
    {UnknownDiagnosticNumber,      "Unknown diagnostic number %s"},
};
// clang-format on

static_assert(isSortedAndUnique(Rows));

constexpr auto Compiled = compileRows<Rows>();
static_assert(!Compiled.hasFault());

constexpr BuiltInCatalogue Catalogue = {Rows, Compiled.pieces, Compiled.ends};

} // namespace

const BuiltInCatalogue& getEnglishCatalogue() {
  return Catalogue;
}

} // namespace messages
