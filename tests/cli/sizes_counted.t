What --sizes counts as code, data, zeros and debug information.

  $ . "$TESTDIR/setup.sh"
  $ cp "$QUARN_EXAMPLES"/wide_plain.o .
  $ x() { cp wide_plain.o x.o; }

What counts is the kind of section, by its flags: not in memory, without bytes, code, writable, other.

  $ row() { library x.a x.o; quarn --sizes x.a | grep ' x.o$'; }
  $ kind() { x; section x.o 6 type "$1"; section x.o 6 flags "$2"; row; }
  $ kind 1 0; kind 1 1; kind 1 4; kind 8 5
         912         80          0          0          0   x.o
         912         80          0          0          0   x.o
         912         80          0          0          0   x.o
         912         80          0          0          0   x.o
  $ kind 8 2; kind 8 3; kind 8 6; kind 8 7
         912         80          0         29          0   x.o
         912         80          0         29          0   x.o
         912         80          0         29          0   x.o
         912         80          0         29          0   x.o
  $ kind 1 6; kind 1 7; kind 7 6
         941         80          0          0          0   x.o
         941         80          0          0          0   x.o
         941         80          0          0          0   x.o
  $ kind 1 3; kind 14 3; kind 0x60000000 0x80000003
         912         80         29          0          0   x.o
         912         80         29          0          0   x.o
         912         80         29          0          0   x.o
  $ kind 1 2; kind 7 0x32; kind 0x70000001 0x82
         912        109          0          0          0   x.o
         912        109          0          0          0   x.o
         912        109          0          0          0   x.o

Out of memory, only the debug sections count, by the start of their names, with or without bytes in the file.

  $ named() { x; sed -i "s/\.comment/$1/" x.o; section x.o 6 type "${2:-1}"; section x.o 6 flags "${3:-0}"; row; }
  $ for name in '.debug\x00\x00' .debug_x .debuggg '.line\x00\x00\x00' .linexyz 'C$$fpmap'; do named "$name"; done
         912         80          0          0         29   x.o
         912         80          0          0         29   x.o
         912         80          0          0         29   x.o
         912         80          0          0         29   x.o
         912         80          0          0         29   x.o
         912         80          0          0         29   x.o
  $ for name in '.debu\x00\x00\x00' x.debug_ .Debug_x xline_xx 'C$$fpma\x00'; do named "$name"; done | uniq -c
        5        912         80          0          0          0   x.o
  $ x; sed -i 's/\.llvm_addrsig/C$$fpmap_more/' x.o; section x.o 6 name $(section x.o 9 name); row
         912         80          0          0          0   x.o
  $ named .debug_x 8; named .debug_x 8 2; named .debug_x 1 2; named .debug_x 1 3; named .debug_x 1 6
         912         80          0          0         29   x.o
         912         80          0         29          0   x.o
         912        109          0          0          0   x.o
         912         80         29          0          0   x.o
         941         80          0          0          0   x.o
  $ named .debug_x; section x.o 6 name 0; row
         912         80          0          0         29   x.o
         912         80          0          0          0   x.o

Code may have stretches of data that the object's own symbols tell of. Pools of constants stand with the code;
$d.realdata is data, writable where the section is. Here $a is at 0, $d at 80, the name under test at 412, $a again at 476.

  $ stretch() { x; sed -i "s/wide_divide/$1/; s/wide_parse/\$a\x00_______/; s/wide_power/\$d\x00_______/" x.o; }
  $ stretch wide_divide; row
         912         80          0          0          0   x.o
  $ stretch '$d.realdata'; row
         848        144          0          0          0   x.o
  $ stretch '$d.realdatb'; row
         912         80          0          0          0   x.o
  $ stretch '$x.realdata'; row
         912         80          0          0          0   x.o
  $ stretch '$e.realdata'; row
         912         80          0          0          0   x.o
  $ stretch '$d.realdata'; section x.o 2 flags 7; row
         848         80         64          0          0   x.o
  $ stretch '$d.realdata'; section x.o 2 flags 3; row
           0         80        912          0          0   x.o

The last one goes on to the section's end, and so does one that the next symbol of its kind is too far for.

  $ stretch '$d.realdata'; symbol x.o 10 value 912; row; symbol x.o 10 value 913; row; symbol x.o 10 value 4294967295; row
         412        580          0          0          0   x.o
         412        580          0          0          0   x.o
         412        580          0          0          0   x.o
  $ stretch '$d.realdata'; symbol x.o 8 value 0; symbol x.o 3 value 1; row
         911         81          0          0          0   x.o
  $ stretch '$d.realdata'; symbol x.o 8 value 912; row; symbol x.o 8 value 911; row
         912         80          0          0          0   x.o
         911         81          0          0          0   x.o
  $ stretch '$d.realdata'; symbol x.o 10 shndx 4; row
         412        580          0          0          0   x.o

Of several at one place the last in the table decides.

  $ stretch '$d.realdata'; symbol x.o 10 value 412; row
         912         80          0          0          0   x.o
  $ stretch '$d.realdata'; symbol x.o 6 value 412; row
         848        144          0          0          0   x.o

In images, places are addresses.

  $ stretch '$d.realdata'; section x.o 2 addr 100; row
         848        144          0          0          0   x.o
  $ elf x.o type 2; row
         848        144          0          0          0   x.o
  $ symbol x.o 10 value 1000; row; elf x.o type 1; row
         324        668          0          0          0   x.o
         412        580          0          0          0   x.o
  $ elf x.o type 3; symbol x.o 8 value 99; row
         912         80          0          0          0   x.o

Bytes of segments that are in no section are read-only data, zero or not.

  $ x; head -c 100 /dev/zero >> x.o; printf '%050d' 0 >> x.o; cp x.o long.o; addSegment x.o 1 2448 100 100 4; row
         912        180          0          0          0   x.o
  $ cp long.o x.o; addSegment x.o 1 2448 150 150 6; row
         912        230          0          0          0   x.o
  $ cp long.o x.o; addSegment x.o 1 2548 50 5000 5; row
         912        130          0          0          0   x.o
  $ cp long.o x.o; addSegment x.o 1 0 52 52 4; addSegment x.o 1 2008 440 440 4; row
         912         80          0          0          0   x.o

A file without sections is counted by its loadable segments.

  $ image() { x; elf x.o type 2; elf x.o shoff 0; }
  $ image; row
           0          0          0          0          0   x.o
  $ image; addSegment x.o 1 0 1000 1500 5; row
        1000          0          0        500          0   x.o
  $ addSegment x.o 1 1000 200 201 6; addSegment x.o 1 1200 300 350 4; row
        1000        300        200        551          0   x.o
  $ addSegment x.o 1 0 100 200 2; addSegment x.o 1 0 100 200 0; addSegment x.o 6 0 100 200 5; row
        1000        300        200        551          0   x.o
  $ addSegment x.o 1 0 10 10 7; addSegment x.o 1 0 20 20 3; addSegment x.o 1 0 0 7 0xfffffff6; row
        1030        300        200        558          0   x.o
  $ image; elf x.o shoff 2008; elf x.o shnum 0; elf x.o shstrndx 0; addSegment x.o 1 0 1000 1500 5; row
        1000          0          0        500          0   x.o
  $ image; elf x.o shoff 2008; elf x.o shnum 1; elf x.o shstrndx 0; addSegment x.o 1 0 52 1500 5; row
           0          0          0          0          0   x.o

Numbers have 32 bits, in rows and in sums.

  $ image; addSegment x.o 1 0 16 0 4; row
           0         16          0 4294967280          0   x.o
  $ x; section x.o 6 type 8; section x.o 6 flags 2; section x.o 6 size 4294967295; row
         912         80          0 4294967295          0   x.o
  $ section x.o 7 type 8; section x.o 7 flags 3; section x.o 7 size 10; row
         912         80          0          9          0   x.o
  $ section x.o 7 flags 0; cp x.o y.o; symbol y.o 4 info 0; library x.a x.o y.o; quarn --sizes x.a
  
        Code    RO Data    RW Data    ZI Data      Debug   Object Name
         912         80          0 4294967295          0   x.o
         912         80          0 4294967295          0   y.o
        1824        160          0 4294967294          0   TOTAL
  
