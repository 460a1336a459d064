# Google Benchmark's source for scripts/bench. Sourced after common.sh.
# shellcheck shell=bash disable=SC2154
#
# Debian's binary packages serve one ABI at a time, the source package both. apt fetches it with a separate
# configuration, made from the system's repositories; no file of the system changes.

benchmark_source=$root/build/downloads/benchmark

# One deb-src line for the release's main repository, from the sources as apt reads them.
source_lines() {
  local codename
  # shellcheck source=/dev/null
  codename=$(. /etc/os-release && echo "$VERSION_CODENAME") || return
  # shellcheck disable=SC2016
  apt-get indextargets --no-release-info --format '$(REPO_URI) $(RELEASE) $(COMPONENT)' 'Created-By: Packages' |
    awk -v codename="$codename" '$2 == codename && $3 == "main" && !seen[$0]++ { print "deb-src", $0 }'
}

fetch_benchmark() {
  local work options
  work=$root/build/downloads/apt
  rm -rf "$work" && mkdir -p "$work"/{lists/partial,cache/archives/partial} || return
  source_lines >"$work/sources.list" || return
  [[ -s $work/sources.list ]] || {
    echo "apt has no repository of this release's main section, so no source package either"
    return 1
  }
  options=(-o "Dir::Etc::SourceList=$work/sources.list" -o Dir::Etc::SourceParts=-
    -o "Dir::State::Lists=$work/lists" -o "Dir::Cache=$work/cache")
  apt-get "${options[@]}" update &&
    (cd "$work" && apt-get "${options[@]}" source benchmark) &&
    mv "$work"/benchmark-*/ "$benchmark_source" &&
    rm -rf "$work"
}

need_benchmark() {
  [[ -f $benchmark_source/CMakeLists.txt ]] && return
  need "${bench_packages[@]}"
  step "fetch Google Benchmark" fetch_benchmark
}
