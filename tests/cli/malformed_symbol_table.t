Each fault of a symbol table has its report.

  $ . "$TESTDIR/setup.sh"
  $ file new.o new
  $ refused() {
  >   cp lib.a before.a
  >   quarn -t lib.a 2>&1 | tee shown
  >   for run in -tv -r -d -m -s '-n -s' -x -p --zs '-t -s'; do
  >     quarn $run lib.a new.o > run 2>&1 && echo "$run is taken"
  >     diff shown run; cmp lib.a before.a
  >   done
  >   ls lib.a.* 2> /dev/null || true
  > }

Too short for its count.

  $ { magic; member / ''; } > lib.a; refused
  Error: L6829E: 'lib.a': malformed archive: Archive symbol table is 0 bytes long, but should contain at least a 4-byte symbol count
  $ { magic; member / abc; } > lib.a; refused
  Error: L6829E: 'lib.a': malformed archive: Archive symbol table is 3 bytes long, but should contain at least a 4-byte symbol count

A count that the table has no room for, whatever its size.

  $ counted() { { magic; header / 0 0 0 0 4; words "$1"; member a.o/ a; } > lib.a; refused; }
  $ counted 1
  Error: L6829E: 'lib.a': malformed archive: Archive symbol table is 4 bytes long, but claims to contain 1 symbols so it should be at least 8 bytes long
  $ counted 2
  Error: L6829E: 'lib.a': malformed archive: Archive symbol table is 4 bytes long, but claims to contain 2 symbols so it should be at least 12 bytes long
  $ counted 0x3fffffff
  Error: L6829E: 'lib.a': malformed archive: Archive symbol table is 4 bytes long, but claims to contain 1073741823 symbols so it should be at least 4294967296 bytes long
  $ counted 0x40000000
  Error: L6829E: 'lib.a': malformed archive: Archive symbol table is 4 bytes long, but claims to contain 1073741824 symbols so it should be at least 4294967300 bytes long
  $ counted 0x7fffffff
  Error: L6829E: 'lib.a': malformed archive: Archive symbol table is 4 bytes long, but claims to contain 2147483647 symbols so it should be at least 8589934592 bytes long
  $ counted 0x80000000
  Error: L6829E: 'lib.a': malformed archive: Archive symbol table is 4 bytes long, but claims to contain 2147483648 symbols so it should be at least 8589934596 bytes long
  $ counted 0xffffffff
  Error: L6829E: 'lib.a': malformed archive: Archive symbol table is 4 bytes long, but claims to contain 4294967295 symbols so it should be at least 17179869184 bytes long
  $ { magic; header / 0 0 0 0 11; words 2 8; printf 'abc\n'; } > lib.a; refused
  Error: L6829E: 'lib.a': malformed archive: Archive symbol table is 11 bytes long, but claims to contain 2 symbols so it should be at least 12 bytes long

A name that does not end.

  $ { magic; header / 0 0 0 0 8; words 1 8; } > lib.a; refused
  Error: L6829E: 'lib.a': malformed archive: Archive symbol table ends in the middle of the name of symbol #0 (out of 1)
  $ { magic; header / 0 0 0 0 12; words 1 80; printf main; member a.o/ a; } > lib.a; refused
  Error: L6829E: 'lib.a': malformed archive: Archive symbol table ends in the middle of the name of symbol #0 (out of 1)
  $ { magic; table 'ok\0x' 84 84; member a.o/ a; } > lib.a; refused
  Error: L6829E: 'lib.a': malformed archive: Archive symbol table ends in the middle of the name of symbol #1 (out of 2)
  $ { magic; table 'a\0b\0' 96 96 96; member a.o/ a; } > lib.a; refused
  Warning: L6974W: 'lib.a': malformed archive: Archive symbol table says symbol #0 'a' is defined in the archive member starting at offset 96 but no archive member starts there
  Warning: L6974W: 'lib.a': malformed archive: Archive symbol table says symbol #1 'b' is defined in the archive member starting at offset 96 but no archive member starts there
  Error: L6829E: 'lib.a': malformed archive: Archive symbol table ends in the middle of the name of symbol #2 (out of 3)

A symbol in no member: it is passed over, the others stay.

  $ { magic; table 'main\0lost\0next\0' 100 99 100; member a.o/ a; } > lib.a
  $ both quarn -t lib.a
  out: a.o
  err: Warning: L6974W: 'lib.a': malformed archive: Archive symbol table says symbol #1 'lost' is defined in the archive member starting at offset 99 but no archive member starts there
  status 0
  $ both quarn --zs lib.a
  out: main                 from a.o        at offset    100
  out: next                 from a.o        at offset    100
  err: Warning: L6974W: 'lib.a': malformed archive: Archive symbol table says symbol #1 'lost' is defined in the archive member starting at offset 99 but no archive member starts there
  status 0
  $ { magic; table 'far\0odd\0' 0xfffffffe 0; member a.o/ a; } > lib.a
  $ both quarn -t lib.a
  out: a.o
  err: Warning: L6974W: 'lib.a': malformed archive: Archive symbol table says symbol #0 'far' is defined in the archive member starting at offset 4294967294 but no archive member starts there
  err: Warning: L6974W: 'lib.a': malformed archive: Archive symbol table says symbol #1 'odd' is defined in the archive member starting at offset 0 but no archive member starts there
  status 0
  $ { magic; table 'end\0\0\0' 142; member a.o/ a; } > lib.a
  $ both quarn -t lib.a
  out: a.o
  err: Warning: L6974W: 'lib.a': malformed archive: Archive symbol table says symbol #0 'end' is defined in the archive member starting at offset 142 but no archive member starts there
  status 0

A symbol in one of the tables.

  $ { magic; table 'self\0x\0\0' 8 8; member a.o/ a; } > lib.a
  $ both quarn -t lib.a
  out: a.o
  err: Warning: L6974W: 'lib.a': malformed archive: Archive symbol table says symbol #0 'self' is defined in the archive member starting at offset 8, but that member is not an object file
  err: Warning: L6974W: 'lib.a': malformed archive: Archive symbol table says symbol #1 'x' is defined in the archive member starting at offset 8, but that member is not an object file
  status 0
  $ { magic; table 'long\0\0\0' 84; header // 0 0 0 0 0; member a.o/ a; } > lib.a
  $ both quarn --zs lib.a
  err: Warning: L6974W: 'lib.a': malformed archive: Archive symbol table says symbol #0 'long' is defined in the archive member starting at offset 84, but that member is not an object file
  status 0

Numbers of symbols in reports count those that were passed over.

  $ { magic; table 'a\0b\0c\0d\0' 1 8 2 96; member a.o/ a; } > lib.a
  $ both quarn --zs lib.a
  out: d                    from a.o        at offset     96
  err: Warning: L6974W: 'lib.a': malformed archive: Archive symbol table says symbol #0 'a' is defined in the archive member starting at offset 1 but no archive member starts there
  err: Warning: L6974W: 'lib.a': malformed archive: Archive symbol table says symbol #1 'b' is defined in the archive member starting at offset 8, but that member is not an object file
  err: Warning: L6974W: 'lib.a': malformed archive: Archive symbol table says symbol #2 'c' is defined in the archive member starting at offset 2 but no archive member starts there
  status 0

Bytes behind the last name: zeros are nothing, the first other one is told of.

  $ { magic; table 'main\0\0\0\0' 84; member a.o/ a; } > lib.a; both quarn --zs lib.a
  out: main                 from a.o        at offset     84
  status 0
  $ { magic; table 'main\0\0xy' 84; member a.o/ a; } > lib.a; both quarn --zs lib.a
  out: main                 from a.o        at offset     84
  err: Warning: L6974W: 'lib.a': malformed archive: Archive symbol table contains unexpected data at offset 14, after all the expected data has finished at offset 13
  status 0
  $ { magic; header / 0 0 0 0 8; words 0; printf '\0\0\0\1'; } > lib.a; both quarn -t lib.a
  err: Warning: L6974W: 'lib.a': malformed archive: Archive symbol table contains unexpected data at offset 7, after all the expected data has finished at offset 4
  status 0
  $ { magic; header / 0 0 0 0 4; words 0; } > lib.a; both quarn -t lib.a
  status 0
  $ { magic; header / 0 0 0 0 20; words 0 0 0 0 0; } > lib.a; both quarn -t lib.a
  status 0

A member of any kind may have symbols; members behind a member of odd size are found.

  $ { magic; table 'a\0b\0' 84 146; member a.txt/ a; member b.txt/ b; } > lib.a; both quarn --zs lib.a
  out: a                    from a.txt      at offset     84
  out: b                    from b.txt      at offset    146
  status 0

Warnings can be made errors; the file stays then. Otherwise the table is made anew.

  $ { magic; table 'lost\0\0\0\0' 9; member a.o/ a; } > lib.a; cp lib.a before.a
  $ both quarn -s --diag_error=L6974 lib.a; cmp lib.a before.a
  err: Error: L6974W: 'lib.a': malformed archive: Archive symbol table says symbol #0 'lost' is defined in the archive member starting at offset 9 but no archive member starts there
  status 1
  $ both quarn -r --diag_error=6974 --diag_suppress=6875 lib.a new.o; cmp lib.a before.a
  err: Error: L6974W: 'lib.a': malformed archive: Archive symbol table says symbol #0 'lost' is defined in the archive member starting at offset 9 but no archive member starts there
  status 1
  $ both quarn -s lib.a
  err: Warning: L6974W: 'lib.a': malformed archive: Archive symbol table says symbol #0 'lost' is defined in the archive member starting at offset 9 but no archive member starts there
  status 0
  $ both quarn --zs lib.a
  status 0
  $ cp before.a lib.a; both quarn -n -d lib.a a.o; both quarn -t lib.a
  err: Warning: L6974W: 'lib.a': malformed archive: Archive symbol table says symbol #0 'lost' is defined in the archive member starting at offset 9 but no archive member starts there
  status 0
  status 0

Names in reports are text like any other.

  $ { magic; table 'a\001%%s\377\0' 8; member a.o/ a; } > lib.a; both quarn -t lib.a
  out: a.o
  err: Warning: L6974W: 'lib.a': malformed archive: Archive symbol table says symbol #0 'a\\001%s\xff' is defined in the archive member starting at offset 8, but that member is not an object file (esc)
  status 0

As a file word such an archive is a plain file.

  $ { magic; member / abc; member a.o/ a; } > bad.a; rm lib.a
  $ both quarn -rcv --normalise=1 lib.a bad.a
  out: a - bad.a
  err: Warning: L6875W: Adding non-ELF object 'bad.a' to archive 'lib.a'
  status 0
  $ { magic; table 'lost\0\0\0\0' 9; member a.o/ a; } > bad.a
  $ both quarn -rv --normalise=1 lib.a bad.a
  out: r - bad.a
  err: Warning: L6875W: Adding non-ELF object 'bad.a' to archive 'lib.a'
  status 0
