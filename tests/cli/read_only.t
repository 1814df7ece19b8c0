An archive that may not be written is not written.

  $ . "$TESTDIR/setup.sh"
  $ file a.o a; file b.o b; library lib.a a.o; cp lib.a before.a
  $ chmod 444 lib.a; chmod 777 .

Reading it is all right.

  $ asNobody -t lib.a
  a.o
  $ asNobody -p lib.a; echo
  a

Every run that would write is refused before its action.

  $ for action in '-rv' '-dv' '-mv' '-s' '-n -t' '-t -s' '-q'; do both asNobody $action lib.a b.o; done
  err: Error: L6979E: Output file 'lib.a' is read-only
  status 1
  err: Error: L6979E: Output file 'lib.a' is read-only
  status 1
  err: Error: L6979E: Output file 'lib.a' is read-only
  status 1
  err: Error: L6979E: Output file 'lib.a' is read-only
  status 1
  err: Error: L6979E: Output file 'lib.a' is read-only
  status 1
  err: Error: L6979E: Output file 'lib.a' is read-only
  status 1
  err: Error: L6979E: Output file 'lib.a' is read-only
  status 1
  $ both asNobody --create -v --diag_suppress=L6875 lib.a b.o
  out: a - b.o
  err: Error: L6979E: Output file 'lib.a' is read-only
  status 1
  $ cmp lib.a before.a

The refusal comes before the position is looked for.

  $ both asNobody -r -a none.o lib.a b.o
  err: Error: L6979E: Output file 'lib.a' is read-only
  status 1

A folder where nothing can be made: the old archive stays.

  $ mkdir closed; cp before.a closed/lib.a; chmod 666 closed/lib.a; chmod 555 closed
  $ if [ "$(id -u)" = 0 ]; then chown 0 closed; fi
  $ both asNobody -d closed/lib.a a.o
  err: Error: L6830E: Writing file 'closed/lib.a' : Permission denied
  status 1
  $ both asNobody -rc --diag_suppress=L6875 closed/new.a b.o
  err: Error: L6830E: Writing file 'closed/new.a' : Permission denied
  status 1
  $ cmp closed/lib.a before.a
  $ ls closed
  lib.a
  $ chmod 755 closed

An archive that may not be read.

  $ cp before.a secret.a; chmod 000 secret.a
  $ both asNobody -t secret.a
  err: Error: L6835E: Reading file 'secret.a' : Permission denied
  status 1
  $ both asNobody -r secret.a b.o
  err: Error: L6835E: Reading file 'secret.a' : Permission denied
  status 1
  $ chmod 600 secret.a; cmp secret.a before.a

A file that may not be read can't be put in.

  $ cp b.o secret.o; chmod 000 secret.o; cp before.a open.a; chmod 666 open.a
  $ both asNobody -rv --diag_suppress=L6875 open.a secret.o
  err: Error: L6835E: Reading file 'open.a' : Permission denied
  status 1
  $ cmp open.a before.a
  $ chmod 600 secret.o
  $ ls
  a.o
  b.o
  before.a
  closed
  lib.a
  open.a
  secret.a
  secret.o
