# Google Benchmark's source for scripts/bench. Sourced after common.sh.
# shellcheck shell=bash disable=SC2154
#
# Debian has the library for one ABI at a time; its source package serves both. apt fetches that with
# a configuration of its own, made from the repositories the system already uses: no file of the
# system changes.

benchmark_source=$root/build/downloads/benchmark

# One deb-src line for the release's main repository, in apt's own reading of the system's sources.
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
