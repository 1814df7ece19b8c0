// SPDX-License-Identifier: Apache-2.0
//
// The two texts about a parsed command line: the command line itself, written again from the
// values, and the dump of all tables for whoever debugs them. Both are made when the parsing is
// over, from the tables and values alone, and go into a sink of the caller; neither changes
// anything.

#pragma once

#include <cstddef>

namespace tabledrivenparser {

class Parser;
class TextSink;

/// Writes the options that differ from their defaults, in the order of their ids, then the
/// positional words; a sink with QuoteMode::Blanks and the separator ' ' makes it a command line.
/// Ends with a NUL if it fits. Returns the size needed, the NUL included.
size_t printCommandLine(const Parser& parser, TextSink& sink);

/// Writes each id with its type and value, and below it each of its rows. A sink with
/// QuoteMode::Never and the separator ',' is meant. Ends and returns like printCommandLine.
size_t dumpTables(const Parser& parser, TextSink& sink);

} // namespace tabledrivenparser
