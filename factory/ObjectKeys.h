#ifndef TARN_OBJECTKEYS_H
#define TARN_OBJECTKEYS_H

#include <CPUClassNames.h>

#include <array>
#include <cstddef>
#include <string>
#include <utility>

namespace Tarn::CPUProvider {

/// How the objects of a class are identified.
enum class KeyStyle {
  Device,     ///< class, identifier and the system that it belongs to
  InstanceId  ///< the identifier alone
};

/// Key lists for property filters, which take them as arrays of mutable pointers.
inline const char* deviceKeyNames[] = {"CreationClassName", "DeviceID", "SystemCreationClassName", "SystemName",
                                       nullptr};
inline const char* instanceIdKeyNames[] = {"InstanceID", nullptr};

inline const char** keyNames(KeyStyle style) {
  return style == KeyStyle::Device ? deviceKeyNames : instanceIdKeyNames;
}

/// The keys of one object, in the order in which they are set.
class ObjectKeys {
 public:
  struct Key {
    const char* name;
    const char* value;
  };

  ObjectKeys(KeyStyle style, const char* className, std::string identifier, std::string systemName)
      : identifier_(std::move(identifier)), systemName_(std::move(systemName)) {
    if (style == KeyStyle::Device) {
      keys_ = {{{"CreationClassName", className},
                {"DeviceID", identifier_.c_str()},
                {"SystemCreationClassName", computerSystemClass},
                {"SystemName", systemName_.c_str()}}};
      count_ = 4;
    } else {
      keys_ = {{{"InstanceID", identifier_.c_str()}}};
      count_ = 1;
    }
  }
  ~ObjectKeys() = default;
  ObjectKeys(const ObjectKeys&) = delete;
  ObjectKeys& operator=(const ObjectKeys&) = delete;

  const Key* begin() const { return keys_.data(); }
  const Key* end() const { return keys_.data() + count_; }

 private:
  std::string identifier_;
  std::string systemName_;
  std::array<Key, 4> keys_{};
  std::size_t count_ = 0;
};

}  // namespace Tarn::CPUProvider

#endif
