Ninja with a response file, for an object with a blank in its name:

  $ . "$TESTDIR/setup.sh"
  $ project ninja
  $ ninja > log
  $ ./main
  12
  $ quarn-ar t libwords.a
  one two.o
