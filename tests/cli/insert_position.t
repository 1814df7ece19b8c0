-a, -b and -i put new members behind or before another one.

  $ . "$TESTDIR/setup.sh"
  $ insert() { quarn -r --normalise=1000000000 --diag_suppress=L6875 "$@"; }
  $ for name in a b c x y z; do file $name.o $name; done
  $ fresh() { rm -f lib.a; library lib.a a.o b.o c.o; }
  $ list() { quarn -t lib.a | tr '\n' ' '; echo; }

New members stand behind each other, in the order of the words.

  $ fresh; insert -a a.o lib.a x.o y.o; list
  a.o x.o y.o b.o c.o 
  $ fresh; insert -b b.o lib.a x.o y.o; list
  a.o x.o y.o b.o c.o 
  $ fresh; insert -i b.o lib.a x.o y.o z.o; list
  a.o x.o y.o z.o b.o c.o 
  $ fresh; insert -a c.o lib.a x.o; list
  a.o b.o c.o x.o 
  $ fresh; insert -b a.o lib.a x.o; list
  x.o a.o b.o c.o 

A member that is there keeps its place.

  $ fresh; insert -v -a c.o lib.a a.o x.o; list
  r - a.o
  a - x.o
  a.o b.o c.o x.o 
  $ fresh; insert -v -b a.o lib.a x.o c.o y.o; list
  a - x.o
  r - c.o
  a - y.o
  x.o y.o a.o b.o c.o 

The position is the first member that matches, in either case, by pattern too; without its folders.

  $ fresh; insert -a B.O lib.a x.o; list
  a.o b.o x.o c.o 
  $ fresh; insert -a '[bc].o' lib.a x.o; list
  Error: L6841E: Position '[bc].o' not found
  a.o b.o c.o 
  $ fresh; insert -a '?.o' lib.a x.o; list
  a.o x.o b.o c.o 
  $ fresh; insert -b 'c*' lib.a x.o; list
  a.o b.o x.o c.o 
  $ fresh; insert -b 'some/where/c.o' lib.a x.o; list
  a.o b.o x.o c.o 

A pattern that also fits the tables finds them; new members then stand in front.

  $ fresh; insert -b '*' lib.a x.o; list
  x.o a.o b.o c.o 
  $ fresh; insert -a '*' lib.a x.o; list
  x.o a.o b.o c.o 
  $ fresh; quarn -n -s lib.a; insert -b '*' lib.a x.o; list
  x.o a.o b.o c.o 
  $ fresh; quarn -n -s lib.a; insert -a '*' lib.a x.o; list
  a.o x.o b.o c.o 

-b wins over -a, and the last of -b and -i.

  $ fresh; insert -b a.o -a c.o lib.a x.o; list
  x.o a.o b.o c.o 
  $ fresh; insert -b a.o -i c.o lib.a x.o; list
  a.o b.o x.o c.o 

No such member: nothing is done.

  $ fresh; cp lib.a before.a
  $ both insert -v -a none.o lib.a x.o
  err: Error: L6841E: Position 'none.o' not found
  status 1
  $ both insert -v -b none.o lib.a x.o
  err: Error: L6841E: Position 'none.o' not found
  status 1
  $ both insert -i none.o lib.a
  err: Error: L6841E: Position 'none.o' not found
  status 1
  $ cmp lib.a before.a

So it is with actions that have no use for a position, and with an archive that is not there.

  $ both quarn -t -b none.o lib.a
  err: Error: L6841E: Position 'none.o' not found
  status 1
  $ both quarn -d -a none.o lib.a a.o
  err: Error: L6841E: Position 'none.o' not found
  status 1
  $ both quarn -s -a none.o lib.a
  err: Error: L6841E: Position 'none.o' not found
  status 1
  $ both insert -a a.o new.a x.o
  err: Error: L6841E: Position 'a.o' not found
  status 1
  $ both quarn -t -a a.o new.a
  err: Error: L6841E: Position 'a.o' not found
  status 1
  $ both quarn --create -a a.o lib.a x.o
  err: Error: L6841E: Position 'a.o' not found
  status 1
  $ cmp lib.a before.a

A position that is found does not disturb a listing.

  $ quarn -t -a c.o lib.a
  a.o
  b.o
  c.o

Members of an archive that is inserted go to the position, too.

  $ library other.a x.o y.o
  $ fresh; insert -v -a a.o lib.a other.a z.o; list
  a - x.o
  a - y.o
  a - z.o
  a.o x.o y.o z.o b.o c.o 
