Moving takes the first member of each word to the position, or to the end.

  $ . "$TESTDIR/setup.sh"
  $ for name in a b c d e; do file $name.o $name; done
  $ fresh() { rm -f lib.a; library lib.a a.o b.o c.o d.o e.o; }
  $ list() { quarn -t lib.a | tr '\n' ' '; echo; }

  $ fresh; both quarn -mv lib.a b.o; list
  out: m - b.o
  status 0
  a.o c.o d.o e.o b.o 
  $ fresh; quarn -mv lib.a b.o a.o; list
  m - b.o
  m - a.o
  c.o d.o e.o b.o a.o 
  $ fresh; quarn -m lib.a e.o; list
  a.o b.o c.o d.o e.o 

Behind or before another one, in the order of the words.

  $ fresh; quarn -mv -a d.o lib.a a.o b.o; list
  m - a.o
  m - b.o
  c.o d.o a.o b.o e.o 
  $ fresh; quarn -m -b b.o lib.a e.o d.o; list
  a.o e.o d.o b.o c.o 
  $ fresh; quarn -m -b d.o lib.a a.o e.o b.o; list
  c.o a.o e.o b.o d.o 
  $ fresh; quarn -m -a a.o lib.a c.o e.o; list
  a.o c.o e.o b.o d.o 
  $ fresh; quarn -m -a c.o lib.a c.o; list
  a.o b.o c.o d.o e.o 
  $ fresh; quarn -m -b c.o lib.a c.o; list
  a.o b.o c.o d.o e.o 
  $ fresh; quarn -m -b a.o lib.a e.o; list
  e.o a.o b.o c.o d.o 
  $ fresh; quarn -m -a e.o lib.a a.o; list
  b.o c.o d.o e.o a.o 
  $ fresh; quarn -m -i B.O lib.a D.O; list
  a.o d.o b.o c.o e.o 

Only the first that matches is moved.

  $ mkdir elsewhere
  $ fresh; (cd elsewhere; quarn -mv ../lib.a '?.o'); list
  m - a.o
  b.o c.o d.o e.o a.o 
  $ fresh; quarn -mv lib.a '[a]*' 'C*'; list
  Error: L6831E: '[a]*' not present in archive 'lib.a'
  m - c.o
  a.o b.o c.o d.o e.o 
  $ rm -f lib.a; library lib.a a.o b.o a.o; quarn -mv lib.a a.o; quarn -tv lib.a | cut -c45-
  m - a.o
  001 b.o (offset     72)
  001 a.o (offset    134)
  001 a.o (offset    196)

A pattern never means the tables.

  $ fresh; quarn -mv lib.a '*'; list
  m - a.o
  b.o c.o d.o e.o a.o 

With a position the words are looked for on disk first; each file found is a word then.

  $ fresh; quarn -mv -b a.o lib.a '*.o'; list
  m - a.o
  m - b.o
  m - c.o
  m - d.o
  m - e.o
  a.o b.o c.o d.o e.o 
  $ fresh; (cd elsewhere; quarn -mv -a e.o ../lib.a '?.o'); list
  m - a.o
  b.o c.o d.o e.o a.o 

A word without a member is an error, and nothing is written.

  $ fresh; cp lib.a before.a
  $ both quarn -mv lib.a a.o none.o b.o
  out: m - a.o
  out: m - b.o
  err: Error: L6831E: 'none.o' not present in archive 'lib.a'
  status 1
  $ both quarn -m -a none.o lib.a a.o
  err: Error: L6841E: Position 'none.o' not found
  status 1
  $ cmp lib.a before.a

Without words, nothing moves.

  $ both quarn -mv lib.a
  status 0
  $ both quarn -mv -a c.o lib.a
  status 0
  $ cmp lib.a before.a
