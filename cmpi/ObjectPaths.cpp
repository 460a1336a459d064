#include <cmpift.h>
#include <cvlog/CVLogger.h>
#include <tarn/Common.h>

#include <algorithm>
#include <optional>
#include <string_view>
#include <vector>

#include "cmpi/KeyValue.h"
#include "platform/base/Ascii.h"
#include "platform/cvlog/Level.h"
#include "platform/cvlog/Report.h"

namespace Tarn {
namespace {

using Common::describe;
using Common::equalIgnoringCase;
using Common::KeyValue;
using Common::keyValue;
using Common::lessIgnoringCase;
using Common::textOf;

// Associations of associations nest two or three deep. A path that refers to itself must end somewhere.
constexpr int deepestReference = 8;

struct Key {
  std::string_view name;
  KeyValue value;
};

bool isUsable(const CMPIObjectPath* path) {
  return path != nullptr && path->hdl != nullptr && path->ft != nullptr;
}

std::string_view className(const CMPIObjectPath* path) {
  return textOf(path->ft->getClassName(path, nullptr));
}

std::string_view nameSpace(const CMPIObjectPath* path) {
  return textOf(path->ft->getNameSpace(path, nullptr));
}

/// The keys in the order of their names, or nothing where the broker does not tell them all.
std::optional<std::vector<Key>> sortedKeys(const CMPIObjectPath* path) {
  CMPIStatus status{CMPI_RC_OK, nullptr};
  const CMPICount count = path->ft->getKeyCount(path, &status);
  if (status.rc != CMPI_RC_OK) {
    return std::nullopt;
  }
  std::vector<Key> keys;
  for (CMPICount index = 0; index < count; ++index) {
    CMPIString* name = nullptr;
    const CMPIData data = path->ft->getKeyAt(path, index, &name, &status);
    if (status.rc != CMPI_RC_OK) {
      return std::nullopt;
    }
    keys.push_back({textOf(name), keyValue(data)});
  }
  std::sort(keys.begin(), keys.end(), [](const Key& a, const Key& b) { return lessIgnoringCase(a.name, b.name); });
  return keys;
}

std::string quoted(std::string_view text) {
  return '"' + std::string(text) + '"';
}

/// Compares two paths and, where asked to, notes the first difference.
class Comparison {
 public:
  Comparison(bool withNamespaces, bool explains) : withNamespaces_(withNamespaces), explains_(explains) {}

  bool equal(const CMPIObjectPath* left, const CMPIObjectPath* right) {
    if (!isUsable(left) || !isUsable(right)) {
      return differs([] { return "a path is missing"; });
    }
    return equalClasses(left, right) && (!withNamespaces_ || equalNamespaces(left, right)) && equalKeys(left, right);
  }

  [[nodiscard]] const std::string& difference() const { return difference_; }

 private:
  /// Makes the text only where somebody will read it: most candidates of a search differ.
  template <class Explain>
  bool differs(Explain explain) {
    if (explains_) {
      difference_ += explain();
    }
    return false;
  }

  bool differ(std::string_view what, std::string_view left, std::string_view right) {
    return differs([&] { return std::string(what) + " differ: " + quoted(left) + " and " + quoted(right); });
  }

  bool equalClasses(const CMPIObjectPath* left, const CMPIObjectPath* right) {
    const std::string_view leftName = className(left);
    const std::string_view rightName = className(right);
    return equalIgnoringCase(leftName, rightName) || differ("class names", leftName, rightName);
  }

  bool equalNamespaces(const CMPIObjectPath* left, const CMPIObjectPath* right) {
    const std::string_view leftName = nameSpace(left);
    const std::string_view rightName = nameSpace(right);
    return leftName.empty() || rightName.empty() || equalIgnoringCase(leftName, rightName) ||
           differ("namespaces", leftName, rightName);
  }

  bool equalKeys(const CMPIObjectPath* left, const CMPIObjectPath* right) {
    const auto leftKeys = sortedKeys(left);
    const auto rightKeys = sortedKeys(right);
    if (!leftKeys || !rightKeys) {
      return differs([] { return "the broker does not tell all keys"; });
    }
    if (leftKeys->size() != rightKeys->size()) {
      return differ("numbers of keys", std::to_string(leftKeys->size()), std::to_string(rightKeys->size()));
    }
    return std::equal(leftKeys->begin(), leftKeys->end(), rightKeys->begin(),
                      [this](const Key& a, const Key& b) { return equalKey(a, b); });
  }

  bool equalKey(const Key& left, const Key& right) {
    if (!equalIgnoringCase(left.name, right.name)) {
      return differ("names of keys", left.name, right.name);
    }
    const auto* leftPath = std::get_if<const CMPIObjectPath*>(&left.value);
    const auto* rightPath = std::get_if<const CMPIObjectPath*>(&right.value);
    if (leftPath != nullptr && rightPath != nullptr) {
      return equalReferences(left.name, *leftPath, *rightPath);
    }
    return left.value == right.value || differs([&] {
             return "values of key " + quoted(left.name) + " differ: " + describe(left.value) + " and " +
                    describe(right.value);
           });
  }

  bool equalReferences(std::string_view key, const CMPIObjectPath* left, const CMPIObjectPath* right) {
    if (depth_ == deepestReference) {
      return differs([] { return "references are nested too deep"; });
    }
    const std::size_t lengthBefore = difference_.size();
    if (explains_) {
      difference_ += "in key " + quoted(key) + ": ";
    }
    ++depth_;
    const bool areEqual = equal(left, right);
    --depth_;
    if (areEqual) {
      difference_.resize(lengthBefore);
    }
    return areEqual;
  }

  bool withNamespaces_;
  bool explains_;
  int depth_ = 0;
  std::string difference_;
};

}  // namespace

bool isObjPathsEqual(const CMPIObjectPath* left, const CMPIObjectPath* right, bool flag) {
  return Comparison(flag, false).equal(left, right);
}

bool isObjPathsEqualWithLog(const CMPIBroker* /*broker*/, const CMPIObjectPath* left, const CMPIObjectPath* right,
                            bool flag) {
  constexpr int level = CVLog::levelInfo;
  const bool explains = CVLog::CVLogger::logTakes(level) || CVLog::CVLogger::traceTakes(level);
  Comparison comparison(flag, explains);
  const bool areEqual = comparison.equal(left, right);
  if (!areEqual && explains) {
    Common::report({"Corvane.Common", "ObjectPaths.cpp"}, level, "Object paths differ: " + comparison.difference());
  }
  return areEqual;
}

}  // namespace Tarn
