What a member needs is told by its decoration symbols, or, if asked for, by the object as a whole: then its attribute
section counts, and decoration symbols count by the place that they are in.

  $ . "$TESTDIR/setup.sh"
  $ section=0x70000003

attributes HEX: the contents of an attribute section that says this of the whole file, in the ABI's own tags.

  $ attributes() {
  >   local tags=${1// /} size; size=$(( ${#tags} / 2 ))
  >   echo "41 $(little 4 $(( size + 15 ))) 71 6f 62 69 78 00 01 $(little 4 $(( size + 5 ))) $tags"
  > }

makers HEX: the same, with a subsection of the maker's tags behind it.

  $ makers() {
  >   local tags=${2// /} size; size=$(( ${#tags} / 2 ))
  >   echo "$(attributes "$1") $(little 4 $(( size + 13 ))) 5a 45 56 00 01 $(little 4 $(( size + 5 ))) $tags"
  > }
  $ make() { rm -f lib.a; quarn --create "$@" lib.a 1.o 2.o; listed lib.a; }
  $ asked() { make --qobix_buildattr "$@"; }

Architecture 4 with its first instruction set, and architecture 10 with profile A. The level of the full instruction set
is claimed unless the maker's tag 22 denies it.

  $ variant 1.o; addSection 1.o $section "$(makers '06 04 08 01' '16 00')"
  $ variant 2.o; addSection 2.o $section "$(makers '06 0a 07 41 08 01' '16 00')"
  $ asked
  Warning: L6877W: Attribute difference of archive member '2.o' in minor variant group beginning with '1.o' includes attribute(s) with no symbol decoration representation
  gcd 1.o
  gcd$$BuildAttributes$$ZEV_ISAv7$J$K$B$A:UL41UL21$US41US21$IEEE1 2.o
  $ make
  Warning: L6876W: Minor variants of archive member '1.o' include multiple base variants
  gcd 1.o
  gcd 2.o
  $ asked --no_qobix_buildattr
  Warning: L6876W: Minor variants of archive member '1.o' include multiple base variants
  gcd 1.o
  gcd 2.o
  $ variant 2.o; addSection 2.o $section "$(attributes '06 0a 07 41 08 01')"; asked
  Warning: L6877W: Attribute difference of archive member '2.o' in minor variant group beginning with '1.o' includes attribute(s) with no symbol decoration representation
  gcd 1.o
  gcd$$BuildAttributes$$ZEV_ISAv8$J$K$B$A:UL41UL21$US41US21$IEEE1 2.o

The flags of tags.

  $ variant 1.o; addSection 1.o $section "$(makers '06 04 08 01' '16 00')"
  $ flags() { variant 2.o; addSection 2.o $section "$(makers "06 04 08 01 $1" "16 00 $2")"; asked; }
  $ flags '0f 02 0e 01' ''
  Warning: L6874W: Minor variants of archive member '1.o' include no base variant
  gcd$$BuildAttributes$$ZEV_ISAv3$IEEE1$USESV6 1.o
  gcd$$BuildAttributes$$ZEV_ISAv3$IEEE1$RWPI 2.o
  $ flags '10 01' ''
  gcd 1.o
  gcd$$BuildAttributes$$ZEV_ISAv3$IEEE1$ROPI 2.o
  $ flags '18 01 19 01' ''
  gcd 1.o
  gcd$$BuildAttributes$$ZEV_ISAv3$IEEE1$EBA8$REQ8$PRES8 2.o
  $ flags '1a 02 12 04' ''
  gcd 1.o
  gcd$$BuildAttributes$$ZEV_ISAv3$IEEE1$WCHAR32$ENUMINT 2.o
  $ flags '1e 02' ''
  gcd 1.o
  gcd$$BuildAttributes$$ZEV_ISAv3$IEEE1$OTIME 2.o
  $ flags '' '06 01 0a 01 0c 01'
  gcd 1.o
  gcd$$BuildAttributes$$ZEV_ISAv3$IEEE1$UX$STANDARDLIB$MICROLIB 2.o
  $ flags '17 03' ''
  Warning: L6877W: Attribute difference of archive member '2.o' in minor variant group beginning with '1.o' includes attribute(s) with no symbol decoration representation
  gcd 1.o
  gcd$$BuildAttributes$$ZEV_ISAv3$PE$IEEE1$IEEEF 2.o
  $ flags '22 01' '08 01 14 03'
  gcd 1.o
  gcd$$BuildAttributes$$ZEV_ISAv3$PLD3$MD$A:UL41UL21$US41US21$IEEE1 2.o

Tags that nothing depends on make no difference; nor do unknown ones, or another vendor.

  $ flags '05 58 00 1a 01 1d 01 48 07 49 59 00 20 01 58 00' ''
  Warning: L6876W: Minor variants of archive member '1.o' include multiple base variants
  gcd 1.o
  gcd 2.o
  $ variant 2.o; addSection 2.o $section "$(makers '06 04 08 01' '16 00') $(little 4 13) 78 79 7a 00 01 $(little 4 5)"; asked
  Warning: L6876W: Minor variants of archive member '1.o' include multiple base variants
  gcd 1.o
  gcd 2.o

Code that can be used on another architecture as well needs only what both have.

  $ flags '41 06 0b 00' ''
  gcd$$BuildAttributes$$ZEV_ISAv5$E$P$IEEE1 1.o
  gcd 2.o

A malformed run of tags is taken as far as it goes.

  $ variant 2.o; addSection 2.o $section "$(makers '06 04 08 01 10 01 80' '16 00')"; asked
  gcd 1.o
  gcd$$BuildAttributes$$ZEV_ISAv3$IEEE1$ROPI 2.o

An object without attributes is of the default kind. One whose tags tell nothing that counts is, too.

  $ variant 1.o; variant 2.o; asked
  Warning: L6876W: Minor variants of archive member '1.o' include multiple base variants
  gcd 1.o
  gcd 2.o
  $ addSection 1.o $section "$(attributes '1a 02')"; asked
  Warning: L6876W: Minor variants of archive member '1.o' include multiple base variants
  gcd 1.o
  gcd 2.o
  $ variant 1.o; addSection 1.o $section 41; asked
  Warning: L6876W: Minor variants of archive member '1.o' include multiple base variants
  gcd 1.o
  gcd 2.o
  $ variant 1.o '$ZEV_ISAv4$IEEE1'; variant 2.o; asked
  Warning: L6874W: Minor variants of archive member '1.o' include no base variant
  gcd$$BuildAttributes$$ZEV_ISAv4$IEEE1$EBA4 1.o
  gcd$$BuildAttributes$$A:L22$X:L11$S22$IEEE1$IW$USESV6$~STKCKD$USESV7$~SHL$OSPACE$EBA8$EABIv2 2.o

A section outranks decoration symbols if the maker's version is above 0, and gives way to them if not.

  $ variant 1.o '$ZEV_ISAv4$IEEE1'; addSection 1.o $section "$(makers '06 04 08 01' '16 00 12 02')"
  $ variant 2.o '$ZEV_ISAv4$IEEE1'; addSection 2.o $section "$(makers '06 04 08 01' '16 00 12 00')"; asked
  Warning: L6874W: Minor variants of archive member '1.o' include no base variant
  gcd$$BuildAttributes$$ZEV_ISAv5$E$P$A:L22$X:L11$S22$IEEE1$IW$USESV6$~STKCKD$USESV7$~SHL$OSPACE$EABIv2 1.o
  gcd$$BuildAttributes$$ZEV_ISAv3$IEEE1$EBA4 2.o
  $ published lib.a
  gcd$$BuildAttributes$$ZEV_ISAv5$E$P$A:L22$X:L11$S22$IEEE1$IW$USESV6$~STKCKD$USESV7$~SHL$OSPACE$EABIv2
  gcd$$BuildAttributes$$ZEV_ISAv3$IEEE1$EBA4
  $ make
  Warning: L6876W: Minor variants of archive member '1.o' include multiple base variants
  gcd 1.o
  gcd 2.o

Of several symbols for the whole object the last one counts, where together they count without being asked.

  $ variant 1.o '$IEEE1' '$J$IEEE1$IW'; variant 2.o '$J$IEEE1$IW'; asked
  Warning: L6876W: Minor variants of archive member '1.o' include multiple base variants
  gcd 1.o
  gcd 2.o
  $ make
  Warning: L6876W: Minor variants of archive member '1.o' include multiple base variants
  gcd 1.o
  gcd 2.o

However many there are, all of them count.

  $ long='$ZEV_ISAv7$N$HFUv3$PE$A:L44L22$IEEE1$IW$RWPI$USESV6$STKCKD$USESV7$OTIME$ROPI$EBA8$STANDARDLIB$MICROLIB$REQ8$EABIv2'
  $ variant 1.o "$long"; texts=(); for i in $(seq 200); do texts+=("$long"); done; variant 2.o "${texts[@]}" '$J$IEEE1'; make
  gcd 1.o
  gcd$$BuildAttributes$$ZEV_ISAv3$J$IEEE1 2.o

An absolute symbol that is global is a name like others, and so no other object has the same names.

  $ variant 2.o
  $ llvm-objcopy --add-symbol 'BuildAttributes$$J$IEEE1=0,global' 1.o; make
  gcd 1.o
  BuildAttributes$$J$IEEE1 1.o
  gcd 2.o

Big-endian objects have the lengths the other way round; they say the same.

  $ cp "$QUARN_EXAMPLES"/allocator_plain.o 1.o
  $ cp "$QUARN_OBJECTS"/40-big/allocator_plain.o 2.o; asked | awk '{ print $NF }' | uniq -c
  Warning: L6876W: Minor variants of archive member '1.o' include multiple base variants
        7 1.o
        7 2.o

Corrupted sections make the object unreadable, whatever was asked for. It is told in the words of the reader.

  $ variant 1.o; index=$(elf 1.o shnum)
  $ corrupted() { variant 2.o; addSection 2.o $section "$1"; make | tail -n +2; }
  $ corrupted ''
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #1 '2.o': Build attributes in section #10 are corrupted
  $ corrupted 42
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #1 '2.o': Build attributes in section #10 are corrupted
  $ corrupted '41 04 00 00 00'
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #1 '2.o': Build attributes in section #10 are corrupted
  $ corrupted "41 $(little 4 6) 61"
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #1 '2.o': Build attributes in section #10 are corrupted
  $ corrupted "41 $(little 4 6) 71 71"
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #1 '2.o': Build attributes in section #10 are corrupted
  $ corrupted "41 $(little 4 11) 78 00 00 $(little 4 5)"
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #1 '2.o': Build attributes in section #10 are corrupted
  $ corrupted "41 $(little 4 11) 78 00 04 $(little 4 5)"
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #1 '2.o': Build attributes in section #10 are corrupted
  $ corrupted "41 $(little 4 11) 78 00 01 $(little 4 4)"
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #1 '2.o': Build attributes in section #10 are corrupted
  $ corrupted "41 $(little 4 11) 78 00 01 $(little 4 6)"
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #1 '2.o': Build attributes in section #10 are corrupted
  $ corrupted "41 $(little 4 11) 78 00 02 $(little 4 5)"
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #1 '2.o': Build attributes in section #10 are corrupted
  $ corrupted "41 $(little 4 13) 78 00 02 $(little 4 7) $(printf %02x $(( index + 1 ))) 00"
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #1 '2.o': Build attributes in section #10 are corrupted
  $ corrupted "41 $(little 4 13) 78 00 03 $(little 4 7) $(printf %02x 64) 00"
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #1 '2.o': Build attributes in section #10 are corrupted
  $ corrupted "41 $(little 4 13) 78 00 02 $(little 4 7) 01 00"
  Warning: L6876W: Minor variants of archive member '1.o' include multiple base variants
  gcd 2.o

The others are published, and with the report raised to an error nothing is written.

  $ corrupted 42 > out; listed lib.a; rm lib.a
  Warning: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #1 '2.o': Build attributes in section #10 are corrupted
  gcd 1.o
  $ quarn --create --diag_error=L6974 lib.a 1.o 2.o; ls lib.a
  Error: L6974W: 'lib.a': malformed archive: Unable to read symbols defined in archive member #1 '2.o': Build attributes in section #10 are corrupted
  ls: cannot access 'lib.a': No such file or directory
  [2]
