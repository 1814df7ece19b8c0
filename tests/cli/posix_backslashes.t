A backslash separates folders in the names of members, libraries and words, and is a letter like others on disk.

  $ . "$TESTDIR/setup.sh"

The name of a member is what stands behind it.

  $ insert() { quarn -r --normalise=1000000000 --diag_suppress=L6875 "$@"; }
  $ mkdir -p sub/deep; file sub/deep/e.txt e; file 'odd\f.txt' f; file ./g.txt g; file a.txt a
  $ insert -v -c parts.a sub/deep/e.txt 'odd\f.txt' ./g.txt "$PWD/a.txt"
  a - e.txt
  a - f.txt
  a - g.txt
  a - a.txt
  $ quarn -t parts.a
  e.txt
  f.txt
  g.txt
  a.txt

Names in the map of what libraries need count from their last backslash on, with it.

  $ make() { rm -f "$1"; quarn --create --libattrmap=map "${options[@]}" "$@" || return; listed "$1"; }
  $ options=()
  $ options=()
  $ variant base.o '$IEEE1'; variant fast.o '$J$IEEE1'
  $ echo '*_g* $J$IEEE1' > map; make 'x_g\y.a' base.o fast.o; echo '\* $J$IEEE1' > map; make 'x_g\y.a' base.o fast.o
  gcd base.o
  gcd$$BuildAttributes$$J$IEEE1 fast.o
  Warning: L6876W: Minor variants of archive member 'base.o' include multiple base variants
  gcd base.o
  gcd fast.o
