// SPDX-License-Identifier: Apache-2.0
//
// The texts of --help and --vsn, which are also those of a command line that asks for nothing.
#include "quarn/banner.h"

#include "messages/interface/messages.h"
#include "messages/interface/output.h"
#include "support/interface/version_banner.h"

#include <string>

namespace quarn {

namespace {

// What stands for one character of a name in a file_list word.
constexpr char AnyCharacter = '?';

} // namespace

void showBanner(BannerMode mode, const char* toolName) {
  messages::writeText(messages::Stream::Output,
                      support::bannerText(support::getBuildData()) + "\n");
  if (mode == BannerMode::Alone) return;
  messages::listingMessage(messages::HelpCommandFormat, toolName);
  messages::listingMessage(messages::HelpWildcards, AnyCharacter);
  messages::listingMessage(messages::HelpEditOptions);
  messages::listingMessage(messages::HelpOtherOptions);
  messages::listingMessage(messages::HelpExamples, toolName, toolName, AnyCharacter, toolName,
                           toolName);
}

} // namespace quarn
