A linker finds symbols by our table, and takes the members that it needs.

  $ . "$TESTDIR/setup.sh"
  $ for tool in ld.lld readelf; do command -v $tool > /dev/null || exit 80; done
  $ folders=("$QUARN_EXAMPLES" "$QUARN_OBJECTS"/{40-big,183-little,183-big})

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
