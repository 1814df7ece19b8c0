What fish makes of a line when completion is asked for.

  $ . "$TESTDIR/setup.sh"
  $ completed() { "$TESTDIR/complete_in_fish" "$@"; }

Members, for each action that reads or edits, alone and among other letters; each is quoted.

  $ completed 'quarn -t lib.a ' 'quarn -x lib.a t' 'quarn -dv lib.a i' 'quarn -m lib.a m' 'quarn -p lib.a a' \
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

Names with characters that one shell or another takes for its own.

  $ completed 'quarn -t odd.a ' 'quarn -t odd.a a:' 'quarn -t odd.a \~' 'quarn -t odd.a \!' 'quarn -t odd.a tab'
  quarn -t odd.a : !last.o '#note.o' =which.o a:b.o 'p%q.o' 'tab?here.o' ^c.o '{a,b}.o' '~home.o'
  quarn -t odd.a a:: a:b.o
  quarn -t odd.a \~: '~home.o'
  quarn -t odd.a \!: !last.o
  quarn -t odd.a tab: 'tab?here.o'

In quotes that have been opened already, and behind a part that is quoted.

  $ completed 'quarn -x lib.a "t' "quarn -x lib.a 'm" 'quarn -x lib.a two\ w' "quarn -x lib.a 'i"
  quarn -x lib.a "t: 'two words.o'
  quarn -x lib.a 'm: 'money$x.o'
  quarn -x lib.a two\ w: 'two words.o'
  quarn -x lib.a 'i: it\'s.o

An archive whose name is quoted itself, behind "--", and in another folder.

  $ completed 'quarn -t folder/my\ lib.a o' 'quarn -t "folder/my lib.a" o' 'quarn -t -- lib.a o'
  quarn -t folder/my\ lib.a o: one.o
  quarn -t "folder/my lib.a" o: one.o
  quarn -t -- lib.a o: one.o

Positions, also where the archive stands behind the cursor.

  $ completed 'quarn -r lib.a -a o' 'quarn -m lib.a -b o' 'quarn -mv lib.a -i on' 'quarn -r lib.a -ao'
  quarn -r lib.a -a o: one.o
  quarn -m lib.a -b o: one.o
  quarn -mv lib.a -i on: one.o
  quarn -r lib.a -ao: -aone.o

A missing or broken archive, a folder or a pipe has no members, nor has a program that is not there, and nothing
is said.

  $ completed 'quarn -t none.a ' 'quarn -t broken.a ' 'quarn -t folder ' 'quarn -t pipe.a ' 'quarn -t lib.a none' \
  >   'quarn -a ' 'none/quarn -t lib.a '
  quarn -t none.a :
  quarn -t broken.a :
  quarn -t folder :
  quarn -t pipe.a :
  quarn -t lib.a none:
  quarn -a :
  none/quarn -t lib.a :

The archive: what ends as archives do, and anything where nothing does.

  $ completed 'quarn -t l' 'quarn -t ' 'quarn -t folder/' 'quarn -t n' 'quarn n'
  quarn -t l: lib.a
  quarn -t : broken.a folder/ lib.a new.o odd.a pipe.a
  quarn -t folder/: 'folder/my lib.a'
  quarn -t n: new.o
  quarn n: new.o

Files, for who inserts; reports want no more words.

  $ completed 'quarn -r lib.a n' 'quarn -qv lib.a n' 'quarn --create new.a n' 'quarn --sizes lib.a ' \
  >   'quarn --zs lib.a ' 'quarn -s lib.a '
  quarn -r lib.a n: new.o
  quarn -qv lib.a n: new.o
  quarn --create new.a n: new.o
  quarn --sizes lib.a :
  quarn --zs lib.a :
  quarn -s lib.a :

Options, and the values that they know.

  $ completed 'quarn --diag_style=' 'quarn --diag_style=d' 'quarn --diag_style ' 'quarn --message_locale=j' \
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

  $ completed 'quarn -t -- -' 'quarn -t -- lib.a --c'
  quarn -t -- -:
  quarn -t -- lib.a --c:

The words of ar and ranlib: letters, a place and a count, the archive, and what is in it or goes into it.

  $ completed 'quarn-ar ' 'quarn-ar r' 'quarn-ar t l' 'quarn-ar t lib.a o' 'quarn-ar t lib.a ./-' \
  >   'quarn-ar rc lib.a n' 'quarn-ar q lib.a n' 'quarn-ar ra o' 'quarn-ar mb one.o l' 'quarn-ar xN 2 l' \
  >   'quarn-ar xN 2 lib.a i' 'quarn-ar -d -v lib.a m' 'quarn-ar s lib.a ' 'quarn-ar t none.a ' \
  >   'quarn-ar t broken.a ' 'quarn-ar t lib.a two\ w' 'quarn-ar --rsp' 'quarn-ar --rsp-quoting=' \
  >   'quarn-ar --diag_style=d' 'quarn-ar --target d' 'quarn-ar --target default t lib.a i' 'quarn-ranlib l' \
  >   'quarn-ranlib lib.a folder/' 'quarn-ranlib --v' 'quarn-ranlib --plugin n' 'quarn-ranlib -'
  quarn-ar : d m p q r s t x
  quarn-ar r: r ra rb rc rD rf ri rl rP rS rs rU ru rV rv
  quarn-ar t l: lib.a
  quarn-ar t lib.a o: one.o
  quarn-ar t lib.a ./-: ./-dash.o
  quarn-ar rc lib.a n: new.o
  quarn-ar q lib.a n: new.o
  quarn-ar ra o:
  quarn-ar mb one.o l: lib.a
  quarn-ar xN 2 l: lib.a
  quarn-ar xN 2 lib.a i: it\'s.o
  quarn-ar -d -v lib.a m: 'money$x.o'
  quarn-ar s lib.a :
  quarn-ar t none.a :
  quarn-ar t broken.a :
  quarn-ar t lib.a two\ w: 'two words.o'
  quarn-ar --rsp: --rsp-quoting
  quarn-ar --rsp-quoting=: --rsp-quoting=posix --rsp-quoting=windows
  quarn-ar --diag_style=d: --diag_style=devstudio
  quarn-ar --target d: default
  quarn-ar --target default t lib.a i: it\'s.o
  quarn-ranlib l: lib.a
  quarn-ranlib lib.a folder/: 'folder/my lib.a'
  quarn-ranlib --v: --version
  quarn-ranlib --plugin n: new.o
  quarn-ranlib -: -D -h -t -U -V -v --diag_error --diag_remark --diag_style --diag_suppress --diag_warning --help --libattrmap --plugin --qobix_buildattr --rsp-quoting --target --version

Libraries and the options of quarn-json.

  $ completed 'quarn-json l' 'quarn-json lib.a folder/' 'quarn-json --v' 'quarn-json --lib' 'quarn-json --libattrmap=n' \
  >   'quarn-json --libattrmap n' 'quarn-json --libattrmap new.o l' 'quarn-json -- l' 'quarn-json -'
  quarn-json l: lib.a
  quarn-json lib.a folder/: 'folder/my lib.a'
  quarn-json --v: --version
  quarn-json --lib: --libattrmap
  quarn-json --libattrmap=n: --libattrmap=new.o
  quarn-json --libattrmap n: new.o
  quarn-json --libattrmap new.o l: lib.a
  quarn-json -- l: lib.a
  quarn-json -: --help --libattrmap --qobix_buildattr --version
