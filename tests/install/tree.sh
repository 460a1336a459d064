# Directory trees that look like a machine with the product and a broker, below $tree. Sourced by register-test and
# scripts/check-packages.
# shellcheck shell=bash disable=SC2154

install_tests=$(cd "${BASH_SOURCE[0]%/*}" && pwd)

# elf FILE CLASS: the first bytes of a program of 32 (1) or 64 (2) bits.
elf() {
  mkdir -p "${1%/*}"
  printf '\177ELF%b\001\001' "\\00$2" >"$1"
  chmod +x "$1"
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

# captured BROKER: the files and directories of a real one; files without content are empty.
captured() {
  local path
  while read -r path; do
    case $path in
      '#'*) ;;
      */) mkdir -p "$tree/$path" ;;
      *) mkdir -p "$tree/${path%/*}" && : >"$tree/$path" ;;
    esac
  done <"$install_tests/captured/$1.files"
  cp -r "$install_tests/captured/$1/." "$tree"
}

# put_tools DIRECTORY TOOL...
put_tools() {
  local tool
  export tree tools=$install_tests/tools
  for tool in "${@:2}"; do
    ln -sf "$tools/${tool/%mofl/mof}" "$tree/$1/$tool"
  done
}

# sfcb [CLASS]: 1 for one of 32 bits.
sfcb() {
  captured sfcb
  elf "$tree/usr/sbin/sfcbd" "${1:-2}"
  put_tools usr/bin sfcbrepos sfcbstage
  cp "$tree/var/lib/sfcb/stage/default.reg" "$tree/var/lib/sfcb/registration/providerRegister"
}

# An OpenPegasus that runs where it was built.
pegasus() {
  captured pegasus
  elf "$tree/opt/pegasus/bin/cimserver" 2
  put_tools opt/pegasus/bin cimmof cimmofl cimprovider cimcli
}

# The same one, laid out as distributions package it.
packaged_pegasus() {
  pegasus
  mkdir -p "$tree/var/lib/Pegasus" "$tree/etc/Pegasus" "$tree/usr/lib/Pegasus/providers"
  mv "$tree/opt/pegasus/repository" "$tree/var/lib/Pegasus"
  mv "$tree/opt/pegasus/bin/cimserver" "$tree/usr/sbin"
  mkdir -p "$tree/usr/bin"
  mv "$tree"/opt/pegasus/bin/* "$tree/usr/bin"
  rm -r "$tree/opt"
}
