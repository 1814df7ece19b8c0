// SPDX-License-Identifier: Apache-2.0
//
// Words, request, libraries, document. It comes out when all libraries have been read, or not at
// all: who reads from a pipe could not tell a document of half the libraries from one of all. The
// libraries behind one that can't be read are looked at nevertheless, so that one run tells of all.
#include "quarn-json/json_main.h"

#include "messages/interface/output.h"
#include "quarn-json/command_line.h"
#include "quarn-json/document.h"
#include "quarn-json/library_facts.h"
#include "quarn-json/usage.h"
#include "quarn/archive_run.h"
#include "quarn/reporting.h"

#include <string>

namespace quarn_json {

namespace {

void putLibrary(quarn::Run& run, Document& document) {
  if (run.openStatus.missing) {
    quarn::reportMessage(messages::ErrorWord, messages::ArchiveNotFound, run.getArchiveName(),
                         quarn::hostErrorText(run.openStatus.errorNumber));
    return;
  }
  putFacts(run.archive, document);
}

// A run of `quarn` ends at the first error, so each library has an account of its own.
void showLibraries(support::Host& host, const Request& request) {
  Document document(host);
  for (const std::string& library : request.libraries)
    quarn::runOnArchive(host, library.c_str(), request.settings,
                        [&document](quarn::Run& run) { putLibrary(run, document); });
  if (quarn::hasErrors()) return;
  const support::HostError error = document.finish(messages::writeRaw);
  if (error == 0) return;
  quarn::reportMessage(messages::ErrorWord, messages::WritingExtractedFile, document.getFileName(),
                       quarn::hostErrorText(error));
}

} // namespace

void jsonMain(int argc, const char* const* argv, const char* toolName, support::Host& host,
              alloclib::RegionGeneral& memory) {
  messages::setProgramName(toolName);
  Request request;
  switch (readCommandLine(argc, argv, host, memory, request)) {
  case Answer::Refused:
    return;
  case Answer::Help:
    return messages::writeText(messages::Stream::Output, helpText(toolName));
  case Answer::Version:
    return messages::writeText(messages::Stream::Output, versionText());
  case Answer::Run:
    return showLibraries(host, request);
  }
}

} // namespace quarn_json
