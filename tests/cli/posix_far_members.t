Members far behind in a file, up to its 2 GiB, are members like any other. The files have holes, and hardly any bytes.

  $ . "$TESTDIR/setup.sh"; . "$TESTDIR/objects.sh"
  $ file note.txt note; quick() { timeout 10 "$@"; }

far.a HOLE: an object behind so many zeros, and a table that says where it is.

  $ far() {
  >   { magic; table 'far\0' $(( 80 + 60 + $1 )); header zeros/ 0 0 0 644 "$1"; } > far.a; truncate -s $(( 140 + $1 )) far.a
  >   { header a.o/ 0 0 0 644 "$(stat -c %s whole.o)"; cat whole.o; } >> far.a
  > }

As large as an archive may be: its size is even, as that of each archive.

  $ far $(( 2147483646 - 140 - 60 - $(stat -c %s whole.o) )); stat -c %s far.a
  2147483646
  $ quick quarn -tv far.a
  rw-r--r--     0/     02147480998 Jan 01 00:00 1970 zeros (offset     80)
  rw-r--r--     0/     0   2448 Jan 01 00:00 1970 a.o (offset 2147481138)
  $ quick quarn --zs far.a
  far                  from a.o        at offset 2147481138
  $ quick quarn --sizes far.a | grep a.o
         912         80          0          0          0   a.o
  $ quick quarn -p far.a a.o | cmp - whole.o; quick quarn-ar p far.a a.o | cmp - whole.o
  $ quick quarn -x far.a a.o; cmp a.o whole.o; rm a.o; quick quarn-ar x far.a a.o; cmp a.o whole.o; rm a.o

It may lose members, and get none that is too many.

  $ ln far.a less.a; quick quarn -d less.a zeros; quarn -t less.a; quarn --zs less.a | grep wide_gcd
  a.o
  wide_gcd             from a.o        at offset    234
  $ ln far.a more.a; both quick quarn -r --diag_suppress=L6875 more.a note.txt; both quick quarn-ar r more.a note.txt
  err: Error: L6830E: Writing file 'more.a' : File too large
  status 1
  err: quarn-ar: Error: L6830E: Writing file 'more.a' : File too large
  status 1
  $ [ more.a -ef far.a ] && ls more.a*
  more.a

Its own table may become too many, too.

  $ both quick quarn -s more.a
  err: Error: L6830E: Writing file 'more.a' : File too large
  status 1

As the words of an insertion it comes to a new archive member by member, and is too large there.

  $ both quick quarn -r -c --diag_suppress=L6875 new.a far.a note.txt
  err: Error: L6830E: Writing file 'new.a' : File too large
  status 1
  $ ls new.a* 2> /dev/null
  [2]

A byte more is too many, whatever it stands for.

  $ far $(( 2147483648 - 140 - 60 - $(stat -c %s whole.o) ))
  $ for words in '-t' '-tv' '-p' '-x' '--zs' '--sizes' '--entries' '-s' '-m'; do quick quarn $words far.a 2>&1; done | sort -u
  Error: L6835E: Reading file 'far.a' : Value too large for defined data type
  $ for words in t p x s; do quick quarn-ar $words far.a 2>&1; done | sort -u
  quarn-ar: Error: L6835E: Reading file 'far.a' : Value too large for defined data type

Nothing is taken for what it would be with fewer bits: not as an archive, and not as a member.

  $ for size in 4294967296 4294967304 4294967376 1099511627776; do
  >   truncate -s "$size" whole.a; printf '!<arch>\n' | dd of=whole.a conv=notrunc status=none
  >   both quick quarn -r -c --diag_suppress=L6875 new.a whole.a; both quick quarn-ar rc new.a whole.a; rm whole.a
  >   { magic; member a.txt/ ab; } > whole.a; truncate -s "$size" whole.a; both quick quarn -t whole.a; both quick quarn-ar t whole.a
  > done | sort | uniq -c
        4 err: Error: L6835E: Reading file 'new.a' : Value too large for defined data type
        4 err: Error: L6835E: Reading file 'whole.a' : Value too large for defined data type
        8 err: quarn-ar: Error: L6835E: Reading file 'whole.a' : Value too large for defined data type
       16 status 1
  $ ls new.a* 2> /dev/null
  [2]

A table that leads beyond 2 GiB, or beyond all numbers, leads nowhere.

  $ { magic; table 'a\0b\0c\0d\0' 96 2147483648 4294967294 4294967295; member a.txt/ a; } > lost.a
  $ quarn --zs lost.a 2>&1 | sed 's/.*symbol #/#/'
  #1 'b' is defined in the archive member starting at offset 2147483648 but no archive member starts there
  #2 'c' is defined in the archive member starting at offset 4294967294 but no archive member starts there
  #3 'd' is defined in the archive member starting at offset 4294967295 but no archive member starts there
  a                    from a.txt      at offset     96

A table of the symbols, or of the long names, may be as large as the file, and nearly empty.

  $ { magic; header / 0 0 0 0 100000000; } > table.a; truncate -s 100000068 table.a; quick quarn -t table.a; quick quarn --zs table.a
  $ { magic; header // 0 0 0 0 100000000; } > names.a; truncate -s 100000065 names.a
  $ { printf 'n/\n'; member /99999997 n; header /0 0 0 0 644 0; } >> names.a; quick quarn -t names.a
  n
  
