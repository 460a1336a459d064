// Decoding the firmware's tables, against a walk over the same bytes.

#include <string>

#include "bench/Rows.h"
#include "platform/inventory/sources/smbios/Tables.h"
#include "tests/support/SmbiosEncoder.h"

namespace Corvane::Bench {
namespace {

using namespace Tarn::Smbios;

constexpr unsigned int processors = 8;
constexpr unsigned int structures = 100;

/// Looks at every byte once, in the order that the structures have, for the two zeros that end each of them.
unsigned int endsIn(Bytes table) {
  unsigned int ends = 0;
  std::byte last{1};
  for (const std::byte byte : table) {
    ends += (last | byte) == std::byte{0} ? 1 : 0;
    last = byte;
  }
  return ends;
}

}  // namespace

void addSmbiosRows() {
  const Support::SmbiosEncoder machine = Support::smbiosMachine(processors, structures);
  const std::string entryPoint = machine.entryPoint();
  const std::string table = machine.table();
  const Decoded decoded = decode(bytesOf(entryPoint), bytesOf(table));
  const auto* const tables = std::get_if<Tables>(&decoded);
  require(tables != nullptr && tables->structures.size() == structures && tables->processors.size() == processors &&
              tables->problems.empty(),
          "the SMBIOS table", "100 structures, 8 of them processors");

  addRow(
      {"decoding an SMBIOS table of 100 structures", 2.0},
      [entryPoint, table] { benchmark::DoNotOptimize(decode(bytesOf(entryPoint), bytesOf(table))); },
      [table] { benchmark::DoNotOptimize(endsIn(bytesOf(table))); });
}

}  // namespace Corvane::Bench
