// Masking the firmware's table: it keeps its shape and what is wrong with it, and masking it twice changes nothing.

#include "fuzz/Target.h"
#include "platform/inventory/sources/smbios/Tables.h"
#include "platform/inventory/sources/snapshot/SmbiosMask.h"

namespace {

using Corvane::Fuzz::require;
using namespace Tarn::Smbios;

void checkShape(const Tables& before, const Tables& after) {
  require(before.structures.size() == after.structures.size(), "every structure stays");
  for (std::size_t i = 0; i < before.structures.size(); ++i) {
    const Structure& one = before.structures[i];
    const Structure& other = after.structures[i];
    require(one.offset == other.offset && one.type == other.type && one.handle == other.handle &&
                one.formatted.size() == other.formatted.size() && one.strings.size() == other.strings.size(),
            "every structure stays where it is and as long as it is");
  }
  require(before.problems == after.problems, "what is wrong stays wrong");
  for (std::size_t i = 0; i < before.processors.size(); ++i) {
    const Processor& one = before.processors[i];
    const Processor& other = after.processors[i];
    require(one.id.value == other.id.value && one.status.value == other.status.value &&
                one.cores.value == other.cores.value &&
                one.version.value.has_value() == other.version.value.has_value(),
            "what the inventory is read from stays");
  }
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  const std::string dump = Corvane::Fuzz::textOf(data, size);
  Problems problems;
  const auto entryPoint = readEntryPoint(bytesOf(dump), problems);
  const auto* const found = std::get_if<EntryPoint>(&entryPoint);
  // The table stands behind the entry point, whatever that says.
  const std::string head = dump.substr(0, found == nullptr ? 0 : found->length);
  const std::string table = dump.substr(head.size());

  std::string masked = table;
  Tarn::Inventory::maskTable(head, masked);
  require(masked.size() == table.size(), "a table keeps its length");
  const Decoded before = decode(bytesOf(head), bytesOf(table));
  const Decoded after = decode(bytesOf(head), bytesOf(masked));
  require(before.index() == after.index(), "what could be decoded still can be");
  if (const auto* const tables = std::get_if<Tables>(&before)) {
    checkShape(*tables, std::get<Tables>(after));
  }
  std::string twice = masked;
  require(Tarn::Inventory::maskTable(head, twice).empty(), "nothing is left to mask");
  require(twice == masked, "a masked table stays as it is");
  return 0;
}
