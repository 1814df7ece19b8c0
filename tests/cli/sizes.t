--sizes shows how many bytes of each object are code and data, and the sums.

  $ . "$TESTDIR/setup.sh"
  $ cp "$QUARN_EXAMPLES"/*_plain.o "$QUARN_EXAMPLES"/*_debug.o "$QUARN_EXAMPLES"/*_sections.o .
  $ quarn --create plain.a *_plain.o
  $ both quarn --sizes plain.a
  out: 
  out:       Code    RO Data    RW Data    ZI Data      Debug   Object Name
  out:        908         40          0      65552          0   allocator_plain.o
  out:       4592          8          0          8          0   automaton_plain.o
  out:       1624         56          0          0          0   bignum_plain.o
  out:       1372        132          0          0          0   calendar_plain.o
  out:       2992         40          0          0          0   matrix_plain.o
  out:        912         80          0          0          0   wide_plain.o
  out:      12400        356          0      65560          0   TOTAL
  out: 
  status 0

Debug information has a column of its own, and functions in sections of their own are added up.

  $ quarn --create debug.a *_debug.o; quarn --sizes debug.a
  
        Code    RO Data    RW Data    ZI Data      Debug   Object Name
         908         40          0      65552       2770   allocator_debug.o
        4864          8          0          8       3871   automaton_debug.o
        1124         56          0          0       3286   bignum_debug.o
        1352        132          0          0       2988   calendar_debug.o
        1348         40          0          0       2616   matrix_debug.o
         912         80          0          0       2622   wide_debug.o
       10508        356          0      65560      18153   TOTAL
  
  $ quarn --create sections.a *_sections.o; quarn --sizes sections.a | sed 's/sections/plain/' | diff <(quarn --sizes plain.a) -

The other classes and byte orders.

  $ for folder in 40-big 183-little 183-big; do
  >   quarn --create other.a "$QUARN_OBJECTS"/$folder/*.o; quarn --sizes other.a
  > done
  
        Code    RO Data    RW Data    ZI Data      Debug   Object Name
         908         40          0      65552          0   allocator_plain.o
        4592          8          0          8          0   automaton_plain.o
        1624         56          0          0          0   bignum_plain.o
        1372        132          0          0          0   calendar_plain.o
        2992         40          0          0          0   matrix_plain.o
         916         80          0          0          0   wide_plain.o
       12404        356          0      65560          0   TOTAL
  
  
        Code    RO Data    RW Data    ZI Data      Debug   Object Name
        1024          0          0      65568          0   allocator_plain.o
        3952        606          0          8          0   automaton_plain.o
        1776          0          0          0          0   bignum_plain.o
        1440        100          0          0          0   calendar_plain.o
        1288         64          0          0          0   matrix_plain.o
         552          0          0          0          0   wide_plain.o
       10032        770          0      65576          0   TOTAL
  
  
        Code    RO Data    RW Data    ZI Data      Debug   Object Name
        1048          0          0      65568          0   allocator_plain.o
        3952        606          0          8          0   automaton_plain.o
        1828          0          0          0          0   bignum_plain.o
        1440        100          0          0          0   calendar_plain.o
        1400         64          0          0          0   matrix_plain.o
         560          0          0          0          0   wide_plain.o
       10228        770          0      65576          0   TOTAL
  

Words do not choose: the whole archive is shown, in its order, and nothing is missed or written.

  $ cp plain.a before.a; quarn -m -a wide_plain.o plain.a allocator_plain.o
  $ quarn --sizes plain.a none.o wide_plain.o | sed 's/.* //'
  
  Name
  automaton_plain.o
  bignum_plain.o
  calendar_plain.o
  matrix_plain.o
  wide_plain.o
  allocator_plain.o
  TOTAL
  
  $ cp before.a plain.a; chmod 444 plain.a; quarn --sizes plain.a > /dev/null; cmp plain.a before.a; ls | grep -v '[.][ao]$'
  [1]

Without members, without objects, and with one that cannot be read there is still the row of sums.

  $ nothing() {
  >   both quarn --sizes "$1"
  > }
  $ magic > empty.a; nothing empty.a
  out: 
  out:       Code    RO Data    RW Data    ZI Data      Debug   Object Name
  out:          0          0          0          0          0   TOTAL
  out: 
  status 0
  $ file text.txt text; library text.a text.txt; nothing text.a
  out: 
  out:       Code    RO Data    RW Data    ZI Data      Debug   Object Name
  out:          0          0          0          0          0   TOTAL
  out: 
  status 0
  $ x() { cp wide_plain.o x.o; }
  $ x; elf x.o machine 3; library mixed.a --diag_suppress=warning x.o text.txt matrix_plain.o; nothing mixed.a
  out: 
  out:       Code    RO Data    RW Data    ZI Data      Debug   Object Name
  out:       2992         40          0          0          0   matrix_plain.o
  out:       2992         40          0          0          0   TOTAL
  out: 
  status 0
  $ both quarn --sizes --diag_error=warning --diag_error=L6974 mixed.a | tail -2
  out: 
  status 0
  $ both quarn --sizes none.a
  err: Error: L6832E: Archive 'none.a' not found : No such file or directory
  status 1
