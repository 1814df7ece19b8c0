// SPDX-License-Identifier: Apache-2.0
//
// The help names each option once; a test compares it with the option rows.
#include "quarn-json/usage.h"

#include "support/interface/version_banner.h"

namespace quarn_json {

namespace {

constexpr std::string_view Help = R"( [options] library...

Shows members, symbols, sizes, entry points, attributes and builds of libraries as one JSON document.

Options:
  --help                  show this text
  --libattrmap=<file>     what libraries need of their target, by their names
  --qobix_buildattr       read the attribute sections of objects, too
  --version               show the version
)";

} // namespace

std::string helpText(std::string_view toolName) {
  return "Usage: " + std::string(toolName) + std::string(Help);
}

std::string versionText() {
  return "quarn-json " + std::string(support::getBuildData().version) + "\n";
}

} // namespace quarn_json
