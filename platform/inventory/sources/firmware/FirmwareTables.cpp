#include "platform/inventory/sources/firmware/FirmwareTables.h"

#include <cerrno>
#include <string_view>
#include <utility>
#include <variant>

#include "platform/base/Hex.h"
#include "platform/inventory/sources/kernel/SystemModel.h"
#include "platform/inventory/tree/PlainText.h"
#include "platform/inventory/tree/PropertyTable.h"

namespace Tarn::Inventory {

namespace {

using namespace NodeLexicon;

constexpr const char* withoutTables = "needs firmware with SMBIOS tables, which list sockets, their states and clocks";
// Nothing is wrong then: nobody but root may read the tables, as serial numbers stand in them.
constexpr const char* forRoot = "run as root to see the sockets, their state and their clocks as well";
constexpr const char* brokenTables = "what is sound in the table counts; newer firmware may mend it";

bool readFile(Machine& machine, const char* path, std::string& contents) {
  FileSystem& files = machine.root().files();
  const FileError error = files.read(path, contents);
  if (error != 0) {
    const bool isForRoot = error == EACCES || error == EPERM;
    machine.unread().add(files.nameOf(path), describeError(error), isForRoot ? forRoot : withoutTables);
  }
  return error == 0;
}

void noteProblems(Machine& machine, const std::vector<Smbios::Problem>& problems) {
  if (problems.empty()) {
    return;
  }
  std::string reason = Smbios::describe(problems.front());
  if (problems.size() > 1) {
    reason += " (and " + std::to_string(problems.size() - 1) + " more)";
  }
  machine.unread().add(machine.root().files().nameOf(tableFile), std::move(reason), brokenTables);
}

void addText(Facts& facts, Properties id, const Smbios::System& system, const Smbios::Field<std::string>& field) {
  facts.text(id, firmwareText(field),
             [&system, &field] { return originInTables(system.structure, field, "as it stands"); });
}

}  // namespace

std::unique_ptr<const FirmwareTables> readFirmwareTables(Machine& machine) {
  auto firmware = std::make_unique<FirmwareTables>();
  if (!readFile(machine, entryPointFile, firmware->entryPoint) || !readFile(machine, tableFile, firmware->table)) {
    return nullptr;
  }
  Smbios::Decoded decoded = Smbios::decode(Smbios::bytesOf(firmware->entryPoint), Smbios::bytesOf(firmware->table));
  if (const auto* const problem = std::get_if<Smbios::Problem>(&decoded)) {
    noteProblems(machine, {*problem});
    return nullptr;
  }
  firmware->tables = std::get<Smbios::Tables>(std::move(decoded));
  noteProblems(machine, firmware->tables.problems);
  return firmware;
}

Facts systemFacts(const Smbios::Tables& tables) {
  Facts facts;
  if (!tables.systems.empty()) {
    const Smbios::System& system = tables.systems.front();
    addText(facts, PropSystemModel, system, system.product);
    addText(facts, PropSystemManufacturer, system, system.manufacturer);
  }
  return facts;
}

Origin originInTables(const Smbios::Structure& structure, std::size_t offset, Smbios::Bytes raw, std::string rule) {
  return {Smbios::placeOf(structure, offset), byteText(raw), std::move(rule)};
}

Origin originInTables(const Smbios::Structure& structure, const Smbios::Field<std::string>& field, std::string rule) {
  return {Smbios::placeOf(structure, field.offset), field ? *field : std::string(), std::move(rule)};
}

std::string byteText(Smbios::Bytes bytes) {
  std::string text;
  for (const std::byte byte : bytes) {
    text += text.empty() ? "" : " ";
    Common::appendHex(text, std::to_integer<unsigned char>(byte), Common::hexCapitals);
  }
  return text;
}

std::string handleText(const Smbios::Structure& structure) {
  return Common::hexText(structure.handle, 4, Common::hexCapitals);
}

std::string firmwareText(const Smbios::Field<std::string>& field) {
  std::string text = plainText(field ? std::string_view(*field) : std::string_view());
  return isPlaceholder(text) ? std::string() : text;
}

}  // namespace Tarn::Inventory
