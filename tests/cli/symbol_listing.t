--zs shows the symbol table as the file holds it.

  $ . "$TESTDIR/setup.sh"

Three symbols in two members, in the order of the table.

  $ { magic; table 'of_b\0main\0zero\0' 162 100 100; member a.o/ a; member b.o/ b; } > lib.a
  $ quarn -tv lib.a
  rw-r--r--     0/     0      1 Jan 01 00:00 1970 a.o (offset    100)
  rw-r--r--     0/     0      1 Jan 01 00:00 1970 b.o (offset    162)
  $ quarn --zs lib.a
  of_b                 from b.o        at offset    162
  main                 from a.o        at offset    100
  zero                 from a.o        at offset    100

The columns are at least 20 and 10 wide.

  $ { magic; table 'a_symbol_that_does_not_fit_in_twenty\0brief\0x\0' 130 130 196; member a_longer_name.o/ abcde; member b/ ''; } > wide.a
  $ quarn -tv wide.a
  rw-r--r--     0/     0      5 Jan 01 00:00 1970 a_longer_name.o (offset    130)
  rw-r--r--     0/     0      0 Jan 01 00:00 1970 b (offset    196)
  $ quarn --zs wide.a | sed 's/$/$/'
  a_symbol_that_does_not_fit_in_twenty from a_longer_name.o at offset    130$
  brief                from a_longer_name.o at offset    130$
  x                    from b          at offset    196$

Words do not choose, and what was not read is not missed.

  $ quarn --zs lib.a none.o
  of_b                 from b.o        at offset    162
  main                 from a.o        at offset    100
  zero                 from a.o        at offset    100

An empty name and a name twice are symbols like others. Zero bytes behind the names are nothing.

  $ { magic; table '\0t\0t\0\0\0\0' 92 92 92; member a.o/ a; } > odd.a
  $ both quarn --zs odd.a
  out:                      from a.o        at offset     92
  out: t                    from a.o        at offset     92
  out: t                    from a.o        at offset     92
  status 0

A table without symbols shows nothing; without a table there is a remark, and that is no error.

  $ file a.o a; library none.a a.o
  $ both quarn --zs none.a
  status 0
  $ quarn -n -s none.a
  $ both quarn --zs none.a
  err: Archive 'none.a' does not have a symbol table
  status 0
  $ magic > empty.a
  $ both quarn --zs empty.a
  err: Archive 'empty.a' does not have a symbol table
  status 0
  $ both quarn --zs --diag_suppress=L6872 --diag_error=6872 empty.a
  err: Archive 'empty.a' does not have a symbol table
  status 0
  $ both quarn --zs missing.a
  err: Error: L6832E: Archive 'missing.a' not found : No such file or directory
  status 1

A symbol with build attributes is shown with them.

  $ attributed() { { magic; table "$1\0" $((68 + (8 + ${#1} + 1 + 1) / 2 * 2)); member a.o/ a; } > attributed.a; quarn --zs attributed.a | sed 's/at offset .*/at it/'; }
  $ attributed 'plain'
  plain                from a.o        at it
  $ attributed 'f$$BuildAttributes$$ZEV_ISAv4$A:L22$X:L11$S22$IEEE1$IW$USESV6$~STKCKD$USESV7$~SHL$OSPACE$EBA8$EABIv2'
  f$$BuildAttributes$$ZEV_ISAv4$A:L22$X:L11$S22$IEEE1$IW$USESV6$~STKCKD$USESV7$~SHL$OSPACE$EBA8$EABIv2 from a.o        at it
  $ attributed '$$BuildAttributes$$IEEE1'
  $$BuildAttributes$$IEEE1 from a.o        at it

With -s the symbols are shown as they were, and the table is then made anew.

  $ cp lib.a again.a
  $ quarn --zs -s again.a
  of_b                 from b.o        at offset    162
  main                 from a.o        at offset    100
  zero                 from a.o        at offset    100
  $ quarn --zs again.a
  $ both quarn --zs -s empty.a
  err: Archive 'empty.a' does not have a symbol table
  status 0
  $ both quarn --zs empty.a
  status 0
  $ cp lib.a again.a
  $ quarn --zs -n again.a
  of_b                 from b.o        at offset    162
  main                 from a.o        at offset    100
  zero                 from a.o        at offset    100
  $ both quarn --zs again.a
  err: Archive 'again.a' does not have a symbol table
  status 0

Control bytes in names are shown as numbers.

  $ { magic; table 'a\001b\0%%s\0' 88 88; member a.o/ a; } > control.a
  $ quarn --zs control.a
  a\001b                  from a.o        at offset     88
  %s                   from a.o        at offset     88
