# Directory trees that look like a machine with the product and a broker. Sourced by register-test.
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
    printf '#!/bin/sh\ncalls=%s\nroot=%s\n' "$root/calls" "$root"
    printf '%s\n' 'echo "${0##*/} $*" | sed "s|$root/|/|g" >>"$calls"' "$@"
  } >"$file"
  chmod +x "$file"
}

product() {
  local library
  mkdir -p "$root/usr/sbin" "$root/usr/share/corvane"
  cp "$binary/packaging/corvcpu-register" "$root/usr/sbin"
  cp -r "$source/packaging/register" "$root/usr/share/corvane/register"
  mkdir "$root/usr/share/corvane/schema"
  cp "$source"/schema/*.mof "$root/usr/share/corvane/schema"
  cp -r "$binary/schema/sfcb" "$binary/schema/pegasus" "$root/usr/share/corvane"
  for library in corvcpuprofileprovider corvcomputersystemprovider; do
    elf "$root/usr/lib/x86_64-linux-gnu/cmpi/lib$library.so" 2
    elf "$root/usr/lib/i386-linux-gnu/cmpi/lib$library.so" 1
  done
}

# sfcb [CLASS]: a broker whose configuration names a provider directory of its own.
sfcb() {
  elf "$root/usr/sbin/sfcbd" "${1:-2}"
  tool "$root/usr/bin/sfcbrepos" 'test ! -e "$root/broken"'
  mkdir -p "$root/etc/sfcb" "$root/var/lib/sfcb/stage/mofs" "$root/var/lib/sfcb/stage/regs" \
    "$root/var/lib/sfcb/registration" "$root/usr/lib/sfcb"
  printf 'httpPort: 5988\nproviderDirs: /usr/lib/sfcb /usr/lib\n' >"$root/etc/sfcb/sfcb.cfg"
  printf '[CIM_IndicationFilter]\n   provider: x\n' >"$root/var/lib/sfcb/stage/regs/default.reg"
}

# What a running OpenPegasus does to its repository: cimmof makes class files, cimcli takes them away.
pegasus() {
  local state=$root/var/lib/Pegasus class
  local classes=$state/repository/root#cimv2/classes
  elf "$root/usr/sbin/cimserver" 2
  mkdir -p "$classes" "$state/repository/root#PG_InterOp" "$root/etc/Pegasus" "$root/usr/lib/Pegasus/providers"
  for class in Processor ProcessorCore Memory ProcessorCapabilities ComputerSystem AssociatedCacheMemory SystemDevice \
    ElementCapabilities ConcreteComponent; do
    : >"$classes/CIM_$class.CIM_Parent"
  done
  # shellcheck disable=SC2016
  local compile='for file; do :; done
test ! -e "$root/broken" || exit 4
for class in $(sed -n "s/^class \([A-Za-z_]*\) .*/\1/p" "$file"); do : >"'$classes'/$class.CIM_Parent"; done
sed -n "/PG_ProviderModule /,/^}/s/^   Name = \"\(.*\)\";/\1/p" "$file" >>"$root/modules"'
  tool "$root/usr/bin/cimmof" "$compile"
  tool "$root/usr/bin/cimmofl" "$compile"
  # shellcheck disable=SC2016
  tool "$root/usr/bin/cimprovider" 'test ! -e "$root/stopped" || exit 1
case $1 in -l) cat "$root/modules" ;; -r) sed -i "/^$3\$/d" "$root/modules" ;; esac'
  tool "$root/usr/bin/cimcli" 'case $1 in ei) cat "$root/capabilities" ;; dc) rm "'"$classes"'/$2".* ;; esac'
  : >"$root/modules"
  : >"$root/capabilities"
}
