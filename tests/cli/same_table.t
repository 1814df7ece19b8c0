Other archivers put the same table in front of the same objects.

  $ . "$TESTDIR/setup.sh"; . "$TESTDIR/others.sh"
  $ folders=("$QUARN_EXAMPLES" "$QUARN_OBJECTS"/{40-big,183-little,183-big})

  $ archived() { rm -f ours.a ar.a llvm.a; library ours.a "$@"; ar rcD ar.a "$@"; llvm-ar rcD --format=gnu llvm.a "$@"; }

For what compilers make the tables are the same to the byte, but for the zero bytes that some put at the end.

  $ for folder in "${folders[@]}"; do
  >   for kind in plain sections debug; do
  >     ls "$folder"/*_$kind.o > /dev/null 2>&1 || continue
  >     archived "$folder"/*_$kind.o
  >     for theirs in ar llvm; do sameTable ours.a $theirs.a; done
  >     echo $size $(quarn --zs ours.a | wc -l)
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
  >   for theirs in ar llvm; do sameTable ours.a $theirs.a; done
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
