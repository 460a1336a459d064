#ifndef TESTS_SUPPORT_UNIONCOPYINGBROKER_H
#define TESTS_SUPPORT_UNIONCOPYINGBROKER_H

#include <cmpift.h>

#include <string>
#include <vector>

namespace Support {

/// The host's broker with one habit of a production broker: it copies the whole union of every value that it is
/// handed, whatever the value's type. One at a time.
class UnionCopyingBroker {
 public:
  explicit UnionCopyingBroker(const CMPIBroker* original);
  UnionCopyingBroker(const UnionCopyingBroker&) = delete;
  UnionCopyingBroker& operator=(const UnionCopyingBroker&) = delete;

  const CMPIBroker* handle() const { return &record_; }

  /// How many values were copied, and which of them were not initialized to the union's end, such as
  /// "setProperty Level".
  unsigned int copies() const;
  std::vector<std::string> partialValues() const;

 private:
  CMPIBroker record_;
  CMPIBrokerEncFT services_;
};

}  // namespace Support

#endif
