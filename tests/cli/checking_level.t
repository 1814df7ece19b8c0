--db_check sets the level of internal checks; what it doesn't know it passes over in silence.

  $ . "$TESTDIR/setup.sh"
  $ file a.o a; library lib.a a.o
  $ check() { both quarn "--db_check=$1" -t lib.a; }

  $ for level in none low medium high extravagant lowx bogus '' LOW Show SHOW showx 'low,' 'show,lowx' 'show,xyz'; do check "$level"; done
  out: a.o
  status 0
  out: a.o
  status 0
  out: a.o
  status 0
  out: a.o
  status 0
  out: a.o
  status 0
  out: a.o
  status 0
  out: a.o
  status 0
  out: a.o
  status 0
  out: a.o
  status 0
  out: a.o
  status 0
  out: a.o
  status 0
  out: a.o
  status 0
  out: a.o
  status 0
  out: a.o
  status 0
  out: a.o
  status 0

The levels can be shown, in any style in the same form.

  $ check show
  out: a.o
  err: COLD LOW checks enabled
  err: HOT LOW checks enabled
  status 0
  $ check show,none
  out: a.o
  status 0
  $ check show,
  out: a.o
  status 0
  $ check show,low
  out: a.o
  err: COLD LOW checks enabled
  err: HOT LOW checks enabled
  status 0
  $ check show,medium
  out: a.o
  err: COLD LOW checks enabled
  err: COLD MEDIUM checks enabled
  err: HOT LOW checks enabled
  status 0
  $ check show,high
  out: a.o
  err: COLD LOW checks enabled
  err: COLD MEDIUM checks enabled
  err: COLD HIGH checks enabled
  err: HOT LOW checks enabled
  status 0
  $ check show,extravagant
  out: a.o
  err: COLD LOW checks enabled
  err: COLD MEDIUM checks enabled
  err: COLD HIGH checks enabled
  err: COLD EXTRAVAGANT checks enabled
  err: HOT LOW checks enabled
  status 0
  $ both quarn --diag_style=ide --db_check=show -t lib.a
  out: a.o
  err: COLD LOW checks enabled
  err: HOT LOW checks enabled
  status 0

The last one counts.

  $ both quarn --db_check=show,high --db_check=show -t lib.a
  out: a.o
  err: COLD LOW checks enabled
  err: HOT LOW checks enabled
  status 0

Checks on or off, the work is the same.

  $ for level in none low high; do cp lib.a $level.a; quarn --db_check=$level -s $level.a; cmp lib.a $level.a; done
