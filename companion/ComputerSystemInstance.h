#ifndef COMPANION_COMPUTERSYSTEMINSTANCE_H
#define COMPANION_COMPUTERSYSTEMINSTANCE_H

#include <cmpift.h>

#include "companion/ComputerSystem.h"

namespace Tarn::ComputerSystemProvider {

inline constexpr const char* className = "HALDA_ComputerSystem";

/// The object path of the system in the namespace and of the host of `request`, or NULL when the
/// broker refuses; `status` then says why. The path belongs to the request.
CMPIObjectPath* makePath(const CMPIBroker* broker, const CMPIObjectPath* request, const ComputerSystem& system,
                         CMPIStatus* status);

/// The instance of the system with its keys and the properties that the NULL-terminated selection names,
/// without regard to case; NULL selects all. What is not known stays unset, so that the
/// client sees null. NULL when the broker refuses; `status` then says why.
CMPIInstance* makeInstance(const CMPIBroker* broker, const CMPIObjectPath* request, const ComputerSystem& system,
                           const char** selection, CMPIStatus* status);

}  // namespace Tarn::ComputerSystemProvider

#endif
