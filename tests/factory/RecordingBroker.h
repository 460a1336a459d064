#ifndef TESTS_FACTORY_RECORDINGBROKER_H
#define TESTS_FACTORY_RECORDINGBROKER_H

#include <cmpift.h>

#include <string>
#include <vector>

#include "host/broker/Broker.h"

namespace FactoryTests {

/// The broker of the host with an ear at two slots: it notes what is set on instances and what is
/// added to object paths, with the very type that was given, before any filter. One at a time.
class RecordingBroker {
 public:
  explicit RecordingBroker(Corvcim::Broker& broker);
  ~RecordingBroker();
  RecordingBroker(const RecordingBroker&) = delete;
  RecordingBroker& operator=(const RecordingBroker&) = delete;

  const CMPIBroker* handle() const { return &record_; }

  /// The settings since they were taken last, such as "Family uint16 198" or "Name chars |Xeon|".
  std::vector<std::string> takeProperties();
  std::vector<std::string> takeKeys();

 private:
  CMPIBroker record_;
  CMPIBrokerEncFT services_;
};

}  // namespace FactoryTests

#endif
