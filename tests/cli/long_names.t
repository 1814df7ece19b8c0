Names of 16 and more characters stand in a table of their own.

  $ . "$TESTDIR/setup.sh"
  $ long() { magic; header // 0 0 0 0 "${#1}"; printf '%s' "$1"; (( ${#1} % 2 )) && echo; true; }
  $ nl=$'\n'
  $ names="first_long_name.o/${nl}second_long_name.o/${nl}"
  $ indexed() { { long "$names"; member "/$1" x; member b.o/ b; } > lib.a; both quarn -t lib.a; }

  $ indexed 0
  out: first_long_name.o
  out: b.o
  status 0
  $ indexed 19
  out: second_long_name.o
  out: b.o
  status 0

A number that points into a name gives the rest of it.

  $ indexed 6
  out: long_name.o
  out: b.o
  status 0
  $ indexed 16
  out: o
  out: b.o
  status 0
  $ indexed 35
  out: .o
  out: b.o
  status 0

The slash that ends an entry is the end of an empty name; the newline behind it begins none.

  $ indexed 17
  out: 
  out: b.o
  status 0
  $ indexed 18
  out: 
  out: b.o
  err: Warning: L6974W: 'lib.a': malformed archive: Archive member header starting at offset 108 contains out-of-range long-name index 18 (the long-name table is 39 bytes long)
  status 0
  $ indexed 38
  out: 
  out: b.o
  err: Warning: L6974W: 'lib.a': malformed archive: Archive member header starting at offset 108 contains out-of-range long-name index 38 (the long-name table is 39 bytes long)
  status 0

Out of range.

  $ indexed 39
  out: 
  out: b.o
  err: Warning: L6974W: 'lib.a': malformed archive: Archive member header starting at offset 108 contains out-of-range long-name index 39 (the long-name table is 39 bytes long)
  status 0
  $ indexed 40
  out: 
  out: b.o
  err: Warning: L6974W: 'lib.a': malformed archive: Archive member header starting at offset 108 contains out-of-range long-name index 40 (the long-name table is 39 bytes long)
  status 0
  $ indexed 4294967295
  out: 
  out: b.o
  err: Warning: L6974W: 'lib.a': malformed archive: Archive member header starting at offset 108 contains out-of-range long-name index 4294967295 (the long-name table is 39 bytes long)
  status 0

Not a number.

  $ indexed 1x
  out: 
  out: b.o
  err: Warning: L6974W: 'lib.a': malformed archive: Archive member header starting at offset 108 contains invalid long-name index '1x             '
  status 0
  $ indexed '1 2'
  out: 
  out: b.o
  err: Warning: L6974W: 'lib.a': malformed archive: Archive member header starting at offset 108 contains invalid long-name index '1 2            '
  status 0
  $ indexed 4294967296
  out: 
  out: b.o
  err: Warning: L6974W: 'lib.a': malformed archive: Archive member header starting at offset 108 contains invalid long-name index '4294967296     '
  status 0
  $ indexed 000000000000000
  out: first_long_name.o
  out: b.o
  status 0

A table whose last entry has no end.

  $ names="first_long_name.o/${nl}unended_name.o"
  $ indexed 0
  out: first_long_name.o
  out: b.o
  status 0
  $ indexed 19
  out: 
  out: b.o
  err: Warning: L6974W: 'lib.a': malformed archive: Archive member header starting at offset 102 contains out-of-range long-name index 19 (the long-name table is 33 bytes long)
  status 0
  $ names="unended/"; indexed 0
  out: 
  out: b.o
  err: Warning: L6974W: 'lib.a': malformed archive: Archive member header starting at offset 76 contains out-of-range long-name index 0 (the long-name table is 8 bytes long)
  status 0
  $ names="/${nl}"; indexed 0
  out: 
  out: b.o
  status 0
  $ names="${nl}x/${nl}"; indexed 0; indexed 1
  out: 
  out: x
  out: b.o
  status 0
  out: x
  out: b.o
  status 0
  $ names=''; indexed 0
  out: 
  out: b.o
  err: Warning: L6974W: 'lib.a': malformed archive: Archive member header starting at offset 68 contains out-of-range long-name index 0 (the long-name table is 0 bytes long)
  status 0

No table.

  $ { magic; member /0 a; member b.o/ b; } > lib.a; both quarn -t lib.a
  out: 
  out: b.o
  err: Warning: L6974W: 'lib.a': malformed archive: Archive member header starting at offset 8 contains an index into the long name table, but this archive has no long name table
  status 0
  $ { magic; member /0 a; member // 'name/'; } > lib.a; both quarn -t lib.a
  out: 
  err: Warning: L6974W: 'lib.a': malformed archive: Archive member header starting at offset 8 contains an index into the long name table, but this archive has no long name table
  status 0
  $ { magic; member a.o/ a; member b.o/ b; member // "a_long_name.o/$nl"; member /0 c; } > lib.a; both quarn -t lib.a
  out: a.o
  out: b.o
  out: 
  out: 
  err: Warning: L6974W: 'lib.a': malformed archive: Archive member header starting at offset 208 contains an index into the long name table, but this archive has no long name table
  status 0

The table may be first or second.

  $ { magic; header / 0 0 0 0 4; words 0; member // "a_long_name.o/$nl"; member /0 c; } > lib.a; both quarn -tv lib.a
  out: rw-r--r--     0/     0      1 Jan 01 00:00 1970 a_long_name.o (offset    148)
  status 0
  $ { magic; member // "a_long_name.o/$nl"; member /0 c; } > lib.a; both quarn -tv lib.a
  out: rw-r--r--     0/     0      1 Jan 01 00:00 1970 a_long_name.o (offset     84)
  status 0
  $ { magic; member a.o/ a; member // "a_long_name.o/$nl"; member /0 c; } > lib.a; both quarn -tv lib.a
  out: rw-r--r--     0/     0      1 Jan 01 00:00 1970 a.o (offset      8)
  out: rw-r--r--     0/     0      1 Jan 01 00:00 1970 a_long_name.o (offset    146)
  status 0

Slashes within a name are folders; newlines are not the end.

  $ names="dir/with_long_name.o/${nl}"; indexed 0
  out: with_long_name.o
  out: b.o
  status 0
  $ names="two${nl}lines_of_name.o/${nl}"; indexed 0
  out: two
  out: lines_of_name.o
  out: b.o
  status 0
  $ names="$(printf 'tail/../../x\\y.o')/${nl}"; indexed 0
  out: y.o
  out: b.o
  status 0

A table that is not stale is kept as it is, with references nobody wrote like this.

  $ { long "unused_long_name.o/${nl}second_long_name.o/${nl}"; member /20 x; } > lib.a
  $ quarn -n -s lib.a; bytes lib.a | sed -n '1,9p'
  0000000 21 3c 61 72 63 68 3e 0a 2f 2f 20 20 20 20 20 20  >!<arch>.//      <
  0000016 20 20 20 20 20 20 20 20 30 20 20 20 20 20 20 20  >        0       <
  0000032 20 20 20 20 30 20 20 20 20 20 30 20 20 20 20 20  >    0     0     <
  0000048 30 20 20 20 20 20 20 20 34 30 20 20 20 20 20 20  >0       40      <
  0000064 20 20 60 0a 75 6e 75 73 65 64 5f 6c 6f 6e 67 5f  >  `.unused_long_<
  0000080 6e 61 6d 65 2e 6f 2f 0a 73 65 63 6f 6e 64 5f 6c  >name.o/.second_l<
  0000096 6f 6e 67 5f 6e 61 6d 65 2e 6f 2f 0a 2f 32 30 20  >ong_name.o/./20 <
  0000112 20 20 20 20 20 20 20 20 20 20 20 20 30 20 20 20  >            0   <
  0000128 20 20 20 20 20 20 20 20 30 20 20 20 20 20 30 20  >        0     0 <
  $ { long "short.o/${nl}"; member /0 x; } > lib.a
  $ quarn -n -s lib.a; bytes lib.a
  0000000 21 3c 61 72 63 68 3e 0a 2f 2f 20 20 20 20 20 20  >!<arch>.//      <
  0000016 20 20 20 20 20 20 20 20 30 20 20 20 20 20 20 20  >        0       <
  0000032 20 20 20 20 30 20 20 20 20 20 30 20 20 20 20 20  >    0     0     <
  0000048 30 20 20 20 20 20 20 20 39 20 20 20 20 20 20 20  >0       9       <
  0000064 20 20 60 0a 73 68 6f 72 74 2e 6f 2f 0a 0a 73 68  >  `.short.o/..sh<
  0000080 6f 72 74 2e 6f 2f 20 20 20 20 20 20 20 20 30 20  >ort.o/        0 <
  0000096 20 20 20 20 20 20 20 20 20 20 30 20 20 20 20 20  >          0     <
  0000112 30 20 20 20 20 20 31 30 30 36 34 34 20 20 31 20  >0     100644  1 <
  0000128 20 20 20 20 20 20 20 20 60 0a 78 0a              >        `.x.<
  0000140
  $ quarn -n -s lib.a; quarn -n -d lib.a none 2> /dev/null; bytes lib.a | tail -6
  0000064 20 20 60 0a 73 68 6f 72 74 2e 6f 2f 0a 0a 73 68  >  `.short.o/..sh<
  0000080 6f 72 74 2e 6f 2f 20 20 20 20 20 20 20 20 30 20  >ort.o/        0 <
  0000096 20 20 20 20 20 20 20 20 20 20 30 20 20 20 20 20  >          0     <
  0000112 30 20 20 20 20 20 31 30 30 36 34 34 20 20 31 20  >0     100644  1 <
  0000128 20 20 20 20 20 20 20 20 60 0a 78 0a              >        `.x.<
  0000140

An edit writes it anew, in the order of the members; with the last long name it goes away.

  $ file third_long_name.o 3; file a.o a
  $ { long "unused_long_name.o/${nl}second_long_name.o/${nl}first_long_name.o/${nl}"; member /20 2; member /40 1; } > lib.a
  $ quarn -t lib.a
  second_long_name.o
  first_long_name.o
  $ quarn -rn --normalise=1 --diag_suppress=6875 lib.a third_long_name.o
  $ bytes lib.a
  0000000 21 3c 61 72 63 68 3e 0a 2f 2f 20 20 20 20 20 20  >!<arch>.//      <
  0000016 20 20 20 20 20 20 20 20 30 20 20 20 20 20 20 20  >        0       <
  0000032 20 20 20 20 30 20 20 20 20 20 30 20 20 20 20 20  >    0     0     <
  0000048 30 20 20 20 20 20 20 20 35 38 20 20 20 20 20 20  >0       58      <
  0000064 20 20 60 0a 73 65 63 6f 6e 64 5f 6c 6f 6e 67 5f  >  `.second_long_<
  0000080 6e 61 6d 65 2e 6f 2f 0a 66 69 72 73 74 5f 6c 6f  >name.o/.first_lo<
  0000096 6e 67 5f 6e 61 6d 65 2e 6f 2f 0a 74 68 69 72 64  >ng_name.o/.third<
  0000112 5f 6c 6f 6e 67 5f 6e 61 6d 65 2e 6f 2f 0a 2f 30  >_long_name.o/./0<
  0000128 20 20 20 20 20 20 20 20 20 20 20 20 20 20 30 20  >              0 <
  0000144 20 20 20 20 20 20 20 20 20 20 30 20 20 20 20 20  >          0     <
  0000160 30 20 20 20 20 20 31 30 30 36 34 34 20 20 31 20  >0     100644  1 <
  0000176 20 20 20 20 20 20 20 20 60 0a 32 0a 2f 32 30 20  >        `.2./20 <
  0000192 20 20 20 20 20 20 20 20 20 20 20 20 30 20 20 20  >            0   <
  0000208 20 20 20 20 20 20 20 20 30 20 20 20 20 20 30 20  >        0     0 <
  0000224 20 20 20 20 31 30 30 36 34 34 20 20 31 20 20 20  >    100644  1   <
  0000240 20 20 20 20 20 20 60 0a 31 0a 2f 33 39 20 20 20  >      `.1./39   <
  0000256 20 20 20 20 20 20 20 20 20 20 31 20 20 20 20 20  >          1     <
  0000272 20 20 20 20 20 20 30 20 20 20 20 20 30 20 20 20  >      0     0   <
  0000288 20 20 31 30 30 36 34 34 20 20 31 20 20 20 20 20  >  100644  1     <
  0000304 20 20 20 20 60 0a 33 0a                          >    `.3.<
  0000312
  $ quarn -mn -b second_long_name.o lib.a third_long_name.o; bytes lib.a | sed -n 2,13p
  0000016 20 20 20 20 20 20 20 20 30 20 20 20 20 20 20 20  >        0       <
  0000032 20 20 20 20 30 20 20 20 20 20 30 20 20 20 20 20  >    0     0     <
  0000048 30 20 20 20 20 20 20 20 35 38 20 20 20 20 20 20  >0       58      <
  0000064 20 20 60 0a 74 68 69 72 64 5f 6c 6f 6e 67 5f 6e  >  `.third_long_n<
  0000080 61 6d 65 2e 6f 2f 0a 73 65 63 6f 6e 64 5f 6c 6f  >ame.o/.second_lo<
  0000096 6e 67 5f 6e 61 6d 65 2e 6f 2f 0a 66 69 72 73 74  >ng_name.o/.first<
  0000112 5f 6c 6f 6e 67 5f 6e 61 6d 65 2e 6f 2f 0a 2f 30  >_long_name.o/./0<
  0000128 20 20 20 20 20 20 20 20 20 20 20 20 20 20 31 20  >              1 <
  0000144 20 20 20 20 20 20 20 20 20 20 30 20 20 20 20 20  >          0     <
  0000160 30 20 20 20 20 20 31 30 30 36 34 34 20 20 31 20  >0     100644  1 <
  0000176 20 20 20 20 20 20 20 20 60 0a 33 0a 2f 31 39 20  >        `.3./19 <
  0000192 20 20 20 20 20 20 20 20 20 20 20 20 30 20 20 20  >            0   <
  $ quarn -dn lib.a 'f*' 'second*'; bytes lib.a
  0000000 21 3c 61 72 63 68 3e 0a 2f 2f 20 20 20 20 20 20  >!<arch>.//      <
  0000016 20 20 20 20 20 20 20 20 30 20 20 20 20 20 20 20  >        0       <
  0000032 20 20 20 20 30 20 20 20 20 20 30 20 20 20 20 20  >    0     0     <
  0000048 30 20 20 20 20 20 20 20 31 39 20 20 20 20 20 20  >0       19      <
  0000064 20 20 60 0a 74 68 69 72 64 5f 6c 6f 6e 67 5f 6e  >  `.third_long_n<
  0000080 61 6d 65 2e 6f 2f 0a 0a 2f 30 20 20 20 20 20 20  >ame.o/../0      <
  0000096 20 20 20 20 20 20 20 20 31 20 20 20 20 20 20 20  >        1       <
  0000112 20 20 20 20 30 20 20 20 20 20 30 20 20 20 20 20  >    0     0     <
  0000128 31 30 30 36 34 34 20 20 31 20 20 20 20 20 20 20  >100644  1       <
  0000144 20 20 60 0a 33 0a                                >  `.3.<
  0000150
  $ quarn -dn lib.a 't*'; bytes lib.a
  0000000 21 3c 61 72 63 68 3e 0a                          >!<arch>.<
  0000008
