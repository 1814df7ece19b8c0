# Sourced by every transcript. QUARN_EXAMPLES is the folder of sample objects; the tools under test
# are first on the PATH; each transcript runs in an empty folder of its own.
umask 022
export TZ=UTC LC_ALL=C
# Without a leak checker's own exit status and words getting between.
export ASAN_OPTIONS=detect_leaks=0:${ASAN_OPTIONS:-}

# file NAME TEXT: a file with exactly this text, dated 2001-09-09 01:46:40.
file() {
  printf '%s' "$2" > "$1"
  touch -d @1000000000 "$1"
}

# bytes FILE: every byte of a file, to be compared.
bytes() {
  od -A d -t x1z -v "$1"
}

# both COMMAND...: shows stdout and stderr apart, and the status.
both() {
  local status=0
  "$@" > "$CRAMTMP/stdout" 2> "$CRAMTMP/stderr" || status=$?
  sed 's/^/out: /' "$CRAMTMP/stdout"
  if [ -n "$(tail -c 1 "$CRAMTMP/stdout")" ]; then echo; fi
  sed 's/^/err: /' "$CRAMTMP/stderr"
  echo "status $status"
}

# header NAME DATE UID GID MODE SIZE: one member header as it stands in a file.
header() {
  printf '%-16s%-12s%-6s%-6s%-8s%-10s`\n' "$@"
}

# library NAME FILE...: an archive of these files made by the tool, the same on every day.
library() {
  quarn --create --normalise=1000000000 --diag_suppress=L6875 "$@"
}

# magic: how each archive begins.
magic() {
  printf '!<arch>\n'
}

# member NAME_FIELD TEXT: a whole member as it stands in a file: header, text, padding.
member() {
  header "$1" 0 0 0 100644 "${#2}"
  printf '%s' "$2"
  if (( ${#2} % 2 )); then echo; fi
}

# words NUMBER...: 32-bit numbers as a symbol table holds them, the high byte first.
words() {
  local number
  for number in "$@"; do
    printf '%b' "$(printf '\\x%02x' $(( number >> 24 & 255 )) $(( number >> 16 & 255 )) \
      $(( number >> 8 & 255 )) $(( number & 255 )))"
  done
}

# asNobody ARGUMENT...: the tool run by somebody who owns nothing here, or simply by a user who is not
# root. The folders that lead to the tool may be closed to others, so it is started through a descriptor.
asNobody() {
  if [ "$(id -u)" != 0 ]; then quarn "$@"; return; fi
  setpriv --reuid=65534 --regid=65534 --clear-groups -- /proc/self/fd/9 "$@" 9< "$(command -v quarn)"
}

# table NAMES OFFSET...: a symbol table as it stands in a file; the names are a printf format that
# writes the end of each name as \0.
table() {
  local names=$1 size
  shift
  size=$(( 4 + 4 * $# + $(printf "$names" | wc -c) ))
  header / 0 0 0 0 "$size"
  words $# "$@"
  printf "$names"
  if (( size % 2 )); then echo; fi
}

# patch FILE OFFSET HEXBYTES: these bytes in the place of those that stand there.
patch() {
  local hex=${3//[ $'\n']/} bytes='' at
  for (( at = 0; at < ${#hex}; at += 2 )); do bytes+="\\x${hex:at:2}"; done
  printf '%b' "$bytes" | dd of="$1" bs=64K oflag=seek_bytes seek=$(( $2 )) conv=notrunc status=none
}

# little SIZE NUMBER...: the numbers as hex bytes, the low byte first.
little() {
  local size=$1 number left digits text=''
  shift
  for number in "$@"; do
    for (( left = size; left > 0; --left )); do
      printf -v digits '%02x' $(( number & 255 ))
      text+=$digits
      number=$(( number >> 8 ))
    done
  done
  printf '%s' "$text"
}

# The places of fields, as offset and size, in the header and in the rows of a little-endian object of
# class 1. The helpers below are for such objects only. Transcripts call them by the hundred, and what
# takes time is starting a program: od and dd are started once for what is read or written at once.
declare -A elfFields=([class]='4 1' [data]='5 1' [type]='16 2' [machine]='18 2' [version]='20 4'
  [entry]='24 4' [phoff]='28 4' [shoff]='32 4' [ehsize]='40 2' [phentsize]='42 2' [phnum]='44 2'
  [shentsize]='46 2' [shnum]='48 2' [shstrndx]='50 2')
declare -A sectionFields=([name]='0 4' [type]='4 4' [flags]='8 4' [addr]='12 4' [offset]='16 4' [size]='20 4'
  [link]='24 4' [info]='28 4' [addralign]='32 4' [entsize]='36 4')
declare -A symbolFields=([name]='0 4' [value]='4 4' [size]='8 4' [info]='12 1' [other]='13 1' [shndx]='14 2')

# numberAt FILE OFFSET SIZE: the number that stands there, in $number.
numberAt() {
  read -r number < <(od -A n -v -t "u$3" --endian=little -j "$2" -N "$3" "$1")
}

# field FILE BASE PLACE [NUMBER]: says a number, or sets it.
field() {
  local place=($3) number
  if [ $# = 4 ]; then patch "$1" $(( $2 + place )) "$(little "${place[1]}" "$4")"; return; fi
  numberAt "$1" $(( $2 + place )) "${place[1]}"
  echo "$number"
}

# elf FILE FIELD [NUMBER]: a field of the header.
elf() {
  field "$1" 0 "${elfFields[$2]}" ${3:+"$3"}
}

# section FILE INDEX FIELD [NUMBER]: a field of a section's row.
section() {
  local number
  numberAt "$1" ${elfFields[shoff]}
  field "$1" $(( number + 40 * $2 )) "${sectionFields[$3]}" ${4:+"$4"}
}

# symbol FILE INDEX FIELD [NUMBER]: a field of a row of the first symbol table.
symbol() {
  local number rows words at
  numberAt "$1" ${elfFields[shoff]}
  rows=$number
  numberAt "$1" ${elfFields[shnum]}
  words=($(od -A n -v -t u4 --endian=little -j "$rows" -N $(( 40 * number )) "$1"))
  for (( at = 0; at < ${#words[@]}; at += 10 )); do
    (( words[at + 1] == 2 )) || continue
    field "$1" $(( words[at + 4] + 16 * $2 )) "${symbolFields[$3]}" ${4:+"$4"}
    return
  done
  echo "$1 has no symbol table"
  return 1
}

# addSection FILE TYPE HEXBYTES [FIELD NUMBER]...: one more section, the last. The rows move to the end.
addSection() {
  local file=$1 type=$2 bytes=${3// /} number count rows end
  shift 3
  numberAt "$file" ${elfFields[shnum]}
  count=$number
  numberAt "$file" ${elfFields[shoff]}
  rows=$(od -A n -v -t x1 -j "$number" -N $(( 40 * count )) "$file")
  end=$(stat -c %s "$file")
  patch "$file" "$end" "$bytes$rows$(little 4 0 "$type" 0 0 "$end" $(( ${#bytes} / 2 )) 0 0 0 0)"
  elf "$file" shoff $(( end + ${#bytes} / 2 ))
  elf "$file" shnum $(( count + 1 ))
  while (( $# )); do
    section "$file" "$count" "$1" "$2"
    shift 2
  done
}

# addSegment FILE TYPE OFFSET FILE_SIZE MEMORY_SIZE FLAGS: one more program header. The rows move to the end.
addSegment() {
  local file=$1 number count rows end
  numberAt "$file" ${elfFields[phnum]}
  count=$number
  numberAt "$file" ${elfFields[phoff]}
  rows=$(od -A n -v -t x1 -j "$number" -N $(( 32 * count )) "$file")
  end=$(stat -c %s "$file")
  patch "$file" "$end" "$rows$(little 4 "$2" "$3" 0 0 "$4" "$5" "$6" 0)"
  elf "$file" phoff "$end"
  elf "$file" phnum $(( count + 1 ))
}

# variant FILE [TEXT...]: an object that defines "gcd" alone, with these attribute texts in symbols of its own.
variant() {
  local file=$1 symbols=() text
  shift
  for text; do symbols+=(--add-symbol "BuildAttributes\$$text=0,local"); done
  llvm-objcopy --keep-global-symbol=wide_gcd --redefine-sym wide_gcd=gcd --remove-section .ZEV.attributes \
    "${symbols[@]}" "$QUARN_EXAMPLES/wide_plain.o" "$file"
}

# variants TEXT...: a library lib.a of a build for each text, made with ${options[@]}, and what its symbol table says.
options=()
variants() {
  local text number=0
  rm -f ?.o lib.a
  for text; do number=$(( number + 1 )); variant $number.o ${text:+"$text"}; done
  quarn --create --normalise=1000000000 "${options[@]}" lib.a ?.o || return
  listed lib.a
}

# published FILE: the names in the symbol table, as they stand in the file. The count and the offsets are in front.
published() {
  local header size count
  IFS= read -r -N 66 header < "$1"
  size=${header: -10}
  count=$(od -A n -t u4 --endian=big -j 68 -N 4 "$1")
  tail -c +$(( 73 + 4 * count )) "$1" | head -c $(( size - 4 - 4 * count )) | tr '\0\n' '\n~'
}

# listed FILE: what the tool says of the names and their members.
listed() {
  quarn --zs "$1" | awk '{ print $1, $3 }'
}
