Converters are shared objects of the machine, which may be damaged, or made for another C library.
Where one breaks, the page is one that the host lacks. The tool stays whole, and silent about it.

  $ . "$TESTDIR/setup.sh"
  $ for tool in gcc iconv; do command -v $tool > /dev/null || exit 80; done
  $ getconf GNU_LIBC_VERSION > /dev/null 2>&1 || exit 80
  $ file a.o a; library lib.a a.o

broken CODE: makes that the first function of a converter, for two pages that there are not and for the
Chinese one. Another program that asks for one of them shows that it is found. Without its converter the
Chinese page is UTF-8.

  $ mkdir converters
  $ for name in CP4001 CP4002 EUC-CN; do echo "module INTERNAL $name// BROKEN 1"; done > converters/gconv-modules
  $ broken() {
  >   echo "#include <stdlib.h>
  >   int gconv_init(void *step) { (void)step; $1 }
  >   int gconv(void) { return 0; }" > broken.c
  >   gcc -shared -fPIC -o converters/BROKEN.so broken.c
  > }
  $ export GCONV_PATH=$PWD/converters
  $ tried() {
  >   for locale in 4001 ja_JP.4002 ja_JP.gb2312; do both quarn --message_locale=$locale -t none; done
  > }
  $ broken 'abort();'
  $ (ulimit -c 0; echo a | iconv -f UTF-8 -t CP4001 > /dev/null 2>&1; echo $?) 2> /dev/null
  134
  $ tried
  err: Fatal error: L9780E: Could not initialise message locale 4001
  status 1
  err: Fatal error: L9780E: Could not initialise message locale ja_JP.4002
  status 1
  err: Error: L6832E: アーカイブ 'none' が見つかりません : No such file or directory
  status 1
  $ broken '*(volatile int *)8 = 1; return 0;' && tried
  err: Fatal error: L9780E: Could not initialise message locale 4001
  status 1
  err: Fatal error: L9780E: Could not initialise message locale ja_JP.4002
  status 1
  err: Error: L6832E: アーカイブ 'none' が見つかりません : No such file or directory
  status 1
  $ head -c 3000 converters/BROKEN.so > cut && mv cut converters/BROKEN.so && tried
  err: Fatal error: L9780E: Could not initialise message locale 4001
  status 1
  err: Fatal error: L9780E: Could not initialise message locale ja_JP.4002
  status 1
  err: Error: L6832E: アーカイブ 'none' が見つかりません : No such file or directory
  status 1
  $ echo text > converters/BROKEN.so && tried
  err: Fatal error: L9780E: Could not initialise message locale 4001
  status 1
  err: Fatal error: L9780E: Could not initialise message locale ja_JP.4002
  status 1
  err: Error: L6832E: アーカイブ 'none' が見つかりません : No such file or directory
  status 1
  $ ls
  a.o
  broken.c
  converters
  lib.a

A tool that was started without standard streams, or by somebody who doesn't wait for children, has its
pages nevertheless.

  $ unset GCONV_PATH
  $ iconv -f UTF-8 -t CP1252 < /dev/null 2> /dev/null || exit 80
  $ quarn --message_locale=1252 -t lib.a <&- 2>&-
  a.o
  $ (trap '' CHLD; quarn --message_locale=1252 -t lib.a)
  a.o
