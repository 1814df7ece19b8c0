A library of any files is made, listed, printed and taken apart again.

  $ . "$TESTDIR/setup.sh"
  $ file one.txt one
  $ file two.txt two2
  $ quarn --create --normalise=7 --diag_suppress=L6875 lib.a one.txt two.txt
  $ quarn -t lib.a
  one.txt
  two.txt
  $ quarn -tv lib.a
  rw-r--r--     0/     0      3 Jan 01 00:00 1970 one.txt (offset     72)
  rw-r--r--     0/     0      4 Jan 01 00:00 1970 two.txt (offset    136)

The file is the magic, a symbol table without symbols, and the two members, each at an even offset.

  $ bytes lib.a
  0000000 21 3c 61 72 63 68 3e 0a 2f 20 20 20 20 20 20 20  >!<arch>./       <
  0000016 20 20 20 20 20 20 20 20 30 20 20 20 20 20 20 20  >        0       <
  0000032 20 20 20 20 30 20 20 20 20 20 30 20 20 20 20 20  >    0     0     <
  0000048 30 20 20 20 20 20 20 20 34 20 20 20 20 20 20 20  >0       4       <
  0000064 20 20 60 0a 00 00 00 00 6f 6e 65 2e 74 78 74 2f  >  `.....one.txt/<
  0000080 20 20 20 20 20 20 20 20 37 20 20 20 20 20 20 20  >        7       <
  0000096 20 20 20 20 30 20 20 20 20 20 30 20 20 20 20 20  >    0     0     <
  0000112 31 30 30 36 34 34 20 20 33 20 20 20 20 20 20 20  >100644  3       <
  0000128 20 20 60 0a 6f 6e 65 0a 74 77 6f 2e 74 78 74 2f  >  `.one.two.txt/<
  0000144 20 20 20 20 20 20 20 20 37 20 20 20 20 20 20 20  >        7       <
  0000160 20 20 20 20 30 20 20 20 20 20 30 20 20 20 20 20  >    0     0     <
  0000176 31 30 30 36 34 34 20 20 34 20 20 20 20 20 20 20  >100644  4       <
  0000192 20 20 60 0a 74 77 6f 32                          >  `.two2<
  0000200

  $ quarn -p lib.a two.txt
  two2 (no-eol)
  $ mkdir out && cd out
  $ quarn -xv ../lib.a
  x - one.txt
  x - two.txt
  $ cmp one.txt ../one.txt && cmp two.txt ../two.txt

Writing it back with nothing to change gives the same bytes.

  $ cd ..
  $ cp lib.a before.a
  $ quarn -s lib.a
  $ cmp lib.a before.a
