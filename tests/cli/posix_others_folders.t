Folders of others, and disks that nobody may write to. A refused run leaves what was there, and nothing
of its own.

  $ . "$TESTDIR/setup.sh"
  $ file a.o a; file b.o b; library old.a a.o
  $ state() { ls -1A; cmp lib.a ../old.a; stat -c "%a %h" lib.a; }

In a sticky folder everybody makes files, and only their owner replaces them.

  $ mkdir shared; cp old.a shared/lib.a; chmod 666 shared/lib.a; chmod 1777 shared
  $ if [ "$(id -u)" != 0 ]; then exit 80; fi
  $ for words in '-r lib.a ../b.o' '-s lib.a' '-d lib.a a.o' '--create lib.a ../b.o'; do
  >   (cd shared; both asNobody --diag_suppress=L6875 $words; state)
  > done
  err: Error: L6830E: Writing file 'lib.a' : Operation not permitted
  status 1
  lib.a
  666 1
  err: Error: L6830E: Writing file 'lib.a' : Operation not permitted
  status 1
  lib.a
  666 1
  err: Error: L6830E: Writing file 'lib.a' : Operation not permitted
  status 1
  lib.a
  666 1
  err: Error: L6830E: Writing file 'lib.a' : Operation not permitted
  status 1
  lib.a
  666 1
  $ cp a.o shared/a.o; chmod 644 shared/a.o; (cd shared; both asNobody -x lib.a; ls -1A)
  err: Error: L6843E: Writing file 'a.o' : Permission denied
  status 1
  a.o
  lib.a
  $ (cd shared; both asNobody -r -c --diag_suppress=L6875 new.a ../b.o; ls -1A)
  status 0
  a.o
  lib.a
  new.a

One that is closed gives nothing new.

  $ mkdir closed; cp old.a closed/lib.a; chmod 666 closed/lib.a; chmod 555 closed
  $ for words in '-r lib.a ../b.o' '-x lib.a' '--create new.a ../b.o'; do
  >   (cd closed; both asNobody --diag_suppress=L6875 $words; state)
  > done
  err: Error: L6830E: Writing file 'lib.a' : Permission denied
  status 1
  lib.a
  666 1
  err: Error: L6843E: Writing file 'a.o' : Permission denied
  status 1
  lib.a
  666 1
  err: Error: L6830E: Writing file 'new.a' : Permission denied
  status 1
  lib.a
  666 1

A disk may be there for reading only.

  $ mkdir disk
  $ onReadOnlyDisk() {
  >   unshare --mount bash -c 'mount -t tmpfs none disk && cp old.a disk/lib.a && mount -o remount,ro disk && cd disk && "$@"' - "$@"
  > }
  $ unshare --mount mount -t tmpfs none disk 2> /dev/null || exit 80
  $ for words in '-r lib.a ../b.o' '-s lib.a' '-x lib.a' '--create new.a ../b.o'; do
  >   both onReadOnlyDisk quarn --diag_suppress=L6875 $words
  > done
  err: Error: L6979E: Output file 'lib.a' is read-only
  status 1
  err: Error: L6979E: Output file 'lib.a' is read-only
  status 1
  err: Error: L6843E: Writing file 'a.o' : Read-only file system
  status 1
  err: Error: L6830E: Writing file 'new.a' : Read-only file system
  status 1
