The module makes quarn-ar the archiver of an unmodified project, by Ninja and by Makefiles, for three languages:

  $ . "$TESTDIR/setup.sh"
  $ project cmake
  $ for generator in Ninja "Unix Makefiles"; do
  >   out=out_${generator%% *}
  >   cmake -G "$generator" -B $out -DCMAKE_PROJECT_TOP_LEVEL_INCLUDES="$QUARN_MODULE" -DWITH_ASSEMBLER=ON > log
  >   cmake --build $out > log
  >   $out/shapes
  >   cat $(grep -rl 'ar" --diag_style=gnu qc\|ar --diag_style=gnu qc' $out --include=rules.ninja --include=link.txt) |
  >     grep -o 'quarn-ar"* --diag_style=[a-z]* [a-z]*' | tr -d '"' | sort | uniq -c | sed 's/^ *//'
  >   touch assembled.s && cmake --build $out > log && quarn-ar t $out/libassembled.a
  > done
  3 corners
  3 quarn-ar --diag_style=gnu qc
  assembled.s.o
  3 corners
  3 quarn-ar --diag_style=gnu qc
  assembled.s.o

Libraries of a target with link-time optimisation are made by it too, wherever it is said:

  $ optimised() {
  >   rm -rf ipo && cmake -G Ninja -B ipo -DCMAKE_INTERPROCEDURAL_OPTIMIZATION=ON "$@" > log && cmake --build ipo > log
  >   ipo/shapes
  >   sed 's/ --diag_style=gnu qc .*/ made/' ipo/CMakeFiles/rules.ninja | grep -o '[^/ "]*ar"* made\|[^/ "]*-ar[-0-9]*"* cr ' |
  >     tr -d '"' | sort | uniq -c | sed 's/^ *//'
  > }
  $ optimised -DCMAKE_PROJECT_TOP_LEVEL_INCLUDES="$QUARN_MODULE"
  3 corners
  2 quarn-ar made
  $ optimised -DCMAKE_TOOLCHAIN_FILE="$QUARN_MODULE"
  3 corners
  2 quarn-ar made

Another style is a setting, and a target's own options win:

  $ cmake -G Ninja -B out -DCMAKE_PROJECT_TOP_LEVEL_INCLUDES="$QUARN_MODULE" -DQUARN_DIAG_STYLE=ide > log
  $ cmake --build out > log
  $ grep -c 'diag_style=ide' out/CMakeFiles/rules.ninja | sed 's/[1-9].*/some/'
  some

Where there is no archiver, the configuration says so:

  $ cp "$QUARN_MODULE" alone.cmake
  $ PATH=/usr/bin:/bin cmake -B none -DCMAKE_PROJECT_TOP_LEVEL_INCLUDES="$PWD/alone.cmake" 2>&1 | grep -c 'Could not find QUARN_AR'
  1
