// SPDX-License-Identifier: Apache-2.0
//
// Manual pages as tests read them: the source, where marks tell an option or a token from a word,
// and the text as a reader sees it, which mandoc makes.
#pragma once

#include <regex>
#include <set>
#include <string>
#include <string_view>
#include <vector>

namespace manuals {

using Names = std::set<std::string>;
using Lines = std::vector<std::string>;

// A file of the tree, by its path from the root.
std::string contentsOf(const std::string& path);

// The source of a page without its comments, by its file name.
Lines sourceOf(const std::string& page);

// The page in plain text, in lines as long as its paragraphs.
Lines renderedOf(const std::string& page);

// The lines of a section (".Sh") or subsection (".Ss"), up to the next one; there must be some.
Lines linesUnder(const Lines& source, std::string_view heading);

// The lines of these that begin an item of a list.
Lines itemsIn(Lines lines);

// The macro lines behind the first line that is this one: a list that stands in a sentence.
Lines marksBehind(const Lines& source, std::string_view line);

// The options that a line of source marks, without dashes. Letters that stand together are taken
// apart.
Names optionsIn(std::string_view line);

// The words that a line of source marks with a macro such as "Li" or "Cm", with escapes resolved.
Names wordsMarked(std::string_view line, std::string_view macro);

void add(Names& names, const Names& more);

// The first line of a message's text as a pattern of what a page may have in the place of its
// arguments.
std::regex patternOf(std::string_view text);

} // namespace manuals
