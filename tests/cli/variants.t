Members that define the same symbols are builds of one module. What all of them need is the base; the names of a
member that needs more say what.

  $ . "$TESTDIR/setup.sh"

The first of these is the base: it needs what all of them do.

  $ variants '$ZEV_ISAv4$IEEE1' '$ZEV_ISAv5$IEEE1' '$ZEV_ISAv4$IEEE1$IW'
  gcd 1.o
  gcd$$BuildAttributes$$ZEV_ISAv5$IEEE1 2.o
  gcd$$BuildAttributes$$ZEV_ISAv3$IEEE1$IW 3.o
  $ bytes lib.a | head -11
  0000000 21 3c 61 72 63 68 3e 0a 2f 20 20 20 20 20 20 20  >!<arch>./       <
  0000016 20 20 20 20 20 20 20 20 30 20 20 20 20 20 20 20  >        0       <
  0000032 20 20 20 20 30 20 20 20 20 20 30 20 20 20 20 20  >    0     0     <
  0000048 30 20 20 20 20 20 20 20 39 39 20 20 20 20 20 20  >0       99      <
  0000064 20 20 60 0a 00 00 00 03 00 00 00 a8 00 00 0a 2c  >  `............,<
  0000080 00 00 13 b0 67 63 64 00 67 63 64 24 24 42 75 69  >....gcd.gcd$$Bui<
  0000096 6c 64 41 74 74 72 69 62 75 74 65 73 24 24 5a 45  >ldAttributes$$ZE<
  0000112 56 5f 49 53 41 76 35 24 49 45 45 45 31 00 67 63  >V_ISAv5$IEEE1.gc<
  0000128 64 24 24 42 75 69 6c 64 41 74 74 72 69 62 75 74  >d$$BuildAttribut<
  0000144 65 73 24 24 5a 45 56 5f 49 53 41 76 33 24 49 45  >es$$ZEV_ISAv3$IE<
  0000160 45 45 31 24 49 57 00 0a 31 2e 6f 2f 20 20 20 20  >EE1$IW..1.o/    <

Ten builds of one module, each with one thing more or another.

  $ variants '$ZEV_ISAv4$IEEE1' '$ZEV_ISAv4$IEEE1$OTIME' '$ZEV_ISAv5$IEEE1' '$ZEV_ISAv5$E$P$IEEE1' \
  >   '$ZEV_ISAv6$J$IEEE1' '$ZEV_ISAv7$HFUv3$N$IEEE1' '$ZEV_ISAv4$KRL_ISAv1$IEEE1' '$ZEV_ISAv4$IEEE1$RWPI$ROPI' \
  >   '$ZEV_ISAv4$IEEE1$STKCKD' > ten
  $ cat ten
  gcd 1.o
  gcd$$BuildAttributes$$ZEV_ISAv3$IEEE1$OTIME 2.o
  gcd$$BuildAttributes$$ZEV_ISAv5$IEEE1 3.o
  gcd$$BuildAttributes$$ZEV_ISAv5$E$P$IEEE1 4.o
  gcd$$BuildAttributes$$ZEV_ISAv6$J$IEEE1 5.o
  gcd$$BuildAttributes$$ZEV_ISAv7$N$HFUv3$PE$IEEE1 6.o
  gcd$$BuildAttributes$$KRL_ISAv1$ZEV_ISAv3$IEEE1 7.o
  gcd$$BuildAttributes$$ZEV_ISAv3$IEEE1$RWPI$ROPI 8.o
  gcd$$BuildAttributes$$ZEV_ISAv3$IEEE1$STKCKD 9.o
  $ mv lib.a nine.a; variant 0.o '$ZEV_ISAv8$DE$FP_ZEVv8$KRL_ISAv5$IEEE1'; quarn -r nine.a 0.o
  $ listed nine.a | head -9 | cmp ten -; listed nine.a | tail -1
  gcd$$BuildAttributes$$KRL_ISAv5$ZEV_ISAv8$DE$FP_ZEVv8$PE$IEEE1 0.o

The order of the members is that of the table, whichever is the base. Without a level of the ZEV instruction set in the
base, none is added.

  $ variants '$KRL_ISAv2$IEEE1' '$KRL_ISAv1$IEEE1'
  gcd$$BuildAttributes$$KRL_ISAv2$IEEE1 1.o
  gcd 2.o
  $ variants '$IEEE1' '$J$IEEE1' '$KCPv3$IEEE1$OTIME$REQ8$EABIv2'
  gcd 1.o
  gcd$$BuildAttributes$$J$IEEE1 2.o
  gcd$$BuildAttributes$$ME$KCPv3$IEEE1$OTIME$REQ8$EABIv2 3.o
  $ variants '$IEEE1' '$D$IEEE1'
  gcd 1.o
  gcd$$BuildAttributes$$D$IEEE1 2.o
  $ variants '$ZEV_ISAv4$IEEE1' '$ZEV_ISAv4$D$IEEE1'
  gcd 1.o
  gcd$$BuildAttributes$$ZEV_ISAv3$D$IEEE1 2.o

Levels of flags stand as a whole, and so does what a level of features contains.

  $ variants '$IEEE1$OSPACE' '$IEEE1$OTIME' | tail -1
  gcd$$BuildAttributes$$IEEE1$OTIME 2.o
  $ variants '$IEEE1$IEEEJ' '$IEEE1$IEEEX' | tail -1
  gcd$$BuildAttributes$$IEEE1$IEEEX 2.o
  $ variants '$IEEE1$IEEEF' '$IEEE1$IEEEX' | tail -1
  gcd$$BuildAttributes$$IEEE1$IEEEX 2.o
  $ variants '$KRL_ISAv3$PLD1$IEEE1' '$KRL_ISAv5$PLD8$IEEE1' | tail -1
  gcd$$BuildAttributes$$KRL_ISAv5$PLD8$IEEE1 2.o

Accesses: where all of code, constants and data make them, where only some do, and stores.

  $ variants '$IEEE1' '$A:L22$IEEE1' '$X:L22S22$IEEE1' '$W:L41$IEEE1'
  gcd 1.o
  gcd$$BuildAttributes$$A:L22$IEEE1 2.o
  gcd$$BuildAttributes$$X:L22$S22$IEEE1 3.o
  gcd$$BuildAttributes$$W:L41$IEEE1 4.o

Several symbols of one member state together what it needs.

  $ rm -f ?.o lib.a; variant 1.o '$IEEE1'; variant 2.o '$J$IEEE1' '$E$IEEE1$IW'; quarn --create lib.a 1.o 2.o
  $ listed lib.a
  gcd 1.o
  gcd$$BuildAttributes$$E$J$IEEE1$IW 2.o

Symbols count with their multiplicities, in any order.

  $ two() {
  >   for file; do
  >     llvm-objcopy --keep-global-symbol=wide_gcd --keep-global-symbol=wide_power "$QUARN_EXAMPLES/wide_plain.o" $file
  >   done
  > }
  $ row() { llvm-readelf -s "$1" | awk -v name="$2" '$8 == name { print $1 + 0 }'; }
  $ rm -f ?.o lib.a; two 1.o 2.o; first=$(row 1.o wide_gcd) second=$(row 1.o wide_power)
  $ gcd=$(symbol 1.o $first name) power=$(symbol 1.o $second name)
  $ symbol 2.o $first name $power; symbol 2.o $second name $gcd; quarn --create lib.a 1.o 2.o; listed lib.a
  Warning: L6876W: Minor variants of archive member '1.o' include multiple base variants
  wide_gcd 1.o
  wide_power 1.o
  wide_power 2.o
  wide_gcd 2.o
  $ symbol 2.o $first name $gcd; quarn -r lib.a 2.o; listed lib.a
  wide_gcd 1.o
  wide_power 1.o
  wide_gcd 2.o
  wide_gcd 2.o
  $ symbol 1.o $second name $gcd; quarn -r --diag_suppress=L6876 lib.a 1.o; listed lib.a
  wide_gcd 1.o
  wide_gcd 1.o
  wide_gcd 2.o
  wide_gcd 2.o
  $ symbol 2.o $second info 0; quarn -r lib.a 2.o; listed lib.a
  wide_gcd 1.o
  wide_gcd 1.o
  wide_gcd 2.o

A member that states nothing takes part all the same: it claims the ordinary floating-point model.

  $ variants '' ''
  Warning: L6876W: Minor variants of archive member '1.o' include multiple base variants
  gcd 1.o
  gcd 2.o
  $ variants '' '$J$IEEE1'
  Warning: L6874W: Minor variants of archive member '1.o' include no base variant
  gcd$$BuildAttributes$$IEEE1$IEEEF 1.o
  gcd$$BuildAttributes$$J$IEEE1 2.o
  $ variants '' '$J'
  gcd 1.o
  gcd$$BuildAttributes$$J$IEEE1 2.o
  $ variants '$zev_isav4$ieee1$$' '$ZEV_ISAv4$IEEE1$NONSENSE'
  Warning: L6876W: Minor variants of archive member '1.o' include multiple base variants
  gcd 1.o
  gcd 2.o
  $ variants 'ZEV_ISAv4' '$J'
  gcd 1.o
  gcd$$BuildAttributes$$J$IEEE1 2.o

The stack and the level of the ABI make no variant, but are told where there is one.

  $ variants '$IEEE1$REQ8' '$IEEE1$PRES8$EABIv2'
  Warning: L6876W: Minor variants of archive member '1.o' include multiple base variants
  gcd 1.o
  gcd 2.o
  $ variants '$IEEE1$PRES8' '$J$IEEE1$PRES8$REQ8$EABIv2'
  gcd 1.o
  gcd$$BuildAttributes$$J$IEEE1$REQ8$EABIv2 2.o

Groups come first, in the order of their first members, then the members that are like no other. A survivor of a group
is an ordinary member.

  $ rm -f *.o *.a; for i in 1 3 5; do variant $i.o "\$IEEE1"; done; variant 2.o '$J$IEEE1'
  $ for i in 3 4; do llvm-objcopy --redefine-sym gcd=lcm $(( i == 3 ? 1 : 2 )).o $i.o; done
  $ llvm-objcopy --redefine-sym gcd=sum 1.o 5.o; variant 6.o '$E$IEEE1'
  $ quarn --create lib.a 5.o 3.o 1.o 4.o 2.o 6.o; listed lib.a
  lcm 3.o
  lcm$$BuildAttributes$$J$IEEE1 4.o
  gcd 1.o
  gcd$$BuildAttributes$$J$IEEE1 2.o
  gcd$$BuildAttributes$$E$IEEE1 6.o
  sum 5.o
  $ quarn -d lib.a 3.o; listed lib.a
  gcd 1.o
  gcd$$BuildAttributes$$J$IEEE1 2.o
  gcd$$BuildAttributes$$E$IEEE1 6.o
  sum 5.o
  lcm 4.o

Names of variants may stand twice where other names may not; they neither count as seen nor heed what is.

  $ for i in p q; do llvm-objcopy --keep-global-symbol=wide_gcd --keep-global-symbol=wide_power \
  >   --redefine-sym wide_gcd=gcd --redefine-sym wide_power=$i "$QUARN_EXAMPLES/wide_plain.o" $i.o; done
  $ rm -f lib.a; quarn --create --unique_symbols lib.a p.o 1.o 2.o q.o; listed lib.a
  gcd 1.o
  gcd$$BuildAttributes$$J$IEEE1 2.o
  gcd p.o
  p p.o
  q q.o

Attributes are told from decorated names in a table that somebody else made.

  $ names='gcd$$BuildAttributes$$J$ieee1$junk\0main$$BuildAttributes$$$X$J\0x$$BuildAttributes$\0'
  $ at=$(( 84 + $(printf "$names" | wc -c) )); at=$(( at + at % 2 ))
  $ { magic; table "$names" $at $at $at; cat <(header t.o/ 0 0 0 100644 $(stat -c %s 1.o)) 1.o; } > z.a
  $ quarn --zs z.a
  gcd$$BuildAttributes$$J$IEEE1 from t.o        at offset    168
  main$$BuildAttributes$$X$J$IEEE1$IEEEF from t.o        at offset    168
  x$$BuildAttributes$$IEEE1$IEEEF from t.o        at offset    168
