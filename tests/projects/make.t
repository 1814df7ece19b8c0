Plain Makefiles: member rules with eight jobs at once, recipes, and ranlib:

  $ . "$TESTDIR/setup.sh"
  $ project make
  $ make -j8 AR=quarn-ar RANLIB=quarn-ranlib > log 2>&1
  $ ./main
  10
  $ quarn-ar t libmembers.a | sort | tr '\n' ' '
  a.o b.o c.o d.o e.o f.o g.o h.o  (no-eol)

What is up to date is not made again, as archives with dates tell it to make:

  $ make AR=quarn-ar RANLIB=quarn-ranlib ARFLAGS=rvU -B > log 2>&1
  $ make AR=quarn-ar RANLIB=quarn-ranlib ARFLAGS=rvU | tail -n 1
  make: Nothing to be done for 'all'.
