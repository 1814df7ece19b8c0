// SPDX-License-Identifier: Apache-2.0
//
// Reads the source tree. What is a comment and what a literal is decided here, line by line, for
// all tests: the house has neither comments of several lines nor raw literals in its sources.
#include "tree.h"

#include <algorithm>
#include <fstream>
#include <iterator>
#include <sstream>
#include <string_view>

namespace {

namespace fs = std::filesystem;

bool isSource(const fs::path& file) {
  return file.extension() == ".h" || file.extension() == ".cpp";
}

// Behind the literal that begins here. A mark between digits is none.
size_t literalEnd(std::string_view line, size_t start) {
  const char mark = line[start];
  for (size_t i = start + 1; i < line.size(); ++i) {
    if (line[i] == '\\')
      ++i;
    else if (line[i] == mark)
      return i + 1;
  }
  return start + 1;
}

std::string codeOfLine(std::string_view line, Literals literals) {
  std::string code;
  for (size_t i = 0; i < line.size();) {
    if (line.substr(i).starts_with("//")) break;
    if (line[i] != '"' && line[i] != '\'') {
      code += line[i++];
      continue;
    }
    const size_t end = literalEnd(line, i);
    code += literals == Literals::Kept ? line.substr(i, end - i) : std::string_view("\"\"");
    i = end;
  }
  return code;
}

} // namespace

fs::path treeRoot() {
  return QUARN_SOURCE_DIR;
}

std::string contentsOf(const fs::path& file) {
  std::ifstream stream(file, std::ios::binary);
  return {std::istreambuf_iterator<char>(stream), {}};
}

std::vector<fs::path> sourcesOf(const std::string& folder) {
  std::vector<fs::path> files;
  for (const auto& entry : fs::recursive_directory_iterator(treeRoot() / folder)) {
    if (entry.is_regular_file() && isSource(entry.path())) files.push_back(entry.path());
  }
  std::sort(files.begin(), files.end());
  return files;
}

std::string codeOf(const fs::path& file, Literals literals) {
  std::istringstream lines(contentsOf(file));
  std::string code;
  for (std::string line; std::getline(lines, line);)
    code += codeOfLine(line, literals) + '\n';
  return code;
}
