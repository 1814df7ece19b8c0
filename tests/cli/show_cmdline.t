--show_cmdline writes back what the command line was understood to say.

  $ . "$TESTDIR/setup.sh"
  $ file a.txt a
  $ file 'my file' m
  $ library lib.a a.txt
  $ library 'my lib.a' a.txt
  $ show() { quarn --show_cmdline "$@" 2>&1 >/dev/null; }

It goes to the diagnostics and not to the listing.

  $ both quarn -t --show_cmdline lib.a
  out: a.txt
  err: [quarn --show_cmdline -t lib.a]
  status 0

One row stands for all spellings of an option, and options stand in a fixed order before the words.

  $ show lib.a a.txt -v -t
  [quarn --show_cmdline -t -v lib.a a.txt]
  $ show -V -t lib.a
  [quarn --show_cmdline --vsn -t lib.a]
  $ show -version -t lib.a
  Warning: L3910W: Old syntax, please use '--version'.
  [quarn --show_cmdline --vsn -t lib.a]
  $ show -q lib.a
  [quarn --show_cmdline -r lib.a]
  $ show -i a.txt -t lib.a
  [quarn --show_cmdline -t -ba.txt lib.a]
  $ show --create x.a a.txt --diag_suppress=6875
  [quarn --create --show_cmdline --diag_suppress=6875 x.a a.txt]
  $ show -C -T -c -n -s -u -v -x lib.a
  [quarn --show_cmdline -c -C -n -s -T -u -v -x lib.a]
  Error: L6836E: 'a.txt' already exists, so will not be extracted
  [1]
  $ show --new_files_only -r lib.a
  [quarn --show_cmdline -r --new_files_only lib.a]
  $ show --zs lib.a; show --zt lib.a; show --sizes lib.a; show --entries lib.a
  [quarn --show_cmdline --zs lib.a]
  [quarn --show_cmdline --zt lib.a]
  [quarn --show_cmdline --sizes lib.a]
  [quarn --show_cmdline --entries lib.a]
  $ show -h
  [quarn --help --show_cmdline]
  $ show -d lib.a; show -m lib.a; show -p lib.a
  [quarn --show_cmdline -d lib.a]
  [quarn --show_cmdline -m lib.a]
  [quarn --show_cmdline -p lib.a]

Values stand behind "=" for names and directly behind letters, numbers in decimal, styles by name.

  $ show --normalise=0x100 -t lib.a
  [quarn --show_cmdline -t --normalise=256 lib.a]
  $ show --no_normalise=-5 -t lib.a
  [quarn --show_cmdline -t --normalise=-5 lib.a]
  $ show -a a.txt -t lib.a
  [quarn --show_cmdline -t -aa.txt lib.a]
  $ show -b=a.txt -t lib.a
  [quarn --show_cmdline -t -ba.txt lib.a]
  $ show --diag_style=gnu -t lib.a
  [quarn --show_cmdline -t --diag_style=gnu lib.a]
  $ show --diag_style=IDE -t lib.a
  quarn : [quarn --show_cmdline -t --diag_style=ide lib.a]
  $ show --diag_style=devstudio -t lib.a
  quarn : [quarn --show_cmdline -t --diag_style=devstudio lib.a]
  $ show --db_check=high -t lib.a
  [quarn --show_cmdline -t --db_check=high lib.a]
  $ show --message_locale=en_US -t lib.a
  [quarn --show_cmdline -t --message_locale=en_US lib.a]
  $ show --libattrmap=nomap -t lib.a
  [quarn --show_cmdline -t --libattrmap=nomap lib.a]
  $ show --debug_symbols --unique_symbols --qobix_buildattr -t lib.a
  [quarn --show_cmdline -t --debug_symbols --unique_symbols --qobix_buildattr lib.a]

A value that is the default is not shown.

  $ show --normalise=0 --diag_style=zev --no_debug_symbols --no_unique_symbols --no_qobix_buildattr -t lib.a
  [quarn --show_cmdline -t lib.a]
  $ show --debug_symbols --no_debug_symbols -t lib.a
  [quarn --show_cmdline -t lib.a]

Each element of a list is shown.

  $ show --diag_error=L6874,L6876 --diag_error=1 --diag_warning=2 --diag_remark=3 --diag_suppress=4 -t lib.a
  [quarn --show_cmdline -t --diag_suppress=4 --diag_error=L6874 --diag_error=L6876 --diag_error=1 --diag_warning=2 --diag_remark=3 lib.a]
  $ show --diag_warning=Q12 -t lib.a
  [quarn --show_cmdline -t --diag_warning=Q12 lib.a]

A bad element was not taken.

  $ show --diag_error=L6874,0,L6876 -t lib.a
  Warning: L9962I: Unknown diagnostic number 0
  [quarn --show_cmdline -t --diag_error=L6874 --diag_error=L6876 lib.a]

Argument files are named, beside what they said.

  $ echo -t -a a.txt lib.a > words
  $ show --via words
  [quarn --show_cmdline -t -aa.txt --via=words lib.a]
  $ echo -t lib.a > more
  $ show --via=words,more
  [quarn --show_cmdline -t -aa.txt --via=words --via=more lib.a lib.a]
  Error: L6831E: 'lib.a' not present in archive 'lib.a'
  [1]

Words with blanks and empty ones are quoted.

  $ show -t 'my lib.a'
  [quarn --show_cmdline -t "my lib.a"]
  $ show -t lib.a ''
  [quarn --show_cmdline -t lib.a ""]
  Error: L6831E: '' not present in archive 'lib.a'
  [1]
  $ show -t "a$(printf '\t')b"
  [quarn --show_cmdline -t "a\tb"] (esc)
  Error: L6832E: Archive 'a\tb' not found : No such file or directory (esc)
  [1]
  $ show -a 'x y' -t lib.a
  [quarn --show_cmdline -t -a"x y" lib.a]
  Error: L6841E: Position 'x y' not found
  [1]
  $ show --libattrmap='m m' -t lib.a
  [quarn --show_cmdline -t --libattrmap="m m" lib.a]
  $ show -a '' -t lib.a
  [quarn --show_cmdline -t -a= lib.a]
  $ show --diag_error= -t lib.a
  [quarn --show_cmdline -t --diag_error= lib.a]
  $ show -t lib.a 'say "so"'
  [quarn --show_cmdline -t lib.a "say "so""]
  Error: L6831E: 'say "so"' not present in archive 'lib.a'
  [1]

The end of options is kept.

  $ show -t -- lib.a
  [quarn --show_cmdline -t -- lib.a]
  $ show -t -- lib.a -v
  [quarn --show_cmdline -t -- lib.a -v]
  Error: L6831E: '-v' not present in archive 'lib.a'
  [1]

Text is text, whatever it holds.

  $ show -t '%s%n.a'
  [quarn --show_cmdline -t %s%n.a]
  Error: L6832E: Archive '%s%n.a' not found : No such file or directory
  [1]
  $ show -t "$(printf 'c\001d.a')"
  [quarn --show_cmdline -t c\001d.a]
  Error: L6832E: Archive 'c\001d.a' not found : No such file or directory
  [1]
  $ show -t "$(printf '\303\251.a')"
  [quarn --show_cmdline -t \xc3\xa9.a] (esc)
  Error: L6832E: Archive '\xc3\xa9.a' not found : No such file or directory (esc)
  [1]

It is a remark that can't be silenced, in the location form of the style.

  $ show --diag_suppress=warning --diag_suppress=error -t lib.a
  [quarn --show_cmdline -t --diag_suppress=warning --diag_suppress=error lib.a]
  $ show --diag_style=ide --diag_suppress=L6875 -t lib.a
  quarn : [quarn --show_cmdline -t --diag_style=ide --diag_suppress=L6875 lib.a]

It comes before all that the command line asks for.

  $ both quarn --show_cmdline -r -d lib.a
  err: [quarn --show_cmdline -d -r lib.a]
  err: Error: L6840E: Only one action option may be specified
  status 1
  $ both quarn --show_cmdline --version_number
  out: 1000001
  err: [quarn --show_cmdline --version_number]
  status 0

A long command line is shown whole.

  $ show -t lib.a $(printf 'name%04d ' {1..1000}) | head -1 | wc -c
  9032
