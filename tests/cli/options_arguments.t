Words without a dash are the archive and its files, whatever they look like.

  $ . "$TESTDIR/setup.sh"
  $ file a.txt a
  $ library lib.a a.txt

The argument of a letter stands behind it, behind "=", or in the next word.

  $ file b.txt b
  $ quarn -r --diag_suppress=L6875 -ba.txt lib.a b.txt && quarn -t lib.a
  b.txt
  a.txt
  $ file c.txt c
  $ quarn -r --diag_suppress=L6875 -b=b.txt lib.a c.txt && quarn -t lib.a
  c.txt
  b.txt
  a.txt
  $ file d.txt d
  $ quarn -r --diag_suppress=L6875 -i c.txt lib.a d.txt && quarn -t lib.a
  d.txt
  c.txt
  b.txt
  a.txt
  $ file e.txt e
  $ quarn -r --diag_suppress=L6875 lib.a e.txt -a=d.txt && quarn -t lib.a
  d.txt
  e.txt
  c.txt
  b.txt
  a.txt
  $ quarn -a,d.txt -t lib.a
  Fatal error: L3900U: Unrecognized option '-a,d.txt'.
  [1]
  $ quarn -a= -t lib.a
  d.txt
  e.txt
  c.txt
  b.txt
  a.txt

Options may stand anywhere.

  $ quarn lib.a -t a.txt
  a.txt
  $ quarn lib.a a.txt -t
  a.txt

After "--" every word is a name; a second one is a name as well.

  $ library -- -odd.a a.txt
  $ quarn -t -- -odd.a
  a.txt
  $ quarn -t -- -odd.a -t
  Error: L6831E: '-t' not present in archive '-odd.a'
  [1]
  $ quarn -t -- -odd.a --
  Error: L6831E: '--' not present in archive '-odd.a'
  [1]
  $ quarn -- -odd.a -t > /dev/null
  Error: L6839E: One of the actions -[dmpqrtx] must be specified
  [1]
  $ quarn -t -- lib.a --help
  Error: L6831E: '--help' not present in archive 'lib.a'
  [1]
  $ quarn -t -- > /dev/null
  Error: L6838E: No archive specified
  [1]

The word "-" is a name.

  $ library - a.txt
  $ quarn -t -
  a.txt
  $ quarn -t - a.txt
  a.txt
  $ quarn -t lib.a -
  Error: L6831E: '-' not present in archive 'lib.a'
  [1]

A name may begin with "=" or ",".

  $ library =x.a a.txt
  $ quarn -t =x.a
  a.txt
  $ quarn -t ,x.a
  Error: L6832E: Archive ',x.a' not found : No such file or directory
  [1]

An empty word is an empty name.

  $ quarn -t "" > /dev/null
  Error: L6838E: No archive specified
  [1]
  $ quarn -t lib.a ""
  Error: L6831E: '' not present in archive 'lib.a'
  [1]
  $ quarn -r lib.a ""
  Error: L6833E: File '' does not exist
  [1]
  $ quarn -t -a "" lib.a
  d.txt
  e.txt
  c.txt
  b.txt
  a.txt
  $ quarn --via ""
  Fatal error: L3904U: Could not open via file ''.
  [1]
  $ quarn --via=
  Fatal error: L3904U: Could not open via file ''.
  [1]

Of settings given twice the last one counts; lists grow.

  $ quarn -t -a nowhere -a a.txt lib.a
  d.txt
  e.txt
  c.txt
  b.txt
  a.txt
  $ quarn -t -b nowhere -i a.txt lib.a
  d.txt
  e.txt
  c.txt
  b.txt
  a.txt
  $ quarn -t -a nowhere -b a.txt lib.a
  d.txt
  e.txt
  c.txt
  b.txt
  a.txt
  $ quarn -t -b a.txt -a nowhere lib.a
  d.txt
  e.txt
  c.txt
  b.txt
  a.txt
  $ quarn -t -b nowhere -a a.txt lib.a
  Error: L6841E: Position 'nowhere' not found
  [1]
  $ quarn --show_cmdline --debug_symbols --unique_symbols --no_debug_symbols -t lib.a
  [quarn --show_cmdline -t --unique_symbols lib.a]
  d.txt
  e.txt
  c.txt
  b.txt
  a.txt
  $ quarn --show_cmdline --diag_error=L1,L2 --diag_error=L3 -t lib.a
  [quarn --show_cmdline -t --diag_error=L1 --diag_error=L2 --diag_error=L3 lib.a]
  d.txt
  e.txt
  c.txt
  b.txt
  a.txt
