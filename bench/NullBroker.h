#ifndef CORVANE_BENCH_NULLBROKER_H
#define CORVANE_BENCH_NULLBROKER_H

#include <cmpidt.h>
#include <cmpift.h>

#include <array>
#include <cstddef>

/// A CMPI broker that costs next to nothing: each service counts its call and returns an object that
/// was there before. What a provider operation takes here is the provider's own time.
///
/// A path remembers its class and its identifying key ("DeviceID" or "InstanceID"), and a new string its
/// text, because association providers read them back; nothing else is kept. Not for more than one thread.
namespace Corvane::Bench::NullBroker {

enum Service : std::size_t {
  NewObjectPath,
  NewInstance,
  NewArray,
  NewString,
  GetNameSpace,
  SetNameSpace,
  SetHostname,
  GetClassName,
  AddKey,
  AddIdentifier,  ///< AddKey of the key that is remembered
  GetKey,
  GetKeyCount,
  SetProperty,
  SetIdentifier,  ///< SetProperty of the key that is remembered
  SetPropertyFilter,
  GetObjectPath,
  GetCharPtr,
  SetElement,
  EnumerateInstances,
  EnumerateInstanceNames,
  HasNext,
  GetNext,
  ReturnInstance,
  ReturnObjectPath,
  ReturnDone,
  ServiceCount
};

/// Number of calls by service.
using Calls = std::array<std::size_t, ServiceCount>;

const CMPIBroker* broker();
const CMPIContext* context();
const CMPIResult* result();

/// A path for a request, valid until the process ends.
/// `identifier` is the value of its one key, nullptr for a path without keys; `className` is kept by address.
const CMPIObjectPath* requestPath(const char* className, const char* identifier);

/// Begins a request: the objects of the one before are used again, and counting starts at zero.
void beginRequest();

/// The calls since the request began.
const Calls& calls();

/// Makes the same calls, each with constant arguments and the same number of objects: what they cost alone.
void repeat(const Calls& calls);

}  // namespace Corvane::Bench::NullBroker

#endif
