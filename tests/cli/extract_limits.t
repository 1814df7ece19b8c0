A name can be too long for a file; -T cuts it.

  $ . "$TESTDIR/setup.sh"
  $ named() { printf 'n%.0s' $(seq "$1"); }
  $ long() { { magic; header // 0 0 0 0 $(($1 + 2)); named $1; printf '/\n'; [ $(($1 % 2)) = 0 ] || echo; header /0 0 0 0 644 2; printf 'in'; } > long.a; }
  $ shorten() { sed 's/n\{200\}/<200>/g'; }
  $ mkdir out

The longest name that a file can have here is 255 bytes.

  $ long 255; (cd out; quarn -xv ../long.a | shorten; ls | wc -c; rm *)
  x - <200>nnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnn
  256

From 256 to 260 the host refuses it.

  $ long 256; (cd out; both quarn -xv ../long.a | shorten; ls)
  err: Error: L6843E: Writing file '<200>nnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnn' : File name too long
  status 1
  $ long 260; (cd out; both quarn -xv ../long.a | shorten; ls)
  err: Error: L6843E: Writing file '<200>nnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnn' : File name too long
  status 1

From 261 on the tool does.

  $ long 261; (cd out; both quarn -xv ../long.a | shorten; ls)
  err: Error: L6842E: Filename '<200>nnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnn' too long for file system
  status 1
  $ long 1500; (cd out; both quarn -xv ../long.a | sed 's/n\{200\}/<200>/g'; ls)
  err: Error: L6842E: Filename '<200><200><200><200><200><200><200>nnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnn' too long for file system
  status 1

With -T the front of the name is kept; the lines show the whole name.

  $ for length in 255 256 260 261 1500; do
  >   long $length; (cd out; both quarn -xvT ../long.a | shorten; ls | wc -c; cat *; echo; rm *)
  > done
  out: x - <200>nnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnn
  status 0
  256
  in
  out: x - <200>nnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnn
  status 0
  256
  in
  out: x - <200>nnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnn
  status 0
  256
  in
  out: x - <200>nnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnn
  status 0
  256
  in
  out: x - <200><200><200><200><200><200><200>nnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnn
  status 0
  256
  in

-C looks for the cut name and shows it.

  $ long 300; (cd out; quarn -xT ../long.a; both quarn -xvTC ../long.a | shorten; ls | wc -c)
  err: Error: L6836E: '<200>nnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnn' already exists, so will not be extracted
  status 1
  256

One long name does not keep the others from being extracted.

  $ { cat long.a; header short/ 0 0 0 644 2; printf 'ok'; } > mixed.a
  $ (cd out; rm *; both quarn -xv ../mixed.a | shorten; ls)
  out: x - short
  err: Error: L6842E: Filename '<200>nnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnn' too long for file system
  status 1
  short

Such names are listed, matched and kept.

  $ quarn -t mixed.a | shorten
  <200>nnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnn
  short
  $ quarn -t mixed.a 'nnn*' | shorten
  <200>nnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnn
  $ cp mixed.a before.a; quarn -d mixed.a short
  $ quarn -s mixed.a; quarn -t mixed.a | shorten
  <200>nnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnnn
