Other archivers put the same table in front of the same objects, and a linker finds its symbols by ours.

  $ . "$TESTDIR/setup.sh"
  $ for tool in ar llvm-ar nm llvm-nm ranlib llvm-ranlib ld.lld readelf; do command -v $tool > /dev/null || exit 80; done
  $ folders=("$QUARN_EXAMPLES" "$QUARN_OBJECTS"/{40-big,183-little,183-big})

content FILE: the bytes of the table, offsets and all.

  $ content() { head -c $(( 68 + $(head -c 66 "$1" | tail -c 10) )) "$1" | tail -c +69; }
  $ archived() { rm -f ours.a ar.a llvm.a; library ours.a "$@"; ar rcD ar.a "$@"; llvm-ar rcD --format=gnu llvm.a "$@"; }

For what compilers make the tables are the same to the byte, but for the zero bytes that some put at the end.

  $ for folder in "${folders[@]}"; do
  >   for kind in plain sections debug; do
  >     ls "$folder"/*_$kind.o > /dev/null 2>&1 || continue
  >     archived "$folder"/*_$kind.o
  >     for theirs in ar llvm; do cmp <(content ours.a) <(content $theirs.a | head -c $(content ours.a | wc -c)); done
  >     echo $(content ours.a | wc -c) $(quarn --zs ours.a | wc -l)
  >   done
  > done
  573 36
  573 36
  573 36
  573 36
  573 36
  573 36

One by one too, each of the sample objects.

  $ for object in "$QUARN_EXAMPLES"/*.o "$QUARN_OBJECTS"/*/*.o; do
  >   archived $object
  >   for theirs in ar llvm; do cmp <(content ours.a) <(content $theirs.a | head -c $(content ours.a | wc -c)); done
  > done

Names that compilers do not publish are where opinions part. llvm-ar leaves out the names of files, sections and
stretches of code, which are global here. ar takes an empty name for one. We leave out what lies in debug sections.

  $ cp "$QUARN_EXAMPLES"/wide_plain.o x.o
  $ symbol x.o 1 info 0x14; symbol x.o 2 info 0x13; symbol x.o 2 name $(symbol x.o 19 name); symbol x.o 3 info 0x10
  $ symbol x.o 4 name 325; sed -i 's/\.comment/.debug_x/' x.o; symbol x.o 22 shndx 6
  $ symbol x.o 5 shndx 0xfff2; symbol x.o 9 shndx 0xfff1; symbol x.o 6 info 0x22; symbol x.o 7 other 2; symbol x.o 8 info 0x02
  $ names() { nm -s "$1" 2> /dev/null | sed -n '/^Archive index/,/^$/s/ *in x.o$//p' | sed 's/^$/(empty)/' | paste -s -d ' '; }
  $ archived x.o; for tool in ours ar llvm; do echo $tool: $(names $tool.a); done
  ours: wide.c wide_to_float $a.0 __umoddi3 wide_power wide_prime __divdi3 wide_parse wide_print wide_to_double wide_from_double wide_to_float
  ar: wide.c wide_to_float $a.0 (empty) __umoddi3 wide_power wide_prime __divdi3 wide_parse wide_print wide_to_double wide_from_double wide_to_float wide_shift
  llvm: __umoddi3 wide_power wide_prime __divdi3 wide_parse wide_print wide_to_double wide_from_double wide_to_float wide_shift
  $ library ours.a --debug_symbols x.o; echo $(names ours.a)
  wide.c wide_to_float $a.0 __umoddi3 wide_power wide_prime __divdi3 wide_parse wide_print wide_to_double wide_from_double wide_to_float wide_shift

Machines that are not ours have no names here.

  $ elf x.o machine 62; archived x.o 2> /dev/null; for tool in ours llvm; do names $tool.a | wc -w; done
  0
  12

Their readers see our table as we do, and their makers of tables find nothing to change.

  $ for folder in "${folders[@]}"; do
  >   library lib.a "$folder"/*_plain.o
  >   quarn --zs lib.a | awk '{ print $1, "in", $3 }' > shown
  >   nm -s lib.a 2> /dev/null | grep ' in ' | diff shown -
  >   llvm-nm --print-armap lib.a 2> /dev/null | grep ' in ' | diff shown -
  >   for tool in 'ranlib -D' 'llvm-ranlib -D' 'ar sD' 'llvm-ar sD'; do
  >     cp lib.a copy.a; $tool copy.a; quarn --zs copy.a | awk '{ print $1, "in", $3 }' | diff shown -
  >     cmp <(content lib.a) <(content copy.a | head -c $(content lib.a | wc -c))
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

A linker takes the members that it needs.

  $ linked() {
  >   rm -f image
  >   ld.lld --unresolved-symbols=ignore-all -e 0 "$@" lib.a -o image > /dev/null 2>&1 || echo "status $?"
  >   readelf -sW image | awk '$5 == "GLOBAL" && $7 != "UND" { print $8 }' | sort | paste -s -d ' '
  > }
  $ for folder in "${folders[@]}"; do
  >   library lib.a "$folder"/{allocator,automaton,bignum,matrix,wide}_plain.o
  >   linked "$folder"/calendar_plain.o; linked -u vec_dot "$folder"/calendar_plain.o
  > done
  date_print date_to_seconds seconds_to_date year_is_leap
  date_print date_to_seconds mat4_apply mat4_identity mat4_multiply matrix_determinant seconds_to_date vec_dot year_is_leap
  date_print date_to_seconds seconds_to_date year_is_leap
  date_print date_to_seconds mat4_apply mat4_identity mat4_multiply matrix_determinant seconds_to_date vec_dot year_is_leap
  date_print date_to_seconds seconds_to_date year_is_leap
  date_print date_to_seconds mat4_apply mat4_identity mat4_multiply matrix_determinant seconds_to_date vec_dot year_is_leap
  date_print date_to_seconds seconds_to_date year_is_leap
  date_print date_to_seconds mat4_apply mat4_identity mat4_multiply matrix_determinant seconds_to_date vec_dot year_is_leap

It is the table that it goes by: with a letter changed there it finds the member under the other name only.

  $ patch lib.a $(grep -abo vec_dot lib.a | head -1 | cut -d : -f 1) 56
  $ linked -u vec_dot "$folder"/calendar_plain.o; linked -u Vec_dot "$folder"/calendar_plain.o
  date_print date_to_seconds seconds_to_date year_is_leap
  date_print date_to_seconds mat4_apply mat4_identity mat4_multiply matrix_determinant seconds_to_date vec_dot year_is_leap
  $ quarn -s lib.a; linked -u vec_dot "$folder"/calendar_plain.o
  date_print date_to_seconds mat4_apply mat4_identity mat4_multiply matrix_determinant seconds_to_date vec_dot year_is_leap

A member that cannot be read does not stand in the way of the others.

  $ cp "$QUARN_EXAMPLES"/wide_plain.o bad.o; elf bad.o type 9; quarn -r -b allocator_plain.o lib.a --diag_suppress=L6974 bad.o
  $ linked -u vec_dot -u bitmap_take "$folder"/calendar_plain.o | tr ' ' '\n' | grep -e vec_dot -e bitmap_take
  bitmap_take
  vec_dot
