# Shared by the scripts of this directory. Sourced, not run.
# shellcheck shell=bash disable=SC2034

set -euo pipefail

root=$(cd "$(dirname "${BASH_SOURCE[0]}")/.." && pwd)
logs=$root/build/logs
jobs=$(nproc)
failures=0

# A user's exported overrides of the product must not change the results of the scripts.
unset "${!CORVANE_@}"

# CMake reads the launcher when it configures a build directory for the first time.
if [[ -z ${CMAKE_CXX_COMPILER_LAUNCHER:-} ]] && command -v ccache >/dev/null; then
  export CMAKE_CXX_COMPILER_LAUNCHER=ccache
fi
export CCACHE_SLOPPINESS=pch_defines,time_macros # required to cache with precompiled headers

# Debian packages by purpose; docs/dependencies.md gives the reason for each.
build_packages=(cmake g++ g++-multilib ninja-build nlohmann-json3-dev)
hwloc_packages=(libhwloc-dev) # optional
test_packages=(googletest)
check_packages=(clang-format)
tidy_packages=(clang-tidy)
bench_packages=(dpkg-dev)

die() {
  printf 'scripts/%s: %s\n' "${0##*/}" "$*" >&2
  exit 1
}

# The usage text of a script is its leading comment.
usage() { sed -n '2,/^$/{s/^# \{0,1\}//p;}' "$0"; }

# step NAME COMMAND...: runs a command with its output in a log. Prints one line on success, the whole
# log on failure; the caller decides whether to continue.
step() {
  local name=$1 log start=$SECONDS
  shift
  log=${name//: /-}
  log=$logs/${log// /-}.log
  mkdir -p "$logs"
  printf '%-32s ' "$name"
  if "$@" >"$log" 2>&1 </dev/null; then
    printf 'ok %5d s\n' $((SECONDS - start))
    return 0
  fi
  printf 'FAILED %d s\n\n' $((SECONDS - start))
  cat "$log"
  printf '\n%s failed. The log above is kept in %s\n\n' "$name" "$log"
  failures=$((failures + 1))
  return 1
}

# installed PACKAGE: whether it is installed.
installed() { dpkg-query -W -f '${db:Status-Status}\n' "$1" 2>/dev/null | grep -qx installed; }

apt_install() {
  local as_root=()
  ((EUID == 0)) || as_root=(sudo)
  "${as_root[@]}" apt-get -o DPkg::Lock::Timeout=300 update &&
    "${as_root[@]}" env DEBIAN_FRONTEND=noninteractive \
      apt-get -o DPkg::Lock::Timeout=300 -y --no-install-recommends install "$@"
}

# need PACKAGE...: installs the missing ones; without any, apt is not called.
need() {
  local missing=() package
  command -v dpkg-query >/dev/null || die "no dpkg on this system; install the counterparts of: $*"
  for package; do
    installed "$package" || missing+=("$package")
  done
  ((${#missing[@]})) || return 0
  if ((EUID != 0)) && ! command -v sudo >/dev/null; then
    die "missing packages, and neither root nor sudo to install them: apt-get install ${missing[*]}"
  fi
  printf 'Missing packages: %s\n' "${missing[*]}"
  ((EUID == 0)) || sudo -v
  step "install packages" apt_install "${missing[@]}" ||
    die "could not install ${missing[*]}; install them by hand and run this again"
}

# configure PRESET [-DNAME=VALUE...]
configure() {
  local preset=$1
  shift
  step "$preset: configure" env -C "$root" cmake --preset "$preset" "$@"
}

# build PRESET [TARGET...]
build() {
  local preset=$1
  shift
  step "$preset: build" cmake --build "$root/build/$preset" -j "$jobs" ${1+--target "$@"}
}
