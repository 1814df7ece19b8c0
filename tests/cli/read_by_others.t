What is made and edited here is read by other archivers, and they can go on with it.

  $ . "$TESTDIR/setup.sh"; . "$TESTDIR/others.sh"

What is edited here is read there.

  $ makeTheirs
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
