#ifndef CORVANE_BENCH_LOGFLOORS_H
#define CORVANE_BENCH_LOGFLOORS_H

#include <benchmark/benchmark.h>

#include <cstdio>

/// What the text of a log event costs at the least: snprintf, for each of the two sinks.
namespace Corvane::Bench {

template <class... Arguments>
void formatTwice(const char* format, Arguments... arguments) {
  char buffer[512];
  for (int sink = 0; sink < 2; ++sink) {
    benchmark::DoNotOptimize(std::snprintf(buffer, sizeof buffer, format, arguments...));
    benchmark::DoNotOptimize(buffer);
  }
}

/// The entry of a function with six parameters, as the builders of instances have them.
inline void formatEntryTwice(const char* function, const char* file, unsigned int line, const void* object) {
  char list[256];
  char buffer[512];
  for (int sink = 0; sink < 2; ++sink) {
    std::snprintf(list, sizeof list, " broker=%p ref=%p proc=%p properties=%d isObjPath=%d rc=%p", object, object,
                  object, 0, 1, object);
    std::snprintf(buffer, sizeof buffer, "ENTERING: %s() in %s [Line: %u],Parameters List: %s", function, file, line,
                  list);
    benchmark::DoNotOptimize(buffer);
  }
}

}  // namespace Corvane::Bench

#endif
