// SPDX-License-Identifier: Apache-2.0
//
// For test programs whose subjects live in regions. At the end every region must be gone, or the
// session ends the program with an internal error: a forgotten region fails the suite.

#include "alloclib/interface/session.h"

#include <gtest/gtest.h>

int main(int argc, char** argv) {
  testing::InitGoogleTest(&argc, argv);
  const alloclib::Session session;
  return RUN_ALL_TESTS();
}
