#ifndef CORVANE_PLATFORM_INVENTORY_SOURCES_SMBIOS_PROBLEM_H
#define CORVANE_PLATFORM_INVENTORY_SOURCES_SMBIOS_PROBLEM_H

#include <cstddef>
#include <cstdint>
#include <optional>
#include <string>
#include <vector>

namespace Tarn::Smbios {

/// What is wrong with a table, and where.
struct Problem {
  /// What `offset` counts from.
  enum class Place : std::uint8_t { EntryPoint, Table };

  Place place = Place::Table;
  std::size_t offset = 0;  ///< of the byte that is wrong, from the beginning of the entry point or of the table
  std::string text;        ///< what is wrong there: "the structure's length is 2, less than its header's 4"
  std::optional<unsigned int> structure = {};  ///< the structure's position in the table, from 0; none: the whole
  std::optional<std::uint16_t> handle = {};    ///< that structure's handle, where it has one

  bool operator==(const Problem&) const = default;
};

/// The problem as one sentence for people:
/// "SMBIOS table, offset 0x1c4, structure 12 (handle 0x0043): string 3 is not there".
std::string describe(const Problem& problem);

/// Problems in the order in which they were found. A broken table can have very many of them, so only the first
/// ones are kept, and the last one says that there are more.
class Problems {
 public:
  static constexpr std::size_t most = 64;

  void add(Problem problem);

  const std::vector<Problem>& list() const { return list_; }

 private:
  std::vector<Problem> list_;
};

}  // namespace Tarn::Smbios

#endif
