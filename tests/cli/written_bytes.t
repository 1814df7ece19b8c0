What is written, byte for byte.

  $ . "$TESTDIR/setup.sh"
  $ create() { rm -f lib.a; quarn --create --normalise=7 --diag_suppress=L6875 "$@"; }

A name of 15 characters fills the field with its slash; one of 16 stands in the table. Odd members are
followed by a newline, even ones and empty ones by nothing.

  $ file fifteen_letters 1; file sixteen_letters_ 22; : > empty
  $ create lib.a fifteen_letters sixteen_letters_ empty
  $ bytes lib.a
  0000000 21 3c 61 72 63 68 3e 0a 2f 20 20 20 20 20 20 20  >!<arch>./       <
  0000016 20 20 20 20 20 20 20 20 30 20 20 20 20 20 20 20  >        0       <
  0000032 20 20 20 20 30 20 20 20 20 20 30 20 20 20 20 20  >    0     0     <
  0000048 30 20 20 20 20 20 20 20 34 20 20 20 20 20 20 20  >0       4       <
  0000064 20 20 60 0a 00 00 00 00 2f 2f 20 20 20 20 20 20  >  `.....//      <
  0000080 20 20 20 20 20 20 20 20 30 20 20 20 20 20 20 20  >        0       <
  0000096 20 20 20 20 30 20 20 20 20 20 30 20 20 20 20 20  >    0     0     <
  0000112 30 20 20 20 20 20 20 20 31 38 20 20 20 20 20 20  >0       18      <
  0000128 20 20 60 0a 73 69 78 74 65 65 6e 5f 6c 65 74 74  >  `.sixteen_lett<
  0000144 65 72 73 5f 2f 0a 66 69 66 74 65 65 6e 5f 6c 65  >ers_/.fifteen_le<
  0000160 74 74 65 72 73 2f 37 20 20 20 20 20 20 20 20 20  >tters/7         <
  0000176 20 20 30 20 20 20 20 20 30 20 20 20 20 20 31 30  >  0     0     10<
  0000192 30 36 34 34 20 20 31 20 20 20 20 20 20 20 20 20  >0644  1         <
  0000208 60 0a 31 0a 2f 30 20 20 20 20 20 20 20 20 20 20  >`.1./0          <
  0000224 20 20 20 20 37 20 20 20 20 20 20 20 20 20 20 20  >    7           <
  0000240 30 20 20 20 20 20 30 20 20 20 20 20 31 30 30 36  >0     0     1006<
  0000256 34 34 20 20 32 20 20 20 20 20 20 20 20 20 60 0a  >44  2         `.<
  0000272 32 32 65 6d 70 74 79 2f 20 20 20 20 20 20 20 20  >22empty/        <
  0000288 20 20 37 20 20 20 20 20 20 20 20 20 20 20 30 20  >  7           0 <
  0000304 20 20 20 20 30 20 20 20 20 20 31 30 30 36 34 34  >    0     100644<
  0000320 20 20 30 20 20 20 20 20 20 20 20 20 60 0a        >  0         `.<
  0000334

Without a symbol table the long names are the first member.

  $ quarn -n -s lib.a; bytes lib.a | head -7
  0000000 21 3c 61 72 63 68 3e 0a 2f 2f 20 20 20 20 20 20  >!<arch>.//      <
  0000016 20 20 20 20 20 20 20 20 30 20 20 20 20 20 20 20  >        0       <
  0000032 20 20 20 20 30 20 20 20 20 20 30 20 20 20 20 20  >    0     0     <
  0000048 30 20 20 20 20 20 20 20 31 38 20 20 20 20 20 20  >0       18      <
  0000064 20 20 60 0a 73 69 78 74 65 65 6e 5f 6c 65 74 74  >  `.sixteen_lett<
  0000080 65 72 73 5f 2f 0a 66 69 66 74 65 65 6e 5f 6c 65  >ers_/.fifteen_le<
  0000096 74 74 65 72 73 2f 37 20 20 20 20 20 20 20 20 20  >tters/7         <

The tables' own headers are kept when they came from a file, and blank fields become 0.

  $ { magic; header / 5 6 7 100 4; words 0; header // '' '' '' '' 18; printf 'sixteen_letters_/\n'; header /0 0 0 0 644 0; } > lib.a
  $ quarn -s lib.a; bytes lib.a
  0000000 21 3c 61 72 63 68 3e 0a 2f 20 20 20 20 20 20 20  >!<arch>./       <
  0000016 20 20 20 20 20 20 20 20 35 20 20 20 20 20 20 20  >        5       <
  0000032 20 20 20 20 36 20 20 20 20 20 37 20 20 20 20 20  >    6     7     <
  0000048 31 30 30 20 20 20 20 20 34 20 20 20 20 20 20 20  >100     4       <
  0000064 20 20 60 0a 00 00 00 00 2f 2f 20 20 20 20 20 20  >  `.....//      <
  0000080 20 20 20 20 20 20 20 20 30 20 20 20 20 20 20 20  >        0       <
  0000096 20 20 20 20 30 20 20 20 20 20 30 20 20 20 20 20  >    0     0     <
  0000112 30 20 20 20 20 20 20 20 31 38 20 20 20 20 20 20  >0       18      <
  0000128 20 20 60 0a 73 69 78 74 65 65 6e 5f 6c 65 74 74  >  `.sixteen_lett<
  0000144 65 72 73 5f 2f 0a 2f 30 20 20 20 20 20 20 20 20  >ers_/./0        <
  0000160 20 20 20 20 20 20 30 20 20 20 20 20 20 20 20 20  >      0         <
  0000176 20 20 30 20 20 20 20 20 30 20 20 20 20 20 36 34  >  0     0     64<
  0000192 34 20 20 20 20 20 30 20 20 20 20 20 20 20 20 20  >4     0         <
  0000208 60 0a                                            >`.<
  0000210

Headers that were read are written as they were, numbers without leading blanks.

  $ { magic; header a.o/ ' 12 ' ' 3' 00004 ' 0644' 2; printf ab; } > lib.a
  $ quarn -n -s lib.a; bytes lib.a
  0000000 21 3c 61 72 63 68 3e 0a 61 2e 6f 2f 20 20 20 20  >!<arch>.a.o/    <
  0000016 20 20 20 20 20 20 20 20 31 32 20 20 20 20 20 20  >        12      <
  0000032 20 20 20 20 33 20 20 20 20 20 34 20 20 20 20 20  >    3     4     <
  0000048 36 34 34 20 20 20 20 20 32 20 20 20 20 20 20 20  >644     2       <
  0000064 20 20 60 0a 61 62                                >  `.ab<
  0000070

A member without a name, first in an archive without tables, would be read as a symbol table.

  $ { magic; member 'no end' abcd; member a.o/ a; } > lib.a
  $ quarn -n -s lib.a
  Warning: L6974W: 'lib.a': malformed archive: Archive member header starting at offset 8 has no '/' character in its name field
  $ bytes lib.a | head -5
  0000000 21 3c 61 72 63 68 3e 0a 2f 20 20 20 20 20 20 20  >!<arch>./       <
  0000016 20 20 20 20 20 20 20 20 30 20 20 20 20 20 20 20  >        0       <
  0000032 20 20 20 20 30 20 20 20 20 20 30 20 20 20 20 20  >    0     0     <
  0000048 31 30 30 36 34 34 20 20 34 20 20 20 20 20 20 20  >100644  4       <
  0000064 20 20 60 0a 61 62 63 64 61 2e 6f 2f 20 20 20 20  >  `.abcda.o/    <
  $ quarn -t lib.a
  Error: L6829E: 'lib.a': malformed archive: Archive symbol table is 4 bytes long, but claims to contain 1633837924 symbols so it should be at least 6535351700 bytes long
  [1]

A run with nothing to do writes the same bytes.

  $ create lib.a fifteen_letters sixteen_letters_ empty; cp lib.a before.a
  $ for run in -r -s '-d' '-m' '-t -s' '-s -v'; do quarn $run lib.a > /dev/null; cmp lib.a before.a; done
  $ quarn -n -s lib.a; cp lib.a before.a
  $ for run in '-r -n' '-s -n' '-d -n' '-t -n'; do quarn $run lib.a > /dev/null; cmp lib.a before.a; done

An archive of no members is its magic, with the table of no symbols, or without.

  $ magic > lib.a; quarn -s lib.a; bytes lib.a
  0000000 21 3c 61 72 63 68 3e 0a 2f 20 20 20 20 20 20 20  >!<arch>./       <
  0000016 20 20 20 20 20 20 20 20 30 20 20 20 20 20 20 20  >        0       <
  0000032 20 20 20 20 30 20 20 20 20 20 30 20 20 20 20 20  >    0     0     <
  0000048 30 20 20 20 20 20 20 20 34 20 20 20 20 20 20 20  >0       4       <
  0000064 20 20 60 0a 00 00 00 00                          >  `.....<
  0000072
  $ quarn -n -s lib.a; bytes lib.a
  0000000 21 3c 61 72 63 68 3e 0a                          >!<arch>.<
  0000008

The file is made beside the archive, under the first name that is free, and no trace stays.

  $ create lib.a empty; file lib.a.0 mine; mkdir lib.a.1
  $ quarn -d lib.a empty; ls; cat lib.a.0; echo
  before.a
  empty
  fifteen_letters
  lib.a
  lib.a.0
  lib.a.1
  sixteen_letters_
  mine
  $ ln -s nowhere lib.a.2; quarn -s lib.a; ls -d lib.a*; readlink lib.a.2
  lib.a
  lib.a.0
  lib.a.1
  lib.a.2
  nowhere
