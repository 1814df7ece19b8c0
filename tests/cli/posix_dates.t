Files of any date and owner: what has no place in a header is refused, and nothing is made of it.

  $ . "$TESTDIR/setup.sh"
  $ member a.txt/ old > old; { magic; cat old; } > lib.a; cp lib.a before.a
  $ inserted() {
  >   quarn --diag_suppress=6875 "$@" a.txt || return
  >   quarn -tv lib.a a.txt | awk '{ print $(NF - 6), $(NF - 5), $(NF - 4), $(NF - 3) }'; cp before.a lib.a
  > }

The first and the last second of 31 bits are dates as any other.

  $ for date in 0 1 2147483647; do
  >   file a.txt new; touch -d @$date a.txt; inserted -r lib.a; inserted --create lib.a
  >   quarn-ar rU lib.a a.txt; quarn-ar tv lib.a | awk '{ print $(NF - 4), $(NF - 3), $(NF - 2), $(NF - 1) }'; cp before.a lib.a
  > done
  Jan 01 00:00 1970
  Jan 01 00:00 1970
  Jan 1 00:00 1970
  Jan 01 00:00 1970
  Jan 01 00:00 1970
  Jan 1 00:00 1970
  Jan 19 03:14 2038
  Jan 19 03:14 2038
  Jan 19 03:14 2038

The seconds before and behind them are none, whatever the header would say.

  $ for date in -2147483649 -1 2147483648 4294967296; do
  >   file a.txt new; touch -d @$date a.txt; both inserted -r lib.a; both inserted --create --normalise=1 lib.a; both inserted -ru lib.a
  >   both quarn-ar rU lib.a a.txt; both quarn -r -c new.a a.txt; cmp lib.a before.a; ls new.a* 2> /dev/null
  > done | sort | uniq -c
       12 err: Error: L6835E: Reading file 'lib.a' : Value too large for defined data type
        4 err: Error: L6835E: Reading file 'new.a' : Value too large for defined data type
        4 err: quarn-ar: Error: L6835E: Reading file 'a.txt' : Value too large for defined data type
       20 status 1

quarn-ar takes such files where it doesn't ask for their dates.

  $ for date in -1 2147483648; do
  >   file a.txt new; touch -d @$date a.txt; quarn-ar r lib.a a.txt; quarn-ar tv lib.a; cp before.a lib.a
  > done
  rw-r--r-- 0/0      3 Jan  1 00:00 1970 a.txt
  rw-r--r-- 0/0      3 Jan  1 00:00 1970 a.txt

An archive of such a date is no library for the tool, and neither is it a file that could be a member.

  $ { magic; cat old; } > other.a; touch -d @-1 other.a; both quarn -r --diag_suppress=6875 lib.a other.a; both quarn -t other.a; quarn-ar t other.a
  err: Error: L6835E: Reading file 'lib.a' : Value too large for defined data type
  status 1
  err: Error: L6835E: Reading file 'other.a' : Value too large for defined data type
  status 1
  a.txt
  $ touch -d @2147483648 other.a; both quarn -r --diag_suppress=6875 lib.a other.a; quarn-ar r lib.a other.a; quarn-ar t lib.a; cp before.a lib.a
  err: Error: L6835E: Reading file 'lib.a' : Value too large for defined data type
  status 1
  a.txt
  other.a

What is extracted can have dates that files of members can't.

  $ { magic; header b.txt/ 4294967295 0 0 644 1; printf 'b\n'; header c.txt/ 2147483648 0 0 644 1; printf 'c\n'; } > late.a
  $ quarn-ar xo late.a; stat -c '%Y %n' b.txt c.txt
  4294967295 b.txt
  2147483648 c.txt

Owners of six digits fit, and of more lose the last ones; of more than 31 bits they are refused.

  $ owned() {
  >   file a.txt new
  >   if ! chown "$1" a.txt 2> /dev/null; then echo "$2"; return; fi
  >   quarn --create -n --diag_suppress=6875 own.a a.txt 2>&1 && dd if=own.a bs=1 skip=36 count=12 status=none | sed 's/......$/ &/' && echo
  >   true
  > }
  $ owned 99999:100000 '99999  100000'
  99999  100000
  $ owned 999999:999999 '999999 999999'
  999999 999999
  $ owned 1000000:9999999 '100000 999999'
  100000 999999
  $ owned 2147483647:0 '214748 0     '
  214748 0     
  $ owned 2147483648:0 "Error: L6835E: Reading file 'own.a' : Value too large for defined data type"
  Error: L6835E: Reading file 'own.a' : Value too large for defined data type
  $ owned 0:4294967294 "Error: L6835E: Reading file 'own.a' : Value too large for defined data type"
  Error: L6835E: Reading file 'own.a' : Value too large for defined data type

quarn-ar takes none that would have to lose digits.

  $ ownedByAr() {
  >   file a.txt new
  >   if ! chown "$1" a.txt 2> /dev/null; then echo "$2"; return; fi
  >   quarn-ar rcU ar.a a.txt 2>&1 && quarn-ar tv ar.a | cut -d ' ' -f 2; rm -f ar.a
  > }
  $ ownedByAr 999999:999999 999999/999999
  999999/999999
  $ ownedByAr 0:1000000 "quarn-ar: Error: the owner of 'a.txt' has too many digits for 'U'"
  quarn-ar: Error: the owner of 'a.txt' has too many digits for 'U'
  $ ownedByAr 4294967294:0 "quarn-ar: Error: L6835E: Reading file 'a.txt' : Value too large for defined data type"
  quarn-ar: Error: L6835E: Reading file 'a.txt' : Value too large for defined data type
