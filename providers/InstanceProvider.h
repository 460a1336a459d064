#ifndef TARN_INSTANCEPROVIDER_H
#define TARN_INSTANCEPROVIDER_H

#include "FrontDoor.h"

/// The family of the four providers of plain instances. Each says in an InstanceProvider what is its
/// own; the three operations below say what they do with it.
namespace Tarn::CPUProvider {

/// A text to log and the line that it is reported from: the one where it stands, unless given.
struct Remark {
  const char* text;
  unsigned int line;

  // NOLINTNEXTLINE(google-explicit-constructor,hicpp-explicit-conversions): tables read better without the type
  constexpr Remark(const char* remark = nullptr, unsigned int at = __builtin_LINE()) : text(remark), line(at) {}
  explicit constexpr operator bool() const { return text != nullptr; }
};

struct InstanceProvider {
  const EventLog& events;
  const CMPIBroker* const& broker;

  // The kinds of record that the operations need.
  bool isProc;
  bool isMem;
  bool isProcCore;

  unsigned short (CPUObjFactory::*getAllInstances)(const CMPIBroker*, const CMPIObjectPath*, const char**, bool,
                                                   Instances&, CMPIStatus*);
  unsigned short (CPUObjFactory::*getOneInstance)(const CMPIBroker*, const CMPIObjectPath*, CMPIString*, const char**,
                                                  Instances&, CMPIStatus*);
  unsigned short (CPUObjFactory::*getAllPaths)(const CMPIBroker*, const CMPIObjectPath*, Paths&, CMPIStatus*);

  struct {
    const char* key;        ///< the key that names the instance
    bool tracesKey;         ///< whether its text is logged
    bool failsWithoutKeys;  ///< else a request without keys succeeds with nothing
    Remark noKeys;
    Remark oneFailed;
    Remark allFailed;           ///< without text: nothing is logged
    unsigned int exitLine = 0;  ///< of the exit mark; 0: the entry point's own
  } getInstance;

  // How many results to expect, and the variable that the number is logged as, if it is.
  struct {
    CountRecords expected;
    const char* variable;
    Remark failed;
  } enumInstances;

  struct {
    CountRecords expected;
    Remark variable;
    Remark failed;
  } enumInstanceNames;

  CPUObjFactory* factory() const { return CPUObjFactory::getFactoryInstance(isProc, isMem, isProcCore); }
};

/// One request, and the entry point that reports it.
struct InstanceRequest {
  const CMPIResult* result;
  const CMPIObjectPath* reference;
  const char** properties;
  const char* function = __builtin_FUNCTION();
  unsigned int line = __builtin_LINE();
};

/// The instance that the reference's key names. Without that key (but with another): all of them.
CMPIStatus getInstance(const InstanceProvider& provider, const InstanceRequest& request);
CMPIStatus enumInstances(const InstanceProvider& provider, const InstanceRequest& request);
CMPIStatus enumInstanceNames(const InstanceProvider& provider, const InstanceRequest& request);

}  // namespace Tarn::CPUProvider

#endif
