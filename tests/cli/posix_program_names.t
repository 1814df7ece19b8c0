A program has the name that it is called by, in what it says of itself.

  $ . "$TESTDIR/setup.sh"
  $ file a.txt a; library lib.a a.txt; quarn --help > help

Only the tool's name in the examples changes with the name it is called by.

  $ (exec -a /usr/bin/zqbookkeeper.exe quarn) | grep bookkeeper
  bookkeeper options archive [ file_list ]
          bookkeeper -r  mylib.a obj1 obj2 obj3...
          bookkeeper -x  mylib.a ?sort*
          bookkeeper -d  mylib.a hash.o
          bookkeeper -tv ansilib.a
  $ (exec -a /usr/bin/zqbookkeeper.exe quarn) | sed 's/bookkeeper/quarn/' | cmp - help
  $ (exec -a '' quarn) > unnamed; echo $?; sed -n 9p unnamed
  0
   options archive [ file_list ]

The name is the one that the tool was called by.

  $ ln -s "$(command -v quarn)" library-tool
  $ ./library-tool --show_cmdline -t lib.a
  [library-tool --show_cmdline -t lib.a]
  a.txt
  $ (exec -a C:/tools/zqquarn.exe quarn --show_cmdline -t lib.a)
  [quarn --show_cmdline -t lib.a]
  a.txt
  $ (exec -a a.b quarn --show_cmdline -t lib.a)
  [b --show_cmdline -t lib.a]
  a.txt
  $ (exec -a quarn-1.2 quarn --show_cmdline -t lib.a)
  [2 --show_cmdline -t lib.a]
  a.txt
  $ (exec -a quarn.exe.dll quarn --show_cmdline -t lib.a)
  [exe --show_cmdline -t lib.a]
  a.txt
  $ (exec -a quarn.dll quarn --show_cmdline -t lib.a)
  [quarn --show_cmdline -t lib.a]
  a.txt
  $ (exec -a .exe quarn --show_cmdline -t lib.a)
  [exe --show_cmdline -t lib.a]
  a.txt
  $ (exec -a zqzqx quarn --show_cmdline -t lib.a)
  [zqx --show_cmdline -t lib.a]
  a.txt
  $ (exec -a 'tool:q\w' quarn --show_cmdline -t lib.a)
  [w --show_cmdline -t lib.a]
  a.txt
  $ (exec -a /x/abcdefghijklmnopqrstuvwxyz0123456789 quarn --show_cmdline -t lib.a)
  [abcdefghijklmnopqrstuvwxyz01234 --show_cmdline -t lib.a]
  a.txt
  $ (exec -a '' quarn --show_cmdline -t lib.a)
  [ --show_cmdline -t lib.a]
  a.txt

Of the program for build systems it also says which of two it is.

  $ ln -s "$(command -v quarn-ar)" cross-ranlib; both ./cross-ranlib none.a
  err: cross-ranlib: Error: L6832E: Archive 'none.a' not found : No such file or directory
  status 1
