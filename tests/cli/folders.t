Folders are neither archives nor members.

  $ . "$TESTDIR/setup.sh"
  $ file a.o a; library lib.a a.o; cp lib.a before.a
  $ mkdir folder

As the archive: an error, at once.

  $ both timeout 5 quarn -t folder
  err: Error: L6835E: Reading file 'folder' : Is a directory
  status 1
  $ both timeout 5 quarn -r folder a.o
  err: Error: L6835E: Reading file 'folder' : Is a directory
  status 1
  $ both timeout 5 quarn -s folder
  err: Error: L6835E: Reading file 'folder' : Is a directory
  status 1
  $ both timeout 5 quarn -t folder/
  err: Error: L6835E: Reading file 'folder/' : Is a directory
  status 1

With --create they are refused when it comes to writing, and stay.

  $ both timeout 5 quarn --create --diag_suppress=L6875 folder a.o
  err: Error: L6978E: Deleting file 'folder' : Is a directory
  status 1
  $ test -d folder && ls
  a.o
  before.a
  folder
  lib.a

As a file to put in: an error for each, the others are looked at, nothing is written.

  $ both timeout 5 quarn -rv lib.a folder
  err: Error: L6835E: Reading file 'lib.a' : Is a directory
  status 1
  $ cmp lib.a before.a

In the place of a member of the same name, too.

  $ mkdir sub; mkdir sub/a.o
  $ both timeout 5 quarn -rv lib.a sub/a.o
  err: Error: L6835E: Reading file 'lib.a' : Is a directory
  status 1
  $ cmp lib.a before.a
