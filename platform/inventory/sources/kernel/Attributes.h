#ifndef CORVANE_PLATFORM_INVENTORY_SOURCES_KERNEL_ATTRIBUTES_H
#define CORVANE_PLATFORM_INVENTORY_SOURCES_KERNEL_ATTRIBUTES_H

#include <array>
#include <optional>
#include <span>
#include <string>
#include <string_view>

#include "platform/inventory/sources/files/FileSystem.h"
#include "platform/inventory/tree/CpuSet.h"

namespace Tarn::Inventory {

/// Reads the kernel's attributes: files that hold one short value. Each call names its file in parts,
/// texts and numbers, which it joins: number("cpu", 12, "/topology/core_id").
class Attributes {
 public:
  explicit Attributes(FileSystem& files) : files_(files) {}

  /// The value without the white space around it; good until the next call. Nothing if the file cannot
  /// be read.
  template <class... Parts>
  std::optional<std::string_view> text(const Parts&... parts) {
    return read(join(parts...));
  }

  /// A number from 0 on. Nothing for any other value: the kernel writes -1 for what it does not know.
  template <class... Parts>
  std::optional<unsigned int> number(const Parts&... parts) {
    const std::optional<std::string_view> value = read(join(parts...));
    return value ? toNumber(*value) : std::nullopt;
  }

  /// A list of CPU numbers.
  template <class... Parts>
  std::optional<CpuSet> list(const Parts&... parts) {
    const std::optional<std::string_view> value = read(join(parts...));
    return value ? CpuSet::fromList(*value) : std::nullopt;
  }

  /// The CPUs that the first usable one of these files below cpuN/ holds.
  std::optional<CpuSet> cpusIn(unsigned int cpu, std::span<const std::string_view> suffixes);

  /// A file's value as CPU numbers: a list if the file's name ends with "_list", else a mask.
  static std::optional<CpuSet> parseCpus(std::string_view fileName, std::string_view value);

  /// Why the last call could not read its file; 0 if it could.
  FileError error() const { return error_; }

  /// The last call's file, for messages.
  std::string fileName() const { return files_.nameOf(path_.data()); }

  FileSystem& files() const { return files_; }

  /// A file's contents without the white space around them.
  static std::string_view valueOf(std::string_view contents);

  static std::optional<unsigned int> toNumber(std::string_view text);

  /// The number after a prefix: 12 for "cpu12" after "cpu".
  static std::optional<unsigned int> numberAfter(std::string_view prefix, std::string_view name);

 private:
  static constexpr std::size_t longestPath = 128;

  template <class... Parts>
  const char* join(const Parts&... parts) {
    char* end = path_.data();
    ((end = append(end, parts)), ...);
    *end = '\0';
    return path_.data();
  }
  char* append(char* end, std::string_view part);
  char* append(char* end, unsigned int part);

  std::optional<std::string_view> read(const char* path);

  FileSystem& files_;
  FileError error_ = 0;
  std::array<char, longestPath> path_{};
  std::string contents_;
};

}  // namespace Tarn::Inventory

#endif
