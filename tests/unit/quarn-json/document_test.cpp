// SPDX-License-Identifier: Apache-2.0
//
// The lines of the document, and the commas between them.
#include "quarn-json/document.h"

#include "tests/support/faulty_host.h"
#include "tests/support/memory_host.h"

#include <gtest/gtest.h>
#include <nlohmann/json.hpp>

namespace quarn_json {

namespace {

std::string textOf(Document& document) {
  std::string text;
  EXPECT_EQ(document.finish([&text](std::string_view piece) { text += piece; }), 0);
  return text;
}

// Rows of more than half of what is kept in memory.
void putLargeRows(Document& document, int count) {
  document.startLibrary();
  document.startList("members");
  for (int i = 0; i < count; ++i)
    document.putRow(std::string(Document::MostInMemory / 2 + 1, static_cast<char>('a' + i)));
  document.endList();
  document.endLibrary();
}

TEST(Document, HasALineForEachFieldAndRow) {
  testsupport::MemoryHost host;
  Document document(host);
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
  EXPECT_EQ(textOf(document), "{\n  \"formatVersion\": 1,\n  \"libraries\": [\n" + library + ",\n" +
                                  other + "\n  ]\n}\n");
}

TEST(Document, KeepsInAFileWhatIsTooMuchForTheMemory) {
  testsupport::MemoryHost host;
  {
    Document document(host);
    putLargeRows(document, 5);
    EXPECT_EQ(host.openHandles(), 1u);
    const Json whole = Json::parse(textOf(document));
    const Json& rows = whole.at("libraries").at(0).at("members");
    ASSERT_EQ(rows.size(), 5u);
    EXPECT_EQ(rows.at(0), std::string(Document::MostInMemory / 2 + 1, 'a'));
    EXPECT_EQ(rows.at(4), std::string(Document::MostInMemory / 2 + 1, 'e'));
    EXPECT_NE(document.getFileName(), "");
  }
  EXPECT_EQ(host.openHandles(), 0u);
  EXPECT_EQ(host.getNames().size(), 0u);
}

TEST(Document, HandsOutNothingWhereItCouldNotBeKept) {
  testsupport::MemoryHost host;
  testsupport::FaultyHost faulty(host);
  faulty.failCall(1, ENOSPC);
  Document document(faulty);
  putLargeRows(document, 5);
  EXPECT_EQ(document.finish([](std::string_view) { ADD_FAILURE(); }), ENOSPC);
}

} // namespace

} // namespace quarn_json
