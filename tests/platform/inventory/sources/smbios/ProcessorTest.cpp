#include "platform/inventory/sources/smbios/Processor.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include "tests/platform/inventory/sources/smbios/Decoding.h"

namespace Tarn::Smbios {
namespace {

using Support::SmbiosProcessor;

/// One processor, decoded, and what was wrong with it.
class DecodedProcessor {
 public:
  explicit DecodedProcessor(const SmbiosProcessor& processor) : tables_(tableOf(processor)) {}

  const Processor& operator*() const { return tables_->processors.at(0); }
  const Processor* operator->() const { return &**this; }
  std::vector<std::string> problems() const { return tables_.problems(); }

 private:
  Decoding tables_;
};

TEST(Processor, HasEveryField) {
  const DecodedProcessor processor(SmbiosProcessor{.frame = {.handle = 0x43}});

  EXPECT_EQ(valueOf(processor->socket), "CPU 1");
  EXPECT_EQ(valueOf(processor->type), 3);
  EXPECT_EQ(valueOf(processor->family), 0xB3);
  EXPECT_EQ(valueOf(processor->manufacturer), "Example Semiconductors");
  EXPECT_EQ(*processor->id, 0xBFEBFBFF000406F1U);
  EXPECT_EQ(valueOf(processor->version), "Example Processor 1000 @ 2.00GHz");
  EXPECT_EQ(valueOf(processor->externalClock), 100);
  EXPECT_EQ(valueOf(processor->maxSpeed), 4000);
  EXPECT_EQ(valueOf(processor->currentSpeed), 2000);
  EXPECT_EQ(valueOf(processor->populated), 1);
  EXPECT_EQ(*processor->status, ProcessorStatus::Enabled);
  EXPECT_EQ(valueOf(processor->upgrade), 0x2B);
  EXPECT_EQ(valueOf(processor->serialNumber), "CPU-0001");
  EXPECT_EQ(valueOf(processor->assetTag), "ASSET-0001");
  EXPECT_EQ(valueOf(processor->partNumber), "PART-0001");
  EXPECT_EQ(valueOf(processor->cores), 8);
  EXPECT_EQ(valueOf(processor->coresEnabled), 8);
  EXPECT_EQ(valueOf(processor->threads), 16);
  EXPECT_EQ(valueOf(processor->characteristics), 0xFC);
  EXPECT_THAT(processor.problems(), testing::IsEmpty());
}

TEST(Processor, SaysWhereEachFieldStands) {
  const DecodedProcessor processor(SmbiosProcessor{.frame = {.handle = 0x43}});

  EXPECT_EQ(placeOf(processor->structure, processor->externalClock), "SMBIOS type 4, handle 0x0043, offset 0x12");
  EXPECT_EQ(hexOf(processor->externalClock.raw), "6400");
  EXPECT_EQ(hexOf(processor->id.raw), "f1060400fffbebbf");
  EXPECT_EQ(processor->id.offset, 0x08U);
  EXPECT_EQ(processor->populated.offset, 0x18U);
  EXPECT_EQ(hexOf(processor->status.raw), "41");
  EXPECT_EQ(processor->caches[2].offset, 0x1EU);
}

TEST(Processor, EveryStatusIsTold) {
  struct Case {
    std::uint8_t code;
    std::optional<ProcessorStatus> status;
  };
  const Case cases[] = {
      {0, ProcessorStatus::Unknown},
      {1, ProcessorStatus::Enabled},
      {2, ProcessorStatus::DisabledByUser},
      {3, ProcessorStatus::DisabledByFirmware},
      {4, ProcessorStatus::Idle},
      {5, std::nullopt},
      {6, std::nullopt},
      {7, ProcessorStatus::Other},
  };
  for (const Case& c : cases) {
    const DecodedProcessor processor(SmbiosProcessor{.status = c.code});

    EXPECT_EQ(processor->status.value, c.status) << unsigned{c.code};
    EXPECT_EQ(valueOf(processor->populated), 1) << unsigned{c.code};
  }
}

TEST(Processor, IgnoresTheReservedBitsOfTheStatus) {
  const DecodedProcessor processor(SmbiosProcessor{.populated = false, .status = 0xB9});

  EXPECT_EQ(*processor->status, ProcessorStatus::Enabled);
  EXPECT_EQ(valueOf(processor->populated), 0);
}

TEST(Processor, AnEmptySocketHasItsLabelOnly) {
  const DecodedProcessor processor(Support::emptySocket("CPU 2"));

  EXPECT_EQ(valueOf(processor->socket), "CPU 2");
  EXPECT_EQ(valueOf(processor->populated), 0);
  EXPECT_EQ(*processor->status, ProcessorStatus::Unknown);
  EXPECT_EQ(valueOf(processor->upgrade), 0x2B);
  EXPECT_FALSE(processor->family);
  EXPECT_FALSE(processor->id);
  EXPECT_FALSE(processor->version);
  EXPECT_FALSE(processor->externalClock);
  EXPECT_FALSE(processor->maxSpeed);
  EXPECT_FALSE(processor->currentSpeed);
  EXPECT_FALSE(processor->serialNumber);
  EXPECT_FALSE(processor->cores);
  EXPECT_FALSE(processor->coresEnabled);
  EXPECT_FALSE(processor->threads);
  EXPECT_EQ(processor->maxSpeed.raw.size(), 2U) << "unknown is not the same as not there";
}

TEST(Processor, FamilyStandsInOneOfTwoFields) {
  struct Case {
    std::uint16_t family;
    long long value;
    std::size_t offset;
  };
  const Case cases[] = {
      {0x00, -1, 0x06},       {0x01, 1, 0x06},       {0x02, -1, 0x06},      {0x42, 0x42, 0x06},
      {0xFD, 0xFD, 0x06},     {0x0100, 0x100, 0x28}, {0x0101, 0x101, 0x28}, {0x0258, 600, 0x28},
      {0xFFFD, 0xFFFD, 0x28}, {0xFFFE, -1, 0x28},    {0xFFFF, -1, 0x28},
  };
  for (const Case& c : cases) {
    const DecodedProcessor processor(SmbiosProcessor{.family = c.family});

    EXPECT_EQ(valueOf(processor->family), c.value) << c.family;
    EXPECT_EQ(processor->family.offset, c.offset) << c.family;
    EXPECT_THAT(processor.problems(), testing::IsEmpty()) << c.family;
  }
}

TEST(Processor, FamilyOfASecondFieldThatIsNotThereIsAProblem) {
  const DecodedProcessor processor(SmbiosProcessor{.frame = {.length = 0x28}, .family = 0x0101});

  EXPECT_EQ(valueOf(processor->family), -1);
  EXPECT_EQ(hexOf(processor->family.raw), "fe");
  EXPECT_THAT(processor.problems(),
              testing::ElementsAre("SMBIOS table, offset 0x6, structure 0 (handle 0x0010): the family is in a second "
                                   "field, for which the structure is too short"));
}

TEST(Processor, CountsStandInOneOfTwoFields) {
  struct Case {
    std::uint16_t count;
    long long value;
    std::size_t offset;
  };
  const Case cases[] = {{0, -1, 0x23},    {1, 1, 0x23},     {254, 254, 0x23},       {255, 255, 0x2A},
                        {256, 256, 0x2A}, {512, 512, 0x2A}, {0xFFFE, 0xFFFE, 0x2A}, {0xFFFF, -1, 0x2A}};
  for (const Case& c : cases) {
    const DecodedProcessor processor(SmbiosProcessor{.cores = c.count, .coresEnabled = c.count, .threads = c.count});

    EXPECT_EQ(valueOf(processor->cores), c.value) << c.count;
    EXPECT_EQ(valueOf(processor->coresEnabled), c.value) << c.count;
    EXPECT_EQ(valueOf(processor->threads), c.value) << c.count;
    EXPECT_EQ(processor->cores.offset, c.offset) << c.count;
    EXPECT_EQ(processor->coresEnabled.offset, c.offset + (c.offset == 0x23 ? 1 : 2)) << c.count;
    EXPECT_EQ(processor->threads.offset, c.offset + (c.offset == 0x23 ? 2 : 4)) << c.count;
  }
}

TEST(Processor, ACountOf255WithoutASecondFieldIsJustThat) {
  const DecodedProcessor processor(SmbiosProcessor{.frame = {.length = 0x2A}, .cores = 255});

  EXPECT_EQ(valueOf(processor->cores), 255);
  EXPECT_EQ(processor->cores.offset, 0x23U);
}

TEST(Processor, ASecondCountThatIsNotThereForAllThreeCountsForThoseItIsThereFor) {
  const DecodedProcessor processor(
      SmbiosProcessor{.frame = {.length = 0x2D}, .cores = 512, .coresEnabled = 511, .threads = 1024});

  EXPECT_EQ(valueOf(processor->cores), 512);
  EXPECT_EQ(valueOf(processor->coresEnabled), 255);
  EXPECT_EQ(valueOf(processor->threads), 255);
}

TEST(Processor, CodesThatMeanUnknownAreAbsentAndUnlistedOnesAreKept) {
  const DecodedProcessor unknown(SmbiosProcessor{.type = 2, .upgrade = 2, .characteristics = 0x02});
  const DecodedProcessor unlisted(SmbiosProcessor{.type = 0xF0, .upgrade = 0xF1, .characteristics = 0xFC00});

  EXPECT_EQ(valueOf(unknown->type), -1);
  EXPECT_EQ(valueOf(unknown->upgrade), -1);
  EXPECT_EQ(valueOf(unknown->characteristics), -1);
  EXPECT_EQ(valueOf(unlisted->type), 0xF0);
  EXPECT_EQ(valueOf(unlisted->upgrade), 0xF1);
  EXPECT_EQ(valueOf(unlisted->characteristics), 0xFC00);
}

TEST(Processor, CachesThatAreNotProvidedAreAbsent) {
  Support::SmbiosEncoder encoder;
  const std::uint16_t cache = encoder.add(Support::SmbiosCache{.frame = {.handle = 0x0007}, .level = 2});
  encoder.add(SmbiosProcessor{.caches = {0xFFFF, cache, 0xFFFF}});
  encoder.end();
  const Decoding tables(encoder);
  const Processor& processor = tables->processors.at(0);

  EXPECT_EQ(valueOf(processor.caches[0]), -1);
  EXPECT_EQ(valueOf(processor.caches[1]), 7);
  EXPECT_EQ(valueOf(processor.caches[2]), -1);
  EXPECT_EQ(tables->cache(7), tables->caches.data());
  EXPECT_THAT(tables.problems(), testing::IsEmpty());
}

TEST(Processor, HasExactlyTheFieldsThatItsLengthReaches) {
  // For every length: how many of the fields are there. A field counts where its last byte is within the length.
  const std::size_t ends[] = {0x05, 0x06, 0x07, 0x08, 0x10, 0x11, 0x14, 0x16, 0x18, 0x19, 0x1A,
                              0x1C, 0x1E, 0x20, 0x21, 0x22, 0x23, 0x24, 0x25, 0x26, 0x28};
  for (std::size_t length = 4; length <= 0x40; ++length) {
    const DecodedProcessor processor(SmbiosProcessor{.frame = {.length = static_cast<std::uint8_t>(length)}});
    const Processor& p = *processor;
    const bool there[] = {!p.socket.raw.empty(),        !p.type.raw.empty(),       !p.family.raw.empty(),
                          !p.manufacturer.raw.empty(),  !p.id.raw.empty(),         !p.version.raw.empty(),
                          !p.externalClock.raw.empty(), !p.maxSpeed.raw.empty(),   !p.currentSpeed.raw.empty(),
                          !p.status.raw.empty(),        !p.upgrade.raw.empty(),    !p.caches[0].raw.empty(),
                          !p.caches[1].raw.empty(),     !p.caches[2].raw.empty(),  !p.serialNumber.raw.empty(),
                          !p.assetTag.raw.empty(),      !p.partNumber.raw.empty(), !p.cores.raw.empty(),
                          !p.coresEnabled.raw.empty(),  !p.threads.raw.empty(),    !p.characteristics.raw.empty()};
    for (std::size_t i = 0; i < std::size(ends); ++i) {
      EXPECT_EQ(there[i], length >= ends[i]) << "field " << i << ", length " << length;
    }
    EXPECT_EQ(processor.problems().empty(), length >= 0x1A) << length;
  }
}

}  // namespace
}  // namespace Tarn::Smbios
