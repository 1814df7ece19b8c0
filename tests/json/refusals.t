There is one document of all libraries, or none: a reader at the other end of a pipe could not tell half of them from
the whole.

  $ . "$TESTDIR/../cli/setup.sh"
  $ file notes.txt 'notes'; quarn --create --normalise=1 --diag_suppress=6875 -c lib.a notes.txt
  $ { magic; printf 'x'; } > short.a; { magic; printf '%s' "$(member x/ 12345)" | head -c 62; } > cut.a; mkdir folder.a

  $ both quarn-json lib.a lib.a
  out: {
  out:   "formatVersion": 1,
  out:   "libraries": [
  out:     {
  out:       "file": "lib.a",
  out:       "attributes": null,
  out:       "symbolTable": {"offset":8,"size":4},
  out:       "members": [
  out:         {"name":"notes.txt","offset":72,"size":5,"date":1,"uid":0,"gid":0,"mode":33188,"kind":"file"}
  out:       ],
  out:       "symbols": [
  out:       ],
  out:       "variantGroups": [
  out:       ]
  out:     },
  out:     {
  out:       "file": "lib.a",
  out:       "attributes": null,
  out:       "symbolTable": {"offset":8,"size":4},
  out:       "members": [
  out:         {"name":"notes.txt","offset":72,"size":5,"date":1,"uid":0,"gid":0,"mode":33188,"kind":"file"}
  out:       ],
  out:       "symbols": [
  out:       ],
  out:       "variantGroups": [
  out:       ]
  out:     }
  out:   ]
  out: }
  status 0
  $ both quarn-json lib.a nothere.a short.a lib.a cut.a folder.a notes.txt
  err: quarn-json: Error: L6832E: Archive 'nothere.a' not found : No such file or directory
  err: quarn-json: Error: L6829E: 'short.a': malformed archive: End of file in the middle of archive member header starting at offset 8
  err: quarn-json: Error: L6829E: 'cut.a': malformed archive: Error reading member 'x': archive member is at offset 68 and has size 5 but archive file is only 70 bytes long
  err: quarn-json: Error: L6835E: Reading file 'folder.a' : Is a directory
  err: quarn-json: Error: L6835E: Reading file 'notes.txt' : Unexpected end of file
  status 1

A library that is not quite as it should be is no failure, and the warning is not in the document's way:

  $ { magic; member x/ text; } | sed 's|^x/              0 |x/              0z|' > odd.a; both quarn-json odd.a
  out: {
  out:   "formatVersion": 1,
  out:   "libraries": [
  out:     {
  out:       "file": "odd.a",
  out:       "attributes": null,
  out:       "symbolTable": null,
  out:       "members": [
  out:         {"name":"x","offset":8,"size":4,"date":0,"uid":0,"gid":0,"mode":33188,"kind":"file"}
  out:       ],
  out:       "symbols": [
  out:       ],
  out:       "variantGroups": [
  out:       ]
  out:     }
  out:   ]
  out: }
  err: quarn-json: Warning: L6974W: 'odd.a': malformed archive: Archive member header starting at offset 8 contains invalid date string '0z          '
  status 0

Words:

  $ both quarn-json
  err: quarn-json: Error: L6838E: No archive specified
  status 1
  $ both quarn-json --libattrmap
  err: quarn-json: Fatal error: L3901U: Missing argument for option 'libattrmap'.
  status 1
  $ both quarn-json --compact lib.a
  err: quarn-json: Fatal error: L3900U: Unrecognized option '--compact'.
  status 1
  $ both quarn-json --version
  out: quarn-json 1.0.0
  status 0
  $ quarn-json --help | head -1
  Usage: quarn-json [options] library...

A map that can't be read gives way to the built-in one, as it does in quarn:

  $ quarn-json --libattrmap=nothere lib.a | grep attributes
        "attributes": "$IEEE1",

Where stdout can't take the document:

  $ quarn-json lib.a > /dev/full
  quarn-json: Error: L6843E: Writing file 'stdout' : No space left on device
  [1]
  $ quarn-json lib.a >&-; echo $?
  0

Nothing is ever written to a library:

  $ cksum lib.a > before; touch -d @5 lib.a; chmod 444 lib.a; quarn-json lib.a > /dev/null; cksum lib.a | cmp before -; stat -c %Y lib.a
  5
