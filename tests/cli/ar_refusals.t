What cannot be honoured is refused in one sentence, and the archive stays as it was.

  $ . "$TESTDIR/setup.sh"
  $ file a.txt a; quarn-ar rc lib.a a.txt; cp lib.a before.a
  $ refused() {
  >   both quarn-ar "$@"; cmp lib.a before.a
  > }

Words.

  $ refused
  err: quarn-ar: Error: L6839E: One of the actions -[dmpqrstx] must be specified
  status 1
  $ refused rc
  err: quarn-ar: Error: L6838E: No archive specified
  status 1
  $ refused v lib.a
  err: quarn-ar: Error: L6839E: One of the actions -[dmpqrstx] must be specified
  status 1
  $ refused rd lib.a a.txt
  err: quarn-ar: Error: two operations: 'r' and 'd'
  status 1
  $ refused rz lib.a a.txt
  err: quarn-ar: Error: there is no letter 'z', as in 'rz'
  status 1
  $ refused xP lib.a
  err: quarn-ar: Error: 'P' can't be honoured with the operation 'x'
  status 1
  $ refused rab a.txt lib.a a.txt
  err: quarn-ar: Error: two places: 'a' and 'b'
  status 1
  $ refused ra
  err: quarn-ar: Error: 'a' wants a member's name in front of the archive
  status 1
  $ refused rcT lib.a a.txt
  err: quarn-ar: Error: thin archives are not made ('T')
  status 1
  $ refused rc --thin lib.a a.txt
  err: quarn-ar: Error: thin archives are not made
  status 1
  $ refused rc --target=pe-x86-64 lib.a a.txt
  err: quarn-ar: Error: archives for the target 'pe-x86-64' are not made
  status 1
  $ refused rc --output=x lib.a a.txt
  err: quarn-ar: Error: there is no option '--output'
  status 1
  $ refused rc lib.a a.txt --plugin
  err: quarn-ar: Error: the option '--plugin' wants a value
  status 1
  $ refused tN 0 lib.a
  err: quarn-ar: Error: 'N' can't be honoured with the operation 't'
  status 1
  $ refused dN 0 lib.a a.txt
  err: quarn-ar: Error: 'N' wants a number from 1 on in front of the archive, not '0'
  status 1
  $ echo 'CREATE lib.a' | refused -M
  err: quarn-ar: Error: scripts are not read ('M'): give the operations as words
  status 1
  $ refused @none
  err: quarn-ar: Error: the response file 'none' can't be opened: No such file or directory
  status 1
  $ echo @circle > circle; refused t lib.a @circle
  err: quarn-ar: Error: the response file 'circle' leads back to itself
  status 1
  $ echo '"a' > open; refused t lib.a @open
  err: quarn-ar: Error: the response file 'open' has a quote without an end
  status 1
  $ refused --rsp-quoting=dos t lib.a
  err: quarn-ar: Error: there is no quoting 'dos'
  status 1
  $ echo --rsp-quoting=dos t lib.a > words; refused @words
  err: quarn-ar: Error: there is no quoting 'dos'
  status 1

Members and files.

  $ refused t lib.a b.txt
  err: quarn-ar: Error: L6831E: 'b.txt' not present in archive 'lib.a'
  status 1
  $ refused x lib.a b.txt
  err: quarn-ar: Error: L6831E: 'b.txt' not present in archive 'lib.a'
  status 1
  $ refused m lib.a b.txt
  err: quarn-ar: Error: L6831E: 'b.txt' not present in archive 'lib.a'
  status 1
  $ refused d lib.a b.txt
  err: quarn-ar: Warning: L6831E: 'b.txt' not present in archive 'lib.a'
  status 0
  $ refused r lib.a b.txt
  err: quarn-ar: Error: L6833E: File 'b.txt' does not exist
  status 1
  $ refused r lib.a .
  err: quarn-ar: Error: L6835E: Reading file '.' : Is a directory
  status 1
  $ refused r lib.a lib.a
  err: quarn-ar: Error: 'lib.a' is the archive itself, and can't be a member of it
  status 1
  $ refused rb b.txt lib.a a.txt
  err: quarn-ar: Error: L6841E: Position 'b.txt' not found
  status 1
  $ refused t none.a
  err: quarn-ar: Error: L6832E: Archive 'none.a' not found : No such file or directory
  status 1
  $ refused d none.a
  err: quarn-ar: Error: L6832E: Archive 'none.a' not found : No such file or directory
  status 1

The name in front of a diagnostic is the program's; its form and severity can be chosen.

  $ refused d --diag_error=6831 lib.a b.txt
  err: quarn-ar: Error: L6831E: 'b.txt' not present in archive 'lib.a'
  status 1
  $ refused t --diag_style=gnu lib.a b.txt
  err: lib.a: Error: L6831E: 'b.txt' not present in archive 'lib.a'
  status 1
