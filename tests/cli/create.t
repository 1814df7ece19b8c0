--create starts from an empty archive, whatever is there.

  $ . "$TESTDIR/setup.sh"
  $ file a.o a; file b.o b
  $ create() { quarn --create --normalise=1 --diag_suppress=L6875 "$@"; }

No remark is made, neither for a new archive nor for an old one.

  $ both create -v lib.a a.o
  out: a - a.o
  status 0
  $ both create -v lib.a b.o
  out: a - b.o
  status 0
  $ quarn -t lib.a
  b.o

The old file is not looked at.

  $ echo 'no archive at all' > lib.a
  $ both create lib.a a.o
  status 0
  $ quarn -t lib.a
  a.o

Without files it is an error, and what is there stays.

  $ cp lib.a before.a
  $ both quarn --create lib.a
  err: Error: L6980E: No archive members specified with --create
  status 1
  $ both quarn --create --vsn lib.a
  err: Error: L6980E: No archive members specified with --create
  status 1
  $ both quarn --create -n lib.a
  err: Error: L6980E: No archive members specified with --create
  status 1
  $ both quarn --create new.a
  err: Error: L6980E: No archive members specified with --create
  status 1
  $ cmp lib.a before.a

When a file is missing, too.

  $ both create -v lib.a b.o none.o
  out: a - b.o
  err: Error: L6833E: File 'none.o' does not exist
  status 1
  $ cmp lib.a before.a
  $ ls
  a.o
  b.o
  before.a
  lib.a

A pattern without a match is a missing file.

  $ both create lib.a '*.none'
  err: Error: L6833E: File '*.none' does not exist
  status 1

The archive itself, as it was, may be among the files.

  $ both create -v lib.a lib.a b.o
  out: a - a.o
  out: a - b.o
  status 0
  $ quarn -t lib.a
  a.o
  b.o
  $ quarn -p lib.a a.o; echo
  a

--create with -u or -C and other settings is the same.

  $ both create -uv --new_files_only -C -T lib.a a.o
  out: a - a.o
  status 0

Without --create, -c takes the remark away; the remark can't be suppressed otherwise.

  $ quarn -r --diag_suppress=L6875 one.a a.o
  Creating archive 'one.a'
  $ quarn -r --diag_suppress=L6875 -c two.a a.o
  $ quarn -r --diag_suppress=L6875,6873 three.a a.o
  Creating archive 'three.a'
  $ quarn -r --diag_suppress=L6875 --diag_error=L6873 four.a a.o
  Creating archive 'four.a'
  $ ls *.a
  before.a
  four.a
  lib.a
  one.a
  three.a
  two.a
