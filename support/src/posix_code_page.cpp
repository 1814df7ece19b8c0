// SPDX-License-Identifier: Apache-2.0
//
// Code pages by way of iconv, which knows them by names. The name is "CP" and the number, but for
// the pages below, which are known by the names of their standards.
//
// The C library reads its converters from shared objects of the machine when they are asked for.
// For a program that is linked statically these may belong to another build of the library, which
// is known to crash, as one does that is damaged. So each is first tried in a process apart; a
// converter that brings this down is one that the host lacks.

#include "support/interface/code_page.h"

#include <algorithm>
#include <array>
#include <cerrno>
#include <csignal>
#include <cstdint>
#include <cstdio>
#include <iconv.h>
#include <new>
#include <sys/mman.h>
#include <sys/wait.h>
#include <unistd.h>

namespace support {

namespace {

struct PageName {
  uint32_t number;
  const char* name;
};

constexpr PageName PageNames[] = {
    {10000, "MACINTOSH"}, {20127, "ASCII"},  {20866, "KOI8-R"},
    {20936, "GB2312"},    {21866, "KOI8-U"}, {51932, "EUC-JP"},
    {51936, "GB2312"},    {51949, "EUC-KR"}, {54936, "GB18030"},
};

// ISO 8859, by its parts.
constexpr uint32_t FirstPart = 28591;
constexpr uint32_t LastPart = 28605;

struct NameText {
  std::array<char, 24> text{};
};

NameText nameOf(uint32_t number) {
  NameText name;
  const auto* const row = std::find_if(std::begin(PageNames), std::end(PageNames),
                                       [number](const PageName& r) { return r.number == number; });
  const bool isPart = number >= FirstPart && number <= LastPart;
  if (row != std::end(PageNames)) {
    std::snprintf(name.text.data(), name.text.size(), "%s", row->name);
  } else if (isPart) {
    std::snprintf(name.text.data(), name.text.size(), "ISO-8859-%u", number - FirstPart + 1);
  } else {
    std::snprintf(name.text.data(), name.text.size(), "CP%u", number);
  }
  return name;
}

// For what a broken converter raises, and for one that never comes back. Nothing is left behind: no
// memory image on the disk, and no words on the terminal.
constexpr int EndingSignals[] = {SIGABRT, SIGALRM, SIGBUS, SIGFPE,
                                 SIGILL,  SIGSEGV, SIGSYS, SIGTRAP};
constexpr unsigned LongestTrial = 10; // seconds

[[noreturn]] void endTrial(int) {
  _exit(0);
}

// Null if there is none.
void* openByName(const char* name) {
  // A number stands for a failure, of a type that is a pointer elsewhere.
  iconv_t converter = iconv_open(name, "UTF-8");
  return reinterpret_cast<intptr_t>(converter) == -1 ? nullptr : converter;
}

bool canConvert(const char* name) {
  void* const converter = openByName(name);
  if (converter == nullptr) return false;
  std::array<char, 4> text{'a', '\xE3', '\x82', '\xA2'};
  std::array<char, 64> bytes{};
  char* in = text.data();
  char* out = bytes.data();
  size_t inLeft = text.size();
  size_t outLeft = bytes.size();
  // Whatever it answers: that it comes back is enough here.
  static_cast<void>(iconv(converter, &in, &inLeft, &out, &outLeft));
  return true;
}

// In the child.
[[noreturn]] void runTrial(const char* name, volatile bool& isPassed) {
  for (const int number : EndingSignals)
    std::signal(number, endTrial);
  ::close(STDOUT_FILENO);
  ::close(STDERR_FILENO);
  alarm(LongestTrial);
  isPassed = canConvert(name);
  endTrial(0);
}

// The answer is in memory that both share. The child's status would be lost for a tool that was
// started with SIGCHLD ignored.
bool passesTrial(const char* name) {
  void* const shared =
      mmap(nullptr, sizeof(bool), PROT_READ | PROT_WRITE, MAP_SHARED | MAP_ANONYMOUS, -1, 0);
  if (shared == MAP_FAILED) return false;
  auto* const isPassed = new (shared) volatile bool(false);
  const pid_t child = fork();
  if (child == 0) runTrial(name, *isPassed);
  while (child > 0 && waitpid(child, nullptr, 0) < 0 && errno == EINTR) {
  }
  const bool result = *isPassed;
  munmap(shared, sizeof(bool));
  return result;
}

} // namespace

bool CodePage::openConverter(uint32_t number) {
  const NameText name = nameOf(number);
  if (!passesTrial(name.text.data())) return false;
  m_Converter = openByName(name.text.data());
  return m_Converter != nullptr;
}

void CodePage::closeConverter() const {
  iconv_close(m_Converter);
}

size_t CodePage::encode(std::string_view character, Encoded bytes) const {
  std::array<char, 4> copy{};
  std::copy(character.begin(), character.end(), copy.begin());
  char* in = copy.data();
  char* out = bytes.data();
  size_t inLeft = character.size();
  size_t outLeft = bytes.size();
  // Without a text it goes back to its first state, and before that gives out what it kept back to
  // see whether an accent follows. An answer above 0 tells of characters that it has replaced.
  iconv(m_Converter, nullptr, nullptr, nullptr, nullptr);
  if (iconv(m_Converter, &in, &inLeft, &out, &outLeft) != 0) return 0;
  if (iconv(m_Converter, nullptr, nullptr, &out, &outLeft) != 0) return 0;
  return bytes.size() - outLeft;
}

} // namespace support
