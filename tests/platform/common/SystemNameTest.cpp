#include <gtest/gtest.h>
#include <sys/utsname.h>
#include <tarn/Common.h>

namespace {

TEST(SystemName, IsTheNodeNameOfTheKernel) {
  utsname kernel{};
  ASSERT_EQ(uname(&kernel), 0);
  EXPECT_EQ(Tarn::getSystemName(), kernel.nodename);
}

}  // namespace
