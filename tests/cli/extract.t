Extracting writes members as files in the current folder.

  $ . "$TESTDIR/setup.sh"
  $ file a.o a; file b.o bb; file c.txt ccc
  $ file a_name_of_twenty_.txt long
  $ quarn --create --diag_suppress=L6875 lib.a a.o a_name_of_twenty_.txt b.o c.txt
  $ cp lib.a before.a
  $ mkdir out; cd out

All members but the tables.

  $ both quarn -xv ../lib.a
  out: x - a.o
  out: x - a_name_of_twenty_.txt
  out: x - b.o
  out: x - c.txt
  status 0
  $ ls
  a.o
  a_name_of_twenty_.txt
  b.o
  c.txt
  $ for name in *; do cmp "$name" "../$name"; done
  $ rm *

Some of them: the order is that of the words, then of the archive.

  $ quarn -xv ../lib.a c.txt '?.O'
  x - c.txt
  x - a.o
  x - b.o
  $ rm *

A member that two words name is written twice; folders in a word don't count.

  $ quarn -xv ../lib.a a.o 'any/where/a*'
  x - a.o
  x - a.o
  x - a_name_of_twenty_.txt
  $ ls; rm *
  a.o
  a_name_of_twenty_.txt

A word without a member is an error; the others are extracted.

  $ both quarn -xv ../lib.a none.o b.o ''
  out: x - b.o
  err: Error: L6831E: 'none.o' not present in archive '../lib.a'
  err: Error: L6831E: '' not present in archive '../lib.a'
  status 1
  $ ls; rm *
  b.o

Files that are there are overwritten, also longer ones.

  $ file a.o 'something longer'
  $ quarn -x ../lib.a a.o
  $ cmp a.o ../a.o

With -C they are kept, and that is an error; the rest is done.

  $ file a.o mine; mkdir b.o
  $ both quarn -xvC ../lib.a
  out: x - a_name_of_twenty_.txt
  out: x - c.txt
  err: Error: L6836E: 'a.o' already exists, so will not be extracted
  err: Error: L6836E: 'b.o' already exists, so will not be extracted
  status 1
  $ cat a.o; echo; ls
  mine
  a.o
  a_name_of_twenty_.txt
  b.o
  c.txt
  $ rmdir b.o; rm *

Where no file can be made the member is passed over.

  $ mkdir a.o
  $ both quarn -xv ../lib.a a.o b.o
  out: x - b.o
  err: Error: L6843E: Writing file 'a.o' : Is a directory
  status 1
  $ ls; rmdir a.o; rm *
  a.o
  b.o

The file is new: its time is now, whatever the member says.

  $ { magic; header m.o/ 1000 1 1 100777 1; printf 'm\n'; } > ../mode.a
  $ quarn -x ../mode.a
  $ test m.o -nt ../mode.a || test "$(stat -c %Y m.o)" -ge "$(stat -c %Y ../mode.a)"
  $ rm *

Several members of one name follow each other, so the last one stays.

  $ { magic; member a.o/ first; member a.o/ second; } > ../twice.a
  $ quarn -xv ../twice.a && cat a.o; echo
  x - a.o
  x - a.o
  second
  $ both quarn -xvC ../twice.a
  err: Error: L6836E: 'a.o' already exists, so will not be extracted
  err: Error: L6836E: 'a.o' already exists, so will not be extracted
  status 1
  $ rm *

A member of no bytes is a file of no bytes.

  $ { magic; member empty.o/ ''; } > ../empty.a
  $ quarn -xv ../empty.a && stat -c %s empty.o
  x - empty.o
  0
  $ rm *

A folder in a member's name is not followed: only the last part of the name counts.

  $ mkdir sub
  $ { magic; header // 0 0 0 0 26; printf 'sub/inner_of_twenty_.txt/\n'; header /0 0 0 0 644 2; printf 'in'; } > ../folders.a
  $ quarn -xv ../folders.a; ls . sub; rm inner*; rmdir sub
  x - inner_of_twenty_.txt
  .:
  inner_of_twenty_.txt
  sub
  
  sub:
  $ { magic; header // 0 0 0 0 26; printf '../../../etc/passwd.text/\n'; header /0 0 0 0 644 2; printf 'in'; } > ../up.a
  $ quarn -xv ../up.a; ls; rm *
  x - passwd.text
  passwd.text
  $ { magic; member 'sub\in.txt/' in; } > ../back.a
  $ quarn -xv ../back.a; ls; rm *
  x - in.txt
  in.txt

Names that can be no file.

  $ { magic; member ../ dots; member ./ dot; member a.o/ a; } > ../dots.a
  $ both quarn -xv ../dots.a
  out: x - a.o
  err: Error: L6843E: Writing file '..' : Is a directory
  err: Error: L6843E: Writing file '.' : Is a directory
  status 1
  $ { magic; member a.o/ a; member / empty; } > ../nameless.a
  $ both quarn -xv ../nameless.a
  out: x - a.o
  err: Error: L6843E: Writing file '' : No such file or directory
  status 1
  $ ls; rm *
  a.o
  $ cd ..

A member called like the archive does not overwrite it.

  $ { magic; member lib.a/ me; member x.o/ x; } > self.a
  $ mkdir self; cp self.a self/lib.a; cd self
  $ both quarn -xv lib.a
  out: x - x.o
  err: Error: L6836E: 'lib.a' already exists, so will not be extracted
  status 1
  $ cmp lib.a ../self.a; ls; rm x.o
  lib.a
  x.o
  $ ln lib.a other.a; rm lib.a; ln -s other.a lib.a
  $ both quarn -xv other.a
  out: x - x.o
  err: Error: L6836E: 'lib.a' already exists, so will not be extracted
  status 1
  $ cmp other.a ../self.a
  $ both quarn -xvT lib.a lib.a
  err: Error: L6836E: 'lib.a' already exists, so will not be extracted
  status 1
  $ both quarn -xvC lib.a lib.a
  err: Error: L6836E: 'lib.a' already exists, so will not be extracted
  status 1
  $ cmp other.a ../self.a
  $ cd ..

Extracting writes nothing else, and the archive stays.

  $ cmp lib.a before.a
  $ (mkdir new_folder; cd new_folder; quarn -x -s ../lib.a; ls)
  a.o
  a_name_of_twenty_.txt
  b.o
  c.txt

An archive that is not there.

  $ both quarn -x missing.a
  err: Error: L6832E: Archive 'missing.a' not found : No such file or directory
  status 1
