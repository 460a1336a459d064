# Directory trees that look like a machine with the product and a broker, below $tree. Sourced by register-test and
# scripts/check-packages.
# shellcheck shell=bash disable=SC2154

# elf FILE CLASS: the first bytes of a program of 32 (1) or 64 (2) bits.
elf() {
  mkdir -p "${1%/*}"
  printf '\177ELF%b\001\001' "\\00$2" >"$1"
  chmod +x "$1"
}

# tool FILE [LINE...]: a program that records its call and goes on with these lines.
tool() {
  local file=$1
  shift
  mkdir -p "${file%/*}"
  # shellcheck disable=SC2016
  {
    printf '#!/bin/sh\ncalls=%s\ntree=%s\n' "$tree/calls" "$tree"
    printf '%s\n' 'echo "${0##*/} $*" | sed "s|$tree/|/|g" >>"$calls"' "$@"
  } >"$file"
  chmod +x "$file"
}

product() {
  local library
  mkdir -p "$tree/usr/sbin" "$tree/usr/share/corvane"
  cp "$binary/packaging/corvcpu-register" "$tree/usr/sbin"
  cp -r "$source/packaging/register" "$tree/usr/share/corvane/register"
  mkdir "$tree/usr/share/corvane/schema"
  cp "$source"/schema/*.mof "$tree/usr/share/corvane/schema"
  cp -r "$binary/schema/sfcb" "$binary/schema/pegasus" "$tree/usr/share/corvane"
  for library in corvcpuprofileprovider corvcomputersystemprovider; do
    elf "$tree/usr/lib/x86_64-linux-gnu/cmpi/lib$library.so" 2
    elf "$tree/usr/lib/i386-linux-gnu/cmpi/lib$library.so" 1
  done
}

# sfcb [CLASS]: a broker whose configuration names a provider directory of its own.
sfcb() {
  elf "$tree/usr/sbin/sfcbd" "${1:-2}"
  # shellcheck disable=SC2016
  tool "$tree/usr/bin/sfcbrepos" 'test ! -e "$tree/broken"'
  mkdir -p "$tree/etc/sfcb" "$tree/var/lib/sfcb/stage/mofs" "$tree/var/lib/sfcb/stage/regs" \
    "$tree/var/lib/sfcb/registration" "$tree/usr/lib/sfcb"
  printf 'httpPort: 5988\nproviderDirs: /usr/lib/sfcb /usr/lib\n' >"$tree/etc/sfcb/sfcb.cfg"
  printf '[CIM_IndicationFilter]\n   provider: x\n' >"$tree/var/lib/sfcb/stage/regs/default.reg"
}

# What a running OpenPegasus does to its repository: cimmof makes class files, cimcli takes them away.
pegasus() {
  local state=$tree/var/lib/Pegasus class
  local classes=$state/repository/root#cimv2/classes
  elf "$tree/usr/sbin/cimserver" 2
  mkdir -p "$classes" "$state/repository/root#PG_InterOp" "$tree/etc/Pegasus" "$tree/usr/lib/Pegasus/providers"
  for class in Processor ProcessorCore Memory ProcessorCapabilities ComputerSystem AssociatedCacheMemory SystemDevice \
    ElementCapabilities ConcreteComponent; do
    : >"$classes/CIM_$class.CIM_Parent"
  done
  # shellcheck disable=SC2016
  local compile='for file; do :; done
test ! -e "$tree/broken" || exit 4
for class in $(sed -n "s/^class \([A-Za-z_]*\) .*/\1/p" "$file"); do : >"'$classes'/$class.CIM_Parent"; done
sed -n "/PG_ProviderModule /,/^}/s/^   Name = \"\(.*\)\";/\1/p" "$file" >>"$tree/modules"'
  tool "$tree/usr/bin/cimmof" "$compile"
  tool "$tree/usr/bin/cimmofl" "$compile"
  # shellcheck disable=SC2016
  tool "$tree/usr/bin/cimprovider" 'test ! -e "$tree/stopped" || exit 1
case $1 in -l) cat "$tree/modules" ;; -r) sed -i "/^$3\$/d" "$tree/modules" ;; esac'
  # shellcheck disable=SC2016
  tool "$tree/usr/bin/cimcli" 'case $1 in ei) cat "$tree/capabilities" ;; dc) rm "'"$classes"'/$2".* ;; esac'
  : >"$tree/modules"
  : >"$tree/capabilities"
}
