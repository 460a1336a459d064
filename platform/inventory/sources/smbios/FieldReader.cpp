#include "platform/inventory/sources/smbios/FieldReader.h"

#include <algorithm>
#include <iterator>

namespace Tarn::Smbios::detail {

FieldReader::FieldReader(const Structure& structure, std::size_t leastLength, Problems& problems)
    : structure_(structure), problems_(problems) {
  if (structure.formatted.size() < leastLength) {
    note(1, "the structure of type " + std::to_string(structure.type) + " has " +
                std::to_string(structure.formatted.size()) + " bytes; the shortest ever defined has " +
                std::to_string(leastLength));
  }
}

Bytes FieldReader::bytes(std::size_t offset, std::size_t width) const {
  const Bytes all = structure_.formatted;
  return offset + width <= all.size() ? all.subspan(offset, width) : Bytes();
}

Field<std::string> FieldReader::text(std::size_t offset) const {
  Field<std::string> field{offset, bytes(offset, 1), {}};
  const unsigned int index = field.raw.empty() ? 0 : std::to_integer<unsigned int>(field.raw[0]);
  if (index == 0) {
    return field;
  }
  const std::optional<Bytes> text = structure_.string(index);
  if (!text) {
    note(offset, "string " + std::to_string(index) + " is not there, the structure has " +
                     std::to_string(structure_.stringCount()));
  } else if (!text->empty()) {
    field.value.emplace();
    std::ranges::transform(*text, std::back_inserter(*field.value),
                           [](std::byte byte) { return std::to_integer<char>(byte); });
  }
  return field;
}

void FieldReader::note(std::size_t offset, const std::string& text) const {
  problems_.add({Problem::Place::Table, structure_.offset + offset, text, structure_.number, structure_.handle});
}

}  // namespace Tarn::Smbios::detail
