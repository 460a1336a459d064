#include "host/corvcim/results/MofWriter.h"

#include "host/corvcim/results/LocalPaths.h"
#include "host/corvcim/text/Text.h"

namespace Corvcim {
namespace {

void append(std::string& mof, const Instance& instance) {
  mof += (mof.empty() ? "" : "\n") + toValidUtf8(withoutHosts(instance).text());
  if (!mof.ends_with('\n')) {
    mof += '\n';
  }
}

}  // namespace

std::string instancesAsMof(std::span<const Instance> instances) {
  std::string mof;
  for (const Instance& instance : instances) {
    append(mof, instance);
  }
  return mof;
}

std::string pathsAsMof(std::span<const ObjectPath> paths) {
  std::string mof;
  for (const ObjectPath& path : paths) {
    append(mof, {path, path.keys});
  }
  return mof;
}

}  // namespace Corvcim
