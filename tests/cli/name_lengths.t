Names of any length: those of up to 15 bytes in the header, the others in a table.

  $ . "$TESTDIR/setup.sh"
  $ lengths() { awk '{ print length($0) }' | xargs; }
  $ zeros() { printf "%0$1d" 7; }
  $ for length in 1 14 15 16 17 255; do file "$(zeros $length)" "$length"; done; file new.txt new

As the names of files.

  $ quarn --create --normalise=1 --diag_suppress=6875 lib.a 7 0*7; quarn -t lib.a | lengths
  1 255 17 16 15 14
  $ tr -d '\0' < lib.a | grep -ao '.\{58\}`$' | cut -c 1-16 | tr ' ' .
  /...............
  //..............
  7/..............
  /0..............
  /257............
  /276............
  000000000000007/
  00000000000007/.
  $ quarn-ar rc plain.a 7 0*7; quarn-ar t plain.a | lengths
  1 255 17 16 15 14
  $ for length in 1 14 15 16 17 255; do
  >   quarn -p lib.a "$(zeros $length)"; quarn-ar p lib.a "$(zeros $length)"; echo
  >   quarn -m lib.a "$(zeros $length)"; quarn -rv --normalise=1 --diag_suppress=6875 lib.a "$(zeros $length)" | wc -c
  > done | xargs
  11 6 1414 19 1515 20 1616 21 1717 22 255255 260
  $ quarn -t lib.a | lengths
  1 14 15 16 17 255
  $ quarn -d lib.a "$(zeros 16)"; quarn -t lib.a | lengths; quarn-ar d plain.a "$(zeros 15)" "$(zeros 255)"; quarn-ar t plain.a | lengths
  1 14 15 17 255
  1 17 16 14

Longer ones than files have come from other archives, and are as good.

  $ named() { head -c "$1" /dev/zero | tr '\0' n; }
  $ long() { { magic; header // 0 0 0 0 $(( $1 + 2 )); named "$1"; printf '/\n'; [ $(( $1 % 2 )) = 0 ] || echo; header /0 0 0 0 644 2; printf in; } > long.a; }
  $ for length in 255 256 1029 1030 4095 4096 4097 20000; do
  >   name=$(named $length); long $length; quarn -r --normalise=1 --diag_suppress=6875 long.a new.txt
  >   quarn --create --normalise=1 --diag_suppress=6875 copy.a long.a; quarn-ar m copy.a "$name"; quarn -t copy.a | lengths
  >   quarn -m long.a "$name"; quarn -p long.a "$name"; quarn-ar p long.a "$name"; quarn -t long.a 'n*n' | lengths
  >   quarn -rv --diag_suppress=6875 copy.a long.a | lengths; quarn -d long.a "$name"; quarn -t long.a
  > done
  7 255
  inin255
  11 259
  new.txt
  7 256
  inin256
  11 260
  new.txt
  7 1029
  inin1029
  11 1033
  new.txt
  7 1030
  inin1030
  11 1034
  new.txt
  7 4095
  inin4095
  11 4099
  new.txt
  7 4096
  inin4096
  11 4100
  new.txt
  7 4097
  inin4097
  11 4101
  new.txt
  7 20000
  inin20000
  11 20004
  new.txt

The words of the tool are compared up to their 1029th byte, and those of quarn-ar whole.

  $ same=$(named 1029); table="${same}1/"$'\n'"${same}2/"$'\n'
  $ { magic; member // "$table"; member /0 1; member /1032 2; } > two.a
  $ quarn -p two.a "${same}1"; echo; quarn -p two.a "${same}3"; echo; quarn-ar p two.a "${same}2"; echo
  12
  12
  2
  $ quarn-ar t two.a "${same}3" 2>&1 | sed 's/n\{1029\}/<1029>/'
  quarn-ar: Error: L6831E: '<1029>3' not present in archive 'two.a'
  $ quarn -d two.a "${same}1"; quarn -t two.a
