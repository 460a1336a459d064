#ifndef CORVANE_PLATFORM_INVENTORY_SOURCES_SMBIOS_STRUCTURE_H
#define CORVANE_PLATFORM_INVENTORY_SOURCES_SMBIOS_STRUCTURE_H

#include <cstddef>
#include <cstdint>
#include <optional>
#include <string>
#include <vector>

#include "platform/inventory/sources/smbios/Bytes.h"
#include "platform/inventory/sources/smbios/EntryPoint.h"
#include "platform/inventory/sources/smbios/Problem.h"

namespace Tarn::Smbios {

/// What this library knows by name of the types of structures.
namespace StructureType {
inline constexpr std::uint8_t system = 1;
inline constexpr std::uint8_t processor = 4;
inline constexpr std::uint8_t cache = 7;
inline constexpr std::uint8_t inactive = 126;
inline constexpr std::uint8_t endOfTable = 127;
}  // namespace StructureType

/// One structure of the table: a formatted area of fields at fixed offsets, and the strings after it. It looks into
/// the table's bytes, which must outlive it.
struct Structure {
  static constexpr std::size_t headerLength = 4;

  unsigned int number = 0;  ///< position in the table, from 0
  std::size_t offset = 0;   ///< where it begins in the table, bytes
  std::uint8_t type = 0;
  std::uint16_t handle = 0;
  Bytes formatted;  ///< the header and the fields: as many bytes as the structure's own length says
  Bytes strings;    ///< the strings, each with its terminating zero; empty where it has none

  /// String number `index`, counted from 1 as the fields do. Its bytes are without the zero. Nothing where there is
  /// no such string.
  std::optional<Bytes> string(unsigned int index) const;

  /// How many strings it has.
  unsigned int stringCount() const;

  /// Hands every string to `take(index, bytes)`, in their order and counted as above. Asking for one number after the
  /// other would look for each from the beginning.
  template <class Take>
  void eachString(Take take) const {
    Bytes rest = strings;
    for (unsigned int index = 1; !rest.empty(); ++index) {
      take(index, takeString(rest));
    }
  }

 private:
  // The first string of these; what follows its zero is left.
  static Bytes takeString(Bytes& rest);
};

/// How much of a table is read, bytes: many times what the largest machines have, and little enough that the texts of a
/// broken or made-up table, each of which any number of fields may refer to, do not fill the memory.
inline constexpr std::size_t largestTable = std::size_t{1} << 20U;

/// "SMBIOS type 4, handle 0x0043", or with an offset in the structure "SMBIOS type 4, handle 0x0043, offset 0x12".
std::string placeOf(const Structure& structure);
std::string placeOf(const Structure& structure, std::size_t offset);

/// Finds the structures of a table. What is no structure ends the walk, as the length of a broken one does not tell
/// where the next begins; a structure whose formatted area does not fit is not among them. The end-of-table structure
/// is the last one under _SM3_. Under the older entry points it is the last one only when as many structures as were
/// announced have been seen, since there the whole length of the table is looked at. What comes after the first
/// `largestTable` bytes is not read.
std::vector<Structure> walk(const EntryPoint& entryPoint, Bytes table, Problems& problems);

}  // namespace Tarn::Smbios

#endif
