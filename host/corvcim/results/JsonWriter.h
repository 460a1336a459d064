#ifndef HOST_CORVCIM_RESULTS_JSONWRITER_H
#define HOST_CORVCIM_RESULTS_JSONWRITER_H

#include <span>
#include <string>

#include "host/broker/Instance.h"
#include "host/broker/Operation.h"
#include "host/corvcim/text/Json.h"

namespace Corvcim {

/// Each instance is an object with "class", "namespace", "path" and "properties"; codes and numbers are
/// numbers, references are paths. Properties of the class that were selected and have no value are null.
std::string instancesAsJson(std::span<const Instance> instances, const PropertyList& selection);
std::string instanceAsJson(const Instance& instance, const PropertyList& selection);

/// Each path is an object with "class", "namespace", "path" and "keys".
std::string pathsAsJson(std::span<const ObjectPath> paths);

/// One value; null for what JSON does not have: infinities and NaN.
OrderedJson valueAsJson(const Value& value);

}  // namespace Corvcim

#endif
