# Sourced by every transcript here. QUARN_PROJECTS is the folder of the projects; the archiver under
# test is on the PATH; each transcript runs in an empty folder of its own.
umask 022
export TZ=UTC LC_ALL=C
export ASAN_OPTIONS=detect_leaks=0:${ASAN_OPTIONS:-}
unset AR RANLIB ARFLAGS CC CXX CFLAGS CXXFLAGS LDFLAGS MAKEFLAGS

# project NAME: a copy of the project, in a folder of its name.
project() {
  cp -r "$QUARN_PROJECTS/$1" .
  cd "$1"
}

# manyObjects FOLDER: 4,000 objects, f_0000.o to f_3999.o, each with a function of its name.
manyObjects() {
  mkdir "$1"
  echo 'int f_0000(void) { return 1; }' | cc -x c -c - -o "$1/f_0000.o"
  python3 - "$1" << 'END'
import pathlib, sys
folder = pathlib.Path(sys.argv[1])
first = (folder / "f_0000.o").read_bytes()
for number in range(1, 4000):
    name = "f_%04d" % number
    (folder / (name + ".o")).write_bytes(first.replace(b"f_0000", name.encode()))
END
}
