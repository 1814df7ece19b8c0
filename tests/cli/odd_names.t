Names are bytes: whatever they hold, they go through every action and every message.

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
  $ round ' lead and trail '
  a -  lead and trail 
   lead and trail 
  rw-r--r--     0/     0      1 Jan 01 00:00 1970  lead and trail  (offset    150)
  x -  lead and trail 
  
  < lead and trail >
  
  x
  m -  lead and trail 
  Warning: L6875W: Adding non-ELF object ' lead and trail ' to archive 'lib.a'
  r -  lead and trail 
  d -  lead and trail 
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
  $ round "$(printf 'bad\377\376')"
  a - bad\xff\xfe (esc)
  bad\xff\xfe (esc)
  rw-r--r--     0/     0      1 Jan 01 00:00 1970 bad\xff\xfe (offset     72) (esc)
  x - bad\xff\xfe (esc)
  
  <bad\xff\xfe> (esc)
  
  x
  m - bad\xff\xfe (esc)
  Warning: L6875W: Adding non-ELF object 'bad\xff\xfe' to archive 'lib.a' (esc)
  r - bad\xff\xfe (esc)
  d - bad\xff\xfe (esc)
  $ round "$(printf 'bell\007')"
  a - bell\007
  bell\007
  rw-r--r--     0/     0      1 Jan 01 00:00 1970 bell\007 (offset     72)
  x - bell\007
  
  <bell\007>
  
  x
  m - bell\007
  Warning: L6875W: Adding non-ELF object 'bell\007' to archive 'lib.a'
  r - bell\007
  d - bell\007
  $ round "$(printf 'cr\015del\177')"
  a - cr\015del\177
  cr\015del\177
  rw-r--r--     0/     0      1 Jan 01 00:00 1970 cr\015del\177 (offset     72)
  x - cr\015del\177
  
  <cr\015del\177>
  
  x
  m - cr\015del\177
  Warning: L6875W: Adding non-ELF object 'cr\015del\177' to archive 'lib.a'
  r - cr\015del\177
  d - cr\015del\177
  $ round "$(printf 'tab\tx')"
  a - tab\tx (esc)
  tab\tx (esc)
  rw-r--r--     0/     0      1 Jan 01 00:00 1970 tab\tx (offset     72) (esc)
  x - tab\tx (esc)
  
  <tab\tx> (esc)
  
  x
  m - tab\tx (esc)
  Warning: L6875W: Adding non-ELF object 'tab\tx' to archive 'lib.a' (esc)
  r - tab\tx (esc)
  d - tab\tx (esc)
  $ round "$(printf 'line\nx')"
  a - line
  x
  line
  x
  rw-r--r--     0/     0      1 Jan 01 00:00 1970 line
  x (offset     72)
  x - line
  x
  
  <line
  x>
  
  x
  m - line
  x
  Warning: L6875W: Adding non-ELF object 'line
  x' to archive 'lib.a'
  r - line
  x
  d - line
  x
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
  $ round 'a"b'
  a - a"b
  a"b
  rw-r--r--     0/     0      1 Jan 01 00:00 1970 a"b (offset     72)
  x - a"b
  
  <a"b>
  
  x
  m - a"b
  Warning: L6875W: Adding non-ELF object 'a"b' to archive 'lib.a'
  r - a"b
  d - a"b
  $ round "$(printf 'an_extremely_long_name_with_\303\251_and_\001_and_%%s')"
  a - an_extremely_long_name_with_\xc3\xa9_and_\\001_and_%s (esc)
  an_extremely_long_name_with_\xc3\xa9_and_\\001_and_%s (esc)
  rw-r--r--     0/     0      1 Jan 01 00:00 1970 an_extremely_long_name_with_\xc3\xa9_and_\\001_and_%s (offset    178) (esc)
  x - an_extremely_long_name_with_\xc3\xa9_and_\\001_and_%s (esc)
  
  <an_extremely_long_name_with_\xc3\xa9_and_\\001_and_%s> (esc)
  
  x
  m - an_extremely_long_name_with_\xc3\xa9_and_\\001_and_%s (esc)
  Warning: L6875W: Adding non-ELF object 'an_extremely_long_name_with_\xc3\xa9_and_\\001_and_%s' to archive 'lib.a' (esc)
  r - an_extremely_long_name_with_\xc3\xa9_and_\\001_and_%s (esc)
  d - an_extremely_long_name_with_\xc3\xa9_and_\\001_and_%s (esc)

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
  $ library "$(printf 'esc\033.a')" a.o; quarn -t "$(printf 'esc\033.a')" none
  Error: L6831E: 'none' not present in archive 'esc\033.a'
  [1]

Names of any length are shown whole.

  $ for length in 1000 10000 20000 100000; do
  >   quarn -t lib.a "$(printf 'n%.0s' $(seq $length))" 2>&1 | wc -c
  > done
  1049
  10049
  20049
  100049

Contents are no text: they come out of -p unchanged.

  $ printf 'a\001\r\177\033' > raw; library lib.a raw; quarn -p lib.a | od -An -c
     a 001  \r 177 033
