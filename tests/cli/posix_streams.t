Closed streams, and devices in their place.

  $ . "$TESTDIR/setup.sh"
  $ printf 'one\n' > a.o; printf 'two\n' > b.o; touch -d @1000000000 a.o b.o; library lib.a a.o b.o

A closed stream is no reason to fail; nothing goes where it should not.

  $ quarn -t lib.a >&-; echo $?
  0
  $ quarn -t lib.a none 2>&-; echo $?
  1
  $ quarn -t lib.a none >&- 2>&-; echo $?
  1
  $ quarn -t lib.a none <&- >&- 2>&-; echo $?
  1
  $ quarn -p lib.a >&-; echo $?
  0
  $ quarn --help >&-; echo $?
  0
  $ quarn --version_number >&-; echo $?
  0
  $ quarn --vsn >&- 2>&-; echo $?
  0
  $ quarn -k 2>&-; echo $?
  1
  $ cp lib.a before.a
  $ quarn -rv --diag_suppress=6875 lib.a a.o >&- 2>&- <&-; echo $?
  0
  $ quarn -t lib.a
  a.o
  b.o
  $ quarn -d lib.a none >&- 2>&-; echo $?; quarn -t lib.a
  0
  a.o
  b.o
  $ quarn -rc lib2.a a.o >&- 2>&-; echo $?; quarn -t lib2.a
  0
  a.o
  $ quarn -x lib.a >&- 2>&-; cat a.o b.o
  one
  two

A full device on stdout is told of, and does not harm the archive.

  $ for words in --version_number --vsn --help "-t lib.a"; do quarn $words > /dev/full; echo $?; done
  Error: L6843E: Writing file 'stdout' : No space left on device
  1
  Error: L6843E: Writing file 'stdout' : No space left on device
  1
  Error: L6843E: Writing file 'stdout' : No space left on device
  1
  Error: L6843E: Writing file 'stdout' : No space left on device
  1
  $ cp lib.a before.a; quarn -t -s lib.a > /dev/full 2> /dev/null; cmp lib.a before.a; ls *.a
  before.a
  lib.a
  lib2.a

What can't be told is not done, so that it can be tried again.

  $ quarn -dv lib.a a.o > /dev/full; echo $?; cmp lib.a before.a
  Error: L6843E: Writing file 'stdout' : No space left on device
  1
  $ quarn-ar qv lib.a a.o > /dev/full; echo $?; cmp lib.a before.a
  quarn-ar: Error: L6843E: Writing file 'stdout' : No space left on device
  1

Where nothing can be said, the status says it.

  $ quarn -t lib.a none > /dev/full 2> /dev/full; echo $?
  1
  $ quarn -r lib.a none.o a.o 2> /dev/full; echo $?; cmp lib.a before.a
  1

A reader that is gone before the first line ends a run, whose archive is the old one or the new one.

  $ for words in '-t lib.a' '-p lib.a' '-t -s lib.a' '-rv lib.a b.o'; do
  >   cp before.a lib.a
  >   (sleep 0.1; exec quarn --diag_suppress=6875 $words) | true
  >   echo "${PIPESTATUS[0]}"; quarn -t lib.a | xargs; ls *.a*
  > done
  141
  a.o b.o
  before.a
  lib.a
  lib2.a
  141
  a.o b.o
  before.a
  lib.a
  lib2.a
  141
  a.o b.o
  before.a
  lib.a
  lib2.a
  141
  a.o b.o
  before.a
  lib.a
  lib2.a
