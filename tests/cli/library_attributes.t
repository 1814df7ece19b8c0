The name of a library can say what all of its members may need: by a map of patterns for names.

  $ . "$TESTDIR/setup.sh"
  $ make() { rm -f "$1"; quarn --create --libattrmap=map "${options[@]}" "$@" || return; listed "$1"; }
  $ options=()
  $ variant base.o '$IEEE1'; variant fast.o '$J$IEEE1'; variant odd.o '$IEEE1$STKCKD'

What the library needs is no difference any more, and is checked for what it excludes.

  $ echo '*_j* $J$IEEE1' > map; make lib_j.a base.o fast.o
  Warning: L6876W: Minor variants of archive member 'base.o' include multiple base variants
  gcd base.o
  gcd fast.o
  $ make other.a base.o fast.o
  gcd base.o
  gcd$$BuildAttributes$$J$IEEE1 fast.o
  $ echo '* $IEEE1$~STKCKD' > map; make lib.a base.o odd.o
  Warning: L6974W: 'lib.a': malformed archive: Attributes of minor variant member object 'odd.o' are incompatible with library attributes
  gcd base.o
  gcd$$BuildAttributes$$IEEE1$STKCKD odd.o
  $ variant strict.o '$IEEE1$STKCKD'; make lib.a strict.o odd.o
  Warning: L6974W: 'lib.a': malformed archive: Common attributes of minor variant group beginning with archive member #0 'strict.o' are incompatible with library attributes
  Warning: L6974W: 'lib.a': malformed archive: Attributes of minor variant member object 'strict.o' are incompatible with library attributes
  Warning: L6974W: 'lib.a': malformed archive: Attributes of minor variant member object 'odd.o' are incompatible with library attributes
  Warning: L6876W: Minor variants of archive member 'strict.o' include multiple base variants
  gcd strict.o
  gcd odd.o
  $ options=(--diag_suppress=L6974); make lib.a base.o odd.o
  gcd base.o
  gcd$$BuildAttributes$$IEEE1$STKCKD odd.o
  $ options=(--diag_error=L6974); make lib.a base.o odd.o; ls lib.a
  Error: L6974W: 'lib.a': malformed archive: Attributes of minor variant member object 'odd.o' are incompatible with library attributes
  ls: cannot access 'lib.a': No such file or directory
  [2]
  $ options=()

The report counts the tables among the members.

  $ make lib.a strict.o odd.o > out 2>&1; quarn -s --libattrmap=map lib.a 2>&1 | head -1
  Warning: L6974W: 'lib.a': malformed archive: Common attributes of minor variant group beginning with archive member #1 'strict.o' are incompatible with library attributes
  $ variant a_long_name_of_a_member.o '$IEEE1$STKCKD'; make lib.a strict.o odd.o a_long_name_of_a_member.o > out 2>&1
  $ quarn -s --libattrmap=map lib.a 2>&1 | head -1
  Warning: L6974W: 'lib.a': malformed archive: Common attributes of minor variant group beginning with archive member #2 'strict.o' are incompatible with library attributes

A row without "IEEE1" claims the ordinary floating-point model for everything. Rows add up.

  $ echo '* $E' > map; make lib.a base.o fast.o; published lib.a
  gcd base.o
  gcd$$BuildAttributes$$J$IEEE1 fast.o
  gcd
  gcd$$BuildAttributes$$J$IEEE1
  $ printf '%s\n' '* $IEEE1$E' 'lib* $IEEE1$J x' > map; make lib.a base.o fast.o
  Warning: L6876W: Minor variants of archive member 'base.o' include multiple base variants
  gcd base.o
  gcd fast.o

With a map the promises of the stack and the ABI level leave all records, whether a row matches or not.

  $ variant one.o '$J$IEEE1$PRES8$EABIv2$REQ8'; variant two.o '$IEEE1$PRES8'; echo 'none $E' > map; make lib.a one.o two.o
  gcd$$BuildAttributes$$J$IEEE1$REQ8 one.o
  gcd two.o
  $ rm -f lib.a; quarn --create lib.a one.o two.o; listed lib.a
  gcd$$BuildAttributes$$J$IEEE1$REQ8$EABIv2 one.o
  gcd two.o
  $ variant hfu.o '$HFUv2$IEEE1'; make lib.a base.o hfu.o
  Warning: L6974W: 'lib.a': malformed archive: Attributes of minor variant member object 'hfu.o' are incompatible with library attributes
  gcd base.o
  gcd$$BuildAttributes$$HFUv2$PE$IEEE1 hfu.o

Lines: "#" at their very start, white space of every kind, the third word, words behind it, and lines of one word.

  $ try() { printf "$1" > map; make lib.a base.o fast.o; }
  $ try '#* $J$IEEE1\n'
  gcd base.o
  gcd$$BuildAttributes$$J$IEEE1 fast.o
  $ try ' #* $J$IEEE1\n'
  gcd base.o
  gcd$$BuildAttributes$$J$IEEE1 fast.o
  $ try '\t *\f\v$J$IEEE1\r\n'
  Warning: L6876W: Minor variants of archive member 'base.o' include multiple base variants
  gcd base.o
  gcd fast.o
  $ try '* $J$IEEE1 class more words\n'
  Warning: L6876W: Minor variants of archive member 'base.o' include multiple base variants
  gcd base.o
  gcd fast.o
  $ try '*\n\n   \n*  \n'
  gcd base.o
  gcd$$BuildAttributes$$J$IEEE1 fast.o
  $ try '*b.a $J$IEEE1'
  Warning: L6876W: Minor variants of archive member 'base.o' include multiple base variants
  gcd base.o
  gcd fast.o
  $ try 'L?B.A $J$IEEE1\n'
  Warning: L6876W: Minor variants of archive member 'base.o' include multiple base variants
  gcd base.o
  gcd fast.o
  $ try '[l]ib.a $J$IEEE1\n'
  gcd base.o
  gcd$$BuildAttributes$$J$IEEE1 fast.o
  $ try ''
  gcd base.o
  gcd$$BuildAttributes$$J$IEEE1 fast.o

A folder is part of the name.

  $ mkdir dir; echo 'g_* $J$IEEE1' > map; make g_x.a base.o fast.o; make dir/g_x.a base.o fast.o
  Warning: L6876W: Minor variants of archive member 'base.o' include multiple base variants
  gcd base.o
  gcd fast.o
  gcd base.o
  gcd$$BuildAttributes$$J$IEEE1 fast.o

A map that can't be read gives way to the built-in one, without a word.

  $ rm map; make lib_a.a base.o fast.o
  gcd base.o
  gcd$$BuildAttributes$$ZEV_ISAv3$J$IEEE1 fast.o
  $ variant v4.o '$ZEV_ISAv4$IEEE1'; variant v5.o '$ZEV_ISAv5$IEEE1'
  $ make lib_a.a base.o v4.o; make lib.a base.o v4.o
  Warning: L6876W: Minor variants of archive member 'base.o' include multiple base variants
  gcd base.o
  gcd v4.o
  gcd base.o
  gcd$$BuildAttributes$$ZEV_ISAv4$IEEE1 v4.o
  $ mkdir map; make lib_a.a base.o v4.o
  Warning: L6876W: Minor variants of archive member 'base.o' include multiple base variants
  gcd base.o
  gcd v4.o
  $ make lib_xf.a base.o v5.o
  gcd base.o
  gcd$$BuildAttributes$$ZEV_ISAv5$IEEE1 v5.o
  $ make lib_xv.a base.o v5.o
  gcd base.o
  gcd$$BuildAttributes$$ZEV_ISAv5$IEEE1 v5.o
  $ make g_x.a base.o v5.o
  gcd base.o
  gcd$$BuildAttributes$$ZEV_ISAv5$IEEE1 v5.o

The map counts when the table is made: reading alone never warns.

  $ rmdir map; echo '* $IEEE1$~STKCKD' > map; rm lib.a; quarn --create lib.a base.o odd.o
  $ quarn -t --libattrmap=map lib.a; quarn --zs --libattrmap=map lib.a | awk '{ print $1 }'
  base.o
  odd.o
  gcd
  gcd$$BuildAttributes$$IEEE1$STKCKD
  $ cp lib.a old.a; quarn -s --libattrmap=map lib.a; listed lib.a
  Warning: L6974W: 'lib.a': malformed archive: Attributes of minor variant member object 'odd.o' are incompatible with library attributes
  gcd base.o
  gcd$$BuildAttributes$$IEEE1$STKCKD odd.o
