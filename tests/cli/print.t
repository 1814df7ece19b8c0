Printing puts the bytes of members on stdout, and nothing else.

  $ . "$TESTDIR/setup.sh"
  $ printf 'first\n' > a.txt; printf 'no end' > b.txt; : > c.txt
  $ library lib.a a.txt b.txt c.txt
  $ quarn -p lib.a; echo
  first
  no end
  $ quarn -p lib.a b.txt; echo
  no end
  $ quarn -p lib.a b.txt a.txt
  no endfirst
  $ quarn -p lib.a '*.TXT' a.txt
  first
  no endfirst

With -v each has its name in front.

  $ quarn -pv lib.a | sed 's/$/$/'
  $
  <a.txt>$
  $
  first$
  $
  <b.txt>$
  $
  no end$
  <c.txt>$
  $

A word without a member is an error, the others are printed.

  $ both quarn -p lib.a none.txt a.txt
  out: first
  err: Error: L6831E: 'none.txt' not present in archive 'lib.a'
  status 1

Bytes of any kind come out unchanged.

  $ for byte in $(seq 0 255); do printf "\\x$(printf %x $byte)"; done > all
  $ library lib.a all
  $ quarn -p lib.a | cmp - all
  $ head -c 3000000 /dev/urandom > big
  $ library lib.a big all
  $ quarn -p lib.a | cmp - <(cat big all)

The archive stays as it was.

  $ cp lib.a before.a; quarn -p lib.a > /dev/null; cmp lib.a before.a
  $ both quarn -p missing.a
  err: Error: L6832E: Archive 'missing.a' not found : No such file or directory
  status 1
