An archive whose name leaves no room for anything behind it is written like any other.

  $ . "$TESTDIR/setup.sh"
  $ file a.o a; file b.o b
  $ for length in 253 254 255; do
  >   name=$(printf "%0$((length - 2))d.a" 0)
  >   quarn-ar rc "$name" a.o; quarn-ar r "$name" b.o; quarn-ar t "$name" | tr '\n' ' '
  >   quarn -d "$name" a.o; quarn -t "$name"
  > done
  a.o b.o b.o
  a.o b.o b.o
  a.o b.o b.o
  $ ls | sed "s/^00*/0/"
  0.a
  0.a
  0.a
  a.o
  b.o

One that is too long is no name.

  $ quarn-ar rc "$(printf '%0254d.a' 0)" a.o 2>&1 | sed 's/0000*/0/'
  quarn-ar: Error: L6830E: Writing file '0.a' : File name too long
