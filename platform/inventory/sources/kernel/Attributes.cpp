#include "platform/inventory/sources/kernel/Attributes.h"

#include <algorithm>
#include <charconv>

#include "platform/base/Ascii.h"

namespace Tarn::Inventory {

// Both leave room for the terminating zero; a path that did not fit names no file.
char* Attributes::append(char* end, std::string_view part) {
  const auto room = static_cast<std::size_t>(path_.data() + path_.size() - 1 - end);
  return std::copy_n(part.data(), std::min(part.size(), room), end);
}

char* Attributes::append(char* end, unsigned int part) {
  const auto [after, error] = std::to_chars(end, path_.data() + path_.size() - 1, part);
  return error == std::errc() ? after : end;
}

std::optional<std::string_view> Attributes::read(const char* path) {
  error_ = files_.read(path, contents_);
  if (error_ != 0) {
    return std::nullopt;
  }
  return valueOf(contents_);
}

std::optional<CpuSet> Attributes::cpusIn(unsigned int cpu, std::span<const std::string_view> suffixes) {
  for (const std::string_view suffix : suffixes) {
    const std::optional<std::string_view> value = text("cpu", cpu, "/", suffix);
    std::optional<CpuSet> cpus = value ? parseCpus(suffix, *value) : std::nullopt;
    if (cpus) {
      return cpus;
    }
  }
  return std::nullopt;
}

std::optional<CpuSet> Attributes::parseCpus(std::string_view fileName, std::string_view value) {
  return fileName.ends_with("_list") ? CpuSet::fromList(value) : CpuSet::fromMask(value);
}

std::string_view Attributes::valueOf(std::string_view contents) {
  // The device tree ends its texts with a zero.
  return Common::trimmed(contents, std::string_view(" \t\n\0", 4));
}

std::optional<unsigned int> Attributes::toNumber(std::string_view text) {
  unsigned int number = 0;
  const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), number);
  return error == std::errc() && end == text.data() + text.size() ? std::optional(number) : std::nullopt;
}

std::optional<unsigned int> Attributes::numberAfter(std::string_view prefix, std::string_view name) {
  return name.starts_with(prefix) ? toNumber(name.substr(prefix.size())) : std::nullopt;
}

}  // namespace Tarn::Inventory
