The tables of an object have the right shape, and their texts an end.

  $ . "$TESTDIR/setup.sh"; . "$TESTDIR/objects.sh"

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
