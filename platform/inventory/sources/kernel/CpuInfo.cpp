#include "platform/inventory/sources/kernel/CpuInfo.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <utility>

#include "platform/base/Ascii.h"

namespace Tarn::Inventory {

namespace {

constexpr std::string_view white = " \t";

// Fields that hold a number which identifies a part.
constexpr std::array<std::string_view, 5> numberFields = {"core id", "cpu family", "model", "physical id", "stepping"};

// The value if the line is "name: value".
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

bool isDigits(std::string_view text) {
  return !text.empty() && text.find_first_not_of("0123456789") == std::string_view::npos;
}

// Nothing if it exceeds what the type holds.
std::optional<unsigned int> toNumber(std::string_view digits) {
  unsigned int number = 0;
  const std::errc error = std::from_chars(digits.data(), digits.data() + digits.size(), number).ec;
  return error == std::errc() ? std::optional(number) : std::nullopt;
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
  // On s390 blocks begin with "cpu number", which on ia64 is a field within a block.
  if (!split("processor")) {
    common_.clear();
    split("cpu number");
  }
  std::ranges::stable_sort(blocks_, {}, &Block::cpu);
}

// False if the text has no block that begins so.
bool CpuInfo::split(std::string_view blockStart) {
  bool hasBlocks = false;
  bool isInBlock = false;
  std::size_t* end = nullptr;  // of the block, if it counts
  std::size_t number = 0;
  const auto endBlock = [&](std::size_t offset) {
    if (end != nullptr) {
      *std::exchange(end, nullptr) = offset;
    }
  };
  forEachLine(text_, [&](std::string_view line, std::size_t begin) {
    ++number;
    const std::optional<std::string_view> start = valueOf(line, blockStart);
    // Older arm kernels also have a "processor" that is a text.
    if (start && isDigits(*start)) {
      endBlock(begin);
      hasBlocks = isInBlock = true;
      const std::optional<unsigned int> cpu = toNumber(*start);
      if (cpu && *cpu < CpuSet::limit) {
        cpus_.add(*cpu);
        end = &blocks_.emplace_back(Block{*cpu, begin, text_.size()}).end;
      } else {
        noteMisfit(number, blockStart, *start);
      }
    } else if (isInBlock && Common::trimmed(line).empty()) {
      endBlock(begin);
      isInBlock = false;
    } else {
      checkNumbers(number, line);
      if (!isInBlock) {
        common_.append(line) += '\n';
      }
    }
    return true;
  });
  return hasBlocks;
}

void CpuInfo::checkNumbers(std::size_t lineNumber, std::string_view line) {
  for (const std::string_view name : numberFields) {
    const std::optional<std::string_view> value = valueOf(line, name);
    if (value && isDigits(*value) && !toNumber(*value)) {
      noteMisfit(lineNumber, name, *value);
    }
  }
}

void CpuInfo::noteMisfit(std::size_t lineNumber, std::string_view name, std::string_view value) {
  if (!misfit_) {
    misfit_ = {lineNumber, std::string(name), std::string(value)};
  }
}

std::string_view CpuInfo::field(unsigned int cpu, std::string_view name) const {
  const std::string whole = fieldName(cpu, name);
  const auto block = std::ranges::lower_bound(blocks_, cpu, {}, &Block::cpu);
  if (block != blocks_.end() && block->cpu == cpu) {
    const std::string_view own =
        firstField(std::string_view(text_).substr(block->begin, block->end - block->begin), whole);
    if (!own.empty()) {
      return own;
    }
  }
  return firstField(common_, whole);
}

std::string CpuInfo::fieldName(unsigned int cpu, std::string_view name) {
  const std::size_t star = name.find('*');
  return star == std::string_view::npos
             ? std::string(name)
             : std::string(name.substr(0, star)) + std::to_string(cpu) + std::string(name.substr(star + 1));
}

}  // namespace Tarn::Inventory
