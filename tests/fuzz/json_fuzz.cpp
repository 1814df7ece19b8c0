// SPDX-License-Identifier: Apache-2.0
//
// Any bytes as an archive, and as the only member of one, shown by quarn-json: out comes a whole
// document of JSON, the same each time, or a complaint and no document. Who puts the document down
// again as its values are has the same values.
#include "alloclib/interface/region_objects.h"
#include "messages/interface/messages.h"
#include "quarn-json/json_main.h"
#include "quarn-json/json_names.h"
#include "quarn/reporting.h"
#include "tests/fuzz/memory_bound.h"
#include "tests/fuzz/silence.h"
#include "tests/support/archive_builder.h"
#include "tests/support/memory_host.h"

#include <nlohmann/json.hpp>

#include <array>
#include <cstdlib>
#include <string>
#include <string_view>
#include <utility>

namespace {

using quarn_json::Json;

void expect(bool condition) {
  if (!condition) std::abort();
}

class Collector final : public messages::OutputSink {
public:
  int write(std::string_view bytes) override {
    m_Text += bytes;
    return 0;
  }
  [[nodiscard]] std::string take() { return std::exchange(m_Text, {}); }

private:
  std::string m_Text;
};

Collector& collector() {
  static Collector output;
  return output;
}

bool initialise() {
  fuzzing::silenceMessages();
  messages::setOutputSinks(&collector(), &fuzzing::silence);
  return true;
}

// Empty after a complaint.
std::string documentOf(support::Host& host, const char* option) {
  const std::array<const char*, 4> arguments = {"quarn-json", "lib.a", option, nullptr};
  const alloclib::RegionOwner memory(alloclib::RegionGeneral::Create(1024, "fuzz"));
  messages::initialise();
  const int count = option == nullptr ? 2 : 3;
  quarn_json::jsonMain(count, arguments.data(), "quarn-json", host, *memory);
  messages::flushAll();
  std::string text = collector().take();
  expect(quarn::hasErrors() == text.empty());
  return text;
}

// The text is for readers; the bytes come with it where it can't be them.
void checkName(const Json& row) {
  const std::string name = row.at("name").get<std::string>();
  expect(quarn_json::isUtf8(name));
  const auto bytes = row.find("nameBytes");
  if (bytes == row.end()) return;
  const std::string digits = bytes->get<std::string>();
  expect(digits.size() % 2 == 0);
  expect(digits.find_first_not_of("0123456789abcdef") == std::string::npos);
}

void check(const std::string& text) {
  const Json document = Json::parse(text, nullptr, false);
  expect(!document.is_discarded() && document.at("libraries").size() == 1);
  expect(Json::parse(quarn_json::lineOf(document), nullptr, false) == document);
  const Json& library = document.at("libraries").at(0);
  const size_t memberCount = library.at("members").size();
  for (const Json& member : library.at("members"))
    checkName(member);
  for (const Json& symbol : library.at("symbols")) {
    checkName(symbol);
    expect(symbol.at("member").get<size_t>() < memberCount);
  }
}

void show(std::string_view archive) {
  for (const char* option : {static_cast<const char*>(nullptr), "--qobix_buildattr"}) {
    testsupport::MemoryHost host;
    host.addFile("lib.a", archive);
    const std::string text = documentOf(host, option);
    expect(host.openHandles() == 0 && host.getNames().size() == 1);
    expect(documentOf(host, option) == text);
    if (!text.empty()) check(text);
  }
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size) {
  static const bool IsInitialised = initialise();
  if (!IsInitialised) return 0;
  const fuzzing::MemoryBound bound(size);
  const std::string_view bytes(reinterpret_cast<const char*>(data), size);
  show(bytes);
  show(testsupport::archive().member("a.o", bytes).bytes());
  return 0;
}
