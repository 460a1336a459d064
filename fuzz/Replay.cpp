// replay DIRECTORY [MUTATIONS]: gives a target every file of a corpus, and of each some mutations, the same ones every
// time. A fuzzer in small, for builds without one.

#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <random>
#include <span>
#include <vector>

#include "fuzz/Target.h"

namespace {

using Input = std::vector<std::uint8_t>;

std::vector<Input> readCorpus(const std::filesystem::path& directory) {
  std::vector<std::filesystem::path> files;
  for (const auto& entry : std::filesystem::directory_iterator(directory)) {
    files.push_back(entry.path());
  }
  std::ranges::sort(files);
  std::vector<Input> corpus;
  for (const std::filesystem::path& path : files) {
    std::ifstream file(path, std::ios::binary);
    corpus.emplace_back(std::istreambuf_iterator<char>(file), std::istreambuf_iterator<char>());
  }
  return corpus;
}

class Mutator {
 public:
  explicit Mutator(const std::vector<Input>& corpus) : corpus_(corpus) {}

  Input mutate(Input input) {
    using Change = void (Mutator::*)(Input&);
    constexpr Change changes[] = {&Mutator::flipBit, &Mutator::setByte, &Mutator::setByte, &Mutator::repeatStretch,
                                  &Mutator::remove,  &Mutator::cut,     &Mutator::splice};
    for (std::size_t left = 1 + below(4); left > 0 && !input.empty(); --left) {
      (this->*changes[below(std::size(changes))])(input);
    }
    return input;
  }

 private:
  static constexpr std::size_t longest = 1U << 18U;

  // Not a distribution: those differ between standard libraries.
  std::size_t below(std::size_t limit) { return random_() % limit; }

  static Input::iterator at(Input& input, std::size_t index) {
    return input.begin() + static_cast<std::ptrdiff_t>(index);
  }

  void flipBit(Input& input) {
    std::uint8_t& byte = input[below(input.size())];
    byte = static_cast<std::uint8_t>(byte ^ 1U << below(8));
  }

  void setByte(Input& input) {
    constexpr std::uint8_t telling[] = {0x00, 0x01, 0x03, 0x04, 0x7E, 0x7F, 0x80, 0xFE, 0xFF, '\n', '"', '0', ']'};
    input[below(input.size())] = telling[below(std::size(telling))];
  }

  void repeatStretch(Input& input) {
    const std::size_t begin = below(input.size());
    const std::size_t end = begin + 1 + below(std::min<std::size_t>(input.size() - begin, 64));
    if (input.size() < longest) {
      const Input stretch(at(input, begin), at(input, end));
      input.insert(at(input, end), stretch.begin(), stretch.end());
    }
  }

  void remove(Input& input) {
    const std::size_t begin = below(input.size());
    input.erase(at(input, begin), at(input, begin + 1 + below(std::min<std::size_t>(input.size() - begin, 32))));
  }

  void cut(Input& input) { input.resize(below(input.size() + 1)); }

  void splice(Input& input) {
    const Input& other = corpus_[below(corpus_.size())];
    const std::size_t from = std::min(below(input.size()), other.size());
    input.resize(from);
    input.insert(input.end(), other.begin() + static_cast<std::ptrdiff_t>(from), other.end());
  }

  const std::vector<Input>& corpus_;
  std::mt19937 random_;  // NOLINT(cert-msc51-cpp): the same numbers every time
};

}  // namespace

int main(int argc, char** argv) {
  const std::span<char*> arguments(argv, static_cast<std::size_t>(argc));
  if (argc < 2) {
    std::fprintf(stderr, "usage: %s DIRECTORY [MUTATIONS]\n", arguments[0]);
    return 2;
  }
  const std::size_t mutations = argc > 2 ? std::strtoul(arguments[2], nullptr, 10) : 0;
  const std::vector<Input> corpus = readCorpus(arguments[1]);
  if (corpus.empty()) {
    std::fprintf(stderr, "%s: no files in it\n", arguments[1]);
    return 2;
  }
  Mutator mutator(corpus);
  for (const Input& input : corpus) {
    LLVMFuzzerTestOneInput(input.data(), input.size());
  }
  for (std::size_t i = 0; i < mutations; ++i) {
    const Input input = mutator.mutate(corpus[i % corpus.size()]);
    LLVMFuzzerTestOneInput(input.data(), input.size());
  }
  std::printf("%zu files, %zu mutations\n", corpus.size(), mutations);
}
