# Sourced by transcripts in which a run meets with something that is used up. before/ is the folder in
# which it starts; what it shall come to stands in after/ and after.out.

# planned COMMAND...: what the command does where nothing is in its way.
planned() {
  rm -rf after
  cp -a before after
  (cd after && "$@") > after.out 2> after.err
}

# limited LIMIT COMMAND...: the command in a fresh folder, behind a limit that is a command of the shell.
# Says what is not kept. Its streams are pipes, which the limits leave alone.
limited() {
  local limit=$1
  shift
  rm -rf now
  cp -a before now
  (
    set -o pipefail
    { (cd now && eval "$limit" && exec "$@") 2>&1 >&7 7>&- | cat > now.err; } 7>&1 | cat > now.out
  ) 2> /dev/null
  status=$?
  judged now | sed "s/^/$limit: /"
  statuses+="$status "
}

# judged FOLDER: the promises to a run that has ended with $status: 0 and the whole result; or 1 with a
# report, and each file old or new, and none half or besides.
judged() {
  local name
  if [ "$status" = 0 ]; then
    diff -r "$1" after
    cmp -s now.out after.out || echo 'status 0 with another output'
    return
  fi
  if [ "$status" != 1 ] || [ ! -s now.err ]; then echo "status $status without a report"; fi
  for name in "$1"/*; do
    cmp -s "$name" "before/${name##*/}" || cmp -s "$name" "after/${name##*/}" ||
      echo "${name##*/} is neither old nor new"
  done
  for name in before/*; do [ -e "$1/${name##*/}" ] || echo "${name##*/} is gone"; done
}

# met: the different statuses of the runs so far, in order.
met() {
  printf '%s\n' $statuses | sort -nu | xargs
  statuses=''
}

# each LIMITS FROM TO STEP WORD...: a run of the words behind each of the limits.
each() {
  local limit=$1 from=$2 to=$3 step=$4 size
  shift 4
  planned "$@"
  for size in $(seq "$from" "$step" "$to"); do limited "$limit $size" "$@"; done
  met
}

# memoryDisk, imageDisk: mounts a small disk at disk/.
memoryDisk() {
  mount -t tmpfs -o size=128k none disk
}
imageDisk() {
  dd if=/dev/zero of=image bs=1K count=256 status=none && mke2fs -q -F image && mount -o loop image disk
}

# alone COMMAND...: a function where nobody else sees what it mounts.
alone() {
  local new=(--mount)
  [ "$(id -u)" = 0 ] || new+=(--user --map-root-user)
  # Only what is exported goes with it.
  export -f $(compgen -A function)
  unshare "${new[@]}" bash -c '"$@"' - "$@"
}

# filled DISK COMMAND...: the command on a disk that is full but for nothing, then for a little, and so
# on until there is room enough.
filled() {
  local disk=$1 room
  shift
  planned "$@"
  for room in $(seq 0 4 120); do
    $disk && cp -p before/* disk || return
    dd if=/dev/zero of=disk/filler bs=1K status=none 2> /dev/null
    truncate -s "-${room}K" disk/filler
    status=0
    (cd disk && exec "$@") > now.out 2> now.err || status=$?
    rm -rf now disk/filler disk/lost+found
    cp -a disk now
    umount disk
    judged now | sed "s/^/$room KB: /"
    statuses+="$status "
    [ "$status" != 0 ] || break
  done
  met
}
