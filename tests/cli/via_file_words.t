The words of an argument file: what divides them, what quotes and backslashes do, and how long one may be.

  $ . "$TESTDIR/setup.sh"
  $ file a.txt a
  $ file 'a b' ab
  $ library lib.a a.txt 'a b'

What the words are is shown by listing them back.

  $ via() { printf "$@" > via; quarn --show_cmdline --via via; }

  $ via -- '-t lib.a'
  [quarn --show_cmdline -t --via=via lib.a]
  a.txt
  a b
  $ via -- '-t\nlib.a\n'
  [quarn --show_cmdline -t --via=via lib.a]
  a.txt
  a b
  $ via -- '-t\r\nlib.a\r\n'
  [quarn --show_cmdline -t --via=via lib.a]
  a.txt
  a b
  $ via -- '\n\n  -t\t\f\v \rlib.a  \n\n'
  [quarn --show_cmdline -t --via=via lib.a]
  a.txt
  a b
  $ quarn -t lib.a --via=via
  Error: L6831E: 'lib.a' not present in archive 'lib.a'
  [1]

Quotes keep blanks in a word and are removed, wherever they stand; the other kind stays.

  $ via -- '-t lib.a "a b"'
  [quarn --show_cmdline -t --via=via lib.a "a b"]
  a b
  $ via -- "-t lib.a 'a b'"
  [quarn --show_cmdline -t --via=via lib.a "a b"]
  a b
  $ via -- '-t lib.a a" "b'
  [quarn --show_cmdline -t --via=via lib.a "a b"]
  a b
  $ via -- '-t lib.a ""'
  [quarn --show_cmdline -t --via=via lib.a ""]
  Error: L6831E: '' not present in archive 'lib.a'
  [1]
  $ via -- '-t lib.a '"'a \"b\" c'"
  [quarn --show_cmdline -t --via=via lib.a "a "b" c"]
  Error: L6831E: 'a "b" c' not present in archive 'lib.a'
  [1]
  $ via -- '-t lib.a "it'"'"'s"'
  [quarn --show_cmdline -t --via=via lib.a it's]
  Error: L6831E: 'it's' not present in archive 'lib.a'
  [1]

Parentheses keep blanks as well, and stay.

  $ via -- '-t lib.a name(a b)c'
  [quarn --show_cmdline -t --via=via lib.a "name(a b)c"]
  Error: L6831E: 'name(a b)c' not present in archive 'lib.a'
  [1]
  $ via -- '-t lib.a (a (b) c)'
  [quarn --show_cmdline -t --via=via lib.a "(a (b)" c)]
  Error: L6831E: '(a (b)' not present in archive 'lib.a'
  Error: L6831E: 'c)' not present in archive 'lib.a'
  [1]
  $ via -- '-t lib.a "(" ")"'
  [quarn --show_cmdline -t --via=via lib.a ( )]
  Error: L6831E: '(' not present in archive 'lib.a'
  Error: L6831E: ')' not present in archive 'lib.a'
  [1]

A backslash guards a quote, itself within quotes, and otherwise is a character like any other.

  $ literally() { printf '%s' "$1" > via; quarn -t lib.a --via via; }

  $ literally 'dir\file.o'
  Error: L6831E: 'dir\file.o' not present in archive 'lib.a'
  [1]
  $ literally '\\server\share'
  Error: L6831E: '\\server\share' not present in archive 'lib.a'
  [1]
  $ literally '\"a'
  Error: L6831E: '"a' not present in archive 'lib.a'
  [1]
  $ literally '"a\"b"'
  Error: L6831E: 'a"b' not present in archive 'lib.a'
  [1]
  $ literally "'a\"b'"
  Error: L6831E: 'a"b' not present in archive 'lib.a'
  [1]
  $ literally "'a\\\"b'"
  Error: L6831E: 'a"b' not present in archive 'lib.a'
  [1]
  $ literally "'a\\'b'"
  Error: L6831E: 'a'b' not present in archive 'lib.a'
  [1]
  $ literally '"a\\b"'
  Error: L6831E: 'a\b' not present in archive 'lib.a'
  [1]
  $ literally "'a\\\\b'"
  Error: L6831E: 'a\b' not present in archive 'lib.a'
  [1]
  $ literally '"a\'"'"'b"'
  Error: L6831E: 'a\'b' not present in archive 'lib.a'
  [1]
  $ literally "\\'a b'"
  Fatal error: L3906U: Malformed via file 'via'.
  [1]
  $ literally '"a\x"'
  Error: L6831E: 'a\x' not present in archive 'lib.a'
  [1]
  $ literally '"a\ b"'
  Error: L6831E: 'a\ b' not present in archive 'lib.a'
  [1]
  $ literally '(a\"b c)'
  Error: L6831E: '(a"b c)' not present in archive 'lib.a'
  [1]

Blanks and line ends outside quotes end a word all the same, and the backslash stays.

  $ literally 'dir\ next\
  > end\'
  Error: L6831E: 'dir\' not present in archive 'lib.a'
  Error: L6831E: 'next\' not present in archive 'lib.a'
  Error: L6831E: 'end\' not present in archive 'lib.a'
  [1]

A comment runs to the end of its line, also in the middle of a word and within quotes, and takes the line end with it.

  $ via -- '# all of it\n-t lib.a ; the rest\n'
  [quarn --show_cmdline -t --via=via lib.a]
  a.txt
  a b
  $ via -- '-t lib.a a#x\n.txt'
  [quarn --show_cmdline -t --via=via lib.a a.txt]
  a.txt
  $ via -- '-t lib.a "a#x"\n b"'
  [quarn --show_cmdline -t --via=via lib.a "a b"]
  a b
  $ via -- '-t#\r\nlib.a'
  [quarn --show_cmdline -t --via=via lib.a]
  a.txt
  a b

A quote may not span lines or stay open, nor a parenthesis.

  $ via -- '-t lib.a "a\nb"'
  Fatal error: L3906U: Malformed via file 'via'.
  [1]
  $ via -- "-t lib.a 'a"
  Fatal error: L3906U: Malformed via file 'via'.
  [1]
  $ via -- '-t lib.a (a\n)'
  Fatal error: L3906U: Malformed via file 'via'.
  [1]
  $ via -- '-t lib.a (a'
  Fatal error: L3906U: Malformed via file 'via'.
  [1]
  $ via -- '"a\rb"'
  Fatal error: L3906U: Malformed via file 'via'.
  [1]

A word and the one before it may have 1024 bytes together, each with its end.

  $ name=$(printf 'n%.0s' {1..1017})
  $ printf -- '-t\nlib.a %s\n' "$name" > via
  $ quarn --via via 2>&1 | head -c 20; echo
  Error: L6831E: 'nnnn
  $ printf -- '-t\nlib.a %sn\n' "$name" > via
  $ quarn --via via
  Fatal error: L3907U: Via file 'via' command too long for buffer.
  [1]
  $ printf -- '-t\nlib.a "%s"\n' "$name" > via
  $ quarn --via via
  Fatal error: L3907U: Via file 'via' command too long for buffer.
  [1]

A hundred thousand words are no trouble, wherever the pieces of the file end.

  $ { echo -t lib.a; yes a.txt | head -100000; } > many
  $ quarn --via many | sort | uniq -c | sed 's/^ *//'
  100000 a.txt
  $ { echo --show_cmdline -h; yes "a.txt \"a b\" 'a b' no\\x \"q\\\\\\\"\"" | head -20000 | sed 's/$/\r/'; } | head -c -2 > many
  $ quarn --via many 2>&1 > help | tr ' ' '\n' | sort | uniq -c | sed 's/^ *//'
  40000 "a
  1 --help
  1 --show_cmdline
  1 --via=many
  1 [quarn
  20000 a.txt
  40000 b"
  20000 no\x
  19999 q\"
  1 q\"]
  $ for blanks in $(seq 1015 1030); do
  >   { printf -- "-t%${blanks}slib.a %s %s" '' a.txt '"a b"'; } > via
  >   quarn --via via
  > done | sort | uniq -c | sed 's/^ *//'
  16 a b
  16 a.txt
