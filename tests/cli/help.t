Help is the banner and the whole text, on stdout, with the name the tool was called by.

  $ . "$TESTDIR/setup.sh"
  $ both quarn --help
  out: Product: Quarn Object Tools 1.0
  out: Component: Quarn Object Tools 1.0
  out: Tool: quarn [01000001]
  out: 
  out: Archive creation and maintenance tool
  out: 
  out: Command format:
  out: 
  out: quarn options archive [ file_list ]
  out: 
  out: Wildcards '?' and '*' may be used in file_list
  out: 
  out: Options:-
  out: 
  out:  -r         Insert files in <file_list>, replace existing members of the same name.
  out:  -d         Delete the members in <file_list>.
  out:  -x         Extract members in <file_list> placing in files of the same name.
  out:  -m         Move files in <file_list>.
  out:  -p         Print files to stdout.
  out:  -a pos     Insert/move files after file named <pos>.
  out:  -b pos     Insert/move files before file named <pos>.
  out:  -u         Update older files only, used with -r.
  out: 
  out:  -n         Do not add a symbol table to an object archive.
  out:  -s         Force regeneration of archive symbol table.
  out:  -t         Print table of contents of archive.
  out: --zs        Show the symbol table.
  out: --zt        Summarize the archive contents (sizes + entries).
  out:  -c         Suppress warning when a new archive is created.
  out:  -C         Do not overwrite existing files when extracting.
  out:  -T         Truncate file names to system maximum length.
  out:  -v         Give verbose output.
  out: --create    Force creation of a new archive.
  out: --via file  Take additional arguments from via file.
  out: --sizes     List the size of each member and the library total.
  out: --entries   List sections containing ENTRY points.
  out: --vsn       Print the current Quarn Version. 
  out: --help      Print this message. 
  out: 
  out: Examples:-
  out: 
  out:         quarn -r  mylib.a obj1 obj2 obj3...
  out:         quarn -x  mylib.a ?sort*
  out:         quarn -d  mylib.a hash.o
  out:         quarn -tv ansilib.a
  out: 
  status 0

The trailing blanks belong to the last two lines of the options.

  $ quarn -h | grep -n ' $'
  37:--vsn       Print the current Quarn Version. 
  38:--help      Print this message. 

All ways to it give the same.

  $ quarn --help > help
  $ quarn -h | cmp - help
  $ quarn | cmp - help

Whatever the diagnostics do, help does not change.

  $ quarn --diag_style=ide --diag_suppress=warning -h | cmp - help
