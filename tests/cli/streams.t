Listings go to stdout, diagnostics to stderr, each in the order in which it came about.

  $ . "$TESTDIR/setup.sh"
  $ printf 'one\n' > a.o; printf 'two\n' > b.o; touch -d @1000000000 a.o b.o; library lib.a a.o b.o

Lines and contents in their order, also in a pipe or a file.

  $ quarn -pv lib.a | cat
  
  <a.o>
  
  one
  
  <b.o>
  
  two
  $ quarn -xv lib.a > out; cat out
  x - a.o
  x - b.o

On one descriptor a diagnostic follows what was printed before it.

  $ quarn -t lib.a a.o none b.o > out 2>&1; cat out
  a.o
  Error: L6831E: 'none' not present in archive 'lib.a'
  b.o
  $ quarn -pv lib.a a.o none b.o > out 2>&1; cat out
  
  <a.o>
  
  one
  Error: L6831E: 'none' not present in archive 'lib.a'
  
  <b.o>
  
  two
  $ quarn -rv lib.a a.o none.o b.o 2>&1 | cat
  Warning: L6875W: Adding non-ELF object 'a.o' to archive 'lib.a'
  r - a.o
  Error: L6833E: File 'none.o' does not exist
  r - b.o

Large contents between lines stay in their place.

  $ yes 0123456789 | head -c 1000000 > big; library big.a big a.o
  $ quarn -pv big.a | md5sum | cut -c1-8; { printf '\n<big>\n\n'; cat big; printf '\n<a.o>\n\n'; cat a.o; } | md5sum | cut -c1-8
  a86d9337
  a86d9337

A reader that goes away ends a listing, and the archive is whole.

  $ head -c 3000000 /dev/zero > zeros; library zeros.a zeros zeros
  $ quarn -p zeros.a | head -c 10 | wc -c
  10
  $ quarn -t zeros.a > /dev/null
