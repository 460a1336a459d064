#ifndef CORVCIM_INSTANCE_H
#define CORVCIM_INSTANCE_H

#include "host/broker/ObjectPath.h"

#include <iosfwd>
#include <string>
#include <string_view>
#include <vector>

namespace Corvcim {

struct Instance {
  ObjectPath path;                     ///< with keys, as the broker derives it from the properties
  std::vector<NamedValue> properties;  ///< in the order in which they were first set, keys among them

  /// The property of that name, without regard to case; nullptr if it was not set.
  [[nodiscard]] const Value* property(std::string_view name) const { return findValue(properties, name); }

  /// As MOF: instance of CLASS { Name = value; ... };
  [[nodiscard]] std::string text() const;

  friend bool operator==(const Instance&, const Instance&) = default;
  friend std::ostream& operator<<(std::ostream& stream, const Instance& instance);
};

/// The path of an instance of `classPath` with these properties: the keys that the class table gives
/// the class, taken from the properties (those not set are left out). `classPath` itself if the table
/// does not know the class.
[[nodiscard]] ObjectPath instancePath(const ObjectPath& classPath, const std::vector<NamedValue>& properties);

/// An instance whose path follows from its properties; the shortest way to script one.
[[nodiscard]] Instance makeInstance(std::string_view nameSpace, std::string_view className,
                                    std::vector<NamedValue> properties);

}  // namespace Corvcim

#endif
