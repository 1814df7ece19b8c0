# Sourced behind setup.sh by the transcripts of names that are out of the ordinary: objects with blanks, UTF-8 and
# bytes that are no UTF-8 in their names, beside plain.o.
blank='two  words.o' utf8=$(printf 'caf\303\251.o') bytes=$(printf '\377\200bad\376.o')
long=$(printf ' a long name, \303\251 \377.o'); odd=("$blank" "$utf8" "$bytes" "$long")
objects=(wide allocator automaton bignum)
for i in 0 1 2 3; do cp "$QUARN_EXAMPLES/${objects[i]}_plain.o" "${odd[i]}"; section "./${odd[i]}" 2 flags 0x10000006; done
cp "$QUARN_EXAMPLES/matrix_plain.o" plain.o
touch -d @1000000000 *.o

# names ARGUMENT...: the names of members.
names() {
  quarn -t "$@"
}
