# SPDX-License-Identifier: Apache-2.0
#
# Runs the commands of a document's first table, each in a folder of its own, and compares what the commands of
# a row leave behind.

# The folder that each command finds: a library of three members, two of them as old as their files.
givenFolder() {
  mkdir "$1" "$1/dir"
  cp "$QUARN_EXAMPLES"/bignum_plain.o "$1"/a.o
  cp "$QUARN_EXAMPLES"/matrix_plain.o "$1"/b.o
  cp "$QUARN_EXAMPLES"/wide_plain.o "$1"/c.o
  cp "$QUARN_EXAMPLES"/calendar_plain.o "$1"/x.o
  cp "$QUARN_EXAMPLES"/automaton_plain.o "$1"/dir/y.o
  touch -d @1000000000 "$1"/*.o
  quarn --create "$1"/lib.a "$1"/a.o "$1"/b.o "$1"/c.o
  touch "$1"/a.o
  echo x.o > "$1"/words
}

# tableRows DOCUMENT: says what is wrong, and nothing if all is well.
tableRows() {
  local line cell first count=0 number=0
  while IFS= read -r line; do
    first=
    while IFS= read -r cell; do
      number=$(( number + 1 ))
      givenFolder "row.$number"
      (cd "row.$number" && eval "$cell" > said 2>&1) || echo "fails: $cell: $(cat "row.$number/said")"
      quarn-ar t "row.$number/lib.a" > "row.$number/list"
      first=${first:-$number}
      cmp "row.$first/list" "row.$number/list" || echo "leaves other members: $cell"
      count=$(( count + 1 ))
    done < <(grep -o '`[^`]*`' <<< "$line" | tr -d '`')
  done < <(awk '/^\|/ { if (++row > 2) print } !/^\|/ && row { exit }' "$1")
  rm -rf row.*
  (( count > 40 )) || echo "only $count commands"
}
