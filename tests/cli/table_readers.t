The readers of other archivers find in our symbol table what we do, and their makers of tables leave it alone.

  $ . "$TESTDIR/setup.sh"; . "$TESTDIR/others.sh"
  $ folders=("$QUARN_EXAMPLES" "$QUARN_OBJECTS"/{40-big,183-little,183-big})

  $ for folder in "${folders[@]}"; do
  >   library lib.a "$folder"/*_plain.o
  >   quarn --zs lib.a | awk '{ print $1, "in", $3 }' > shown
  >   nm -s lib.a 2> /dev/null | grep ' in ' | diff shown -
  >   llvm-nm --print-armap lib.a 2> /dev/null | grep ' in ' | diff shown -
  >   for tool in 'ranlib -D' 'llvm-ranlib -D' 'ar sD' 'llvm-ar sD'; do
  >     cp lib.a copy.a; $tool copy.a; quarn --zs copy.a | awk '{ print $1, "in", $3 }' | diff shown -
  >     sameTable lib.a copy.a
  >   done
  >   ar t lib.a > list; llvm-ar t lib.a | diff list -; quarn -t lib.a | diff list -
  > done

After each kind of edit as well.

  $ quarn -d lib.a 'wide*'; quarn -m -b allocator_plain.o lib.a matrix_plain.o; quarn -r -a allocator_plain.o lib.a "$folder"/wide_plain.o
  $ quarn --zs lib.a | awk '{ print $1, "in", $3 }' > shown; nm -s lib.a 2> /dev/null | grep ' in ' | diff shown -; cut -d ' ' -f 3 shown | uniq
  matrix_plain.o
  allocator_plain.o
  wide_plain.o
  automaton_plain.o
  bignum_plain.o
  calendar_plain.o
