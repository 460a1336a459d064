#include "host/broker/Instance.h"

#include <ostream>

#include "schema/ClassTable.h"

namespace Corvcim {

std::string Instance::text() const {
  std::string result = "instance of " + path.className + " {\n";
  for (const NamedValue& each : properties) {
    result += "  " + each.name + " = " + each.value.text() + ";\n";
  }
  return result + "};";
}

std::ostream& operator<<(std::ostream& stream, const Instance& instance) {
  return stream << "// " << instance.path << '\n' << instance.text();
}

ObjectPath instancePath(const ObjectPath& classPath, const std::vector<NamedValue>& properties) {
  const ClassDefinition* definition = findClass(classPath.className);
  if (definition == nullptr) {
    return classPath;
  }
  ObjectPath result = {classPath.host, classPath.nameSpace, classPath.className, {}};
  for (const PropertyDefinition& each : definition->properties) {
    const Value* value = each.key ? findValue(properties, each.name) : nullptr;
    if (value != nullptr && !value->isNull()) {
      result.keys.push_back({std::string(each.name), *value});
    }
  }
  return result;
}

Instance makeInstance(std::string_view nameSpace, std::string_view className, std::vector<NamedValue> properties) {
  const ObjectPath classPath = {{}, std::string(nameSpace), std::string(className), {}};
  return {instancePath(classPath, properties), std::move(properties)};
}

}  // namespace Corvcim
