// SPDX-License-Identifier: Apache-2.0
//
// What one run is to do: the command line as one record. Nothing else holds a letter's value.
#pragma once

#include "quarn/settings.h"

#include <cstdint>
#include <string>
#include <vector>

namespace quarn_ar {

// The value of each is its letter.
enum class Operation : char {
  None = 0,
  Delete = 'd',
  Move = 'm',
  Print = 'p',
  Append = 'q',
  Replace = 'r',
  Index = 's',
  List = 't',
  Extract = 'x',
};

enum class Place : uint8_t { End, Before, After };

struct Request {
  Operation operation = Operation::None;
  Place place = Place::End;
  std::string placeName;    // of the member that the place is told by
  uint32_t instance = 0;    // of the members of a name the so-manieth, from 1; 0 if nobody asked
  bool fullNames = false;   // names keep their folders
  bool shortNames = false;  // names are cut to the characters that a header has room for
  bool realNumbers = false; // date, owner and mode of a file go into its member
  bool newerOnly = false;   // a member is replaced by a newer file only
  support::PathStyle pathStyle = support::PathStyle_Posix; // of the words that name files
  quarn::Settings settings; // the rest, which the libraries and the driver's road understand
  std::vector<std::string> archives; // several for an index alone
  std::vector<std::string> files;
};

} // namespace quarn_ar
