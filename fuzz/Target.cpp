#include "fuzz/Target.h"

#include <cstdio>
#include <cstdlib>

namespace Corvane::Fuzz {

void require(bool condition, const char* promise) {
  if (!condition) {
    std::fprintf(stderr, "broken promise: %s\n", promise);
    std::abort();
  }
}

std::string textOf(const std::uint8_t* data, std::size_t size) {
  return {data, data + size};
}

}  // namespace Corvane::Fuzz
