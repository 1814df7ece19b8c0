Parallel builds put many objects into one library at once.

  $ . "$TESTDIR/setup.sh"

A makefile names the library's members; each is put in by a run of its own, and nobody waits for the
others to begin.

  $ for i in $(seq 40); do file "$i.c" "source $i"; done
  $ cat > Makefile << 'END'
  > .SECONDARY:
  > library: $(foreach i,$(shell seq 40),lib.a($(i).o))
  > lib.a(%.o): %.o
  > 	@quarn -r -c --diag_suppress=L6875 $@ $<
  > %.o: %.c
  > 	@cp $< $@
  > END
  $ make -s -j8 library
  $ quarn -t lib.a | sort -n | tr '\n' ' '; echo
  1.o 2.o 3.o 4.o 5.o 6.o 7.o 8.o 9.o 10.o 11.o 12.o 13.o 14.o 15.o 16.o 17.o 18.o 19.o 20.o 21.o 22.o 23.o 24.o 25.o 26.o 27.o 28.o 29.o 30.o 31.o 32.o 33.o 34.o 35.o 36.o 37.o 38.o 39.o 40.o 
  $ for i in $(seq 40); do quarn -p lib.a $i.o | cmp - $i.c; done
  $ ls | grep -v -e '\.[co]$'
  Makefile
  lib.a

The same with real objects, whose symbols all stand in the table at the end.

  $ rm lib.a
  $ cp "$QUARN_EXAMPLES"/*_plain.o .
  $ quarn --create all.a *_plain.o
  $ for each in *_plain.o; do quarn -r -c lib.a "$each" & done; wait
  $ quarn --zs lib.a | awk '{ print $1, $3 }' | sort > together
  $ quarn --zs all.a | awk '{ print $1, $3 }' | sort | cmp - together

Whoever makes the library tells so once; the others add to it.

  $ rm lib.a
  $ for i in $(seq 20); do quarn -r --diag_suppress=L6875 lib.a $i.o 2> said.$i & done; wait
  $ cat said.*
  Creating archive 'lib.a'
  $ quarn -t lib.a | wc -l
  20
