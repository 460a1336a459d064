#ifndef CORVANE_PLATFORM_INVENTORY_TREE_CPUSET_H
#define CORVANE_PLATFORM_INVENTORY_TREE_CPUSET_H

#include <cstddef>
#include <cstdint>
#include <initializer_list>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace Tarn::Inventory {

/// A set of logical CPU numbers, as the kernel counts them.
class CpuSet {
 public:
  /// Numbers from here on are refused, so that a broken list cannot ask for unbounded memory.
  static constexpr unsigned int limit = 1U << 16;

  CpuSet() = default;
  CpuSet(std::initializer_list<unsigned int> numbers);

  /// Reads the kernel's list form, such as "0-3,8,10-11": ascending, no number twice. An empty text is the
  /// empty set, and white space around the list is skipped. Nothing if the text is no such list.
  static std::optional<CpuSet> fromList(std::string_view list);

  /// Reads the kernel's mask form, such as "1,0000000f": groups of 32 bits in hexadecimal, the highest
  /// first. White space around the mask is skipped. Nothing if the text is no such mask.
  static std::optional<CpuSet> fromMask(std::string_view mask);

  /// The set in the kernel's list form.
  std::string toList() const;

  void add(unsigned int number);
  void add(const CpuSet& other);
  void remove(const CpuSet& other);
  void keepOnly(const CpuSet& other);

  bool empty() const { return words_.empty(); }
  bool contains(unsigned int number) const;
  bool intersects(const CpuSet& other) const;
  bool isSubsetOf(const CpuSet& other) const;
  unsigned int count() const;

  /// The lowest number, and the lowest one after `number`; `limit` where there is none.
  unsigned int first() const { return from(0); }
  unsigned int next(unsigned int number) const { return from(number + 1); }

  /// Walks the numbers, ascending: for (const unsigned int cpu : set).
  class Iterator {
   public:
    using difference_type = std::ptrdiff_t;
    using value_type = unsigned int;

    Iterator() = default;
    unsigned int operator*() const { return number_; }
    Iterator& operator++() {
      number_ = set_->next(number_);
      return *this;
    }
    Iterator operator++(int) {
      const Iterator before = *this;
      ++*this;
      return before;
    }
    bool operator==(const Iterator& other) const = default;

   private:
    friend class CpuSet;
    Iterator(const CpuSet& set, unsigned int number) : set_(&set), number_(number) {}

    const CpuSet* set_ = nullptr;
    unsigned int number_ = limit;
  };
  Iterator begin() const { return {*this, first()}; }
  Iterator end() const { return {*this, limit}; }

  bool operator==(const CpuSet& other) const = default;

 private:
  using Word = std::uint64_t;
  static constexpr unsigned int bits = 64;

  void addRange(unsigned int low, unsigned int high);
  unsigned int from(unsigned int number) const;
  void trim();

  std::vector<Word> words_;  // never ends with a zero, so that equal sets compare equal
};

}  // namespace Tarn::Inventory

#endif
