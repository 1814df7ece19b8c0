--entries lists the sections that are marked as entry points.

  $ . "$TESTDIR/setup.sh"
  $ cp "$QUARN_EXAMPLES"/{wide,matrix}_plain.o .
  $ x() { cp wide_plain.o x.o; }
  $ entries() { library x.a x.o; both quarn --entries x.a; }

The mark is one flag of a section with contents in memory; the place is that of the object's header.

  $ x; entries
  out: No ENTRY points found.
  status 0
  $ x; section x.o 2 flags 0x10000006; entries
  out: ENTRY at offset 0 in section .text of x.o
  status 0
  $ elf x.o entry 412; entries
  out: ENTRY at offset 412 in section .text of x.o
  status 0
  $ x; elf x.o entry 412; entries
  out: No ENTRY points found.
  status 0
  $ for flags in 0x10000002 0x10000003 0x10000007 0xfffffdff; do x; section x.o 6 flags $flags; entries; done
  out: ENTRY at offset 0 in section .comment of x.o
  status 0
  out: ENTRY at offset 0 in section .comment of x.o
  status 0
  out: ENTRY at offset 0 in section .comment of x.o
  status 0
  out: ENTRY at offset 0 in section .comment of x.o
  status 0
  $ for flags in 0x10000000 0x10000005 0x20000006 0xefffffff; do x; section x.o 6 flags $flags; entries; done | uniq
  out: No ENTRY points found.
  status 0
  out: No ENTRY points found.
  status 0
  out: No ENTRY points found.
  status 0
  out: No ENTRY points found.
  status 0
  $ for type in 0 7 8 14 0x70000001; do x; section x.o 6 type $type; section x.o 6 flags 0x10000006; entries; done | sort -u
  out: No ENTRY points found.
  status 0
  $ x; section x.o 7 flags 0x10000006; entries
  out: ENTRY at offset 0 in section .note.GNU-stack of x.o
  status 0

The place is a number of 32 bits with a sign.

  $ for entry in 1 2147483647 2147483648 4294967295; do x; section x.o 2 flags 0x10000006; elf x.o entry $entry; entries; done
  out: ENTRY at offset 1 in section .text of x.o
  status 0
  out: ENTRY at offset 2147483647 in section .text of x.o
  status 0
  out: ENTRY at offset -2147483648 in section .text of x.o
  status 0
  out: ENTRY at offset -1 in section .text of x.o
  status 0
  $ cp "$QUARN_OBJECTS"/183-little/wide_plain.o x.o; patch x.o 24 0500000001000000
  $ patch x.o $(( $(field x.o 40 '0 4') + 2 * 64 + 8 )) 0600001000000000; entries
  out: ENTRY at offset 5 in section .text of x.o
  status 0
  $ cp "$QUARN_OBJECTS"/40-big/wide_plain.o x.o; patch x.o 24 fffffffe; patch x.o $(( 2012 + 2 * 40 + 8 )) 10000006; entries
  out: ENTRY at offset -2 in section .text of x.o
  status 0

A section without a name has an empty one.

  $ x; section x.o 2 flags 0x10000006; section x.o 2 name 0; entries
  out: ENTRY at offset 0 in section  of x.o
  status 0

Each marked section has its line, in the order of members and of sections, each with its object's place.

  $ x; section x.o 6 flags 0x10000002; section x.o 2 flags 0x10000006; elf x.o entry 8
  $ section matrix_plain.o 2 flags 0x10000006; elf matrix_plain.o entry 16
  $ file text.txt text; library lib.a x.o text.txt matrix_plain.o wide_plain.o 2> /dev/null
  $ both quarn --entries lib.a
  out: ENTRY at offset 8 in section .text of x.o
  out: ENTRY at offset 8 in section .comment of x.o
  out: ENTRY at offset 16 in section .text of matrix_plain.o
  status 0
  $ quarn -m --diag_suppress=L6876 -b x.o lib.a matrix_plain.o; quarn --entries lib.a text.txt none
  ENTRY at offset 16 in section .text of matrix_plain.o
  ENTRY at offset 8 in section .text of x.o
  ENTRY at offset 8 in section .comment of x.o

Nothing to list: no members, no objects, one that cannot be read; and no archive at all.

  $ magic > empty.a; both quarn --entries empty.a
  out: No ENTRY points found.
  status 0
  $ library text.a text.txt; both quarn --entries text.a
  out: No ENTRY points found.
  status 0
  $ elf x.o version 0; library x.a --diag_suppress=warning x.o; both quarn --entries x.a
  out: No ENTRY points found.
  status 0
  $ both quarn --entries none.a
  err: Error: L6832E: Archive 'none.a' not found : No such file or directory
  status 1
