// Requests to the finished library on a null broker, against the same broker calls with constant
// arguments and, where the library has to collect anew, the same records filled from constants.

#include <CPUClassNames.h>

#include <functional>
#include <string>
#include <utility>

#include "bench/LoadedProduct.h"
#include "bench/LogFloors.h"
#include "bench/RecordFilling.h"
#include "bench/Rows.h"

namespace Corvane::Bench {
namespace {

using namespace Tarn::CPUProvider;

/// How often a request collects each kind anew.
struct Collections {
  std::size_t processors = 0;
  std::size_t cores = 0;
  std::size_t caches = 0;
};

/// Adds the row of a request: makes it once, checks how much it returned, and takes its broker calls as the
/// floor, with what else has to be done.
void addRequestRow(
    const Row& row, const std::function<CMPIStatus()>& request, std::size_t results, const MachineSize& machine,
    const Collections& collections, const std::function<void()>& besides = [] {}) {
  if (!selected(row.name)) {
    return;
  }
  const auto operation = [request] {
    NullBroker::beginRequest();
    request();
  };
  operation();  // collects what is collected once
  operation();
  const NullBroker::Calls calls = NullBroker::calls();
  require(calls[NullBroker::ReturnInstance] == results, row.name.c_str(), "returns the expected number of instances");

  addRow(row, operation, [=] {
    NullBroker::beginRequest();
    fillProcessors(machine, collections.processors);
    fillCores(machine, collections.cores);
    fillCaches(machine, collections.caches);
    NullBroker::repeat(calls);
    besides();
  });
}

/// Two rows of one request. Against its broker calls alone, which cost next to nothing on a null broker; and
/// against these with the texts of the log events that every instance has.
void addProcessorRows() {
  const Row row{"EnumInstances of HALDA_CPUProcessor, warm, 64 processors", 2.2};
  const Row withLog{row.name + ", log events in the floor", 2.2};
  if (!selected(row.name) && !selected(withLog.name)) {
    return;
  }
  constexpr MachineSize machine{64, 1};
  CMPIInstanceMI* mi = LoadedProduct(makeMachine(machine)).instances("CPUProcessorProvider");
  const CMPIObjectPath* path = NullBroker::requestPath(cpuProcessorClass, nullptr);
  const auto request = [=] {
    return mi->ft->enumerateInstances(mi, NullBroker::context(), NullBroker::result(), path, nullptr);
  };
  addRequestRow(row, request, machine.processors, machine, {});
  addRequestRow(withLog, request, machine.processors, machine, {}, [path] {
    for (std::size_t i = 0; i < machine.processors; ++i) {
      formatEntryTwice("makeCPUProcInstance", "CPUObjFactory.cpp", 76, path);
      formatTwice("VARIABLE: '%s' has Value '%s' at line %u in %s", "name", "Bench CPU", 76U, "CPUObjFactory.cpp");
      formatEntryTwice("makeCPUProcInstance", "CPUObjFactory.cpp", 82, path);
    }
  });
}

/// An association as it is measured: all of it, and from one element to those related to it.
struct Association {
  const char* className;
  const char* provider;
  const char* source;  ///< class of the element that the navigation starts from
  std::string (*sourcePath)();

  /// What each request returns and collects, by the machine.
  std::pair<std::size_t, Collections> (*enumeration)(const MachineSize&);
  std::pair<std::size_t, Collections> (*navigation)(const MachineSize&);
};

std::string firstProcessor() {
  return processorPath(0);
}
std::string firstCore() {
  return corePath(0, 0);
}
std::string firstProcessorInstance() {
  return "NERITH:" + processorPath(0);
}

using Expected = std::pair<std::size_t, Collections>;

constexpr Association associations[] = {
    {cpuAssociatedCacheMemoryClass, "CPUAssociatedCacheMemoryProvider", cpuProcessorClass, firstProcessor,
     [](const MachineSize& m) -> Expected {
       return {m.caches(), {.processors = m.caches()}};
     },
     [](const MachineSize& m) -> Expected {
       return {m.cachesEach(), {.caches = m.cachesEach()}};
     }},
    {cpuCoreAssociatedCacheMemoryClass, "CPUCoreAssociatedCacheMemoryProvider", cpuProcessorCoreClass, firstCore,
     [](const MachineSize& m) -> Expected {
       return {m.cores() * m.cachesEach(), {.processors = m.cores(), .caches = m.cores() * m.cachesEach()}};
     },
     [](const MachineSize& m) -> Expected {
       return {m.cachesEach(), {.processors = 1, .caches = m.cachesEach()}};
     }},
    {cpuSystemDeviceClass, "CPUSystemDeviceProvider", computerSystemClass, firstProcessor,
     [](const MachineSize& m) -> Expected {
       return {m.processors, {}};
     },
     [](const MachineSize& m) -> Expected {
       return {m.processors, {}};
     }},
    {cpuElementCapClass, "CPUElementCapabilitiesProvider", cpuProcessorCapClass, firstProcessorInstance,
     [](const MachineSize& m) -> Expected {
       return {m.processors, {}};
     },
     [](const MachineSize&) -> Expected {
       return {1, {}};
     }},
    {cpuConcreteComponentClass, "CPUConcreteComponentProvider", cpuProcessorClass, firstProcessor,
     [](const MachineSize& m) -> Expected {
       return {m.cores(), {.cores = m.cores()}};
     },
     [](const MachineSize& m) -> Expected {
       return {m.coresEach, {.cores = m.coresEach}};
     }},
};

constexpr MachineSize machines[] = {{2, 4}, {2, 16}, {2, 64}};

/// The row "NAME, 32 cores", whose growth is against the machine before.
Row rowFor(const std::string& name, std::size_t machine) {
  const auto named = [&](const MachineSize& size) { return name + ", " + std::to_string(size.cores()) + " cores"; };
  Row row{named(machines[machine])};
  if (machine > 0) {
    row.smaller = named(machines[machine - 1]);
  }
  return row;
}

void addAssociationRows(const Association& association) {
  const CMPIObjectPath* classPath = NullBroker::requestPath(association.className, nullptr);
  const CMPIObjectPath* sourcePath = NullBroker::requestPath(association.source, association.sourcePath().c_str());

  for (std::size_t index = 0; index < std::size(machines); ++index) {
    const MachineSize& machine = machines[index];
    Row enumeration = rowFor("EnumInstances of " + std::string(association.className), index);
    const Row navigation = rowFor("Associators through " + std::string(association.className), index);
    if (!selected(enumeration.name) && !selected(navigation.name)) {
      continue;
    }
    if (association.className == cpuCoreAssociatedCacheMemoryClass && machine.cores() == 128) {
      enumeration.limit = 1.5;
      enumeration.slow = true;
    }
    const LoadedProduct product(makeMachine(machine));

    CMPIInstanceMI* elements = product.instances(association.provider);
    const auto enumerate = [=] {
      return elements->ft->enumerateInstances(elements, NullBroker::context(), NullBroker::result(), classPath,
                                              nullptr);
    };
    const auto [enumerated, walks] = association.enumeration(machine);
    addRequestRow(enumeration, enumerate, enumerated, machine, walks);

    CMPIAssociationMI* links = product.associations(association.provider);
    const auto navigate = [=] {
      return links->ft->associators(links, NullBroker::context(), NullBroker::result(), sourcePath,
                                    association.className, nullptr, nullptr, nullptr, nullptr);
    };
    const auto [related, queries] = association.navigation(machine);
    addRequestRow(navigation, navigate, related, machine, queries);
  }
}

}  // namespace

void addProviderRows() {
  addProcessorRows();
  for (const Association& association : associations) {
    addAssociationRows(association);
  }
}

}  // namespace Corvane::Bench
