Windows looks each word up, takes the letters from the disk, and has names of its own.

  $ . "$TESTDIR/setup.sh"
  $ mkdir Sub 'my folder'; for name in b.o a.o C.txt .hidden.o; do file $name $name; file Sub/$name "Sub $name"; done
  $ create() { rm -f new.a; quarn -r -c -v --normalise=1 --diag_suppress=L6875 new.a "$@"; }
  $ here=$PWD; drive="z:${here//\//\\}"

Names come in the order of the host, which is that of their letters in either case, hidden ones too.

  $ file B2.o B2; create '*.o'
  a - .hidden.o
  a - a.o
  a - b.o
  a - B2.o
  $ create 'Sub\*.o'
  a - .hidden.o
  a - a.o
  a - b.o
  $ create './Sub/../*.txt' "$drive\\Sub\\?.txt" "z:$here/Sub/c*"
  a - C.txt
  a - C.txt
  a - C.txt
  $ create '?.?'
  a - a.o
  a - b.o

A name without a pattern is looked up as well, and the member gets the letters that the disk has.

  $ create 'A.O' 'sub\C.TXT' 'SUB/B.o'
  a - a.o
  a - C.txt
  a - b.o
  $ quarn -p new.a c.txt; echo
  Sub C.txt

A pattern stands in the last part alone. Brackets mean nothing.

  $ create 'S*\a.o'
  Error: L6833E: File 'S*\a.o' does not exist
  [1]
  $ file '[ab].o' brackets; create '[ab].o'; rm '[ab].o'
  a - [ab].o

Both separators are one; more than one in a row, too.

  $ create 'Sub\a.o' Sub/b.o 'Sub\/C.txt' '.\Sub\.hidden.o'
  a - a.o
  a - b.o
  a - C.txt
  a - .hidden.o

A drive has a folder that one is in. Its name alone is that folder.

  $ create z:a.o 'z:Sub\b.o' 'Z:?.txt'
  a - a.o
  a - b.o
  a - C.txt
  $ create z:none.o c:none.o 'c:\none.o' q:none.o 'q:\*.o'
  Error: L6833E: File 'z:none.o' does not exist
  Error: L6833E: File 'c:none.o' does not exist
  Error: L6833E: File 'c:\none.o' does not exist
  Error: L6833E: File 'q:none.o' does not exist
  Error: L6833E: File 'q:\*.o' does not exist
  [1]
  $ create "z:$here/a.o" "Z:${here//\//\\}\\b.o"
  a - a.o
  a - b.o
  $ create 'c:\windows\none*' 'C:/windows/NONE.o'
  Error: L6833E: File 'c:\windows\none*' does not exist
  Error: L6833E: File 'C:/windows/NONE.o' does not exist
  [1]

A share is a server and a name.

  $ create '\\server\share\a.o' '//server/share/a.o' '\\server\share\*.o' '\\server' '\\'
  Error: L6833E: File '\\server\share\a.o' does not exist
  Error: L6833E: File '//server/share/a.o' does not exist
  Error: L6833E: File '\\server\share\*.o' does not exist
  Error: L6833E: File '\\server' does not exist
  Error: L6833E: File '\\' does not exist
  [1]
  $ create "\\\\?\\$drive\\a.o" "\\\\?\\unix${here//\//\\}\\b.o"
  a - a.o
  a - b.o

A word without a match stays as it is.

  $ create 'x*.o' 'nowhere\*.o' 'no?.o' 'a.o\' 'a.o\b.o'
  Error: L6833E: File 'x*.o' does not exist
  Error: L6833E: File 'nowhere\*.o' does not exist
  Error: L6833E: File 'no?.o' does not exist
  Error: L6833E: File 'a.o\' does not exist
  Error: L6833E: File 'a.o\b.o' does not exist
  [1]
  $ create a.o ''
  a - a.o
  Error: L6833E: File '' does not exist
  [1]

"." and ".." are folders, found by no pattern, and are no files.

  $ create . ..
  Error: L6835E: Reading file 'new.a' : Is a directory
  Error: L6835E: Reading file 'new.a' : Is a directory
  [1]
  $ create '.*.o' 'Sub\..' 'Sub\.' 'Sub\'
  a - .hidden.o
  Error: L6835E: Reading file 'new.a' : Is a directory
  Error: L6835E: Reading file 'new.a' : Is a directory
  Error: L6835E: Reading file 'new.a' : Is a directory
  [1]
  $ create Sub
  Error: L6835E: Reading file 'new.a' : Is a directory
  [1]
  $ mkdir D.dir; create '*.dir'; rmdir D.dir
  Error: L6835E: Reading file 'new.a' : Is a directory

Folders and names with blanks, and of other alphabets.

  $ file 'my folder/two words.o' 1; create 'my folder\two words.o' 'my folder/*'
  a - two words.o
  a - two words.o
  $ mkdir 資料; file 資料/アーカイブ.o 2; file 資料/É.o 3
  $ create 資料/アーカイブ.o '資料\*.o' '資料/?.o' | cat
  a - \xe3\x82\xa2\xe3\x83\xbc\xe3\x82\xab\xe3\x82\xa4\xe3\x83\x96.o (esc)
  a - \xc3\x89.o (esc)
  a - \xe3\x82\xa2\xe3\x83\xbc\xe3\x82\xab\xe3\x82\xa4\xe3\x83\x96.o (esc)
  a - \xc3\x89.o (esc)
  $ quarn -t new.a アーカイブ.o; quarn -p new.a É.o; echo
  \xe3\x82\xa2\xe3\x83\xbc\xe3\x82\xab\xe3\x82\xa4\xe3\x83\x96.o (esc)
  \xe3\x82\xa2\xe3\x83\xbc\xe3\x82\xab\xe3\x82\xa4\xe3\x83\x96.o (esc)
  33
  $ create 資料/é.o
  a - \xc3\x89.o (esc)
  $ mkdir out; cd out; quarn -x ../new.a; ls; cd ..; rm -r out
  \xc3\x89.o (esc)
  $ library 資料/目録.a a.o; quarn -r --normalise=1 '資料\目録.a' b.o; quarn -t 資料/目録.a
  Warning: L6875W: Adding non-ELF object 'b.o' to archive '\xe8\xb3\x87\xe6\x96\x99\\\xe7\x9b\xae\xe9\x8c\xb2.a' (esc)
  a.o
  b.o
  $ cp a.o 😀.o; create 😀.o '?.o'; quarn -t new.a 😀.o
  a - \xf0\x9f\x98\x80.o (esc)
  a - a.o
  a - b.o
  \xf0\x9f\x98\x80.o (esc)

Words for members are patterns, as on every host, in whose names folders don't count.

  $ create a.o b.o C.txt
  a - a.o
  a - b.o
  a - C.txt
  $ quarn -t new.a 'any\where\*.O' 'c:b.*' 'z:\C.TXT'
  a.o
  b.o
  Error: L6831E: 'c:b.*' not present in archive 'new.a'
  C.txt
  [1]

Paths of more than 260 letters.

  $ part=$(printf 'deep%.0s' {1..20}); deep=$part/$part/$part/$part; mkdir -p "$deep"; echo ${#deep}
  323
  $ file "$deep/a.o" deep; quarn --create --normalise=1 --diag_suppress=L6875 "$deep/lib.a" "$deep/a.o" b.o; quarn -t "$deep/lib.a"
  a.o
  b.o
  $ quarn -p "z:$PWD/$deep/lib.a" a.o; echo; quarn -tv "$deep/lib.a"
  deep
  rw-r--r--     0/     0      4 Jan 01 00:00 1970 a.o (offset     72)
  rw-r--r--     0/     0      3 Jan 01 00:00 1970 b.o (offset    136)
  $ quarn -rv --normalise=1 --diag_suppress=L6875 "${deep//\//\\}\\lib.a" "${deep//\//\\}\\*.o"
  r - a.o
  $ quarn -d "$deep/lib.a" b.o; quarn -t "$deep/lib.a"; ls "$deep"
  a.o
  a.o
  lib.a
  $ mkdir out; cd out; quarn -xv "../$deep/lib.a"; cat a.o; echo; cd ..; rm -r out
  x - a.o
  deep
  $ rm -r deep*

What Windows takes for a device, a stream or another name is never made a file.

  $ devices() {
  >   { magic; for name; do member "$name/" in; done; member last.o/ ok; } > lib.a
  >   mkdir out; (cd out; both quarn -xv ../lib.a; ls -A; cat last.o; echo); rm -r out
  > }
  $ devices con NUL.o com1.txt Lpt9 aux.a.b 'prn .o' 'CONIN$'
  out: x - last.o
  err: Error: L6843E: Writing file 'con' : Invalid argument
  err: Error: L6843E: Writing file 'NUL.o' : Invalid argument
  err: Error: L6843E: Writing file 'com1.txt' : Invalid argument
  err: Error: L6843E: Writing file 'Lpt9' : Invalid argument
  err: Error: L6843E: Writing file 'aux.a.b' : Invalid argument
  err: Error: L6843E: Writing file 'prn .o' : Invalid argument
  err: Error: L6843E: Writing file 'CONIN$' : Invalid argument
  status 1
  last.o
  ok
  $ devices a:b a.o:x:\$DATA c:
  out: x - last.o
  err: Error: L6843E: Writing file 'a:b' : Invalid argument
  err: Error: L6843E: Writing file 'a.o:x:$DATA' : Invalid argument
  err: Error: L6843E: Writing file 'c:' : Invalid argument
  status 1
  last.o
  ok
  $ devices x. 'x ' 'x. .' ...
  out: x - last.o
  err: Error: L6843E: Writing file 'x.' : Invalid argument
  err: Error: L6843E: Writing file 'x ' : Invalid argument
  err: Error: L6843E: Writing file 'x. .' : Invalid argument
  err: Error: L6843E: Writing file '...' : Invalid argument
  status 1
  last.o
  ok
  $ devices com10 console nul_ .con x.nul 'x y.o' '.o'
  out: x - com10
  out: x - console
  out: x - nul_
  out: x - .con
  out: x - x.nul
  out: x - x y.o
  out: x - .o
  out: x - last.o
  status 0
  .con
  .o
  com10
  console
  last.o
  nul_
  x y.o
  x.nul
  ok
  $ { magic; header // 0 0 0 0 30; printf '%-28s/\n' 'a_name_of_seventeen_letters.'; header /0 0 0 0 644 2; printf in; } > lib.a
  $ mkdir out; cd out; both quarn -xv ../lib.a; ls -A; cd ..; rmdir out
  err: Error: L6843E: Writing file 'a_name_of_seventeen_letters.' : Invalid argument
  status 1
  $ { magic; member "com$(printf '\302\271')/" in; } > lib.a; both quarn -xv lib.a
  err: Error: L6843E: Writing file 'com\xc2\xb9' : Invalid argument (esc)
  status 1

Nor what it can't have in a name. The rest of a name behind a backslash is one.

  $ devices 'a*b' 'a?b' 'a<b>' 'a|b' 'a"b' | grep -v '^out: x - a'
  out: x - last.o
  err: Error: L6843E: Writing file 'a*b' : Invalid argument
  err: Error: L6843E: Writing file 'a?b' : Invalid argument
  err: Error: L6843E: Writing file 'a<b>' : Invalid argument
  err: Error: L6843E: Writing file 'a|b' : Invalid argument
  err: Error: L6843E: Writing file 'a"b' : Invalid argument
  status 1
  last.o
  ok
  $ devices 'sub\in.o' 'c:\in.o' '..\up.o' 'sub\nul'
  out: x - in.o
  out: x - in.o
  out: x - up.o
  out: x - last.o
  err: Error: L6843E: Writing file 'nul' : Invalid argument
  status 1
  in.o
  last.o
  up.o
  ok

An archive that may not be written.

  $ library kept.a a.o b.o; cp kept.a before.a; chmod 444 kept.a
  $ for action in -t -p -dv -rv -mv -s -q; do both quarn $action kept.a b.o; done
  out: b.o
  status 0
  out: b.o
  status 0
  err: Error: L6979E: Output file 'kept.a' is read-only
  status 1
  err: Error: L6979E: Output file 'kept.a' is read-only
  status 1
  err: Error: L6979E: Output file 'kept.a' is read-only
  status 1
  err: Error: L6979E: Output file 'kept.a' is read-only
  status 1
  err: Error: L6979E: Output file 'kept.a' is read-only
  status 1
  $ both quarn --create -v --diag_suppress=L6875 kept.a b.o
  out: a - b.o
  err: Error: L6979E: Output file 'kept.a' is read-only
  status 1
  $ cmp kept.a before.a; ls kept*
  kept.a
  $ mkdir out; cd out; quarn -x ../kept.a; ls; cd ..; rm -r out; chmod 644 kept.a
  a.o
  b.o

An archive is replaced that the same run reads its members from.

  $ quarn -r --normalise=1 --diag_suppress=L6875 kept.a kept.a C.txt kept.a; quarn -t kept.a; quarn -p kept.a; echo
  a.o
  b.o
  C.txt
  a.o
  b.o
  a.ob.oC.txta.ob.o
  $ head -c 300000 /dev/zero > large.o; library large.a large.o a.o
  $ quarn -m -v -a a.o large.a large.o; quarn -r --normalise=1 --diag_suppress=L6875 large.a large.a b.o; quarn -t large.a
  m - large.o
  a.o
  large.o
  b.o
  $ quarn -p large.a large.o | cmp - large.o; ls large*
  large.a
  large.o

The name of the tool is that of its file, without a folder and an extension of programs.

  $ called() { cp "$QUARN_FILE" "Sub/$1"; env -u TMPDIR LC_ALL=C.UTF-8 wine "Sub/$1" --show_cmdline -t new.a a.o; }
  $ for name in zqtool.exe tool.EXE a.b.exe x.dll.exe abcdefghijklmnopqrstuvwxyz0123456789.exe アーカイブ.exe; do
  >   called $name
  > done
  [tool --show_cmdline -t new.a a.o]
  a.o
  [tool --show_cmdline -t new.a a.o]
  a.o
  [b --show_cmdline -t new.a a.o]
  a.o
  [dll --show_cmdline -t new.a a.o]
  a.o
  [abcdefghijklmnopqrstuvwxyz01234 --show_cmdline -t new.a a.o]
  a.o
  [\xe3\x82\xa2\xe3\x83\xbc\xe3\x82\xab\xe3\x82\xa4\xe3\x83\x96 --show_cmdline -t new.a a.o] (esc)
  a.o

The map of what libraries need has the name behind the last backslash, and with it.

  $ variant base.o '$IEEE1'; variant fast.o '$J$IEEE1'; mkdir lib_j
  $ made() { rm -f "$1"; quarn --create --libattrmap=map "$@" && listed "$1"; }
  $ printf 'g_* $J$IEEE1\n' > map; made g_x.a base.o fast.o; made 'Sub\g_x.a' base.o fast.o; made Sub/g_x.a base.o fast.o
  Warning: L6876W: Minor variants of archive member 'base.o' include multiple base variants
  gcd base.o
  gcd fast.o
  gcd base.o
  gcd$$BuildAttributes$$J$IEEE1 fast.o
  gcd base.o
  gcd$$BuildAttributes$$J$IEEE1 fast.o
  $ printf '\\g_* $J$IEEE1\n' > map; made 'Sub\g_x.a' base.o fast.o; made Sub/g_x.a base.o fast.o
  Warning: L6876W: Minor variants of archive member 'base.o' include multiple base variants
  gcd base.o
  gcd fast.o
  gcd base.o
  gcd$$BuildAttributes$$J$IEEE1 fast.o
  $ printf '*_j* $J$IEEE1\n' > map; made 'lib_j\x.a' base.o fast.o; made lib_j/x.a base.o fast.o
  gcd base.o
  gcd$$BuildAttributes$$J$IEEE1 fast.o
  Warning: L6876W: Minor variants of archive member 'base.o' include multiple base variants
  gcd base.o
  gcd fast.o

quarn-ar and quarn-json take words as they stand. Names of members have no folders.

  $ quarn-ar rcs ar.a A.O 'Sub\b.o'; quarn-ar t ar.a
  A.O
  b.o
  $ quarn-ar rcs ar.a '*.o' none.o
  quarn-ar: Error: L6833E: File '*.o' does not exist
  quarn-ar: Error: L6833E: File 'none.o' does not exist
  [1]
  $ quarn-json 'Sub\g_x.a' | head -c 60; echo; quarn-json '*.a'
  {
    "formatVersion": 1,
    "libraries": [
      {
        "file":
  quarn-json: Error: L6832E: Archive '*.a' not found : No such file or directory
  [1]
