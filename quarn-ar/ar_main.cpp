// SPDX-License-Identifier: Apache-2.0
//
// Words, request, archives. Several archives are done one after the other, and the first that fails
// is the last: what stands behind it is as it was.
#include "quarn-ar/ar_main.h"

#include "messages/interface/output.h"
#include "quarn-ar/command_line.h"
#include "quarn-ar/operations.h"
#include "quarn-ar/refusal.h"
#include "quarn-ar/response_file.h"
#include "quarn/archive_run.h"
#include "quarn/reporting.h"

#include <optional>
#include <string>
#include <vector>

namespace quarn_ar {

namespace {

constexpr std::string_view QuotingOption = "--rsp-quoting";

// Asked for before the response files are read, so by a word of the command line itself. Behind
// `--` all are names. Nothing after a refusal.
std::optional<Quoting> findQuoting(const std::vector<std::string>& words) {
  Quoting quoting = Quoting::Posix;
  for (size_t i = 0; i < words.size() && words[i] != "--"; ++i) {
    const std::string_view word = words[i];
    if (!word.starts_with(QuotingOption)) continue;
    std::string_view value = word.substr(QuotingOption.size());
    if (value.starts_with('='))
      value.remove_prefix(1);
    else if (value.empty() && i + 1 < words.size())
      value = words[i + 1];
    const std::optional<Quoting> named = quotingNamed(value);
    if (!named) return std::nullopt;
    quoting = *named;
  }
  return quoting;
}

void show(const std::string& text) {
  messages::writeText(messages::Stream::Output, text);
}

void runOnArchives(support::Host& host, const Request& request) {
  const auto operation = [&request](quarn::Run& run) { doOperation(run, request); };
  for (const std::string& archive : request.archives) {
    messages::setSubject(archive);
    quarn::runOnArchive(host, archive.c_str(), request.settings, operation);
    if (quarn::hasErrors()) break;
  }
  messages::setSubject({});
}

} // namespace

void arMain(int argc, const char* const* argv, const char* toolName, support::Host& host,
            alloclib::RegionGeneral&) {
  messages::setProgramName(toolName);
  const Program program = programNamed(toolName);
  std::vector<std::string> words(argv + (argc > 0 ? 1 : 0), argv + argc);
  const std::optional<Quoting> quoting = findQuoting(words);
  if (!quoting || !expandResponseFiles(host, *quoting, words)) return;
  Request request;
  request.pathStyle = host.getPathStyle();
  switch (readCommandLine(program, words, request)) {
  case Answer::Refused:
    return;
  case Answer::Help:
    return show(helpText(program, toolName));
  case Answer::Version:
    return show(versionText(program));
  case Answer::Run:
    return runOnArchives(host, request);
  }
}

} // namespace quarn_ar
