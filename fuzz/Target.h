#ifndef CORVANE_FUZZ_TARGET_H
#define CORVANE_FUZZ_TARGET_H

#include <cstddef>
#include <cstdint>
#include <string>

/// One input for the reader that a target tests. Ends the program where the reader breaks a promise; what it merely
/// refuses is fine. libFuzzer calls it, and so does the replay of the corpus. Returns 0.
extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size);

namespace Corvane::Fuzz {

/// Ends the program with the promise that was broken, in a way that fuzzers and tests notice.
void require(bool condition, const char* promise);

/// The input as text.
std::string textOf(const std::uint8_t* data, std::size_t size);

}  // namespace Corvane::Fuzz

#endif
