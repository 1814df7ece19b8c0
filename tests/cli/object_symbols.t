Symbols, relocations and groups refer to what there is.

  $ . "$TESTDIR/setup.sh"; . "$TESTDIR/objects.sh"

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
