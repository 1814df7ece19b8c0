How it is told that objects of an archive cannot be read, and what that means for the run.

  $ . "$TESTDIR/setup.sh"; . "$TESTDIR/objects.sh"

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

  $ cp "$QUARN_OBJECTS"/183-big/wide_plain.o x.o; cp "$QUARN_EXAMPLES"/bignum_plain.o y.o
  $ both quarn -r new.a x.o y.o
  status 0
