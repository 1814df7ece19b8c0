Builds of one module get the symbol table that the tool gives them, to the byte.

  $ . "$TESTDIR/setup.sh"
  $ sameTable() {
  >   local header
  >   IFS= read -r -N 66 header < "$1"
  >   cmp -n $(( 68 + ${header: -10} )) "$1" "$2"
  > }

  $ cp "$QUARN_EXAMPLES"/wide_{plain,build_d}.o .
  $ for option in --diag_suppress=6876,6877 --qobix_buildattr; do
  >   quarn --create --normalise=0 $option ours.a wide_plain.o wide_build_d.o
  >   rm -f lib.a; quarn-ar $option rc lib.a wide_plain.o wide_build_d.o; sameTable ours.a lib.a; listed lib.a | grep gcd
  > done
  wide_gcd wide_plain.o
  wide_gcd wide_build_d.o
  Warning: L6877W: Attribute difference of archive member 'wide_build_d.o' in minor variant group beginning with 'wide_plain.o' includes attribute(s) with no symbol decoration representation
  quarn-ar: Warning: L6877W: Attribute difference of archive member 'wide_build_d.o' in minor variant group beginning with 'wide_plain.o' includes attribute(s) with no symbol decoration representation
  wide_gcd wide_plain.o
  wide_gcd$$BuildAttributes$$ZEV_ISAv3$P$D$K$B$S$IEEE1 wide_build_d.o
  $ echo 'lib* $ZEV_ISAv7' > map; quarn -s --qobix_buildattr --libattrmap=map --diag_suppress=6974,6877 lib.a; cp lib.a ours.a
  $ quarn-ranlib --qobix_buildattr --libattrmap map --diag_suppress=6974,6877 lib.a; sameTable ours.a lib.a

  $ for text in '$ZEV_ISAv4$IEEE1' '$ZEV_ISAv5$IEEE1' '$ZEV_ISAv4$IEEE1$IW'; do variant $(( ++number )).o "$text"; done
  $ quarn --create --normalise=0 ours.a ?.o; quarn-ar rc other.a ?.o
  $ sameTable ours.a other.a; listed other.a
  gcd 1.o
  gcd$$BuildAttributes$$ZEV_ISAv5$IEEE1 2.o
  gcd$$BuildAttributes$$ZEV_ISAv3$IEEE1$IW 3.o

An edit by either keeps it.

  $ quarn-ar r ours.a 2.o; quarn -r --normalise=0 other.a 3.o; sameTable ours.a other.a
  $ quarn-ar d ours.a 3.o; quarn -d other.a 3.o; sameTable ours.a other.a; listed ours.a
  gcd 1.o
  gcd$$BuildAttributes$$ZEV_ISAv5$IEEE1 2.o
