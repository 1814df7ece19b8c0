The document waits in a file of its own until it is whole, and that file goes with the run, however it ends.

  $ . "$TESTDIR/../cli/setup.sh"
  $ mkdir tmp; export TMPDIR=$PWD/tmp
  $ cp "$QUARN_EXAMPLES/wide_plain.o" wide.o; for i in $(seq 500); do echo wide.o; done > words
  $ quarn-ar qc lib.a @words 2> /dev/null; libraries=$(yes lib.a | head -n 40)

  $ quarn-json $libraries | head -n 1; ls tmp
  {

The user's limit on the size of files is an error like a full disk.

  $ (ulimit -f 1000; quarn-json $libraries | wc -c; echo ${PIPESTATUS[0]}); ls tmp
  quarn-json: Error: L6843E: Writing file '*/tmp/quarn.*' : File too large (glob)
  0
  1
