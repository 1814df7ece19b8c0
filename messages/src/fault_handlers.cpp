// SPDX-License-Identifier: Apache-2.0
//
// What the libraries on the ground say when they give up, said as messages. They include no one, so
// they call through handlers. When memory has run out the report must need none: lines are composed
// in a buffer that is kept, and catalogue texts are constants.

#include "alloclib/interface/handlers.h"
#include "checking/interface/checking.h"
#include "messages/interface/output.h"
#include "messages/interface/process_end.h"
#include "messages/src/message_state.h"

#include <new>

namespace messages {

namespace {

// What is held back comes out first, since holding more of it would need memory.
void onOutOfMemory() {
  HeldOutput().release();
  report(FatalWord, nullptr, OutOfMemory);
  endProcess(1);
}

// The sizes are of no use to who runs the tool.
void onRegionOutOfMemory(size_t, size_t) {
  onOutOfMemory();
}

void onRegionError(const char* text) {
  std::string& line = startLine();
  appendArguments(line, "Internal alloclib error: %s\n", ArgumentArray<const char*>{text});
  writeText(Stream::Error, line);
  endProcess(1);
}

void onCheckingText(std::string_view text) {
  writeText(messageState.diagnosticStream, text);
}

} // namespace

void installFaultHandlers() {
  checking::setFailureHandler(assertionFault);
  checking::setFaultHandler(plainFault);
  checking::setTextSink(onCheckingText);
  alloclib::setInternalErrorHandler(onRegionError);
  alloclib::setOutOfMemoryHandler(onRegionOutOfMemory);
  // The standard containers have no other way to say it, and exceptions end at no one's catch.
  std::set_new_handler(onOutOfMemory);
}

} // namespace messages
