A run has one action, on one archive.

  $ . "$TESTDIR/setup.sh"
  $ file a.txt a
  $ library lib.a a.txt
  $ cp lib.a before.a

Two actions: an error, and nothing is done.

  $ both quarn -r -d lib.a a.txt
  err: Error: L6840E: Only one action option may be specified
  status 1
  $ both quarn -x -t lib.a
  err: Error: L6840E: Only one action option may be specified
  status 1
  $ both quarn -p --zs lib.a
  err: Error: L6840E: Only one action option may be specified
  status 1
  $ both quarn -m -t lib.a a.txt
  err: Error: L6840E: Only one action option may be specified
  status 1
  $ both quarn --create -t new.a a.txt
  err: Error: L6840E: Only one action option may be specified
  status 1
  $ both quarn --create -d new.a a.txt
  err: Error: L6840E: Only one action option may be specified
  status 1
  $ both quarn --sizes --entries lib.a
  err: Error: L6840E: Only one action option may be specified
  status 1
  $ both quarn --zt --sizes lib.a
  err: Error: L6840E: Only one action option may be specified
  status 1
  $ both quarn -r --zs lib.a
  err: Error: L6840E: Only one action option may be specified
  status 1
  $ both quarn -t -q lib.a
  err: Error: L6840E: Only one action option may be specified
  status 1
  $ both quarn -xt lib.a
  err: Error: L6840E: Only one action option may be specified
  status 1

Each action that differs from the first one is told of.

  $ both quarn -d -t -x lib.a a.txt
  err: Error: L6840E: Only one action option may be specified
  err: Error: L6840E: Only one action option may be specified
  status 1
  $ both quarn -d --entries -x -m -p -t -r --sizes --zt --zs --create lib.a a.txt
  err: Error: L6840E: Only one action option may be specified
  err: Error: L6840E: Only one action option may be specified
  err: Error: L6840E: Only one action option may be specified
  err: Error: L6840E: Only one action option may be specified
  err: Error: L6840E: Only one action option may be specified
  err: Error: L6840E: Only one action option may be specified
  err: Error: L6840E: Only one action option may be specified
  err: Error: L6840E: Only one action option may be specified
  err: Error: L6840E: Only one action option may be specified
  status 1

The same action twice is one action, and so are its other names.

  $ quarn -t -t lib.a
  a.txt
  $ quarn -r -q lib.a
  $ quarn --create -r --normalise=1 --diag_suppress=L6875 new.a a.txt
  $ quarn --create -q --normalise=1 --diag_suppress=L6875 new.a a.txt
  $ quarn -t new.a
  a.txt

The conflict comes before help, banner, position and archive.

  $ both quarn -h -r -d lib.a
  err: Error: L6840E: Only one action option may be specified
  status 1
  $ both quarn -r -d
  err: Error: L6840E: Only one action option may be specified
  status 1
  $ both quarn -t -x -a nowhere missing.a
  err: Error: L6840E: Only one action option may be specified
  status 1
  $ both quarn -r -d lib.a none.txt
  err: Error: L6840E: Only one action option may be specified
  status 1

Nothing was touched.

  $ cmp lib.a before.a
  $ ls
  a.txt
  before.a
  lib.a
  new.a
