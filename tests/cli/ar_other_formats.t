Archives of other formats are not taken for what they are not.

  $ . "$TESTDIR/setup.sh"
  $ file a.txt a; file b.txt b
  $ given() {
  >   "$@" > lib.a; cp lib.a before.a
  > }
  $ tried() {
  >   for words in 't lib.a' 'r lib.a b.txt' 's lib.a'; do quarn-ar --diag_suppress=6974 $words; cmp lib.a before.a; done
  > }

Members of BSD's archives have their names in front of their bytes, or without an end.

  $ given eval "magic; member '#1/12' 'a.txt       a'"; tried
  quarn-ar: Error: 'lib.a' has a member without a name, as in another format
  quarn-ar: Error: 'lib.a' has a member without a name, as in another format
  quarn-ar: Error: 'lib.a' has a member without a name, as in another format
  $ given eval "magic; member 'a.txt' a"; tried
  quarn-ar: Error: 'lib.a' has a member without a name, as in another format
  quarn-ar: Error: 'lib.a' has a member without a name, as in another format
  quarn-ar: Error: 'lib.a' has a member without a name, as in another format

Thin archives hold no bytes.

  $ given printf '!<thin>\n'; tried
  quarn-ar: Error: L6826E: 'lib.a' not in archive format
  quarn-ar: Error: L6826E: 'lib.a' not in archive format
  quarn-ar: Error: L6826E: 'lib.a' not in archive format

A symbol table for larger files is made anew.

  $ (magic; member /SYM64/ '12345678'; member a.txt/ a) > lib.a
  $ quarn-ar t lib.a; quarn-ar p lib.a; echo; quarn-ar r lib.a b.txt; quarn-ar t lib.a; bytes lib.a | head -2
  a.txt
  a
  a.txt
  b.txt
  0000000 21 3c 61 72 63 68 3e 0a 61 2e 74 78 74 2f 20 20  >!<arch>.a.txt/  <
  0000016 20 20 20 20 20 20 20 20 30 20 20 20 20 20 20 20  >        0       <

An archive in an archive is a file like any other.

  $ cp lib.a inner.a; quarn-ar rc outer.a inner.a a.txt; quarn-ar t outer.a; quarn-ar p outer.a inner.a | cmp - inner.a
  inner.a
  a.txt
