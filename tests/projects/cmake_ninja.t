An unmodified CMake project, by Ninja. Both objects called util.c.o are in the library:

  $ . "$TESTDIR/setup.sh"
  $ project cmake
  $ cmake -G Ninja -B out -DCMAKE_AR="$(command -v quarn-ar)" -DCMAKE_RANLIB="$(command -v quarn-ranlib)" > log
  $ cmake --build out >> log
  $ out/shapes
  3 corners
  $ quarn-ar t out/libnumbers.a
  util.c.o
  util.c.o
  $ touch one/util.c && cmake --build out >> log && quarn-ar t out/libnumbers.a
  util.c.o
  util.c.o

A library of 4,001 objects, which only a response file can name:

  $ manyObjects objects
  $ cmake -B out -DOBJECTS="$PWD/objects" > log
  $ cmake --build out >> log
  $ quarn-ar t out/libmany.a | wc -l
  4001
  $ out/sum
  4
  $ grep -c 'RSP_FILE' out/CMakeFiles/rules.ninja | sed 's/[1-9].*/some/'
  some
