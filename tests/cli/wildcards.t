"?" stands for one character, "*" for any run, letters for either case, in the last part of a name.

  $ . "$TESTDIR/setup.sh"
  $ { magic; for name in a ab abc ABC abcd b.o a.b.c '[x]' 'q?' 'q*'; do member "$name/" x; done; } > lib.a
  $ list() { quarn -t lib.a "$@" | tr '\n' ' '; echo; }

  $ list '?'
  a 
  $ list '??'
  ab q? q* 
  $ list 'a?c'
  abc ABC 
  $ list 'a*'
  a ab abc ABC abcd a.b.c 
  $ list '*'
  a ab abc ABC abcd b.o a.b.c [x] q? q* 
  $ list '**'
  a ab abc ABC abcd b.o a.b.c [x] q? q* 
  $ list '*c'
  abc ABC a.b.c 
  $ list '*b*'
  ab abc ABC abcd b.o a.b.c 
  $ list 'a*b*c'
  abc ABC a.b.c 
  $ list 'a**c'
  abc ABC a.b.c 
  $ list '*.*'
  b.o a.b.c 
  $ list '?*?*?*?'
  abcd a.b.c 
  $ list 'ABC'
  abc ABC 
  $ list 'abc*'
  abc ABC abcd 
  $ list 'abcd*'
  abcd 
  $ list 'abcde*'
  Error: L6831E: 'abcde*' not present in archive 'lib.a'
  
  $ list 'abcd?'
  Error: L6831E: 'abcd?' not present in archive 'lib.a'
  
  $ list '*?'
  a ab abc ABC abcd b.o a.b.c [x] q? q* 

Brackets, braces and backslashes mean nothing; a backslash separates folders, as "/" does.

  $ list '[x]'
  [x] 
  $ list '[ab]'
  Error: L6831E: '[ab]' not present in archive 'lib.a'
  
  $ list '{a,b}'
  Error: L6831E: '{a,b}' not present in archive 'lib.a'
  
  $ list 'q\?'
  a 
  $ list 'dir/a?'
  ab 
  $ list 'dir\a?'
  ab 
  $ list '*/ab'
  ab 
  $ list 'a/'
  Error: L6831E: 'a/' not present in archive 'lib.a'
  

A pattern of many stars takes no time.

  $ name=$(printf 'a%.0s' {1..1000})
  $ { magic; header // 0 0 0 0 1002; printf "$name/\n"; header /0 0 0 0 644 0; } > long.a
  $ timeout 5 quarn -t long.a "$(printf 'a*%.0s' {1..300})b" 2>&1 | tail -c 36
  *b' not present in archive 'long.a'
  $ timeout 5 quarn -t long.a "$(printf '*a%.0s' {1..300})" | wc -c
  1001

Other alphabets have no cases.

  $ { magic; member "$(printf '\303\251')/" x; } > utf.a
  $ quarn -t utf.a "$(printf '\303\251')"
  \xc3\xa9 (esc)
  $ quarn -t utf.a "$(printf '\303\211')"
  Error: L6831E: '\xc3\x89' not present in archive 'utf.a' (esc)
  [1]
  $ quarn -t utf.a '??'
  \xc3\xa9 (esc)
