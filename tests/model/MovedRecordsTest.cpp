#include <CPU.h>
#include <gtest/gtest.h>

#include <utility>
#include <vector>

namespace {

using Tarn::CPUProvider::Memory;
using Tarn::CPUProvider::Processor;
using Tarn::CPUProvider::ProcessorCore;

template <class Record>
class MovedRecord : public ::testing::Test {
 protected:
  MovedRecord() { record.setOperationalStatus(2); }

  Record record;
};

using Records = ::testing::Types<Processor, ProcessorCore, Memory>;
TYPED_TEST_SUITE(MovedRecord, Records);

using Statuses = std::vector<unsigned short>;

TYPED_TEST(MovedRecord, HandsItsOperationalStatusOn) {
  const TypeParam other(std::move(this->record));
  EXPECT_EQ(other.getOperationalStatus(), Statuses{8});
}

// NOLINTBEGIN(bugprone-use-after-move,clang-analyzer-cplusplus.Move): what is left is what is tested.

TYPED_TEST(MovedRecord, KeepsOneOperationalStatus) {
  const TypeParam other(std::move(this->record));
  EXPECT_EQ(this->record.getOperationalStatus().size(), 1U);
}

TYPED_TEST(MovedRecord, CanBeFilledAnew) {
  const TypeParam other(std::move(this->record));
  EXPECT_TRUE(this->record.setOperationalStatus(1));
  EXPECT_EQ(this->record.getOperationalStatus(), Statuses{2});
}

// NOLINTEND(bugprone-use-after-move,clang-analyzer-cplusplus.Move)

}  // namespace
