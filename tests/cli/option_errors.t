What is wrong with the command line ends the run before anything is touched.

  $ . "$TESTDIR/setup.sh"
  $ file a.txt a
  $ library lib.a a.txt
  $ cp lib.a before.a

Unrecognized, with as many dashes as were given.

  $ both quarn -d --frobnicate lib.a a.txt
  err: Fatal error: L3900U: Unrecognized option '--frobnicate'.
  status 1
  $ both quarn -d -k lib.a a.txt
  err: Fatal error: L3900U: Unrecognized option '-k'.
  status 1
  $ cmp lib.a before.a

Missing argument.

  $ both quarn -d lib.a a.txt --via
  err: Fatal error: L3901U: Missing argument for option 'via'.
  status 1
  $ both quarn -d lib.a a.txt -a
  err: Fatal error: L3901U: Missing argument for option 'a'.
  status 1
  $ both quarn -d lib.a a.txt -i
  err: Fatal error: L3901U: Missing argument for option 'i'.
  status 1
  $ both quarn -d lib.a a.txt --diag_error
  err: Fatal error: L3901U: Missing argument for option 'diag_error'.
  status 1
  $ both quarn -d lib.a a.txt --db_check
  err: Fatal error: L3901U: Missing argument for option 'db_check'.
  status 1
  $ both quarn -d lib.a a.txt -via
  err: Warning: L3910W: Old syntax, please use '--via'.
  err: Fatal error: L3901U: Missing argument for option 'via'.
  status 1

An argument that may look like an option is the argument.

  $ quarn -a -t lib.a > /dev/null
  Error: L6839E: One of the actions -[dmpqrtx] must be specified
  [1]
  $ both quarn -t -a -- lib.a
  err: Error: L6841E: Position '--' not found
  status 1
  $ quarn --libattrmap -t lib.a a.txt > /dev/null
  Error: L6839E: One of the actions -[dmpqrtx] must be specified
  [1]

Argument not permitted.

  $ both quarn --normalise=abc -t lib.a
  err: Fatal error: L3903U: Argument 'abc' not permitted for option 'normalise'.
  status 1
  $ both quarn --diag_style=fancy -t lib.a
  err: Fatal error: L3903U: Argument 'fancy' not permitted for option 'diag_style'.
  status 1
  $ both quarn --diag_style= -t lib.a
  err: Fatal error: L3903U: Argument '' not permitted for option 'diag_style'.
  status 1
  $ both quarn --diag_style=gn -t lib.a
  err: Fatal error: L3903U: Argument 'gn' not permitted for option 'diag_style'.
  status 1

Overflow.

  $ both quarn --normalise=2147483648 -t lib.a
  err: Fatal error: L3908U: Overflow: '2147483648' will not fit in an integer.
  status 1

Argument files that are not there, are folders, are malformed, binary, endless, or hold too long words.

  $ both quarn --via nowhere
  err: Fatal error: L3904U: Could not open via file 'nowhere'.
  status 1
  $ mkdir folder
  $ both quarn --via folder
  err: Fatal error: L3905U: Error when reading from via file 'folder'.
  status 1
  $ printf '"a b' > open_quote
  $ both quarn --via open_quote
  err: Fatal error: L3906U: Malformed via file 'open_quote'.
  status 1
  $ printf -- '-t\0lib.a' > binary
  $ both quarn --via binary
  err: Fatal error: L3918U: '\0' character found in via file 'binary' - possible binary file.  Aborting via file parse.
  status 1
  $ echo --via itself > itself
  $ both quarn --via itself
  err: Fatal error: L3902U: Recursive via file inclusion depth of 10 reached in file 'itself'.
  status 1
  $ { printf '%0600d ' 1; printf '%0600d\n' 2; } > wide
  $ both quarn --via wide
  err: Fatal error: L3907U: Via file 'wide' command too long for buffer.
  status 1

Unexpected argument, and an argument in a row of letters.

  $ both quarn --zs=1 lib.a
  err: Fatal error: L3916U: Unexpected argument for option '--zs'
  status 1
  $ both quarn -ta pos lib.a
  err: Fatal error: L3917U: Concatenated options cannot have arguments: -a 
  status 1

An ambiguity is a remark, and an error follows.

  $ both quarn --no. lib.a
  err: Possible matches for 'no.' include 'no_debug_symbols' and 'no_unique_symbols'.
  err: Fatal error: L3900U: Unrecognized option '--no.'.
  status 1

Choosing "list" as a style shows what may be chosen and goes on, in the style of "ide".

  $ both quarn --diag_style=list -t lib.a
  out: a.txt
  err: quarn : The following arguments to option 'diag_style' can be selected:
  err:  list zev ide devstudio gnu
  status 0
  $ both quarn --diag_style=LIST -t lib.a none
  err: quarn : The following arguments to option 'diag_style' can be selected:
  err:  list zev ide devstudio gnu
  err: quarn : error L6831:  'none' not present in archive 'lib.a'
  status 1

Old spellings and repeated letters are warnings, which can be silenced or made errors.

  $ both quarn -D lib.a none
  err: Warning: L3910W: Old syntax, please use '-d'.
  err: Warning: L6831E: 'none' not present in archive 'lib.a'
  status 0
  $ both quarn --diag_suppress=L3910,L6831 -D lib.a none
  status 0
  $ both quarn --diag_error=L3910 -zs lib.a
  err: Error: L3910W: Old syntax, please use '--zs'.
  status 1
  $ both quarn --diag_error=3920 -tt lib.a
  err: Error: L3920W: Option '-t' repeated in concatenated options '-tt'.
  status 1
  $ both quarn --diag_remark=L3920 -tt lib.a
  out: a.txt
  err: Option '-t' repeated in concatenated options '-tt'.
  status 0
  $ both quarn -tt lib.a --diag_error=3920
  out: a.txt
  err: Warning: L3920W: Option '-t' repeated in concatenated options '-tt'.
  status 0

A raised warning counts although the version number is still printed.

  $ both quarn --diag_error=L3910 -vsn --version_number
  out: 1000001
  err: Error: L3910W: Old syntax, please use '--vsn'.
  status 0

Fatal errors can't be lowered.

  $ both quarn --diag_suppress=error --diag_suppress=L3900 -k
  err: Fatal error: L3900U: Unrecognized option '-k'.
  status 1

Nothing was changed by any of this.

  $ cmp lib.a before.a
  $ ls
  a.txt
  before.a
  binary
  folder
  itself
  lib.a
  open_quote
  wide
