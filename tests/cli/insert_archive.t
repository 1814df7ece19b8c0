A file word that is an archive stands for its members.

  $ . "$TESTDIR/setup.sh"
  $ for name in a b c d; do file $name.txt $name; done
  $ file a_name_of_twenty_.txt long
  $ library other.a b.txt a_name_of_twenty_.txt c.txt
  $ library lib.a a.txt

They come in their order, without the tables.

  $ both quarn -rv lib.a other.a
  out: a - b.txt
  out: a - a_name_of_twenty_.txt
  out: a - c.txt
  err: Warning: L6875W: Adding non-ELF object 'b.txt' to archive 'lib.a'
  status 0
  $ quarn -tv lib.a
  rw-r--r--     0/     0      1 Sep 09 01:46 2001 a.txt (offset    156)
  rw-r--r--     0/     0      1 Sep 09 01:46 2001 b.txt (offset    218)
  rw-r--r--     0/     0      4 Sep 09 01:46 2001 a_name_of_twenty_.txt (offset    280)
  rw-r--r--     0/     0      1 Sep 09 01:46 2001 c.txt (offset    344)
  $ quarn -p lib.a a_name_of_twenty_.txt b.txt c.txt; echo
  longbc

Members of the same name are replaced in their place.

  $ file c.txt 'c changed'
  $ library third.a d.txt c.txt
  $ quarn -rv --diag_suppress=L6875 lib.a third.a
  a - d.txt
  r - c.txt
  $ quarn -tv lib.a
  rw-r--r--     0/     0      1 Sep 09 01:46 2001 a.txt (offset    156)
  rw-r--r--     0/     0      1 Sep 09 01:46 2001 b.txt (offset    218)
  rw-r--r--     0/     0      4 Sep 09 01:46 2001 a_name_of_twenty_.txt (offset    280)
  rw-r--r--     0/     0      9 Sep 09 01:46 2001 c.txt (offset    344)
  rw-r--r--     0/     0      1 Sep 09 01:46 2001 d.txt (offset    414)
  $ quarn -p lib.a c.txt; echo
  c changed

They keep the header they have there; normalising is for plain files.

  $ { magic; header b.txt/ 5 6 7 100600 1; printf 'B\n'; } > headers.a
  $ quarn -r --normalise=9 --diag_suppress=L6875 lib.a headers.a
  $ quarn -tv lib.a b.txt
  rw-------     6/     7      1 Jan 01 00:00 1970 b.txt (offset    218)
  $ quarn -d lib.a b.txt
  $ quarn -r --normalise=9 --diag_suppress=L6875 lib.a headers.a
  $ quarn -tv lib.a b.txt
  rw-------     6/     7      1 Jan 01 00:00 1970 b.txt (offset    414)

Names are the same in either case.

  $ { magic; member B.TXT/ shout; } > upper.a
  $ quarn -rv --diag_suppress=L6875 lib.a upper.a
  r - b.txt
  $ quarn -p lib.a b.txt; echo
  shout

Several members of one name in the source are as many in the target.

  $ { magic; member two.o/ 1; member two.o/ 22; } > two.a
  $ quarn -rv --diag_suppress=L6875 lib.a two.a
  a - two.o
  a - two.o
  $ quarn -t lib.a 'two*'
  two.o
  two.o

With -u the times of the members are compared. One that is kept still gets the header fields of the other.

  $ { magic; header m.o/ 100 1 1 100644 3; printf 'old\n'; } > old.a
  $ { magic; header m.o/ 200 2 2 100600 3; printf 'new\n'; } > new.a
  $ quarn -rc --diag_suppress=L6875 t.a old.a
  $ quarn -ruv --diag_suppress=L6875 t.a new.a && quarn -tv t.a && quarn -p t.a; echo
  r - m.o
  rw-------     2/     2      3 Jan 01 00:03 1970 m.o (offset     72)
  new
  $ quarn -ruv --diag_suppress=L6875 t.a old.a && quarn -tv t.a && quarn -p t.a; echo
  rw-r--r--     1/     1      3 Jan 01 00:01 1970 m.o (offset     72)
  new
  $ quarn -rv --new_files_only --diag_suppress=L6875 t.a old.a && quarn -tv t.a && quarn -p t.a; echo
  rw-r--r--     1/     1      3 Jan 01 00:01 1970 m.o (offset     72)
  new

The warning on members that are not ELF names the first of them, also when it was kept.

  $ both quarn -rv --new_files_only t.a old.a
  err: Warning: L6875W: Adding non-ELF object 'm.o' to archive 't.a'
  status 0
  $ cp "$QUARN_EXAMPLES/matrix_plain.o" m.o
  $ quarn -rc elf.a m.o
  $ both quarn -rvc out.a elf.a
  out: a - m.o
  status 0
  $ both quarn -rv out.a elf.a other.a third.a
  out: r - m.o
  out: a - b.txt
  out: a - a_name_of_twenty_.txt
  out: a - c.txt
  out: a - d.txt
  out: a - c.txt
  err: Warning: L6875W: Adding non-ELF object 'b.txt' to archive 'out.a'
  status 0

An empty archive adds nothing.

  $ magic > empty.a
  $ cp lib.a before.a
  $ both quarn -rv lib.a empty.a
  status 0
  $ cmp lib.a before.a

A file that can't be read as an archive whole goes in as a plain file: cut off, or with anything odd in it.

  $ head -c 100 other.a > cut.a
  $ both quarn -rvc --normalise=1 plain.a cut.a
  out: a - cut.a
  err: Warning: L6875W: Adding non-ELF object 'cut.a' to archive 'plain.a'
  status 0
  $ printf '!<arch>' > seven
  $ { magic; member 'b.txt/ x' b; } > trailing.a
  $ { magic; header b.txt/ bad 0 0 644 1; printf 'b\n'; } > date.a
  $ { magic; member b.txt/ b; printf 'junk'; } > junk.a
  $ { magic; member 'sixteenlettersno' b; } > unended.a
  $ both quarn -rv --normalise=1 plain.a seven trailing.a date.a junk.a unended.a
  out: a - seven
  out: a - trailing.a
  out: a - date.a
  out: a - junk.a
  out: a - unended.a
  err: Warning: L6875W: Adding non-ELF object 'seven' to archive 'plain.a'
  status 0
  $ quarn -t plain.a
  cut.a
  seven
  trailing.a
  date.a
  junk.a
  unended.a

The archive itself may be the source; its members then replace themselves.

  $ library self.a a.txt b.txt
  $ cp self.a before.a
  $ quarn -rv --diag_suppress=L6875 self.a self.a
  r - a.txt
  r - b.txt
  $ cmp self.a before.a

--create makes an archive of the members of others.

  $ quarn --create -v --diag_suppress=L6875 sum.a other.a third.a
  a - b.txt
  a - a_name_of_twenty_.txt
  a - c.txt
  a - d.txt
  a - c.txt
  $ quarn -t sum.a
  b.txt
  a_name_of_twenty_.txt
  c.txt
  d.txt
  c.txt
