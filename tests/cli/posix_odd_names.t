Names of files are bytes: control bytes, quotes, blanks at the ends and what is no UTF-8 go through
every action and every message.

  $ . "$TESTDIR/setup.sh"
  $ round() {
  >   printf x > "$1"; quarn --create --normalise=1 --diag_suppress=L6875 -v lib.a "./$1" && quarn -t lib.a &&
  >   quarn -tv -- lib.a "$1" && mv -- "$1" kept && quarn -xv -- lib.a "$1" && cmp -- "$1" kept &&
  >   quarn -pv -- lib.a "$1" && echo && quarn -mv -- lib.a "$1" && quarn -rv -- lib.a "$1" &&
  >   quarn -dv -- lib.a "$1"
  >   rm -f -- "$1" kept
  > }

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

The archive may have such a name.

  $ file a.o a
  $ library "$(printf 'esc\033.a')" a.o; quarn -t "$(printf 'esc\033.a')" none
  Error: L6831E: 'none' not present in archive 'esc\033.a'
  [1]

An option may begin with any byte.

  $ quarn "-$(printf '\351')" lib.a
  Fatal error: L3900U: Unrecognized option '-\xe9'. (esc)
  [1]

Names of any length are shown whole.

  $ for length in 100000; do
  >   quarn -t lib.a "$(printf 'n%.0s' $(seq $length))" 2>&1 | wc -c
  > done
  100049
