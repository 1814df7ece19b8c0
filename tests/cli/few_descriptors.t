A process may have only so many files open at a time. A run needs no more of them for more inputs,
also where these are too large to be kept in memory.

  $ . "$TESTDIR/setup.sh"
  $ for i in $(seq 40); do head -c $((70000 + i)) /dev/zero > "$i.o"; done
  $ for i in $(seq 40); do quarn -r -c --diag_suppress=L6875 "$i.a" "$i.o"; done
  $ ulimit -n 12
  $ quarn -r -c --diag_suppress=L6875 files.a *.o
  $ quarn -r --diag_suppress=L6875 files.a *.o
  $ quarn -r -c --diag_suppress=L6875 archives.a [0-9]*.a
  $ quarn -r --diag_suppress=L6875 archives.a [0-9]*.a
  $ for lib in files archives; do quarn -t $lib.a | wc -l; done
  40
  40
  $ for i in $(seq 40); do quarn -p archives.a $i.o | cmp - $i.o; done
  $ mkdir out && cd out && quarn -x ../files.a
  $ for i in $(seq 40); do cmp $i.o ../$i.o; done

With too few of them for an archive a run says so, and what needs none is done.

  $ cd .. && printf 'one\n' > a.o && library one.a a.o && cp one.a before.a
  $ atMost() { (ulimit -n $1; shift; "$@"; echo "status $?"); }
  $ for limit in 4 5 6; do atMost $limit quarn -t one.a; done
  Error: L6835E: Reading file 'one.a' : Too many open files
  status 1
  Error: L6835E: Reading file 'one.a' : Too many open files
  status 1
  a.o
  status 0
  $ for limit in 4 5; do atMost $limit quarn -t one.a <&-; done
  a.o
  status 0
  a.o
  status 0
  $ atMost 4 quarn -r one.a a.o; cmp one.a before.a
  Error: L6835E: Reading file 'one.a' : Too many open files
  status 1
  $ atMost 4 quarn --version_number | wc -l; atMost 4 quarn -k
  2
  Fatal error: L3900U: Unrecognized option '-k'.
  status 1

A complaint that can't be written shows in the status.

  $ quarn -d one.a none 2> /dev/full; echo $?
  1
