// SPDX-License-Identifier: Apache-2.0
//
// Linked against libraries that the archiver under test has made.
#include <cstdio>
#include <string>

extern "C" int one(void);
extern "C" int two(void);
std::string shape(int corners);

int main() {
  std::printf("%s\n", shape(one() + two()).c_str());
}
