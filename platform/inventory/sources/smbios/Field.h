#ifndef CORVANE_PLATFORM_INVENTORY_SOURCES_SMBIOS_FIELD_H
#define CORVANE_PLATFORM_INVENTORY_SOURCES_SMBIOS_FIELD_H

#include <cstddef>
#include <optional>
#include <string>

#include "platform/inventory/sources/smbios/Bytes.h"
#include "platform/inventory/sources/smbios/Structure.h"

namespace Tarn::Smbios {

/// One value of a structure, together with where it stands.
template <class Value>
struct Field {
  std::size_t offset = 0;      ///< of its first byte in the structure
  Bytes raw = {};              ///< those bytes, lowest first; empty where the structure is too short for the field
  std::optional<Value> value;  ///< nothing where the field is not there, or says that it does not know

  explicit operator bool() const { return value.has_value(); }
  const Value& operator*() const { return *value; }
  const Value* operator->() const { return &*value; }
};

/// "SMBIOS type 4, handle 0x0043, offset 0x12".
template <class Value>
std::string placeOf(const Structure& structure, const Field<Value>& field) {
  return placeOf(structure, field.offset);
}

}  // namespace Tarn::Smbios

#endif
