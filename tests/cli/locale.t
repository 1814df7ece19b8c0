The language of the messages is English unless asked otherwise.

  $ . "$TESTDIR/setup.sh"
  $ file a.o a; library lib.a a.o

Names of languages and of codes that are taken.

  $ for name in en_US ja_JP UTF-8 utf-8 UTF8 utf8 65001 gb2312 20936 en_US.UTF-8 en_US.utf8 ja_JP.UTF-8 en_US.65001; do
  >   quarn --message_locale=$name -t lib.a || echo $name
  > done
  a.o
  a.o
  a.o
  a.o
  a.o
  a.o
  a.o
  a.o
  a.o
  a.o
  a.o
  a.o
  a.o

All others end the run.

  $ for name in fr_FR fr_FR.UTF-8 en_US. en_US.latin1 C '' EN_US ja_JP.sjis 1252 932 65001x utf .UTF-8 en_US.UTF-8.x; do
  >   both quarn "--message_locale=$name" -t lib.a
  > done
  err: Fatal error: L9780E: Could not initialise message locale fr_FR
  status 1
  err: Fatal error: L9780E: Could not initialise message locale fr_FR.UTF-8
  status 1
  err: Fatal error: L9780E: Could not initialise message locale en_US.
  status 1
  err: Fatal error: L9780E: Could not initialise message locale en_US.latin1
  status 1
  err: Fatal error: L9780E: Could not initialise message locale C
  status 1
  err: Fatal error: L9780E: Could not initialise message locale 
  status 1
  err: Fatal error: L9780E: Could not initialise message locale EN_US
  status 1
  err: Fatal error: L9780E: Could not initialise message locale ja_JP.sjis
  status 1
  err: Fatal error: L9780E: Could not initialise message locale 1252
  status 1
  err: Fatal error: L9780E: Could not initialise message locale 932
  status 1
  err: Fatal error: L9780E: Could not initialise message locale 65001x
  status 1
  err: Fatal error: L9780E: Could not initialise message locale utf
  status 1
  err: Fatal error: L9780E: Could not initialise message locale .UTF-8
  status 1
  err: Fatal error: L9780E: Could not initialise message locale en_US.UTF-8.x
  status 1

English stays English.

  $ quarn --message_locale=en_US -t lib.a none
  Error: L6831E: 'none' not present in archive 'lib.a'
  [1]
  $ quarn --message_locale=UTF-8 -t lib.a none
  Error: L6831E: 'none' not present in archive 'lib.a'
  [1]

The last language counts, from its place on; a code alone does not change it.

  $ quarn --message_locale=ja_JP --message_locale=en_US.UTF-8 -t lib.a none
  Error: L6831E: 'none' not present in archive 'lib.a'
  [1]
  $ quarn --message_locale=ja_JP --help > japanese
  $ quarn --message_locale=ja_JP --message_locale=utf8 --help | cmp - japanese
  $ iconv -f UTF-8 -t UTF-8 japanese | cmp - japanese
  $ both quarn --message_locale=ja_JP --version_number
  out: 1000001
  status 0

The environment has no say.

  $ LANG=ja_JP.UTF-8 LC_ALL=ja_JP.UTF-8 LC_MESSAGES=ja_JP.UTF-8 quarn -t lib.a none
  Error: L6831E: 'none' not present in archive 'lib.a'
  [1]
