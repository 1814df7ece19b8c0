// SPDX-License-Identifier: Apache-2.0
//
// quarn-json on a host in memory, as the driver's tests have it, and its document as values.
#pragma once

#include "quarn-json/json_main.h"
#include "quarn-json/json_names.h"
#include "tests/unit/quarn/driver_fixture.h"

#include <nlohmann/json.hpp>

namespace quarn_json {

using quarn::RunOutcome;
using quarn::Words;
using testing::HasSubstr;
using testing::IsEmpty;

class JsonTest : public quarn::DriverTest {
protected:
  RunOutcome json(const Words& words) { return runWork(jsonMain, "quarn-json", words); }

  // What a run without a complaint says of the libraries.
  Json librariesOf(const Words& words) {
    const RunOutcome outcome = json(words);
    EXPECT_EQ(outcome.status, 0);
    EXPECT_EQ(outcome.errors, "");
    const Json document = Json::parse(outcome.output);
    EXPECT_EQ(document.at("formatVersion"), 1);
    return document.at("libraries");
  }
  Json libraryOf(const Words& words) { return librariesOf(words).at(0); }

  // The only member of a library.
  Json memberOf(const testsupport::ArchiveBuilder& library) {
    m_Host.addFile("lib.a", library.bytes());
    return libraryOf({"lib.a"}).at("members").at(0);
  }
};

} // namespace quarn_json
