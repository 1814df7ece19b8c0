// SPDX-License-Identifier: Apache-2.0
//
// The lines of the document, and the commas between them.
#include "quarn-json/document.h"

#include <gtest/gtest.h>
#include <nlohmann/json.hpp>

namespace quarn_json {

namespace {

TEST(Document, HasALineForEachFieldAndRow) {
  Document document;
  for (const char* name : {"a.a", "b.a"}) {
    document.startLibrary();
    document.putField("file", name);
    document.startList("members");
    document.putRow({{"name", "x.o"}, {"size", 1}});
    document.putRow({{"name", "y.o"}, {"size", 2}});
    document.endList();
    document.startList("symbols");
    document.endList();
    document.endLibrary();
  }
  const std::string library = R"(    {
      "file": "a.a",
      "members": [
        {"name":"x.o","size":1},
        {"name":"y.o","size":2}
      ],
      "symbols": [
      ]
    })";
  std::string other = library;
  other.replace(other.find("a.a"), 1, "b");
  EXPECT_EQ(document.finish(), "{\n  \"formatVersion\": 1,\n  \"libraries\": [\n" + library +
                                   ",\n" + other + "\n  ]\n}\n");
}

} // namespace

} // namespace quarn_json
