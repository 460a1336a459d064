#ifndef CORVANE_PLATFORM_INVENTORY_SOURCES_SMBIOS_FIELDREADER_H
#define CORVANE_PLATFORM_INVENTORY_SOURCES_SMBIOS_FIELDREADER_H

#include <optional>
#include <string>

#include "platform/inventory/sources/smbios/Field.h"
#include "platform/inventory/sources/smbios/Problem.h"
#include "platform/inventory/sources/smbios/Structure.h"

namespace Tarn::Smbios::detail {

/// Takes one structure's fields, each only where the structure's own length reaches to its end.
class FieldReader {
 public:
  /// A structure shorter than `leastLength`, the shortest that the standard ever had, is noted as a problem.
  FieldReader(const Structure& structure, std::size_t leastLength, Problems& problems);

  /// The number at `offset`, passed through `translate`, which gives the value or nothing where it is unknown.
  template <std::unsigned_integral Raw, class Translate>
  auto number(std::size_t offset, Translate translate) const {
    Field<typename decltype(translate(Raw{}))::value_type> field{offset, bytes(offset, sizeof(Raw)), {}};
    if (!field.raw.empty()) {
      field.value = translate(littleEndian<Raw>(field.raw, 0));
    }
    return field;
  }

  /// A small field and, for values that do not fit, its later and larger twin: the twin where the first field holds
  /// `marker` and the structure is long enough for the twin, else the first.
  template <std::unsigned_integral First, std::unsigned_integral Second, class TranslateFirst, class TranslateSecond>
  auto twoFields(std::size_t first, First marker, TranslateFirst translateFirst, std::size_t second,
                 TranslateSecond translateSecond) const {
    const Bytes raw = bytes(first, sizeof(First));
    const bool inSecond =
        !raw.empty() && littleEndian<First>(raw, 0) == marker && !bytes(second, sizeof(Second)).empty();
    return inSecond ? number<Second>(second, translateSecond) : number<First>(first, translateFirst);
  }

  /// The bytes at `offset`; none where the structure is too short for all of them.
  Bytes bytes(std::size_t offset, std::size_t width) const;

  /// The string whose number stands at `offset`. A number without a string is a problem.
  Field<std::string> text(std::size_t offset) const;

  void note(std::size_t offset, const std::string& text) const;

 private:
  const Structure& structure_;
  Problems& problems_;
};

/// Translations of what means "unknown" in many fields.
template <class Raw>
std::optional<Raw> unlessZero(Raw raw) {
  return raw == 0 ? std::nullopt : std::optional(raw);
}
template <class Raw>
std::optional<Raw> unlessZeroOrTwo(Raw raw) {
  return raw == 0 || raw == 2 ? std::nullopt : std::optional(raw);
}

}  // namespace Tarn::Smbios::detail

#endif
