Objects for link-time optimisation: what they define stands in records of their compiler's own.

  $ . "$TESTDIR/setup.sh"
  $ for tool in gcc nm; do command -v $tool > /dev/null || exit 80; done
  $ echo 'int b_sum(void); int a_sum(void) { return b_sum() + 1; }' > a.c; echo 'int b_sum(void) { return 2; } int common;' > b.c
  $ echo 'int a_sum(void); int main(void) { return a_sum(); }' > main.c
  $ gcc -flto -c main.c && gcc -flto main.o a.c b.c -o image 2> /dev/null || exit 80

A library of them is linked, by a compiler that optimises and by one that only links.

  $ gcc -flto -fcommon -fno-fat-lto-objects -c a.c b.c; quarn-ar rc lib.a --plugin=liblto.so a.o b.o; published lib.a | sort
  a_sum
  b_sum
  common
  $ gcc -flto main.o lib.a -o image; ./image
  [3]
  $ gcc -c main.c -o plain.o; gcc -flto plain.o lib.a -o image; ./image
  [3]

Those that hold machine code too need none of that.

  $ gcc -flto -ffat-lto-objects -c a.c b.c; quarn-ar rc fat.a a.o b.o; published fat.a | sort
  a_sum
  b_sum
  common
  $ gcc -fno-lto plain.o fat.a -o image; ./image
  [3]
  $ gcc -flto main.o fat.a -o image; ./image
  [3]
