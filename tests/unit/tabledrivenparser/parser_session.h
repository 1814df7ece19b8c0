// SPDX-License-Identifier: Apache-2.0
//
// A parser with everything round it: files in memory, a reporter that keeps each message as the
// line that a user would read, and a listener that writes down what it hears. Tests compare those
// lines, so that each text and each argument's place in it is part of what they hold.

#pragma once

#include "alloclib/interface/region.h"
#include "alloclib/interface/region_objects.h"
#include "tabledrivenparser/interface/listener.h"
#include "tabledrivenparser/interface/parser.h"
#include "tabledrivenparser/interface/reporter.h"
#include "tabledrivenparser/interface/via_file_reader.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <functional>
#include <map>
#include <memory>
#include <string>
#include <vector>

namespace tabledrivenparser {

using Lines = std::vector<std::string>;

// A region of the test's own; the region system starts with the first one.
alloclib::RegionOwner makeRegion();

// Keeps "fatal: Unrecognized option '--x'." and the like.
class RecordingReporter final : public Reporter {
public:
  void reportOptionMessage(ReportLevel level, OptionMessage message,
                           std::span<const OptionMessageArgument> arguments) override;

  Lines m_Lines;
};

// Files by name. The named one can fail at a read, at the close, or both.
class MemoryFiles final : public ViaFileReader {
public:
  void* open(const char* name) override;
  ptrdiff_t read(void* file, char* buffer, size_t size) override;
  bool close(void* file) override;

  std::map<std::string, std::string> m_Contents;
  std::string m_FailingClose;       // the name of a file
  std::string m_FailingRead;        // the name of a file
  size_t m_PieceSize = 1024 * 1024; // at most so many bytes a read
  int m_OpenCount = 0;              // files that are open now

private:
  struct OpenFile {
    std::string name;
    size_t position = 0;
  };
};

// Calls its function and keeps what it was asked.
class RecordingListener final : public Listener {
public:
  bool onOption(Parser& parser, uint32_t id, const Value& value) override;

  std::function<bool(Parser&, uint32_t, const Value&)> m_Answer;
  Lines m_Lines; // "3=text" or "3=17"
};

class ParserSession {
public:
  ParserSession(const OptionTable& table, std::span<const ValueDefinition> definitions);

  // Makes the parser, over the records as they are by then, at the first use.
  Parser& parser();
  // Feeds the words as a command line.
  void parse(std::initializer_list<const char*> words);
  void parse(const Lines& words);

  const Lines& getReports() const { return m_Reporter.m_Lines; }
  // The elements of a list of strings.
  Lines texts(uint32_t id);
  std::vector<long long> numbers(uint32_t id);
  // The report of the command line as printed by --show_cmdline.
  std::string commandLine();
  std::string dump();

  RecordingReporter m_Reporter;
  MemoryFiles m_Files;
  RecordingListener m_Listener;
  std::vector<ValueRecord> m_Records;

private:
  const OptionTable& m_Options;
  std::span<const ValueDefinition> m_DefinitionTable;
  alloclib::RegionOwner m_Region;
  std::unique_ptr<Parser> m_Parser;
  std::vector<std::unique_ptr<std::string>> m_Words;
};

} // namespace tabledrivenparser
