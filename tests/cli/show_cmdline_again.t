What --show_cmdline writes can be given to the tool again, and means the same.

  $ . "$TESTDIR/setup.sh"
  $ file a.txt a; file 'a b' ab; file ' ' blank; file "$(printf 'tab\tx')" tab; file ./-dash dash; file "$(printf '\303\251\377')" bytes
  $ library lib.a a.txt 'a b' ' ' "$(printf 'tab\tx')" ./-dash "$(printf '\303\251\377')"
  $ cp lib.a 'my lib.a'; cp lib.a ' '; cp lib.a start.a
  $ printf '*_x* $IEEE1$ZEV_ISAv4\n' > 'a map'

The line goes through the shell once more, which knows blanks and double quotes as the tool does. What was said of
the words before it is left out.

  $ again() {
  >   cp start.a lib.a; cp start.a 'my lib.a'; cp start.a ' '
  >   { quarn --show_cmdline "$@" 2>&1; echo "status $?"; } | sed -n '/\[quarn /,$p' > first
  >   cp lib.a first.a; cp 'my lib.a' first.my.a; cp ' ' first.blank.a
  >   line=$(head -1 first); line=${line#*'[quarn '}
  >   cp start.a lib.a; cp start.a 'my lib.a'; cp start.a ' '
  >   set -f; eval "quarn ${line%]}" > second 2>&1; echo "status $?" >> second; set +f
  >   cmp lib.a first.a; cmp 'my lib.a' first.my.a; cmp ' ' first.blank.a; cmp first second; cat second
  > }

Words with blanks and tabs, of nothing but blanks, and empty ones.

  $ again -t 'my lib.a' 'a b' "$(printf 'tab\tx')" ' '
  [quarn --show_cmdline -t "my lib.a" "a b" "tab\tx" " "] (esc)
  a b
  tab\tx (esc)
   
  status 0
  $ again -t ' ' ' ' ''
  [quarn --show_cmdline -t " " " " ""]
   
  Error: L6831E: '' not present in archive ' '
  status 1
  $ again -t lib.a '' '  ' "$(printf '\t')" ''
  [quarn --show_cmdline -t lib.a "" "  " "\t" ""] (esc)
  Error: L6831E: '' not present in archive 'lib.a'
  Error: L6831E: '  ' not present in archive 'lib.a'
  Error: L6831E: '\t' not present in archive 'lib.a' (esc)
  Error: L6831E: '' not present in archive 'lib.a'
  status 1
  $ again -t '' lib.a | head -2
  [quarn --show_cmdline -t "" lib.a]
  Error: L6838E: No archive specified

Values with blanks, empty ones, and those that begin as if they were something else.

  $ again -m -a 'a b' lib.a a.txt
  [quarn --show_cmdline -m -a"a b" lib.a a.txt]
  status 0
  $ again -m -b ' ' -v 'my lib.a' a.txt
  [quarn --show_cmdline -m -v -b" " "my lib.a" a.txt]
  m - a.txt
  status 0
  $ again -m -a "$(printf 'tab\tx')" lib.a 'a b'
  [quarn --show_cmdline -m -a"tab\tx" lib.a "a b"] (esc)
  status 0
  $ again -m -b=-dash lib.a "$(printf '\303\251\377')"
  [quarn --show_cmdline -m -b-dash lib.a \xc3\xa9\xff] (esc)
  status 0
  $ again -t -a '' lib.a
  [quarn --show_cmdline -t -a= lib.a]
  a.txt
  a b
   
  tab\tx (esc)
  -dash
  \xc3\xa9\xff (esc)
  status 0
  $ again -t -a '=x' lib.a
  [quarn --show_cmdline -t -a==x lib.a]
  Error: L6841E: Position '=x' not found
  status 1
  $ again -t -b ',x y' lib.a
  [quarn --show_cmdline -t -b=",x y" lib.a]
  Error: L6841E: Position ',x y' not found
  status 1
  $ again -t -a -t lib.a
  [quarn --show_cmdline -t -a-t lib.a]
  Error: L6841E: Position '-t' not found
  status 1
  $ again -t -b -- lib.a
  [quarn --show_cmdline -t -b-- lib.a]
  Error: L6841E: Position '--' not found
  status 1
  $ again -t --libattrmap= --diag_error= --db_check= lib.a a.txt
  [quarn --show_cmdline -t --db_check= --diag_error= --libattrmap= lib.a a.txt]
  a.txt
  status 0
  $ again -t --libattrmap '=a,b' lib.a a.txt
  [quarn --show_cmdline -t --libattrmap==a,b lib.a a.txt]
  a.txt
  status 0
  $ again -s --libattrmap='a map' --diag_error='L6875 ,x y,' -- lib.a
  [quarn --show_cmdline -s --diag_error="L6875 " --diag_error="x y" --diag_error= --libattrmap="a map" -- lib.a]
  status 0
  $ again -t --diag_error,L1,L2 --normalise=0x10 --diag_style=IDE lib.a a.txt
  quarn : [quarn --show_cmdline -t --normalise=16 --diag_style=ide --diag_error=L1 --diag_error=L2 lib.a a.txt]
  a.txt
  status 0

Words that would be options.

  $ again -tv -- lib.a -dash --create --
  [quarn --show_cmdline -t -v -- lib.a -dash --create --]
  rw-r--r--     0/     0      4 Sep 09 01:46 2001 -dash (offset    326)
  Error: L6831E: '--create' not present in archive 'lib.a'
  Error: L6831E: '--' not present in archive 'lib.a'
  status 1
  $ again -t - -
  [quarn --show_cmdline -t - -]
  Error: L6832E: Archive '-' not found : No such file or directory
  status 1

Bytes of any kind.

  $ again -t lib.a "$(printf '\303\251\377')" '*' '%s%n' 'a=b' '?]'
  [quarn --show_cmdline -t lib.a \xc3\xa9\xff * %s%n a=b ?]] (esc)
  \xc3\xa9\xff (esc)
  a.txt
  a b
   
  tab\tx (esc)
  -dash
  \xc3\xa9\xff (esc)
  Error: L6831E: '%s%n' not present in archive 'lib.a'
  Error: L6831E: 'a=b' not present in archive 'lib.a'
  Error: L6831E: '?]' not present in archive 'lib.a'
  status 1
  $ again -d -v lib.a "$(printf '\303\251\377')" 'a b'
  [quarn --show_cmdline -d -v lib.a \xc3\xa9\xff "a b"] (esc)
  d - \xc3\xa9\xff (esc)
  d - a b
  status 0

