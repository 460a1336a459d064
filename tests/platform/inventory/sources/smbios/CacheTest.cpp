#include "platform/inventory/sources/smbios/Cache.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "tests/platform/inventory/sources/smbios/Decoding.h"

namespace Tarn::Smbios {
namespace {

using Support::SmbiosCache;

class DecodedCache {
 public:
  explicit DecodedCache(const SmbiosCache& cache) : tables_(tableOf(cache)) {}

  const Cache& operator*() const { return tables_->caches.at(0); }
  const Cache* operator->() const { return &**this; }
  std::vector<std::string> problems() const { return tables_.problems(); }

 private:
  Decoding tables_;
};

TEST(SmbiosCache, HasEveryField) {
  const DecodedCache cache(SmbiosCache{.frame = {.handle = 0x0A}, .level = 3, .mode = 2, .installedKiB = 2048});

  EXPECT_EQ(valueOf(cache->socket), "L1 Cache");
  EXPECT_EQ(valueOf(cache->level), 3);
  EXPECT_EQ(valueOf(cache->enabled), 1);
  EXPECT_EQ(*cache->mode, CacheMode::VariesWithAddress);
  EXPECT_EQ(valueOf(cache->installedSize), 2048);
  EXPECT_EQ(*cache->type, CacheType::Unified);
  EXPECT_EQ(valueOf(cache->associativity), 7);
  EXPECT_EQ(valueOf(cache->ways), 8);
  EXPECT_EQ(placeOf(cache->structure, cache->mode), "SMBIOS type 7, handle 0x000a, offset 0x05");
  EXPECT_EQ(hexOf(cache->mode.raw), "8202");
  EXPECT_THAT(cache.problems(), testing::IsEmpty());
}

TEST(SmbiosCache, ConfigurationIsReadBitByBit) {
  const DecodedCache off(SmbiosCache{.enabled = false, .mode = 0});
  const DecodedCache unknown(SmbiosCache{.level = 8, .mode = 3});

  EXPECT_EQ(valueOf(off->level), 1);
  EXPECT_EQ(valueOf(off->enabled), 0);
  EXPECT_EQ(*off->mode, CacheMode::WriteThrough);
  EXPECT_EQ(valueOf(unknown->level), 8);
  EXPECT_FALSE(unknown->mode);
}

TEST(SmbiosCache, SizeStandsInOneOfTwoFields) {
  struct Case {
    std::uint64_t kibibytes;
    std::size_t offset;
    std::string raw;
  };
  const Case cases[] = {
      {0, 0x09, "0000"},
      {32, 0x09, "2000"},
      {0x7FFF, 0x09, "ff7f"},
      {0x8000, 0x09, "0082"},
      {0x7FFE * 64ULL, 0x09, "feff"},
      {0x7FFF * 64ULL, 0x17, "c0ff1f00"},
      {4ULL << 20, 0x17, "00004000"},
      {1ULL << 31, 0x17, "00000082"},
      {0x7FFFFFFFULL * 64, 0x17, "ffffffff"},
  };
  for (const Case& c : cases) {
    const DecodedCache cache(SmbiosCache{.installedKiB = c.kibibytes});

    EXPECT_EQ(cache->installedSize.value, c.kibibytes);
    EXPECT_EQ(cache->installedSize.offset, c.offset) << c.kibibytes;
    EXPECT_EQ(hexOf(cache->installedSize.raw), c.raw);
  }
}

TEST(SmbiosCache, ALargeSizeWithoutASecondFieldIsWhatTheFirstSays) {
  const DecodedCache cache(SmbiosCache{.frame = {.length = 0x13}, .installedKiB = 4ULL << 20});

  EXPECT_EQ(valueOf(cache->installedSize), 0x7FFF * 64);
  EXPECT_EQ(cache->installedSize.offset, 0x09U);
}

TEST(SmbiosCache, EveryAssociativityIsTold) {
  // By code: the number of ways, -1 where the code names none.
  const long long ways[] = {-1, -1, -1, 1, 2, 4, -1, 8, 16, 12, 24, 32, 48, 64, 20, -1};
  for (std::uint8_t code = 0; code < std::size(ways); ++code) {
    const DecodedCache cache(SmbiosCache{.associativity = code});

    EXPECT_EQ(valueOf(cache->ways), ways[code]) << unsigned{code};
    EXPECT_EQ(valueOf(cache->associativity), code == 0 || code == 2 ? -1 : code) << unsigned{code};
  }
}

TEST(SmbiosCache, TypesThatAreNotListedAreAbsent) {
  const std::optional<CacheType> types[] = {
      {}, CacheType::Other, {}, CacheType::Instruction, CacheType::Data, CacheType::Unified, {}};
  for (std::uint8_t code = 0; code < std::size(types); ++code) {
    const DecodedCache cache(SmbiosCache{.type = code});

    EXPECT_EQ(cache->type.value, types[code]) << unsigned{code};
    EXPECT_EQ(std::to_integer<unsigned int>(cache->type.raw[0]), code);
  }
}

TEST(SmbiosCache, HasExactlyTheFieldsThatItsLengthReaches) {
  const std::size_t ends[] = {0x05, 0x07, 0x0B, 0x12, 0x13};
  for (std::size_t length = 4; length <= 0x20; ++length) {
    const DecodedCache cache(SmbiosCache{.frame = {.length = static_cast<std::uint8_t>(length)}});
    const Cache& c = *cache;
    const bool there[] = {!c.socket.raw.empty(), !c.level.raw.empty(), !c.installedSize.raw.empty(),
                          !c.type.raw.empty(), !c.associativity.raw.empty()};
    for (std::size_t i = 0; i < std::size(ends); ++i) {
      EXPECT_EQ(there[i], length >= ends[i]) << "field " << i << ", length " << length;
    }
    EXPECT_EQ(cache.problems().empty(), length >= 0x0F) << length;
  }
}

}  // namespace
}  // namespace Tarn::Smbios
