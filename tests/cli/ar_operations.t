The words that build systems use. Names, dates and owners of the files make no difference.

  $ . "$TESTDIR/setup.sh"
  $ mkdir folder; file one.txt 1; file folder/two.txt 22; file a_name_of_more_than_fifteen.txt 333

  $ quarn-ar rc lib.a one.txt folder/two.txt a_name_of_more_than_fifteen.txt
  $ bytes lib.a
  0000000 21 3c 61 72 63 68 3e 0a 2f 2f 20 20 20 20 20 20  >!<arch>.//      <
  0000016 20 20 20 20 20 20 20 20 30 20 20 20 20 20 20 20  >        0       <
  0000032 20 20 20 20 30 20 20 20 20 20 30 20 20 20 20 20  >    0     0     <
  0000048 30 20 20 20 20 20 20 20 33 33 20 20 20 20 20 20  >0       33      <
  0000064 20 20 60 0a 61 5f 6e 61 6d 65 5f 6f 66 5f 6d 6f  >  `.a_name_of_mo<
  0000080 72 65 5f 74 68 61 6e 5f 66 69 66 74 65 65 6e 2e  >re_than_fifteen.<
  0000096 74 78 74 2f 0a 0a 6f 6e 65 2e 74 78 74 2f 20 20  >txt/..one.txt/  <
  0000112 20 20 20 20 20 20 30 20 20 20 20 20 20 20 20 20  >      0         <
  0000128 20 20 30 20 20 20 20 20 30 20 20 20 20 20 36 34  >  0     0     64<
  0000144 34 20 20 20 20 20 31 20 20 20 20 20 20 20 20 20  >4     1         <
  0000160 60 0a 31 0a 74 77 6f 2e 74 78 74 2f 20 20 20 20  >`.1.two.txt/    <
  0000176 20 20 20 20 30 20 20 20 20 20 20 20 20 20 20 20  >    0           <
  0000192 30 20 20 20 20 20 30 20 20 20 20 20 36 34 34 20  >0     0     644 <
  0000208 20 20 20 20 32 20 20 20 20 20 20 20 20 20 60 0a  >    2         `.<
  0000224 32 32 2f 30 20 20 20 20 20 20 20 20 20 20 20 20  >22/0            <
  0000240 20 20 30 20 20 20 20 20 20 20 20 20 20 20 30 20  >  0           0 <
  0000256 20 20 20 20 30 20 20 20 20 20 36 34 34 20 20 20  >    0     644   <
  0000272 20 20 33 20 20 20 20 20 20 20 20 20 60 0a 33 33  >  3         `.33<
  0000288 33 0a                                            >3.<
  0000290
  $ quarn-ar t lib.a
  one.txt
  two.txt
  a_name_of_more_than_fifteen.txt
  $ quarn-ar tv lib.a
  rw-r--r-- 0/0      1 Jan  1 00:00 1970 one.txt
  rw-r--r-- 0/0      2 Jan  1 00:00 1970 two.txt
  rw-r--r-- 0/0      3 Jan  1 00:00 1970 a_name_of_more_than_fifteen.txt
  $ quarn-ar p lib.a two.txt one.txt; echo
  221
  $ quarn-ar pv lib.a two.txt; echo
  
  <two.txt>
  
  22

With or without a dash, the letters in one word or in several.

  $ quarn-ar -t lib.a two.txt; quarn-ar t -v lib.a two.txt; quarn-ar -t -v -- lib.a two.txt
  two.txt
  rw-r--r-- 0/0      2 Jan  1 00:00 1970 two.txt
  rw-r--r-- 0/0      2 Jan  1 00:00 1970 two.txt

Replacing keeps the place; new ones come to the end, or beside a member.

  $ file one.txt one; file three.txt 3; file four.txt 4
  $ quarn-ar rv lib.a one.txt three.txt; quarn-ar rbv two.txt lib.a four.txt; quarn-ar t lib.a
  r - one.txt
  a - three.txt
  a - four.txt
  one.txt
  four.txt
  two.txt
  a_name_of_more_than_fifteen.txt
  three.txt
  $ quarn-ar qv lib.a one.txt; quarn-ar mav one.txt lib.a three.txt; quarn-ar dvN 2 lib.a one.txt; quarn-ar t lib.a
  a - one.txt
  m - three.txt
  d - one.txt
  one.txt
  three.txt
  four.txt
  two.txt
  a_name_of_more_than_fifteen.txt

Only what is newer than its member, where members have dates.

  $ rm lib.a; quarn-ar rcU lib.a one.txt; touch -d @1000000001 four.txt; quarn-ar ruvU lib.a one.txt four.txt; quarn-ar tv lib.a | cut -c 11-
  a - four.txt
  0/0      3 Sep  9 01:46 2001 one.txt
  0/0      1 Sep  9 01:46 2001 four.txt

Extraction goes to the current folder, whatever a name says, and restores dates if it is told so.

  $ quarn-ar rcP full.a folder/two.txt; quarn-ar t full.a; rm -r folder; quarn-ar xvo full.a; cat two.txt; ls -d folder; stat -c %Y two.txt
  folder/two.txt
  x - folder/two.txt
  22ls: cannot access 'folder': No such file or directory
  0

Response files hold words, and the names of others.

  $ echo 'rc "li b.a" @names' > words; echo "'one.txt' four.txt" > names
  $ quarn-ar @words; quarn-ar t 'li b.a'
  one.txt
  four.txt
  $ echo '"li b.a" c:\none.txt' > words; quarn-ar --rsp-quoting=windows t @words
  quarn-ar: Error: L6831E: 'c:\none.txt' not present in archive 'li b.a'
  [1]

The symbol table is made unless it is not wanted; ranlib makes it anew.

  $ cp "$QUARN_EXAMPLES"/matrix_plain.o .; quarn-ar rcS lib.a matrix_plain.o; published lib.a | head -1
  $ cp lib.a other.a; quarn-ranlib lib.a other.a; published lib.a | head -1; cmp lib.a other.a
  mat4_identity
  $ quarn-ar dS lib.a one.txt; quarn-ar s lib.a; published lib.a | head -1
  mat4_identity

Nothing happens to the archive, or all of it.

  $ cp lib.a before.a; quarn-ar r lib.a one.txt none.txt; cmp lib.a before.a
  quarn-ar: Error: L6833E: File 'none.txt' does not exist
