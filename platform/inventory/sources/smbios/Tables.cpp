#include "platform/inventory/sources/smbios/Tables.h"

#include <algorithm>
#include <string>

#include "platform/inventory/sources/smbios/Hexadecimal.h"

namespace Tarn::Smbios {

namespace {

/// How many handles there can be.
constexpr std::size_t handles = std::size_t{1} << 16U;

void checkHandles(const std::vector<Structure>& structures, Problems& problems) {
  std::vector<bool> seen(handles);
  for (const Structure& structure : structures) {
    if (seen[structure.handle] && structure.type != StructureType::inactive) {
      problems.add({Problem::Place::Table, structure.offset + 2, "an earlier structure has the same handle",
                    structure.number, structure.handle});
    }
    seen[structure.handle] = true;
  }
}

// What a processor calls its caches must be caches.
void checkCaches(const Tables& tables, Problems& problems) {
  for (const Processor& processor : tables.processors) {
    for (const Field<std::uint16_t>& handle : processor.caches) {
      if (handle && tables.cache(*handle) == nullptr) {
        problems.add({Problem::Place::Table, processor.structure.offset + handle.offset,
                      "there is no cache with the handle " + detail::hexadecimal(*handle, 4),
                      processor.structure.number, processor.structure.handle});
      }
    }
  }
}

// Records are large: moving them each time a list grows would take longer than decoding them.
template <class Record>
void reserveFor(std::uint8_t type, const std::vector<Structure>& structures, std::vector<Record>& records) {
  records.reserve(static_cast<std::size_t>(std::ranges::count(structures, type, &Structure::type)));
}

Tables decodeTable(const EntryPoint& entryPoint, Bytes table, Problems& problems) {
  Tables tables;
  tables.entryPoint = entryPoint;
  tables.structures = walk(entryPoint, table, problems);
  checkHandles(tables.structures, problems);
  reserveFor(StructureType::processor, tables.structures, tables.processors);
  reserveFor(StructureType::cache, tables.structures, tables.caches);
  for (const Structure& structure : tables.structures) {
    switch (structure.type) {
      case StructureType::system:
        tables.systems.push_back(readSystem(structure, problems));
        break;
      case StructureType::processor:
        tables.processors.push_back(readProcessor(structure, problems));
        break;
      case StructureType::cache:
        tables.cacheByHandle.emplace(structure.handle, tables.caches.size());
        tables.caches.push_back(readCache(structure, problems));
        break;
      default:
        break;
    }
  }
  checkCaches(tables, problems);
  tables.problems = problems.list();
  return tables;
}

}  // namespace

const Structure* Tables::structure(std::uint16_t handle) const {
  const auto found = std::ranges::find(structures, handle, &Structure::handle);
  return found == structures.end() ? nullptr : &*found;
}

const Cache* Tables::cache(std::uint16_t handle) const {
  const auto found = cacheByHandle.find(handle);
  return found == cacheByHandle.end() ? nullptr : &caches[found->second];
}

Decoded decode(Bytes entryPoint, Bytes table) {
  Problems problems;
  const auto read = readEntryPoint(entryPoint, problems);
  if (const auto* const problem = std::get_if<Problem>(&read)) {
    return *problem;
  }
  return decodeTable(std::get<EntryPoint>(read), table, problems);
}

Bytes tableInDump(const EntryPoint& entryPoint, Bytes file) {
  if (entryPoint.tableAddress < entryPoint.length || entryPoint.tableAddress >= file.size()) {
    return {};
  }
  const Bytes rest = file.subspan(static_cast<std::size_t>(entryPoint.tableAddress));
  return rest.first(std::min<std::size_t>(rest.size(), entryPoint.tableLength));
}

Decoded decodeDump(Bytes file) {
  Problems problems;
  const auto read = readEntryPoint(file, problems);
  if (const auto* const problem = std::get_if<Problem>(&read)) {
    return *problem;
  }
  const auto& entryPoint = std::get<EntryPoint>(read);
  const Bytes table = tableInDump(entryPoint, file);
  if (table.empty()) {
    return Problem{Problem::Place::EntryPoint, 0,
                   "the table is not in the file: it should begin at " + detail::hexadecimal(entryPoint.tableAddress) +
                       ", after the entry point's " + std::to_string(entryPoint.length) + " bytes and within the " +
                       std::to_string(file.size()) + " bytes of the file"};
  }
  return decodeTable(entryPoint, table, problems);
}

}  // namespace Tarn::Smbios
