A user's limits on files, descriptors and memory: whatever they are, the old archive is there, or the
complete new one, and nothing else.

  $ . "$TESTDIR/setup.sh"; . "$TESTDIR/limits.sh"
  $ mkdir before; cd before; cp "$QUARN_EXAMPLES"/{bignum,matrix}_debug.o "$QUARN_EXAMPLES/calendar_plain.o" .
  $ yes 0123456789 | head -c 100000 > large
  $ library lib.a bignum_debug.o calendar_plain.o; library large.a large matrix_debug.o; cd ..

A file may not become too large. The limit counts parts of 1024 bytes.

  $ each 'ulimit -f' 0 20 1 quarn -r lib.a matrix_debug.o
  0 1
  $ each 'ulimit -f' 0 12 1 quarn -s lib.a
  0 1
  $ each 'ulimit -f' 0 12 1 quarn --create lib.a matrix_debug.o
  0 1
  $ each 'ulimit -f' 0 100 14 quarn -r -c --diag_suppress=L6875 new.a large
  0 1
  $ each 'ulimit -f' 0 20 1 quarn-ar rcs lib.a matrix_debug.o
  0 1
  $ cp -a before inputs; rm before/large before/*.o; each 'ulimit -f' 0 100 7 quarn -x large.a
  0 1
  $ rm -r before; mv inputs before

So few of them may be open at a time that there is none for some step, from what lets the program begin.

  $ begins() { (ulimit "$@"; exec quarn --vsn) > /dev/null 2>&1; }
  $ fewest=3; until begins -n $fewest || [ $fewest = 10 ]; do fewest=$(( fewest + 1 )); done
  $ each 'ulimit -n' $fewest 10 1 quarn -r lib.a matrix_debug.o
  0 1
  $ each 'ulimit -n' $fewest 10 1 quarn -r lib.a large.a
  0 1
  $ each 'ulimit -n' $fewest 10 1 quarn -r lib.a 'm*.o'
  0 1
  $ each 'ulimit -n' $fewest 10 1 quarn -s lib.a
  0 1
  $ each 'ulimit -n' $fewest 10 1 quarn -d lib.a calendar_plain.o
  0 1
  $ each 'ulimit -n' $fewest 10 1 quarn --sizes lib.a
  0 1
  $ each 'ulimit -n' $fewest 10 1 quarn-ar rcs lib.a matrix_debug.o
  0 1
  $ cp -a before inputs; rm before/large before/*.o; each 'ulimit -n' $fewest 10 1 quarn -x large.a
  0 1
  $ rm -r before; mv inputs before

Memory is short, from what lets the program begin to what is enough.

  $ first=1000; until begins -v $first || [ $first -gt 100000 ]; do first=$(( first + 100 )); done 2> /dev/null
  $ rm before/large
  $ for words in '-s lib.a' '-r lib.a matrix_debug.o' '-x large.a lar*' '-p large.a'; do
  >   planned quarn $words
  >   for size in $(seq $first 50 $(( first + 5000 ))); do
  >     limited "ulimit -v $size" quarn $words
  >     [ "$status" != 0 ] || break
  >   done
  >   met
  > done
  0 1
  0 1
  0 1
  0 1
