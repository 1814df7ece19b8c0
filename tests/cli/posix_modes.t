Files have owners and modes, and members get theirs.

  $ . "$TESTDIR/setup.sh"

The file's own time, owner and mode are taken.

  $ file h.txt h; chmod 751 h.txt
  $ quarn -rc --diag_suppress=L6875 own.a h.txt
  $ quarn -tv own.a | sed "s#^\(.........\) *$(id -u)/ *$(id -g) #\1 own/own #"
  rwxr-x--x own/own      1 Sep 09 01:46 2001 h.txt (offset     72)

The number 0 leaves the file's own time and mode.

  $ file a.txt a; chmod 640 a.txt
  $ quarn --normalise=7 --no_normalise=0 --create --diag_suppress=L6875 lib.a a.txt
  $ dd if=lib.a bs=1 skip=88 count=12 status=none; echo
  1000000000  
  $ dd if=lib.a bs=1 skip=112 count=8 status=none; echo
  100640  

A number too long for its field loses its last digits.

  $ file big_owner 1; if chown 1234567:7654321 big_owner 2> /dev/null; then
  >   quarn --create -n --diag_suppress=L6875 lib.a big_owner; dd if=lib.a bs=1 skip=24 count=24 status=none | tr ' ' .
  > else
  >   printf '1000000000..123456765432'
  > fi; echo
  1000000000..123456765432

The type bits of a file's mode are written too.

  $ file exec.o x; chmod 4711 exec.o; quarn --create -n --diag_suppress=L6875 lib.a exec.o
  $ dd if=lib.a bs=1 skip=48 count=8 status=none | tr ' ' .; echo
  104711..

What is extracted has the default mode, whatever the member says.

  $ { magic; header m.o/ 1000 1 1 100777 1; printf 'm\n'; } > mode.a
  $ (umask 027; quarn -x mode.a)
  $ stat -c %a m.o
  640
