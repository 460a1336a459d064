#ifndef HOST_CORVCIM_RESULTS_RESULTWRITER_H
#define HOST_CORVCIM_RESULTS_RESULTWRITER_H

#include <span>
#include <string>

#include "host/broker/Instance.h"
#include "host/broker/Operation.h"
#include "host/corvcim/options/Verbs.h"

namespace Corvcim {

/// What an operation found, as one document in the format (text, MOF or JSON). The selection is the
/// property list of the request: JSON shows what was asked for and is not known as null.
std::string writeInstances(Format format, std::span<const Instance> instances, const PropertyList& selection);
std::string writePaths(Format format, std::span<const ObjectPath> paths);

/// As writeInstances for one; in JSON the object itself and not a list of one.
std::string writeInstance(Format format, const Instance& instance, const PropertyList& selection);

}  // namespace Corvcim

#endif
