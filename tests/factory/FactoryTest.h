#ifndef TESTS_FACTORY_FACTORYTEST_H
#define TESTS_FACTORY_FACTORYTEST_H

#include <CPUObjFactory.h>

#include <string>
#include <vector>

#include "host/broker/Request.h"
#include "tests/factory/RecordingBroker.h"
#include "tests/seam/ScriptedTest.h"

namespace FactoryTests {

using Scripted::Lines;
using Tarn::CPUProvider::CPUObjFactory;
using Tarn::CPUProvider::Memory;
using Tarn::CPUProvider::Processor;
using Tarn::CPUProvider::ProcessorCore;

/// How the factory reports.
inline const Scripted::EventSource events{"Corvane.CPUProvider", "CPUObjFactory.cpp"};
enum FactoryLevel : int { detail = 3000, info = 4000, error = 6000 };

// Records with a value of its own in each field.
Processor fullProcessor(const std::string& deviceId);
ProcessorCore fullCore(const std::string& instanceId);
Memory fullCache(const std::string& deviceId);

// A full record with this identifier into the factory's map, past any collection.
void placeProcessor(const std::string& id);
void placeCore(const std::string& id);
void placeCache(const std::string& id);

/// A factory that has collected nothing, and a request to a broker in which it works.
class FactoryTest : public Scripted::ScriptedTest {
 protected:
  FactoryTest();

  static CPUObjFactory& factory();

  // Into the maps, past any collection.
  static void place(const Processor& processor);
  static void place(const ProcessorCore& core);
  static void place(const Memory& cache);

  /// Forgets what was logged, recorded and counted so far.
  void forgetTraces();

  const char** names(const std::vector<std::string>& list) { return request_.propertyList(list); }
  CMPIString* key(const std::string& text) { return request_.string(text); }
  CMPIObjectPath* path(const std::string& className, const std::string& nameSpace = "root/test");

  /// What `rc` holds: code and message on one line.
  static std::string shown(const CMPIStatus& rc);

  Corvcim::Broker hostBroker_;
  RecordingBroker recording_{hostBroker_};
  Corvcim::Request request_{hostBroker_};
  const CMPIBroker* broker_ = recording_.handle();
  const CMPIObjectPath* ref_ = nullptr;
  CMPIStatus rc_{CMPI_RC_OK, nullptr};
};

/// The DeviceIDs or InstanceIDs of instances or paths, in their order; "NULL" for none.
Lines identifiersOf(const std::vector<CMPIInstance*>& instances);
Lines identifiersOf(const std::vector<CMPIObjectPath*>& paths);

/// The usual parameter list of functions that take a request.
std::string requestParameters(const CMPIBroker* broker, const CMPIObjectPath* ref, const std::string& more);

}  // namespace FactoryTests

#endif
