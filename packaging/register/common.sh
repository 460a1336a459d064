# What the brokers' parts of corvcpu-register share. Sourced, not run.
#
# Paths in variables and records are those inside $root; "$root$path" is the file.
# shellcheck shell=sh disable=SC2034,SC2154

libraries='corvcpuprofileprovider corvcomputersystemprovider'
namespace=root/cimv2
system_class=HALDA_ComputerSystem

say() { printf '%s\n' "$*"; }

fail() {
  printf 'corvcpu-register: %s\n' "$*" >&2
  exit 1
}

# step DESCRIPTION COMMAND...: says what is done and does it, or only says it.
step() {
  if $dry_run; then
    say "would $1"
    return 0
  fi
  say "$1"
  shift
  "$@"
}

need_file() { [ -f "$root$1" ] || fail "$2: $root$1 is missing; $3"; }
need_directory() { [ -d "$root$1" ] || fail "$2: $root$1 is missing; $3"; }

# need_writable DIRECTORY: this one, or the nearest above it that exists.
need_writable() {
  directory=$1
  while [ ! -d "$root$directory" ]; do directory=$(dirname "$directory"); done
  [ -w "$root$directory" ] || fail "cannot write to $root$directory; run this as root"
}

# first_of PROPERTY PATH...: the first path that has the property (-f, -d, -x of test).
first_of() {
  property=$1
  shift
  for path; do
    if test "$property" "$root$path"; then
      printf '%s\n' "$path"
      return 0
    fi
  done
  return 1
}

# expand PATTERN...: the paths inside $root that match.
expand() {
  for pattern; do
    for path in "$root"$pattern; do
      [ ! -e "$path" ] || printf '%s\n' "${path#"$root"}"
    done
  done
}

# elf_class FILE: 1 for 32-bit, 2 for 64-bit, nothing for what is no ELF file.
elf_class() {
  [ "$(od -An -c -N4 "$1" | tr -d ' ')" = '177ELF' ] || return 0
  od -An -tu1 -j4 -N1 "$1" | tr -d ' '
}

# find_libraries DAEMON: sets $library_directory to where the libraries lie that the daemon can load.
find_libraries() {
  elf_kind=$(elf_class "$root$1")
  library_directory=
  for candidate in $(expand "$prefix/lib/*/cmpi" "$prefix/lib64/cmpi" "$prefix/lib32/cmpi" "$prefix/lib/cmpi"); do
    file=$candidate/libcorvcpuprofileprovider.so
    [ -f "$root$file" ] || continue
    if [ -z "$elf_kind" ] || [ "$(elf_class "$root$file")" = "$elf_kind" ]; then
      library_directory=$candidate
      break
    fi
  done
  case $elf_kind in 1) bits='32-bit ' ;; 2) bits='64-bit ' ;; *) bits= ;; esac
  [ -n "$library_directory" ] ||
    fail "no ${bits}libcorvcpuprofileprovider.so below $root$prefix/lib*; install the ${bits}provider package: $root$1 can load no other"
  for library in $libraries; do
    need_file "$library_directory/lib$library.so" "half an installation" "install the provider package again"
  done
}

# record_of KIND: the list of what was done to a broker, one "kind value..." a line.
record_of() { printf '/var/lib/corvane/%s.record\n' "$1"; }

# recorded KIND WORD...: the record's lines with this first word, without it.
recorded() {
  file=$root$(record_of "$1")
  [ ! -f "$file" ] || sed -n "s|^$2 ||p" "$file"
}

is_recorded() { [ -f "$root$(record_of "$1")" ] && grep -qxF "$2" "$root$(record_of "$1")"; }

# record KIND LINE: remembered once. Written before the step it tells of, so that an interrupted
# installation can be completed or taken back.
record() {
  if $dry_run || is_recorded "$1" "$2"; then return 0; fi
  mkdir -p "$root/var/lib/corvane"
  printf '%s\n' "$2" >>"$root$(record_of "$1")"
}

forget() {
  if $dry_run; then return 0; fi
  rm -f "$root$(record_of "$1")"
  rmdir "$root/var/lib/corvane" 2>/dev/null || :
}

# make_directory KIND PATH: with those above it, each remembered.
make_directory() {
  [ ! -d "$root$2" ] || return 0
  make_directory "$1" "$(dirname "$2")"
  record "$1" "directory $2"
  $dry_run || mkdir "$root$2"
}

# put KIND SOURCE TARGET: copies a file unless it is there already.
put() {
  make_directory "$1" "$(dirname "$3")"
  if cmp -s "$root$2" "$root$3"; then
    record "$1" "file $3"
    return 0
  fi
  changed=true
  record "$1" "file $3"
  step "copy $2 to $3" copy_file "$root$2" "$root$3"
}

# A reader never sees half a file.
copy_file() {
  cp "$1" "$2.new"
  chmod 644 "$2.new"
  mv "$2.new" "$2"
}

# link_libraries KIND DIRECTORY: what a broker finds by exactly lib<location>.so in its own directory.
link_libraries() {
  [ "$2" != "$library_directory" ] || return 0
  for library in $libraries; do
    target=$library_directory/lib$library.so
    link=$2/lib$library.so
    [ "$(readlink "$root$link" || :)" != "$target" ] || continue
    changed=true
    record "$1" "link $link"
    step "link $link to $target" ln -sfn "$target" "$root$link"
  done
}

# check_links KIND DIRECTORY: a file of that name that is not ours is not overwritten.
check_links() {
  [ "$2" != "$library_directory" ] || return 0
  need_writable "$2"
  for library in $libraries; do
    link=$2/lib$library.so
    if [ -e "$root$link" ] || [ -L "$root$link" ]; then
      [ "$(readlink "$root$link" || :)" = "$library_directory/lib$library.so" ] || is_recorded "$1" "link $link" ||
        fail "$root$link exists and was not put there by this program; move it away"
    fi
  done
}

# missing KIND: the first recorded file or link that is not there, or leads nowhere.
missing() {
  for path in $(recorded "$1" file); do
    [ -f "$root$path" ] || { say "$path" && return 0; }
  done
  for path in $(recorded "$1" link); do
    { [ -L "$root$path" ] && [ -f "$root$(readlink "$root$path")" ]; } || { say "$path" && return 0; }
  done
  return 1
}

# is_listed VALUE LIST...
is_listed() {
  wanted=$1
  shift
  for each; do
    [ "$each" != "$wanted" ] || return 0
  done
  return 1
}

# take_back KIND: removes recorded links, files and the directories that are empty then. Files whose
# path stands in $kept stay.
take_back() {
  for link in $(recorded "$1" link); do
    [ ! -L "$root$link" ] || step "remove $link" rm "$root$link"
  done
  for file in $(recorded "$1" file); do
    # shellcheck disable=SC2086
    if is_listed "$file" ${kept:-}; then continue; fi
    [ ! -f "$root$file" ] || step "remove $file" rm "$root$file"
  done
  recorded "$1" directory | sort -r | while read -r directory; do
    $dry_run || rmdir "$root$directory" 2>/dev/null || :
  done
}

# classes_of MOF: the classes that a file declares; parents_of MOF: what they are derived from.
classes_of() { sed -n 's/^class \([A-Za-z_]*\) : .*/\1/p' "$root$1"; }
parents_of() { sed -n 's/^class [A-Za-z_]* : \([A-Za-z_]*\).*/\1/p' "$root$1" | sort -u; }

check_product() {
  for file in schema/corvane-cpu.mof schema/corvane-computersystem.mof "$@"; do
    need_file "$data/$file" "half an installation" "install the provider package again"
  done
}
