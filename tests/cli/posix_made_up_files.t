Files that the host makes up as they are read say that they are empty.

  $ [ -s /proc/version ] || [ -n "$(cat /proc/version)" ] || exit 80
  $ . "$TESTDIR/setup.sh"
  $ file a.o a; library lib.a a.o; cp lib.a before.a

None is stored as the empty file that it says it is.

  $ both quarn -rv lib.a /proc/version
  err: Error: L6835E: Reading file 'lib.a' : Invalid argument
  status 1
  $ both quarn --create new.a /proc/version
  err: Error: L6835E: Reading file 'new.a' : Invalid argument
  status 1
  $ both quarn-ar r lib.a /proc/version
  err: quarn-ar: Error: L6835E: Reading file '/proc/version' : Invalid argument
  status 1
  $ cmp lib.a before.a; ls *.a
  before.a
  lib.a

One that begins as an archive is none without members: a process may have any environment.

  $ env -i "$(printf '!<arch>\nx=1')" sleep 100 & other=$!
  $ until head -c 7 /proc/$other/environ | grep -q '!<arch>'; do sleep 0.1; done
  $ ln -s /proc/$other/environ made_up.a
  $ both quarn -t made_up.a
  err: Error: L6835E: Reading file 'made_up.a' : Invalid argument
  status 1
  $ both quarn -r made_up.a a.o
  err: Error: L6835E: Reading file 'made_up.a' : Invalid argument
  status 1
  $ both quarn -r lib.a made_up.a
  err: Error: L6835E: Reading file 'lib.a' : Invalid argument
  status 1
  $ kill $other; cmp lib.a before.a

Words are read from them to their end.

  $ mkdir bin; cp "$(command -v sleep)" bin/lib.a; bin/lib.a 100 & other=$!
  $ until grep -q lib.a /proc/$other/comm; do sleep 0.1; done
  $ quarn -t --via /proc/$other/comm; quarn-ar t @/proc/$other/comm
  a.o
  a.o
  $ kill $other
