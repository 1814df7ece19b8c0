// SPDX-License-Identifier: Apache-2.0
//
// An object's names, sizes and attributes are found on two roads: in its tables, and in the model
// that is made of them. Whatever the object, both must come to the same.
#pragma once

#include <string>

namespace testsupport {

// Takes both roads, with a handler that refuses to go on and with one that goes on wherever there
// is a way: the answers, the reports and what is found must agree.
void expectSameOnBothRoads(const std::string& object);

} // namespace testsupport
