#ifndef TESTS_FACTORY_FACTORYTEXTS_H
#define TESTS_FACTORY_FACTORYTEXTS_H

#include <string>

/// Failure texts whose runs of blanks belong to them; clients and log filters match them as they stand.
namespace FactoryTests {

inline const std::string processorArrayFailed =
    "Create Array for Property                         OperationalStatus failed.";
inline const std::string capabilitiesArrayFailed =
    "Create Array for Property                         RequestedStatesSupported failed.";
inline const std::string processorPathFailed = "Create CMPIObjectPath                     failed for CPU Processor.";
inline const std::string corePathFailed = "Create CMPIObjectPath                     failed for CPU Processor Core.";
inline const std::string cachePathFailed = "Create CMPIObjectPath                     failed for CPU Memory.";
inline const std::string capabilitiesPathFailed =
    "Create CMPIObjectPath                     failed for CPU Processor Capabilities.";
inline const std::string coreAndCacheArrayFailed = "Create Array for Property OperationalStatus failed.";
inline const std::string pathFailed = "Create CMPIObjectPath failed.";

}  // namespace FactoryTests

#endif
