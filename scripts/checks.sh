# Checks of the sources themselves, for scripts/test. Sourced after common.sh.
# shellcheck shell=bash disable=SC2154

longest_source=500

# tracked [PATTERN...]: the repository's files, one per line; without git (a source archive), all files.
tracked() {
  cd "$root" || return
  # The tree may belong to another user (a mounted checkout in a container); reading it is harmless.
  if git -c safe.directory='*' rev-parse --git-dir >/dev/null 2>&1; then
    # A file that was deleted but not yet committed is still listed.
    git -c safe.directory='*' ls-files -- "$@" | while read -r file; do [[ ! -e $file ]] || echo "$file"; done
  else
    local pattern names=(-false)
    for pattern in "${@:-*}"; do names+=(-o -name "$pattern"); done
    find . -path ./build -prune -o -type f \( "${names[@]}" \) -printf '%P\n'
  fi
}

# Captures under tests/fixtures are kept as the machine wrote them.
check_hygiene() {
  local texts sources file lines status=0
  cd "$root" || return
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

check_format() {
  cd "$root" || return
  tracked '*.h' '*.cpp' '*.c' | xargs -r clang-format --dry-run -Werror
}

# Every translation unit of the native build that is the repository's own; headers are seen through them.
# clang is told nothing that only GCC understands, its precompiled headers included.
check_tidy() {
  local database=$root/build/tidy
  cd "$root" && mkdir -p "$database" || return
  sed -E 's/ (-fno-gnu-unique|-Wno-restrict|-Winvalid-pch|-fpch-preprocess|-include [^ ]*cmake_pch\.hxx)//g' \
    build/native/compile_commands.json >"$database/compile_commands.json"
  tracked '*.cpp' | grep -Fxf <(sed -n "s|^ *\"file\": \"$root/\(.*\)\".*|\1|p" "$database/compile_commands.json") |
    xargs -r -P "$jobs" -n 1 clang-tidy --quiet -p "$database"
}
