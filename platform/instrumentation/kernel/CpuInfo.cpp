#include "platform/instrumentation/kernel/CpuInfo.h"

#include <algorithm>
#include <charconv>
#include <optional>

#include "platform/common/Ascii.h"

namespace Tarn::Inventory {

namespace {

constexpr std::string_view white = " \t";
constexpr std::string_view blockStart = "processor";

// The value where the line is "name: value".
std::optional<std::string_view> valueOf(std::string_view line, std::string_view name) {
  if (!line.starts_with(name)) {
    return std::nullopt;
  }
  const std::size_t colon = line.find_first_not_of(white, name.size());
  if (colon == std::string_view::npos || line[colon] != ':') {
    return std::nullopt;
  }
  return Common::trimmed(line.substr(colon + 1), white);
}

// Calls action(line, its offset) for each line until the action returns false.
template <class Action>
void forEachLine(std::string_view text, Action action) {
  for (std::size_t begin = 0; begin < text.size();) {
    const std::size_t end = std::min(text.find('\n', begin), text.size());
    if (!action(text.substr(begin, end - begin), begin)) {
      return;
    }
    begin = end + 1;
  }
}

std::string_view firstField(std::string_view text, std::string_view name) {
  std::string_view found;
  forEachLine(text, [&](std::string_view line, std::size_t /*begin*/) {
    const std::optional<std::string_view> value = valueOf(line, name);
    found = value.value_or(std::string_view());
    return !value;
  });
  return found;
}

}  // namespace

CpuInfo::CpuInfo(std::string text) : text_(std::move(text)) {
  forEachLine(text_, [this](std::string_view line, std::size_t begin) {
    const std::optional<std::string_view> value = valueOf(line, blockStart);
    unsigned int cpu = 0;
    // Older arm kernels also have a "processor" that is a text.
    if (value && !value->empty() &&
        std::from_chars(value->data(), value->data() + value->size(), cpu).ptr == value->data() + value->size()) {
      blocks_.push_back({cpu, begin, text_.size()});
      cpus_.add(cpu);
    }
    return true;
  });
  for (std::size_t i = 1; i < blocks_.size(); ++i) {
    blocks_[i - 1].end = blocks_[i].begin;
  }
  std::ranges::sort(blocks_, {}, &Block::cpu);
}

std::string_view CpuInfo::field(unsigned int cpu, std::string_view name) const {
  const std::string_view text = text_;
  const auto block = std::ranges::lower_bound(blocks_, cpu, {}, &Block::cpu);
  if (block != blocks_.end() && block->cpu == cpu) {
    const std::string_view own = firstField(text.substr(block->begin, block->end - block->begin), name);
    if (!own.empty()) {
      return own;
    }
  }
  return firstField(text, name);
}

}  // namespace Tarn::Inventory
