An argument file holds words that stand in for it on the command line.

  $ . "$TESTDIR/setup.sh"
  $ file a.txt a
  $ file 'a b' ab
  $ library lib.a a.txt 'a b'

What the words are is shown by listing them back.

  $ via() { printf "$@" > via; quarn --show_cmdline --via via; }

An empty file adds nothing and says nothing.

  $ : > empty
  $ both quarn -t lib.a --via empty
  out: a.txt
  out: a b
  status 0
  $ printf ' \n\t\r\n' > blank
  $ both quarn -t lib.a --via=blank
  out: a.txt
  out: a b
  status 0

The word behind is looked at before a word acts, so a fault in it comes first.

  $ via -- '--diag_style=gnu "open'
  Fatal error: L3906U: Malformed via file 'via'.
  [1]
  $ via -- '--diag_style=ide -t lib.a "open'
  quarn : Fatal error L3906:  Malformed via file 'via'.
  [1]

A NUL byte is found when its piece of the file is read, also in a comment, and before any word acts.

  $ via -- '--diag_style=ide -t lib.a # \0 x\n'
  Fatal error: L3918U: '\0' character found in via file 'via' - possible binary file.  Aborting via file parse.
  [1]
  $ { printf -- '--diag_style=ide\n'; yes -- '-T' | head -800; printf '\0'; } > late
  $ quarn -t lib.a --via late
  quarn : Fatal error L3918:  '\0' character found in via file 'late' - possible binary file.  Aborting via file parse.
  [1]

Options that need an argument find it in the file only.

  $ via -- '-t lib.a -a a.txt'
  [quarn --show_cmdline -t -aa.txt --via=via lib.a]
  a.txt
  a b
  $ via -- '-t lib.a -a'
  Fatal error: L3901U: Missing argument for option 'a'.
  [1]
  $ printf -- '-t -a' > via
  $ quarn --via via a.txt lib.a
  Fatal error: L3901U: Missing argument for option 'a'.
  [1]
  $ printf -- '--via' > via
  $ quarn --via via lib.a
  Fatal error: L3901U: Missing argument for option 'via'.
  [1]

"--" in a file ends the options there and behind it.

  $ printf -- '-t -- lib.a' > via
  $ quarn --via via -t
  Error: L6831E: '-t' not present in archive 'lib.a'
  [1]

The words act in their place: what is switched on in the file holds for what follows it.

  $ printf -- '--diag_style=ide' > style
  $ quarn -vsn --via style -zs > /dev/null
  Warning: L3910W: Old syntax, please use '--vsn'.
  quarn : warning L3910:  Old syntax, please use '--zs'.
  $ printf -- '--via style' > outer
  $ quarn -vsn --via outer -zs > /dev/null
  Warning: L3910W: Old syntax, please use '--vsn'.
  quarn : warning L3910:  Old syntax, please use '--zs'.

Several files, one after the other.

  $ echo -t > one; echo lib.a > two; echo a.txt > three
  $ quarn --via one,two --via three
  a.txt
  $ quarn --via=one --via=two,three --show_cmdline
  [quarn --show_cmdline -t --via=one --via=two --via=three lib.a a.txt]
  a.txt
  $ quarn --via one,nowhere
  Fatal error: L3904U: Could not open via file 'nowhere'.
  [1]

Nine levels work, the tenth does not.

  $ for level in 1 2 3 4 5 6 7 8; do echo --via level$((level + 1)) > level$level; done
  $ echo -t lib.a > level9
  $ quarn --via level1
  a.txt
  a b
  $ echo --via level10 > level9; echo -t lib.a > level10
  $ quarn --via level1
  Fatal error: L3902U: Recursive via file inclusion depth of 10 reached in file 'level10'.
  [1]

After a file is done its level is free again.

  $ for turn in 1 2 3 4 5 6 7 8 9 10 11 12; do echo --via level9; done > turns
  $ echo -t lib.a > level9
  $ quarn --via turns
  Error: L6831E: 'lib.a' not present in archive 'lib.a'
  Error: L6831E: 'lib.a' not present in archive 'lib.a'
  Error: L6831E: 'lib.a' not present in archive 'lib.a'
  Error: L6831E: 'lib.a' not present in archive 'lib.a'
  Error: L6831E: 'lib.a' not present in archive 'lib.a'
  Error: L6831E: 'lib.a' not present in archive 'lib.a'
  Error: L6831E: 'lib.a' not present in archive 'lib.a'
  Error: L6831E: 'lib.a' not present in archive 'lib.a'
  Error: L6831E: 'lib.a' not present in archive 'lib.a'
  Error: L6831E: 'lib.a' not present in archive 'lib.a'
  Error: L6831E: 'lib.a' not present in archive 'lib.a'
  [1]

The strings of a file outlive it.

  $ printf -- '-t -a a.txt --libattrmap=nomap lib.a' > via
  $ quarn --via via,empty
  a.txt
  a b

A name that holds a conversion is only a name.

  $ echo '%s%n' > '%d.via'
  $ quarn -t --via %d.via
  Error: L6832E: Archive '%s%n' not found : No such file or directory
  [1]
  $ quarn --via %s
  Fatal error: L3904U: Could not open via file '%s'.
  [1]
