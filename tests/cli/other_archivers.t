Archives of other archivers are read, and theirs read ours.

  $ . "$TESTDIR/setup.sh"
  $ for tool in ar llvm-ar nm llvm-nm ranlib llvm-ranlib; do command -v $tool > /dev/null || exit 80; done
  $ mkdir in; cp "$QUARN_EXAMPLES"/matrix_plain.o "$QUARN_EXAMPLES"/wide_debug.o in
  $ file in/odd.txt odd; file in/even.txt even; file in/empty.txt ''
  $ file in/a_name_of_more_than_sixteen.txt 'long name'
  $ file in/fifteen_letters 15; file in/sixteen_letters_ 16
  $ cd in

  $ unpack() {
  >   rm -rf ../out; mkdir ../out; (cd ../out; quarn -x "../in/$1" || echo "$1 does not unpack")
  >   diff -r -x '*.a' -x '*.list' . ../out || echo "$1 differs"
  > }

Each makes one with and without a symbol table; all are listed and taken apart alike.

  $ ar rcD gnu.a *.o *.txt *letters*; ar rcDS gnu_bare.a *.o *.txt *letters*
  $ llvm-ar rcD --format=gnu llvm.a *.o *.txt *letters*; llvm-ar rcDS --format=gnu llvm_bare.a *.o *.txt *letters*
  $ for archive in gnu gnu_bare llvm llvm_bare; do quarn -t $archive.a > $archive.list; done
  $ cat gnu.list
  matrix_plain.o
  wide_debug.o
  a_name_of_more_than_sixteen.txt
  empty.txt
  even.txt
  odd.txt
  fifteen_letters
  sixteen_letters_
  $ for archive in gnu gnu_bare llvm llvm_bare; do
  >   diff gnu.list $archive.list; ar t $archive.a | diff - $archive.list; unpack $archive.a
  >   quarn -p $archive.a | cmp - <(ar p $archive.a)
  > done; rm *.list

Their symbol tables say the same as their own tools.

  $ for archive in gnu llvm; do
  >   quarn --zs $archive.a | awk '{print $1, "in", $3}' | sort > ours
  >   nm -s $archive.a 2> /dev/null | sed -n '/^Archive index/,/^$/p' | grep ' in ' | sort | diff - ours
  > done; head -3 ours; rm ours
  mat4_apply in matrix_plain.o
  mat4_identity in matrix_plain.o
  mat4_multiply in matrix_plain.o
  $ both quarn --zs gnu_bare.a
  err: Archive 'gnu_bare.a' does not have a symbol table
  status 0

What is edited here is read there.

  $ readable() {
  >   ar t "$1" > names; llvm-ar t "$1" | diff names - ; quarn -t "$1" | diff names -
  >   nm -s "$1" > /dev/null 2> said; llvm-nm "$1" > /dev/null 2>> said
  >   grep -v -e 'no symbols' -e 'file format not recognized' -e '^$' -e 'not recognized as a valid object' said
  >   for tool in ranlib llvm-ranlib; do cp "$1" copy.a; $tool copy.a && quarn -t copy.a | diff names -; done
  >   mkdir apart; (cd apart; ar x "../$1"; cd ..; quarn -p "$1" | cmp - <(ar p "$1")); rm -r apart names said copy.a
  > }
  $ for archive in gnu gnu_bare llvm llvm_bare; do
  >   quarn -r --diag_suppress=L6875 $archive.a odd.txt empty.txt matrix_plain.o; readable $archive.a; unpack $archive.a
  >   quarn -m -b odd.txt $archive.a sixteen_letters_; readable $archive.a
  >   quarn -d $archive.a a_name_of_more_than_sixteen.txt wide_debug.o; readable $archive.a
  >   quarn -s $archive.a; readable $archive.a
  >   quarn -n -s $archive.a; readable $archive.a
  > done
  $ quarn -t llvm.a
  matrix_plain.o
  empty.txt
  even.txt
  sixteen_letters_
  odd.txt
  fifteen_letters

What is made here is read there, and theirs can go on with it.

  $ quarn --create --diag_suppress=L6875 ours.a *.o *.txt *letters*; readable ours.a; unpack ours.a
  $ for tool in ar llvm-ar; do
  >   cp ours.a theirs.a; $tool d theirs.a even.txt; $tool r theirs.a even.txt; $tool m theirs.a odd.txt
  >   unpack theirs.a; quarn -s theirs.a; readable theirs.a; unpack theirs.a
  > done
  $ rm theirs.a ours.a

Several members of one name, and archives of none.

  $ ar qcD twice.a odd.txt even.txt odd.txt; ar qcDS twice_bare.a odd.txt odd.txt
  $ quarn -t twice.a; quarn -t twice_bare.a; quarn -p twice_bare.a; echo
  odd.txt
  even.txt
  odd.txt
  odd.txt
  odd.txt
  oddodd
  $ quarn -r --diag_suppress=L6875 twice.a odd.txt; readable twice.a
  $ ar rc none.a; quarn -tv none.a; quarn -s none.a; readable none.a
  $ llvm-ar rc empty.a; quarn -tv empty.a; quarn -r --diag_suppress=L6875 empty.a odd.txt; readable empty.a

The long listing agrees with theirs on what both show.

  $ rm *.a; ar rcU gnu.a *.txt *.o; chmod 751 odd.txt; ar rU gnu.a odd.txt
  $ ar tv gnu.a | tr -s ' ' > theirs
  $ quarn -tv gnu.a | sed -E 's|^(.{9}) *([0-9]+)/ *([0-9]+) *([0-9]+) (...) 0?([0-9]+) (.*) \(offset .*|\1 \2/\3 \4 \5 \6 \7|' | diff - theirs
  $ rm theirs

Archives of theirs as file words.

  $ quarn --create -v --diag_suppress=L6875 all.a gnu.a odd.txt
  a - a_name_of_more_than_sixteen.txt
  a - empty.txt
  a - even.txt
  a - odd.txt
  a - matrix_plain.o
  a - wide_debug.o
  a - odd.txt

Thin archives hold no members and are refused; so are other kinds.

  $ rm *.a; ar rcT thin.a odd.txt 2> /dev/null; quarn -t thin.a
  Error: L6826E: 'thin.a' not in archive format
  [1]

Archives of another form are taken as far as their headers make sense.

  $ llvm-ar rcSD --format=bsd bsd.a odd.txt 2> /dev/null; both quarn -t bsd.a
  out: 
  err: Warning: L6974W: 'bsd.a': malformed archive: Archive member header starting at offset 8 has a trailing non-space character after the '/' character in its name field
  status 0
