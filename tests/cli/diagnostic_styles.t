Each style has its own look for diagnostics; listings look the same in all.

  $ . "$TESTDIR/setup.sh"
  $ file a.o a; library lib.a a.o; cp lib.a bare.a; quarn -n -s bare.a
  $ for style in zev list ide devstudio gnu; do
  >   echo "--- $style"
  >   both quarn --diag_style=$style -d --diag_error=0 -zs lib.a
  >   both quarn --diag_style=$style --zs bare.a
  >   both quarn --diag_style=$style -d lib.a none
  >   both quarn --diag_style=$style -t lib.a none a.o
  >   both quarn --diag_style=$style -k
  > done
  --- zev
  err: Warning: L9962I: Unknown diagnostic number 0
  err: Warning: L3910W: Old syntax, please use '--zs'.
  err: Error: L6840E: Only one action option may be specified
  status 1
  err: Archive 'bare.a' does not have a symbol table
  status 0
  err: Warning: L6831E: 'none' not present in archive 'lib.a'
  status 0
  out: a.o
  err: Error: L6831E: 'none' not present in archive 'lib.a'
  status 1
  err: Fatal error: L3900U: Unrecognized option '-k'.
  status 1
  --- list
  err: quarn : The following arguments to option 'diag_style' can be selected:
  err:  list zev ide devstudio gnu
  err: quarn : warning L9962:  Unknown diagnostic number 0
  err: quarn : warning L3910:  Old syntax, please use '--zs'.
  err: quarn : error L6840:  Only one action option may be specified
  status 1
  err: quarn : The following arguments to option 'diag_style' can be selected:
  err:  list zev ide devstudio gnu
  err: quarn : Archive 'bare.a' does not have a symbol table
  status 0
  err: quarn : The following arguments to option 'diag_style' can be selected:
  err:  list zev ide devstudio gnu
  err: quarn : warning L6831:  'none' not present in archive 'lib.a'
  status 0
  out: a.o
  err: quarn : The following arguments to option 'diag_style' can be selected:
  err:  list zev ide devstudio gnu
  err: quarn : error L6831:  'none' not present in archive 'lib.a'
  status 1
  err: quarn : The following arguments to option 'diag_style' can be selected:
  err:  list zev ide devstudio gnu
  err: quarn : Fatal error L3900:  Unrecognized option '-k'.
  status 1
  --- ide
  err: quarn : warning L9962:  Unknown diagnostic number 0
  err: quarn : warning L3910:  Old syntax, please use '--zs'.
  err: quarn : error L6840:  Only one action option may be specified
  status 1
  err: quarn : Archive 'bare.a' does not have a symbol table
  status 0
  err: quarn : warning L6831:  'none' not present in archive 'lib.a'
  status 0
  out: a.o
  err: quarn : error L6831:  'none' not present in archive 'lib.a'
  status 1
  err: quarn : Fatal error L3900:  Unrecognized option '-k'.
  status 1
  --- devstudio
  err: quarn : warning L9962:  Unknown diagnostic number 0
  err: quarn : warning L3910:  Old syntax, please use '--zs'.
  err: quarn : error L6840:  Only one action option may be specified
  status 1
  err: quarn : Archive 'bare.a' does not have a symbol table
  status 0
  err: quarn : warning L6831:  'none' not present in archive 'lib.a'
  status 0
  out: a.o
  err: quarn : error L6831:  'none' not present in archive 'lib.a'
  status 1
  err: quarn : Fatal error L3900:  Unrecognized option '-k'.
  status 1
  --- gnu
  err: Warning: L9962I: Unknown diagnostic number 0
  err: Warning: L3910W: Old syntax, please use '--zs'.
  err: Error: L6840E: Only one action option may be specified
  status 1
  err: Archive 'bare.a' does not have a symbol table
  status 0
  err: Warning: L6831E: 'none' not present in archive 'lib.a'
  status 0
  out: a.o
  err: Error: L6831E: 'none' not present in archive 'lib.a'
  status 1
  err: Fatal error: L3900U: Unrecognized option '-k'.
  status 1

Names of styles may be of either case, and the last one counts from its place on.

  $ both quarn --diag_style=Gnu -t lib.a none
  err: Error: L6831E: 'none' not present in archive 'lib.a'
  status 1
  $ both quarn --diag_style=IDE --diag_style=gnu -t lib.a none
  err: Error: L6831E: 'none' not present in archive 'lib.a'
  status 1
  $ both quarn --diag_error=0 --diag_style=ide --diag_error=0 --diag_style=zev --diag_error=0 -t lib.a
  out: a.o
  err: Warning: L9962I: Unknown diagnostic number 0
  err: quarn : warning L9962:  Unknown diagnostic number 0
  err: Warning: L9962I: Unknown diagnostic number 0
  status 0

The choices are shown each time they are asked for.

  $ both quarn --diag_style=list --diag_style=list --diag_style=zev --diag_style=list -t lib.a none
  err: quarn : The following arguments to option 'diag_style' can be selected:
  err:  list zev ide devstudio gnu
  err: quarn : The following arguments to option 'diag_style' can be selected:
  err:  list zev ide devstudio gnu
  err: quarn : The following arguments to option 'diag_style' can be selected:
  err:  list zev ide devstudio gnu
  err: quarn : error L6831:  'none' not present in archive 'lib.a'
  status 1
