A link as the archive stays a link: the file that it leads to is the one that is replaced.

  $ . "$TESTDIR/setup.sh"
  $ file a.o a; file b.o b
  $ mkdir real; library real/lib.a a.o; ln -s real/lib.a lib.a; ln -s lib.a second.a
  $ quarn -r --normalise=1 --diag_suppress=L6875 second.a b.o
  $ readlink second.a lib.a; quarn -t real/lib.a
  lib.a
  real/lib.a
  a.o
  b.o
  $ ls; ls real
  a.o
  b.o
  lib.a
  real
  second.a
  lib.a

The file made on the way stands beside the real one.

  $ touch real/lib.a.0
  $ quarn -d lib.a b.o; ls real; stat -c %s real/lib.a.0
  lib.a
  lib.a.0
  0

A link that leads nowhere is no archive yet; writing makes the file that it names.

  $ ln -s real/new.a new.a
  $ both quarn -t new.a
  err: Error: L6832E: Archive 'new.a' not found : No such file or directory
  status 1
  $ both quarn -r --normalise=1 --diag_suppress=L6875 new.a a.o
  err: Creating archive 'new.a'
  status 0
  $ readlink new.a; quarn -t real/new.a
  real/new.a
  a.o

A link in a circle is not there, and nothing can be made of it.

  $ ln -s loop.a loop.a
  $ both quarn -t loop.a
  err: Error: L6832E: Archive 'loop.a' not found : No such file or directory
  status 1
  $ both quarn -rc --diag_suppress=L6875 loop.a a.o
  err: Error: L6830E: Writing file 'loop.a' : Too many levels of symbolic links
  status 1
  $ readlink loop.a
  loop.a

Links to files go in as what they lead to, under their own name.

  $ ln -s a.o link.o
  $ quarn --create -v --normalise=1 --diag_suppress=L6875 links.a link.o
  a - link.o
  $ quarn -tv links.a
  rw-r--r--     0/     0      1 Jan 01 00:00 1970 link.o (offset     72)
  $ ln -s none dangling.o
  $ both quarn -rv links.a dangling.o
  err: Error: L6833E: File 'dangling.o' does not exist
  status 1

Hard links: the name is replaced, the other one keeps the old archive.

  $ library one.a a.o; ln one.a two.a
  $ quarn -d one.a a.o; quarn -t two.a
  a.o

Extraction goes through a link that is in the way.

  $ mkdir out; cd out; ln -s ../target.o a.o
  $ quarn -x ../real/lib.a; readlink a.o; cat ../target.o; echo
  ../target.o
  a

With -C it leaves a link alone, also one that leads to nothing.

  $ both quarn -xC ../real/lib.a
  err: Error: L6836E: 'a.o' already exists, so will not be extracted
  status 1
  $ rm ../target.o
  $ both quarn -xC ../real/lib.a
  err: Error: L6836E: 'a.o' already exists, so will not be extracted
  status 1
  $ readlink a.o; ls ..  | grep target
  ../target.o
  [1]
