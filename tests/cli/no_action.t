Without an action there is nothing to do, unless the symbol table is to be made.

  $ . "$TESTDIR/setup.sh"
  $ file a.txt a
  $ library lib.a a.txt
  $ cp lib.a before.a
  $ quarn --help > help

An archive alone is not enough, and gets help. Settings are no action.

  $ both quarn lib.a > shown
  $ grep -v '^out: ' shown
  err: Error: L6839E: One of the actions -[dmpqrtx] must be specified
  status 1
  $ sed -n 's/^out: //p' shown | cmp - help
  $ for setting in -n -v -c -C -T -u --new_files_only --debug_symbols --unique_symbols --qobix_buildattr --normalise=5 --libattrmap=x --db_check=high --diag_style=gnu; do
  >   quarn $setting lib.a > shown || cmp shown help
  > done
  Error: L6839E: One of the actions -[dmpqrtx] must be specified
  Error: L6839E: One of the actions -[dmpqrtx] must be specified
  Error: L6839E: One of the actions -[dmpqrtx] must be specified
  Error: L6839E: One of the actions -[dmpqrtx] must be specified
  Error: L6839E: One of the actions -[dmpqrtx] must be specified
  Error: L6839E: One of the actions -[dmpqrtx] must be specified
  Error: L6839E: One of the actions -[dmpqrtx] must be specified
  Error: L6839E: One of the actions -[dmpqrtx] must be specified
  Error: L6839E: One of the actions -[dmpqrtx] must be specified
  Error: L6839E: One of the actions -[dmpqrtx] must be specified
  Error: L6839E: One of the actions -[dmpqrtx] must be specified
  Error: L6839E: One of the actions -[dmpqrtx] must be specified
  Error: L6839E: One of the actions -[dmpqrtx] must be specified
  Error: L6839E: One of the actions -[dmpqrtx] must be specified
  $ quarn lib.a a.txt > shown
  Error: L6839E: One of the actions -[dmpqrtx] must be specified
  [1]
  $ cmp shown help

Asked for the version as well, the banner alone follows the error.

  $ both quarn --vsn lib.a
  out: Product: Quarn Object Tools 1.0
  out: Component: Quarn Object Tools 1.0
  out: Tool: quarn [01000001]
  err: Error: L6839E: One of the actions -[dmpqrtx] must be specified
  status 1
  $ both quarn -V -n lib.a
  out: Product: Quarn Object Tools 1.0
  out: Component: Quarn Object Tools 1.0
  out: Tool: quarn [01000001]
  err: Error: L6839E: One of the actions -[dmpqrtx] must be specified
  status 1

Options without an archive.

  $ both quarn -t > shown
  $ grep -v '^out: ' shown
  err: Error: L6838E: No archive specified
  status 1
  $ sed -n 's/^out: //p' shown | cmp - help
  $ quarn -v > shown
  Error: L6838E: No archive specified
  [1]
  $ cmp shown help
  $ quarn -s > shown
  Error: L6838E: No archive specified
  [1]
  $ quarn -r -a x > shown
  Error: L6838E: No archive specified
  [1]
  $ quarn --create > shown
  Error: L6838E: No archive specified
  [1]
  $ cmp shown help

With the version asked for, there is nothing to complain about.

  $ both quarn --vsn
  out: Product: Quarn Object Tools 1.0
  out: Component: Quarn Object Tools 1.0
  out: Tool: quarn [01000001]
  status 0
  $ both quarn --vsn -t
  out: Product: Quarn Object Tools 1.0
  out: Component: Quarn Object Tools 1.0
  out: Tool: quarn [01000001]
  status 0
  $ both quarn --version -v -s
  out: Product: Quarn Object Tools 1.0
  out: Component: Quarn Object Tools 1.0
  out: Tool: quarn [01000001]
  status 0
  $ both quarn -V --create
  out: Product: Quarn Object Tools 1.0
  out: Component: Quarn Object Tools 1.0
  out: Tool: quarn [01000001]
  status 0

No word at all gives help, and help asks for nothing else.

  $ quarn > shown; echo $?
  0
  $ cmp shown help
  $ both quarn -h -t missing.a > shown
  $ sed -n 's/^out: //p' shown | cmp - help
  $ tail -1 shown
  status 0
  $ quarn --help --vsn | cmp - help
  $ quarn --help -d lib.a a.txt | cmp - help
  $ quarn --help --create new.a | cmp - help

The version of a run with an action is not shown.

  $ both quarn --vsn -t lib.a
  out: a.txt
  status 0

-s is enough to work on: the table is made anew.

  $ both quarn -s lib.a
  status 0
  $ cmp lib.a before.a
  $ both quarn -s --vsn lib.a
  status 0
  $ quarn -n -s lib.a
  $ quarn -tv lib.a
  rw-r--r--     0/     0      1 Sep 09 01:46 2001 a.txt (offset      8)
  $ quarn -s lib.a
  $ cmp lib.a before.a

With -s alone, file words are of no use and not looked at.

  $ both quarn -s lib.a none.txt
  status 0
  $ cmp lib.a before.a
  $ ls
  a.txt
  before.a
  help
  lib.a
  shown
