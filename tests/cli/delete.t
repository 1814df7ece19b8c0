Deleting removes all members that match, and a word without any is a warning only.

  $ . "$TESTDIR/setup.sh"
  $ for name in a b c; do file $name.o $name; file $name.txt $name; done
  $ fresh() { rm -f lib.a; library lib.a a.o b.o a.txt c.o b.txt; }

  $ fresh; both quarn -dv lib.a b.o; quarn -t lib.a
  out: d - b.o
  status 0
  a.o
  a.txt
  c.o
  b.txt

All that match go, from the last to the first, in either case.

  $ fresh; mkdir elsewhere; cd elsewhere
  $ quarn -dv ../lib.a *.o; quarn -t ../lib.a; cd ..
  d - c.o
  d - b.o
  d - a.o
  a.txt
  b.txt
  $ fresh; quarn -dv lib.a 'A*'; quarn -t lib.a
  d - a.txt
  d - a.o
  b.o
  c.o
  b.txt
  $ fresh; quarn -dv lib.a '?.TXT' b.o; quarn -t lib.a
  d - b.txt
  d - a.txt
  d - b.o
  a.o
  c.o
  $ fresh; quarn -dv lib.a some/folder/a.o 'other\b.o'; quarn -t lib.a
  d - a.o
  d - b.o
  a.txt
  c.o
  b.txt

The pattern is for members, whatever files are there.

  $ fresh; file d.o d; quarn -dv lib.a '*.o'
  d - c.o
  d - b.o
  d - a.o

A word without a member is a warning; the rest is done.

  $ fresh; both quarn -dv lib.a none.o a.o none.o; quarn -t lib.a
  out: d - a.o
  err: Warning: L6831E: 'none.o' not present in archive 'lib.a'
  err: Warning: L6831E: 'none.o' not present in archive 'lib.a'
  status 0
  b.o
  a.txt
  c.o
  b.txt
  $ both quarn -d lib.a a.o
  err: Warning: L6831E: 'a.o' not present in archive 'lib.a'
  status 0

The warning can be silenced, lowered, or made an error, which keeps the archive.

  $ both quarn -d --diag_suppress=L6831 lib.a none.o
  status 0
  $ both quarn -d --diag_remark=L6831 lib.a none.o
  err: 'none.o' not present in archive 'lib.a'
  status 0
  $ cp lib.a before.a
  $ both quarn -dv --diag_error=L6831 lib.a none.o b.o
  out: d - b.o
  err: Error: L6831E: 'none.o' not present in archive 'lib.a'
  status 1
  $ cmp lib.a before.a

Without words nothing is deleted and the archive is written back.

  $ both quarn -dv lib.a
  status 0
  $ cmp lib.a before.a

"*" is all members and none of the tables.

  $ file a_name_of_twenty_.txt long
  $ library all.a a.o a_name_of_twenty_.txt b.o
  $ quarn -dv all.a '*'
  d - b.o
  d - a_name_of_twenty_.txt
  d - a.o
  $ bytes all.a
  0000000 21 3c 61 72 63 68 3e 0a 2f 20 20 20 20 20 20 20  >!<arch>./       <
  0000016 20 20 20 20 20 20 20 20 30 20 20 20 20 20 20 20  >        0       <
  0000032 20 20 20 20 30 20 20 20 20 20 30 20 20 20 20 20  >    0     0     <
  0000048 30 20 20 20 20 20 20 20 34 20 20 20 20 20 20 20  >0       4       <
  0000064 20 20 60 0a 00 00 00 00                          >  `.....<
  0000072
  $ both quarn -dv all.a '*'
  err: Warning: L6831E: '*' not present in archive 'all.a'
  status 0
  $ both quarn -d all.a ''
  err: Warning: L6831E: '' not present in archive 'all.a'
  status 0

Of several members of one name all go.

  $ library twice.a a.o b.o a.o a.o
  $ quarn -dv twice.a a.o; quarn -t twice.a
  d - a.o
  d - a.o
  d - a.o
  b.o
