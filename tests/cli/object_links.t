The links between an object's sections lead to sections of the right kind.

  $ . "$TESTDIR/setup.sh"; . "$TESTDIR/objects.sh"

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
