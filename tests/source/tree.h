// SPDX-License-Identifier: Apache-2.0
//
// The source tree as the tests of its rules read it.
#pragma once

#include <filesystem>
#include <string>
#include <vector>

// Where the tree lies.
std::filesystem::path treeRoot();

// All bytes of a file.
std::string contentsOf(const std::filesystem::path& file);

// The headers and sources of a folder and of those in it, by name.
std::vector<std::filesystem::path> sourcesOf(const std::string& folder);

// The text of C++ without its comments; each literal is empty, or what it says if that is asked
// for.
enum class Literals { Empty, Kept };
std::string codeOf(const std::filesystem::path& file, Literals literals = Literals::Empty);
