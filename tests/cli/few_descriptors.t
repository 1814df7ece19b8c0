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
