#ifndef CORVCIM_OBJECT_PATH_H
#define CORVCIM_OBJECT_PATH_H

#include "host/broker/Value.h"

#include <cstddef>
#include <iosfwd>
#include <stdexcept>
#include <string>
#include <string_view>
#include <vector>

namespace Corvcim {

/// Why a text is no object path: what() holds the whole sentence with the text and the place.
class PathSyntaxError : public std::runtime_error {
 public:
  PathSyntaxError(std::string_view text, std::size_t offset, std::string_view reason);
  [[nodiscard]] std::size_t offset() const { return offset_; }  ///< bytes from the start of the text

 private:
  std::size_t offset_;
};

/// The name of a class (no keys) or of an instance.
struct ObjectPath {
  std::string host;       ///< empty: not given
  std::string nameSpace;  ///< such as "root/cimv2"; empty: not given
  std::string className;
  std::vector<NamedValue> keys;

  /// The key of that name, without regard to case; nullptr if there is none.
  [[nodiscard]] const Value* key(std::string_view name) const { return findValue(keys, name); }

  /// The usual WBEM form: root/cimv2:HALDA_CPUProcessor.CreationClassName="HALDA_CPUProcessor",DeviceID="x".
  /// A host goes in front as //host/; references are quoted paths, their own quotes escaped.
  [[nodiscard]] std::string text() const;

  /// Reads that form back. Accepts a leading http:, https:, // or /, and a path without namespace. A
  /// key that the class table knows gets its type there; any other is a string if quoted, else a
  /// boolean, a sint64 or a uint64. Throws PathSyntaxError.
  static ObjectPath parse(std::string_view text);

  /// Exactly the same, spelling and order of keys included.
  friend bool operator==(const ObjectPath&, const ObjectPath&) = default;
  friend std::ostream& operator<<(std::ostream& stream, const ObjectPath& path);
};

/// Whether both name the same instance: class and key names without regard to case, the same set of
/// keys, in any order, texts exactly, integers by number whatever their type. Hosts are not compared,
/// namespaces only where both are given.
[[nodiscard]] bool namesSameInstance(const ObjectPath& left, const ObjectPath& right);

}  // namespace Corvcim

#endif
