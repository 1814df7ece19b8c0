Faults in objects of the other class and of the other byte order are told in the same words.

  $ . "$TESTDIR/setup.sh"; . "$TESTDIR/objects.sh"

Class 2 has wider rows and counts.

  $ cp "$QUARN_OBJECTS"/183-little/allocator_plain.o whole.o; x; taken
  7
        1024          0          0      65568          0   x.o
  $ row64() { patch x.o $(( $(field x.o 40 '0 4') + 64 * $1 + $2 )) "$3"; }
  $ x; row64 8 56 "$(little 8 16)"; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Section #8 specifies its entry size as 16 (should be 24)
  $ x; row64 3 56 "$(little 8 12)"; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Section #3 specifies its entry size as 12 (should be 24)
  $ x; row64 3 56 "$(little 8 $(( 1 << 32 )))"; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Section #3 specifies its entry size as 4294967296 (should be 24)
  $ x; row64 3 4 "$(little 4 9)"; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Section #3 specifies its entry size as 24 (should be 16)
  $ x; row64 8 32 "$(little 8 385)"; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Section #8 has length 385, which is not a multiple of 24
  $ x; row64 2 32 "$(little 8 $(( (1 << 62) )))"; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': I/O error writing file 'x.o': Unknown error -1
  $ x; row64 2 24 ffffffffffffffff; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': I/O error writing file 'x.o': Unknown error -1
  $ x; patch x.o 60 0000; row64 0 32 0000000000000080; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': I/O error writing file 'x.o': Unknown error -1
  $ x; patch x.o 60 0000; row64 0 32 "$(little 8 9)"; taken
  7
        1024          0          0      65568          0   x.o
  $ x; patch x.o 40 ffffffffffffffff; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': I/O error writing file 'x.o': Unknown error -1
  $ x; patch x.o $(( $(field x.o 40 '0 4') )) ffffffff; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Section name field for section #0 specifies a string table offset 4294967295 which is beyond the end of the section-name string table (length 204)
  $ x; patch x.o 1512 "$(little 8 $(( 16 << 32 | 2 )))"; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Relocation #0 in relocation section #3 refers to symbol #16 but its associated symbol table section #8 only contains 16 symbols
  $ x; patch x.o 18 0300; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': ELF file has unsupported machine code 3 (we only handle EM_ZEV = 40)
  $ overlay64() { x; row64 5 4 04000070; row64 5 24 "$(little 8 616 29)"; row64 5 56 "$(little 8 "$1")"; patch x.o 616 "$2"; }
  $ cp "$QUARN_OBJECTS"/183-little/wide_plain.o whole.o
  $ overlay64 12 "$(little 8 0)$(little 2 2 0)"; row64 3 32 "$(little 8 0)"; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Record #0 in debug overlay section #5 refers to section #2 which is not a debug section
  $ overlay64 16 "$(little 8 0)$(little 4 70000 0)"; row64 3 32 "$(little 8 0)"; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Record #0 in debug overlay section #5 refers to section #70000 which is not a section
  $ overlay64 11 "$(little 8 -1 -1)"; row64 3 32 "$(little 8 0)"; taken
  10
         552          0          0          0          0   x.o

The other byte order is turned.

  $ cp "$QUARN_OBJECTS"/40-big/wide_plain.o whole.o; x; patch x.o 16 0007; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': ELF file has unrecognised type code 7 (we handle types 1-4)
  $ x; patch x.o 50 000b; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': ELF header refers to section-name string table section #11 but the last section is #10
  $ cp "$QUARN_OBJECTS"/183-big/wide_plain.o whole.o; x; patch x.o 62 0007; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': ELF header refers to section-name string table section #7 but the last section is #6
