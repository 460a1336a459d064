#include "tests/platform/inventory/sources/smbios/Decoding.h"

#include <algorithm>
#include <iterator>
#include <utility>

namespace Tarn::Smbios {

Decoding::Decoding(std::string entryPoint, std::string table)
    : entryPoint_(std::move(entryPoint)),
      table_(std::move(table)),
      decoded_(decode(bytesOf(entryPoint_), bytesOf(table_))) {}

std::vector<std::string> Decoding::problems() const {
  std::vector<std::string> texts;
  std::ranges::transform((**this).problems, std::back_inserter(texts), describe);
  return texts;
}

std::string failureOf(const Decoded& decoded) {
  const auto* const problem = std::get_if<Problem>(&decoded);
  return problem == nullptr ? std::string() : describe(*problem);
}

std::string valueOf(const Field<std::string>& field) {
  return field ? *field : "-";
}

}  // namespace Tarn::Smbios
