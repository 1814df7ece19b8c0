A library of another machine stays one that its linker can use.

  $ . "$TESTDIR/setup.sh"
  $ for tool in gcc ld ar nm ranlib; do command -v $tool > /dev/null || exit 80; done
  $ for letter in a b c; do
  >   echo "extern int $letter; int $letter = 1; int ${letter}_common; static int hidden; int ${letter}_sum(void) { return $letter + hidden; }"
  > done | split -l 1 --additional-suffix=.c - source
  $ gcc -fcommon -c sourceaa.c -o a.o; gcc -c sourceab.c -o b.o; gcc -ffunction-sections -c sourceac.c -o a_long_name_of_a_member.o
  $ echo 'int a_sum(void), b_sum(void), c_sum(void); int main(void) { return a_sum() + b_sum() + c_sum(); }' > main.c
  $ linked() {
  >   rm -f image; gcc main.c "$@" -o image && ./image; echo "returns $?"
  > }

It publishes what its own archiver does, in the same order, and has the same members.

  $ index() {
  >   nm -s "$1" 2> /dev/null | sed -n '/^Archive index/,/^$/p'
  > }
  $ quarn-ar rc lib.a a.o b.o a_long_name_of_a_member.o; linked lib.a
  returns 3
  $ ar rcD theirs.a a.o b.o a_long_name_of_a_member.o 2> /dev/null; diff <(index lib.a) <(index theirs.a)
  $ diff <(quarn-ar tv lib.a) <(ar tv lib.a); ar p lib.a | cmp - <(quarn-ar p theirs.a)

Either can go on where the other has stopped.

  $ quarn-ar d theirs.a b.o; quarn-ar q theirs.a b.o; ar t theirs.a; linked theirs.a
  a.o
  a_long_name_of_a_member.o
  b.o
  returns 3
  $ ar dD lib.a a.o 2> /dev/null; quarn-ar rb b.o lib.a a.o; quarn-ar t lib.a; linked lib.a
  a.o
  b.o
  a_long_name_of_a_member.o
  returns 3
  $ ranlib -D lib.a 2> /dev/null; cp lib.a before.a; quarn-ranlib lib.a; diff <(index lib.a) <(index before.a)

A table that is left out can be made later.

  $ quarn-ar rcS bare.a a.o b.o a_long_name_of_a_member.o; quarn-ranlib bare.a; linked bare.a
  returns 3

What is no object, or a damaged one, stands in nobody's way.

  $ file notes.txt notes; head -c 300 a.o > cut.o; quarn-ar r lib.a notes.txt cut.o
  quarn-ar: Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #6 'cut.o': I/O error writing file 'cut.o': Unknown error -1
  $ linked lib.a
  returns 3

The tool itself refuses to publish such objects; quarn-ar repairs that.

  $ quarn -s lib.a --diag_suppress=6974; index lib.a
  $ quarn-ranlib --diag_suppress=6974 lib.a; linked lib.a
  returns 3
