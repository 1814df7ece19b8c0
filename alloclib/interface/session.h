// SPDX-License-Identifier: Apache-2.0
//
// The life of the libraries in a program. Archives, object modules, parsers and everything else
// that lives in regions is made after it and is gone before it:
//
//   int main() {
//     alloclib::Session session;
//     arlib::Archive archive(support::getNativeHost());
//     ...
//   }
//
// The tool is the exception: a message may end it in the middle, so it calls leave().

#pragma once

#include "alloclib/interface/process.h"

namespace alloclib {

/// One at a time.
class Session {
public:
  Session() { initialise(); }
  /// Every region must be gone, or that is an internal error.
  ~Session() {
    if (!m_IsLeft) shutDown();
  }
  Session(const Session&) = delete;
  Session& operator=(const Session&) = delete;

  /// Ends it now, in a process that is about to exit: what regions still hold is left to the host.
  void leave() {
    shutDown(false);
    m_IsLeft = true;
  }

private:
  bool m_IsLeft = false;
};

} // namespace alloclib
