A member whose name field makes no sense has no name; the fault is told of where it is one.

  $ . "$TESTDIR/setup.sh"

A name without an end, and one with something behind its end.

  $ { magic; member 'sixteenlettersno' a; member b.o/ b; } > lib.a; both quarn -t lib.a
  out: 
  out: b.o
  err: Warning: L6974W: 'lib.a': malformed archive: Archive member header starting at offset 8 has no '/' character in its name field
  status 0
  $ { magic; member 'blanks only' a; } > lib.a; both quarn -t lib.a
  out: 
  err: Warning: L6974W: 'lib.a': malformed archive: Archive member header starting at offset 8 has no '/' character in its name field
  status 0
  $ { magic; member 'a.o/x' a; member b.o/ b; } > lib.a; both quarn -t lib.a
  out: 
  out: b.o
  err: Warning: L6974W: 'lib.a': malformed archive: Archive member header starting at offset 8 has a trailing non-space character after the '/' character in its name field
  status 0
  $ { magic; member 'dir/a.o/' a; } > lib.a; both quarn -t lib.a
  out: 
  err: Warning: L6974W: 'lib.a': malformed archive: Archive member header starting at offset 8 has a trailing non-space character after the '/' character in its name field
  status 0
  $ { magic; member '/x' a; } > lib.a; both quarn -t lib.a
  out: 
  err: Warning: L6974W: 'lib.a': malformed archive: Archive member header starting at offset 8 has a trailing non-space character after the '/' character in its name field
  status 0
  $ both quarn -d lib.a none; both quarn -t lib.a
  err: Warning: L6974W: 'lib.a': malformed archive: Archive member header starting at offset 8 has a trailing non-space character after the '/' character in its name field
  err: Warning: L6831E: 'none' not present in archive 'lib.a'
  status 0
  out: 
  status 0
  $ { magic; member '///' a; } > lib.a; both quarn -t lib.a
  out: 
  err: Warning: L6974W: 'lib.a': malformed archive: Archive member header starting at offset 8 has a trailing non-space character after the '/' character in its name field
  status 0
  $ { magic; header "$(printf 'a.o/\tx')" 0 0 0 644 0; } > lib.a; both quarn -t lib.a
  out: 
  err: Warning: L6974W: 'lib.a': malformed archive: Archive member header starting at offset 8 has a trailing non-space character after the '/' character in its name field
  status 0

A NUL byte ends a name.

  $ { magic; member 'ax.o/' a | sed 's/x/\x00/'; } > lib.a; both quarn -t lib.a
  out: a
  status 0
  $ { magic; member 'x/' a | sed 's/x/\x00/'; } > lib.a; both quarn -t lib.a
  out: 
  status 0
  $ { magic; member // "a_longxname_of_20.o/$(printf '\n.')" | sed 's/x/\x00/'; member /0 c; } > lib.a; both quarn -t lib.a
  out: a_long
  status 0

A "/" or "//" that is no table is a member without a name.

  $ { magic; member a.o/ a; member / x; member b.o/ b; } > lib.a; both quarn -t lib.a
  out: a.o
  out: 
  out: b.o
  status 0
  $ { magic; member a.o/ a; member b.o/ b; member // x; } > lib.a; both quarn -t lib.a
  out: a.o
  out: b.o
  out: 
  status 0
  $ { magic; member // x; member // y; member a.o/ a; } > lib.a; both quarn -tv lib.a
  out: rw-r--r--     0/     0      1 Jan 01 00:00 1970  (offset     70)
  out: rw-r--r--     0/     0      1 Jan 01 00:00 1970 a.o (offset    132)
  status 0
  $ { magic; member a.o/ a; member // x; member b.o/ b; } > lib.a; both quarn -tv lib.a
  out: rw-r--r--     0/     0      1 Jan 01 00:00 1970 a.o (offset      8)
  out: rw-r--r--     0/     0      1 Jan 01 00:00 1970 b.o (offset    132)
  status 0
  $ { magic; header / 0 0 0 0 4; words 0; member / xyz; } > lib.a; both quarn -tv lib.a
  out: rw-r--r--     0/     0      3 Jan 01 00:00 1970  (offset     72)
  status 0
  $ { magic; member a.o/ a; header / '' '' '' '' 0; } > lib.a; both quarn -tv lib.a
  out: rw-r--r--     0/     0      1 Jan 01 00:00 1970 a.o (offset      8)
  out: ---------     0/     0      0 Jan 01 00:00 1970  (offset     70)
  status 0

An archive with nothing in it is one.

  $ magic > lib.a; both quarn -t lib.a
  status 0
