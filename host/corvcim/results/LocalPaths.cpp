#include "host/corvcim/results/LocalPaths.h"

#include <utility>
#include <vector>

namespace Corvcim {

ObjectPath withoutHosts(ObjectPath path) {
  path.host.clear();
  for (NamedValue& key : path.keys) {
    key.value = withoutHosts(key.value);
  }
  return path;
}

Value withoutHosts(const Value& value) {
  if (value.isNull()) {
    return value;
  }
  if (value.type() == CMPI_ref) {
    return Value::reference(withoutHosts(value.asReference()));
  }
  if (value.type() == CMPI_refA) {
    std::vector<Value> elements;
    for (const Value& element : value.elements()) {
      elements.push_back(withoutHosts(element));
    }
    return Value::array(CMPI_ref, std::move(elements));
  }
  return value;
}

Instance withoutHosts(Instance instance) {
  instance.path = withoutHosts(std::move(instance.path));
  for (NamedValue& property : instance.properties) {
    property.value = withoutHosts(property.value);
  }
  return instance;
}

}  // namespace Corvcim
