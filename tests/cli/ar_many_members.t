A hundred thousand members, each told by its name, take no time to speak of: names are looked up, and not searched for.

  $ . "$TESTDIR/setup.sh"
  $ quick() { timeout 20 "$@"; }
  $ awk 'BEGIN {
  >   printf "!<arch>\n"
  >   for (i = 0; i < 100000; ++i) printf "%-16s%-12s%-6s%-6s%-8s%-10s`\nin", i ".txt/", 0, 0, 0, 644, 2
  > }' > lib.a
  $ quick quarn-ar t lib.a > words; wc -l < words; quick quarn-ar t lib.a @words | cmp - words
  100000
  $ quick quarn-ar p lib.a @words | wc -c
  200000
  $ tac words > back; quick quarn-ar m lib.a @back; quick quarn-ar t lib.a | cmp - back
  $ quick quarn-ranlib lib.a; quick quarn-ar t lib.a | cmp - back
  $ file new.txt new; quick quarn-ar rb 0.txt lib.a new.txt; quick quarn-ar t lib.a | tail -2
  new.txt
  0.txt
  $ quick quarn-ar dN 1 lib.a @words; quick quarn-ar t lib.a
  new.txt
