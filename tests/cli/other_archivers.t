Archives of other archivers are read.

  $ . "$TESTDIR/setup.sh"; . "$TESTDIR/others.sh"

Each makes one with and without a symbol table; all are listed and taken apart alike.

  $ makeTheirs
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
