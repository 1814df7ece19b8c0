// SPDX-License-Identifier: Apache-2.0
//
// A fresh message library for each test, with strings for its streams and an exception for the end
// of the process. Each write is kept by itself, so that a test can count them; a sink can be made
// to fail from any moment on.

#pragma once

#include "messages/interface/messages.h"
#include "messages/interface/output_sink.h"
#include "messages/interface/process_end.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

namespace messages {

class StringSink final : public OutputSink {
public:
  int write(std::string_view bytes) override {
    if (m_Error != 0) return m_Error;
    m_Writes.emplace_back(bytes);
    return 0;
  }
  void failWith(int errorNumber) { m_Error = errorNumber; }
  size_t writeCount() const { return m_Writes.size(); }
  std::string getText() const {
    std::string all;
    for (const std::string& piece : m_Writes)
      all += piece;
    return all;
  }

private:
  std::vector<std::string> m_Writes;
  int m_Error = 0;
};

struct ProcessEnded {
  int status;
};

class MessagesTest : public testing::Test {
protected:
  void SetUp() override {
    setOutputSinks(&m_Output, &m_Error);
    setExitHandler([](int status) { throw ProcessEnded{status}; });
    initialise();
  }

  void TearDown() override {
    setOutputSinks(nullptr, nullptr);
    setExitHandler(nullptr);
  }

  std::string getErrorText() const { return m_Error.getText(); }

  std::string outputText() {
    flushAll();
    return m_Output.getText();
  }

  // The status that the process ended with, or -1 if it went on.
  template <class Action>
  int statusOf(Action action) {
    try {
      action();
    } catch (const ProcessEnded& end) {
      return end.status;
    }
    return -1;
  }

  StringSink m_Output;
  StringSink m_Error;
};

} // namespace messages
