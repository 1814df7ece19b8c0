Blanks, UTF-8 and bytes that are no UTF-8 in the names of members: each action takes them as they are.

  $ . "$TESTDIR/setup.sh"; . "$TESTDIR/odd_names.sh"

Insertion, by both letters and into a new archive, and its messages.

  $ quarn -q --normalise=1 -v lib.a plain.o "${odd[@]}"; cp lib.a start.a
  a - plain.o
  a - two  words.o
  a - caf\xc3\xa9.o (esc)
  a - \xff\x80bad\xfe.o (esc)
  a -  a long name, \xc3\xa9 \xff.o (esc)
  Creating archive 'lib.a'
  $ quarn -r --normalise=1 -v lib.a "${odd[@]}"; cmp lib.a start.a
  r - two  words.o
  r - caf\xc3\xa9.o (esc)
  r - \xff\x80bad\xfe.o (esc)
  r -  a long name, \xc3\xa9 \xff.o (esc)
  $ quarn --create --normalise=1 -v made.a plain.o "${odd[@]}"; cmp made.a start.a
  a - plain.o
  a - two  words.o
  a - caf\xc3\xa9.o (esc)
  a - \xff\x80bad\xfe.o (esc)
  a -  a long name, \xc3\xa9 \xff.o (esc)
  $ names lib.a
  plain.o
  two  words.o
  caf\xc3\xa9.o (esc)
  \xff\x80bad\xfe.o (esc)
   a long name, \xc3\xa9 \xff.o (esc)

The bytes in the file: short names in their headers, the long one in the table, shown as each header's first field.

  $ quarn -tv lib.a
  rw-r--r--     0/     0   5480 Jan 01 00:00 1970 plain.o (offset    652)
  rw-r--r--     0/     0   2448 Jan 01 00:00 1970 two  words.o (offset   6192)
  rw-r--r--     0/     0   2292 Jan 01 00:00 1970 caf\xc3\xa9.o (offset   8700) (esc)
  rw-r--r--     0/     0   8916 Jan 01 00:00 1970 \xff\x80bad\xfe.o (offset  11052) (esc)
  rw-r--r--     0/     0   2764 Jan 01 00:00 1970  a long name, \xc3\xa9 \xff.o (offset  20028) (esc)
  $ for at in $(quarn -tv lib.a | sed 's/.*(offset *\([0-9]*\))$/\1/'); do tail -c +$(( at + 1 )) lib.a | head -c 16 | tr ' ' .; echo; done
  plain.o/........
  two..words.o/...
  caf\xc3\xa9.o/........ (esc)
  \xff\x80bad\xfe.o/....... (esc)
  /0..............
  $ grep -a -c "^$long/\$" lib.a
  1
  $ printf '%s\n' "${odd[@]}" > wanted; names lib.a "${odd[@]}" > found; cmp wanted found

Listings, all and by name.

  $ for name in "${odd[@]}"; do names lib.a "$name"; quarn -tv lib.a "$name"; done
  two  words.o
  rw-r--r--     0/     0   2448 Jan 01 00:00 1970 two  words.o (offset   6192)
  caf\xc3\xa9.o (esc)
  rw-r--r--     0/     0   2292 Jan 01 00:00 1970 caf\xc3\xa9.o (offset   8700) (esc)
  \xff\x80bad\xfe.o (esc)
  rw-r--r--     0/     0   8916 Jan 01 00:00 1970 \xff\x80bad\xfe.o (offset  11052) (esc)
   a long name, \xc3\xa9 \xff.o (esc)
  rw-r--r--     0/     0   2764 Jan 01 00:00 1970  a long name, \xc3\xa9 \xff.o (offset  20028) (esc)
  $ quarn --zs lib.a | sed 's/^[a-z_]* *//' | sort | uniq -c | sed 's/^ *//'
  1 4_apply           from plain.o    at offset    652
  1 4_identity        from plain.o    at offset    652
  1 4_multiply        from plain.o    at offset    652
  7 from  a long name, \xc3\xa9 \xff.o at offset  20028 (esc)
  7 from caf\xc3\xa9.o    at offset   8700 (esc)
  2 from plain.o    at offset    652
  10 from two  words.o at offset   6192
  3 from \xff\x80bad\xfe.o   at offset  11052 (esc)
  $ quarn --sizes lib.a
  
        Code    RO Data    RW Data    ZI Data      Debug   Object Name
        2992         40          0          0          0   plain.o
         912         80          0          0          0   two  words.o
         908         40          0      65552          0   caf\xc3\xa9.o (esc)
        4592          8          0          8          0   \xff\x80bad\xfe.o (esc)
        1624         56          0          0          0    a long name, \xc3\xa9 \xff.o (esc)
       11028        224          0      65560          0   TOTAL
  
  $ quarn --sizes lib.a "$blank" "$bytes"
  
        Code    RO Data    RW Data    ZI Data      Debug   Object Name
        2992         40          0          0          0   plain.o
         912         80          0          0          0   two  words.o
         908         40          0      65552          0   caf\xc3\xa9.o (esc)
        4592          8          0          8          0   \xff\x80bad\xfe.o (esc)
        1624         56          0          0          0    a long name, \xc3\xa9 \xff.o (esc)
       11028        224          0      65560          0   TOTAL
  
  $ quarn --entries lib.a
  ENTRY at offset 0 in section .text of two  words.o
  ENTRY at offset 0 in section .text of caf\xc3\xa9.o (esc)
  ENTRY at offset 0 in section .text of \xff\x80bad\xfe.o (esc)
  ENTRY at offset 0 in section .text of  a long name, \xc3\xa9 \xff.o (esc)
  $ quarn --entries lib.a "$utf8"
  ENTRY at offset 0 in section .text of two  words.o
  ENTRY at offset 0 in section .text of caf\xc3\xa9.o (esc)
  ENTRY at offset 0 in section .text of \xff\x80bad\xfe.o (esc)
  ENTRY at offset 0 in section .text of  a long name, \xc3\xa9 \xff.o (esc)
  $ quarn --zt lib.a "$long"
  
        Code    RO Data    RW Data    ZI Data      Debug   Object Name
        2992         40          0          0          0   plain.o
         912         80          0          0          0   two  words.o
         908         40          0      65552          0   caf\xc3\xa9.o (esc)
        4592          8          0          8          0   \xff\x80bad\xfe.o (esc)
        1624         56          0          0          0    a long name, \xc3\xa9 \xff.o (esc)
       11028        224          0      65560          0   TOTAL
  
  ENTRY at offset 0 in section .text of two  words.o
  ENTRY at offset 0 in section .text of caf\xc3\xa9.o (esc)
  ENTRY at offset 0 in section .text of \xff\x80bad\xfe.o (esc)
  ENTRY at offset 0 in section .text of  a long name, \xc3\xa9 \xff.o (esc)

Positions, for moves and insertions, with both letters and both ways to write them.

  $ quarn -m -v -b "$utf8" lib.a "$bytes"; names lib.a
  m - \xff\x80bad\xfe.o (esc)
  plain.o
  two  words.o
  \xff\x80bad\xfe.o (esc)
  caf\xc3\xa9.o (esc)
   a long name, \xc3\xa9 \xff.o (esc)
  $ quarn -m -v "-a$long" lib.a "$blank" plain.o; names lib.a
  m - two  words.o
  m - plain.o
  \xff\x80bad\xfe.o (esc)
  caf\xc3\xa9.o (esc)
   a long name, \xc3\xa9 \xff.o (esc)
  two  words.o
  plain.o
  $ quarn -r -v "-i=$bytes" lib.a plain.o "$long"; names lib.a
  r - plain.o
  r -  a long name, \xc3\xa9 \xff.o (esc)
  \xff\x80bad\xfe.o (esc)
  caf\xc3\xa9.o (esc)
   a long name, \xc3\xa9 \xff.o (esc)
  two  words.o
  plain.o
  $ quarn -r -v -a "$blank" lib.a "$utf8"; names lib.a
  r - caf\xc3\xa9.o (esc)
  \xff\x80bad\xfe.o (esc)
  caf\xc3\xa9.o (esc)
   a long name, \xc3\xa9 \xff.o (esc)
  two  words.o
  plain.o
  $ cp start.a lib.a

Printing and extracting.

  $ quarn -p lib.a "$bytes" "$blank" | cmp - <(cat "./$bytes" "$blank")
  $ quarn -pv lib.a "$utf8" | head -c 12
  
  <caf\xc3\xa9.o> (esc)
  
  $ mkdir out; cd out; quarn -xv ../lib.a; for name in *.o; do cmp -- "$name" "../$name"; done
  x - plain.o
  x - two  words.o
  x - caf\xc3\xa9.o (esc)
  x - \xff\x80bad\xfe.o (esc)
  x -  a long name, \xc3\xa9 \xff.o (esc)
  $ quarn -xvC ../lib.a "${odd[@]}"
  Error: L6836E: 'two  words.o' already exists, so will not be extracted
  Error: L6836E: 'caf\xc3\xa9.o' already exists, so will not be extracted (esc)
  Error: L6836E: '\xff\x80bad\xfe.o' already exists, so will not be extracted (esc)
  Error: L6836E: ' a long name, \xc3\xa9 \xff.o' already exists, so will not be extracted (esc)
  [1]
  $ rm *.o; quarn -x ../lib.a "${odd[@]}"; ls -b; cd ..
  \ a\ long\ name,\ \303\251\ \377.o
  caf\303\251.o
  two\ \ words.o
  \377\200bad\376.o

Deleting.

  $ quarn -dv lib.a "$blank" "$bytes"; names lib.a
  d - two  words.o
  d - \xff\x80bad\xfe.o (esc)
  plain.o
  caf\xc3\xa9.o (esc)
   a long name, \xc3\xa9 \xff.o (esc)
  $ quarn -dv lib.a "$long" "$utf8" "$blank"; names lib.a
  d -  a long name, \xc3\xa9 \xff.o (esc)
  d - caf\xc3\xa9.o (esc)
  Warning: L6831E: 'two  words.o' not present in archive 'lib.a'
  plain.o
  $ cp start.a lib.a
