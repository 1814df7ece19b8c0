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

  $ for name in fr_FR fr_FR.UTF-8 en_US. en_US.latin1 C '' EN_US ja_JP.sjis cp932 65001x 65002 1 1200 65000 500 +932 0x3a4 99999999999999999999 en_US.1200 utf .UTF-8 en_US.UTF-8.x; do
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
  err: Fatal error: L9780E: Could not initialise message locale cp932
  status 1
  err: Fatal error: L9780E: Could not initialise message locale 65001x
  status 1
  err: Fatal error: L9780E: Could not initialise message locale 65002
  status 1
  err: Fatal error: L9780E: Could not initialise message locale 1
  status 1
  err: Fatal error: L9780E: Could not initialise message locale 1200
  status 1
  err: Fatal error: L9780E: Could not initialise message locale 65000
  status 1
  err: Fatal error: L9780E: Could not initialise message locale 500
  status 1
  err: Fatal error: L9780E: Could not initialise message locale +932
  status 1
  err: Fatal error: L9780E: Could not initialise message locale 0x3a4
  status 1
  err: Fatal error: L9780E: Could not initialise message locale 99999999999999999999
  status 1
  err: Fatal error: L9780E: Could not initialise message locale en_US.1200
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

Every message has Japanese words; codes, names and the words in front of them stay as they are.

in_japanese ARGUMENT...: the status of a run, and how its output differs from what is expected.

  $ in_japanese() { cat > expected; quarn --message_locale=ja_JP.UTF-8 "$@" > actual 2>&1; echo $?; diff expected actual; }
  $ in_japanese -t missing.a <<'E'
  > Error: L6832E: アーカイブ 'missing.a' が見つかりません : No such file or directory
  > E
  1
  $ in_japanese -t lib.a none <<'E'
  > Error: L6831E: 'none' はアーカイブ 'lib.a' に存在しません
  > E
  1
  $ in_japanese -xC lib.a a.o <<'E'
  > Error: L6836E: 'a.o' は既に存在するため、抽出しません
  > E
  1
  $ in_japanese -r --diag_style=ide new.a a.o <<'E'
  > quarn : warning L6875:  ELF ではないオブジェクト 'a.o' をアーカイブ 'new.a' に追加しています
  > quarn : アーカイブ 'new.a' を作成しています
  > E
  0
  $ in_japanese -tt lib.a <<'E'
  > Warning: L3920W: 連結されたオプション '-tt' でオプション '-t' が繰り返されています。
  > a.o
  > E
  0
  $ in_japanese --normalise=x lib.a <<'E'
  > Fatal error: L3903U: 引数 'x' はオプション 'normalise' では使用できません。
  > E
  1
  $ in_japanese --diag_error=0 --unknown <<'E'
  > Warning: L9962I: 不明な診断番号です: 0
  > Fatal error: L3900U: オプション '--unknown' を認識できません。
  > E
  1
  $ in_japanese --message_locale=fr_FR -t lib.a <<'E'
  > Fatal error: L9780E: メッセージロケール fr_FR を初期化できませんでした
  > E
  1
  $ in_japanese -t . <<'E'
  > Error: L6835E: ファイル '.' の読み込みに失敗しました : Is a directory
  > E
  1
  $ echo --via=again > again
  $ in_japanese --via=again <<'E'
  > Fatal error: L3902U: via ファイルの再帰的な取り込みが、ファイル 'again' で深さ 10 に達しました。
  > E
  1
  $ in_japanese --via none <<'E'
  > Fatal error: L3904U: via ファイル 'none' を開けませんでした。
  > E
  1
  $ variant 1.o; variant 2.o '$R:L22'
  $ in_japanese --create variants.a 1.o 2.o <<'E'
  > Warning: L6877W: '1.o' で始まるマイナーバリアントグループのアーカイブメンバ '2.o' の属性の差異に、シンボル装飾で表現できない属性が含まれています
  > E
  0
  $ in_japanese --sizes variants.a <<'E'
  > 
  >     コード   ROデータ   RWデータ   ZIデータ   デバッグ   オブジェクト名
  >        912         80          0          0          0   1.o
  >        912         80          0          0          0   2.o
  >       1824        160          0          0          0   TOTAL
  > 
  > E
  0
  $ in_japanese --zs variants.a <<'E'
  > gcd                  定義元 1.o        オフセット    124
  > gcd$$BuildAttributes$$A:L22$IEEE1 定義元 2.o        オフセット   2512
  > E
  0
  $ elf 1.o entry 16; section 1.o 2 flags 0x10000006; quarn -r lib.a 1.o
  $ in_japanese --entries lib.a <<'E'
  > ENTRY: 1.o のセクション .text のオフセット 16
  > E
  0
  $ in_japanese --help <<'E'
  > Product: Quarn Object Tools 1.0
  > Component: Quarn Object Tools 1.0
  > Tool: quarn [01000001]
  > 
  > アーカイブ作成・保守ツール
  > 
  > コマンド形式:
  > 
  > quarn options archive [ file_list ]
  > 
  > file_list ではワイルドカード '?' と '*' を使用できます
  > 
  > オプション:
  > 
  >  -r         <file_list> のファイルを挿入し、同名の既存メンバを置き換えます。
  >  -d         <file_list> のメンバを削除します。
  >  -x         <file_list> のメンバを抽出し、同名のファイルに保存します。
  >  -m         <file_list> のファイルを移動します。
  >  -p         ファイルを標準出力に出力します。
  >  -a pos     ファイルを <pos> という名前のファイルの後ろに挿入または移動します。
  >  -b pos     ファイルを <pos> という名前のファイルの前に挿入または移動します。
  >  -u         古いファイルだけを更新します。-r と共に使用します。
  > 
  >  -n         オブジェクトアーカイブにシンボルテーブルを追加しません。
  >  -s         アーカイブのシンボルテーブルを強制的に再生成します。
  >  -t         アーカイブの内容一覧を表示します。
  > --zs        シンボルテーブルを表示します。
  > --zt        アーカイブの内容を要約します (サイズ + エントリ)。
  >  -c         新しいアーカイブを作成するときの警告を抑制します。
  >  -C         抽出時に既存のファイルを上書きしません。
  >  -T         ファイル名をシステムの最大長に切り詰めます。
  >  -v         詳細な情報を出力します。
  > --create    新しいアーカイブを強制的に作成します。
  > --via file  via ファイルから追加の引数を読み込みます。
  > --sizes     各メンバのサイズとライブラリの合計を一覧表示します。
  > --entries   ENTRY ポイントを含むセクションを一覧表示します。
  > --vsn       Quarn の現在のバージョンを表示します。
  > --help      このメッセージを表示します。
  > 
  > 例:
  > 
  >         quarn -r  mylib.a obj1 obj2 obj3...
  >         quarn -x  mylib.a ?sort*
  >         quarn -d  mylib.a hash.o
  >         quarn -tv ansilib.a
  > 
  > E
  0

The environment has no say.

  $ LANG=ja_JP.UTF-8 LC_ALL=ja_JP.UTF-8 LC_MESSAGES=ja_JP.UTF-8 quarn -t lib.a none
  Error: L6831E: 'none' not present in archive 'lib.a'
  [1]
