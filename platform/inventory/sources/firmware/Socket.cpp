#include "platform/inventory/sources/firmware/Socket.h"

#include <algorithm>
#include <array>
#include <map>
#include <optional>
#include <string_view>
#include <utility>

#include "platform/base/Ascii.h"
#include "platform/inventory/sources/firmware/FirmwareTables.h"
#include "platform/inventory/sources/kernel/CimFamily.h"
#include "platform/inventory/tree/PropertyTable.h"

namespace Tarn::Inventory {

namespace {

using namespace NodeLexicon;
using Smbios::Field;
using Smbios::ProcessorStatus;

// With "S:" in front and a cache's name after it, such a path is no longer than others.
constexpr std::size_t longestLabel = 8;

constexpr std::size_t signatureLength = 4;

// Sockets of coprocessors are no processors of the machine.
constexpr std::array<std::uint8_t, 3> otherTypes = {4, 5, 6};

struct StatusRow {
  ProcessorStatus code;
  unsigned int status;
  std::string_view rule;
};
constexpr std::array statusRows = {
    StatusRow{ProcessorStatus::Unknown, Status::inUse, "bits 0 to 2 are 0, unknown: in use, 1"},
    StatusRow{ProcessorStatus::Enabled, Status::inUse, "bits 0 to 2 are 1, enabled: in use, 1"},
    StatusRow{ProcessorStatus::DisabledByUser, Status::disabled, "bits 0 to 2 are 2, disabled by the user: 16"},
    StatusRow{ProcessorStatus::DisabledByFirmware, Status::failed,
              "bits 0 to 2 are 3, disabled by the firmware after the self-test: failed, 24"},
    StatusRow{ProcessorStatus::Idle, Status::inUse, "bits 0 to 2 are 4, idle: in use, 1"},
    StatusRow{ProcessorStatus::Other, Status::inUse, "bits 0 to 2 are 7, other: in use, 1"},
};
constexpr StatusRow emptyRow = {ProcessorStatus::Unknown, Status::emptySocket, "bit 6 is 0: an empty socket, 15"};
constexpr StatusRow reservedRow = {ProcessorStatus::Unknown, Status::inUse,
                                   "bits 0 to 2 hold a reserved code: taken as unknown, in use, 1"};

const StatusRow& statusRow(const Smbios::Processor& processor) {
  if (!processor.populated || !*processor.populated) {
    return emptyRow;
  }
  const auto* const row =
      processor.status ? std::ranges::find(statusRows, *processor.status, &StatusRow::code) : statusRows.end();
  return row == statusRows.end() ? reservedRow : *row;
}

bool isCentral(const Smbios::Processor& processor) {
  return !processor.type || std::ranges::find(otherTypes, *processor.type) == otherTypes.end();
}

// The label as a part of a path; empty where it will not do.
std::string labelForPath(const Smbios::Processor& processor) {
  std::string label = firmwareText(processor.socket);
  std::erase(label, ' ');
  const bool plain = std::ranges::all_of(
      label, [](char c) { return Common::isLetter(c) || Common::isDigit(c) || c == '-' || c == '_'; });
  return plain && label.size() <= longestLabel ? label : std::string();
}

// Whether the field of the identification register holds another identifier than the kernel's.
bool holdsSocId(const Smbios::Processor& processor) {
  return processor.characteristics && (*processor.characteristics & Smbios::ProcessorCharacteristic::armSocId) != 0;
}

ProcessorIdentity identityOf(const Smbios::Processor& processor) {
  ProcessorIdentity identity;
  if (processor.id && !holdsSocId(processor)) {
    const Smbios::Bytes signature = processor.id.raw.first(signatureLength);
    const bool isZero = std::ranges::all_of(signature, [](std::byte byte) { return byte == std::byte{0}; });
    identity.signature = isZero ? std::string() : byteText(signature);
  }
  identity.name = comparableName(firmwareText(processor.version));
  identity.cores = processor.cores.value;
  identity.threads = processor.threads.value;
  return identity;
}

// Who makes x86 processors, as firmware writes it. On these the identification register has the stepping.
constexpr std::array<std::string_view, 7> x86Makers = {
    "advanced micro devices", "amd", "authenticamd", "genuineintel", "hygon", "intel", "zhaoxin"};

std::optional<unsigned int> x86Stepping(const Smbios::Processor& processor) {
  const std::string maker = comparableName(firmwareText(processor.manufacturer));
  const bool isX86 = std::ranges::any_of(x86Makers, [&](std::string_view known) { return maker.starts_with(known); });
  // Without a signature the feature bits after it say nothing of the stepping.
  const bool isTold = processor.id && (*processor.id & 0xFFFFFFFFU) != 0;
  return isX86 && isTold ? std::optional(static_cast<unsigned int>(*processor.id & 0xFU)) : std::nullopt;
}

std::optional<unsigned int> widthOf(const Smbios::Processor& processor) {
  // A processor without any characteristic is one whose characteristics nobody filled in.
  if (!processor.characteristics || *processor.characteristics == 0) {
    return std::nullopt;
  }
  return (*processor.characteristics & Smbios::ProcessorCharacteristic::wide64) != 0 ? 64 : 32;
}

/// How often each text is there.
std::map<std::string, unsigned int> counted(const std::vector<std::string>& texts) {
  std::map<std::string, unsigned int> counts;
  for (const std::string& text : texts) {
    ++counts[text];
  }
  return counts;
}

// Broken firmware gives a handle twice. The place in the table tells the two apart.
void separateEqualHandles(std::vector<Socket>& sockets) {
  std::vector<std::string> paths;
  paths.reserve(sockets.size());
  for (const Socket& socket : sockets) {
    paths.push_back(socket.path);
  }
  const std::map<std::string, unsigned int> counts = counted(paths);
  for (Socket& socket : sockets) {
    if (counts.at(socket.path) > 1) {
      socket.path += '.' + std::to_string(socket.structure->structure.number);
    }
  }
}

/// Collects the properties of one socket, each with its field.
class Collector {
 public:
  Collector(const Socket& socket, const std::string& matched) : processor_(*socket.structure), matched_(matched) {}

  Facts collect(bool populated) {
    text(PropSocket, processor_.socket);
    if (populated) {
      addProcessor();
    }
    number(PropUpgradeMethod, processor_.upgrade, "as it stands: the codes are CIM's");
    return std::move(facts_);
  }

 private:
  void addProcessor() {
    number(PropFamily, processor_.family, "as it stands: the codes are CIM's");
    if (!processor_.family && matched_.empty()) {
      facts_.number(PropFamily, CimFamily::unknown, told(processor_.family, "no family is given: unknown"));
    }
    text(PropProcessorName, processor_.version);
    addId();
    const std::optional<unsigned int> stepping = x86Stepping(processor_);
    facts_.text(PropStepping, stepping ? std::to_string(*stepping) : std::string(),
                told(processor_.id, "the lowest four bits of an x86 signature"));
    number(PropProcessorCores, processor_.cores, "as it stands");
    number(PropEnabledCores, processor_.coresEnabled, "as it stands");
    number(PropHardwareThreads, processor_.threads, "as it stands");
    number(PropMaxClockSpeed, processor_.maxSpeed, "MHz, the most that the socket takes");
    number(PropCurrentClockSpeed, processor_.currentSpeed, "MHz, at boot");
    number(PropExternalClockSpeed, processor_.externalClock, "MHz");
    constexpr const char* widthRule = "64 with bit 2, else 32";
    facts_.number(PropDataWidth, widthOf(processor_), told(processor_.characteristics, widthRule));
    facts_.number(PropAddressWidth, widthOf(processor_), told(processor_.characteristics, widthRule));
    text(PropSerialNumber, processor_.serialNumber);
    text(PropAssetTag, processor_.assetTag);
    text(PropPartNumber, processor_.partNumber);
  }

  // Two identifiers of one processor do not contradict each other: the kernel's is used.
  void addId() {
    const bool isOther = holdsSocId(processor_) && !matched_.empty();
    const std::string id = processor_.id && !isOther ? byteText(processor_.id.raw) : std::string();
    facts_.text(PropProcessorId, id, told(processor_.id, "its bytes as they stand"));
  }

  template <class Value>
  void number(Properties id, const Field<Value>& field, const char* rule) {
    facts_.number(id, field ? std::optional<unsigned int>(*field) : std::nullopt, told(field, rule));
  }

  void text(Properties id, const Field<std::string>& field) {
    facts_.text(id, firmwareText(field), told(field, "as it stands"));
  }

  template <class Value>
  Facts::Explain told(const Field<Value>& field, const char* rule) const {
    return [&structure = processor_.structure, &field, rule, matched = matched_] {
      return originInTables(structure, field, rule + (matched.empty() ? "" : "; socket found by: " + matched));
    };
  }

  const Smbios::Processor& processor_;
  const std::string& matched_;
  Facts facts_;
};

}  // namespace

bool Socket::isEnabled() const {
  return isPopulated() && status == Status::inUse;
}

Origin Socket::statusOrigin() const {
  return originInTables(structure->structure, structure->populated, std::string(statusRow(*structure).rule));
}

Origin Socket::labelOrigin() const {
  if (structure->socket) {
    return originInTables(structure->structure, structure->socket, "the label of the socket");
  }
  return {Smbios::placeOf(structure->structure), handleText(structure->structure),
          "the socket has no label: its handle"};
}

std::vector<Socket> readSockets(const Smbios::Tables& tables) {
  std::vector<Socket> sockets;
  std::vector<std::string> labels;
  for (const Smbios::Processor& processor : tables.processors) {
    if (isCentral(processor) && processor.populated) {
      const std::string label = firmwareText(processor.socket);
      sockets.push_back({.structure = &processor,
                         .path = {},
                         .label = label.empty() ? "0x" + handleText(processor.structure) : label,
                         .status = statusRow(processor).status,
                         .identity = identityOf(processor)});
      labels.push_back(labelForPath(processor));
    }
  }
  const std::map<std::string, unsigned int> counts = counted(labels);
  for (std::size_t i = 0; i < sockets.size(); ++i) {
    const bool usable = !labels[i].empty() && counts.at(labels[i]) == 1;
    sockets[i].path = usable ? "S:" + labels[i] : "S#" + handleText(sockets[i].structure->structure);
  }
  separateEqualHandles(sockets);
  std::ranges::stable_sort(sockets, {}, [](const Socket& socket) { return socket.structure->structure.handle; });
  return sockets;
}

Facts socketFacts(const Socket& socket, const std::string& matched) {
  return Collector(socket, matched).collect(socket.isPopulated());
}

}  // namespace Tarn::Inventory
