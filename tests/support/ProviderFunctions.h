#ifndef TESTS_SUPPORT_PROVIDERFUNCTIONS_H
#define TESTS_SUPPORT_PROVIDERFUNCTIONS_H

#include <cmpift.h>

#include <string>
#include <vector>

/// The nine providers as a broker registers them, and their factory functions linked in.
namespace Support {

using CreateInstanceMI = CMPIInstanceMI* (*)(const CMPIBroker*, const CMPIContext*, CMPIStatus*);
using CreateAssociationMI = CMPIAssociationMI* (*)(const CMPIBroker*, const CMPIContext*, CMPIStatus*);

struct ProviderFunctions {
  std::string className;
  std::string provider;   ///< prefix of the factory functions
  std::string prefix;     ///< of the entry points, as the log names them
  std::string file;       ///< that the log names
  std::string component;  ///< under which it logs
  CreateInstanceMI createInstanceMI;
  CreateAssociationMI createAssociationMI;  ///< NULL for the four providers of plain classes

  std::string instanceMIName() const { return "instance" + provider; }
  std::string associationMIName() const { return "association" + provider; }
};

const std::vector<ProviderFunctions>& providerFunctions();

/// The provider of a class. Throws std::out_of_range for a class without one.
const ProviderFunctions& providerOf(const std::string& className);

}  // namespace Support

#endif
