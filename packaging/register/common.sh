# What the brokers' parts of corvcpu-register share. Sourced, not run.
#
# Paths in variables are those inside $root; "$root$path" is the file. What is registered is read from
# the broker's own files, so that registrations made or removed by hand are recognized.
# Lists are words: no path or name in them has blanks.
# shellcheck shell=sh disable=SC2034,SC2046,SC2086,SC2154

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
    if test "$property" "$root$path"; then say "$path" && return 0; fi
  done
  return 1
}

# expand PATTERN...: the paths inside $root that match.
expand() {
  for pattern; do
    for path in "$root"$pattern; do
      [ ! -e "$path" ] || say "${path#"$root"}"
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

# A reader never sees half a file.
copy_file() {
  mkdir -p "$(dirname "$2")"
  cp "$1" "$2.new"
  chmod 644 "$2.new"
  mv "$2.new" "$2"
}

# our_links DIRECTORY...: the links to a provider library by which a broker finds it as lib<location>.so.
our_links() {
  for directory; do
    for library in $libraries; do
      case $(readlink "$root$directory/lib$library.so" || :) in
        /*"/cmpi/lib$library.so") say "$directory/lib$library.so" ;;
      esac
    done
  done
}

unlink_libraries() {
  for link in $(our_links "$@"); do
    step "remove $link" rm "$root$link"
  done
}

# link_libraries DIRECTORY: unless it is where the libraries lie.
link_libraries() {
  [ "$1" != "$library_directory" ] || return 0
  for library in $libraries; do
    target=$library_directory/lib$library.so
    link=$1/lib$library.so
    [ "$(readlink "$root$link" || :)" != "$target" ] || continue
    step "link $link to $target" ln -sfn "$target" "$root$link"
  done
}

# check_links DIRECTORY: a file of that name that is not ours is not overwritten.
check_links() {
  [ "$1" != "$library_directory" ] || return 0
  need_writable "$1"
  for library in $libraries; do
    link=$1/lib$library.so
    if [ -e "$root$link" ] && ! is_listed "$link" $(our_links "$1"); then
      fail "$root$link exists and was not put there by this program; move it away"
    fi
  done
}

# missing_library DIRECTORY...: the first library that none of them has.
missing_library() {
  for library in $libraries; do
    found=false
    for directory; do
      # A link leads to a path inside $root.
      file=$(readlink "$root$directory/lib$library.so" || :)
      case $file in /*) ;; *) file=$directory/lib$library.so ;; esac
      [ ! -f "$root$file" ] || found=true
    done
    $found || { say "lib$library.so" && return 0; }
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

# classes_of MOF: the classes that a file declares; parents_of MOF: what they are derived from.
classes_of() { sed -n 's/^class \([A-Za-z_]*\) : .*/\1/p' "$root$1"; }
parents_of() { sed -n 's/^class [A-Za-z_]* : \([A-Za-z_]*\).*/\1/p' "$root$1" | sort -u; }

check_product() {
  for unit in corvane-computersystem corvane-cpu; do
    for file in schema/$unit.mof sfcb/$unit.reg pegasus/$unit.mof; do
      need_file "$data/$file" "half an installation" "install the provider package again"
    done
  done
}

# look KIND: sets $owner, the other agent that provides HALDA_ComputerSystem, if any, and $units, what to register.
look() {
  units='corvane-computersystem corvane-cpu'
  ! owner=$("$1_owner" "$system_class") || units=corvane-cpu
}

status() {
  if ! "$1_is_registered"; then
    say "$1: not registered"
    return 3
  fi
  look "$1"
  problem=$("$1_problem" $units)
  if [ -n "$problem" ]; then
    say "$1: incomplete, $problem; run corvcpu-register install"
    return 1
  fi
  say "$1: registered, with${owner:+out} $system_class${owner:+, which is left to its agent}"
}

check_install() {
  check_product
  "$1_check_tools" install
  for class in $(classes_of "$data/schema/corvane-cpu.mof"); do
    ! owner=$("$1_owner" "$class") ||
      fail "$class belongs to another agent: $owner names it; remove that agent's registration first"
  done
  look "$1"
  "$1_check_install"
}

install() {
  look "$1"
  [ -z "$owner" ] || say "leave $system_class to its agent ($owner)"
  "$1_install"
  $dry_run || status "$1"
}

check_remove() { ! "$1_is_registered" || "$1_check_tools" remove; }

remove() {
  if ! "$1_is_registered"; then
    say "$1: not registered; nothing to remove"
    return 0
  fi
  look "$1"
  [ -z "$owner" ] || say "leave $system_class to its agent ($owner)"
  "$1_remove"
  $dry_run || status "$1" || [ $? -eq 3 ]
}
