A rewritten archive keeps the permissions of the old one; a new one has the usual ones.

  $ . "$TESTDIR/setup.sh"
  $ file a.o a; file b.o b
  $ mode() { stat -c %a lib.a; }
  $ library lib.a a.o; mode
  644
  $ (umask 077; library new.a a.o; stat -c %a new.a)
  600
  $ for mode in 600 664 755 640 777; do chmod $mode lib.a; quarn -r --diag_suppress=L6875 lib.a b.o; mode; done
  600
  664
  755
  640
  777
  $ chmod 604 lib.a; quarn -d lib.a b.o; mode
  604
  $ chmod 640 lib.a; quarn -s lib.a; mode
  640
  $ chmod 660 lib.a; library lib.a b.o; mode
  660

A failed run changes nothing about it, not even its time.

  $ touch -d @1000000000 lib.a
  $ quarn -r lib.a none.o
  Error: L6833E: File 'none.o' does not exist
  [1]
  $ stat -c '%a %Y' lib.a
  660 1000000000
  $ quarn -t lib.a > /dev/null; stat -c '%a %Y' lib.a
  660 1000000000
