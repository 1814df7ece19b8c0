A disk in memory that becomes full at every possible moment: the old archive is there, or the complete
new one, and nothing half.

  $ . "$TESTDIR/setup.sh"; . "$TESTDIR/limits.sh"
  $ mkdir before disk; cd before; cp "$QUARN_EXAMPLES"/{bignum,matrix}_debug.o "$QUARN_EXAMPLES/calendar_plain.o" .
  $ library lib.a bignum_debug.o calendar_plain.o; cd ..

Not everybody may mount one, and not everywhere.

  $ alone memoryDisk > /dev/null 2>&1 || exit 80

  $ alone filled memoryDisk quarn -r lib.a matrix_debug.o
  0 1
  $ alone filled memoryDisk quarn -s lib.a
  0 1
  $ alone filled memoryDisk quarn -d lib.a calendar_plain.o
  0 1
  $ alone filled memoryDisk quarn --create -v lib.a bignum_debug.o matrix_debug.o
  0 1
  $ alone filled memoryDisk quarn-ar rcs lib.a matrix_debug.o
  0 1
  $ rm before/*.o; alone filled memoryDisk quarn -x lib.a
  0 1
