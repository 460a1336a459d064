#ifndef HOST_CORVCIM_RESULTS_MOFWRITER_H
#define HOST_CORVCIM_RESULTS_MOFWRITER_H

#include <span>
#include <string>

#include "host/broker/Instance.h"

namespace Corvcim {

/// The instances as MOF: instance of CLASS { Name = value; ... };
std::string instancesAsMof(std::span<const Instance> instances);

/// The paths as MOF has them: as instances with their keys alone.
std::string pathsAsMof(std::span<const ObjectPath> paths);

}  // namespace Corvcim

#endif
