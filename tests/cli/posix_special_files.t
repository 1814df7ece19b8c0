Pipes and devices are neither archives nor members.

  $ . "$TESTDIR/setup.sh"
  $ file a.o a; library lib.a a.o; cp lib.a before.a
  $ mkdir folder; mkfifo pipe

As the archive: an error, at once.

  $ both timeout 5 quarn -t pipe
  err: Error: L6835E: Reading file 'pipe' : Invalid argument
  status 1
  $ both timeout 5 quarn -rv pipe a.o
  err: Error: L6835E: Reading file 'pipe' : Invalid argument
  status 1
  $ both timeout 5 quarn -s pipe
  err: Error: L6835E: Reading file 'pipe' : Invalid argument
  status 1
  $ both timeout 5 quarn -t /dev/null
  err: Error: L6835E: Reading file '/dev/null' : Invalid argument
  status 1
  $ both timeout 5 quarn -t /dev/zero
  err: Error: L6835E: Reading file '/dev/zero' : Invalid argument
  status 1
  $ both timeout 5 quarn -r /dev/null a.o
  err: Error: L6835E: Reading file '/dev/null' : Invalid argument
  status 1
  $ both timeout 5 quarn -t /dev/stdin < /dev/null
  err: Error: L6835E: Reading file '/dev/stdin' : Invalid argument
  status 1

With --create they are refused when it comes to writing, and stay.

  $ both timeout 5 quarn --create --diag_suppress=L6875 pipe a.o
  err: Error: L6978E: Deleting file 'pipe' : Invalid argument
  status 1
  $ test -d folder && test -p pipe && ls
  a.o
  before.a
  folder
  lib.a
  pipe

As a file to put in: an error for each, the others are looked at, nothing is written.

  $ both timeout 5 quarn -rv lib.a pipe
  err: Error: L6835E: Reading file 'lib.a' : Invalid argument
  status 1
  $ both timeout 5 quarn -rv lib.a /dev/null
  err: Error: L6835E: Reading file 'lib.a' : Invalid argument
  status 1
  $ both timeout 5 quarn -rv --diag_suppress=L6875 lib.a pipe a.o folder
  out: r - a.o
  err: Error: L6835E: Reading file 'lib.a' : Invalid argument
  err: Error: L6835E: Reading file 'lib.a' : Is a directory
  status 1
  $ cmp lib.a before.a

In the place of a member of the same name, too.

  $ mkdir sub; mkdir sub/a.o; mkfifo sub/b.o
  $ both timeout 5 quarn -ruv lib.a sub/a.o sub/b.o
  err: Error: L6835E: Reading file 'lib.a' : Is a directory
  err: Error: L6835E: Reading file 'lib.a' : Invalid argument
  status 1
  $ cmp lib.a before.a
