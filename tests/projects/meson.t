An unmodified Meson project:

  $ . "$TESTDIR/setup.sh"
  $ project meson
  $ AR=$(command -v quarn-ar) meson setup out > log
  $ meson compile -C out > log
  $ out/shapes
  3 corners
  $ quarn-ar t out/libnumbers.a
  one_util.c.o
  two_util.c.o
  $ quarn-ar t out/libshape.a | sort
  one_util.c.o
  shape.cpp.o
  two_util.c.o

It asks for archives without dates, and for none that are thin:

  $ grep -h 'LINK_ARGS = csr' out/build.ninja | sort -u
   LINK_ARGS = csrD
