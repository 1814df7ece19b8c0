# SPDX-License-Identifier: Apache-2.0
#
# Makes a transcript of the examples of a manual page. An example is a literal display that begins with a
# prompt; a comment that begins with one is a command that readers don't see. In an example each character
# that typesetters change is written as an escape, so that what a reader copies is what was run.

function fail(text) {
  print FILENAME ":" FNR ": " text > "/dev/stderr"
  failed = 1
  exit 1
}

function plain(line) {
  if (line ~ /['`^~]/ || line ~ /(^|[^\\])-/) fail("a character that must be an escape: " line)
  gsub(/\\&/, "", line)
  gsub(/\\-/, "-", line)
  gsub(/\\\(aq/, "'", line)
  gsub(/\\\(ga/, "`", line)
  gsub(/\\\(ha/, "^", line)
  gsub(/\\\(ti/, "~", line)
  gsub(/\\e/, "\001", line)
  if (line ~ /\\/) fail("an escape that is not known: " line)
  gsub(/\001/, "\\", line)
  return line
}

/^\.\\" [$>] / { print "  " substr($0, 5); next }
/^\.Bd -literal/ { isFirst = 1; next }
/^\.Ed/ { isExample = 0; print ""; next }
isFirst { isFirst = 0; isExample = /^\$ / }
isExample { print "  " plain($0); if (/^\$ /) ++count }
END { if (!failed && count == 0) fail("no examples") }
