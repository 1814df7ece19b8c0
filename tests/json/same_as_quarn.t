The document has what quarn shows of the same library: members, symbols, sizes and entry points.

  $ . "$TESTDIR/../cli/setup.sh"
  $ same() {
  >   { quarn -tv "$1"; quarn --zs "$1"; quarn --sizes "$1"; quarn --entries "$1"; } > shown
  >   quarn-json "$1" | "$QUARN_PYTHON" "$TESTDIR/as_quarn_says.py" | diff shown - && wc -l < shown
  > }

Of what compilers make, in each class and byte order, alone and as builds of one module:

  $ for folder in "$QUARN_EXAMPLES" "$QUARN_OBJECTS"/{40-big,183-little,183-big}; do
  >   rm -f real.a; quarn --create --diag_suppress=6874,6876,6877 real.a "$folder"/*.o; same real.a
  > done
  341
  53
  53
  53

With an entry point, a file that is no object, and one that is damaged:

  $ cp "$QUARN_EXAMPLES/wide_plain.o" start.o; section start.o 2 flags 0x10000006; elf start.o entry 32772
  $ head -c 1000 start.o > broken.o; file notes.txt 'notes'
  $ quarn --create --normalise=1000000000 --diag_suppress=6875,6974 mixed.a start.o notes.txt broken.o; same mixed.a
  19

The table is that of the file, decorated names included. What builds there are is told by the members, whatever the
table says:

  $ field() {
  >   quarn-json "${@:2}" | "$QUARN_PYTHON" -c "import json, sys; library = json.load(sys.stdin)['libraries'][0]; print(*map(json.dumps, [$1]), sep='\n')"
  > }
  $ rm *.a *.o; variants '$ZEV_ISAv4$IEEE1' '$ZEV_ISAv5$IEEE1'
  gcd 1.o
  gcd$$BuildAttributes$$ZEV_ISAv5$IEEE1 2.o
  $ field "library['symbols']" lib.a
  [{"name": "gcd", "member": 0}, {"name": "gcd", "member": 1, "attributes": "$ZEV_ISAv5$IEEE1"}]
  $ field "library['variantGroups']" lib.a > groups; cat groups
  [{"attributes": "$ZEV_ISAv4$IEEE1", "variants": [{"member": 0, "isBase": true}, {"member": 1, "isBase": false, "decoration": "$ZEV_ISAv5$IEEE1", "isComplete": true}]}]
  $ quarn -n -s lib.a; field "library['symbolTable'], library['symbols']" lib.a
  null
  []
  $ field "library['variantGroups']" lib.a | diff groups -

Attribute sections count where they are asked for, as they do in a run of quarn that makes the table:

  $ field "[member['attributes'] for member in library['members']]" lib.a
  ["$ZEV_ISAv4$IEEE1", "$ZEV_ISAv5$IEEE1"]
  $ cp "$QUARN_EXAMPLES"/wide_{plain,build_d}.o .; quarn --create --qobix_buildattr --diag_suppress=6877 wide.a wide_*.o
  $ quarn --zs wide.a | grep -o 'gcd.*BuildAttributes[^ ]*'
  gcd$$BuildAttributes$$ZEV_ISAv3$P$D$K$B$S$IEEE1
  $ for option in '' --qobix_buildattr; do field "library['variantGroups'][0]['variants']" $option wide.a; done
  [{"member": 0, "isBase": true}, {"member": 1, "isBase": true}]
  [{"member": 0, "isBase": false, "decoration": "$ZEV_ISAv3$P$D$K$B$S$IEEE1", "isComplete": false}, {"member": 1, "isBase": true}]

Names keep their folders, which quarn does not show:

  $ file a.txt a; mkdir inner; file inner/b.txt b; quarn-ar rcP folders.a a.txt inner/b.txt; quarn -t folders.a
  a.txt
  b.txt
  $ field "*(member['name'] for member in library['members'])" folders.a
  "a.txt"
  "inner/b.txt"

What the library's name says is added to all:

  $ printf '*lib.a $J$IEEE1\n' > map
  $ field "library['attributes'], library['variantGroups'][0]['attributes']" --libattrmap=map lib.a
  "$J$IEEE1"
  "$ZEV_ISAv4$J$IEEE1"

Another format keeps names in front of the bytes, and objects are not seen behind them:

  $ { printf '!<arch>\n%-16s%-12s%-6s%-6s%-8s%-10s`\nwide' '#1/4' 0 0 0 644 $(( $(stat -c %s wide_plain.o) + 4 ))
  >   cat wide_plain.o; } > other.a
  $ field "[[member['name'], member['kind']] for member in library['members']]" other.a 2> /dev/null
  [["", "file"]]
