#include "platform/inventory/tree/CpuSet.h"

#include <algorithm>
#include <bit>
#include <charconv>

#include "platform/base/Ascii.h"

namespace Tarn::Inventory {

namespace {

std::optional<unsigned int> takeNumber(std::string_view& text) {
  unsigned int number = 0;
  const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), number);
  if (error != std::errc() || number >= CpuSet::limit) {
    return std::nullopt;
  }
  text.remove_prefix(static_cast<std::size_t>(end - text.data()));
  return number;
}

bool take(std::string_view& text, char c) {
  if (text.empty() || text.front() != c) {
    return false;
  }
  text.remove_prefix(1);
  return true;
}

}  // namespace

CpuSet::CpuSet(std::initializer_list<unsigned int> numbers) {
  for (const unsigned int number : numbers) {
    add(number);
  }
}

std::optional<CpuSet> CpuSet::fromList(std::string_view list) {
  CpuSet set;
  std::string_view rest = Common::trimmed(list, " \t\n");
  if (rest.empty()) {
    return set;
  }
  unsigned int lowest = 0;  // a range that began below it would make the cost of a long text unbounded
  do {
    const std::optional<unsigned int> low = takeNumber(rest);
    const std::optional<unsigned int> high = low && take(rest, '-') ? takeNumber(rest) : low;
    if (!high || *low < lowest || *high < *low) {
      return std::nullopt;
    }
    set.addRange(*low, *high);
    lowest = *high + 1;
  } while (take(rest, ','));
  return rest.empty() ? std::optional(std::move(set)) : std::nullopt;
}

std::optional<CpuSet> CpuSet::fromMask(std::string_view mask) {
  constexpr std::size_t digits = 8;
  constexpr unsigned int groupBits = 32;
  CpuSet set;
  std::string_view rest = Common::trimmed(mask, " \t\n");
  for (unsigned int base = 0;; base += groupBits) {
    const std::size_t comma = rest.rfind(',');
    const bool isHighest = comma == std::string_view::npos;
    const std::string_view group = rest.substr(isHighest ? 0 : comma + 1);
    std::uint32_t word = 0;
    const auto [end, error] = std::from_chars(group.data(), group.data() + group.size(), word, 16);
    const bool isWhole = error == std::errc() && end == group.data() + group.size();
    if (!isWhole || group.size() > digits || (!isHighest && group.size() < digits) || (base >= limit && word != 0)) {
      return std::nullopt;
    }
    if (word != 0) {
      set.words_.resize(std::max(set.words_.size(), std::size_t{base / bits + 1}));
      set.words_[base / bits] |= Word{word} << base % bits;
    }
    if (isHighest) {
      return set;
    }
    rest = rest.substr(0, comma);
  }
}

std::string CpuSet::toList() const {
  std::string list;
  for (unsigned int low = first(); low != limit;) {
    unsigned int high = low;
    while (contains(high + 1)) {
      ++high;
    }
    list += (list.empty() ? "" : ",") + std::to_string(low);
    if (high != low) {
      list += "-" + std::to_string(high);
    }
    low = next(high);
  }
  return list;
}

void CpuSet::add(unsigned int number) {
  if (number >= limit) {
    return;
  }
  const std::size_t word = number / bits;
  if (word >= words_.size()) {
    words_.resize(word + 1);
  }
  words_[word] |= Word{1} << number % bits;
}

void CpuSet::addRange(unsigned int low, unsigned int high) {
  words_.resize(std::max(words_.size(), std::size_t{high / bits + 1}));
  for (unsigned int index = low / bits; index <= high / bits; ++index) {
    const Word from = index == low / bits ? ~Word{0} << low % bits : ~Word{0};
    const Word to = index == high / bits ? ~Word{0} >> (bits - 1 - high % bits) : ~Word{0};
    words_[index] |= from & to;
  }
}

void CpuSet::add(const CpuSet& other) {
  words_.resize(std::max(words_.size(), other.words_.size()));
  for (std::size_t i = 0; i < other.words_.size(); ++i) {
    words_[i] |= other.words_[i];
  }
}

void CpuSet::remove(const CpuSet& other) {
  for (std::size_t i = 0; i < std::min(words_.size(), other.words_.size()); ++i) {
    words_[i] &= ~other.words_[i];
  }
  trim();
}

void CpuSet::keepOnly(const CpuSet& other) {
  words_.resize(std::min(words_.size(), other.words_.size()));
  for (std::size_t i = 0; i < words_.size(); ++i) {
    words_[i] &= other.words_[i];
  }
  trim();
}

bool CpuSet::contains(unsigned int number) const {
  const std::size_t word = number / bits;
  return word < words_.size() && ((words_[word] >> number % bits) & 1U) != 0;
}

bool CpuSet::intersects(const CpuSet& other) const {
  for (std::size_t i = 0; i < std::min(words_.size(), other.words_.size()); ++i) {
    if ((words_[i] & other.words_[i]) != 0) {
      return true;
    }
  }
  return false;
}

bool CpuSet::isSubsetOf(const CpuSet& other) const {
  if (words_.size() > other.words_.size()) {
    return false;
  }
  for (std::size_t i = 0; i < words_.size(); ++i) {
    if ((words_[i] & ~other.words_[i]) != 0) {
      return false;
    }
  }
  return true;
}

unsigned int CpuSet::count() const {
  unsigned int total = 0;
  for (const Word word : words_) {
    total += static_cast<unsigned int>(std::popcount(word));
  }
  return total;
}

unsigned int CpuSet::from(unsigned int number) const {
  std::size_t index = number / bits;
  if (index >= words_.size()) {
    return limit;
  }
  Word word = words_[index] & (~Word{0} << number % bits);
  while (word == 0) {
    if (++index == words_.size()) {
      return limit;
    }
    word = words_[index];
  }
  return static_cast<unsigned int>(index) * bits + static_cast<unsigned int>(std::countr_zero(word));
}

void CpuSet::trim() {
  while (!words_.empty() && words_.back() == 0) {
    words_.pop_back();
  }
}

}  // namespace Tarn::Inventory
