What zsh makes of a line when completion is asked for.

  $ . "$TESTDIR/setup.sh"
  $ complete() { "$TESTDIR/complete_in" zsh "$@"; }

Members, for each action that reads or edits, alone and among other letters; each is quoted.

  $ complete 'quarn -t lib.a ' 'quarn -x lib.a t' 'quarn -dv lib.a i' 'quarn -m lib.a m' 'quarn -p lib.a a' \
  >   'quarn -tv lib.a s' 'quarn -x lib.a \[' 'quarn -x lib.a b' 'quarn -x lib.a key=1' 'quarn -x lib.a ./-' \
  >   'quarn lib.a -x on'
  quarn -t lib.a ./-dash.o \[x\]\*\?.o a\;b\&c\|\(d\).o bell\?.o it\'s.o key=1:2.o money\$x.o one.o say\ \"hi\".o two\ words.o |
  quarn -x lib.a two\ words.o |
  quarn -dv lib.a it\'s.o |
  quarn -m lib.a money\$x.o |
  quarn -p lib.a a\;b\&c\|\(d\).o |
  quarn -tv lib.a say\ \"hi\".o |
  quarn -x lib.a \[x\]\*\?.o |
  quarn -x lib.a bell\?.o |
  quarn -x lib.a key=1:2.o |
  quarn -x lib.a ./-dash.o |
  quarn lib.a -x one.o |

In quotes that have been opened already, and behind a part that is quoted.

  $ complete $'quarn -x lib.a "t\t' $'quarn -x lib.a \'m\t' $'quarn -x lib.a "m\t' $'quarn -x lib.a "s\t' \
  >   $'quarn -x lib.a \'i\t' $'quarn -x lib.a two\\ w\t' $'quarn -x lib.a k\t' $'quarn -m lib.a -a"t\t' \
  >   $'quarn -t "fol\t'
  quarn -x lib.a "two words.o" |
  quarn -x lib.a 'money$x.o' |
  quarn -x lib.a "money\$x.o" |
  quarn -x lib.a "say \"hi\".o" |
  quarn -x lib.a 'it'\''s.o' |
  quarn -x lib.a two\ words.o |
  quarn -x lib.a key=1:2.o |
  quarn -m lib.a -atwo\ words.o |
  quarn -t "folder/|

An archive whose name is quoted itself, behind "--", and in another folder.

  $ complete 'quarn -t folder/my\ lib.a o' 'quarn -t "folder/my lib.a" o' 'quarn -t -- lib.a o'
  quarn -t folder/my\ lib.a one.o |
  quarn -t "folder/my lib.a" one.o |
  quarn -t -- lib.a one.o |

Positions, also where the archive stands behind the cursor.

  $ complete 'quarn -r lib.a -a o' 'quarn -m -b ^ lib.a' 'quarn -mv lib.a -i on' 'quarn -r lib.a -ao'
  quarn -r lib.a -a one.o |
  quarn -m -b ./-dash.o \[x\]\*\?.o a\;b\&c\|\(d\).o bell\?.o it\'s.o key=1:2.o money\$x.o one.o say\ \"hi\".o  two\ words.o lib.a|
  quarn -mv lib.a -i one.o |
  quarn -r lib.a -aone.o |

A missing or broken archive, a folder or a pipe has no members, and nothing is said.

  $ complete 'quarn -t none.a ' 'quarn -t broken.a ' 'quarn -t folder ' 'quarn -t pipe.a ' 'quarn -t lib.a none' \
  >   'quarn -a '
  quarn -t none.a |
  quarn -t broken.a |
  quarn -t folder |
  quarn -t pipe.a |
  quarn -t lib.a none|
  quarn -a |

The archive: what ends as archives do, and anything where nothing does.

  $ complete 'quarn -t l' 'quarn -t ' 'quarn -t folder/' 'quarn -t n' 'quarn n'
  quarn -t lib.a |
  quarn -t broken.a folder lib.a |
  quarn -t folder/my\ lib.a |
  quarn -t new.o |
  quarn new.o |

Files, for who inserts; reports want no more words.

  $ complete 'quarn -r lib.a n' 'quarn -qv lib.a n' 'quarn --create new.a n' 'quarn --sizes lib.a ' \
  >   'quarn --zs lib.a ' 'quarn -s lib.a '
  quarn -r lib.a new.o |
  quarn -qv lib.a new.o |
  quarn --create new.a new.o |
  quarn --sizes lib.a |
  quarn --zs lib.a |
  quarn -s lib.a |

Options, and the values that they know.

  $ complete 'quarn --diag_style=' 'quarn --diag_style=d' 'quarn --diag_style ' 'quarn --message_locale=j' \
  >   'quarn --db_check h' 'quarn --diag_error=L6876,w' 'quarn --diag_suppress=L397' 'quarn --libattrmap=n' \
  >   'quarn --via n' 'quarn --normalise=' 'quarn --cre' 'quarn --no_' 'quarn --nor' 'quarn -t lib.a --uni'
  quarn --diag_style=devstudio --diag_style=gnu --diag_style=ide --diag_style=list --diag_style=zev |
  quarn --diag_style=devstudio |
  quarn --diag_style devstudio gnu ide list zev |
  quarn --message_locale=ja_JP --message_locale=ja_JP.UTF-8 |
  quarn --db_check high |
  quarn --diag_error=L6876,warning,|
  quarn --diag_suppress=L397|
  quarn --libattrmap=new.o |
  quarn --via new.o |
  quarn --normalise=|
  quarn --create |
  quarn --no_debug_symbols --no_normalise --no_qobix_buildattr --no_unique_symbols |
  quarn --normalise=|
  quarn -t lib.a --unique_symbols |

Behind "--" nothing is an option.

  $ complete 'quarn -t -- -' 'quarn -t -- lib.a --c'
  quarn -t -- -|
  quarn -t -- lib.a --c|
