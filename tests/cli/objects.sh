# Sourced behind setup.sh by the transcripts of objects that cannot be read, or that only just can. x.o stands
# between two good objects, behind the symbol table: it is member #2. Each case is that x.o is made anew, damaged,
# and either refused or taken.
cp "$QUARN_EXAMPLES"/matrix_plain.o good.o
cp "$QUARN_EXAMPLES"/calendar_plain.o later.o
cp "$QUARN_EXAMPLES"/wide_plain.o whole.o

# publishedBy FILE: the names in the table and their members, as the tool lists them.
publishedBy() {
  local name from member rest
  while read -r name from member rest; do echo "$name $member"; done < <(quarn --zs "$1" 2>&1)
}

library start.a good.o
library without.a good.o later.o
sizes=$(quarn --sizes without.a)
published=$(publishedBy without.a)

# same TEXT COMMAND...: that this is all that the command says; shows how it differs, if it does.
same() {
  local text=$1 said
  shift
  said=$("$@" 2>&1) || said+=$'\n'"status $?"
  [ "$said" = "$text" ] || diff <(echo "$text") <(echo "$said")
}

# x: a good object.
x() {
  cp whole.o x.o
}

# added: shows what is said when x.o comes in. It is kept as it is.
added() {
  cp start.a lib.a
  quarn -r lib.a x.o later.o 2>&1 || echo "status $?"
  quarn -p lib.a x.o | cmp - x.o
}

# other: what is no object at all. The neighbours are published, and the reports leave x.o out.
other() {
  added
  same "$published" publishedBy lib.a
  same "$sizes" quarn --sizes lib.a
}

# refused: an object that can't be read. What is shown is all that is said; a table made anew is the same, with
# one line said again.
refused() {
  local again
  other
  same 'No ENTRY points found.' quarn --entries lib.a
  cp lib.a once.a
  again=$(quarn -s lib.a 2>&1) || echo "status $?"
  cmp lib.a once.a
  [[ $again == ?* && $again != *$'\n'* ]] || echo "$again"
}

# taken: an object that is read. Shows the count of its published names and its row in the table of sizes.
taken() {
  added
  quarn --zs lib.a 2>&1 | grep -c ' from x.o '
  quarn --sizes lib.a 2>&1 | grep ' x.o$'
}

# wide COUNT: so many section indices of 32 bits, all 0, as hex bytes.
wide() {
  little 4 $(printf '%*s' "$1" | sed 's/ / 0/g')
}
