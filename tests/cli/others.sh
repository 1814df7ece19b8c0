# Sourced behind setup.sh by the transcripts that hold archives against those of other archivers. Ends the
# transcript as skipped where one of these is missing; then goes into a folder of files for the archives.
for tool in ar llvm-ar nm llvm-nm ranlib llvm-ranlib; do command -v $tool > /dev/null || exit 80; done

# GNU's programs look for plugins beside themselves, and hand each object to them. Copies in another place find
# none, say the same, and take a tenth of the time.
mkdir bin in
for tool in ar nm ranlib; do cp "$(readlink -f "$(command -v $tool)")" bin/$tool; done
PATH=$PWD/bin:$PATH

cd in
cp "$QUARN_EXAMPLES"/matrix_plain.o "$QUARN_EXAMPLES"/wide_debug.o .
file odd.txt odd; file even.txt even; file empty.txt ''
file a_name_of_more_than_sixteen.txt 'long name'
file fifteen_letters 15; file sixteen_letters_ 16

# makeTheirs: archives of all these files by both, with and without a symbol table.
makeTheirs() {
  ar rcD gnu.a *.o *.txt *letters*; ar rcDS gnu_bare.a *.o *.txt *letters*
  llvm-ar rcD --format=gnu llvm.a *.o *.txt *letters*; llvm-ar rcDS --format=gnu llvm_bare.a *.o *.txt *letters*
}

# unpack FILE: that we take the archive apart into the files of this folder. Says nothing then, as below.
unpack() {
  rm -rf ../out; mkdir ../out
  (cd ../out; quarn -x "../in/$1" || echo "$1 does not unpack")
  diff -r -x '*.a' -x '*.list' . ../out || echo "$1 differs"
}

# readable FILE: that the others find in our archive what we do, and that we can read what they make of it.
readable() {
  ar t "$1" > names; llvm-ar t "$1" | diff names - ; quarn -t "$1" | diff names -
  nm -s "$1" > /dev/null 2> said; llvm-nm "$1" > /dev/null 2>> said
  grep -v -e 'no symbols' -e 'file format not recognized' -e '^$' -e 'not recognized as a valid object' said
  for tool in ranlib llvm-ranlib; do cp "$1" copy.a; $tool copy.a && quarn -t copy.a | diff names -; done
  mkdir apart; (cd apart; ar x "../$1"; cd ..; quarn -p "$1" | cmp - <(ar p "$1")); rm -r apart names said copy.a
}

# sameTable OURS THEIRS: that the bytes of our symbol table, offsets and all, begin theirs. Its size is then in $size.
sameTable() {
  local header
  IFS= read -r -N 66 header < "$1"
  size=$(( ${header: -10} ))
  cmp -i 68 -n $size "$1" "$2"
}
