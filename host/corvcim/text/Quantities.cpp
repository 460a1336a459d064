#include "host/corvcim/text/Quantities.h"

#include <array>
#include <string_view>

namespace Corvcim {
namespace {

/// value / unit with at most two decimals, rounded to the nearest.
std::string decimal(std::uint64_t value, std::uint64_t unit) {
  std::uint64_t whole = value / unit;
  std::uint64_t hundredths = (value % unit * 100 + unit / 2) / unit;
  if (hundredths == 100) {
    ++whole;
    hundredths = 0;
  }
  std::string text = std::to_string(whole);
  if (hundredths == 0) {
    return text;
  }
  text += '.';
  text += static_cast<char>('0' + hundredths / 10);
  if (hundredths % 10 != 0) {
    text += static_cast<char>('0' + hundredths % 10);
  }
  return text;
}

struct BinaryUnit {
  unsigned shift;
  std::string_view name;
};

constexpr std::array<BinaryUnit, 4> binaryUnits = {{{40, " TiB"}, {30, " GiB"}, {20, " MiB"}, {10, " KiB"}}};

}  // namespace

std::string formatBytes(std::uint64_t bytes) {
  for (const BinaryUnit& unit : binaryUnits) {
    const std::uint64_t one = std::uint64_t{1} << unit.shift;
    if (bytes >= one) {
      return decimal(bytes, one).append(unit.name);
    }
  }
  return std::to_string(bytes) + (bytes == 1 ? " byte" : " bytes");
}

std::string formatMegahertz(std::uint64_t megahertz) {
  constexpr std::uint64_t gigahertz = 1000;
  if (megahertz >= gigahertz) {
    return decimal(megahertz, gigahertz) + " GHz";
  }
  return std::to_string(megahertz) + " MHz";
}

}  // namespace Corvcim
