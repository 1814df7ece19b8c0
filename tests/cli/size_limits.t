Sizes, times and places are numbers of 31 bits; what is larger is refused before anything is written.

  $ . "$TESTDIR/setup.sh"
  $ file a.o a; library lib.a a.o; cp lib.a before.a

A file of 2 GiB is too large, one byte less is not.

  $ truncate -s 2147483648 huge; touch -d @1000000000 huge
  $ both timeout 10 quarn -rv --diag_suppress=L6875 lib.a huge
  err: Error: L6835E: Reading file 'lib.a' : Value too large for defined data type
  status 1
  $ cmp lib.a before.a; ls lib.a*
  lib.a

An archive that would get too large is not begun.

  $ truncate -s 2147483647 large; truncate -s 1200000000 half; touch -d @1000000000 large half
  $ both timeout 10 quarn -rv --diag_suppress=L6875 lib.a large
  out: a - large
  err: Error: L6830E: Writing file 'lib.a' : File too large
  status 1
  $ both timeout 10 quarn -r --diag_suppress=L6875 lib.a half half
  err: Error: L6830E: Writing file 'lib.a' : File too large
  status 1
  $ both timeout 10 quarn -rc --diag_suppress=L6875 new.a half half
  err: Error: L6830E: Writing file 'new.a' : File too large
  status 1
  $ cmp lib.a before.a; ls *.a lib.a*
  before.a
  lib.a
  lib.a

An archive of 2 GiB can't be read, and one of less is no trouble.

  $ { magic; member a.o/ ab; } > huge.a; truncate -s 2147483648 huge.a
  $ both timeout 10 quarn -t huge.a
  err: Error: L6835E: Reading file 'huge.a' : Value too large for defined data type
  status 1
  $ both timeout 10 quarn -r huge.a a.o
  err: Error: L6835E: Reading file 'huge.a' : Value too large for defined data type
  status 1
  $ { magic; header zeros/ 0 0 0 644 2000000000; } > large.a; truncate -s 2000000068 large.a
  $ timeout 10 quarn -tv large.a
  rw-r--r--     0/     02000000000 Jan 01 00:00 1970 zeros (offset      8)

So it is with an archive of a time that can't be told.

  $ touch -d @-5 lib.a; both quarn -t lib.a
  err: Error: L6835E: Reading file 'lib.a' : Value too large for defined data type
  status 1
  $ touch -d @2147483648 lib.a; both quarn -t lib.a
  err: Error: L6835E: Reading file 'lib.a' : Value too large for defined data type
  status 1
  $ touch -d @2147483647 lib.a; both quarn -t lib.a
  out: a.o
  status 0
  $ magic > empty.a; touch -d @-5 empty.a; both quarn -t empty.a
  status 0
