What an object consists of lies in its file, and its sections don't share bytes of it.

  $ . "$TESTDIR/setup.sh"; . "$TESTDIR/objects.sh"

The section headers lie in the file, whatever their count.

  $ x; elf x.o shoff 2009; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': I/O error writing file 'x.o': Unknown error -1
  $ x; elf x.o shoff 4294967295; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': I/O error writing file 'x.o': Unknown error -1
  $ x; elf x.o shnum 12; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': I/O error writing file 'x.o': Unknown error -1
  $ x; elf x.o shnum 65535; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': I/O error writing file 'x.o': Unknown error -1
  $ x; truncate -s -1 x.o; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': I/O error writing file 'x.o': Unknown error -1
  $ x; truncate -s 52 x.o; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': I/O error writing file 'x.o': Unknown error -1

A count of zero is found in the first row.

  $ x; elf x.o shnum 0; section x.o 0 size 11; taken
  10
         912         80          0          0          0   x.o
  $ x; elf x.o shnum 0; section x.o 0 size 12; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': I/O error writing file 'x.o': Unknown error -1
  $ x; elf x.o shnum 0; section x.o 0 size 4294967295; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': I/O error writing file 'x.o': Unknown error -1
  $ x; elf x.o shnum 0; elf x.o shoff 2448; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': I/O error writing file 'x.o': Unknown error -1

No table, or a table of no rows.

  $ x; elf x.o shoff 0; elf x.o shstrndx 99; taken
  0
           0          0          0          0          0   x.o
  $ x; elf x.o shnum 0; elf x.o shstrndx 0; taken
  0
           0          0          0          0          0   x.o
  $ x; elf x.o shnum 0; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': ELF header refers to section-name string table section #1 but the last section is #4294967295
  $ x; elf x.o shnum 0; elf x.o shstrndx 65535; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Section header table is empty

The program headers lie in the file, and so does every segment with bytes, needed or not.

  $ x; elf x.o phoff 52; elf x.o phnum 65535; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': I/O error writing file 'x.o': Unknown error -1
  $ x; elf x.o phoff 2417; elf x.o phnum 1; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': I/O error writing file 'x.o': Unknown error -1
  $ x; elf x.o phoff 4294967295; elf x.o phnum 1; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': I/O error writing file 'x.o': Unknown error -1
  $ x; elf x.o phnum 65535; taken
  10
         912         80          0          0          0   x.o
  $ x; elf x.o phoff 2448; elf x.o phnum 65535; truncate -s $(( 2448 + 32 * 65535 )) x.o; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': I/O error writing file 'x.o': Unknown error -1
  $ x; elf x.o phoff 2448; elf x.o phnum 65534; truncate -s $(( 2448 + 32 * 65534 )) x.o; taken
  10
         912         80          0          0          0   x.o
  $ x; addSegment x.o 1 52 4096 4096 5; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': I/O error writing file 'x.o': Unknown error -1
  $ x; addSegment x.o 4 0 2481 0 4; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': I/O error writing file 'x.o': Unknown error -1
  $ x; addSegment x.o 1 4294967280 32 32 4; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': I/O error writing file 'x.o': Unknown error -1
  $ x; addSegment x.o 1 4294967280 0 64 4; taken
  10
         912         80          0          0          0   x.o
  $ x; addSegment x.o 1 52 912 912 5; taken
  10
         912         80          0          0          0   x.o

The contents of every section lie in the file, but those of sections that have none there.

  $ x; section x.o 2 size 2397; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': I/O error writing file 'x.o': Unknown error -1
  $ x; section x.o 6 offset 2420; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': I/O error writing file 'x.o': Unknown error -1
  $ x; section x.o 6 offset 4294967295; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': I/O error writing file 'x.o': Unknown error -1
  $ x; section x.o 6 size 4294967295; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': I/O error writing file 'x.o': Unknown error -1
  $ x; section x.o 10 size 4294967280; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': I/O error writing file 'x.o': Unknown error -1
  $ x; section x.o 6 type 8; section x.o 6 offset 4294967295; section x.o 6 size 4294967295
  $ section x.o 7 offset 4294967295; section x.o 0 offset 9999; section x.o 0 size 9999; taken
  10
         912         80          0          0          0   x.o

Sections do not share bytes of the file; the lowest pair is named. Headers and segments
may lie anywhere. (The 300 bytes that the second segment shares with the first are counted again as padding.)

  $ x; section x.o 6 offset 963; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Sections #2 and #6 overlap in the file
  $ x; section x.o 6 offset 964; section x.o 4 size 1; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Sections #4 and #6 overlap in the file
  $ x; section x.o 8 offset 1044; section x.o 6 offset 52; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Sections #2 and #6 overlap in the file
  $ x; section x.o 8 offset 52; section x.o 6 offset 60; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Sections #2 and #6 overlap in the file
  $ x; section x.o 6 type 8; section x.o 6 offset 52; section x.o 7 offset 60; taken
  10
         912         80          0          0          0   x.o
  $ x; section x.o 6 offset 0; section x.o 8 type 1; section x.o 8 offset 2100; addSegment x.o 1 0 100 100 4; addSegment x.o 1 50 300 300 4; taken
  10
         912        380          0          0          0   x.o
