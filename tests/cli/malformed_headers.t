Each fault of an archive's headers has its report. Those that leave something to go on with are warnings;
the others end the run, and the file stays as it is.

  $ . "$TESTDIR/setup.sh"
  $ file new.o new

What reading runs say is said by writing runs as well, and they change nothing.

  $ refused() {
  >   cp lib.a before.a
  >   quarn -t lib.a 2>&1 | tee shown
  >   for run in -tv -r -d -m -s '-n -s' -x -p --zs '-t -s'; do
  >     quarn $run lib.a new.o > run 2>&1 && echo "$run is taken"
  >     diff shown run; cmp lib.a before.a
  >   done
  >   ls lib.a.* 2> /dev/null || true
  > }

Not an archive at all.

  $ echo 'plain text, longer than the magic' > lib.a; refused
  Error: L6826E: 'lib.a' not in archive format
  $ printf '!<arch>X' > lib.a; refused
  Error: L6826E: 'lib.a' not in archive format
  $ printf '!<thin>\n' > lib.a; refused
  Error: L6826E: 'lib.a' not in archive format

Too short to tell.

  $ : > lib.a; refused
  Error: L6835E: Reading file 'lib.a' : Unexpected end of file
  $ printf '!<a' > lib.a; refused
  Error: L6835E: Reading file 'lib.a' : Unexpected end of file
  $ printf '!<arch>' > lib.a; refused
  Error: L6835E: Reading file 'lib.a' : Unexpected end of file

A header that is cut short, anywhere.

  $ { magic; printf a; } > lib.a; refused
  Error: L6829E: 'lib.a': malformed archive: End of file in the middle of archive member header starting at offset 8
  $ { magic; header a.o/ 0 0 0 644 0 | head -c 15; } > lib.a; refused
  Error: L6829E: 'lib.a': malformed archive: End of file in the middle of archive member header starting at offset 8
  $ { magic; header a.o/ 0 0 0 644 0 | head -c 16; } > lib.a; refused
  Error: L6829E: 'lib.a': malformed archive: End of file in the middle of archive member header starting at offset 8
  $ { magic; header a.o/ 0 0 0 644 0 | head -c 59; } > lib.a; refused
  Error: L6829E: 'lib.a': malformed archive: End of file in the middle of archive member header starting at offset 8
  $ { magic; member a.o/ abc; header b.o/ 0 0 0 644 0 | head -c 40; } > lib.a; refused
  Error: L6829E: 'lib.a': malformed archive: End of file in the middle of archive member header starting at offset 72
  $ { magic; member a.o/ abcd; echo; } > lib.a; refused
  Error: L6829E: 'lib.a': malformed archive: End of file in the middle of archive member header starting at offset 72

The end mark of a header is wrong.

  $ { magic; header a.o/ 0 0 0 644 0 | head -c 58; printf '``'; } > lib.a; refused
  Error: L6829E: 'lib.a': malformed archive: Archive member header starting at offset 8 contains incorrect archive-member magic number
  $ { magic; header a.o/ 0 0 0 644 0 | head -c 58; printf 'x\n'; } > lib.a; refused
  Error: L6829E: 'lib.a': malformed archive: Archive member header starting at offset 8 contains incorrect archive-member magic number
  $ { magic; member a.o/ a; header b.o/ 0 0 0 644 0 | head -c 58; printf '\n`'; } > lib.a; refused
  Error: L6829E: 'lib.a': malformed archive: Archive member header starting at offset 70 contains incorrect archive-member magic number

It is looked at before the fields, which are looked at in their order.

  $ { magic; header a.o/ x x x x x | head -c 58; printf '``'; } > lib.a; refused
  Error: L6829E: 'lib.a': malformed archive: Archive member header starting at offset 8 contains incorrect archive-member magic number

The size is no number.

  $ sized() { { magic; header a.o/ 0 0 0 644 "$1"; printf 'ab'; } > lib.a; refused; }
  $ sized ''
  Error: L6829E: 'lib.a': malformed archive: Archive member header starting at offset 8 contains invalid size string '          '
  $ sized x
  Error: L6829E: 'lib.a': malformed archive: Archive member header starting at offset 8 contains invalid size string 'x         '
  $ sized '2 2'
  Error: L6829E: 'lib.a': malformed archive: Archive member header starting at offset 8 contains invalid size string '2 2       '
  $ sized 2x
  Error: L6829E: 'lib.a': malformed archive: Archive member header starting at offset 8 contains invalid size string '2x        '
  $ sized -2
  Error: L6829E: 'lib.a': malformed archive: Archive member header starting at offset 8 contains invalid size string '-2        '
  $ sized +2
  Error: L6829E: 'lib.a': malformed archive: Archive member header starting at offset 8 contains invalid size string '+2        '
  $ sized 0x2
  Error: L6829E: 'lib.a': malformed archive: Archive member header starting at offset 8 contains invalid size string '0x2       '
  $ sized 2.0
  Error: L6829E: 'lib.a': malformed archive: Archive member header starting at offset 8 contains invalid size string '2.0       '
  $ sized 4294967296
  Error: L6829E: 'lib.a': malformed archive: Archive member header starting at offset 8 contains invalid size string '4294967296'
  $ sized 9999999999
  Error: L6829E: 'lib.a': malformed archive: Archive member header starting at offset 8 contains invalid size string '9999999999'
  $ { magic; header a.o/ 0 0 0 644 "$(printf '2\t')"; printf 'ab'; } > lib.a; refused
  Error: L6829E: 'lib.a': malformed archive: Archive member header starting at offset 8 contains invalid size string '2\t        ' (esc)
  $ { magic; header / '' '' '' '' ''; } > lib.a; refused
  Error: L6829E: 'lib.a': malformed archive: Archive member header starting at offset 8 contains invalid size string '          '
  $ { magic; header // 0 0 0 0 ''; } > lib.a; refused
  Error: L6829E: 'lib.a': malformed archive: Archive member header starting at offset 8 contains invalid size string '          '

The member is not all there.

  $ sized 3
  Error: L6829E: 'lib.a': malformed archive: Error reading member 'a.o': archive member is at offset 68 and has size 3 but archive file is only 70 bytes long
  $ sized 4294967295
  Error: L6829E: 'lib.a': malformed archive: Error reading member 'a.o': archive member is at offset 68 and has size 4294967295 but archive file is only 70 bytes long
  $ sized 4294967235
  Error: L6829E: 'lib.a': malformed archive: Error reading member 'a.o': archive member is at offset 68 and has size 4294967235 but archive file is only 70 bytes long
  $ { magic; member a.o/ ab; header long_member.o/ 0 0 0 644 100; printf 'short'; } > lib.a; refused
  Error: L6829E: 'lib.a': malformed archive: Error reading member 'long_member.o': archive member is at offset 130 and has size 100 but archive file is only 135 bytes long
  $ { magic; header / 0 0 0 0 8; words 0; } > lib.a; refused
  Error: L6829E: 'lib.a': malformed archive: Error reading member '': archive member is at offset 68 and has size 8 but archive file is only 72 bytes long
  $ { magic; member a.o/ ab; header 'sixteenlettersno' 0 0 0 644 100; } > lib.a; quarn -t lib.a
  Warning: L6974W: 'lib.a': malformed archive: Archive member header starting at offset 70 has no '/' character in its name field
  Error: L6829E: 'lib.a': malformed archive: Error reading member '': archive member is at offset 130 and has size 100 but archive file is only 130 bytes long
  [1]

The byte behind an odd member is not there, or is not the right one.

  $ { magic; header a.o/ 0 0 0 644 1; printf a; } > lib.a; refused
  Error: L6835E: Reading file 'lib.a' : Unexpected end of file
  $ { magic; header / 0 0 0 0 5; words 0; printf '\0'; } > lib.a; refused
  Error: L6835E: Reading file 'lib.a' : Unexpected end of file
  $ { magic; header a.o/ 0 0 0 644 1; printf 'aX'; member b.o/ b; } > lib.a; both quarn -t lib.a
  out: a.o
  out: b.o
  err: Warning: L6974W: 'lib.a': malformed archive: Padding byte at offset 69 has value 88 and not 0x0A as it should be
  status 0
  $ { magic; header a.o/ 0 0 0 644 1; printf 'a\377'; member b.o/ b; } > lib.a; both quarn -t lib.a
  out: a.o
  out: b.o
  err: Warning: L6974W: 'lib.a': malformed archive: Padding byte at offset 69 has value -1 and not 0x0A as it should be
  status 0
  $ { magic; member b.o/ bb; header a.o/ 0 0 0 644 1; printf 'a\0'; } > lib.a; both quarn -t lib.a
  out: b.o
  out: a.o
  err: Warning: L6974W: 'lib.a': malformed archive: Padding byte at offset 131 has value 0 and not 0x0A as it should be
  status 0
  $ { magic; header // 0 0 0 0 1; printf 'x '; } > lib.a; both quarn -t lib.a
  err: Warning: L6974W: 'lib.a': malformed archive: Padding byte at offset 69 has value 32 and not 0x0A as it should be
  status 0
  $ both quarn -s lib.a; both quarn -t lib.a
  err: Warning: L6974W: 'lib.a': malformed archive: Padding byte at offset 69 has value 32 and not 0x0A as it should be
  status 0
  status 0

A warning can be made an error, which keeps the file; or be silenced.

  $ { magic; member a.o/ a; member 'a.o/x' a; } > lib.a; cp lib.a before.a
  $ both quarn -t --diag_error=L6974 lib.a
  err: Error: L6974W: 'lib.a': malformed archive: Archive member header starting at offset 70 has a trailing non-space character after the '/' character in its name field
  status 1
  $ both quarn -s --diag_error=6974 lib.a; cmp lib.a before.a
  err: Error: L6974W: 'lib.a': malformed archive: Archive member header starting at offset 70 has a trailing non-space character after the '/' character in its name field
  status 1
  $ both quarn -r --diag_error=warning lib.a new.o; cmp lib.a before.a
  err: Error: L6974W: 'lib.a': malformed archive: Archive member header starting at offset 70 has a trailing non-space character after the '/' character in its name field
  status 1
  $ both quarn -x --diag_error=6974 lib.a; ls a.o
  err: Error: L6974W: 'lib.a': malformed archive: Archive member header starting at offset 70 has a trailing non-space character after the '/' character in its name field
  status 1
  ls: cannot access 'a.o': No such file or directory
  [2]
  $ both quarn -t --diag_suppress=6974 lib.a
  out: a.o
  out: 
  status 0
  $ both quarn -t --diag_remark=6974 lib.a
  out: a.o
  out: 
  err: 'lib.a': malformed archive: Archive member header starting at offset 70 has a trailing non-space character after the '/' character in its name field
  status 0
  $ both quarn -s --diag_suppress=6974 lib.a; cmp -s lib.a before.a
  status 0
  [1]

Faults that end the run can't be lowered.

  $ { magic; printf a; } > lib.a; both quarn -t --diag_suppress=6829,L6974,error lib.a
  err: Error: L6829E: 'lib.a': malformed archive: End of file in the middle of archive member header starting at offset 8
  status 1

Warnings come in the order of the file, before the fault that ends the run.

  $ { magic; header a.o/ x 0 0 644 1; printf 'aX'; member 'c' c; printf 'junk'; } > lib.a; both quarn -t lib.a
  err: Warning: L6974W: 'lib.a': malformed archive: Archive member header starting at offset 8 contains invalid date string 'x           '
  err: Warning: L6974W: 'lib.a': malformed archive: Padding byte at offset 69 has value 88 and not 0x0A as it should be
  err: Warning: L6974W: 'lib.a': malformed archive: Archive member header starting at offset 70 has no '/' character in its name field
  err: Error: L6829E: 'lib.a': malformed archive: End of file in the middle of archive member header starting at offset 132
  status 1
