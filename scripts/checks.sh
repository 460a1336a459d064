# Checks of the sources, for scripts/test. Sourced after common.sh.
# shellcheck shell=bash disable=SC2154

longest_source=500

# tracked [PATTERN...]: the repository's files, one per line; without git (a source archive), all files.
tracked() {
  cd "$root" || return
  # The tree may belong to another user (a mounted checkout in a container); reading it is harmless.
  if git -c safe.directory='*' rev-parse --git-dir >/dev/null 2>&1; then
    # git lists a deleted file until the deletion is committed.
    git -c safe.directory='*' ls-files -- "$@" | while read -r file; do [[ ! -e $file ]] || echo "$file"; done
  else
    local pattern names=(-false)
    for pattern in "${@:-*}"; do names+=(-o -path "./$pattern"); done
    find . -path ./build -prune -o -type f \( "${names[@]}" \) -printf '%P\n'
  fi
}

check_hygiene() {
  local status=0 check
  cd "$root" || return
  for check in check_texts check_versions check_keys check_folders check_documented_messages check_undocumented_messages; do
    $check || status=1
  done
  return $status
}

# Captures in tests/fixtures stay as the machine wrote them.
check_texts() {
  local texts sources file lines status=0
  mapfile -t texts < <(tracked | grep -v '^tests/fixtures/' | xargs -r -d '\n' grep -lI .)
  mapfile -t sources < <(printf '%s\n' "${texts[@]}" | grep -E '\.(h|cpp|c|cmake|sh)$|CMakeLists\.txt$|^scripts/')

  grep -nE '[[:blank:]]+$' "${texts[@]}" | sed 's/$/ <- trailing blanks/' && status=1
  for file in "${texts[@]}"; do
    [[ -z $(tail -c 1 "$file") ]] || { echo "$file: no newline at the end" && status=1; }
  done
  for file in "${sources[@]}"; do
    lines=$(wc -l <"$file")
    ((lines <= longest_source)) || { echo "$file: $lines lines, more than $longest_source" && status=1; }
  done
  return $status
}

# same_version VERSION FILE SED-COMMAND: whether the command prints only this version.
same_version() {
  local found
  found=$(sed -En "$3" "$2" | sort -u | xargs)
  [[ $found == "$1" ]] || { echo "$2: version ${found:-missing}, but $1 in CMakeLists.txt" && return 1; }
}

# The build takes the version from CMakeLists.txt; these files repeat it.
check_versions() {
  local version number='([0-9]+(\.[0-9]+)+)' status=0 file
  version=$(sed -En "s/^project\(.* VERSION $number.*/\1/p" CMakeLists.txt)
  same_version "$version" CHANGELOG.md "/^## /{s/^## $number.*/\1/p;q}" || status=1
  same_version "$version" docs/brokers.md "s/.*corvane-cpu-provider_${number}_.*/\1/p" || status=1
  for file in schema/*.mof; do
    same_version "$version" "$file" "s/.*Version\(\"$number\"\).*/\1/p" || status=1
  done
  same_version "$version" packaging/rpm/corvane-cpu.spec "s/^Version: *$number$/\1/p" || status=1
  same_version "$version" packaging/rpm/corvane-cpu.spec "/^\* /{s/.* - $number-[0-9]+$/\1/p;q}" || status=1
  return $status
}

# The keys of the configuration: in the library, in the installed file and in the documentation.
check_keys() {
  local keys
  keys=$(sed -n '/eys = {/,/};/p' platform/base/Configuration.cpp | grep -o '"[a-z.]*"' | tr -d '"' | sort)
  diff <(echo "$keys") <(sed -n 's/^#\([a-z.]*\) = .*/\1/p' packaging/corvane.conf | sort) ||
    { echo "packaging/corvane.conf has other keys than platform/base/Configuration.cpp" && return 1; }
  # shellcheck disable=SC2016
  diff <(echo "$keys") <(sed -n '/^## The configuration file/,/^## /s/^| \(`[^|]*`\) |.*/\1/p' docs/logging.md |
    tr -d '`,' | xargs -n 1 | sort) ||
    { echo "docs/logging.md describes other keys than platform/base/Configuration.cpp" && return 1; }
}

# Folders include each other in one direction. tsort lists the folders of a cycle.
check_folders() {
  local edges
  edges=$(tracked '*.h' '*.cpp' | xargs -r grep -oE '^#include "[^"]+/[^"/]+"' /dev/null |
    sed -E 's|/[^/:]*:#include "| |; s|/[^/]*"$||' | awk '$1 != $2' | sort -u)
  tsort <<<"$edges" >/dev/null 2>&1 || {
    echo "These folders include each other; the includes between them:"
    tsort <<<"$edges" 2>&1 >/dev/null | sed -n 's/^tsort: //p' | grep -Fxf <(tr ' ' '\n' <<<"$edges") | sort -u >"$logs/circle"
    grep -wFf "$logs/circle" <<<"$edges" | awk 'NR == FNR { circle[$0]; next } $1 in circle && $2 in circle' "$logs/circle" -
    return 1
  }
}

check_format() {
  cd "$root" || return
  tracked '*.h' '*.cpp' '*.c' | xargs -r clang-format --dry-run -Werror
}

# Each source of the native build that belongs to the repository, alone; clang-tidy checks headers through them.
# Options that only GCC understands are removed, including its precompiled headers.
check_tidy() {
  local database=$root/build/tidy
  cd "$root" && mkdir -p "$database" || return
  cmake --preset native -B build/native-each -DCMAKE_UNITY_BUILD=OFF -DCORVANE_TESTS=ON || return
  sed -E 's/ (-fno-gnu-unique|-Wno-restrict|-Winvalid-pch|-fpch-preprocess|-include [^ ]*cmake_pch\.hxx)//g' \
    build/native-each/compile_commands.json >"$database/compile_commands.json"
  tracked '*.cpp' | grep -Fxf <(sed -n "s|^ *\"file\": \"$root/\(.*\)\".*|\1|p" "$database/compile_commands.json") |
    xargs -r -P "$jobs" -n 1 clang-tidy --quiet -p "$database"
}
