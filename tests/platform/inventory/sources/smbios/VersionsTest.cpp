// Every version of the standard, with the lengths that its structures have.

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "tests/platform/inventory/sources/smbios/Decoding.h"

namespace Tarn::Smbios {
namespace {

using Support::SmbiosEncoder;

struct Versioned {
  unsigned int majorNumber;
  unsigned int minorNumber;
  std::size_t processorLength;
  std::size_t cacheLength;
  std::size_t systemLength;
};

class Versions : public testing::TestWithParam<Versioned> {};

TEST_P(Versions, HaveTheFieldsOfTheirTime) {
  const Versioned& version = GetParam();
  const bool since21 = version.processorLength >= 0x20;
  const bool since23 = version.processorLength >= 0x23;
  const bool since25 = version.processorLength >= 0x28;
  const bool since26 = version.processorLength >= 0x2A;
  const bool since30 = version.processorLength >= 0x30;
  SmbiosEncoder encoder(version.majorNumber, version.minorNumber);
  encoder.add(Support::SmbiosSystem{});
  const std::uint16_t cache = encoder.add(Support::SmbiosCache{.installedKiB = 3ULL << 20});
  encoder.add(Support::SmbiosProcessor{
      .family = since26 ? std::uint16_t{0x101} : std::uint16_t{0xB3}, .caches = {cache, 0xFFFF, 0xFFFF}, .cores = 512});
  encoder.end();

  const Decoding tables(encoder);

  EXPECT_THAT(tables.problems(), testing::IsEmpty());
  EXPECT_EQ(tables->entryPoint.version,
            (Version{static_cast<std::uint8_t>(version.majorNumber), static_cast<std::uint8_t>(version.minorNumber)}));
  EXPECT_EQ(tables->entryPoint.kind, version.majorNumber >= 3 ? EntryPoint::Kind::Smbios3 : EntryPoint::Kind::Smbios2);
  const System& system = tables->systems.at(0);
  EXPECT_EQ(system.structure.formatted.size(), version.systemLength);
  EXPECT_EQ(valueOf(system.product), "Example 100");
  EXPECT_EQ(system.uuid.value.has_value(), since21);
  EXPECT_EQ(valueOf(system.sku), version.systemLength >= 0x1B ? "SKU-100" : "-");
  const Processor& processor = tables->processors.at(0);
  EXPECT_EQ(processor.structure.formatted.size(), version.processorLength);
  EXPECT_EQ(valueOf(processor.version), "Example Processor 1000 @ 2.00GHz");
  EXPECT_EQ(valueOf(processor.caches[0]), since21 ? cache : -1);
  EXPECT_EQ(valueOf(processor.serialNumber), since23 ? "CPU-0001" : "-");
  EXPECT_EQ(valueOf(processor.cores), since30 ? 512 : since25 ? 255 : -1);
  EXPECT_EQ(valueOf(processor.characteristics), since25 ? 0xFC : -1);
  EXPECT_EQ(valueOf(processor.family), since26 ? 0x101 : 0xB3);
  const Cache& decodedCache = tables->caches.at(0);
  EXPECT_EQ(decodedCache.structure.formatted.size(), version.cacheLength);
  EXPECT_EQ(valueOf(decodedCache.associativity), since21 ? 7 : -1);
  EXPECT_EQ(valueOf(decodedCache.installedSize), version.cacheLength >= 0x1B ? 3LL << 20 : 0x7FFF * 64);
}

constexpr Versioned versions[] = {
    {2, 0, 0x1A, 0x0F, 0x08}, {2, 1, 0x20, 0x13, 0x19}, {2, 2, 0x20, 0x13, 0x19}, {2, 3, 0x23, 0x13, 0x19},
    {2, 4, 0x23, 0x13, 0x1B}, {2, 5, 0x28, 0x13, 0x1B}, {2, 6, 0x2A, 0x13, 0x1B}, {2, 7, 0x2A, 0x13, 0x1B},
    {2, 8, 0x2A, 0x13, 0x1B}, {3, 0, 0x30, 0x13, 0x1B}, {3, 1, 0x30, 0x1B, 0x1B}, {3, 2, 0x30, 0x1B, 0x1B},
    {3, 3, 0x30, 0x1B, 0x1B}, {3, 4, 0x30, 0x1B, 0x1B}, {3, 5, 0x30, 0x1B, 0x1B}, {3, 6, 0x32, 0x1B, 0x1B},
    {3, 7, 0x32, 0x1B, 0x1B},
};

INSTANTIATE_TEST_SUITE_P(From20To37, Versions, testing::ValuesIn(versions), [](const auto& row) {
  return "V" + std::to_string(row.param.majorNumber) + "_" + std::to_string(row.param.minorNumber);
});

}  // namespace
}  // namespace Tarn::Smbios
