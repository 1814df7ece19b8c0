Inserting puts files at the end, or in the place of members of the same name.

  $ . "$TESTDIR/setup.sh"
  $ insert() { quarn -r --normalise=1000000000 --diag_suppress=L6875 "$@"; }
  $ file a.txt a; file b.txt b; file c.txt c

A new archive is announced, on the side of the diagnostics.

  $ both insert -v lib.a a.txt b.txt
  out: a - a.txt
  out: a - b.txt
  err: Creating archive 'lib.a'
  status 0
  $ quarn -t lib.a
  a.txt
  b.txt

A member of the name of a file is replaced in its place, others come to the end.

  $ file a.txt 'a, longer'
  $ both insert -v lib.a c.txt a.txt
  out: a - c.txt
  out: r - a.txt
  status 0
  $ quarn -tv lib.a
  rw-r--r--     0/     0      9 Sep 09 01:46 2001 a.txt (offset     72)
  rw-r--r--     0/     0      1 Sep 09 01:46 2001 b.txt (offset    142)
  rw-r--r--     0/     0      1 Sep 09 01:46 2001 c.txt (offset    204)
  $ quarn -p lib.a a.txt; echo
  a, longer

-q is the same.

  $ file b.txt 'b2'
  $ quarn -qv --normalise=1 --diag_suppress=L6875 lib.a b.txt
  r - b.txt
  $ quarn -t lib.a
  a.txt
  b.txt
  c.txt

Without files the archive is written as it was.

  $ cp lib.a before.a
  $ both quarn -r lib.a
  status 0
  $ cmp lib.a before.a

A file that is not there is an error; the others are looked at, but nothing is written.

  $ file d.txt d
  $ both insert -v lib.a none.txt d.txt nothing.txt
  out: a - d.txt
  err: Error: L6833E: File 'none.txt' does not exist
  err: Error: L6833E: File 'nothing.txt' does not exist
  status 1
  $ cmp lib.a before.a
  $ both insert -v new.a none.txt d.txt
  out: a - d.txt
  err: Error: L6833E: File 'none.txt' does not exist
  status 1
  $ ls *.a
  before.a
  lib.a

A file named twice is two members. On a later run each word takes the first one that no word has taken.

  $ insert -v twice.a -c d.txt d.txt
  a - d.txt
  a - d.txt
  $ quarn -t twice.a
  d.txt
  d.txt
  $ file d.txt d2
  $ insert -v twice.a d.txt
  r - d.txt
  $ quarn -tv twice.a
  rw-r--r--     0/     0      2 Sep 09 01:46 2001 d.txt (offset     72)
  rw-r--r--     0/     0      1 Sep 09 01:46 2001 d.txt (offset    134)
  $ insert -v twice.a d.txt d.txt d.txt
  r - d.txt
  r - d.txt
  a - d.txt
  $ quarn -t twice.a
  d.txt
  d.txt
  d.txt

The name of a member is the last part of the file's name.

  $ mkdir -p sub/deep; file sub/deep/e.txt e; file ./g.txt g
  $ insert -v -c parts.a sub/deep/e.txt ./g.txt "$PWD/a.txt"
  a - e.txt
  a - g.txt
  a - a.txt
  $ quarn -t parts.a
  e.txt
  g.txt
  a.txt

Names are the same in either case of the letters, and the member keeps its own.

  $ file Foo.o 1; file foo.o 22; file FOO.o 333
  $ insert -c case.a Foo.o
  $ insert -v case.a foo.o
  r - Foo.o
  $ quarn -tv case.a
  rw-r--r--     0/     0      2 Sep 09 01:46 2001 Foo.o (offset     72)
  $ insert case.a foo.o FOO.o
  $ quarn -tv case.a
  rw-r--r--     0/     0      2 Sep 09 01:46 2001 Foo.o (offset     72)
  rw-r--r--     0/     0      3 Sep 09 01:46 2001 FOO.o (offset    134)

Of several names that differ only in case the first in the archive is replaced.

  $ { magic; member FOO.o/ a; member foo.o/ b; } > cases.a
  $ insert -v cases.a foo.o
  r - FOO.o
  $ quarn -t cases.a; quarn -p cases.a; echo
  FOO.o
  foo.o
  22b

The warning on a member that is not ELF comes once a run, for the first one, with the verbose line behind it.

  $ both quarn -rv -c --normalise=1 warn.a a.txt b.txt
  out: a - a.txt
  out: a - b.txt
  err: Warning: L6875W: Adding non-ELF object 'a.txt' to archive 'warn.a'
  status 0
  $ cp "$QUARN_EXAMPLES/matrix_plain.o" m.o
  $ both quarn -rv --normalise=1 warn.a m.o b.txt a.txt
  out: a - m.o
  out: r - b.txt
  out: r - a.txt
  err: Warning: L6875W: Adding non-ELF object 'b.txt' to archive 'warn.a'
  status 0
  $ both quarn -rv --normalise=1 warn.a m.o
  out: r - m.o
  status 0

It can be silenced, lowered, or made an error, which keeps the old archive.

  $ both quarn -r --diag_suppress=L6875 warn.a a.txt
  status 0
  $ both quarn -r --diag_remark=L6875 warn.a a.txt
  err: Adding non-ELF object 'a.txt' to archive 'warn.a'
  status 0
  $ cp warn.a before.a
  $ both quarn -rv --diag_error=L6875 warn.a a.txt b.txt
  out: r - a.txt
  out: r - b.txt
  err: Error: L6875W: Adding non-ELF object 'a.txt' to archive 'warn.a'
  status 1
  $ cmp warn.a before.a
  $ both quarn -rv --diag_error=L6875 never.a a.txt
  out: a - a.txt
  err: Error: L6875W: Adding non-ELF object 'a.txt' to archive 'never.a'
  status 1
  $ both quarn --create --diag_error=L6875 warn.a a.txt
  err: Error: L6875W: Adding non-ELF object 'a.txt' to archive 'warn.a'
  status 1
  $ cmp warn.a before.a
  $ ls | grep -v -e txt -e '\.o$'
  before.a
  case.a
  cases.a
  lib.a
  parts.a
  sub
  twice.a
  warn.a
