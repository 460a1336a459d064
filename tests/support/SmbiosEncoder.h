#ifndef TESTS_SUPPORT_SMBIOSENCODER_H
#define TESTS_SUPPORT_SMBIOSENCODER_H

#include <array>
#include <cstdint>
#include <optional>
#include <string>
#include <vector>

/// SMBIOS tables of any version, made up structure by structure, as firmware would write them. Nothing here is
/// shared with the decoder.
namespace Support {

/// What several records have: a handle, by default the next free one, and a length of the formatted area, by default
/// that of the version which the tables claim. A shorter one cuts fields off, a longer one appends zeros.
struct SmbiosFrame {
  std::optional<std::uint16_t> handle = {};
  std::optional<std::uint8_t> length = {};
};

// Empty texts are not stored, and their fields refer to no string.

/// Type 1.
struct SmbiosSystem {
  SmbiosFrame frame = {};
  std::string manufacturer = "Example Systems";
  std::string product = "Example 100";
  std::string version = "1.0";
  std::string serialNumber = "SYS-0001";
  std::string uuid = std::string("\x01\x02\x03\x04\x05\x06\x07\x08\x09\x0a\x0b\x0c\x0d\x0e\x0f\x10", 16);
  std::uint8_t wakeUp = 6;
  std::string sku = "SKU-100";
  std::string family = "Example";
};

/// Type 4. A family above 253 and counts above 254 go to their second fields, as the standard asks.
struct SmbiosProcessor {
  SmbiosFrame frame = {};
  std::string socket = "CPU 1";
  std::uint8_t type = 3;
  std::uint16_t family = 0xB3;
  std::string manufacturer = "Example Semiconductors";
  std::uint64_t id = 0xBFEBFBFF000406F1;
  std::string version = "Example Processor 1000 @ 2.00GHz";
  std::uint8_t voltage = 0x8C;
  std::uint16_t externalClock = 100;
  std::uint16_t maxSpeed = 4000;
  std::uint16_t currentSpeed = 2000;
  bool populated = true;
  std::uint8_t status = 1;
  std::uint8_t upgrade = 0x2B;
  std::array<std::uint16_t, 3> caches = {0xFFFF, 0xFFFF, 0xFFFF};  ///< handles
  std::string serialNumber = "CPU-0001";
  std::string assetTag = "ASSET-0001";
  std::string partNumber = "PART-0001";
  std::uint16_t cores = 8;
  std::uint16_t coresEnabled = 8;
  std::uint16_t threads = 16;
  std::uint16_t characteristics = 0xFC;
  std::uint16_t threadsEnabled = 16;
};

/// An empty socket.
SmbiosProcessor emptySocket(const std::string& label);

/// Type 7. Sizes from 2 GiB on go to their second fields.
struct SmbiosCache {
  SmbiosFrame frame = {};
  std::string socket = "L1 Cache";
  std::uint16_t level = 1;
  bool socketed = false;
  std::uint16_t location = 0;
  bool enabled = true;
  std::uint16_t mode = 1;
  std::uint64_t maximumKiB = 512;
  std::uint64_t installedKiB = 512;
  std::uint16_t supportedSram = 0x20;
  std::uint16_t currentSram = 0x20;
  std::uint8_t speed = 0;
  std::uint8_t errorCorrection = 5;
  std::uint8_t type = 5;
  std::uint8_t associativity = 7;
};

/// Any other structure: what follows its header, and its strings.
struct SmbiosOther {
  SmbiosFrame frame = {};
  std::uint8_t type = 0;
  std::string fields = {};
  std::vector<std::string> strings = {};
};

class SmbiosEncoder {
 public:
  enum class EntryPoint : std::uint8_t { Legacy, Smbios2, Smbios3 };

  /// The entry point is `_SM3_` from version 3.0 on and `_SM_` before, unless another is asked for.
  explicit SmbiosEncoder(unsigned int majorNumber = 3, unsigned int minorNumber = 4,
                         std::optional<EntryPoint> kind = {});

  /// Each returns the structure's handle. Handles that are not given are counted from 0x0010 on.
  std::uint16_t add(const SmbiosSystem& system);
  std::uint16_t add(const SmbiosProcessor& processor);
  std::uint16_t add(const SmbiosCache& cache);
  std::uint16_t add(const SmbiosOther& other);

  /// The end-of-table structure, which every table should have at its end.
  std::uint16_t end();

  /// What the entry point says instead of the truth.
  SmbiosEncoder& announceStructures(std::uint16_t count);
  SmbiosEncoder& announceLength(std::uint32_t length);

  /// The two files that the kernel shows.
  std::string entryPoint() const { return entryPointTo(0x000E0000); }
  const std::string& table() const { return table_; }

  /// One file with both, the table at offset 32.
  std::string dump() const;

  /// Where the structure that was added last begins in the table.
  std::size_t lastOffset() const { return lastOffset_; }

 private:
  bool since(unsigned int majorNumber, unsigned int minorNumber) const;
  std::uint16_t append(std::uint8_t type, const SmbiosFrame& frame, std::size_t usualLength, std::string fields,
                       const std::vector<std::string>& strings);
  std::string entryPointTo(std::uint32_t address) const;

  unsigned int major_;
  unsigned int minor_;
  EntryPoint kind_;
  std::string table_;
  std::size_t lastOffset_ = 0;
  std::uint16_t nextHandle_ = 0x0010;
  std::uint16_t count_ = 0;
  unsigned int largestStructure_ = 0;
  std::optional<std::uint16_t> announcedCount_;
  std::optional<std::uint32_t> announcedLength_;
};

/// A machine with `processors` sockets of 3 caches each, and structures of other types until there are `structures`
/// of all, the last one being the end of the table.
SmbiosEncoder smbiosMachine(unsigned int processors, unsigned int structures);

}  // namespace Support

#endif
