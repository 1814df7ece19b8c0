What fish makes of a line when completion is asked for.

  $ . "$TESTDIR/setup.sh"
  $ complete() { "$TESTDIR/complete_in_fish" "$@"; }

Members, for each action that reads or edits, alone and among other letters; each is quoted.

  $ complete 'quarn -t lib.a ' 'quarn -x lib.a t' 'quarn -dv lib.a i' 'quarn -m lib.a m' 'quarn -p lib.a a' \
  >   'quarn -tv lib.a s' 'quarn -x lib.a \[' 'quarn -x lib.a b' 'quarn -x lib.a key=1' 'quarn -x lib.a ./-' \
  >   'quarn lib.a -x on'
  quarn -t lib.a : 'a;b&c|(d).o' 'bell?.o' it\'s.o key=1:2.o 'money$x.o' one.o 'say "hi".o' 'two words.o' '[x]*?.o'
  quarn -x lib.a t: 'two words.o'
  quarn -dv lib.a i: it\'s.o
  quarn -m lib.a m: 'money$x.o'
  quarn -p lib.a a: 'a;b&c|(d).o'
  quarn -tv lib.a s: 'say "hi".o'
  quarn -x lib.a \[: '[x]*?.o'
  quarn -x lib.a b: 'bell?.o'
  quarn -x lib.a key=1: key=1:2.o
  quarn -x lib.a ./-: ./-dash.o
  quarn lib.a -x on: one.o

In quotes that have been opened already, and behind a part that is quoted.

  $ complete 'quarn -x lib.a "t' "quarn -x lib.a 'm" 'quarn -x lib.a two\ w' "quarn -x lib.a 'i"
  quarn -x lib.a "t: 'two words.o'
  quarn -x lib.a 'm: 'money$x.o'
  quarn -x lib.a two\ w: 'two words.o'
  quarn -x lib.a 'i: it\'s.o

An archive whose name is quoted itself, behind "--", and in another folder.

  $ complete 'quarn -t folder/my\ lib.a o' 'quarn -t "folder/my lib.a" o' 'quarn -t -- lib.a o'
  quarn -t folder/my\ lib.a o: one.o
  quarn -t "folder/my lib.a" o: one.o
  quarn -t -- lib.a o: one.o

Positions, also where the archive stands behind the cursor.

  $ complete 'quarn -r lib.a -a o' 'quarn -m lib.a -b o' 'quarn -mv lib.a -i on' 'quarn -r lib.a -ao'
  quarn -r lib.a -a o: one.o
  quarn -m lib.a -b o: one.o
  quarn -mv lib.a -i on: one.o
  quarn -r lib.a -ao: -aone.o

A missing or broken archive, a folder or a pipe has no members, and nothing is said.

  $ complete 'quarn -t none.a ' 'quarn -t broken.a ' 'quarn -t folder ' 'quarn -t pipe.a ' 'quarn -t lib.a none' \
  >   'quarn -a '
  quarn -t none.a :
  quarn -t broken.a :
  quarn -t folder :
  quarn -t pipe.a :
  quarn -t lib.a none:
  quarn -a :

The archive: what ends as archives do, and anything where nothing does.

  $ complete 'quarn -t l' 'quarn -t ' 'quarn -t folder/' 'quarn -t n' 'quarn n'
  quarn -t l: lib.a
  quarn -t : broken.a folder/ lib.a new.o pipe.a
  quarn -t folder/: 'folder/my lib.a'
  quarn -t n: new.o
  quarn n: new.o

Files, for who inserts; reports want no more words.

  $ complete 'quarn -r lib.a n' 'quarn -qv lib.a n' 'quarn --create new.a n' 'quarn --sizes lib.a ' \
  >   'quarn --zs lib.a ' 'quarn -s lib.a '
  quarn -r lib.a n: new.o
  quarn -qv lib.a n: new.o
  quarn --create new.a n: new.o
  quarn --sizes lib.a :
  quarn --zs lib.a :
  quarn -s lib.a :

Options, and the values that they know.

  $ complete 'quarn --diag_style=' 'quarn --diag_style=d' 'quarn --diag_style ' 'quarn --message_locale=j' \
  >   'quarn --db_check h' 'quarn --diag_error=L6876,w' 'quarn --diag_suppress=L397' 'quarn --libattrmap=n' \
  >   'quarn --via n' 'quarn --normalise=' 'quarn --cre' 'quarn --no_' 'quarn --nor' 'quarn -t lib.a --uni'
  quarn --diag_style=: --diag_style=devstudio --diag_style=gnu --diag_style=ide --diag_style=list --diag_style=zev
  quarn --diag_style=d: --diag_style=devstudio
  quarn --diag_style : devstudio gnu ide list zev
  quarn --message_locale=j: --message_locale=ja_JP --message_locale=ja_JP.UTF-8
  quarn --db_check h: high
  quarn --diag_error=L6876,w: --diag_error=L6876,warning
  quarn --diag_suppress=L397:
  quarn --libattrmap=n: --libattrmap=new.o
  quarn --via n: new.o
  quarn --normalise=:
  quarn --cre: --create
  quarn --no_: --no_debug_symbols --no_normalise --no_qobix_buildattr --no_unique_symbols
  quarn --nor: --normalise
  quarn -t lib.a --uni: --unique_symbols

Behind "--" nothing is an option.

  $ complete 'quarn -t -- -' 'quarn -t -- lib.a --c'
  quarn -t -- -:
  quarn -t -- lib.a --c:
