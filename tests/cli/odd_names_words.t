Blanks, UTF-8 and bytes that are no UTF-8 in patterns, in the names of archives and argument files, and in what is said
of them.

  $ . "$TESTDIR/setup.sh"; . "$TESTDIR/odd_names.sh"
  $ quarn --create --normalise=1 lib.a plain.o "${odd[@]}"; cp lib.a start.a; mkdir out

Wildcards, in the archive and in the folder. "?" is one byte.

  $ names lib.a 't?o  w*'; names lib.a "$(printf 'caf?\251.*')"; names lib.a 'caf??.o'; names lib.a "$(printf '*\377*')"
  two  words.o
  caf\xc3\xa9.o (esc)
  caf\xc3\xa9.o (esc)
  \xff\x80bad\xfe.o (esc)
   a long name, \xc3\xa9 \xff.o (esc)
  $ names lib.a "$(printf '*\301*')" "$(printf '?\303*')"
  Error: L6831E: '*\xc1*' not present in archive 'lib.a' (esc)
  Error: L6831E: '?\xc3*' not present in archive 'lib.a' (esc)
  [1]
  $ quarn -d -v lib.a "$(printf '* *\377*')"; names lib.a
  d -  a long name, \xc3\xa9 \xff.o (esc)
  plain.o
  two  words.o
  caf\xc3\xa9.o (esc)
  \xff\x80bad\xfe.o (esc)
  $ for pattern in '* *' "$(printf 'c*\251.o')" "$(printf '\377?bad?.?')" "$(printf '*\251*')"; do
  >   quarn --create -v wild.a "$pattern"
  > done
  a -  a long name, \xc3\xa9 \xff.o (esc)
  a - two  words.o
  a - caf\xc3\xa9.o (esc)
  a - \xff\x80bad\xfe.o (esc)
  a -  a long name, \xc3\xa9 \xff.o (esc)
  a - caf\xc3\xa9.o (esc)
  $ quarn --create wild.a "$(printf '*\301*')"
  Error: L6833E: File '*\xc1*' does not exist (esc)
  [1]

Argument files: their names, and the words in them.

  $ via="$(printf 'v i\303\251\376')"
  $ { printf -- '--show_cmdline -t\nstart.a '; printf '"%s" ' "${odd[@]}"; } > "$via"; quarn --via "$via"
  [quarn --show_cmdline -t --via="v i\xc3\xa9\xfe" start.a "two  words.o" caf\xc3\xa9.o \xff\x80bad\xfe.o " a long name, \xc3\xa9 \xff.o"] (esc)
  two  words.o
  caf\xc3\xa9.o (esc)
  \xff\x80bad\xfe.o (esc)
   a long name, \xc3\xa9 \xff.o (esc)
  $ printf -- "-t -b '%s' start.a '%s' %s\r\n%s" "$blank" "$long" "$utf8" "$bytes" > "$via"; quarn "--via=$via"
   a long name, \xc3\xa9 \xff.o (esc)
  caf\xc3\xa9.o (esc)
  \xff\x80bad\xfe.o (esc)
  $ printf -- '--via "%s"' "$via" > "$bytes.via"; quarn --via "$bytes.via"
   a long name, \xc3\xa9 \xff.o (esc)
  caf\xc3\xa9.o (esc)
  \xff\x80bad\xfe.o (esc)
  $ printf '"open' > "$via"; quarn --via "$via"
  Fatal error: L3906U: Malformed via file 'v i\xc3\xa9\xfe'. (esc)
  [1]
  $ printf 'a\0b' > "$via"; quarn --via "$via"
  Fatal error: L3918U: '\\0' character found in via file 'v i\xc3\xa9\xfe' - possible binary file.  Aborting via file parse. (esc)
  [1]
  $ printf 'n%.0s' {1..1100} > "$via"; quarn --via "$via"
  Fatal error: L3907U: Via file 'v i\xc3\xa9\xfe' command too long for buffer. (esc)
  [1]
  $ printf -- '--via "%s"' "$via" > "$via"; quarn --via "$via"
  Fatal error: L3902U: Recursive via file inclusion depth of 10 reached in file 'v i\xc3\xa9\xfe'. (esc)
  [1]
  $ quarn --via "no $via"; quarn --via "./$via,$via/"
  Fatal error: L3904U: Could not open via file 'no v i\xc3\xa9\xfe'. (esc)
  Fatal error: L3902U: Recursive via file inclusion depth of 10 reached in file 'v i\xc3\xa9\xfe'. (esc)
  [1]
  $ mkdir "d $via"; quarn --via "d $via"
  Fatal error: L3905U: Error when reading from via file 'd v i\xc3\xa9\xfe'. (esc)
  [1]

Archives of such names, in folders of such names.

  $ mkdir "$bytes d"
  $ for archive in "my $utf8.a" "$bytes d/$blank.a"; do
  >   quarn -rv --normalise=1 "$archive" plain.o "$blank"; cmp "$archive" <(quarn --create --normalise=1 new.a plain.o "$blank"; cat new.a)
  >   for action in -t --zs --sizes --entries -x; do (cd out; quarn $action "../$archive" plain.o > /dev/null); done
  >   quarn -mv -a "$blank" "$archive" plain.o; quarn -dv "$archive" plain.o; quarn -t "$archive"; quarn -p "$archive" | cmp - "$blank"
  >   quarn -t "$archive" "no $bytes"; quarn -r "$archive" "no $bytes"; quarn -r -a "no $bytes" "$archive" plain.o
  >   quarn -d "$archive" "no $bytes"; quarn -m "$archive" "no $bytes"
  >   quarn -r "$archive" "$bytes d"; quarn -t "$archive.no"; quarn -rv all.a "$archive"; quarn --show_cmdline -s "$archive"
  >   printf junk >> "$archive"; quarn -t "$archive"; rm "$archive"
  > done
  a - plain.o
  a - two  words.o
  Creating archive 'my caf\xc3\xa9.o.a' (esc)
  m - plain.o
  d - plain.o
  two  words.o
  Error: L6831E: 'no \xff\x80bad\xfe.o' not present in archive 'my caf\xc3\xa9.o.a' (esc)
  Error: L6833E: File 'no \xff\x80bad\xfe.o' does not exist (esc)
  Error: L6841E: Position 'no \xff\x80bad\xfe.o' not found (esc)
  Warning: L6831E: 'no \xff\x80bad\xfe.o' not present in archive 'my caf\xc3\xa9.o.a' (esc)
  Error: L6831E: 'no \xff\x80bad\xfe.o' not present in archive 'my caf\xc3\xa9.o.a' (esc)
  Error: L6835E: Reading file 'my caf\xc3\xa9.o.a' : Is a directory (esc)
  Error: L6832E: Archive 'my caf\xc3\xa9.o.a.no' not found : No such file or directory (esc)
  a - two  words.o
  Creating archive 'all.a'
  [quarn --show_cmdline -s "my caf\xc3\xa9.o.a"] (esc)
  Error: L6829E: 'my caf\xc3\xa9.o.a': malformed archive: End of file in the middle of archive member header starting at offset 2742 (esc)
  a - plain.o
  a - two  words.o
  Creating archive '\xff\x80bad\xfe.o d/two  words.o.a' (esc)
  m - plain.o
  d - plain.o
  two  words.o
  Error: L6831E: 'no \xff\x80bad\xfe.o' not present in archive '\xff\x80bad\xfe.o d/two  words.o.a' (esc)
  Error: L6833E: File 'no \xff\x80bad\xfe.o' does not exist (esc)
  Error: L6841E: Position 'no \xff\x80bad\xfe.o' not found (esc)
  Warning: L6831E: 'no \xff\x80bad\xfe.o' not present in archive '\xff\x80bad\xfe.o d/two  words.o.a' (esc)
  Error: L6831E: 'no \xff\x80bad\xfe.o' not present in archive '\xff\x80bad\xfe.o d/two  words.o.a' (esc)
  Error: L6835E: Reading file '\xff\x80bad\xfe.o d/two  words.o.a' : Is a directory (esc)
  Error: L6832E: Archive '\xff\x80bad\xfe.o d/two  words.o.a.no' not found : No such file or directory (esc)
  r - two  words.o
  [quarn --show_cmdline -s "\xff\x80bad\xfe.o d/two  words.o.a"] (esc)
  Error: L6829E: '\xff\x80bad\xfe.o d/two  words.o.a': malformed archive: End of file in the middle of archive member header starting at offset 2742 (esc)

An object that can't be read, one that is none, and one that may not be.

  $ cp plain.o "x $bytes"; elf "x $bytes" machine 3; quarn -r lib.a "x $bytes" && quarn -d lib.a "x $bytes"
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #5 'x \xff\x80bad\xfe.o': ELF file has unsupported machine code 3 (we only handle EM_ZEV = 40) (esc)
  $ file "text $utf8" x; quarn -r lib.a "text $utf8"
  Warning: L6875W: Adding non-ELF object 'text caf\xc3\xa9.o' to archive 'lib.a' (esc)
  $ touch "closed $bytes"; chmod 0 "closed $bytes"; chmod 777 .; chmod 666 lib.a; asNobody -rv lib.a "closed $bytes"
  Error: L6835E: Reading file 'lib.a' : Permission denied
  [1]
  $ cp start.a "kept $utf8.a"; chmod 444 "kept $utf8.a"; asNobody -d "kept $utf8.a" plain.o
  Error: L6979E: Output file 'kept caf\xc3\xa9.o.a' is read-only (esc)
  [1]

Words that the options refuse.

  $ quarn "--$utf8"; quarn "-t$bytes"; quarn "--create=$bytes"; quarn --diag_style "$blank" ; quarn "--normalise=1$bytes"
  Fatal error: L3900U: Unrecognized option '--caf\xc3\xa9.o'. (esc)
  Fatal error: L3900U: Unrecognized option '-\xff\x80bad\xfe.o'. (esc)
  Fatal error: L3916U: Unexpected argument for option '--create'
  Fatal error: L3903U: Argument 'two  words.o' not permitted for option 'diag_style'.
  Fatal error: L3903U: Argument '1\xff\x80bad\xfe.o' not permitted for option 'normalise'. (esc)
  [1]
  $ quarn --message_locale "$bytes"; quarn "--diag_error=$bytes" -t start.a plain.o; quarn "-ta$bytes"
  Fatal error: L9780E: Could not initialise message locale \xff\x80bad\xfe.o (esc)
  Warning: L9962I: Unknown diagnostic number \xff\x80bad\xfe.o (esc)
  plain.o
  Fatal error: L3917U: Concatenated options cannot have arguments: -a \xff\x80bad\xfe.o (esc)
  [1]

What the builds of one module are told about, with a map of such a name that says something of such a library.

  $ mkdir builds; cd builds
  $ printf '*%s_* $IEEE1$~STKCKD\n' "$(printf '\376')" > "map $bytes"; archive="$(printf 'lib \376_.a')"
  $ for name in "$blank" "$long"; do variant "./$name" '$IEEE1$STKCKD'; done
  $ quarn --create -v "--libattrmap=map $bytes" "$archive" "$blank" "$long"
  a - two  words.o
  a -  a long name, \xc3\xa9 \xff.o (esc)
  Warning: L6974W: 'lib \xfe_.a': malformed archive: Common attributes of minor variant group beginning with archive member #0 'two  words.o' are incompatible with library attributes (esc)
  Warning: L6974W: 'lib \xfe_.a': malformed archive: Attributes of minor variant member object 'two  words.o' are incompatible with library attributes (esc)
  Warning: L6974W: 'lib \xfe_.a': malformed archive: Attributes of minor variant member object ' a long name, \xc3\xa9 \xff.o' are incompatible with library attributes (esc)
  Warning: L6876W: Minor variants of archive member 'two  words.o' include multiple base variants
   * two  words.o [0] : two  words.o
   * two  words.o [1] :  a long name, \xc3\xa9 \xff.o (esc)
  $ variant "./$blank" '$J$IEEE1'; variant "./$long" '$E$IEEE1'
  $ quarn --create lib.a "$blank" "$long"; quarn --zs lib.a
  Warning: L6874W: Minor variants of archive member 'two  words.o' include no base variant
  gcd$$BuildAttributes$$J$IEEE1 from two  words.o at offset    222
  gcd$$BuildAttributes$$E$IEEE1 from  a long name, \xc3\xa9 \xff.o at offset   2650 (esc)
  $ cd ..

In the other language and styles as well.

  $ for name in "${odd[@]}"; do
  >   quarn --message_locale=ja_JP -t lib.a "$name." 2>&1 | grep -a -c -F "'$name.'"
  >   quarn --diag_style=gnu -t lib.a "$name."; quarn --diag_style=ide -t lib.a "$name."
  > done
  1
  Error: L6831E: 'two  words.o.' not present in archive 'lib.a'
  quarn : error L6831:  'two  words.o.' not present in archive 'lib.a'
  1
  Error: L6831E: 'caf\xc3\xa9.o.' not present in archive 'lib.a' (esc)
  quarn : error L6831:  'caf\xc3\xa9.o.' not present in archive 'lib.a' (esc)
  1
  Error: L6831E: '\xff\x80bad\xfe.o.' not present in archive 'lib.a' (esc)
  quarn : error L6831:  '\xff\x80bad\xfe.o.' not present in archive 'lib.a' (esc)
  1
  Error: L6831E: ' a long name, \xc3\xa9 \xff.o.' not present in archive 'lib.a' (esc)
  quarn : error L6831:  ' a long name, \xc3\xa9 \xff.o.' not present in archive 'lib.a' (esc)
  [1]
