A letter takes a single dash; names with one dash are the older way, or letters.

  $ . "$TESTDIR/setup.sh"
  $ file a.txt a
  $ library lib.a a.txt

A single letter takes a single dash, and three dashes are one too many.

  $ quarn --t lib.a
  Fatal error: L3900U: Unrecognized option '--t'.
  [1]
  $ quarn --d lib.a a.txt
  Fatal error: L3900U: Unrecognized option '--d'.
  [1]
  $ quarn --h
  Fatal error: L3900U: Unrecognized option '--h'.
  [1]
  $ quarn --tv lib.a
  Fatal error: L3900U: Unrecognized option '--tv'.
  [1]
  $ quarn ---t lib.a
  Fatal error: L3900U: Unrecognized option '---t'.
  [1]
  $ quarn ---create lib.a
  Fatal error: L3900U: Unrecognized option '---create'.
  [1]

With one dash the older names are still taken, and the newer spelling is shown.

  $ quarn -create --normalise=1 --diag_suppress=L6875 old.a a.txt
  Warning: L3910W: Old syntax, please use '--create'.
  $ quarn -vsn | head -1
  Warning: L3910W: Old syntax, please use '--vsn'.
  Product: Quarn Object Tools 1.0
  $ quarn -version | tail -1
  Warning: L3910W: Old syntax, please use '--version'.
  Tool: quarn [01000001]
  $ quarn -help | sed -n 7p
  Warning: L3910W: Old syntax, please use '--help'.
  Command format:
  $ quarn -show_cmdline -t lib.a
  Fatal error: L3900U: Unrecognized option '-ow_cmdline'.
  [1]
  $ quarn -new_files_only -r lib.a
  Warning: L3910W: Old syntax, please use '--new_files_only'.
  $ quarn -zs lib.a
  Warning: L3910W: Old syntax, please use '--zs'.
  $ echo -t lib.a > words
  $ quarn -via words
  Warning: L3910W: Old syntax, please use '--via'.
  a.txt
  $ quarn -Create --normalise=1 --diag_suppress=L6875 old.a a.txt
  Warning: L3910W: Old syntax, please use '--create'.

Newer names want their two dashes: with one they are read letter by letter, or not at all.

  $ quarn -libattrmap=map -t lib.a
  Fatal error: L3900U: Unrecognized option '-libattrmap=map'.
  [1]
  $ quarn -unique_symbols -t lib.a
  Fatal error: L3917U: Concatenated options cannot have arguments: -i que_symbols
  [1]
  $ quarn -qobix_buildattr -t lib.a
  Fatal error: L3900U: Unrecognized option '-obix_buildattr'.
  [1]
  $ quarn -version_number
  Fatal error: L3900U: Unrecognized option '-ersion_number'.
  [1]

An abbreviation wants two dashes too.

  $ quarn -cre. x.a a.txt
  Fatal error: L3900U: Unrecognized option '-e.'.
  [1]
  $ quarn -entri. lib.a
  Fatal error: L3900U: Unrecognized option '-entri.'.
  [1]

Of the letters, those with an older spelling are taken in the other case with a warning.

  $ quarn -D lib.a none.txt
  Warning: L3910W: Old syntax, please use '-d'.
  Warning: L6831E: 'none.txt' not present in archive 'lib.a'
  $ quarn -X lib.a
  Warning: L3910W: Old syntax, please use '-x'.
  $ quarn -N -t lib.a
  Warning: L3910W: Old syntax, please use '-n'.
  a.txt
  $ quarn -H | sed -n 7p
  Warning: L3910W: Old syntax, please use '-h'.
  Command format:
  $ quarn -U -R lib.a
  Warning: L3910W: Old syntax, please use '-u'.
  Warning: L3910W: Old syntax, please use '-r'.
  $ quarn -A=a.txt -t lib.a
  Warning: L3910W: Old syntax, please use '-a'.
  a.txt

The others are letters of their own.

  $ quarn -V | head -1
  Product: Quarn Object Tools 1.0
  $ quarn -T -t lib.a
  a.txt
  $ quarn -C -t lib.a
  a.txt
  $ quarn -c -v -t lib.a
  rw-r--r--     0/     0      1 Sep 09 01:46 2001 a.txt (offset     72)
