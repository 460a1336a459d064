#include "host/corvcim/explain/ExplanationTable.h"

#include <algorithm>

#include "schema/ClassTable.h"

namespace Corvcim {
namespace {

using Row = CodeTable::Row;
using enum Step;

// The codes of the libraries, listed here once more: this program knows a library by its entry points alone, and
// explains by these tables also what another build of it answers. ExplanationTest compares them with
// model/StateCodes.h, ExplainCommandTest with what the built libraries, the companion among them, answer.

constexpr Row enabledStateRows[] = {{0, "0"}, {1, "2"}, {12, "6"}, {16, "3"}};
constexpr CodeTable enabledState = {"EnabledState", enabledStateRows, "5"};

constexpr Row operationalStatusRows[] = {{0, "0"},   {1, "2"},   {2, "8"},   {3, "9"}, {8, "15"},
                                         {10, "10"}, {13, "13"}, {17, "12"}, {20, "5"}};
constexpr CodeTable operationalStatus = {"OperationalStatus", operationalStatusRows, "0"};

constexpr Row processorHealthRows[] = {{0, "0"}, {21, "10"}, {24, "25"}};
constexpr CodeTable processorHealth = {"HealthState of processors", processorHealthRows, "5"};

constexpr Row processorStatusRows[] = {{0, "UnKnown"}, {21, "Degraded"}, {24, "Error"}};
constexpr CodeTable processorStatus = {"Status", processorStatusRows, "OK"};

constexpr Row partHealthRows[] = {{0, "0"}, {1, "5"}, {21, "10"}, {24, "25"}};
constexpr CodeTable partHealth = {"HealthState of cores and caches", partHealthRows, "5"};

constexpr Row otherFamilyRows[] = {{1, "Cell Blade Family"}};
constexpr CodeTable otherFamily = {"OtherFamilyDescription", otherFamilyRows, "Other"};

constexpr Row writePolicyRows[] = {{1, "2"}, {2, "3"}, {3, "4"}, {4, "1"}};
constexpr CodeTable writePolicy = {"WritePolicy", writePolicyRows, "0"};

constexpr Row cacheTypeRows[] = {{0, "0"}, {1, "2"}, {2, "3"}, {3, "4"}};
constexpr CodeTable cacheType = {"CacheType", cacheTypeRows, "0"};

constexpr Row associativityRows[] = {{0, "0"}, {1, "2"}, {2, "5"}, {3, "3"}, {4, "4"}, {5, "6"}, {6, "7"}};
constexpr CodeTable associativity = {"Associativity", associativityRows, "0"};

constexpr Row systemEnabledRows[] = {{0, "0"}, {1, "2"}, {12, "6"}, {16, "3"}, {21, "2"}, {24, "2"}};
constexpr CodeTable systemEnabled = {"EnabledState of the system", systemEnabledRows, "0"};

constexpr Row systemHealthRows[] = {{0, "0"}, {1, "5"}, {12, "5"}, {16, "5"}, {21, "10"}, {24, "25"}};
constexpr CodeTable systemHealth = {"HealthState of the system", systemHealthRows, "0"};

constexpr Row systemOperationalRows[] = {{0, "0"}, {1, "2"}, {12, "10"}, {16, "10"}, {21, "3"}, {24, "6"}};
constexpr CodeTable systemOperational = {"OperationalStatus of the system", systemOperationalRows, "0"};

constexpr std::string_view system = "HALDA_ComputerSystem";
constexpr std::string_view processor = "HALDA_CPUProcessor";
constexpr std::string_view core = "HALDA_CPUProcessorCore";
constexpr std::string_view cache = "HALDA_CPUMemory";
constexpr std::string_view capabilities = "HALDA_CPUProcessorCapabilities";
constexpr std::string_view cacheLink = "HALDA_CPUAssociatedCacheMemory";

constexpr std::string_view className = "the name of the class";
constexpr std::string_view systemClass = "the class of the computer system";
constexpr std::string_view machineName = "the machine's name";
constexpr std::string_view unnamed = "unnamed where another machine's inventory has no name";
constexpr std::string_view message = "a text of the message catalogue, in the configured language";
constexpr std::string_view notApplicable = "always 12: nobody can request a state";
constexpr std::string_view pathWords = "the part's path in the inventory";
constexpr std::string_view linkEnd = "the path of the cache's or processor's instance";
constexpr std::string_view zero = "0 where it is not known";
constexpr std::string_view absent = "left out where it is not known";
constexpr std::string_view empty = "empty where it is not known";
constexpr std::string_view leftOutIfZero = "left out where it is 0";

constexpr PropertySource sources[] = {
    {system, "CreationClassName", "", Constant, className, ""},
    {system, "Name", "SystemName", Copied, "", unnamed},
    {system, "Caption", "", Constant, message, ""},
    {system, "Description", "", Constant, message, ""},
    {system, "ElementName", "SystemName", Copied, "", unnamed},
    {system, "Model", "SystemModel", Copied, "", absent},
    {system, "Manufacturer", "SystemManufacturer", Copied, "", absent},
    {system, "EnabledState", "status", Coded, "", "", &systemEnabled},
    {system, "RequestedState", "", Constant, notApplicable, ""},
    {system, "HealthState", "status", Coded, "", "", &systemHealth},
    {system, "OperationalStatus", "status", Coded, "", "", &systemOperational},

    {processor, "CreationClassName", "", Constant, className, ""},
    {processor, "DeviceID", "path", Copied, pathWords, ""},
    {processor, "SystemCreationClassName", "", Constant, systemClass, ""},
    {processor, "SystemName", "", Constant, machineName, ""},
    {processor, "Caption", "", Constant, message, ""},
    {processor, "Description", "", Constant, message, ""},
    {processor, "ElementName", "description", Copied, "", empty},
    {processor, "Name", "ProcessorName", Copied, "", empty, nullptr, "Unknown"},
    {processor, "Family", "Family", Copied, "", zero, nullptr, "2"},
    {processor, "OtherFamilyDescription", "Family", Coded, "", "Other where it is not known", &otherFamily, "Other"},
    {processor, "EnabledState", "status", Coded, "", "", &enabledState},
    {processor, "RequestedState", "", Constant, notApplicable, ""},
    {processor, "CurrentClockSpeed", "CurrentClockSpeed", Copied, "", zero},
    {processor, "MaxClockSpeed", "MaxClockSpeed", Copied, "", zero},
    {processor, "ExternalBusClockSpeed", "ExternalClockSpeed", Computed, "as it is; 3600 where it is 0",
     "3600 where it is not known"},
    {processor, "CPUStatus", "status", Copied, "", ""},
    {processor, "Status", "status", Coded, "", "", &processorStatus},
    {processor, "HealthState", "status", Coded, "", "", &processorHealth},
    {processor, "OperationalStatus", "status", Coded, "", "", &operationalStatus},
    {processor, "DataWidth", "DataWidth", Copied, leftOutIfZero, absent},
    {processor, "AddressWidth", "AddressWidth", Copied, leftOutIfZero,
     "the data width where it is not known; left out where neither is"},
    {processor, "Stepping", "Stepping", Copied, "", empty},
    {processor, "UniqueId", "ProcessorId", Computed, "in upper case, without blanks", empty},
    {processor, "UpgradeMethod", "UpgradeMethod", Copied, "", zero},
    {processor, "NumberOfEnabledCores", "EnabledCores", Copied, leftOutIfZero, absent},

    {core, "InstanceID", "path", Copied, pathWords, ""},
    {core, "Caption", "", Constant, message, ""},
    {core, "Description", "", Constant, message, ""},
    {core, "ElementName", "description", Copied, "", empty},
    {core, "CoreEnabledState", "", Constant, "always 2, whatever the core's status", ""},
    {core, "EnabledState", "", Constant, "always 2, whatever the core's status", ""},
    {core, "RequestedState", "", Constant, notApplicable, ""},
    {core, "HealthState", "status", Coded, "", "", &partHealth},
    {core, "OperationalStatus", "status", Coded, "", "", &operationalStatus},

    {cache, "CreationClassName", "", Constant, className, ""},
    {cache, "DeviceID", "path", Copied, pathWords, ""},
    {cache, "SystemCreationClassName", "", Constant, systemClass, ""},
    {cache, "SystemName", "", Constant, machineName, ""},
    {cache, "Caption", "", Constant, message, ""},
    {cache, "Description", "", Constant, message, ""},
    {cache, "ElementName", "description", Copied, "", empty},
    {cache, "Name", "CacheName", Copied, "", empty},
    {cache, "BlockSize", "CacheBlockSize", Copied, "", zero},
    {cache, "NumberOfBlocks", "CacheNumberOfBlocks", Copied, "", zero},
    {cache, "ConsumableBlocks", "CacheConsumableBlocks", Copied, "", zero},
    {cache, "EnabledState", "status", Coded, "", "", &enabledState},
    {cache, "HealthState", "status", Coded, "", "", &partHealth},
    {cache, "RequestedState", "", Constant, notApplicable, ""},
    {cache, "OperationalStatus", "status", Coded, "", "", &operationalStatus},

    {capabilities, "InstanceID", "path", Computed, "NERITH: and the processor's path in the inventory", ""},
    {capabilities, "Caption", "", Constant, message, ""},
    {capabilities, "Description", "", Constant, message, ""},
    {capabilities, "NumberOfProcessorCores", "ProcessorCores", Copied, "", zero},
    {capabilities, "NumberOfHardwareThreads", "HardwareThreads", Copied, "", zero},
    {capabilities, "RequestedStatesSupported", "RequestedStatesSupported", Computed,
     "a 2 for each 1, and nothing for any other", "an empty list where it is not known"},
    {capabilities, "ElementNameEditSupported", "", Constant, "always false", ""},

    {cacheLink, "Antecedent", "", Constant, linkEnd, ""},
    {cacheLink, "Dependent", "", Constant, linkEnd, ""},
    {cacheLink, "Level", "CacheLevel", Copied, "", zero},
    {cacheLink, "WritePolicy", "CacheWritePolicy", Coded, "", zero, &writePolicy},
    {cacheLink, "ReadPolicy", "", Constant, "always 0: no inventory has it", ""},
    {cacheLink, "CacheType", "CacheType", Coded, "", zero, &cacheType},
    {cacheLink, "Associativity", "CacheAssociativity", Coded, "", zero, &associativity},
};

const Row* rowOf(const CodeTable& table, unsigned int code) {
  const auto row = std::ranges::find(table.rows, code, &Row::code);
  return row == table.rows.end() ? nullptr : &*row;
}

std::string describeCode(const CodeTable& table, unsigned int code) {
  std::string text = "table " + std::string(table.name) + ": ";
  if (const Row* row = rowOf(table, code)) {
    return text.append(std::to_string(code)).append(" is ").append(row->value);
  }
  return text.append("any code without a row, such as ")
      .append(std::to_string(code))
      .append(", is ")
      .append(table.otherwise);
}

bool isShort(const PropertySource& source) {
  const ClassDefinition* definition = findClass(source.className);
  const PropertyDefinition* property = definition == nullptr ? nullptr : findProperty(*definition, source.property);
  return property != nullptr && property->type == CMPI_uint16;
}

unsigned int asPassedOn(const PropertySource& source, unsigned int number) {
  return isShort(source) ? number & 0xFFFFU : number;
}

std::string describeCopy(const PropertySource& source, const FieldValue& value) {
  if (const auto* const number = std::get_if<unsigned int>(&value);
      number != nullptr && asPassedOn(source, *number) != *number) {
    return "its lowest 16 bits";
  }
  return source.words.empty() || source.words == leftOutIfZero
             ? "as it is" + std::string(source.words.empty() ? "" : "; ") + std::string(source.words)
             : std::string(source.words);
}

// Keys and names lose the blanks around them.
std::string withoutBlanks(const std::string& text) {
  const std::size_t begin = text.find_first_not_of(' ');
  return begin == std::string::npos ? "" : text.substr(begin, text.find_last_not_of(' ') - begin + 1);
}

}  // namespace

std::span<const PropertySource> propertySources() {
  return sources;
}

std::string describeStep(const PropertySource& source, const Datum& datum) {
  if (source.step == Constant) {
    return std::string(source.words);
  }
  if (datum.isVirtual && datum.value && !source.ifVirtual.empty()) {
    return std::string(source.ifVirtual) + ", because the system's model says that the machine is virtual";
  }
  if (!datum.value) {
    return std::string(source.unknown);
  }
  switch (source.step) {
    case Copied:
      return describeCopy(source, *datum.value);
    case Coded:
      return describeCode(*source.codes, std::get<unsigned int>(*datum.value));
    case Constant:
    case Computed:
      break;
  }
  return std::string(source.words);
}

std::optional<std::string> expectedValue(const PropertySource& source, const Datum& datum) {
  if (!datum.value || (source.step != Copied && source.step != Coded)) {
    return std::nullopt;
  }
  if (datum.isVirtual && !source.ifVirtual.empty()) {
    return std::string(source.ifVirtual);
  }
  if (source.step == Coded) {
    const Row* row = rowOf(*source.codes, std::get<unsigned int>(*datum.value));
    return std::string(row == nullptr ? source.codes->otherwise : row->value);
  }
  if (const auto* const number = std::get_if<unsigned int>(&*datum.value)) {
    return std::to_string(asPassedOn(source, *number));
  }
  const auto& text = std::get<std::string>(*datum.value);
  return source.field == "description" || source.field == "path" ? withoutBlanks(text) : text;
}

}  // namespace Corvcim
