When files go in, words are looked up on disk; otherwise they are patterns for members.

  $ . "$TESTDIR/setup.sh"
  $ mkdir sub; for name in b.o a.o B.o c.txt .hidden.o; do file $name $name; file sub/$name "sub $name"; done
  $ create() { rm -f new.a; quarn -r -c -v --normalise=1 --diag_suppress=L6875 new.a "$@"; }

Names come sorted by their bytes, whatever the folder's order, hidden ones too.

  $ create '*.o'
  a - .hidden.o
  a - B.o
  a - a.o
  a - b.o
  $ create 'sub/*.o'
  a - .hidden.o
  a - B.o
  a - a.o
  a - b.o
  $ quarn -p new.a b.o; echo
  sub B.osub b.o
  $ create './sub/../*.txt' "$PWD/sub/?.txt"
  a - c.txt
  a - c.txt
  $ create '?.?'
  a - B.o
  a - a.o
  a - b.o

Case counts on disk.

  $ create 'b.*'
  a - b.o
  $ create 'B.*' 'c.TXT'
  a - B.o
  Error: L6833E: File 'c.TXT' does not exist
  [1]

Only the last part may be a pattern.

  $ create 's*/a.o'
  Error: L6833E: File 's*/a.o' does not exist
  [1]
  $ create 's?b/*.o'
  Error: L6833E: File 's?b/*.o' does not exist
  [1]

Only "?" and "*" are special.

  $ file '[ab].o' brackets; file 'star*.o' star; file 'que?.o' question
  $ create '[ab].o'
  a - [ab].o
  $ create 'star*.o'
  a - star*.o
  $ create 'que?.o'
  a - que?.o
  $ file starfish.o fish
  $ create 'star*.o'
  a - star*.o
  a - starfish.o
  $ create 'star\*.o'
  Error: L6833E: File 'star\*.o' does not exist
  [1]
  $ rm star* que* '[ab].o'

A word without a match stays as it is.

  $ create 'x*.o'
  Error: L6833E: File 'x*.o' does not exist
  [1]
  $ create 'nowhere/*.o'
  Error: L6833E: File 'nowhere/*.o' does not exist
  [1]
  $ create 'a.o' ''
  a - a.o
  Error: L6833E: File '' does not exist
  [1]

"." and ".." are never found, folders are, and are no files. A link that leads nowhere is found, too.

  $ mkdir d.dir; ln -s nothing l.dir
  $ create '*.dir'
  Error: L6835E: Reading file 'new.a' : Is a directory
  Error: L6833E: File 'l.dir' does not exist
  [1]
  $ create '.*.o' '..'
  a - .hidden.o
  Error: L6835E: Reading file 'new.a' : Is a directory
  [1]
  $ create sub
  Error: L6835E: Reading file 'new.a' : Is a directory
  [1]
  $ create sub/
  Error: L6835E: Reading file 'new.a' : Is a directory
  [1]

A folder that can't be read has no matches.

  $ chmod 755 .; mkdir closed; file closed/a.o a; chmod 000 closed
  $ asNobody -rc nobody.a 'closed/*.o'
  Error: L6833E: File 'closed/*.o' does not exist
  [1]
  $ chmod 755 closed

Words of other actions are not expanded, unless there is a position.

  $ create a.o c.txt
  a - a.o
  a - c.txt
  $ cd sub; rm a.o
  $ quarn -t ../new.a '*.o'
  a.o
  $ quarn -t -a a.o ../new.a '*.o' 2>&1
  Error: L6831E: '.hidden.o' not present in archive '../new.a'
  Error: L6831E: 'B.o' not present in archive '../new.a'
  Error: L6831E: 'b.o' not present in archive '../new.a'
  [1]
  $ quarn -d ../new.a '*.o' -b c.txt 2>&1
  Warning: L6831E: '.hidden.o' not present in archive '../new.a'
  Warning: L6831E: 'B.o' not present in archive '../new.a'
  Warning: L6831E: 'b.o' not present in archive '../new.a'
