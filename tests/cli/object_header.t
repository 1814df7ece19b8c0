What the header of an object must say to be read, in which order its faults are told, and what is no object.

  $ . "$TESTDIR/setup.sh"; . "$TESTDIR/objects.sh"
  $ x; taken
  10
         912         80          0          0          0   x.o

The header: type, encoding, version, machine, in this order. An encoding but 1 is read as the high byte first.

  $ x; elf x.o type 0; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': ELF file has unrecognised type code 0 (we handle types 1-4)
  $ x; elf x.o type 5; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': ELF file has unrecognised type code 5 (we handle types 1-4)
  $ x; elf x.o type 65535; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': ELF file has unrecognised type code 65535 (we handle types 1-4)
  $ x; elf x.o type 4; taken
  10
         912         80          0          0          0   x.o
  $ x; elf x.o data 0; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': ELF file has unrecognised type code 256 (we handle types 1-4)
  $ x; elf x.o data 2; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': ELF file has unrecognised type code 256 (we handle types 1-4)
  $ x; elf x.o data 0; elf x.o type 256; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': ELF file has invalid endianness code 0 (should be 1 or 2)
  $ x; elf x.o data 255; elf x.o type 256; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': ELF file has invalid endianness code 255 (should be 1 or 2)
  $ x; elf x.o version 0; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': ELF file has unsupported version code 0 (we only handle version 1)
  $ x; elf x.o version 4294967295; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': ELF file has unsupported version code 4294967295 (we only handle version 1)
  $ x; elf x.o machine 3; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': ELF file has unsupported machine code 3 (we only handle EM_ZEV = 40)
  $ x; elf x.o machine 0; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': ELF file has unsupported machine code 0 (we only handle EM_ZEV = 40)
  $ x; elf x.o machine 185; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': ELF file has unsupported machine code 185 (we only handle EM_ZEV = 40)
  $ x; elf x.o machine 183; taken
  10
         912         80          0          0          0   x.o
  $ x; elf x.o machine 184; taken
  10
         912         80          0          0          0   x.o
  $ x; elf x.o machine 3; elf x.o version 9; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': ELF file has unsupported version code 9 (we only handle version 1)
  $ elf x.o data 0; elf x.o type 256; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': ELF file has invalid endianness code 0 (should be 1 or 2)
  $ elf x.o type 9; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': ELF file has unrecognised type code 2304 (we handle types 1-4)

The version in the first sixteen bytes is not looked at, nor are the header's and the rows' own sizes.

  $ x; patch x.o 6 00; elf x.o ehsize 0; elf x.o shentsize 0; elf x.o phentsize 0; taken
  10
         912         80          0          0          0   x.o

What has no header that can be read is no object at all: it is kept without a word about its symbols.

  $ x; elf x.o class 0; other
  Warning: L6875W: Adding non-ELF object 'x.o' to archive 'lib.a'
  $ x; elf x.o class 3; other
  Warning: L6875W: Adding non-ELF object 'x.o' to archive 'lib.a'
  $ x; patch x.o 1 65; other
  Warning: L6875W: Adding non-ELF object 'x.o' to archive 'lib.a'
  $ x; patch x.o 0 f74f5243; other
  Warning: L6875W: Adding non-ELF object 'x.o' to archive 'lib.a'
  $ for size in 0 4 10 15 16 51; do x; truncate -s $size x.o; other; done
  Warning: L6875W: Adding non-ELF object 'x.o' to archive 'lib.a'
  Warning: L6875W: Adding non-ELF object 'x.o' to archive 'lib.a'
  Warning: L6875W: Adding non-ELF object 'x.o' to archive 'lib.a'
  Warning: L6875W: Adding non-ELF object 'x.o' to archive 'lib.a'
  Warning: L6875W: Adding non-ELF object 'x.o' to archive 'lib.a'
  Warning: L6875W: Adding non-ELF object 'x.o' to archive 'lib.a'
  $ x; elf x.o class 2; truncate -s 63 x.o; other
  Warning: L6875W: Adding non-ELF object 'x.o' to archive 'lib.a'

The byte for class 2 alone makes 64 bytes an object, whatever stands in front of it.

  $ x; elf x.o class 2; patch x.o 0 f74f5243; elf x.o type 77; truncate -s 64 x.o; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': ELF file has unrecognised type code 77 (we handle types 1-4)
  $ head -c 64 /dev/zero > x.o; elf x.o class 2; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': ELF file has unrecognised type code 0 (we handle types 1-4)

A header alone is a whole object.

  $ x; elf x.o shoff 0; truncate -s 52 x.o; taken
  0
           0          0          0          0          0   x.o
