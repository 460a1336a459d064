#include "host/corvcim/operations/RequestCheck.h"

#include <sys/utsname.h>
#include <tarn/Common.h>

#include <algorithm>
#include <stdexcept>
#include <string>
#include <string_view>
#include <vector>

#include "host/broker/Dispatcher.h"
#include "platform/base/NearestName.h"
#include "schema/ClassTable.h"
#include "schema/DmtfClasses.h"
#include "schema/Names.h"

namespace Corvcim {
namespace {

using ClassList = std::vector<const ClassDefinition*>;

/// The name alone of [user[:password]@]host[:port].
std::string_view hostAlone(std::string_view host) {
  host.remove_prefix(host.rfind('@') + 1);
  return host.starts_with('[') ? host.substr(1, host.find(']') - 1) : host.substr(0, host.find(':'));
}

/// Of two names of which one lacks the domain, the first part is compared.
bool isSameHost(std::string_view name, std::string_view other) {
  const std::size_t dot = name.find('.');
  const std::size_t otherDot = other.find('.');
  const bool lacksDomain = dot == std::string_view::npos || otherDot == std::string_view::npos;
  return sameName(name, other) || (lacksDomain && sameName(name.substr(0, dot), other.substr(0, otherDot)));
}

/// The machine that the inventory describes has its own name, whichever host this program runs on.
bool namesThisHost(std::string_view host) {
  struct utsname machine {};
  ::uname(&machine);
  const std::string described = Tarn::getSystemName();
  const std::string_view names[] = {"localhost", "127.0.0.1", "::1", machine.nodename, described};
  return std::ranges::any_of(names, [&](std::string_view name) { return isSameHost(hostAlone(host), name); });
}

void checkPlace(const ObjectPath& path) {
  if (!path.host.empty() && !namesThisHost(path.host)) {
    throw std::runtime_error("the path is one of host '" + std::string(hostAlone(path.host)) +
                             "', and this program asks the libraries of this host; leave out //" + path.host +
                             "/, or ask that host's broker with a WBEM client");
  }
  if (!path.nameSpace.empty() && !sameName(path.nameSpace, servedNameSpace)) {
    throw std::runtime_error("no class is served in the namespace '" + path.nameSpace + "': it can be " +
                             std::string(servedNameSpace));
  }
  for (const NamedValue& key : path.keys) {
    if (!key.value.isNull() && key.value.type() == CMPI_ref) {
      checkPlace(key.value.asReference());
    }
  }
}

/// The association classes that the request goes to, whatever its roles.
ClassList associationsAsked(const Operation& operation) {
  const auto& named = isReferenceOperation(operation.kind) ? operation.filter.resultClass : operation.filter.assocClass;
  ClassList associations = associationsOf(operation.path.className);
  std::erase_if(associations, [&](const ClassDefinition* each) { return named && !isA(each->name, *named); });
  return associations;
}

/// The classes that the request's results can have.
ClassList resultClasses(const Operation& operation) {
  if (!isAssociationOperation(operation.kind)) {
    return classesServing(operation.path.className);
  }
  ClassList classes = associationsAsked(operation);
  if (isReferenceOperation(operation.kind)) {
    return classes;
  }
  ClassList ends;
  for (const ClassDefinition* association : classes) {
    for (const PropertyDefinition& end : referenceEnds(*association)) {
      if (!isA(operation.path.className, end.referenceClass)) {
        ends.push_back(findClass(end.referenceClass));
      }
    }
  }
  return ends;
}

void checkResultClass(const Operation& operation) {
  const std::optional<std::string>& name = operation.filter.resultClass;
  if (name && !isReferenceOperation(operation.kind) && classesServing(*name).empty()) {
    throw std::runtime_error("no class '" + *name + "' is served here; " + suggestClasses(*name));
  }
}

void checkRole(const std::optional<std::string>& role, const ClassList& associations) {
  std::vector<std::string_view> known;
  for (const ClassDefinition* association : associations) {
    for (const PropertyDefinition& end : referenceEnds(*association)) {
      if (std::ranges::find(known, end.name) == known.end()) {
        known.push_back(end.name);
      }
    }
  }
  const auto isRole = [&](std::string_view each) { return sameName(each, *role); };
  if (role && !known.empty() && std::ranges::none_of(known, isRole)) {
    throw std::runtime_error("no association here has the role '" + *role + "'; " +
                             Tarn::Common::suggestNames(*role, known));
  }
}

bool hasProperty(const ClassDefinition& definition, std::string_view name) {
  return findProperty(definition, name) != nullptr || inheritedProperty(definition, name) != nullptr;
}

void checkProperty(const std::string& name, const ClassList& classes) {
  if (classes.empty() ||
      std::ranges::any_of(classes, [&](const ClassDefinition* each) { return hasProperty(*each, name); })) {
    return;
  }
  std::vector<std::string_view> known;
  for (const ClassDefinition* each : classes) {
    for (const PropertyDefinition& property : each->properties) {
      if (std::ranges::find(known, property.name) == known.end()) {
        known.push_back(property.name);
      }
    }
  }
  const std::string who = classes.size() == 1 ? std::string(classes.front()->name) + " has no property '"
                                              : "none of the classes asked has a property '";
  throw std::runtime_error(who + name + "'; " + Tarn::Common::suggestNames(name, known));
}

}  // namespace

void checkRequest(const Operation& operation) {
  checkPlace(operation.path);
  if (isAssociationOperation(operation.kind)) {
    const ClassList associations = associationsAsked(operation);
    checkResultClass(operation);
    checkRole(operation.filter.role, associations);
    checkRole(operation.filter.resultRole, associations);
  }
  if (operation.properties) {
    const ClassList classes = resultClasses(operation);
    for (const std::string& name : *operation.properties) {
      checkProperty(name, classes);
    }
  }
}

}  // namespace Corvcim
