#include "platform/inventory/sources/smbios/System.h"

#include <algorithm>

#include "platform/inventory/sources/smbios/FieldReader.h"

namespace Tarn::Smbios {

namespace {

bool allAre(Bytes bytes, std::byte value) {
  return std::ranges::all_of(bytes, [value](std::byte byte) { return byte == value; });
}

// All zeros: the machine has none. All ones: it has one that is not set.
Field<System::Uuid> readUuid(const detail::FieldReader& fields, std::size_t offset) {
  Field<System::Uuid> field{offset, fields.bytes(offset, std::tuple_size_v<System::Uuid>), {}};
  if (!field.raw.empty() && !allAre(field.raw, std::byte{0}) && !allAre(field.raw, std::byte{0xFF})) {
    field.value.emplace();
    std::ranges::copy(field.raw, field.value->begin());
  }
  return field;
}

}  // namespace

System readSystem(const Structure& structure, Problems& problems) {
  constexpr std::size_t lengthIn20 = 0x08;
  const detail::FieldReader fields(structure, lengthIn20, problems);
  return {
      .structure = structure,
      .manufacturer = fields.text(0x04),
      .product = fields.text(0x05),
      .version = fields.text(0x06),
      .serialNumber = fields.text(0x07),
      .uuid = readUuid(fields, 0x08),
      .sku = fields.text(0x19),
      .family = fields.text(0x1A),
  };
}

}  // namespace Tarn::Smbios
