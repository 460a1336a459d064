#ifndef TARN_BROKERGUARD_H
#define TARN_BROKERGUARD_H

#include <CmpiObjects.h>

#ifdef CORVANE_BROKER_GUARD
#include <cxxabi.h>

#include <exception>
#include <mutex>
#endif

/// What stands between the broker and the library.
///
/// The library itself locks nothing and catches nothing at its entries. Brokers that run requests in
/// parallel, or lose a worker to an escaped exception, want a build with CORVANE_BROKER_GUARD: then one
/// request runs at a time, but for the time it waits for the broker, and an exception becomes
/// CMPI_RC_ERR_FAILED with its text.
namespace Tarn::CPUProvider {

#ifdef CORVANE_BROKER_GUARD

inline std::mutex brokerGuard;

/// Holds the library for as long as it lives.
using GuardLock = std::lock_guard<std::mutex>;

template <auto Operation, const auto& Provider>
struct Guarded;

template <class... Arguments, CMPIStatus (*Operation)(Arguments...), const auto& Provider>
struct Guarded<Operation, Provider> {
  static CMPIStatus call(Arguments... arguments) {
    const GuardLock lock(brokerGuard);
    CMPIStatus status = {CMPI_RC_OK, nullptr};
    try {
      return Operation(arguments...);
    } catch (const abi::__forced_unwind&) {
      throw;  // a cancelled thread has to unwind to its end
    } catch (const std::exception& error) {
      setFailure(Provider.broker, &status, error.what());
    } catch (...) {
      setFailure(Provider.broker, &status, "Unknown exception");
    }
    return status;
  }
};

/// An operation of the provider that `Provider` describes, behind the guard.
template <auto Operation, const auto& Provider>
inline constexpr auto guarded = &Guarded<Operation, Provider>::call;

/// Calls into the broker, which may run other requests of this library before it returns.
template <class Call>
auto upCall(Call call) {
  struct Released {
    Released() { brokerGuard.unlock(); }
    ~Released() { brokerGuard.lock(); }
    Released(const Released&) = delete;
    Released& operator=(const Released&) = delete;
  } const released;
  return call();
}

/// Stores the broker that a factory function was called with and hands back the file's interface.
template <class Interface>
Interface* registerBroker(const CMPIBroker*& broker, const CMPIBroker* caller, Interface& interface) {
  const GuardLock lock(brokerGuard);
  broker = caller;
  return &interface;
}

#else

template <auto Operation, const auto& Provider>
inline constexpr auto guarded = Operation;

template <class Call>
auto upCall(Call call) {
  return call();
}

template <class Interface>
Interface* registerBroker(const CMPIBroker*& broker, const CMPIBroker* caller, Interface& interface) {
  broker = caller;
  return &interface;
}

#endif

}  // namespace Tarn::CPUProvider

#endif
