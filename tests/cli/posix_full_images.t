The same as on disks in memory, on a file system with blocks, which are handed out late.

  $ . "$TESTDIR/setup.sh"; . "$TESTDIR/limits.sh"
  $ mkdir before disk; cd before; cp "$QUARN_EXAMPLES"/{bignum,matrix}_debug.o "$QUARN_EXAMPLES/calendar_plain.o" .
  $ library lib.a bignum_debug.o calendar_plain.o; cd ..

Not everybody may mount one, and not everywhere.

  $ alone imageDisk > /dev/null 2>&1 || exit 80

  $ alone filled imageDisk quarn -r lib.a matrix_debug.o
  0 1
  $ alone filled imageDisk quarn -s lib.a
  0 1
  $ alone filled imageDisk quarn -d lib.a calendar_plain.o
  0 1
  $ alone filled imageDisk quarn --create -v lib.a bignum_debug.o matrix_debug.o
  0 1
  $ alone filled imageDisk quarn-ar rcs lib.a matrix_debug.o
  0 1
  $ rm before/*.o; alone filled imageDisk quarn -x lib.a
  0 1
