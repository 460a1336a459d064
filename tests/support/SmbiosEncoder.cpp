#include "tests/support/SmbiosEncoder.h"

#include <algorithm>
#include <numeric>
#include <utility>

namespace Support {
namespace {

void append(std::string& bytes, std::uint64_t number, unsigned int width) {
  for (unsigned int i = 0; i < width; ++i) {
    bytes += static_cast<char>(static_cast<unsigned char>(number >> (8 * i)));
  }
}

/// The fields behind a structure's header, and the strings that they refer to.
class Fields {
 public:
  Fields& byte(unsigned int number) { return number_(number, 1); }
  Fields& word(unsigned int number) { return number_(number, 2); }
  Fields& doubleWord(std::uint64_t number) { return number_(number, 4); }
  Fields& quadWord(std::uint64_t number) { return number_(number, 8); }
  Fields& raw(const std::string& more) {
    bytes += more;
    return *this;
  }
  Fields& text(const std::string& text) {
    if (text.empty()) {
      return byte(0);
    }
    strings.push_back(text);
    return byte(static_cast<unsigned int>(strings.size()));
  }

  std::string bytes;
  std::vector<std::string> strings;

 private:
  Fields& number_(std::uint64_t number, unsigned int width) {
    append(bytes, number, width);
    return *this;
  }
};

/// The length that a type's structures have from a version on.
struct LengthSince {
  unsigned int majorNumber;
  unsigned int minorNumber;
  std::size_t length;
};

unsigned int firstField(unsigned int number, unsigned int most, unsigned int marker) {
  return number > most ? marker : number;
}

constexpr std::uint64_t firstSizeLimit = 0x7FFFULL * 64;

std::uint64_t encodedSize(std::uint64_t kibibytes, std::uint64_t granularityBit) {
  return kibibytes < granularityBit ? kibibytes : granularityBit | kibibytes / 64;
}

std::uint64_t firstSize(std::uint64_t kibibytes) {
  return kibibytes >= firstSizeLimit ? 0xFFFF : encodedSize(kibibytes, 0x8000);
}

std::string withChecksum(std::string bytes, std::size_t at, std::size_t begin, std::size_t end) {
  const auto sum = std::accumulate(bytes.begin() + static_cast<std::ptrdiff_t>(begin),
                                   bytes.begin() + static_cast<std::ptrdiff_t>(end), 0U,
                                   [](unsigned int total, char c) { return total + static_cast<unsigned char>(c); });
  bytes[at] = static_cast<char>(static_cast<unsigned char>(0x100 - (sum & 0xFFU)));
  return bytes;
}

}  // namespace

SmbiosProcessor emptySocket(const std::string& label) {
  return {.socket = label,
          .family = 2,
          .manufacturer = "",
          .id = 0,
          .version = "",
          .voltage = 0,
          .externalClock = 0,
          .maxSpeed = 0,
          .currentSpeed = 0,
          .populated = false,
          .status = 0,
          .serialNumber = "",
          .assetTag = "",
          .partNumber = "",
          .cores = 0,
          .coresEnabled = 0,
          .threads = 0,
          .characteristics = 0,
          .threadsEnabled = 0};
}

SmbiosEncoder::SmbiosEncoder(unsigned int majorNumber, unsigned int minorNumber, std::optional<EntryPoint> kind)
    : major_(majorNumber),
      minor_(minorNumber),
      kind_(kind.value_or(majorNumber >= 3 ? EntryPoint::Smbios3 : EntryPoint::Smbios2)) {}

bool SmbiosEncoder::since(unsigned int majorNumber, unsigned int minorNumber) const {
  return std::pair(major_, minor_) >= std::pair(majorNumber, minorNumber);
}

std::uint16_t SmbiosEncoder::add(const SmbiosSystem& system) {
  Fields fields;
  fields.text(system.manufacturer).text(system.product).text(system.version).text(system.serialNumber);
  fields.raw(system.uuid).byte(system.wakeUp).text(system.sku).text(system.family);
  const std::size_t length = since(2, 4) ? 0x1B : since(2, 1) ? 0x19 : 0x08;
  return append(1, system.frame, length, fields.bytes, fields.strings);
}

std::uint16_t SmbiosEncoder::add(const SmbiosProcessor& processor) {
  Fields fields;
  fields.text(processor.socket).byte(processor.type).byte(firstField(processor.family, 0xFD, 0xFE));
  fields.text(processor.manufacturer).quadWord(processor.id).text(processor.version).byte(processor.voltage);
  fields.word(processor.externalClock).word(processor.maxSpeed).word(processor.currentSpeed);
  fields.byte((processor.populated ? 0x40U : 0U) | processor.status).byte(processor.upgrade);
  for (const std::uint16_t cache : processor.caches) {
    fields.word(cache);
  }
  fields.text(processor.serialNumber).text(processor.assetTag).text(processor.partNumber);
  fields.byte(firstField(processor.cores, 0xFE, 0xFF)).byte(firstField(processor.coresEnabled, 0xFE, 0xFF));
  fields.byte(firstField(processor.threads, 0xFE, 0xFF)).word(processor.characteristics).word(processor.family);
  fields.word(processor.cores).word(processor.coresEnabled).word(processor.threads).word(processor.threadsEnabled);
  constexpr std::array lengths = {LengthSince{3, 6, 0x32}, LengthSince{3, 0, 0x30}, LengthSince{2, 6, 0x2A},
                                  LengthSince{2, 5, 0x28}, LengthSince{2, 3, 0x23}, LengthSince{2, 1, 0x20},
                                  LengthSince{0, 0, 0x1A}};
  const auto* const length =
      std::ranges::find_if(lengths, [this](const LengthSince& l) { return since(l.majorNumber, l.minorNumber); });
  return append(4, processor.frame, length->length, fields.bytes, fields.strings);
}

std::uint16_t SmbiosEncoder::add(const SmbiosCache& cache) {
  Fields fields;
  const unsigned int configuration = (cache.level - 1U) | (cache.socketed ? 1U << 3U : 0U) |
                                     static_cast<unsigned int>(cache.location << 5U) | (cache.enabled ? 1U << 7U : 0U) |
                                     static_cast<unsigned int>(cache.mode << 8U);
  fields.text(cache.socket).word(configuration);
  fields.word(static_cast<unsigned int>(firstSize(cache.maximumKiB)));
  fields.word(static_cast<unsigned int>(firstSize(cache.installedKiB)));
  fields.word(cache.supportedSram).word(cache.currentSram).byte(cache.speed).byte(cache.errorCorrection);
  fields.byte(cache.type).byte(cache.associativity);
  fields.doubleWord(encodedSize(cache.maximumKiB, 0x80000000)).doubleWord(encodedSize(cache.installedKiB, 0x80000000));
  const std::size_t length = since(3, 1) ? 0x1B : since(2, 1) ? 0x13 : 0x0F;
  return append(7, cache.frame, length, fields.bytes, fields.strings);
}

std::uint16_t SmbiosEncoder::add(const SmbiosOther& other) {
  return append(other.type, other.frame, other.fields.size() + 4, other.fields, other.strings);
}

std::uint16_t SmbiosEncoder::end() {
  return add(SmbiosOther{.frame = {.handle = 0xFEFF}, .type = 127});
}

std::uint16_t SmbiosEncoder::append(std::uint8_t type, const SmbiosFrame& frame, std::size_t usualLength,
                                    std::string fields, const std::vector<std::string>& strings) {
  const std::size_t length = frame.length.value_or(static_cast<std::uint8_t>(usualLength));
  const std::uint16_t handle = frame.handle.value_or(nextHandle_);
  nextHandle_ = frame.handle ? nextHandle_ : static_cast<std::uint16_t>(nextHandle_ + 1);
  lastOffset_ = table_.size();
  ++count_;
  std::string header;
  Support::append(header, type, 1);
  Support::append(header, length, 1);
  Support::append(header, handle, 2);
  fields.insert(0, header);
  fields.resize(length);
  table_ += fields;
  for (const std::string& string : strings) {
    table_ += string + '\0';
  }
  table_ += strings.empty() ? std::string(2, '\0') : std::string(1, '\0');
  largestStructure_ = std::max(largestStructure_, static_cast<unsigned int>(table_.size() - lastOffset_));
  return handle;
}

SmbiosEncoder& SmbiosEncoder::announceStructures(std::uint16_t count) {
  announcedCount_ = count;
  return *this;
}

SmbiosEncoder& SmbiosEncoder::announceLength(std::uint32_t length) {
  announcedLength_ = length;
  return *this;
}

std::string SmbiosEncoder::entryPointTo(std::uint32_t address) const {
  const auto length = announcedLength_.value_or(static_cast<std::uint32_t>(table_.size()));
  const std::uint16_t count = announcedCount_.value_or(count_);
  const unsigned int revision = major_ << 4U | minor_;
  Fields fields;
  switch (kind_) {
    case EntryPoint::Smbios3:
      fields.raw("_SM3_").byte(0).byte(0x18).byte(major_).byte(minor_).byte(0).byte(1).byte(0);
      fields.doubleWord(length).quadWord(address);
      return withChecksum(fields.bytes, 0x05, 0, 0x18);
    case EntryPoint::Smbios2:
      fields.raw("_SM_").byte(0).byte(0x1F).byte(major_).byte(minor_).word(largestStructure_).byte(0);
      fields.raw(std::string(5, '\0')).raw("_DMI_").byte(0).word(length).doubleWord(address).word(count);
      fields.byte(revision);
      return withChecksum(withChecksum(fields.bytes, 0x15, 0x10, 0x1F), 0x04, 0, 0x1F);
    case EntryPoint::Legacy:
      break;
  }
  fields.raw("_DMI_").byte(0).word(length).doubleWord(address).word(count).byte(revision);
  return withChecksum(fields.bytes, 0x05, 0, 0x0F);
}

std::string SmbiosEncoder::dump() const {
  constexpr std::size_t tableOffset = 32;
  std::string file = entryPointTo(tableOffset);
  file.resize(tableOffset);
  return file + table_;
}

SmbiosEncoder smbiosMachine(unsigned int processors, unsigned int structures) {
  constexpr std::uint8_t memoryDevice = 17;
  SmbiosEncoder encoder;
  encoder.add(SmbiosSystem{});
  unsigned int count = 2;  // with the end
  for (unsigned int i = 0; i < processors; ++i, count += 4) {
    SmbiosProcessor processor{.socket = "CPU " + std::to_string(i + 1)};
    for (std::uint16_t level = 1; level <= 3; ++level) {
      processor.caches[level - 1U] = encoder.add(SmbiosCache{.socket = "L" + std::to_string(level), .level = level});
    }
    encoder.add(processor);
  }
  for (; count < structures; ++count) {
    encoder.add(SmbiosOther{.type = memoryDevice,
                            .fields = std::string(0x54, '\x11'),
                            .strings = {"DIMM " + std::to_string(count), "BANK 0", "Example Memory", "MEM-0001"}});
  }
  encoder.end();
  return encoder;
}

}  // namespace Support
