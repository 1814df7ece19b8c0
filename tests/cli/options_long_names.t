A long option is taken in either case, with "-" for "_", and shortened only with a dot.

  $ . "$TESTDIR/setup.sh"
  $ file a.txt a
  $ library lib.a a.txt

Letters may be of either case and "-" stands for "_".

  $ quarn --SHOW_CMDLINE -t lib.a
  [quarn --show_cmdline -t lib.a]
  a.txt
  $ quarn --show-cmdline --New-Files-Only -t lib.a
  [quarn --show_cmdline -t --new_files_only lib.a]
  a.txt
  $ quarn --create --DIAG-SUPPRESS=l6875 other.a a.txt
  $ quarn -t other.a
  a.txt

A dot behind the first letters of a name stands for the rest of it.

  $ quarn --cre. --normalise=1 --diag_sup.=L6875 short.a a.txt
  $ quarn -t short.a
  a.txt
  $ quarn --show. -t lib.a
  [quarn --show_cmdline -t lib.a]
  a.txt
  $ quarn --d. --show. -t lib.a
  [quarn --show_cmdline -t --debug_symbols lib.a]
  a.txt
  $ quarn --version.
  1000001

Behind a whole name the dot is no abbreviation.

  $ quarn --create. x.a a.txt
  Fatal error: L3900U: Unrecognized option '--create.'.
  [1]
  $ quarn --vsn. lib.a
  Fatal error: L3900U: Unrecognized option '--vsn.'.
  [1]

What is cut without a dot is no name.

  $ quarn --cre x.a a.txt
  Fatal error: L3900U: Unrecognized option '--cre'.
  [1]
  $ quarn --creat x.a a.txt
  Fatal error: L3900U: Unrecognized option '--creat'.
  [1]
  $ quarn --createx x.a a.txt
  Fatal error: L3900U: Unrecognized option '--createx'.
  [1]

An abbreviation of several names is refused, and two of them are named. Where names that need an argument
and names that take none compete, those that fit the word are meant.

  $ quarn --no. -t lib.a
  Possible matches for 'no.' include 'no_debug_symbols' and 'no_unique_symbols'.
  Fatal error: L3900U: Unrecognized option '--no.'.
  [1]
  $ quarn --diag. -t lib.a
  Possible matches for 'diag.' include 'diag_error' and 'diag_warning'.
  Fatal error: L3900U: Unrecognized option '--diag.'.
  [1]
  $ quarn --diag.=3 -t lib.a
  Possible matches for 'diag.=3' include 'diag_error' and 'diag_warning'.
  Fatal error: L3900U: Unrecognized option '--diag.=3'.
  [1]
  $ quarn --v. -t lib.a
  Possible matches for 'v.' include 'version' and 'vsn'.
  Fatal error: L3900U: Unrecognized option '--v.'.
  [1]
  $ quarn --s. -t lib.a
  Possible matches for 's.' include 'show_cmdline' and 'sizes'.
  Fatal error: L3900U: Unrecognized option '--s.'.
  [1]
  $ quarn --z. -t lib.a
  Possible matches for 'z.' include 'zs' and 'zt'.
  Fatal error: L3900U: Unrecognized option '--z.'.
  [1]
  $ quarn --n. -t lib.a
  Possible matches for 'n.' include 'new_files_only' and 'no_unique_symbols'.
  Fatal error: L3900U: Unrecognized option '--n.'.
  [1]
  $ quarn --no.=0 -t lib.a
  Possible matches for 'no.=0' include 'no_normalise' and 'normalise'.
  Fatal error: L3900U: Unrecognized option '--no.=0'.
  [1]

A long name that takes no argument gets none, and one that needs one has it behind "=" or in the next word.

  $ quarn --create=1 x.a a.txt
  Fatal error: L3916U: Unexpected argument for option '--create'
  [1]
  $ quarn --create= x.a a.txt
  Fatal error: L3916U: Unexpected argument for option '--create'
  [1]
  $ quarn --create,1 x.a a.txt
  Fatal error: L3916U: Unexpected argument for option '--create'
  [1]
  $ quarn -create=1 x.a a.txt
  Warning: L3910W: Old syntax, please use '--create'.
  Fatal error: L3916U: Unexpected argument for option '-create'
  [1]
  $ quarn --version_number=1
  Fatal error: L3916U: Unexpected argument for option '--version_number'
  [1]
  $ quarn --diag_suppress L6875 --create --normalise 5 next.a a.txt
  $ quarn --diag_suppress= -t lib.a
  a.txt
  $ quarn --normalise
  Fatal error: L3901U: Missing argument for option 'normalise'.
  [1]

A separator in the place of "=" is the older way.

  $ quarn --diag_error,L6875 -t lib.a
  Warning: L3910W: Old syntax, please use '--diag_error=L6875'.
  a.txt
  $ quarn --diag_error,L6875,L6874 -t lib.a
  Warning: L3910W: Old syntax, please use '--diag_error=L6875,L6874'.
  a.txt
  $ echo -t lib.a > words; quarn --via,words
  Warning: L3910W: Old syntax, please use '--via=words'.
  a.txt
  $ quarn --normalise,5 -t lib.a
  Warning: L3910W: Old syntax, please use '--normalise=5'.
  a.txt

Words that name no option at all.

  $ quarn -1 lib.a
  Fatal error: L3900U: Unrecognized option '-1'.
  [1]
  $ quarn --1 lib.a
  Fatal error: L3900U: Unrecognized option '--1'.
  [1]
  $ quarn -= lib.a
  Fatal error: L3900U: Unrecognized option '-='.
  [1]
  $ quarn --= lib.a
  Fatal error: L3900U: Unrecognized option '--='.
  [1]
  $ quarn -. lib.a
  Fatal error: L3900U: Unrecognized option '-.'.
  [1]
  $ quarn --. lib.a
  Fatal error: L3900U: Unrecognized option '--.'.
  [1]
  $ quarn -, lib.a
  Fatal error: L3900U: Unrecognized option '-,'.
  [1]
  $ quarn -k lib.a
  Fatal error: L3900U: Unrecognized option '-k'.
  [1]
  $ quarn -@file lib.a
  Fatal error: L3900U: Unrecognized option '-@file'.
  [1]
  $ quarn --zebra lib.a
  Fatal error: L3900U: Unrecognized option '--zebra'.
  [1]
