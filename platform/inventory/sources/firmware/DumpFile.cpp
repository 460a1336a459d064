#include "platform/inventory/sources/firmware/DumpFile.h"

#include <variant>

#include "platform/inventory/sources/firmware/FirmwareTables.h"
#include "platform/inventory/sources/smbios/Tables.h"
#include "platform/inventory/tree/Error.h"

namespace Tarn::Inventory {

MemoryFileSystem::Files filesOfDump(const std::string& dump, const std::string& name) {
  const Smbios::Bytes bytes = Smbios::bytesOf(dump);
  const Smbios::Decoded decoded = Smbios::decodeDump(bytes);
  if (const auto* const problem = std::get_if<Smbios::Problem>(&decoded)) {
    throw InventoryError("cannot read the SMBIOS dump", name, Smbios::describe(*problem),
                         "name a file that dmidecode --dump-bin wrote");
  }
  const Smbios::EntryPoint& entryPoint = std::get<Smbios::Tables>(decoded).entryPoint;
  const auto begin = static_cast<std::size_t>(entryPoint.tableAddress);
  MemoryFileSystem::Files files;
  files[entryPointFile] = {dump.substr(0, entryPoint.length), 0};
  files[tableFile] = {dump.substr(begin, Smbios::tableInDump(entryPoint, bytes).size()), 0};
  return files;
}

}  // namespace Tarn::Inventory
