Texts leave in the code page that the locale names, where the host has it.

  $ . "$TESTDIR/setup.sh"
  $ for name in CP932 CP1252; do iconv -f UTF-8 -t $name < /dev/null 2> /dev/null || exit 80; done
  $ file a.o a; file café.o c; file アー.o k
  $ library lib.a a.o café.o アー.o

in_page PAGE NAME ARGUMENT...: the status of a run in Japanese and that page, and how it differs from the
same run in UTF-8 and another program's conversion of that.

  $ in_page() {
  >   local page=$1 name=$2; shift 2
  >   quarn --message_locale=ja_JP.$page "$@" > actual 2>&1; echo $?
  >   quarn --message_locale=ja_JP "$@" 2>&1 | iconv -f UTF-8 -t $name | cmp - actual
  > }
  $ in_page 932 CP932 --help
  0
  $ in_page 932 CP932 -t missing.a
  1
  $ in_page 932 CP932 -t lib.a none a.o アー.o
  1
  $ in_page 936 GBK --unknown
  1

Byte by byte, in Shift JIS.

  $ quarn --message_locale=ja_JP.932 -t none 2>&1 | od -A n -t x1z
   45 72 72 6f 72 3a 20 4c 36 38 33 32 45 3a 20 83  >Error: L6832E: .<
   41 81 5b 83 4a 83 43 83 75 20 27 6e 6f 6e 65 27  >A.[.J.C.u 'none'<
   20 82 aa 8c a9 82 c2 82 a9 82 e8 82 dc 82 b9 82  > ...............<
   f1 20 3a 20 4e 6f 20 73 75 63 68 20 66 69 6c 65  >. : No such file<
   20 6f 72 20 64 69 72 65 63 74 6f 72 79 0a        > or directory.<

Names of members are texts. What the page lacks is a question mark, as is each byte that is no UTF-8;
control bytes have become numbers before that.

  $ quarn --message_locale=1252 -t lib.a | od -A n -t x1z
   61 2e 6f 0a 63 61 66 e9 2e 6f 0a 3f 3f 2e 6f 0a  >a.o.caf..o.??.o.<
  $ { magic; member $'\x80\xc3x/' 1; member $'\xc3\xa9\001/' 2; member $'\xc2\x9bA/' 3; } > odd.a
  $ quarn --message_locale=1252 -t odd.a | od -A n -t x1z
   3f 3f 78 0a e9 5c 30 30 31 0a 3f 41 0a           >??x..\001.?A.<

In UTF-8 they pass as they are.

  $ quarn -t odd.a | od -A n -t x1z
   80 c3 78 0a c3 a9 5c 30 30 31 0a c2 9b 41 0a     >..x...\001...A.<
  $ for locale in UTF-8 65001 en_US; do quarn --message_locale=$locale -t odd.a | cmp - <(quarn -t odd.a); done

Only texts are converted: no contents, no archive, and no name of a file.

  $ file é.txt $'\xe9\xc3\xa9\x80\001'
  $ quarn --message_locale=932 --create --normalise=1000000000 --diag_suppress=L6875 page.a é.txt
  $ library plain.a é.txt && cmp page.a plain.a
  $ quarn --message_locale=932 -p page.a é.txt | od -A n -t x1
   e9 c3 a9 80 01
  $ mkdir out && cd out && quarn --message_locale=932 -x ../page.a && cmp é.txt ../é.txt && cd ..

The page counts from its place on, and lasts until another is named.

  $ quarn --message_locale=932 --message_locale=UTF-8 -t none é 2>&1 | iconv -f UTF-8 -t UTF-8 | cmp - <(quarn -t none é 2>&1)
  $ quarn --message_locale=932 --message_locale=ja_JP -t none 2>&1 | cmp - <(quarn --message_locale=ja_JP.932 -t none 2>&1)
  $ quarn --message_locale=ja_JP.932 --message_locale=é 2>&1 | iconv -f CP932 -t UTF-8
  Fatal error: L9780E: メッセージロケール ? を初期化できませんでした

The environment has no say.

  $ LANG=ja_JP.UTF-8 LC_ALL=ja_JP.UTF-8 quarn --message_locale=1252 -t lib.a | cmp - <(quarn --message_locale=1252 -t lib.a)
