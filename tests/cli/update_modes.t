-u replaces what is not newer than the file, --new_files_only what is older.

  $ . "$TESTDIR/setup.sh"
  $ at() { printf '%s' "$3" > "$1"; touch -d "@$2" "$1"; }
  $ insert() { quarn -rv --diag_suppress=L6875 "$@"; }
  $ contents() { quarn -p lib.a; echo; }
  $ at a.o 1000 first
  $ insert -c lib.a a.o
  a - a.o

An older file is left alone, without a word.

  $ at a.o 999 older
  $ both insert -u lib.a a.o
  status 0
  $ both insert --new_files_only lib.a a.o
  status 0
  $ contents
  first

One of the same time is enough for -u.

  $ at a.o 1000 same
  $ both insert --new_files_only lib.a a.o; contents
  status 0
  first
  $ both insert -u lib.a a.o; contents
  out: r - a.o
  status 0
  same

A newer one is enough for both.

  $ at a.o 1001 newer
  $ insert --new_files_only lib.a a.o; contents
  r - a.o
  newer
  $ at a.o 1002 newest
  $ insert -u lib.a a.o; contents
  r - a.o
  newest

--new_files_only wins, in any order.

  $ at a.o 1002 again
  $ insert -u --new_files_only lib.a a.o; contents
  newest
  $ insert --new_files_only -u lib.a a.o; contents
  newest
  $ insert -u lib.a a.o; contents
  r - a.o
  again

Without either every file replaces.

  $ at a.o 5 old
  $ insert lib.a a.o; contents
  r - a.o
  old

Time 0 is no time: the file always replaces.

  $ at a.o 0 zero
  $ insert -u lib.a a.o; contents
  r - a.o
  zero
  $ at a.o 100 hundred; insert lib.a a.o; at a.o 0 zero
  r - a.o
  $ insert --new_files_only lib.a a.o; contents
  r - a.o
  zero

A time that the archive can't hold is an error.

  $ cp lib.a before.a
  $ at a.o -5 before; both insert -u lib.a a.o
  err: Error: L6835E: Reading file 'lib.a' : Value too large for defined data type
  status 1
  $ at a.o 2147483648 after; both insert lib.a a.o
  err: Error: L6835E: Reading file 'lib.a' : Value too large for defined data type
  status 1
  $ at b.o -5 before; both insert lib.a b.o
  err: Error: L6835E: Reading file 'lib.a' : Value too large for defined data type
  status 1
  $ cmp lib.a before.a

New files go in whatever the mode, and one left alone keeps its header too.

  $ at a.o 50 x; insert lib.a a.o; at b.o 10 b
  r - a.o
  $ at a.o 49 x; chmod 600 a.o
  $ insert -u --normalise=7 lib.a a.o b.o
  a - b.o
  $ grep -ao '[ab]\.o/ *[0-9]*' lib.a
  a.o/            50
  b.o/            7

The warning on what is not ELF comes also for a member that is left alone.

  $ both quarn -ruv lib.a a.o
  err: Warning: L6875W: Adding non-ELF object 'a.o' to archive 'lib.a'
  status 0
