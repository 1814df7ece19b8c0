Intermediate code that is no object at all is looked into by its own linker, where there is no table.

  $ . "$TESTDIR/setup.sh"
  $ for tool in clang ld.lld llvm-ar; do command -v $tool > /dev/null || exit 80; done
  $ echo 'int b_sum(void); int a_sum(void) { return b_sum() + 1; }' > a.c; echo 'int b_sum(void) { return 2; } int common;' > b.c
  $ echo 'int a_sum(void); int main(void) { return a_sum(); }' > main.c
  $ for source in a b main; do clang -flto -c $source.c -o $source.bc; done
  $ quarn-ar rc code.a a.bc b.bc; clang -flto -fuse-ld=lld main.bc code.a -o image; ./image
  [3]

A table that llvm-ar has made is kept as long as it is true.

  $ file notes.txt notes; llvm-ar rc code.a a.bc b.bc; quarn-ar r code.a notes.txt; published code.a
  a_sum
  b_sum
  common
  $ clang -flto -fuse-ld=lld main.bc code.a -o image; ./image
  [3]
  $ quarn-ar r code.a b.bc; published code.a
  quarn-ar: Warning: 'b.bc' is intermediate code, of which the symbol table tells nothing
  a_sum

Beside an object, which makes a table, it is a member that nobody finds, and that is told.

  $ echo 'int own(void) { return 4; }' | cc -x c -c - -o own.o
  $ quarn-ar rc mixed.a own.o a.bc b.bc; published mixed.a
  quarn-ar: Warning: 'a.bc' is intermediate code, of which the symbol table tells nothing
  own
