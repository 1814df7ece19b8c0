Texts leave in pages that not every host has.

  $ . "$TESTDIR/setup.sh"
  $ for name in EUC-JP GB18030 GB2312; do iconv -f UTF-8 -t $name < /dev/null 2> /dev/null || exit 80; done
  $ file a.o a; file café.o c; file アー.o k
  $ library lib.a a.o café.o アー.o

in_page PAGE NAME ARGUMENT...: the status of a run in Japanese and that page, and how it differs from the
same run in UTF-8 and another program's conversion of that.

  $ in_page() {
  >   local page=$1 name=$2; shift 2
  >   quarn --message_locale=ja_JP.$page "$@" > actual 2>&1; echo $?
  >   quarn --message_locale=ja_JP "$@" 2>&1 | iconv -f UTF-8 -t $name | cmp - actual
  > }
  $ in_page 51932 EUC-JP --help
  0
  $ in_page 54936 GB18030 -tv lib.a
  0

Of Chinese it is the one that has most of the Japanese letters, too.

  $ for locale in ja_JP.gb2312 ja_JP.20936; do quarn --message_locale=$locale -t none 2>&1; done | iconv -f GB2312 -t UTF-8
  Error: L6832E: ア?カイブ 'none' が?つかりません : No such file or directory
  Error: L6832E: ア?カイブ 'none' が?つかりません : No such file or directory
  $ quarn --message_locale=ja_JP.gb2312 -t none 2>&1 | od -A n -t x1z | head -2
   45 72 72 6f 72 3a 20 4c 36 38 33 32 45 3a 20 a5  >Error: L6832E: .<
   a2 3f a5 ab a5 a4 a5 d6 20 27 6e 6f 6e 65 27 20  >.?...... 'none' <
