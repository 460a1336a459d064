#include "host/corvcim/results/ValueNames.h"

#include <algorithm>

#include "schema/Names.h"

namespace Corvcim {
namespace {

constexpr CodeName enabledStates[] = {{0, "Unknown"},
                                      {1, "Other"},
                                      {2, "Enabled"},
                                      {3, "Disabled"},
                                      {4, "Shutting Down"},
                                      {5, "Not Applicable"},
                                      {6, "Enabled but Offline"},
                                      {7, "In Test"},
                                      {8, "Deferred"},
                                      {9, "Quiesce"},
                                      {10, "Starting"}};

constexpr CodeName requestedStates[] = {{0, "Unknown"},   {2, "Enabled"}, {3, "Disabled"}, {4, "Shut Down"},
                                        {5, "No Change"}, {6, "Offline"}, {7, "Test"},     {8, "Deferred"},
                                        {9, "Quiesce"},   {10, "Reboot"}, {11, "Reset"},   {12, "Not Applicable"}};

constexpr CodeName healthStates[] = {{0, "Unknown"},
                                     {5, "OK"},
                                     {10, "Degraded"},
                                     {15, "Minor Failure"},
                                     {20, "Major Failure"},
                                     {25, "Critical Failure"},
                                     {30, "Non-recoverable Error"}};

constexpr CodeName operationalStatuses[] = {{0, "Unknown"},
                                            {1, "Other"},
                                            {2, "OK"},
                                            {3, "Degraded"},
                                            {4, "Stressed"},
                                            {5, "Predictive Failure"},
                                            {6, "Error"},
                                            {7, "Non-Recoverable Error"},
                                            {8, "Starting"},
                                            {9, "Stopping"},
                                            {10, "Stopped"},
                                            {11, "In Service"},
                                            {12, "No Contact"},
                                            {13, "Lost Communication"},
                                            {14, "Aborted"},
                                            {15, "Dormant"},
                                            {16, "Supporting Entity in Error"},
                                            {17, "Completed"},
                                            {18, "Power Mode"}};

// The inventory's own numbers, as the library passes them on; not those of CIM_Processor.
constexpr CodeName cpuStatuses[] = {{1, "In Use"},
                                    {2, "Starting"},
                                    {3, "Stopping"},
                                    {8, "Dormant"},
                                    {10, "Stopped"},
                                    {12, "Offline"},
                                    {13, "Lost Communication"},
                                    {15, "Empty Socket"},
                                    {16, "Disabled"},
                                    {17, "No Contact"},
                                    {20, "Predictive Failure"},
                                    {21, "Degraded"},
                                    {24, "Failed"}};

constexpr CodeName coreEnabledStates[] = {{0, "Unknown"},
                                          {2, "Core Enabled"},
                                          {3, "Core Disabled"},
                                          {4, "Core Disabled by User"},
                                          {5, "Core Disabled by POST Error"}};

constexpr CodeName cacheLevels[] = {{0, "Unknown"}, {1, "Other"},     {2, "Not Applicable"},
                                    {3, "Primary"}, {4, "Secondary"}, {5, "Tertiary"}};

constexpr CodeName writePolicies[] = {{0, "Unknown"},
                                      {1, "Other"},
                                      {2, "Write Back"},
                                      {3, "Write Through"},
                                      {4, "Varies with Address"},
                                      {5, "Determination per I/O"}};

constexpr CodeName readPolicies[] = {{0, "Unknown"},
                                     {1, "Other"},
                                     {2, "Read"},
                                     {3, "Read-Ahead"},
                                     {4, "Read and Read-Ahead"},
                                     {5, "Determination per I/O"}};

constexpr CodeName cacheTypes[] = {{0, "Unknown"}, {1, "Other"}, {2, "Instruction"}, {3, "Data"}, {4, "Unified"}};

constexpr CodeName associativities[] = {{0, "Unknown"},
                                        {1, "Other"},
                                        {2, "Direct Mapped"},
                                        {3, "2-way Set-Associative"},
                                        {4, "4-way Set-Associative"},
                                        {5, "Fully Associative"},
                                        {6, "8-way Set-Associative"},
                                        {7, "16-way Set-Associative"}};

constexpr CodeName upgradeMethods[] = {{0, "Unknown"},
                                       {1, "Other"},
                                       {2, "Unknown"},
                                       {3, "Daughter Board"},
                                       {4, "ZIF Socket"},
                                       {5, "Replacement or Piggy Back"},
                                       {6, "None"},
                                       {7, "LIF Socket"},
                                       {8, "Slot 1"},
                                       {9, "Slot 2"},
                                       {10, "370 Pin Socket"},
                                       {11, "Slot A"},
                                       {12, "Slot M"},
                                       {13, "Socket 423"},
                                       {14, "Socket A (Socket 462)"},
                                       {15, "Socket 478"},
                                       {16, "Socket 754"},
                                       {17, "Socket 940"},
                                       {18, "Socket 939"},
                                       {19, "Socket mPGA604"},
                                       {20, "Socket LGA771"},
                                       {21, "Socket LGA775"},
                                       {22, "Socket S1"},
                                       {23, "Socket AM2"},
                                       {24, "Socket F (1207)"},
                                       {25, "Socket LGA1366"},
                                       {26, "Socket G34"},
                                       {27, "Socket AM3"},
                                       {28, "Socket C32"},
                                       {29, "Socket LGA1156"},
                                       {30, "Socket LGA1567"},
                                       {31, "Socket PGA988A"},
                                       {32, "Socket BGA1288"},
                                       {33, "Socket rPGA988B"},
                                       {34, "Socket BGA1023"},
                                       {35, "Socket BGA1224"},
                                       {36, "Socket LGA1155"},
                                       {37, "Socket LGA1356"},
                                       {38, "Socket LGA2011"},
                                       {39, "Socket FS1"},
                                       {40, "Socket FS2"},
                                       {41, "Socket FM1"},
                                       {42, "Socket FM2"},
                                       {43, "Socket LGA2011-3"},
                                       {44, "Socket LGA1356-3"},
                                       {45, "Socket LGA1150"},
                                       {46, "Socket BGA1168"},
                                       {47, "Socket BGA1234"},
                                       {48, "Socket BGA1364"},
                                       {49, "Socket AM4"},
                                       {50, "Socket LGA1151"},
                                       {51, "Socket BGA1356"},
                                       {52, "Socket BGA1440"},
                                       {53, "Socket BGA1515"},
                                       {54, "Socket LGA3647-1"},
                                       {55, "Socket SP3"},
                                       {56, "Socket SP3r2"},
                                       {57, "Socket LGA2066"},
                                       {58, "Socket BGA1392"},
                                       {59, "Socket BGA1510"},
                                       {60, "Socket BGA1528"},
                                       {61, "Socket LGA4189"},
                                       {62, "Socket LGA1200"},
                                       {63, "Socket LGA4677"},
                                       {64, "Socket LGA1700"},
                                       {65, "Socket BGA1744"},
                                       {66, "Socket BGA1781"},
                                       {67, "Socket BGA1211"},
                                       {68, "Socket BGA2422"},
                                       {69, "Socket LGA1211"},
                                       {70, "Socket LGA2422"},
                                       {71, "Socket LGA5773"},
                                       {72, "Socket BGA5773"}};

struct Enumeration {
  std::string_view property;
  std::span<const CodeName> codes;
};

constexpr Enumeration enumerations[] = {{"Associativity", associativities},
                                        {"CacheType", cacheTypes},
                                        {"CoreEnabledState", coreEnabledStates},
                                        {"CPUStatus", cpuStatuses},
                                        {"EnabledState", enabledStates},
                                        {"HealthState", healthStates},
                                        {"Level", cacheLevels},
                                        {"OperationalStatus", operationalStatuses},
                                        {"ReadPolicy", readPolicies},
                                        {"RequestedState", requestedStates},
                                        {"RequestedStatesSupported", requestedStates},
                                        {"UpgradeMethod", upgradeMethods},
                                        {"WritePolicy", writePolicies}};

struct Unit {
  std::string_view property;
  std::string_view unit;
};

constexpr Unit units[] = {{"AddressWidth", "bits"}, {"BlockSize", "bytes"},           {"CurrentClockSpeed", "MHz"},
                          {"DataWidth", "bits"},    {"ExternalBusClockSpeed", "MHz"}, {"MaxClockSpeed", "MHz"}};

}  // namespace

std::span<const CodeName> codesOf(std::string_view property) {
  if (sameName(property, "Family")) {
    return processorFamilies();
  }
  const auto* const found = std::ranges::find_if(
      enumerations, [&](const Enumeration& enumeration) { return sameName(property, enumeration.property); });
  return found == std::end(enumerations) ? std::span<const CodeName>() : found->codes;
}

std::string_view valueName(std::string_view property, std::uint64_t code) {
  const std::span<const CodeName> codes = codesOf(property);
  const auto found = std::ranges::lower_bound(codes, code, {}, &CodeName::code);
  return found != codes.end() && found->code == code ? found->name : std::string_view();
}

std::string_view unitName(std::string_view property) {
  for (const Unit& unit : units) {
    if (sameName(property, unit.property)) {
      return unit.unit;
    }
  }
  return {};
}

}  // namespace Corvcim
