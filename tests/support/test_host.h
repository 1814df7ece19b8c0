// SPDX-License-Identifier: Apache-2.0
//
// What tests need of the host they run on, where hosts differ in it.

#pragma once

#include <cstddef>

namespace testsupport {

// The local time of the process from now on, as TZ names it; null for that of the machine.
void setTimeZone(const char* name);

// A variable of the environment; null takes it away.
void setEnvironment(const char* name, const char* value);

// The folder for temporaries, in UTF-8, as the host's users name it; null for that of the machine.
void setTemporaryPlace(const char* folder);

// Whether a process with this status, as death tests see it, was ended by std::abort.
bool hasAborted(int status);

// Address space without memory; null if the host has not so much of it.
void* takeAddresses(size_t size);
void giveAddressesBack(void* addresses, size_t size);

} // namespace testsupport
