#include "host/corvcim/results/ResultWriter.h"

#include "host/corvcim/results/JsonWriter.h"
#include "host/corvcim/results/MofWriter.h"
#include "host/corvcim/results/TextWriter.h"

namespace Corvcim {

std::string writeInstances(Format format, std::span<const Instance> instances, const PropertyList& selection) {
  switch (format) {
    case Format::Mof:
      return instancesAsMof(instances);
    case Format::Json:
      return instancesAsJson(instances, selection);
    default:
      return instancesAsText(instances);
  }
}

std::string writePaths(Format format, std::span<const ObjectPath> paths) {
  switch (format) {
    case Format::Mof:
      return pathsAsMof(paths);
    case Format::Json:
      return pathsAsJson(paths);
    default:
      return pathsAsText(paths);
  }
}

std::string writeInstance(Format format, const Instance& instance, const PropertyList& selection) {
  if (format == Format::Json) {
    return instanceAsJson(instance, selection);
  }
  return writeInstances(format, std::span(&instance, 1), selection);
}

}  // namespace Corvcim
