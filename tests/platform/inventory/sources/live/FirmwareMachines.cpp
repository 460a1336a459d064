#include "tests/platform/inventory/sources/live/FirmwareMachines.h"

#include <array>
#include <string>

namespace Tarn::Inventory {

namespace {

using Support::emptySocket;
using Support::SmbiosCache;
using Support::SmbiosEncoder;
using Support::SmbiosProcessor;
using Support::SmbiosSystem;

constexpr std::uint16_t notProvided = 0xFFFF;
constexpr std::uint8_t unified = 5;

SmbiosEncoder ended(SmbiosEncoder tables) {
  tables.end();
  return tables;
}

// The oldest structures: no cache handles, no serial number, no counts.
SmbiosEncoder oldAndShort() {
  SmbiosEncoder tables(2, 0);
  tables.add(SmbiosSystem{.manufacturer = "Old Boxes", .product = "PowerBox 98"});
  tables.add(SmbiosProcessor{.socket = "Slot 1",
                             .family = 0x11,
                             .manufacturer = "GenuineIntel",
                             .id = 0x0183FBFF00000665,
                             .version = "Pentium II",
                             .externalClock = 66,
                             .maxSpeed = 600,
                             .currentSpeed = 333,
                             .upgrade = 8});
  return ended(std::move(tables));
}

// Structures with fields of a version that is yet to come.
SmbiosEncoder newAndLong() {
  SmbiosEncoder tables(3, 9);
  tables.add(SmbiosSystem{.frame = {.length = 0x30}, .manufacturer = "New Boxes", .product = "PowerBox 30"});
  const std::uint16_t l2 =
      tables.add(SmbiosCache{.frame = {.length = 0x40}, .socket = "L2", .level = 2, .installedKiB = 3145728});
  tables.add(SmbiosProcessor{.frame = {.length = 0x60},
                             .socket = "CPU0",
                             .family = 512,
                             .manufacturer = "Example",
                             .version = "Example 30",
                             .caches = {notProvided, l2, notProvided},
                             .cores = 300,
                             .coresEnabled = 299,
                             .threads = 600,
                             .threadsEnabled = 598});
  return ended(std::move(tables));
}

SmbiosCache cacheOf(std::uint16_t level, std::uint64_t kibibytes, std::uint8_t associativity = 7) {
  return {.socket = "L" + std::to_string(level) + " Cache",
          .level = level,
          .maximumKiB = kibibytes,
          .installedKiB = kibibytes,
          .type = unified,
          .associativity = associativity};
}

// A laptop board with a second socket that nobody filled; the marketing blanks of real firmware.
SmbiosEncoder oneOfTwoSockets() {
  SmbiosEncoder tables(3, 4);
  tables.add(SmbiosSystem{.manufacturer = "Laptops", .product = "Laptop 14 Pro"});
  const std::uint16_t l1 = tables.add(cacheOf(1, 1184, 1));
  const std::uint16_t l2 = tables.add(cacheOf(2, 11776, 1));
  const std::uint16_t l3 = tables.add(cacheOf(3, 24576, 9));
  tables.add(SmbiosProcessor{.socket = "U3E1",
                             .family = 0xC6,
                             .manufacturer = "Intel(R) Corporation",
                             .id = 0xBFEBFBFF000906A3,
                             .version = "12th Gen Intel(R)  Core(TM) i7-12700H    ",
                             .maxSpeed = 4600,
                             .currentSpeed = 2700,
                             .upgrade = 1,
                             .caches = {l1, l2, l3},
                             .serialNumber = "To Be Filled By O.E.M.",
                             .assetTag = "To Be Filled By O.E.M.",
                             .partNumber = "To Be Filled By O.E.M.",
                             .cores = 14,
                             .coresEnabled = 14,
                             .threads = 20});
  tables.add(emptySocket("U3E2"));
  return ended(std::move(tables));
}

SmbiosProcessor serverProcessor(const std::string& socket, const std::string& serialNumber) {
  return {.socket = socket,
          .family = 0xB3,
          .manufacturer = "Intel(R) Corporation",
          .id = 0xBFEBFBFF000606A6,
          .version = "Intel(R) Xeon(R) Gold 6334 CPU @ 3.60GHz",
          .maxSpeed = 4000,
          .currentSpeed = 3600,
          .upgrade = 0x3A,
          .serialNumber = serialNumber,
          .assetTag = "UNKNOWN",
          .partNumber = "CD8068904657601"};
}

// Two processors that only their serial numbers tell apart, a third that failed, and an empty socket.
SmbiosEncoder serverWithAFailedProcessor() {
  SmbiosEncoder tables(3, 3);
  tables.add(SmbiosSystem{.manufacturer = "Rack Servers", .product = "Rack Server 2200"});
  for (const char* number : {"1", "2"}) {
    SmbiosProcessor processor = serverProcessor(std::string("CPU") + number, std::string("SN-") + number);
    processor.caches = {tables.add(cacheOf(1, 640)), tables.add(cacheOf(2, 10240, 1)),
                        tables.add(cacheOf(3, 18432, 9))};
    tables.add(processor);
  }
  SmbiosProcessor failed = serverProcessor("CPU3", "SN-3");
  failed.status = 3;
  failed.caches = {notProvided, notProvided, tables.add(cacheOf(3, 18432, 9))};
  tables.add(failed);
  tables.add(emptySocket("CPU4"));
  return ended(std::move(tables));
}

// More cores than a byte can count.
SmbiosEncoder manyCores() {
  SmbiosEncoder tables(3, 6);
  tables.add(SmbiosSystem{.manufacturer = "Rack Servers", .product = "Rack Server 512"});
  tables.add(SmbiosProcessor{.socket = "P0",
                             .family = 0x6B,
                             .manufacturer = "Advanced Micro Devices, Inc.",
                             .id = 0x178BFBFF00B00F10,
                             .version = "Example 9995",
                             .upgrade = 0x50,
                             .cores = 512,
                             .coresEnabled = 500,
                             .threads = 1024,
                             .threadsEnabled = 1000});
  return ended(std::move(tables));
}

// A family above 255, and an identifier that is no CPUID signature.
SmbiosEncoder armBoard() {
  SmbiosEncoder tables(3, 2);
  tables.add(SmbiosSystem{.manufacturer = "Boards", .product = "Single Board 4B"});
  tables.add(SmbiosProcessor{.socket = "SoC",
                             .family = 257,
                             .manufacturer = "Broadcom",
                             .id = 0x410FD083,
                             .version = "Not Specified",
                             .maxSpeed = 1800,
                             .currentSpeed = 1800,
                             .upgrade = 6,
                             .serialNumber = "",
                             .assetTag = "",
                             .partNumber = "",
                             .cores = 6,
                             .coresEnabled = 6,
                             .threads = 6});
  return ended(std::move(tables));
}

// Codes that no table lists, texts that are none, caches that are odd.
SmbiosEncoder unlistedCodes() {
  SmbiosEncoder tables(3, 4);
  tables.add(SmbiosSystem{.manufacturer = "", .product = "  "});
  const std::uint16_t odd = tables.add(
      SmbiosCache{.socket = "", .level = 3, .mode = 3, .installedKiB = 100, .type = 9, .associativity = 0x77});
  const std::uint16_t off = tables.add(SmbiosCache{
      .socket = "L4", .level = 4, .enabled = false, .mode = 2, .installedKiB = 5242880, .type = 4, .associativity = 6});
  const std::uint16_t notInstalled = tables.add(SmbiosCache{.socket = "L2", .level = 2, .installedKiB = 0});
  SmbiosProcessor processor{.socket = "Processor / 1",
                            .type = 2,
                            .family = 0x99,
                            .manufacturer = "\xFF\xFE",
                            .id = 0,
                            .version = "name \xFF",
                            .externalClock = 0,
                            .maxSpeed = 0,
                            .currentSpeed = 0,
                            .status = 5,
                            .upgrade = 0xEE,
                            .caches = {odd, notInstalled, off},
                            .cores = 0,
                            .coresEnabled = 0,
                            .threads = 0,
                            .characteristics = 2,
                            .threadsEnabled = 0};
  tables.add(processor);
  processor.status = 6;
  processor.family = 2;
  processor.upgrade = 2;
  tables.add(processor);
  processor.type = 5;  // a signal processor
  tables.add(processor);
  return ended(std::move(tables));
}

SmbiosEncoder everyStatus() {
  SmbiosEncoder tables(2, 8);
  tables.add(SmbiosSystem{});
  for (std::uint8_t status = 0; status < 8; ++status) {
    tables.add(SmbiosProcessor{.socket = "CPU " + std::to_string(status), .status = status});
  }
  SmbiosProcessor empty = emptySocket("CPU 8");
  empty.status = 1;
  tables.add(empty);
  return ended(std::move(tables));
}

// A hypervisor that has a socket for each virtual CPU, and clocks of no hardware.
SmbiosEncoder socketPerVirtualCpu() {
  SmbiosEncoder tables(2, 7);
  tables.add(SmbiosSystem{.manufacturer = "Hypervisors", .product = "Virtual Machine"});
  for (int number = 0; number < 4; ++number) {
    tables.add(SmbiosProcessor{.socket = "CPU #00" + std::to_string(number),
                               .family = 1,
                               .manufacturer = "AuthenticAMD",
                               .id = 0x1783FBFF00A00F11,
                               .version = "AMD EPYC 7763 64-Core Processor",
                               .externalClock = 65535,
                               .maxSpeed = 30000,
                               .currentSpeed = 2450,
                               .upgrade = 1,
                               .cores = 1,
                               .coresEnabled = 1,
                               .threads = 1});
  }
  return ended(std::move(tables));
}

// The kernel shows no caches here, and no frequency.
SmbiosEncoder belowAContainer() {
  SmbiosEncoder tables(3, 1);
  tables.add(SmbiosSystem{.manufacturer = "Boards", .product = "Server Board"});
  const std::uint16_t l1 = tables.add(cacheOf(1, 256));
  const std::uint16_t l2 = tables.add(cacheOf(2, 1024, 5));
  const std::uint16_t l3 = tables.add(cacheOf(3, 8192, 8));
  tables.add(SmbiosProcessor{.socket = "LGA1151",
                             .manufacturer = "Intel(R) Corporation",
                             .id = 0xBFEBFBFF000906EA,
                             .version = "Intel(R) Xeon(R) E-2124G CPU @ 3.40GHz",
                             .maxSpeed = 8300,
                             .currentSpeed = 3400,
                             .caches = {l1, l2, l3},
                             .cores = 4,
                             .coresEnabled = 4,
                             .threads = 4});
  return ended(std::move(tables));
}

constexpr std::array machines = {
    FirmwareMachine{"old-and-short", "", oldAndShort},
    FirmwareMachine{"new-and-long", "", newAndLong},
    FirmwareMachine{"one-of-two-sockets", "hybrid-laptop", oneOfTwoSockets},
    FirmwareMachine{"server-with-a-failed-processor", "dual-socket-server", serverWithAFailedProcessor},
    FirmwareMachine{"many-cores", "", manyCores},
    FirmwareMachine{"arm-board", "arm64-board", armBoard},
    FirmwareMachine{"unlisted-codes", "", unlistedCodes},
    FirmwareMachine{"every-status", "", everyStatus},
    FirmwareMachine{"socket-per-virtual-cpu", "virtual-machine", socketPerVirtualCpu},
    FirmwareMachine{"below-a-container", "container", belowAContainer},
};

}  // namespace

void PrintTo(const FirmwareMachine& machine, std::ostream* stream) {
  *stream << machine.name;
}

std::span<const FirmwareMachine> firmwareMachines() {
  return machines;
}

}  // namespace Tarn::Inventory
