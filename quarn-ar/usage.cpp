// SPDX-License-Identifier: Apache-2.0
//
// Build systems look for "[D]" in the help before they ask for archives without dates, and for "@<"
// before they write response files. They also ask for thin archives where they see "[T]": these are
// refused, so T stands without brackets.
#include "quarn-ar/usage.h"

#include "support/interface/version_banner.h"

namespace quarn_ar {

namespace {

constexpr std::string_view ArHelp =
    R"( [-]{dmpqrstx}[abcCDfilNoPsSTuUvV] [place] [count] archive [file]...

Operations:
  d  delete members
  m  move members to the end, or to the place
  p  print members
  q  add files behind the last member, without a look at the names
  r  replace members by files, and add new ones
  s  make the symbol table anew, as ranlib does
  t  list members
  x  extract members into the current folder

Modifiers:
  [a]  behind the member that the place names (r, m)
  [b]  in front of that member (r, m); [i] is the same
  [c]  create the archive without a remark
  [C]  keep files that are there (x)
  [D]  no dates, owners and modes of files (default)
  [f]  cut names to 15 characters
  [l]  nothing; for compatibility
  [N]  of the members of a name take the one with the number count (d, x)
  [o]  give files the dates of their members (x)
  [P]  names with their folders
  [s]  with a symbol table (default)
  [S]  without a symbol table
   T   cut names that the host can't take (x); thin archives are not made
  [u]  replace only what is older than its file (r)
  [U]  with dates, owners and modes of files
  [v]  tell of each member
  [V]  show the version

Options:
  @<file>                         read words from the file
  --rsp-quoting=posix|windows     how words are quoted there
  --plugin=<file>                 nothing; for compatibility
  --target=<format>               elf..., default or binary; nothing else is made
  --qobix_buildattr               attributes of objects from their attribute sections too
  --libattrmap=<file>             what all members may need, by the name of the archive
  --diag_style=<style>            list, zev, ide, devstudio or gnu
  --diag_error=<n>,..  --diag_warning=<n>,..  --diag_remark=<n>,..  --diag_suppress=<n>,..
  -h, --help                      show this text
  --version                       show the version
)";

constexpr std::string_view RanlibHelp = R"( [-DhtUvV] archive...

Makes the symbol tables of archives anew.
  -t  the same, so that the archive is newer than its members
  -D, -U, --plugin=<file>  nothing; for compatibility
  --target=<format>        elf..., default or binary; nothing else is made
  @<file>                  read words from the file; --rsp-quoting=posix|windows
  -v, -V, --version        show the version
  -h, --help               show this text
)";

std::string_view nameOf(Program program) {
  return program == Program::Ar ? "ar" : "ranlib";
}

} // namespace

Program programNamed(std::string_view toolName) {
  return toolName.ends_with("ranlib") ? Program::Ranlib : Program::Ar;
}

std::string versionText(Program program) {
  const std::string name(nameOf(program));
  return "quarn-" + name + " " + std::string(support::getBuildData().version) +
         " (compatible with GNU " + name + ")\n";
}

std::string helpText(Program program, std::string_view toolName) {
  return "Usage: " + std::string(toolName) +
         std::string(program == Program::Ar ? ArHelp : RanlibHelp);
}

} // namespace quarn_ar
