An archive that is not there is an error for each action but inserting.

  $ . "$TESTDIR/setup.sh"
  $ file a.o a

  $ for action in -t -tv -x -p -d -m --zs --sizes --entries --zt; do both quarn $action lib.a a.o; done
  err: Error: L6832E: Archive 'lib.a' not found : No such file or directory
  status 1
  err: Error: L6832E: Archive 'lib.a' not found : No such file or directory
  status 1
  err: Error: L6832E: Archive 'lib.a' not found : No such file or directory
  status 1
  err: Error: L6832E: Archive 'lib.a' not found : No such file or directory
  status 1
  err: Error: L6832E: Archive 'lib.a' not found : No such file or directory
  status 1
  err: Error: L6832E: Archive 'lib.a' not found : No such file or directory
  status 1
  err: Error: L6832E: Archive 'lib.a' not found : No such file or directory
  status 1
  err: Error: L6832E: Archive 'lib.a' not found : No such file or directory
  status 1
  err: Error: L6832E: Archive 'lib.a' not found : No such file or directory
  status 1
  err: Error: L6832E: Archive 'lib.a' not found : No such file or directory
  status 1

With -s or -n too, and nothing is made.

  $ both quarn -t -s lib.a
  err: Error: L6832E: Archive 'lib.a' not found : No such file or directory
  status 1
  $ both quarn -d -n lib.a
  err: Error: L6832E: Archive 'lib.a' not found : No such file or directory
  status 1
  $ both quarn --zs -s -n lib.a
  err: Error: L6832E: Archive 'lib.a' not found : No such file or directory
  status 1
  $ ls
  a.o

-s alone makes an archive without members.

  $ both quarn -s new.a
  err: Creating archive 'new.a'
  status 0
  $ bytes new.a
  0000000 21 3c 61 72 63 68 3e 0a 2f 20 20 20 20 20 20 20  >!<arch>./       <
  0000016 20 20 20 20 20 20 20 20 30 20 20 20 20 20 20 20  >        0       <
  0000032 20 20 20 20 30 20 20 20 20 20 30 20 20 20 20 20  >    0     0     <
  0000048 30 20 20 20 20 20 20 20 34 20 20 20 20 20 20 20  >0       4       <
  0000064 20 20 60 0a 00 00 00 00                          >  `.....<
  0000072
  $ both quarn -s -c other.a
  status 0
  $ cmp new.a other.a
  $ both quarn -n -s none.a
  err: Creating archive 'none.a'
  status 0
  $ bytes none.a
  0000000 21 3c 61 72 63 68 3e 0a                          >!<arch>.<
  0000008
  $ both quarn -s --vsn again.a
  err: Creating archive 'again.a'
  status 0

Inserting without files makes none.

  $ both quarn -r lib.a
  status 0
  $ both quarn -rv -s lib.a
  status 0
  $ both quarn -r -n -c lib.a
  status 0
  $ both quarn --create lib.a
  err: Error: L6980E: No archive members specified with --create
  status 1
  $ both quarn --create -s lib.a
  err: Error: L6980E: No archive members specified with --create
  status 1
  $ ls *.a
  again.a
  new.a
  none.a
  other.a

A name that can be no file is not there.

  $ both quarn -t a.o/lib.a
  err: Error: L6832E: Archive 'a.o/lib.a' not found : No such file or directory
  status 1
  $ both quarn -t nowhere/lib.a
  err: Error: L6832E: Archive 'nowhere/lib.a' not found : No such file or directory
  status 1
  $ long=$(printf 'n%.0s' {1..300}); quarn -t $long 2>&1 | sed 's/n\{300\}/<300>/'
  Error: L6832E: Archive '<300>' not found : No such file or directory
  $ both quarn -r --diag_suppress=L6875 nowhere/lib.a a.o
  err: Creating archive 'nowhere/lib.a'
  err: Error: L6830E: Writing file 'nowhere/lib.a' : No such file or directory
  status 1
  $ both quarn -r --diag_suppress=L6875 a.o/lib.a a.o
  err: Creating archive 'a.o/lib.a'
  err: Error: L6830E: Writing file 'a.o/lib.a' : Not a directory
  status 1

-v and other settings change nothing.

  $ both quarn --diag_suppress=error -tvcC lib.a
  err: Error: L6832E: Archive 'lib.a' not found : No such file or directory
  status 1
  $ both quarn --diag_style=ide -t lib.a
  err: quarn : error L6832:  Archive 'lib.a' not found : No such file or directory
  status 1
  $ both quarn --diag_style=gnu -t lib.a
  err: Error: L6832E: Archive 'lib.a' not found : No such file or directory
  status 1
