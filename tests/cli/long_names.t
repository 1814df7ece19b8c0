Names of 16 and more characters stand in a table of their own, and are found by their places in it.

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
