An object that cannot be read is told apart in exact words, and harms neither the run nor its neighbours.

  $ . "$TESTDIR/setup.sh"
  $ cp "$QUARN_EXAMPLES"/matrix_plain.o good.o; cp "$QUARN_EXAMPLES"/calendar_plain.o later.o
  $ cp "$QUARN_EXAMPLES"/wide_plain.o whole.o
  $ library start.a good.o; library without.a good.o later.o
  $ quarn --sizes without.a > sizes; quarn --zs without.a | awk '{ print $1, $3 }' > published

x.o stands between two good objects, behind the symbol table: it is member #2. What is shown here is all
that is said. The member is kept as it is, the neighbours are published, and the reports leave it out.

  $ refused() {
  >   cp start.a lib.a
  >   quarn -r lib.a x.o later.o 2>&1 || echo "status $?"
  >   quarn -p lib.a x.o | cmp - x.o
  >   quarn --zs lib.a | awk '{ print $1, $3 }' | diff published -
  >   { quarn --sizes lib.a 2>&1 || echo "status $?"; } | diff sizes -
  >   { quarn --entries lib.a 2>&1 || echo "status $?"; } | diff <(echo 'No ENTRY points found.') -
  >   cp lib.a once.a; quarn -s lib.a > again 2>&1 || echo "status $?"
  >   cmp lib.a once.a; [ "$(wc -l < again)" = 1 ] || cat again
  > }

When it is taken, the count of its published names and its row in the table of sizes are shown.

  $ taken() {
  >   cp start.a lib.a
  >   quarn -r lib.a x.o later.o 2>&1 || echo "status $?"
  >   quarn -p lib.a x.o | cmp - x.o
  >   quarn --zs lib.a 2>&1 | grep -c ' from x.o '
  >   quarn --sizes lib.a 2>&1 | grep ' x.o$'
  > }
  $ x() { cp whole.o x.o; }; x; taken
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

The shape of tables: the size of an entry, then the size of the whole.

  $ x; section x.o 10 entsize 15; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Section #10 specifies its entry size as 15 (should be 16)
  $ x; section x.o 10 entsize 24; section x.o 10 size 1; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Section #10 specifies its entry size as 24 (should be 16)
  $ x; section x.o 10 size 367; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Section #10 has length 367, which is not a multiple of 16
  $ x; section x.o 10 entsize 0; taken
  10
         912         80          0          0          0   x.o
  $ x; section x.o 10 entsize 0; section x.o 10 size 15; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Section #10 has length 15, which is not a multiple of 16
  $ x; section x.o 3 entsize 12; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Section #3 specifies its entry size as 12 (should be 8)
  $ x; section x.o 3 size 95; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Section #3 has length 95, which is not a multiple of 8
  $ x; section x.o 3 type 4; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Section #3 specifies its entry size as 8 (should be 12)
  $ x; section x.o 5 type 4; section x.o 5 entsize 0; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Section #5 has length 80, which is not a multiple of 12
  $ x; section x.o 6 type 11; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Section #6 specifies its entry size as 1 (should be 16)
  $ x; section x.o 6 type 17; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Section #6 specifies its entry size as 1 (should be 4)
  $ x; section x.o 6 type 17; section x.o 6 entsize 0; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Section #6 has length 29, which is not a multiple of 4
  $ x; section x.o 6 type 18; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Section #6 specifies its entry size as 1 (should be 4)
  $ x; section x.o 6 type 18; section x.o 6 entsize 4; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Section #6 has length 29, which is not a multiple of 4
  $ x; section x.o 10 size 1; section x.o 6 type 17; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Section #6 specifies its entry size as 1 (should be 4)

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

String tables: not empty, and a zero byte at both ends.

  $ x; section x.o 1 size 0; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': String table section #1 is completely empty
  $ x; patch x.o 1680 41; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': String table section #1 starts with a non-zero byte value
  $ x; section x.o 1 size 325; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': String table section #1 ends with a non-zero byte value
  $ x; patch x.o 1680 41; section x.o 1 size 325; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': String table section #1 starts and ends with a non-zero byte value
  $ x; addSection x.o 3 01; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': String table section #11 starts and ends with a non-zero byte value
  $ x; addSection x.o 3 00; taken
  10
         912         80          0          0          0   x.o
  $ x; addSection x.o 3 ''; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': String table section #11 is completely empty

In the order of sections: a table's bytes before those of a later section.

  $ x; section x.o 1 size 0; section x.o 6 size 9999; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': String table section #1 is completely empty
  $ x; addSection x.o 3 ''; section x.o 6 size 9999; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': I/O error writing file 'x.o': Unknown error -1

The table of section names.

  $ x; elf x.o shstrndx 11; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': ELF header refers to section-name string table section #11 but the last section is #10
  $ x; elf x.o shstrndx 65534; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': ELF header refers to section-name string table section #65534 but the last section is #10
  $ x; elf x.o shstrndx 65535; section x.o 0 link 1; taken
  10
         912         80          0          0          0   x.o
  $ x; elf x.o shstrndx 65535; section x.o 0 link 4294967295; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': ELF header refers to section-name string table section #4294967295 but the last section is #10
  $ x; elf x.o shstrndx 2; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': ELF header refers to section-name string table section #2 but that section has type #1 (SHT_PROGBITS) instead of SHT_STRTAB
  $ x; elf x.o shstrndx 65535; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Section name field for section #1 specifies a nonzero string table offset, but there is no section-name string table
  $ x; elf x.o shstrndx 0; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Section name field for section #1 specifies a nonzero string table offset, but there is no section-name string table
  $ x; elf x.o shstrndx 0; for index in 1 2 3 4 5 6 7 8 9 10; do section x.o $index name 0; done; taken
  10
         912         80          0          0          0   x.o
  $ x; section x.o 2 name 326; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Section name field for section #2 specifies a string table offset 326 which is beyond the end of the section-name string table (length 326)
  $ x; section x.o 0 name 4294967295; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Section name field for section #0 specifies a string table offset 4294967295 which is beyond the end of the section-name string table (length 326)
  $ x; section x.o 2 name 325; taken
  10
         912         80          0          0          0   x.o

Types have names, and those without are only numbers.

  $ for type in 0 1 2 4 5 6 7 8 9 10 11 12 13 14 15 16 17 18 19 1879002115 1879048189 1879048190 1879048191 \
  >   1879048192 1879048193 1879048194 1879048195 1879048196 1879048197 4294967295; do
  >   x; section x.o 7 type $type; elf x.o shstrndx 7; refused
  > done | sed 's/.*that section has //'
  type #0 (SHT_NULL) instead of SHT_STRTAB
  type #1 (SHT_PROGBITS) instead of SHT_STRTAB
  type #2 (SHT_SYMTAB) instead of SHT_STRTAB
  type #4 (SHT_RELA) instead of SHT_STRTAB
  type #5 (SHT_HASH) instead of SHT_STRTAB
  type #6 (SHT_DYNAMIC) instead of SHT_STRTAB
  type #7 (SHT_NOTE) instead of SHT_STRTAB
  type #8 (SHT_NOBITS) instead of SHT_STRTAB
  type #9 (SHT_REL) instead of SHT_STRTAB
  type #10 (SHT_SHLIB) instead of SHT_STRTAB
  type #11 (SHT_DYNSYM) instead of SHT_STRTAB
  type #12 instead of SHT_STRTAB
  type #13 instead of SHT_STRTAB
  type #14 (SHT_INIT_ARRAY) instead of SHT_STRTAB
  type #15 (SHT_FINI_ARRAY) instead of SHT_STRTAB
  type #16 (SHT_PREINIT_ARRAY) instead of SHT_STRTAB
  type #17 (SHT_GROUP) instead of SHT_STRTAB
  type #18 (SHT_SYMTAB_SHNDX) instead of SHT_STRTAB
  type #19 instead of SHT_STRTAB
  type #1879002115 instead of SHT_STRTAB
  type #1879048189 (SHT_GNU_verdef) instead of SHT_STRTAB
  type #1879048190 (SHT_GNU_verneed) instead of SHT_STRTAB
  type #1879048191 (SHT_GNU_versym) instead of SHT_STRTAB
  type #1879048192 instead of SHT_STRTAB
  type #1879048193 (SHT_ZEV_EXIDX) instead of SHT_STRTAB
  type #1879048194 (SHT_ZEV_PREEMPTMAP) instead of SHT_STRTAB
  type #1879048195 (SHT_ZEV_ATTRIBUTES) instead of SHT_STRTAB
  type #1879048196 (SHT_ZEV_DEBUGOVERLAY) instead of SHT_STRTAB
  type #1879048197 instead of SHT_STRTAB
  type #4294967295 instead of SHT_STRTAB

Links of symbol tables, static and dynamic.

  $ x; section x.o 10 link 11; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Symbol table section #10 refers to string table section #11 but the last section is #10
  $ x; section x.o 10 link 0; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Symbol table section #10 refers to string table section #0 but that section has type #0 (SHT_NULL) instead of SHT_STRTAB
  $ x; section x.o 10 link 10; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Symbol table section #10 refers to string table section #10 but that section has type #2 (SHT_SYMTAB) instead of SHT_STRTAB
  $ x; addSection x.o 11 "$(little 4 0 0 0 0)" link 12; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Symbol table section #11 refers to string table section #12 but the last section is #11
  $ x; addSection x.o 11 "$(little 4 0 0 0 0)" link 2; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Symbol table section #11 refers to string table section #2 but that section has type #1 (SHT_PROGBITS) instead of SHT_STRTAB

Links of relocation sections: the symbol table first, then the target.

  $ x; section x.o 3 link 11; section x.o 3 info 11; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Relocation section #3 refers to symbol table section #11 but the last section is #10
  $ x; section x.o 3 link 1; section x.o 3 info 11; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Relocation section #3 refers to symbol table section #1 but that section has type #3 (SHT_STRTAB) instead of SHT_SYMTAB or SHT_DYNSYM
  $ x; section x.o 3 info 11; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Relocation section #3 refers to target section #11 but the last section is #10
  $ x; addSection x.o 4 '' link 0; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Relocation section #11 refers to symbol table section #0 but that section has type #0 (SHT_NULL) instead of SHT_SYMTAB or SHT_DYNSYM
  $ x; addSection x.o 4 '' link 10 info 4294967295; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Relocation section #11 refers to target section #4294967295 but the last section is #11

A relocation section may aim at any section, a note and itself too.

  $ x; section x.o 3 info 7; section x.o 7 type 7; section x.o 5 info 5; taken
  10
         912         80          0          0          0   x.o

Links of hash sections, preemption maps and dynamic sections. The last two may have none.

  $ x; addSection x.o 5 '' link 12; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Hash section #11 refers to symbol table section #12 but the last section is #11
  $ x; addSection x.o 5 '' link 10; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Hash section #11 refers to symbol table section #10 but that section has type #2 (SHT_SYMTAB) instead of SHT_DYNSYM
  $ x; addSection x.o 5 '' link 0; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Hash section #11 refers to symbol table section #0 but that section has type #0 (SHT_NULL) instead of SHT_DYNSYM
  $ x; addSection x.o 0x70000002 '' link 12; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Preemption map section #11 refers to string table section #12 but the last section is #11
  $ x; addSection x.o 0x70000002 '' link 2; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Preemption map section #11 refers to string table section #2 but that section has type #1 (SHT_PROGBITS) instead of SHT_STRTAB
  $ x; addSection x.o 6 '' link 12; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Dynamic section #11 refers to string table section #12 but the last section is #11
  $ x; addSection x.o 6 '' link 2; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Dynamic section #11 refers to string table section #2 but that section has type #1 (SHT_PROGBITS) instead of SHT_STRTAB
  $ x; addSection x.o 6 '' link 0; addSection x.o 0x70000002 '' link 0; taken
  10
         912         80          0          0          0   x.o

Links of groups. The text is wider than the rule: a dynamic symbol table is not taken.

  $ x; addSection x.o 17 "$(little 4 1 2)" link 12; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Group section #11 refers to symbol table section #12 but the last section is #11
  $ x; addSection x.o 17 "$(little 4 1 2)" link 1; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Group section #11 refers to symbol table section #1 but that section has type #3 (SHT_STRTAB) instead of SHT_SYMTAB or SHT_DYNSYM
  $ x; addSection x.o 11 "$(little 4 0 0 0 0)" link 1; addSection x.o 17 "$(little 4 1 2)" link 11; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Group section #12 refers to symbol table section #11 but that section has type #11 (SHT_DYNSYM) instead of SHT_SYMTAB or SHT_DYNSYM
  $ x; addSection x.o 17 "$(little 4 1 2)" link 10 info 23; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Group section #11 refers to symbol #23 but its associated symbol table section #10 only contains 23 symbols
  $ x; addSection x.o 17 "$(little 4 1 2)" link 10 info 22; taken
  10
         912         80          0          0          0   x.o

Links of tables of wide section indices: the link, then that there is one only, then the number of words.

  $ wide() { little 4 $(printf '%*s' "$1" | sed 's/ / 0/g'); }
  $ x; addSection x.o 18 "$(wide 23)" link 12; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': SHT_SYMTAB_SHNDX section #11 refers to symbol table section #12 but the last section is #11
  $ x; addSection x.o 18 "$(wide 23)" link 3; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': SHT_SYMTAB_SHNDX section #11 refers to symbol table section #3 but that section has type #9 (SHT_REL) instead of SHT_SYMTAB or SHT_DYNSYM
  $ x; addSection x.o 18 "$(wide 23)" link 10; taken
  10
         912         80          0          0          0   x.o
  $ addSection x.o 18 "$(wide 22)" link 10; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': SHT_SYMTAB_SHNDX sections #11 and #12 are both associated with the same symbol table section #10
  $ x; addSection x.o 18 "$(wide 22)" link 10; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': SHT_SYMTAB_SHNDX section #11 contains 22 entries, but its associated symbol table section #10 contains 23
  $ x; addSection x.o 11 "$(little 4 0 0 0 0)" link 1; addSection x.o 18 "$(wide 2)" link 11; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': SHT_SYMTAB_SHNDX section #12 contains 2 entries, but its associated symbol table section #11 contains 1

The links of all other sections come last.

  $ x; section x.o 6 link 11; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Link field of section #6 refers to target section #11 but the last section is #10
  $ x; section x.o 6 link 4294967295; section x.o 9 link 99; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Link field of section #6 refers to target section #4294967295 but the last section is #10
  $ x; section x.o 6 link 99; section x.o 10 link 99; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Symbol table section #10 refers to string table section #99 but the last section is #10
  $ x; section x.o 5 link 99; section x.o 10 link 99; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Relocation section #5 refers to symbol table section #99 but the last section is #10

Symbols: the name, then the section, then the type.

  $ x; symbol x.o 4 name 326; symbol x.o 4 shndx 11; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Symbol #4 in symbol table section #10 refers to offset 326 in string table section #1, which is only 326 bytes long
  $ x; symbol x.o 22 name 4294967295; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Symbol #22 in symbol table section #10 refers to offset 4294967295 in string table section #1, which is only 326 bytes long
  $ x; symbol x.o 0 name 4294967295; symbol x.o 0 shndx 99; taken
  10
         912         80          0          0          0   x.o
  $ x; symbol x.o 4 shndx 11; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Symbol #4 in symbol table section #10 is defined in section #11 but the last section is #10
  $ x; symbol x.o 4 shndx 0xff00; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Symbol #4 in symbol table section #10 is defined in section #65280 but the last section is #10
  $ x; symbol x.o 4 shndx 0xfff3; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Symbol #4 in symbol table section #10 is defined in section #65523 but the last section is #10
  $ x; symbol x.o 4 shndx 0xffff; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Symbol #4 in symbol table section #10 has SHN_XINDEX section field, but there is no SHT_SYMTAB_SHNDX section associated with the symbol table
  $ xindex() { x; addSection x.o 18 "$(little 4 0 0 0 0 "$1")$(wide 18)" link 10; symbol x.o 4 shndx 0xffff; }
  $ xindex 2; taken
  10
         912         80          0          0          0   x.o
  $ xindex 0; taken
  10
         912         80          0          0          0   x.o
  $ xindex 12; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Symbol #4 in symbol table section #10 is defined in section #12 but the last section is #11
  $ xindex 0xfff1; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Symbol #4 in symbol table section #10 is defined in section #65521 but the last section is #11
  $ xindex 4294967295; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Symbol #4 in symbol table section #10 is defined in section #4294967295 but the last section is #11
  $ for index in 0 0xfff1 0xfff2; do x; symbol x.o 2 shndx $index; refused; done
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Symbol #2 in symbol table section #10 has type STT_SECTION but is not defined relative to a section
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Symbol #2 in symbol table section #10 has type STT_SECTION but is not defined relative to a section
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Symbol #2 in symbol table section #10 has type STT_SECTION but is not defined relative to a section
  $ x; symbol x.o 2 shndx 0; symbol x.o 2 name 999; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Symbol #2 in symbol table section #10 refers to offset 999 in string table section #1, which is only 326 bytes long
  $ x; symbol x.o 9 name 999; symbol x.o 4 shndx 99; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Symbol #4 in symbol table section #10 is defined in section #99 but the last section is #10

Those of a dynamic table are called so.

  $ dynamic() { x; addSection x.o 11 "$(little 4 0 0 0 0 "$1" 0 0)$(little 1 "$2" 0)$(little 2 "$3")" link 1; }
  $ dynamic 326 0 0; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Symbol #1 in dynamic symbol table section #11 refers to offset 326 in string table section #1, which is only 326 bytes long
  $ dynamic 1 0 12; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Symbol #1 in dynamic symbol table section #11 is defined in section #12 but the last section is #11
  $ dynamic 1 0 0xffff; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Symbol #1 in dynamic symbol table section #11 has SHN_XINDEX section field, but there is no SHT_SYMTAB_SHNDX section associated with the symbol table
  $ dynamic 1 3 0; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Symbol #1 in dynamic symbol table section #11 has type STT_SECTION but is not defined relative to a section

The table of section 0 is not named.

  $ zero() {
  >   x; section x.o 0 type 2; section x.o 0 offset 1136; section x.o 0 size 368; section x.o 0 link 1
  >   for index in 3 5 10; do section x.o $index type 1; section x.o $index size 0; done
  > }
  $ zero; taken
  10
         912         80          0          0          0   x.o
  $ zero; symbol x.o 2 shndx 0xfff1; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Symbol #2 has type STT_SECTION but is not defined relative to a section
  $ zero; symbol x.o 2 name 999; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Symbol #2 in symbol table section #0 refers to offset 999 in string table section #1, which is only 326 bytes long

Relocations: the first row, the last one, and a table without even the row of zeros.

  $ row() { patch x.o $(( $1 + 8 * $2 + 4 )) "$(little 4 $(( $3 << 8 | 2 )))"; }
  $ x; row 1504 0 23; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Relocation #0 in relocation section #3 refers to symbol #23 but its associated symbol table section #10 only contains 23 symbols
  $ x; row 1504 11 0xffffff; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Relocation #11 in relocation section #3 refers to symbol #16777215 but its associated symbol table section #10 only contains 23 symbols
  $ x; row 1504 0 22; row 1504 11 0; taken
  10
         912         80          0          0          0   x.o
  $ x; section x.o 10 size 0; row 1504 0 0; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Relocation #0 in relocation section #3 refers to symbol #0 but its associated symbol table section #10 only contains 0 symbols
  $ x; addSection x.o 4 "$(little 4 0 0x202 0 0 0x1702 0)" link 10 info 2; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Relocation #1 in relocation section #11 refers to symbol #23 but its associated symbol table section #10 only contains 23 symbols
  $ dynamic 1 0 0; addSection x.o 9 "$(little 4 0 0x202)" link 11 info 2; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Relocation #0 in relocation section #12 refers to symbol #2 but its associated symbol table section #11 only contains 2 symbols
  $ x; row 1504 0 23; symbol x.o 22 shndx 99; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Symbol #22 in symbol table section #10 is defined in section #99 but the last section is #10

Groups: a member that is there, and that is in one group once. The first section, of no type, is passed over.

  $ x; addSection x.o 17 "$(little 4 1 12)" link 10; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Group section #11 refers to member section #12 but the last section is #11
  $ x; addSection x.o 17 "$(little 4 1 2 2)" link 10; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Section #2 belongs to group section #11 and also to group section #11
  $ x; addSection x.o 17 "$(little 4 1 2)" link 10; addSection x.o 17 "$(little 4 1 4 2)" link 10; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Section #2 belongs to group section #11 and also to group section #12
  $ x; addSection x.o 17 "$(little 4 1 2 2 4294967295)" link 10; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Section #2 belongs to group section #11 and also to group section #11
  $ x; addSection x.o 17 "$(little 4 1 0 0 2)" link 10; addSection x.o 17 '' link 10; taken
  10
         912         80          0          0          0   x.o
  $ zero; addSection x.o 17 "$(little 4 1 0 0)" link 0; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Section #0 belongs to group section #11 and also to group section #11

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

Records of overlaid debug sections: which section, then where its other one is.

  $ overlay() { cp renamed.o x.o; addSection x.o 0x70000004 "$1" entsize "$2"; }
  $ sed 's/\.comment/.debug_a/' whole.o > renamed.o
  $ overlay "$(little 4 0)$(little 2 2 0)" 8; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Record #0 in debug overlay section #11 refers to section #2 which is not a debug section
  $ overlay "$(little 4 0)$(little 2 12 99)" 8; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Record #0 in debug overlay section #11 refers to section #12 which is not a section
  $ overlay "$(little 4 0)$(little 2 6 2)$(little 4 0)$(little 2 6 12)" 8; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Record #1 in debug overlay section #11 refers to section #12 which is not a section
  $ overlay "$(little 4 0)$(little 2 2 12)" 8; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Record #0 in debug overlay section #11 refers to section #2 which is not a debug section
  $ overlay "$(little 4 0)$(little 2 0 0)" 8; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Record #0 in debug overlay section #11 refers to section #0 which is not a debug section
  $ overlay "$(little 4 0)$(little 4 6 70000)" 12; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Record #0 in debug overlay section #11 refers to section #70000 which is not a section
  $ overlay "$(little 4 0)$(little 4 6 2)" 12; taken
  10
         912         80          0          0         29   x.o
  $ overlay "$(little 4 0)$(little 2 6 2)ffffffffffffff" 8; taken
  10
         912         80          0          0         29   x.o
  $ for size in 0 1 7; do overlay ffffffffffffffffffffffff $size; taken; done
  10
         912         80          0          0         29   x.o
  10
         912         80          0          0         29   x.o
  10
         912         80          0          0         29   x.o

Notes that say in which segment each section in memory lies: sections #2 and #4 are such.

  $ mapped() { x; addSection x.o 7 "$(little 4 4 $(( 4 * $# )) 0x40000000)5a455600$(little 4 "$@")"; }
  $ mapped 0 0; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Section/segment mapping in SHT_NOTE section #11 maps section #2 to segment #0 which does not exist
  $ mapped 0 0; addSegment x.o 6 0 0 0 4; taken
  10
         912         80          0          0          0   x.o
  $ mapped 0 1; addSegment x.o 6 0 0 0 4; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Section/segment mapping in SHT_NOTE section #11 maps section #4 to segment #1 which does not exist
  $ mapped 0; addSegment x.o 6 0 0 0 4; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Section/segment mapping in SHT_NOTE section #11 contains 1 entries, but there are 2 SHF_ALLOC sections
  $ mapped 0 0 9; addSegment x.o 6 0 0 0 4; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Section/segment mapping in SHT_NOTE section #11 contains 3 entries, but there are 2 SHF_ALLOC sections
  $ mapped 0 4294967295 9; addSegment x.o 6 0 0 0 4; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Section/segment mapping in SHT_NOTE section #11 maps section #4 to segment #4294967295 which does not exist
  $ mapped; addSegment x.o 6 0 0 0 4; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Section/segment mapping in SHT_NOTE section #11 contains 0 entries, but there are 2 SHF_ALLOC sections

Only a note of just this name and type, with sixteen bytes; odd bytes at its end, or too many promised, are nothing.

  $ note() { x; addSection x.o 7 "$1"; addSegment x.o 6 0 0 0 4; }
  $ note "$(little 4 3 4 0x40000000)5a455600$(little 4 9)"; taken
  10
         912         80          0          0          0   x.o
  $ note "$(little 4 4 4 0x40000001)5a455600$(little 4 9)"; taken
  10
         912         80          0          0          0   x.o
  $ note "$(little 4 4 4 0x40000000)5a455800$(little 4 9)"; taken
  10
         912         80          0          0          0   x.o
  $ note "$(little 4 4 4 0x40000000)5a4556"; taken
  10
         912         80          0          0          0   x.o
  $ note "$(little 4 4 11 0x40000000)5a455600$(little 4 0 0)ffffff00"; taken
  10
         912         80          0          0          0   x.o
  $ note "$(little 4 4 4294967288 0x40000000)5a455600$(little 4 0 0)"; taken
  10
         912         80          0          0          0   x.o
  $ note "$(little 4 4 4 1)5a455600$(little 4 9)$(little 4 4 8 0x40000000)5a455600$(little 4 0 7)"; refused
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': Section/segment mapping in SHT_NOTE section #11 maps section #4 to segment #7 which does not exist

Odd alignments and addresses are not judged.

  $ x; section x.o 2 addralign 12; section x.o 2 addr 7; section x.o 10 info 999; taken
  10
         912         80          0          0          0   x.o

What has no header that can be read is no object at all: it is kept without a word about its symbols.

  $ other() {
  >   cp start.a lib.a; quarn -r lib.a x.o later.o 2>&1 || echo "status $?"
  >   quarn -p lib.a x.o | cmp - x.o; quarn --sizes lib.a | diff sizes -
  >   quarn --zs lib.a | awk '{ print $1, $3 }' | diff published -
  > }
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

Every object that cannot be read has its line, in the order of members, and the others are published. The number
counts the tables that the file had in front, a table of long names made in this run not.

  $ cp "$QUARN_EXAMPLES"/wide_plain.o x.o; cp x.o y.o; elf x.o machine 3; elf y.o version 0
  $ cp good.o good_object_with_a_long_name.o
  $ both quarn --create lib.a x.o good.o y.o
  err: Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #0 'x.o': ELF file has unsupported machine code 3 (we only handle EM_ZEV = 40)
  err: Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #2 'y.o': ELF file has unsupported version code 0 (we only handle version 1)
  status 0
  $ quarn -t lib.a; quarn --zs lib.a
  x.o
  good.o
  y.o
  mat4_identity        from good.o     at offset   2666
  mat4_multiply        from good.o     at offset   2666
  mat4_apply           from good.o     at offset   2666
  matrix_determinant   from good.o     at offset   2666
  vec_dot              from good.o     at offset   2666
  $ both quarn -r -c new.a x.o
  err: Warning: L6974W: 'new.a': malformed archive: Unable to read symbols defined in archive member #0 'x.o': ELF file has unsupported machine code 3 (we only handle EM_ZEV = 40)
  status 0
  $ both quarn --zs new.a
  status 0
  $ both quarn -r new.a good_object_with_a_long_name.o y.o
  err: Warning: L6974W: 'new.a': malformed archive: Unable to read symbols defined in archive member #1 'x.o': ELF file has unsupported machine code 3 (we only handle EM_ZEV = 40)
  err: Warning: L6974W: 'new.a': malformed archive: Unable to read symbols defined in archive member #3 'y.o': ELF file has unsupported version code 0 (we only handle version 1)
  status 0
  $ both quarn -s new.a
  err: Warning: L6974W: 'new.a': malformed archive: Unable to read symbols defined in archive member #2 'x.o': ELF file has unsupported machine code 3 (we only handle EM_ZEV = 40)
  err: Warning: L6974W: 'new.a': malformed archive: Unable to read symbols defined in archive member #4 'y.o': ELF file has unsupported version code 0 (we only handle version 1)
  status 0
  $ both quarn -m -b x.o new.a y.o
  err: Warning: L6974W: 'new.a': malformed archive: Unable to read symbols defined in archive member #2 'y.o': ELF file has unsupported version code 0 (we only handle version 1)
  err: Warning: L6974W: 'new.a': malformed archive: Unable to read symbols defined in archive member #3 'x.o': ELF file has unsupported machine code 3 (we only handle EM_ZEV = 40)
  status 0
  $ both quarn -d new.a good_object_with_a_long_name.o y.o
  err: Warning: L6974W: 'new.a': malformed archive: Unable to read symbols defined in archive member #1 'x.o': ELF file has unsupported machine code 3 (we only handle EM_ZEV = 40)
  status 0

Where no table is wanted no object is read; without one in front the count is one less.

  $ both quarn -n -s new.a
  status 0
  $ both quarn -n -r new.a y.o
  status 0
  $ both quarn -s new.a
  err: Warning: L6974W: 'new.a': malformed archive: Unable to read symbols defined in archive member #0 'x.o': ELF file has unsupported machine code 3 (we only handle EM_ZEV = 40)
  err: Warning: L6974W: 'new.a': malformed archive: Unable to read symbols defined in archive member #1 'y.o': ELF file has unsupported version code 0 (we only handle version 1)
  status 0

Runs that do not write read no object but for the tables of sizes, and say nothing of it.

  $ cp new.a before.a
  $ for run in -t --zs --entries; do both quarn $run new.a; done
  out: x.o
  out: y.o
  status 0
  status 0
  out: No ENTRY points found.
  status 0
  $ both quarn --sizes new.a
  out: 
  out:       Code    RO Data    RW Data    ZI Data      Debug   Object Name
  out:          0          0          0          0          0   TOTAL
  out: 
  status 0
  $ both quarn --zt new.a
  out: 
  out:       Code    RO Data    RW Data    ZI Data      Debug   Object Name
  out:          0          0          0          0          0   TOTAL
  out: 
  out: No ENTRY points found.
  status 0
  $ mkdir out; (cd out; both quarn -x ../new.a; cmp x.o ../x.o; cmp y.o ../y.o)
  status 0
  $ cmp new.a before.a

The report is a warning like others. As an error it stops the write: the old file stays, and no other appears.

  $ both quarn -r --diag_suppress=L6974 new.a good.o; quarn -t new.a; quarn --zs new.a | wc -l
  status 0
  x.o
  y.o
  good.o
  5
  $ cp new.a before.a; ls > listing
  $ both quarn -r --diag_error=L6974 new.a later.o
  err: Error: L6974W: 'new.a': malformed archive: Unable to read symbols defined in archive member #1 'x.o': ELF file has unsupported machine code 3 (we only handle EM_ZEV = 40)
  err: Error: L6974W: 'new.a': malformed archive: Unable to read symbols defined in archive member #2 'y.o': ELF file has unsupported version code 0 (we only handle version 1)
  status 1
  $ both quarn -s --diag_error=warning new.a
  err: Error: L6974W: 'new.a': malformed archive: Unable to read symbols defined in archive member #1 'x.o': ELF file has unsupported machine code 3 (we only handle EM_ZEV = 40)
  err: Error: L6974W: 'new.a': malformed archive: Unable to read symbols defined in archive member #2 'y.o': ELF file has unsupported version code 0 (we only handle version 1)
  status 1
  $ cmp new.a before.a
  $ both quarn --create --diag_error=L6974 none.a x.o
  err: Error: L6974W: 'none.a': malformed archive: Unable to read symbols defined in archive member #0 'x.o': ELF file has unsupported machine code 3 (we only handle EM_ZEV = 40)
  status 1
  $ both quarn --create --diag_error=L6974 new.a x.o
  err: Error: L6974W: 'new.a': malformed archive: Unable to read symbols defined in archive member #0 'x.o': ELF file has unsupported machine code 3 (we only handle EM_ZEV = 40)
  status 1
  $ cmp new.a before.a; ls | diff listing -
  $ both quarn -r --diag_remark=L6974 new.a later.o
  err: 'new.a': malformed archive: Unable to read symbols defined in archive member #1 'x.o': ELF file has unsupported machine code 3 (we only handle EM_ZEV = 40)
  err: 'new.a': malformed archive: Unable to read symbols defined in archive member #2 'y.o': ELF file has unsupported version code 0 (we only handle version 1)
  status 0
  $ both quarn -t --diag_error=L6974 new.a
  out: x.o
  out: y.o
  out: good.o
  out: later.o
  status 0

A good object in its place ends the report.

  $ cp whole.o x.o; cp "$QUARN_EXAMPLES"/bignum_plain.o y.o
  $ both quarn -r new.a x.o y.o
  status 0
