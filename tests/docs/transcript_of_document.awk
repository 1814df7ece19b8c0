# SPDX-License-Identifier: Apache-2.0
#
# Makes a transcript of a document. A fenced block that begins with a prompt is a session; one behind a
# line that ends with a name and a colon (`Makefile`:) is that file. A comment <!-- $ ... --> is a
# command that readers don't see.

/^<!-- \$ .* -->$/ { print "  " substr($0, 6, length($0) - 9); next }
/^```/ && !inBlock { inBlock = 1; isFirst = 1; next }
/^```$/ {
  if (isFile) print "  > END-OF-FILE"
  if (isFile || isSession) print ""
  inBlock = isFile = isSession = isFirst = 0
  name = ""
  next
}
inBlock && isFirst {
  isFirst = 0
  isSession = /^\$ /
  isFile = !isSession && name != ""
  if (isFile) print "  $ cat > " name " << 'END-OF-FILE'"
}
isSession { print "  " $0; if (/^\$ /) ++count }
isFile { print "  > " $0 }
!inBlock && match($0, /`[^` ]+`:$/) { name = substr($0, RSTART + 1, RLENGTH - 3); next }
!inBlock && NF { name = "" }
END { if (count == 0) { print FILENAME ": no session" > "/dev/stderr"; exit 1 } }
