// SPDX-License-Identifier: Apache-2.0
//
// The operations, each as a build system means it. Where `quarn` has an action of the same letter,
// they differ in what a word means (one member, by its exact name), and in that nothing but a file
// goes into a member: an archive among the files is a member like any other.
#pragma once

#include "quarn-ar/request.h"
#include "quarn/run.h"

#include <cstdint>
#include <optional>
#include <unordered_set>

namespace quarn_ar {

// Does the operation of the request. What went wrong has been reported.
void doOperation(quarn::Run& run, const Request& request);

// r and q.
void insertFiles(quarn::Run& run, const Request& request);

// Where members go that have no place in the list yet, or are about to lose it: the number of
// members in front of them, without those given. Nothing after a report.
[[nodiscard]] std::optional<uint32_t>
findPlace(const arlib::Archive& archive, const Request& request,
          const std::unordered_set<const arlib::ArchiveMember*>& without);

} // namespace quarn_ar
