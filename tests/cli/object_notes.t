Records that few objects have: overlaid debug sections, and notes of what lies in which segment.

  $ . "$TESTDIR/setup.sh"; . "$TESTDIR/objects.sh"

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
