--zt shows the table of sizes and then the entry points.

  $ . "$TESTDIR/setup.sh"
  $ cp "$QUARN_EXAMPLES"/{wide,matrix}_plain.o "$QUARN_EXAMPLES"/bignum_debug.o .
  $ library lib.a wide_plain.o matrix_plain.o bignum_debug.o
  $ both quarn --zt lib.a
  out: 
  out:       Code    RO Data    RW Data    ZI Data      Debug   Object Name
  out:        912         80          0          0          0   wide_plain.o
  out:       2992         40          0          0          0   matrix_plain.o
  out:       1124         56          0          0       3286   bignum_debug.o
  out:       5028        176          0          0       3286   TOTAL
  out: 
  out: No ENTRY points found.
  status 0
  $ section wide_plain.o 2 flags 0x10000006; elf wide_plain.o entry 4294967292; section wide_plain.o 6 flags 0x10000003
  $ quarn -r lib.a wide_plain.o; cp lib.a before.a
  $ quarn --zt lib.a
  
        Code    RO Data    RW Data    ZI Data      Debug   Object Name
         912         80         29          0          0   wide_plain.o
        2992         40          0          0          0   matrix_plain.o
        1124         56          0          0       3286   bignum_debug.o
        5028        176         29          0       3286   TOTAL
  
  ENTRY at offset -4 in section .text of wide_plain.o
  ENTRY at offset -4 in section .comment of wide_plain.o

It is the two reports, one after the other, whatever words follow; nothing is written.

  $ quarn --zt lib.a none | diff <(quarn --sizes lib.a; quarn --entries lib.a) -
  $ quarn --zt --zt lib.a | diff <(quarn --zt lib.a) -
  $ cmp lib.a before.a
  $ both quarn --zt --sizes lib.a
  err: Error: L6840E: Only one action option may be specified
  status 1
  $ both quarn --zt --entries lib.a
  err: Error: L6840E: Only one action option may be specified
  status 1

With -s the archive is written back behind it.

  $ quarn --zt -s lib.a | diff <(quarn --zt before.a) -; cmp lib.a before.a
  $ quarn --zt -n lib.a | tail -1; quarn --zs lib.a
  ENTRY at offset -4 in section .comment of wide_plain.o
  Archive 'lib.a' does not have a symbol table

Objects that cannot be read are left out of both.

  $ elf wide_plain.o data 0; elf matrix_plain.o shnum 60000
  $ quarn -r --diag_suppress=warning before.a wide_plain.o matrix_plain.o; both quarn --zt before.a
  out: 
  out:       Code    RO Data    RW Data    ZI Data      Debug   Object Name
  out:       1124         56          0          0       3286   bignum_debug.o
  out:       1124         56          0          0       3286   TOTAL
  out: 
  out: No ENTRY points found.
  status 0
  $ magic > empty.a; both quarn --zt empty.a
  out: 
  out:       Code    RO Data    RW Data    ZI Data      Debug   Object Name
  out:          0          0          0          0          0   TOTAL
  out: 
  out: No ENTRY points found.
  status 0
  $ both quarn --zt none.a
  err: Error: L6832E: Archive 'none.a' not found : No such file or directory
  status 1
