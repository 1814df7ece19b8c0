# Sourced by every transcript. QUARN_EXAMPLES is the folder of sample objects; the tool under test
# is first on the PATH; each transcript runs in an empty folder of its own.
umask 022
export TZ=UTC LC_ALL=C
# Without a leak checker's own exit status and words getting between.
export ASAN_OPTIONS=detect_leaks=0:${ASAN_OPTIONS:-}

# file NAME TEXT: a file with exactly this text, dated 2001-09-09 01:46:40.
file() {
  printf '%s' "$2" > "$1"
  touch -d @1000000000 "$1"
}

# bytes FILE: every byte of a file, to be compared.
bytes() {
  od -A d -t x1z -v "$1"
}

# both COMMAND...: shows stdout and stderr apart, and the status.
both() {
  local status=0
  "$@" > "$CRAMTMP/stdout" 2> "$CRAMTMP/stderr" || status=$?
  sed 's/^/out: /' "$CRAMTMP/stdout"
  if [ -n "$(tail -c 1 "$CRAMTMP/stdout")" ]; then echo; fi
  sed 's/^/err: /' "$CRAMTMP/stderr"
  echo "status $status"
}

# header NAME DATE UID GID MODE SIZE: one member header as it stands in a file.
header() {
  printf '%-16s%-12s%-6s%-6s%-8s%-10s`\n' "$@"
}

# library NAME FILE...: an archive of these files made by the tool, the same on every day.
library() {
  quarn --create --normalise=1000000000 --diag_suppress=L6875 "$@"
}

# magic: how each archive begins.
magic() {
  printf '!<arch>\n'
}

# member NAME_FIELD TEXT: a whole member as it stands in a file: header, text, padding.
member() {
  header "$1" 0 0 0 100644 "${#2}"
  printf '%s' "$2"
  if (( ${#2} % 2 )); then echo; fi
}

# words NUMBER...: 32-bit numbers as a symbol table holds them, the high byte first.
words() {
  local number
  for number in "$@"; do
    printf '%b' "$(printf '\\x%02x' $(( number >> 24 & 255 )) $(( number >> 16 & 255 )) \
      $(( number >> 8 & 255 )) $(( number & 255 )))"
  done
}

# asNobody ARGUMENT...: the tool run by somebody who owns nothing here, or simply by a user who is not
# root. The folders that lead to the tool may be closed to others, so it is started through a descriptor.
asNobody() {
  if [ "$(id -u)" != 0 ]; then quarn "$@"; return; fi
  setpriv --reuid=65534 --regid=65534 --clear-groups -- /proc/self/fd/9 "$@" 9< "$(command -v quarn)"
}

# table NAMES OFFSET...: a symbol table as it stands in a file; the names are a printf format that
# writes the end of each name as \0.
table() {
  local names=$1 size
  shift
  size=$(( 4 + 4 * $# + $(printf "$names" | wc -c) ))
  header / 0 0 0 0 "$size"
  words $# "$@"
  printf "$names"
  if (( size % 2 )); then echo; fi
}
