Fifty errors are printed; the next one ends the run.

  $ . "$TESTDIR/setup.sh"
  $ file a.o a; file b.o b; library lib.a a.o b.o; cp lib.a before.a
  $ words() { printf "none%d.o " $(seq $1); }

Fifty are shown, and the run goes to its end.

  $ mkdir out; cd out
  $ quarn -xv ../lib.a $(words 50) b.o 2> errors
  x - b.o
  [1]
  $ wc -l < errors; tail -1 errors
  50
  Error: L6831E: 'none50.o' not present in archive '../lib.a'

The next one is not printed, and nothing is done any more.

  $ rm b.o; quarn -xv ../lib.a a.o $(words 51) b.o 2> errors
  x - a.o
  [1]
  $ wc -l < errors; tail -1 errors
  50
  Error: L6831E: 'none50.o' not present in archive '../lib.a'
  $ ls; cd ..
  a.o
  errors
  $ quarn -xv lib.a a.o $(words 300) 2>&1 | wc -l
  51

Warnings don't count.

  $ quarn -d lib.a $(words 60) 2>&1 | wc -l
  60
  $ cp before.a lib.a

Warnings that were made errors do, wherever they come from.

  $ quarn -dv --diag_error=6831 lib.a $(words 60) a.o > out.txt 2> errors; echo $?
  1
  $ wc -l < errors; wc -l < out.txt
  50
  0
  $ quarn --diag_error=3920 -t "-$(printf 'v%.0s' {1..60})" lib.a > out.txt 2> errors; echo $?
  1
  $ wc -l < errors; wc -l < out.txt
  50
  0

What was written to stdout before stays.

  $ quarn -t lib.a a.o $(words 51) b.o 2> /dev/null
  a.o
  [1]
  $ cmp lib.a before.a

Nothing is written for an archive, and nothing is left behind.

  $ quarn -r lib.a $(words 51) > /dev/null 2>&1; echo $?
  1
  $ quarn -r new.a $(words 51) > /dev/null 2>&1; echo $?
  1
  $ cmp lib.a before.a; ls
  a.o
  b.o
  before.a
  errors
  lib.a
  out
  out.txt
