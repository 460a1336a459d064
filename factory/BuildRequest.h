#ifndef TARN_BUILDREQUEST_H
#define TARN_BUILDREQUEST_H

#include <CPUObjFactory.h>

#include <vector>

namespace Tarn::CPUProvider {

/// The builder that makes an instance of one class from a record.
template <class Record>
using Builder = CMPIInstance* (CPUObjFactory::*)(const CMPIBroker*, const CMPIObjectPath*, Record, const char**, bool,
                                                 CMPIStatus*);

/// What is asked of a builder for every record alike, and where its instances go.
struct BuildRequest {
  const CMPIBroker* broker;
  const CMPIObjectPath* ref;
  const char** properties;
  bool isObjPath;
  std::vector<CMPIInstance*>& instances;
  CMPIStatus* rc;
};

template <class Record>
void append(CPUObjFactory& factory, Builder<Record> build, const Record& record, const BuildRequest& request) {
  request.instances.push_back(
      (factory.*build)(request.broker, request.ref, record, request.properties, request.isObjPath, request.rc));
}

}  // namespace Tarn::CPUProvider

#endif
