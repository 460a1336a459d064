#include "platform/inventory/sources/smbios/EntryPoint.h"

#include <algorithm>
#include <array>
#include <numeric>
#include <string>
#include <string_view>

#include "platform/inventory/sources/smbios/Hexadecimal.h"

namespace Tarn::Smbios {

namespace {

using Place = Problem::Place;

/// A stretch of bytes whose sum must be zero.
struct Checksum {
  std::string_view name;
  std::size_t offset;
  std::size_t length;
};

class Reader {
 public:
  Reader(Bytes bytes, Problems& problems) : bytes_(bytes), problems_(problems) {}

  EntryPoint readLegacy() {
    constexpr std::size_t length = 15;
    check({"checksum", 0, length});
    const auto revision = number<std::uint8_t>(0x0E);
    return {.kind = EntryPoint::Kind::Legacy,
            .version = {static_cast<std::uint8_t>(revision >> 4U), static_cast<std::uint8_t>(revision & 0xFU)},
            .tableAddress = number<std::uint32_t>(0x08),
            .tableLength = number<std::uint16_t>(0x06),
            .structures = number<std::uint16_t>(0x0C),
            .length = length};
  }

  EntryPoint readSmbios2() {
    const std::size_t length = ownLength(0x05, 0x1E);
    check({"checksum", 0, length});
    check({"intermediate checksum", 0x10, 0x0F});
    return {.kind = EntryPoint::Kind::Smbios2,
            .version = {number<std::uint8_t>(0x06), number<std::uint8_t>(0x07)},
            .tableAddress = number<std::uint32_t>(0x18),
            .tableLength = number<std::uint16_t>(0x16),
            .structures = number<std::uint16_t>(0x1C),
            .length = length};
  }

  EntryPoint readSmbios3() {
    const std::size_t length = ownLength(0x06, 0x18);
    check({"checksum", 0, length});
    return {.kind = EntryPoint::Kind::Smbios3,
            .version = {number<std::uint8_t>(0x07), number<std::uint8_t>(0x08)},
            .tableAddress = number<std::uint64_t>(0x10),
            .tableLength = number<std::uint32_t>(0x0C),
            .structures = {},
            .length = length};
  }

 private:
  template <std::unsigned_integral Number>
  Number number(std::size_t offset) const {
    return littleEndian<Number>(bytes_, offset);
  }

  // The length that the entry point gives for itself, which its checksum covers.
  std::size_t ownLength(std::size_t offset, std::size_t least) {
    const std::size_t length = number<std::uint8_t>(offset);
    if (length >= least && length <= bytes_.size()) {
      return length;
    }
    problems_.add({Place::EntryPoint, offset,
                   "it gives its own length as " + std::to_string(length) + "; it has at least " +
                       std::to_string(least) + " bytes, and " + std::to_string(bytes_.size()) + " are there"});
    return least;
  }

  void check(const Checksum& checksum) {
    if (checksum.offset + checksum.length > bytes_.size()) {
      return;  // entry points of 2.1 may be a byte shorter than their second checksum reaches
    }
    const Bytes covered = bytes_.subspan(checksum.offset, checksum.length);
    const auto sum = std::accumulate(covered.begin(), covered.end(), 0U, [](unsigned int total, std::byte byte) {
      return (total + std::to_integer<unsigned int>(byte)) & 0xFFU;
    });
    if (sum != 0) {
      problems_.add({Place::EntryPoint, checksum.offset,
                     "the " + std::string(checksum.name) + " is wrong: " + std::to_string(checksum.length) +
                         " bytes add up to " + detail::hexadecimal(sum, 2) + " instead of 0"});
    }
  }

  Bytes bytes_;
  Problems& problems_;
};

struct Anchor {
  std::string_view text;
  std::size_t least;  ///< bytes that are read
  EntryPoint (Reader::*read)();
};
constexpr std::array anchors = {
    Anchor{"_SM3_", 0x18, &Reader::readSmbios3},
    Anchor{"_SM_", 0x1E, &Reader::readSmbios2},
    Anchor{"_DMI_", 0x0F, &Reader::readLegacy},
};

bool beginsWith(Bytes bytes, std::string_view text) {
  const Bytes anchor = bytesOf(text);
  return bytes.size() >= anchor.size() && std::ranges::equal(bytes.first(anchor.size()), anchor);
}

}  // namespace

std::variant<EntryPoint, Problem> readEntryPoint(Bytes bytes, Problems& problems) {
  const auto* const anchor = std::ranges::find_if(anchors, [&](const Anchor& a) { return beginsWith(bytes, a.text); });
  if (anchor == anchors.end()) {
    return Problem{Place::EntryPoint, 0, "no SMBIOS entry point begins here: neither _SM3_ nor _SM_ nor _DMI_"};
  }
  if (bytes.size() < anchor->least) {
    return Problem{Place::EntryPoint, bytes.size(),
                   "the entry point " + std::string(anchor->text) + " ends after " + std::to_string(bytes.size()) +
                       " bytes; it needs " + std::to_string(anchor->least)};
  }
  Reader reader(bytes, problems);
  return (reader.*anchor->read)();
}

}  // namespace Tarn::Smbios
