The long listing shows mode, owner, size, date, name and place.

  $ . "$TESTDIR/setup.sh"

Each of the nine bits of the mode has its place; other bits don't show.

  $ { magic; for mode in 0 1 2 4 10 20 40 100 200 400 777 644 755 7777 100644 40755 1234567; do header $mode/ 0 0 0 $mode 0; done; } > modes.a
  $ quarn -tv modes.a
  ---------     0/     0      0 Jan 01 00:00 1970 0 (offset      8)
  --------x     0/     0      0 Jan 01 00:00 1970 1 (offset     68)
  -------w-     0/     0      0 Jan 01 00:00 1970 2 (offset    128)
  ------r--     0/     0      0 Jan 01 00:00 1970 4 (offset    188)
  -----x---     0/     0      0 Jan 01 00:00 1970 10 (offset    248)
  ----w----     0/     0      0 Jan 01 00:00 1970 20 (offset    308)
  ---r-----     0/     0      0 Jan 01 00:00 1970 40 (offset    368)
  --x------     0/     0      0 Jan 01 00:00 1970 100 (offset    428)
  -w-------     0/     0      0 Jan 01 00:00 1970 200 (offset    488)
  r--------     0/     0      0 Jan 01 00:00 1970 400 (offset    548)
  rwxrwxrwx     0/     0      0 Jan 01 00:00 1970 777 (offset    608)
  rw-r--r--     0/     0      0 Jan 01 00:00 1970 644 (offset    668)
  rwxr-xr-x     0/     0      0 Jan 01 00:00 1970 755 (offset    728)
  rwxrwxrwx     0/     0      0 Jan 01 00:00 1970 7777 (offset    788)
  rw-r--r--     0/     0      0 Jan 01 00:00 1970 100644 (offset    848)
  rwxr-xr-x     0/     0      0 Jan 01 00:00 1970 40755 (offset    908)
  r-xrw-rwx     0/     0      0 Jan 01 00:00 1970 1234567 (offset    968)

Numbers have their column and grow out of it.

  $ { magic; header a/ 0 999999 999999 644 0; header b/ 0 1 22 644 6; printf 123456; } > wide.a
  $ quarn -tv wide.a
  rw-r--r--999999/999999      0 Jan 01 00:00 1970 a (offset      8)
  rw-r--r--     1/    22      6 Jan 01 00:00 1970 b (offset     68)
  $ head -c 12345678 /dev/zero > big; library big.a big big
  $ quarn -tv big.a
  rw-r--r--     0/     012345678 Sep 09 01:46 2001 big (offset     72)
  rw-r--r--     0/     012345678 Sep 09 01:46 2001 big (offset 12345810)

Dates are local time.

  $ { magic; header a/ 1700000000 0 0 644 0; header b/ 951826500 0 0 644 0; header c/ 4102444800 0 0 644 0; } > dates.a
  $ quarn -tv dates.a | cut -c 31-49
  Nov 14 22:13 2023 a
  Feb 29 12:15 2000 b
  Jan 01 00:00 2100 c
  $ TZ=EST5EDT,M3.2.0,M11.1.0 quarn -tv dates.a a b | cut -c 31-49
  Nov 14 17:13 2023 a
  Feb 29 07:15 2000 b
  $ TZ=XYZ-5:30 quarn -tv dates.a a | cut -c 31-49
  Nov 15 03:43 2023 a
  $ LC_ALL=ja_JP.UTF-8 LC_TIME=de_DE.UTF-8 quarn -tv dates.a a | cut -c 31-49
  Nov 14 22:13 2023 a

The place is that of the header, and counts the tables in front.

  $ file x x; file a_name_of_twenty_.txt 1
  $ library tables.a a_name_of_twenty_.txt x
  $ quarn -tv tables.a
  rw-r--r--     0/     0      1 Sep 09 01:46 2001 a_name_of_twenty_.txt (offset    156)
  rw-r--r--     0/     0      1 Sep 09 01:46 2001 x (offset    218)

The short listing is names only. Words choose, in their order; "*" in the order of the archive.

  $ quarn -t wide.a
  a
  b
  $ quarn -t wide.a b a
  b
  a
  $ quarn -t wide.a b '*' a
  b
  a
  b
  a
  $ both quarn -t wide.a none b '??'
  out: b
  err: Error: L6831E: 'none' not present in archive 'wide.a'
  err: Error: L6831E: '??' not present in archive 'wide.a'
  status 1
  $ both quarn -tv wide.a none b
  out: rw-r--r--     1/    22      6 Jan 01 00:00 1970 b (offset     68)
  err: Error: L6831E: 'none' not present in archive 'wide.a'
  status 1

An archive of no members lists nothing.

  $ magic > empty.a
  $ both quarn -t empty.a
  status 0
  $ both quarn -tv empty.a
  status 0
  $ both quarn -t empty.a x
  err: Error: L6831E: 'x' not present in archive 'empty.a'
  status 1
  $ both quarn -t empty.a '*'
  err: Error: L6831E: '*' not present in archive 'empty.a'
  status 1

-tv with -s shows what the file held before the table was made.

  $ quarn -tvs wide.a
  rw-r--r--999999/999999      0 Jan 01 00:00 1970 a (offset      8)
  rw-r--r--     1/    22      6 Jan 01 00:00 1970 b (offset     68)
  $ quarn -tv wide.a
  rw-r--r--999999/999999      0 Jan 01 00:00 1970 a (offset     72)
  rw-r--r--     1/    22      6 Jan 01 00:00 1970 b (offset    132)
  $ quarn -tvn wide.a
  rw-r--r--999999/999999      0 Jan 01 00:00 1970 a (offset     72)
  rw-r--r--     1/    22      6 Jan 01 00:00 1970 b (offset    132)
  $ quarn -tv wide.a
  rw-r--r--999999/999999      0 Jan 01 00:00 1970 a (offset      8)
  rw-r--r--     1/    22      6 Jan 01 00:00 1970 b (offset     68)
