An unmodified automake project with libtool; the second library takes in a convenience library with an object of the
name of its own:

  $ . "$TESTDIR/setup.sh"
  $ project automake
  $ autoreconf -i > log 2>&1
  $ ./configure AR="$(command -v quarn-ar)" RANLIB="$(command -v quarn-ranlib)" > log
  $ make -j4 > log 2>&1
  $ ./shapes
  5
  $ quarn-ar t .libs/libouter.a
  util.o
  lt1-util.o
  $ quarn-ar t libempty.a
  $ grep -E '^(lt_cv_ar_at_file|am_cv_ar)' config.log
  am_cv_ar_interface=ar
  lt_cv_ar_at_file=@
  $ ./configure --disable-shared AR="$(command -v quarn-ar)" RANLIB="$(command -v quarn-ranlib)" > log
  $ make clean > log && make > log 2>&1 && ./shapes
  5
