Letters that take no argument may stand behind one dash.

  $ . "$TESTDIR/setup.sh"
  $ file a.txt a
  $ library lib.a a.txt

  $ quarn -tv lib.a
  rw-r--r--     0/     0      1 Sep 09 01:46 2001 a.txt (offset     72)
  $ quarn -vt lib.a
  rw-r--r--     0/     0      1 Sep 09 01:46 2001 a.txt (offset     72)
  $ quarn -tvcnTC lib.a
  rw-r--r--     0/     0      1 Sep 09 01:46 2001 a.txt (offset     72)

A repeated letter is told of, each time, with the letters so far. Letters are shown as the options they chose.

  $ quarn -tt lib.a
  Warning: L3920W: Option '-t' repeated in concatenated options '-tt'.
  a.txt
  $ quarn -tvt lib.a
  Warning: L3920W: Option '-t' repeated in concatenated options '-tvt'.
  rw-r--r--     0/     0      1 Sep 09 01:46 2001 a.txt (offset      8)
  $ quarn -tvtv --show_cmdline lib.a
  Warning: L3920W: Option '-t' repeated in concatenated options '-tvtv'.
  Warning: L3920W: Option '-v' repeated in concatenated options '-tvtv'.
  [quarn --show_cmdline -t -v lib.a]
  rw-r--r--     0/     0      1 Sep 09 01:46 2001 a.txt (offset      8)
  $ quarn -ttt lib.a
  Warning: L3920W: Option '-t' repeated in concatenated options '-ttt'.
  Warning: L3920W: Option '-t' repeated in concatenated options '-ttt'.
  a.txt
  $ quarn -tvtc lib.a
  Warning: L3920W: Option '-t' repeated in concatenated options '-tvtc'.
  rw-r--r--     0/     0      1 Sep 09 01:46 2001 a.txt (offset      8)
  $ quarn -Xx --show_cmdline lib.a
  Warning: L3910W: Old syntax, please use '-x'.
  Warning: L3920W: Option '-x' repeated in concatenated options '-xx'.
  [quarn --show_cmdline -x lib.a]
  $ quarn -rq --show_cmdline lib.a
  Warning: L3920W: Option '-q' repeated in concatenated options '-rq'.
  [quarn --show_cmdline -r lib.a]

A row of n letters gives n - 1 warnings, however many there are.

  $ quarn -t "-$(printf 'v%.0s' {1..300})" lib.a 2> warnings
  rw-r--r--     0/     0      1 Sep 09 01:46 2001 a.txt (offset     72)
  $ grep -c "^Warning: L3920W: Option '-v' repeated in concatenated options '-vv" warnings
  299
  $ head -c 105 warnings
  Warning: L3920W: Option '-v' repeated in concatenated options '-vvvvvvvvvvvvvvvvvvvvvvvvvvvvvvvvvvvvvvvvv (no-eol)
  $ tail -1 warnings | wc -c
  367

Two words are no concatenation, so nothing is said.

  $ quarn -t -t -v -v lib.a
  rw-r--r--     0/     0      1 Sep 09 01:46 2001 a.txt (offset     72)

A letter that needs an argument can't stand in a row; the first one can have the rest of the word.

  $ quarn -ta pos lib.a
  Fatal error: L3917U: Concatenated options cannot have arguments: -a 
  [1]
  $ quarn -tapos lib.a
  Fatal error: L3917U: Concatenated options cannot have arguments: -a pos
  [1]
  $ quarn -ta=pos lib.a
  Fatal error: L3917U: Concatenated options cannot have arguments: -a =pos
  [1]
  $ quarn -tb pos lib.a
  Fatal error: L3917U: Concatenated options cannot have arguments: -b 
  [1]
  $ quarn -ti pos lib.a
  Fatal error: L3917U: Concatenated options cannot have arguments: -i 
  [1]
  $ quarn -ta
  Fatal error: L3901U: Missing argument for option 'a'.
  [1]
  $ quarn -aa.txt -t lib.a
  a.txt
  $ quarn -aposition -t lib.a
  Error: L6841E: Position 'position' not found
  [1]

An older long name may be the end of the row.

  $ quarn -tvsn lib.a
  Warning: L3910W: Old syntax, please use '--vsn'.
  a.txt
  $ quarn -tvzs lib.a
  Warning: L3910W: Old syntax, please use '--zs'.
  Error: L6840E: Only one action option may be specified
  [1]
  $ quarn -ccreate --diag_suppress=L6875 --normalise=1 new.a a.txt
  Warning: L3910W: Old syntax, please use '--create'.
  $ quarn -tcreate new.a a.txt
  Warning: L3910W: Old syntax, please use '--create'.
  Error: L6840E: Only one action option may be specified
  [1]

A letter of the row that is none, and separators behind letters.

  $ quarn -tk lib.a
  Fatal error: L3900U: Unrecognized option '-k'.
  [1]
  $ quarn -t=1 lib.a
  Fatal error: L3900U: Unrecognized option '-t=1'.
  [1]
  $ quarn -t,v lib.a
  Fatal error: L3900U: Unrecognized option '-t,v'.
  [1]
  $ quarn -tv=1 lib.a
  Fatal error: L3900U: Unrecognized option '-v=1'.
  [1]
  $ quarn -t- lib.a
  Fatal error: L3900U: Unrecognized option '--'.
  [1]
  $ quarn -t. lib.a
  Fatal error: L3900U: Unrecognized option '-.'.
  [1]

Two words of letters are options; without a dash they are an archive and its files.

  $ quarn tv lib.a > /dev/null
  Error: L6839E: One of the actions -[dmpqrtx] must be specified
  [1]
