What is told of builds of one module that have no base, or several, or more in common than names can say.

  $ . "$TESTDIR/setup.sh"

No base, or more than one. With -v come the members: of the group, or those that are bases.

  $ variants '$J$IEEE1' '$E$IEEE1'
  Warning: L6874W: Minor variants of archive member '1.o' include no base variant
  gcd$$BuildAttributes$$J$IEEE1 1.o
  gcd$$BuildAttributes$$E$IEEE1 2.o
  $ options=(-v); variants '$J$IEEE1' '$E$IEEE1' | sed '/^a/d'
  Warning: L6874W: Minor variants of archive member '1.o' include no base variant
   * 1.o [0] : 1.o
   * 1.o [1] : 2.o
  gcd$$BuildAttributes$$J$IEEE1 1.o
  gcd$$BuildAttributes$$E$IEEE1 2.o
  $ options=(); variants '$J$IEEE1' '$J$IEEE1'
  Warning: L6876W: Minor variants of archive member '1.o' include multiple base variants
  gcd 1.o
  gcd 2.o
  $ options=(-v); variants '$IEEE1' '$J$IEEE1' '$IEEE1' | sed '/^a/d'
  Warning: L6876W: Minor variants of archive member '1.o' include multiple base variants
   * 1.o [0] : 1.o
   * 1.o [1] : 3.o
  gcd 1.o
  gcd$$BuildAttributes$$J$IEEE1 2.o
  gcd 3.o

What has no token, or reads back as more than it is. The name stands as it is in the table; a listing shows it in its
own words.

  $ options=(); variants '$HFUi3' '$FPiv8'
  Warning: L6877W: Attribute difference of archive member '2.o' in minor variant group beginning with '1.o' includes attribute(s) with no symbol decoration representation
  gcd 1.o
  gcd$$BuildAttributes$$HFUi5$PE$IEEE1 2.o
  $ options=(-v); variants '$IEEE1' '$R:L22$IEEE1' | sed '/^a/d'; options=()
  Warning: L6877W: Attribute difference of archive member '2.o' in minor variant group beginning with '1.o' includes attribute(s) with no symbol decoration representation
   * 1.o [0] : 1.o
   * 1.o [1] : 2.o
  gcd 1.o
  gcd$$BuildAttributes$$A:L22$IEEE1 2.o
  $ published lib.a
  gcd
  gcd$$BuildAttributes$$C:L22$W:L22$IEEE1
  $ variants '$IEEE1' '$ZEV_ISAv5$IEEE1' '$KRL_ISAv1$IEEE1' > out; sed -n 2,3p out
  gcd$$BuildAttributes$$ZEV_ISAv5$IEEE1 2.o
  gcd$$BuildAttributes$$KRL_ISAv1$IEEE1 3.o
  $ rm -f ?.o; variant 1.o '$IEEE1'; variant 2.o '$ZEV_ISAv5$IEEE1' '$KRL_ISAv1$IEEE1'; rm lib.a; quarn --create lib.a 1.o 2.o
  Warning: L6877W: Attribute difference of archive member '2.o' in minor variant group beginning with '1.o' includes attribute(s) with no symbol decoration representation
  $ published lib.a
  gcd
  gcd$$BuildAttributes$$KRL_ISAv2$ZEV_ISAv5$IEEE1

The warnings can be silenced, which the lines of -v are not, and raised: then nothing is written.

  $ options=(--diag_suppress=L6876); variants '$J$IEEE1' '$J$IEEE1'
  gcd 1.o
  gcd 2.o
  $ options=(-v --diag_suppress=warning); variants '$J$IEEE1' '$J$IEEE1' | sed '/^a/d'
   * 1.o [0] : 1.o
   * 1.o [1] : 2.o
  gcd 1.o
  gcd 2.o
  $ options=(--diag_error=L6876); variants '$J$IEEE1' '$J$IEEE1'; ls lib.a
  Error: L6876W: Minor variants of archive member '1.o' include multiple base variants
  ls: cannot access 'lib.a': No such file or directory
  [2]
  $ options=(--diag_error=L6874); variants '$J$IEEE1' '$E$IEEE1'; ls lib.a
  Error: L6874W: Minor variants of archive member '1.o' include no base variant
  ls: cannot access 'lib.a': No such file or directory
  [2]
  $ options=(--diag_remark=L6877 -v); variants '$IEEE1' '$R:L22$IEEE1' | sed '/^a/d'
  Attribute difference of archive member '2.o' in minor variant group beginning with '1.o' includes attribute(s) with no symbol decoration representation
   * 1.o [0] : 1.o
   * 1.o [1] : 2.o
  gcd 1.o
  gcd$$BuildAttributes$$A:L22$IEEE1 2.o
  $ options=(--diag_style=ide); variants '$J$IEEE1' '$J$IEEE1'
  quarn : warning L6876:  Minor variants of archive member '1.o' include multiple base variants
  gcd 1.o
  gcd 2.o
  $ options=()

An archive that has one keeps it when a warning is an error.

  $ variants '$J$IEEE1' '$E$IEEE1$IW' > out; cp lib.a old.a
  Warning: L6874W: Minor variants of archive member '1.o' include no base variant
  $ quarn -r --diag_error=L6874 lib.a 1.o; echo $?; cmp lib.a old.a
  Error: L6874W: Minor variants of archive member '1.o' include no base variant
  1
