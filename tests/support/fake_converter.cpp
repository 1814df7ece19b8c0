// SPDX-License-Identifier: Apache-2.0
//
// A path converter for tests, as good or as bad as the environment variable FAKE_CONVERTER says.
// Its names lie on drive W. What hangs here doesn't hang for ever, so that a test that fails leaves
// nothing behind.
#include <chrono>
#include <cstdio>
#include <cstdlib>
#include <iostream>
#include <map>
#include <string>
#include <thread>
#include <windows.h>

namespace {

using std::chrono::milliseconds;
using std::chrono::seconds;

void hang() {
  std::this_thread::sleep_for(seconds(60));
}

void say(const std::string& text) {
  std::fwrite(text.data(), 1, text.size(), stdout);
  std::fflush(stdout);
}

std::string hostsName(const std::string& name) {
  std::string answer = "W:";
  for (const char character : name) {
    if (character == '*') {
      answer += "\xEF\x80\xAA";
    } else if (character == '?') {
      answer += "\xEF\x80\xBF";
    } else {
      answer += character == '/' ? '\\' : character;
    }
  }
  return answer;
}

void answer(const std::string& name) {
  say(hostsName(name) + "\n"); // with CR: the stream is one of text
}

void answerLate(const std::string& name) {
  std::this_thread::sleep_for(milliseconds(300));
  answer(name);
}

void answerWithoutLineEnd(const std::string& name) {
  say(hostsName(name));
}

void answerHalfAndEnd(const std::string& name) {
  say(hostsName(name).substr(0, 3));
  std::_Exit(0);
}

void answerInPieces(const std::string& name) {
  say(hostsName(name));
  std::this_thread::sleep_for(milliseconds(50));
  say("\n");
}

void answer300Bytes(const std::string&) {
  say(std::string(299, 'x') + "\n");
}

void answerWithoutEnd(const std::string&) {
  while (std::ferror(stdout) == 0)
    say(std::string(1000, 'x'));
}

void answerTwice(const std::string& name) {
  say(hostsName(name) + "\nW:\\second\n");
}

// Two names, and then it is gone.
void answerTwoNames(const std::string& name) {
  static int count = 0;
  if (++count > 2) std::_Exit(3);
  answer(name);
}

void endAtOnce(const std::string&) {
  std::_Exit(3);
}

void complain(const std::string& name) {
  std::fputs("a complaint\n", stderr);
  std::fflush(stderr);
  answer(name);
}

void answerProcessId(const std::string&) {
  say(std::to_string(GetCurrentProcessId()) + "\n");
}

// Stays when the other end of its input is gone, as a converter that hangs does.
void answerProcessIdAndHang(const std::string& name) {
  answerProcessId(name);
  hang();
}

void answerCommandLine(const std::string&) {
  say(std::string(GetCommandLineA()) + "\n");
}

// The name is the number of a handle in the other process.
void answerWhetherHandleIsOpen(const std::string& name) {
  const auto handle = reinterpret_cast<HANDLE>(std::stoull(name));
  DWORD flags = 0;
  say(GetHandleInformation(handle, &flags) ? "open\n" : "closed\n");
}

const std::map<std::string, void (*)(const std::string&)> Ways = {
    {"", answer},
    {"late", answerLate},
    {"without line end", answerWithoutLineEnd},
    {"half", answerHalfAndEnd},
    {"in pieces", answerInPieces},
    {"300 bytes", answer300Bytes},
    {"without end", answerWithoutEnd},
    {"twice", answerTwice},
    {"two names", answerTwoNames},
    {"no name", endAtOnce},
    {"complaint", complain},
    {"process", answerProcessId},
    {"process and hang", answerProcessIdAndHang},
    {"command line", answerCommandLine},
    {"handle", answerWhetherHandleIsOpen},
    {"hang", [](const std::string&) { hang(); }},
};

} // namespace

int main() {
  const char* way = std::getenv("FAKE_CONVERTER");
  const std::string wayName = way == nullptr ? "" : way;
  if (wayName == "deaf") hang();
  const auto found = Ways.find(wayName);
  if (found == Ways.end()) return 2;
  for (std::string name; std::getline(std::cin, name);)
    found->second(name);
  return 0;
}
