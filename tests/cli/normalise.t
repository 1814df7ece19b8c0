--normalise makes the headers of inserted files the same everywhere.

  $ . "$TESTDIR/setup.sh"
  $ file a.o a; chmod 700 a.o; chown 12:34 a.o 2> /dev/null || true
  $ quarn -rc --normalise=86400 --diag_suppress=L6875 lib.a a.o
  $ quarn -tv lib.a
  rw-r--r--     0/     0      1 Jan 02 00:00 1970 a.o (offset     72)
  $ dd if=lib.a bs=1 skip=72 count=60 status=none
  a.o/            86400       0     0     100644  1         `

A member that is replaced is normalised as well, others are not touched.

  $ { magic; header a.o/ 5 6 7 100600 1; printf 'A\n'; header b.o/ 5 6 7 100600 1; printf 'B\n'; } > two.a
  $ quarn -r --normalise=3 --diag_suppress=L6875 two.a a.o
  $ quarn -tv two.a
  rw-r--r--     0/     0      1 Jan 01 00:00 1970 a.o (offset     72)
  rw-------     6/     7      1 Jan 01 00:00 1970 b.o (offset    134)

Nothing but inserting makes use of it.

  $ { magic; header a.o/ 5 6 7 100600 1; printf 'A\n'; } > one.a
  $ quarn -s --normalise=3 one.a
  $ quarn -m --normalise=3 one.a a.o
  $ quarn -tv one.a
  rw-------     6/     7      1 Jan 01 00:00 1970 a.o (offset     72)

The same files give the same bytes, whatever their times, owners, modes, and the order of the folder.

  $ mkdir one two
  $ for name in x y z; do file one/$name.o $name; done
  $ for name in z x y; do printf $name > two/$name.o; chmod 600 two/$name.o; done
  $ quarn --create --normalise=1 --diag_suppress=L6875 one.a 'one/*.o'
  $ (umask 077; TZ=Asia/Tokyo LC_ALL=tr_TR.UTF-8 quarn --create --normalise=1 --diag_suppress=L6875 two.a 'two/*.o')
  $ cmp one.a two.a

The document of the formats shows, byte for byte, what becomes of two files.

  $ dump() { sed -n "/^\`\`\`$1\$/,/^\`\`\`\$/p" "$QUARN_DOCS/formats.md" | grep '^ ' | cut -c 7-54; }
  $ file note.txt one; file a_rather_long_name.txt four
  $ quarn --create --normalise=86400 --diag_suppress=L6875 lib.a note.txt a_rather_long_name.txt
  $ patch shown.a 0 "$(dump archive-normalised | tr -d '\n')"; cmp lib.a shown.a
