#ifndef TESTS_PLATFORM_INVENTORY_SOURCES_SMBIOS_DECODING_H
#define TESTS_PLATFORM_INVENTORY_SOURCES_SMBIOS_DECODING_H

#include <string>
#include <vector>

#include "platform/inventory/sources/smbios/Tables.h"
#include "tests/support/SmbiosEncoder.h"

namespace Tarn::Smbios {

/// Decoded tables together with the bytes that they look into.
class Decoding {
 public:
  explicit Decoding(const Support::SmbiosEncoder& encoder) : Decoding(encoder.entryPoint(), encoder.table()) {}
  Decoding(std::string entryPoint, std::string table);
  Decoding(const Decoding&) = delete;
  Decoding(Decoding&&) = delete;
  Decoding& operator=(const Decoding&) = delete;
  Decoding& operator=(Decoding&&) = delete;
  ~Decoding() = default;

  const Tables& operator*() const { return std::get<Tables>(decoded_); }
  const Tables* operator->() const { return &**this; }

  /// The problems as people see them.
  std::vector<std::string> problems() const;

 private:
  std::string entryPoint_;
  std::string table_;
  Decoded decoded_;
};

/// The text of the problem that decoding ended with; empty where it did not.
std::string failureOf(const Decoded& decoded);

/// A table with this one structure, of the version that has all fields, and its end.
template <class Record>
Support::SmbiosEncoder tableOf(const Record& record, unsigned int majorNumber = 3, unsigned int minorNumber = 7) {
  Support::SmbiosEncoder encoder(majorNumber, minorNumber);
  encoder.add(record);
  encoder.end();
  return encoder;
}

/// A field's value for comparisons: -1 where it is absent.
template <class Value>
long long valueOf(const Field<Value>& field) {
  return field ? static_cast<long long>(*field) : -1;
}
std::string valueOf(const Field<std::string>& field);  ///< "-" where it is absent

}  // namespace Tarn::Smbios

#endif
