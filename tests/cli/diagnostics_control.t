The --diag options move warnings between suppressed, remark, warning and error.

  $ . "$TESTDIR/setup.sh"
  $ file a.o a; library lib.a a.o; cp lib.a before.a
  $ warn() { both quarn -d "$@" lib.a none; }

By number, with or without the letter, in either case; what stands behind the digits is passed over.

  $ warn
  err: Warning: L6831E: 'none' not present in archive 'lib.a'
  status 0
  $ warn --diag_suppress=L6831
  status 0
  $ warn --diag_suppress=6831
  status 0
  $ warn --diag_suppress=l6831
  status 0
  $ warn --diag_suppress=L6831E
  status 0
  $ warn --diag_suppress=6831xyz
  status 0
  $ warn --diag_suppress=L006831
  status 0
  $ warn --diag_remark=L6831
  err: 'none' not present in archive 'lib.a'
  status 0
  $ warn --diag_error=L6831
  err: Error: L6831E: 'none' not present in archive 'lib.a'
  status 1
  $ warn --diag_warning=L6831
  err: Warning: L6831E: 'none' not present in archive 'lib.a'
  status 0

The last word on a number counts.

  $ warn --diag_suppress=6831 --diag_error=6831
  err: Error: L6831E: 'none' not present in archive 'lib.a'
  status 1
  $ warn --diag_error=6831 --diag_suppress=6831
  status 0
  $ warn --diag_error=6831 --diag_warning=6831
  err: Warning: L6831E: 'none' not present in archive 'lib.a'
  status 0
  $ warn --diag_error=1,6831,2
  err: Error: L6831E: 'none' not present in archive 'lib.a'
  status 1

All warnings at once; a number that has its own word is moved from there.

  $ warn --diag_suppress=warning
  status 0
  $ warn --diag_error=Warning
  err: Error: L6831E: 'none' not present in archive 'lib.a'
  status 1
  $ warn --diag_error=WARNING,L6874
  err: Error: L6831E: 'none' not present in archive 'lib.a'
  status 1
  $ warn --diag_error=warning --diag_warning=6831
  err: Error: L6831E: 'none' not present in archive 'lib.a'
  status 1
  $ warn --diag_warning=6831 --diag_error=warning
  err: Error: L6831E: 'none' not present in archive 'lib.a'
  status 1
  $ warn --diag_error=warning --diag_suppress=6831
  status 0
  $ warn --diag_error=warning --diag_remark=6831
  err: 'none' not present in archive 'lib.a'
  status 0
  $ warn --diag_suppress=warning --diag_error=6831
  err: Error: L6831E: 'none' not present in archive 'lib.a'
  status 1
  $ warn --diag_error=warning --diag_warning=warning
  err: Warning: L6831E: 'none' not present in archive 'lib.a'
  status 0
  $ warn --diag_suppress=error --diag_error=6831
  status 0
  $ warn --diag_warning=error --diag_error=6831
  err: Warning: L6831E: 'none' not present in archive 'lib.a'
  status 0

Errors themselves, remarks and fatal errors stay what they are.

  $ both quarn -t --diag_suppress=error lib.a none
  err: Error: L6831E: 'none' not present in archive 'lib.a'
  status 1
  $ both quarn -t --diag_warning=error lib.a none
  err: Error: L6831E: 'none' not present in archive 'lib.a'
  status 1
  $ both quarn -t --diag_suppress=6831 lib.a none
  err: Error: L6831E: 'none' not present in archive 'lib.a'
  status 1
  $ both quarn -t --diag_remark=6831 --diag_warning=6831 lib.a none
  err: Error: L6831E: 'none' not present in archive 'lib.a'
  status 1
  $ quarn -n -s lib.a
  $ both quarn --zs --diag_suppress=6872 lib.a
  err: Archive 'lib.a' does not have a symbol table
  status 0
  $ both quarn --zs --diag_error=6872 lib.a
  err: Archive 'lib.a' does not have a symbol table
  status 0
  $ both quarn --diag_suppress=3900 -k
  err: Fatal error: L3900U: Unrecognized option '-k'.
  status 1
  $ cp before.a lib.a

Words that are none: a warning of their own, which can't be moved.

  $ both quarn --diag_remark=warning -t lib.a
  out: a.o
  err: Warning: L9962I: Unknown diagnostic number warning
  status 0
  $ both quarn --diag_remark=ERROR -t lib.a
  out: a.o
  err: Warning: L9962I: Unknown diagnostic number ERROR
  status 0
  $ both quarn --diag_warning=0 -t lib.a
  out: a.o
  err: Warning: L9962I: Unknown diagnostic number 0
  status 0
  $ both quarn --diag_warning=10000 -t lib.a
  out: a.o
  err: Warning: L9962I: Unknown diagnostic number 10000
  status 0
  $ both quarn --diag_warning=4294974127 -t lib.a
  out: a.o
  err: Warning: L9962I: Unknown diagnostic number 4294974127
  status 0
  $ both quarn --diag_warning=99999999999999999999999 -t lib.a
  out: a.o
  err: Warning: L9962I: Unknown diagnostic number 99999999999999999999999
  status 0
  $ both quarn --diag_error=-1 -t lib.a
  out: a.o
  err: Warning: L9962I: Unknown diagnostic number -1
  status 0
  $ both quarn --diag_error=+6831 -t lib.a
  out: a.o
  err: Warning: L9962I: Unknown diagnostic number +6831
  status 0
  $ both quarn --diag_error=L -t lib.a
  out: a.o
  err: Warning: L9962I: Unknown diagnostic number L
  status 0
  $ both quarn --diag_error=L-1 -t lib.a
  out: a.o
  err: Warning: L9962I: Unknown diagnostic number L-1
  status 0
  $ both quarn --diag_error=L0 -t lib.a
  out: a.o
  err: Warning: L9962I: Unknown diagnostic number L0
  status 0
  $ both quarn --diag_error=%s%n -t lib.a
  out: a.o
  err: Warning: L9962I: Unknown diagnostic number %s%n
  status 0
  $ both quarn --diag_suppress=9962 --diag_error=9962,0 -t lib.a
  out: a.o
  err: Warning: L9962I: Unknown diagnostic number 0
  status 0
  $ both quarn --diag_suppress=warning --diag_error=0 -t lib.a
  out: a.o
  err: Warning: L9962I: Unknown diagnostic number 0
  status 0
  $ both quarn --diag_error=warning --diag_suppress=0,6831 -d lib.a none
  err: Warning: L9962I: Unknown diagnostic number 0
  status 0
  $ both quarn --diag_error=1,9999 -t lib.a
  out: a.o
  status 0

Other letters are for other tools.

  $ both quarn --diag_warning=Q1234 -t lib.a
  out: a.o
  status 0
  $ both quarn --diag_error=A0,q,X6831,warnings,errors -t lib.a
  out: a.o
  status 0

Empty pieces say nothing.

  $ both quarn --diag_error= -t lib.a
  out: a.o
  status 0
  $ both quarn --diag_error=,6831, -d lib.a none
  err: Error: L6831E: 'none' not present in archive 'lib.a'
  status 1
  $ both quarn --diag_error "" -t lib.a
  out: a.o
  status 0

They hold from their place on.

  $ both quarn -tt --diag_suppress=3920 -vv lib.a
  out: rw-r--r--     0/     0      1 Sep 09 01:46 2001 a.o (offset     72)
  err: Warning: L3920W: Option '-t' repeated in concatenated options '-tt'.
  status 0

The code keeps its letter at every severity.

  $ both quarn --diag_error=L6875 -r lib.a a.o
  err: Error: L6875W: Adding non-ELF object 'a.o' to archive 'lib.a'
  status 1
  $ both quarn --diag_remark=L6875 --diag_style=ide -r lib.a a.o
  err: quarn : Adding non-ELF object 'a.o' to archive 'lib.a'
  status 0
  $ both quarn --diag_error=L6875 --diag_style=ide -r lib.a a.o
  err: quarn : error L6875:  Adding non-ELF object 'a.o' to archive 'lib.a'
  status 1
  $ both quarn --diag_error=L6974 -t lib.a
  out: a.o
  status 0
