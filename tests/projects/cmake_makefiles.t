An unmodified CMake project, by Makefiles. Both objects called util.c.o are in the library:

  $ . "$TESTDIR/setup.sh"
  $ project cmake
  $ cmake -G "Unix Makefiles" -B out -DCMAKE_AR="$(command -v quarn-ar)" -DCMAKE_RANLIB="$(command -v quarn-ranlib)" > log
  $ cmake --build out -j4 >> log
  $ out/shapes
  3 corners
  $ quarn-ar t out/libnumbers.a
  util.c.o
  util.c.o

A library of 4,001 objects, in chunks: the first is made, the others are appended:

  $ manyObjects objects
  $ cmake -B out -DOBJECTS="$PWD/objects" > log
  $ cmake --build out >> log
  $ quarn-ar t out/libmany.a | wc -l
  4001
  $ out/sum
  4
  $ cut -d ' ' -f 1-2 out/CMakeFiles/many.dir/link.txt | sed "s|$(dirname "$(command -v quarn-ar)")/||" | uniq
  quarn-ar qc
  quarn-ar q
  quarn-ranlib libmany.a

The same by response files:

  $ cmake -B out2 -DCMAKE_AR="$(command -v quarn-ar)" -DCMAKE_RANLIB="$(command -v quarn-ranlib)" \
  >   -DCMAKE_C_USE_RESPONSE_FILE_FOR_OBJECTS=1 -DOBJECTS="$PWD/objects" > log
  $ cmake --build out2 --target sum >> log
  $ out2/sum
  4
  $ cmp out/libmany.a out2/libmany.a
