The numbers of a header at their largest: each is read, shown, and kept by every edit.

  $ . "$TESTDIR/setup.sh"
  $ file new.txt new; headers() { tr -d '\0' < "$1" | grep -a '`$' | grep -av '^/ '; }
  $ { magic; header a.txt/ 4294967295 999999 999999 77777777 1; printf 'a\n'; header b.txt/ 2147483648 100000 0 40000000 1; printf 'b\n'; } > lib.a
  $ quarn -tv lib.a
  rwxrwxrwx999999/999999      1 Feb 07 06:28 2106 a.txt (offset      8)
  ---------100000/     0      1 Jan 19 03:14 2038 b.txt (offset     70)
  $ quarn-ar tv lib.a
  rwsrwsrwt 999999/999999      1 Feb  7 06:28 2106 a.txt
  --------- 100000/0      1 Jan 19 03:14 2038 b.txt
  $ quarn -p lib.a; echo; quarn -x lib.a; cat a.txt b.txt; echo; rm a.txt b.txt
  ab
  ab

  $ cp lib.a copy.a; quarn -s copy.a; headers copy.a
  a.txt/          4294967295  999999999999777777771         `
  b.txt/          2147483648  1000000     400000001         `
  $ cp lib.a copy.a; quarn -m copy.a a.txt; headers copy.a
  b.txt/          2147483648  1000000     400000001         `
  a.txt/          4294967295  999999999999777777771         `
  $ cp lib.a copy.a; quarn -d copy.a b.txt; headers copy.a
  a.txt/          4294967295  999999999999777777771         `
  $ cp lib.a copy.a; quarn -r --normalise=1 --diag_suppress=6875 copy.a new.txt; headers copy.a
  a.txt/          4294967295  999999999999777777771         `
  b.txt/          2147483648  1000000     400000001         `
  new.txt/        1           0     0     100644  3         `
  $ quarn-ar dU copy.a new.txt; quarn-ar mU copy.a a.txt; quarn-ranlib -U copy.a; headers copy.a
  b.txt/          2147483648  1000000     400000001         `
  a.txt/          4294967295  999999999999777777771         `

They come along from another archive, too.

  $ quarn --create --normalise=1 --diag_suppress=6875 other.a lib.a; headers other.a
  a.txt/          4294967295  999999999999777777771         `
  b.txt/          2147483648  1000000     400000001         `

A file is newer than a member, or not, by all bits of the date.

  $ file b.txt new; quarn -ruv --diag_suppress=6875 lib.a b.txt; touch -d @2147483647 b.txt; quarn -ruv --diag_suppress=6875 lib.a b.txt; headers lib.a | tail -1
  b.txt/          2147483648  1000000     400000001         `

Sizes of ten digits, and of more than 32 bits.

  $ sized() { { magic; header a.txt/ 0 0 0 644 "$1"; printf 'ab'; } > lib.a; for tool in 'quarn -t' 'quarn-ar t'; do $tool lib.a 2>&1 | sed 's/.*archive: //'; done | uniq; }
  $ for size in 0000000002 1000000000 2147483647 2147483648 4294967295 4294967296 4294967298 9999999999; do sized $size; done
  a.txt
  Error reading member 'a.txt': archive member is at offset 68 and has size 1000000000 but archive file is only 70 bytes long
  Error reading member 'a.txt': archive member is at offset 68 and has size 2147483647 but archive file is only 70 bytes long
  Error reading member 'a.txt': archive member is at offset 68 and has size 2147483648 but archive file is only 70 bytes long
  Error reading member 'a.txt': archive member is at offset 68 and has size 4294967295 but archive file is only 70 bytes long
  Archive member header starting at offset 8 contains invalid size string '4294967296'
  Archive member header starting at offset 8 contains invalid size string '4294967298'
  Archive member header starting at offset 8 contains invalid size string '9999999999'

Dates of eleven and twelve digits are more than 32 bits, unless they begin with zeros.

  $ for date in 004294967295 10000000000 999999999999; do
  >   { magic; header a.txt/ $date 0 0 644 0; } > lib.a; quarn -tv lib.a 2>&1 | sed 's/.*archive: //'
  > done
  rw-r--r--     0/     0      0 Feb 07 06:28 2106 a.txt (offset      8)
  Archive member header starting at offset 8 contains invalid date string '10000000000 '
  rw-r--r--     0/     0      0 Jan 01 00:00 1970 a.txt (offset      8)
  Archive member header starting at offset 8 contains invalid date string '999999999999'
  rw-r--r--     0/     0      0 Jan 01 00:00 1970 a.txt (offset      8)
