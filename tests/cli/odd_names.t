Names go through every action and every message, whatever they hold. What only some hosts have in
names of files is in a transcript of its own.

  $ . "$TESTDIR/setup.sh"
  $ round() {
  >   printf x > "$1"; quarn --create --normalise=1 --diag_suppress=L6875 -v lib.a "./$1" && quarn -t lib.a &&
  >   quarn -tv -- lib.a "$1" && mv -- "$1" kept && quarn -xv -- lib.a "$1" && cmp -- "$1" kept &&
  >   quarn -pv -- lib.a "$1" && echo && quarn -mv -- lib.a "$1" && quarn -rv -- lib.a "$1" &&
  >   quarn -dv -- lib.a "$1"
  >   rm -f -- "$1" kept
  > }

  $ round 'two words'
  a - two words
  two words
  rw-r--r--     0/     0      1 Jan 01 00:00 1970 two words (offset     72)
  x - two words
  
  <two words>
  
  x
  m - two words
  Warning: L6875W: Adding non-ELF object 'two words' to archive 'lib.a'
  r - two words
  d - two words
  $ round '%s%n%d'
  a - %s%n%d
  %s%n%d
  rw-r--r--     0/     0      1 Jan 01 00:00 1970 %s%n%d (offset     72)
  x - %s%n%d
  
  <%s%n%d>
  
  x
  m - %s%n%d
  Warning: L6875W: Adding non-ELF object '%s%n%d' to archive 'lib.a'
  r - %s%n%d
  d - %s%n%d
  $ round '-dash'
  a - -dash
  -dash
  rw-r--r--     0/     0      1 Jan 01 00:00 1970 -dash (offset     72)
  x - -dash
  
  <-dash>
  
  x
  m - -dash
  Warning: L6875W: Adding non-ELF object '-dash' to archive 'lib.a'
  r - -dash
  d - -dash
  $ round "$(printf 'caf\303\251')"
  a - caf\xc3\xa9 (esc)
  caf\xc3\xa9 (esc)
  rw-r--r--     0/     0      1 Jan 01 00:00 1970 caf\xc3\xa9 (offset     72) (esc)
  x - caf\xc3\xa9 (esc)
  
  <caf\xc3\xa9> (esc)
  
  x
  m - caf\xc3\xa9 (esc)
  Warning: L6875W: Adding non-ELF object 'caf\xc3\xa9' to archive 'lib.a' (esc)
  r - caf\xc3\xa9 (esc)
  d - caf\xc3\xa9 (esc)
  $ round "it's"
  a - it's
  it's
  rw-r--r--     0/     0      1 Jan 01 00:00 1970 it's (offset     72)
  x - it's
  
  <it's>
  
  x
  m - it's
  Warning: L6875W: Adding non-ELF object 'it's' to archive 'lib.a'
  r - it's
  d - it's

Not found, they are shown as they are; only control bytes become numbers.

  $ quarn -t lib.a "$(printf 'caf\303\251')" '%s%s%n' "$(printf 'a\001b\033[1m')" 'back\slash' 'a\nb'
  Error: L6831E: 'caf\xc3\xa9' not present in archive 'lib.a' (esc)
  Error: L6831E: '%s%s%n' not present in archive 'lib.a'
  Error: L6831E: 'a\001b\033[1m' not present in archive 'lib.a'
  Error: L6831E: 'back\slash' not present in archive 'lib.a'
  Error: L6831E: 'a\nb' not present in archive 'lib.a'
  [1]
  $ quarn -t "$(printf 'no\002.a')"
  Error: L6832E: Archive 'no\002.a' not found : No such file or directory
  [1]
  $ quarn -r lib.a '%s' "$(printf '\177\r')"
  Error: L6833E: File '%s' does not exist
  Error: L6833E: File '\177\015' does not exist
  [1]

The archive may have such a name, also in reports on its contents.

  $ printf '!<arch>\njunk' > 'per%scent.a'
  $ quarn -t 'per%scent.a'
  Error: L6829E: 'per%scent.a': malformed archive: End of file in the middle of archive member header starting at offset 8
  [1]
  $ file a.o a

Names of any length are shown whole.

  $ for length in 1000 10000 20000; do
  >   quarn -t lib.a "$(printf 'n%.0s' $(seq $length))" 2>&1 | wc -c
  > done
  1049
  10049
  20049

Contents are no text: they come out of -p unchanged.

  $ printf 'a\001\r\177\033' > raw; library lib.a raw; quarn -p lib.a | od -An -c
     a 001  \r 177 033
