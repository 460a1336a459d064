// corvane_bench [--json] [--abi NAME] [--only TEXT]: measures the product and prints the report.

#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <string>

#include "bench/Rows.h"

namespace {

void initializeBenchmark() {
  char name[] = "corvane_bench";
  char interleave[] = "--benchmark_enable_random_interleaving=true";
  char* arguments[] = {name, interleave, nullptr};
  int count = 2;
  benchmark::Initialize(&count, arguments);
}

}  // namespace

int main(int argc, char** argv) {
  bool json = false;
  std::string abi = sizeof(void*) == 4 ? "32-bit" : "64-bit";
  for (int i = 1; i < argc; ++i) {
    if (std::strcmp(argv[i], "--json") == 0) {
      json = true;
    } else if (std::strcmp(argv[i], "--abi") == 0 && i + 1 < argc) {
      abi = argv[++i];
    } else if (std::strcmp(argv[i], "--only") == 0 && i + 1 < argc) {
      Corvane::Bench::selectRows(argv[++i]);
    } else {
      std::fprintf(stderr, "corvane_bench: unknown argument %s\n", argv[i]);
      return 2;
    }
  }

  // The logger as it is without a configuration, whatever this machine has installed.
  setenv("CORVANE_CONFIG", "/dev/null", 1);
  initializeBenchmark();

  Corvane::Bench::addLogRows();
  Corvane::Bench::addProviderRows();
  Corvane::Bench::addCollectionRows();
  Corvane::Bench::addTreeRows();
  Corvane::Bench::addSmbiosRows();
  Corvane::Bench::addProcessRows();
  Corvane::Bench::runRows(abi, json);
}
