Builds of one module get the symbol table that the tool gives them, to the byte.

  $ . "$TESTDIR/setup.sh"
  $ sameTable() {
  >   local header
  >   IFS= read -r -N 66 header < "$1"
  >   cmp -n $(( 68 + ${header: -10} )) "$1" "$2"
  > }

  $ cp "$QUARN_EXAMPLES"/wide_{plain,build_d}.o .
  $ quarn --create --normalise=0 ours.a wide_plain.o wide_build_d.o
  Warning: L6876W: Minor variants of archive member 'wide_plain.o' include multiple base variants
  $ quarn-ar rc lib.a wide_plain.o wide_build_d.o
  quarn-ar: Warning: L6876W: Minor variants of archive member 'wide_plain.o' include multiple base variants
  $ sameTable ours.a lib.a

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
