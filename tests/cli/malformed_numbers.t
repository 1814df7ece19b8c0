Numbers in headers that mean nothing count as 0, and are told of; other bytes stay as they are.

  $ . "$TESTDIR/setup.sh"

Numbers of no meaning count as 0, and are told of.

  $ { magic; header a.o/ never who which what 2; printf ab; } > lib.a
  $ both quarn -tv lib.a
  out: ---------     0/     0      2 Jan 01 00:00 1970 a.o (offset      8)
  err: Warning: L6974W: 'lib.a': malformed archive: Archive member header starting at offset 8 contains invalid date string 'never       '
  err: Warning: L6974W: 'lib.a': malformed archive: Archive member header starting at offset 8 contains invalid uid string 'who   '
  err: Warning: L6974W: 'lib.a': malformed archive: Archive member header starting at offset 8 contains invalid gid string 'which '
  err: Warning: L6974W: 'lib.a': malformed archive: Archive member header starting at offset 8 contains invalid mode string 'what    '
  status 0
  $ both quarn -p lib.a
  out: ab
  err: Warning: L6974W: 'lib.a': malformed archive: Archive member header starting at offset 8 contains invalid date string 'never       '
  err: Warning: L6974W: 'lib.a': malformed archive: Archive member header starting at offset 8 contains invalid uid string 'who   '
  err: Warning: L6974W: 'lib.a': malformed archive: Archive member header starting at offset 8 contains invalid gid string 'which '
  err: Warning: L6974W: 'lib.a': malformed archive: Archive member header starting at offset 8 contains invalid mode string 'what    '
  status 0
  $ { magic; header a.o/ '' '' '' '' 2; printf ab; } > lib.a
  $ both quarn -tv lib.a
  out: ---------     0/     0      2 Jan 01 00:00 1970 a.o (offset      8)
  err: Warning: L6974W: 'lib.a': malformed archive: Archive member header starting at offset 8 contains invalid date string '            '
  err: Warning: L6974W: 'lib.a': malformed archive: Archive member header starting at offset 8 contains invalid uid string '      '
  err: Warning: L6974W: 'lib.a': malformed archive: Archive member header starting at offset 8 contains invalid gid string '      '
  err: Warning: L6974W: 'lib.a': malformed archive: Archive member header starting at offset 8 contains invalid mode string '        '
  status 0
  $ { magic; header a.o/ 4294967296 999999 '1 2' 99 2; printf ab; } > lib.a
  $ both quarn -tv lib.a
  out: ---------999999/     0      2 Jan 01 00:00 1970 a.o (offset      8)
  err: Warning: L6974W: 'lib.a': malformed archive: Archive member header starting at offset 8 contains invalid date string '4294967296  '
  err: Warning: L6974W: 'lib.a': malformed archive: Archive member header starting at offset 8 contains invalid gid string '1 2   '
  err: Warning: L6974W: 'lib.a': malformed archive: Archive member header starting at offset 8 contains invalid mode string '99      '
  status 0
  $ { magic; header a.o/ ' 12 ' ' 3' '4 ' ' 644' ' 2'; printf ab; } > lib.a
  $ both quarn -tv lib.a
  out: rw-r--r--     3/     4      2 Jan 01 00:00 1970 a.o (offset      8)
  status 0
  $ { magic; header a.o/ -1 +1 0x1 08 2; printf ab; } > lib.a
  $ both quarn -tv lib.a
  out: ---------     0/     0      2 Jan 01 00:00 1970 a.o (offset      8)
  err: Warning: L6974W: 'lib.a': malformed archive: Archive member header starting at offset 8 contains invalid date string '-1          '
  err: Warning: L6974W: 'lib.a': malformed archive: Archive member header starting at offset 8 contains invalid uid string '+1    '
  err: Warning: L6974W: 'lib.a': malformed archive: Archive member header starting at offset 8 contains invalid gid string '0x1   '
  status 0

Numbers of digits that the mode doesn't know end before the first of them.

  $ mode() { { magic; header a.o/ 0 0 0 "$1" 0; } > lib.a; quarn -tv lib.a; }
  $ mode 1238
  --x-w--wx     0/     0      0 Jan 01 00:00 1970 a.o (offset      8)
  $ mode 9
  ---------     0/     0      0 Jan 01 00:00 1970 a.o (offset      8)
  $ mode 08
  ---------     0/     0      0 Jan 01 00:00 1970 a.o (offset      8)
  $ mode 12389
  Warning: L6974W: 'lib.a': malformed archive: Archive member header starting at offset 8 contains invalid mode string '12389   '
  ---------     0/     0      0 Jan 01 00:00 1970 a.o (offset      8)
  $ mode 777x
  Warning: L6974W: 'lib.a': malformed archive: Archive member header starting at offset 8 contains invalid mode string '777x    '
  ---------     0/     0      0 Jan 01 00:00 1970 a.o (offset      8)

Fields are shown with the blanks behind them, up to a NUL byte if there is one.

  $ { magic; header a.o/ 'x y' 0 0 644 0; } > lib.a; quarn -t lib.a
  Warning: L6974W: 'lib.a': malformed archive: Archive member header starting at offset 8 contains invalid date string 'x y         '
  a.o
  $ { magic; header a.o/ 0 0 0 644 0 | sed 's/0  /x\x00z/'; } > lib.a; quarn -t lib.a
  Warning: L6974W: 'lib.a': malformed archive: Archive member header starting at offset 8 contains invalid date string 'x'
  a.o

A writing run writes what it has made of it.

  $ { magic; header a.o/ never who which what 2; printf ab; } > lib.a
  $ both quarn -s lib.a
  err: Warning: L6974W: 'lib.a': malformed archive: Archive member header starting at offset 8 contains invalid date string 'never       '
  err: Warning: L6974W: 'lib.a': malformed archive: Archive member header starting at offset 8 contains invalid uid string 'who   '
  err: Warning: L6974W: 'lib.a': malformed archive: Archive member header starting at offset 8 contains invalid gid string 'which '
  err: Warning: L6974W: 'lib.a': malformed archive: Archive member header starting at offset 8 contains invalid mode string 'what    '
  status 0
  $ both quarn -tv lib.a
  out: ---------     0/     0      2 Jan 01 00:00 1970 a.o (offset     72)
  status 0

The tables need not have numbers, but what they have must be some.

  $ { magic; header / '' '' '' '' 4; words 0; header // '' '' '' '' 0; member a.o/ a; } > lib.a; both quarn -t lib.a
  out: a.o
  status 0
  $ { magic; header / x '' '' '' 4; words 0; } > lib.a; both quarn -t lib.a
  err: Warning: L6974W: 'lib.a': malformed archive: Archive member header starting at offset 8 contains invalid date string 'x           '
  status 0
  $ { magic; header // '' x x x 0; } > lib.a; both quarn -t lib.a
  err: Warning: L6974W: 'lib.a': malformed archive: Archive member header starting at offset 8 contains invalid uid string 'x     '
  err: Warning: L6974W: 'lib.a': malformed archive: Archive member header starting at offset 8 contains invalid gid string 'x     '
  err: Warning: L6974W: 'lib.a': malformed archive: Archive member header starting at offset 8 contains invalid mode string 'x       '
  status 0
