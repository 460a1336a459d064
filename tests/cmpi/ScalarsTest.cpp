#include <gtest/gtest.h>

#include <cmpidt.h>

#include <type_traits>

TEST(Scalars, AreTheTypesOfTheInterface) {
  EXPECT_TRUE((std::is_same_v<CMPIBoolean, unsigned char>));
  EXPECT_TRUE((std::is_same_v<CMPIChar16, unsigned short>));
  EXPECT_TRUE((std::is_same_v<CMPIUint8, unsigned char>));
  EXPECT_TRUE((std::is_same_v<CMPIUint16, unsigned short>));
  EXPECT_TRUE((std::is_same_v<CMPIUint32, unsigned int>));
  EXPECT_TRUE((std::is_same_v<CMPIUint64, unsigned long long>));
  EXPECT_TRUE((std::is_same_v<CMPISint8, signed char>));
  EXPECT_TRUE((std::is_same_v<CMPISint16, short>));
  EXPECT_TRUE((std::is_same_v<CMPISint32, int>));
  EXPECT_TRUE((std::is_same_v<CMPISint64, long long>));
  EXPECT_TRUE((std::is_same_v<CMPIReal32, float>));
  EXPECT_TRUE((std::is_same_v<CMPIReal64, double>));
  EXPECT_TRUE((std::is_same_v<CMPICount, unsigned int>));
  EXPECT_TRUE((std::is_same_v<CMPIType, unsigned short>));
  EXPECT_TRUE((std::is_same_v<CMPIValueState, unsigned short>));
  EXPECT_TRUE((std::is_same_v<CMPIAccessor, CMPIData(const char*, void*)>));
  EXPECT_TRUE((std::is_same_v<CMPIThreadFunc, void* (*)(void*)>));
  EXPECT_TRUE((std::is_same_v<CMPIThreadOnceFunc, void (*)(void)>));
  EXPECT_TRUE((std::is_same_v<CMPIThreadKeyCleanupFunc, void (*)(void*)>));
  EXPECT_TRUE((std::is_same_v<CMPIMsgFileHandle, void*>));
  EXPECT_TRUE((std::is_same_v<CMPIGcStat, void>));
  EXPECT_TRUE((std::is_same_v<CMPIFlags, unsigned int>));
  EXPECT_TRUE((std::is_same_v<CMPIVersion, int>));
}
