An installation goes into any folder, and may be moved afterwards:

  $ cmake --install "$QUARN_BUILD" --prefix "$PWD/first" > /dev/null
  $ mkdir other && mv first other/place
  $ place=$PWD/other/place
  $ (cd other/place && ls -d */* include/quarn/*)
  bin/quarn
  bin/quarn-ar
  bin/quarn-json
  bin/quarn-ranlib
  include/quarn
  include/quarn/alloclib
  include/quarn/arlib
  include/quarn/checking
  include/quarn/elfext
  include/quarn/messages
  include/quarn/support
  include/quarn/tabledrivenparser
  lib/cmake
  lib/libquarn_alloclib.a
  lib/libquarn_arlib.a
  lib/libquarn_checking.a
  lib/libquarn_elfext.a
  lib/libquarn_messages.a
  lib/libquarn_support.a
  lib/libquarn_tabledrivenparser.a
  lib/pkgconfig
  share/bash-completion
  share/fish
  share/man
  share/quarn
  share/zsh
  $ (cd other/place/share && find . -type f | sort)
  ./bash-completion/completions/quarn
  ./bash-completion/completions/quarn-ar
  ./bash-completion/completions/quarn-json
  ./bash-completion/completions/quarn-ranlib
  ./fish/vendor_completions.d/quarn-ar.fish
  ./fish/vendor_completions.d/quarn-json.fish
  ./fish/vendor_completions.d/quarn-ranlib.fish
  ./fish/vendor_completions.d/quarn.fish
  ./man/man1/quarn-ar.1
  ./man/man1/quarn-json.1
  ./man/man1/quarn-ranlib.1
  ./man/man1/quarn.1
  ./man/man5/quarn-archive.5
  ./man/man7/quarn-attributes.7
  ./quarn/QuarnArchiver.cmake
  ./quarn/problem-matcher.json
  ./quarn/quarn-json.schema.json
  ./zsh/site-functions/_quarn

Nothing in it knows where it was built, or installed first:

  $ grep -rlF -e "$QUARN_TREE" -e "$QUARN_BUILD" -e "$PWD/first" other/place
  [1]

Its headers need nothing but each other. That each compiles alone is tested where they come from.

  $ (cd other/place/include/quarn && find . -name '*.h' | sort | sed 's/.*/#include "&"/') > all.cpp
  $ "$CXX" -std=c++20 -fsyntax-only -Wall -Wextra -Wpedantic -Werror -I other/place/include/quarn all.cpp

A library to look at:

  $ other/place/bin/quarn --create --qobix_buildattr --diag_suppress=6877 libwide.a \
  >   "$QUARN_TREE"/examples/wide_plain.o "$QUARN_TREE"/examples/wide_build_d.o

The examples, as projects of somebody who has installed the libraries:

  $ build() {
  >   cmake -S "$QUARN_TREE/examples/$1" -B "$1" -G Ninja -DCMAKE_PREFIX_PATH="$place" > log 2>&1 &&
  >     cmake --build "$1" >> log 2>&1 || cat log
  > }
  $ build list_members
  $ list_members/list_members libwide.a
      2448  wide_plain.o
      2168  wide_build_d.o
  $ list_members/list_members all.cpp
  all.cpp: File does not begin with the archive magic number (not an archive file?)
  [1]

  $ build best_build
  $ best_build/best_build libwide.a wide_gcd '$ZEV_ISAv3$P$D$K$B$S$IEEE1'
  wide_build_d.o
  $ best_build/best_build libwide.a wide_gcd '$ZEV_ISAv3'
  wide_plain.o

  $ build command_line
  $ echo '--shout Ada' > words.via
  $ command_line/command_line --times=2 --via=words.via Grace
  Hello, Ada!
  Hello, Ada!
  Hello, Grace!
  Hello, Grace!
  $ command_line/command_line --whisper Ada
  unknown option: --whisper
  [1]

The same by pkg-config, which knows what each library needs:

  $ export PKG_CONFIG_PATH=$place/lib/pkgconfig
  $ pkg-config --print-requires quarn-messages
  quarn-tabledrivenparser
  quarn-support
  quarn-alloclib
  quarn-checking
  $ "$CXX" -std=c++20 "$QUARN_TREE/examples/list_members/main.cpp" -o by_hand \
  >   $(pkg-config --cflags --libs quarn-arlib)
  $ ./by_hand libwide.a
      2448  wide_plain.o
      2168  wide_build_d.o

CMake finds parts and programs by name, and refuses what is not there:

  $ ask() {
  >   printf '%s\n' 'cmake_minimum_required(VERSION 3.25)' 'project(ask CXX)' "$@" > CMakeLists.txt
  >   cmake -S . -B ask -G Ninja -DCMAKE_PREFIX_PATH="$place" 2>&1 > out.txt |
  >     grep -o 'There is no component [a-z]*\|requested version "2"'
  >   sed -n 's/^-- told: //p' out.txt
  > }
  $ ask 'find_package(quarn REQUIRED COMPONENTS elfext messages)' \
  >   'get_target_property(tool quarn::quarn LOCATION)' \
  >   'file(RELATIVE_PATH tool ${CMAKE_PREFIX_PATH} ${tool})' 'message(STATUS "told: ${tool}")'
  bin/quarn
  $ ask 'find_package(quarn REQUIRED)' 'include(QuarnArchiver)' \
  >   'file(RELATIVE_PATH tool ${CMAKE_PREFIX_PATH} ${CMAKE_AR})' 'message(STATUS "told: ${tool}")'
  bin/quarn-ar
  $ ask 'find_package(quarn REQUIRED COMPONENTS kitchen)'
  There is no component kitchen
  $ ask 'find_package(quarn 2 REQUIRED)'
  requested version "2"
