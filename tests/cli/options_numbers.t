A number is decimal or, behind 0x, hexadecimal, signed, and has 32 bits.

  $ . "$TESTDIR/setup.sh"
  $ file a.txt a
  $ dated() {
  >   quarn --create --diag_suppress=L6875 "--normalise=$1" lib.a a.txt || return
  >   dd if=lib.a bs=1 skip=88 count=12 status=none; echo '|'
  > }

  $ dated 1
  1           |
  $ dated 0x100
  256         |
  $ dated 0X1f
  31          |
  $ dated 0xFf
  255         |
  $ dated +7
  7           |
  $ dated ' 7'
  7           |
  $ dated 007
  7           |
  $ dated 2147483647
  2147483647  |
  $ dated 0x7fffffff
  2147483647  |

A negative time is written as the low 32 bits, without a sign.

  $ dated -1
  4294967295  |
  $ dated -2147483648
  2147483648  |
  $ dated -0x1
  Fatal error: L3903U: Argument '-0x1' not permitted for option 'normalise'.
  [1]
  $ dated 0x-1
  4294967295  |

What does not fit in 32 bits overflows.

  $ dated 2147483648
  Fatal error: L3908U: Overflow: '2147483648' will not fit in an integer.
  [1]
  $ dated -2147483649
  Fatal error: L3908U: Overflow: '-2147483649' will not fit in an integer.
  [1]
  $ dated 5000000000
  Fatal error: L3908U: Overflow: '5000000000' will not fit in an integer.
  [1]
  $ dated 0xFFFFFFFF
  Fatal error: L3908U: Overflow: '0xFFFFFFFF' will not fit in an integer.
  [1]
  $ dated 0x80000000
  Fatal error: L3908U: Overflow: '0x80000000' will not fit in an integer.
  [1]
  $ dated 99999999999999999999
  Fatal error: L3908U: Overflow: '99999999999999999999' will not fit in an integer.
  [1]
  $ dated 5000000000x
  Fatal error: L3908U: Overflow: '5000000000x' will not fit in an integer.
  [1]

Anything but a number is refused.

  $ dated abc
  Fatal error: L3903U: Argument 'abc' not permitted for option 'normalise'.
  [1]
  $ dated ''
  Fatal error: L3903U: Argument '' not permitted for option 'normalise'.
  [1]
  $ dated 0x
  Fatal error: L3903U: Argument '0x' not permitted for option 'normalise'.
  [1]
  $ dated 0xg
  Fatal error: L3903U: Argument '0xg' not permitted for option 'normalise'.
  [1]
  $ dated 12x
  Fatal error: L3903U: Argument '12x' not permitted for option 'normalise'.
  [1]
  $ dated '12 '
  Fatal error: L3903U: Argument '12 ' not permitted for option 'normalise'.
  [1]
  $ dated 1,2
  Fatal error: L3903U: Argument '1,2' not permitted for option 'normalise'.
  [1]
  $ dated 1.5
  Fatal error: L3903U: Argument '1.5' not permitted for option 'normalise'.
  [1]
  $ dated --5
  Fatal error: L3903U: Argument '--5' not permitted for option 'normalise'.
  [1]

The twin with "no" takes a number as well. Of both, the last one counts.

  $ quarn --no_normalise=5 --create --diag_suppress=L6875 lib.a a.txt
  $ quarn -tv lib.a
  rw-r--r--     0/     0      1 Jan 01 00:00 1970 a.txt (offset     72)
  $ quarn --normalise=7 --no_normalise 6 --create --diag_suppress=L6875 lib.a a.txt
  $ quarn -tv lib.a
  rw-r--r--     0/     0      1 Jan 01 00:00 1970 a.txt (offset     72)
  $ quarn --no_normalise -t lib.a
  Fatal error: L3903U: Argument '-t' not permitted for option 'no_normalise'.
  [1]
  $ quarn --no_normalise
  Fatal error: L3901U: Missing argument for option 'no_normalise'.
  [1]
