The symbol table names what the objects define.

  $ . "$TESTDIR/setup.sh"
  $ plain() { cp "$QUARN_EXAMPLES/$1"_plain.o .; }
  $ for name in matrix wide calendar; do plain $name; done

  $ x() { cp wide_plain.o x.o; }
  $ names() { quarn --create "$@" x.a x.o || return; published x.a | sed 's/wide_//' | paste -s -d ' '; }
  $ x; names
  gcd power prime divide parse print to_double from_double to_float shift

They stand member by member, and in a member as the object has them; each goes with the offset of its member.

  $ quarn --create lib.a wide_plain.o matrix_plain.o calendar_plain.o
  $ quarn -tv lib.a | sed 's/.* //'
  470)
  2978)
  8518)
  $ bytes lib.a | sed -n '5,10p' | cut -c 1-55
  0000064 20 20 60 0a 00 00 00 13 00 00 01 d6 00 00 01 d6
  0000080 00 00 01 d6 00 00 01 d6 00 00 01 d6 00 00 01 d6
  0000096 00 00 01 d6 00 00 01 d6 00 00 01 d6 00 00 01 d6
  0000112 00 00 0b a2 00 00 0b a2 00 00 0b a2 00 00 0b a2
  0000128 00 00 0b a2 00 00 21 46 00 00 21 46 00 00 21 46
  0000144 00 00 21 46 77 69 64 65 5f 67 63 64 00 77 69 64
  $ quarn --zs lib.a
  wide_gcd             from wide_plain.o at offset    470
  wide_power           from wide_plain.o at offset    470
  wide_prime           from wide_plain.o at offset    470
  wide_divide          from wide_plain.o at offset    470
  wide_parse           from wide_plain.o at offset    470
  wide_print           from wide_plain.o at offset    470
  wide_to_double       from wide_plain.o at offset    470
  wide_from_double     from wide_plain.o at offset    470
  wide_to_float        from wide_plain.o at offset    470
  wide_shift           from wide_plain.o at offset    470
  mat4_identity        from matrix_plain.o at offset   2978
  mat4_multiply        from matrix_plain.o at offset   2978
  mat4_apply           from matrix_plain.o at offset   2978
  matrix_determinant   from matrix_plain.o at offset   2978
  vec_dot              from matrix_plain.o at offset   2978
  year_is_leap         from calendar_plain.o at offset   8518
  date_to_seconds      from calendar_plain.o at offset   8518
  seconds_to_date      from calendar_plain.o at offset   8518
  date_print           from calendar_plain.o at offset   8518
  $ quarn -m -b wide_plain.o lib.a calendar_plain.o
  $ quarn --zs lib.a | awk '{ print $3 }' | uniq -c
        4 calendar_plain.o
       10 wide_plain.o
        5 matrix_plain.o

All bindings but the local one count, in every section, and every visibility.

  $ for info in 0x12 0x22 0xa2 0xd2 0xf2; do x; symbol x.o 4 info $info; names; done | uniq -c
        5 gcd power prime divide parse print to_double from_double to_float shift
  $ x; symbol x.o 4 info 0x02; names
  power prime divide parse print to_double from_double to_float shift
  $ for other in 1 2 3; do x; symbol x.o 4 other $other; names; done | uniq -c
        3 gcd power prime divide parse print to_double from_double to_float shift
  $ x; symbol x.o 22 shndx 4; symbol x.o 19 shndx 8; names
  gcd power prime divide parse print to_double from_double to_float shift

What is undefined does not count, weak or not; common and absolute symbols do.

  $ x; symbol x.o 5 info 0x20; symbol x.o 22 shndx 0; names
  gcd power prime divide parse print to_double from_double to_float
  $ x; symbol x.o 5 shndx 0xfff2; symbol x.o 9 shndx 0xfff1; names
  gcd __umoddi3 power prime divide __divdi3 parse print to_double from_double to_float shift
  $ x; symbol x.o 5 shndx 0xfff2; symbol x.o 5 info 0x05; symbol x.o 9 shndx 0xfff1; symbol x.o 9 info 0; names
  gcd power prime divide parse print to_double from_double to_float shift

Names of files, of sections and of stretches of code are names like others.

  $ x; symbol x.o 1 info 0x14; symbol x.o 2 info 0x13; symbol x.o 2 name $(symbol x.o 22 name); symbol x.o 3 info 0x10; names
  wide.c shift $a.0 gcd power prime divide parse print to_double from_double to_float shift
  $ x; sed -i 's/wide_from_double/BuildAttributes$/; s/wide_to_float/f$$BuildAttri/' x.o; names
  gcd power prime divide parse print to_double BuildAttributes$ f$$BuildAttri shift

No name, or an empty one, is none.

  $ x; symbol x.o 4 name 0; symbol x.o 6 name 325; names
  prime divide parse print to_double from_double to_float shift

Every static table is walked, in the order of sections; the dynamic one is not.

  $ again=$(od -A n -v -t x1 -j 1136 -N 112 wide_plain.o | tr -d ' \n')
  $ x; addSection x.o 2 "$again" link 1; names
  gcd power prime divide parse print to_double from_double to_float shift gcd power
  $ x; addSection x.o 11 "$again" link 1; names
  gcd power prime divide parse print to_double from_double to_float shift

A wide index is the number of a section, and nothing else.

  $ x; addSection x.o 18 "$(little 4 0 0 0 0 0 0 2 6 0 0 0 0 0 0 0 0 0 0 0 0 0 0 0)" link 10
  $ symbol x.o 4 shndx 0xffff; symbol x.o 6 shndx 0xffff; symbol x.o 7 shndx 0xffff; names
  gcd power prime divide parse print to_double from_double to_float shift

Symbols in debug sections are left out unless asked for.

  $ within() { x; sed -i "s/\.comment/$1/" x.o; symbol x.o 4 shndx 6; symbol x.o 6 shndx 6; shift; names "$@"; }
  $ within .comment
  gcd power prime divide parse print to_double from_double to_float shift
  $ for section in .debug_x .debuggg '.debug\x00\x00' .linexyz '.line\x00\x00\x00' '.linear\x00' 'C$$fpmap'; do within "$section"; done | uniq -c
        7 prime divide parse print to_double from_double to_float shift
  $ for section in 'x.debug_' .Debug_x '.debu\x00\x00\x00' '.lin\x00xxx' xline_xx 'C$$fpma\x00' 'c$$fpmap'; do within "$section"; done | uniq -c
        7 gcd power prime divide parse print to_double from_double to_float shift
  $ x; sed -i 's/\.llvm_addrsig/C$$fpmap_more/' x.o; symbol x.o 4 shndx 9; names
  gcd power prime divide parse print to_double from_double to_float shift
  $ within .debug_x; section x.o 6 name 0; names
  prime divide parse print to_double from_double to_float shift
  gcd power prime divide parse print to_double from_double to_float shift
  $ within .debug_x; section x.o 6 flags 2; names; symbol x.o 4 shndx 0xfff1; symbol x.o 6 shndx 0xfff2; names
  prime divide parse print to_double from_double to_float shift
  prime divide parse print to_double from_double to_float shift
  gcd power prime divide parse print to_double from_double to_float shift
  $ within .debug_x --debug_symbols; within 'C$$fpmap' --debug_symbols; within .line_xx --debug_symbols
  gcd power prime divide parse print to_double from_double to_float shift
  gcd power prime divide parse print to_double from_double to_float shift
  gcd power prime divide parse print to_double from_double to_float shift
  $ within .debug_x --no_debug_symbols; within .debug_x --debug_symbols --no_debug_symbols
  prime divide parse print to_double from_double to_float shift
  prime divide parse print to_double from_double to_float shift

The option tells of one run: the next one makes its own table.

  $ within .debug_x --debug_symbols > /dev/null; quarn -s x.a; published x.a | head -1
  wide_prime
  $ quarn -s --debug_symbols x.a; published x.a | head -1
  wide_gcd

A name in two members stands twice; --unique_symbols keeps the first.

  $ cp matrix_plain.o most.o; symbol most.o 15 info 0x02
  $ twice() { quarn --create "$@" two.a matrix_plain.o most.o wide_plain.o; quarn --zs two.a | awk '{ print $3 }' | uniq -c; }
  $ twice
        5 matrix_plain.o
        4 most.o
       10 wide_plain.o
  $ twice --unique_symbols
        5 matrix_plain.o
       10 wide_plain.o
  $ twice --unique_symbols --no_unique_symbols | wc -l
  3
  $ quarn -s --unique_symbols two.a; quarn -m -a wide_plain.o --unique_symbols two.a matrix_plain.o
  $ quarn --zs two.a | awk '{ print $1, $3 }'
  mat4_identity most.o
  mat4_multiply most.o
  mat4_apply most.o
  matrix_determinant most.o
  wide_gcd wide_plain.o
  wide_power wide_plain.o
  wide_prime wide_plain.o
  wide_divide wide_plain.o
  wide_parse wide_plain.o
  wide_print wide_plain.o
  wide_to_double wide_plain.o
  wide_from_double wide_plain.o
  wide_to_float wide_plain.o
  wide_shift wide_plain.o
  vec_dot matrix_plain.o
  $ x; symbol x.o 6 name $(symbol x.o 4 name); names; names --unique_symbols
  gcd gcd prime divide parse print to_double from_double to_float shift
  gcd prime divide parse print to_double from_double to_float shift

-n takes the table away, and the long names are then the first in the file; -s makes it anew, the same.

  $ cp lib.a before.a; quarn -n -s lib.a
  $ both quarn --zs lib.a
  err: Archive 'lib.a' does not have a symbol table
  status 0
  $ head -c 12 lib.a; echo
  !<arch>
  //  
  $ quarn -s lib.a; cmp lib.a before.a; quarn -s lib.a; cmp lib.a before.a
  $ quarn -n -r lib.a x.o; both quarn --zs lib.a
  err: Archive 'lib.a' does not have a symbol table
  status 0
  $ quarn -d lib.a x.o; cmp lib.a before.a
  $ both quarn -n -t lib.a > /dev/null; both quarn --zs lib.a
  err: Archive 'lib.a' does not have a symbol table
  status 0

A wrong table is not believed, and one without symbols stays, with a count of zero.

  $ quarn -s lib.a; patch lib.a 72 00000008; quarn -t lib.a 2>&1 | head -1
  Warning: L6974W: 'lib.a': malformed archive: Archive symbol table says symbol #0 'year_is_leap' is defined in the archive member starting at offset 8, but that member is not an object file
  $ quarn -s --diag_suppress=warning lib.a; cmp lib.a before.a
  $ quarn -d lib.a '*'; bytes lib.a
  0000000 21 3c 61 72 63 68 3e 0a 2f 20 20 20 20 20 20 20  >!<arch>./       <
  0000016 20 20 20 20 20 20 20 20 30 20 20 20 20 20 20 20  >        0       <
  0000032 20 20 20 20 30 20 20 20 20 20 30 20 20 20 20 20  >    0     0     <
  0000048 30 20 20 20 20 20 20 20 34 20 20 20 20 20 20 20  >0       4       <
  0000064 20 20 60 0a 00 00 00 00                          >  `.....<
  0000072

Both classes and both byte orders; other machines are kept and not read.

  $ for object in "$QUARN_EXAMPLES"/wide_plain.o "$QUARN_OBJECTS"/{40-big,183-little,183-big}/wide_plain.o; do
  >   cp $object x.o; names
  > done
  gcd power prime divide parse print to_double from_double to_float shift
  gcd power prime divide parse print to_double from_double to_float shift
  gcd power prime divide parse print to_double from_double to_float shift
  gcd power prime divide parse print to_double from_double to_float shift
  $ for machine in 183 184; do x; elf x.o machine $machine; names; done | uniq -c
        2 gcd power prime divide parse print to_double from_double to_float shift
  $ x; elf x.o machine 62; names
  Warning: L6974W: 'x.a': malformed archive: Unable to read symbols defined in archive member #0 'x.o': ELF file has unsupported machine code 62 (we only handle EM_ZEV = 40)
  
  $ cp "$QUARN_OBJECTS"/183-big/wide_plain.o x.o; patch x.o 18 0014; names
  Warning: L6974W: 'x.a': malformed archive: Unable to read symbols defined in archive member #0 'x.o': ELF file has unsupported machine code 20 (we only handle EM_ZEV = 40)
  
  $ quarn -p x.a x.o | cmp - x.o
