#ifndef CORVCIM_DISPATCHER_H
#define CORVCIM_DISPATCHER_H

#include "host/broker/Operation.h"
#include "schema/ClassTable.h"

#include <map>
#include <memory>
#include <string>
#include <string_view>
#include <vector>

namespace Corvcim {

class ProviderProcess;

/// Files of provider libraries by base name ("corvcpuprofileprovider").
using LibraryFiles = std::map<std::string, std::string, std::less<>>;

/// A class whose provider did not answer an operation that went to several.
struct ClassFailure {
  std::string className;
  CMPIrc rc = CMPI_RC_ERR_FAILED;
  std::string message;

  friend bool operator==(const ClassFailure&, const ClassFailure&) = default;
};

/// How a message about a class that is not served ends: "did you mean HALDA_CPUMemory?", or the list of the classes
/// served. `onlyAssociations` leaves out all others.
[[nodiscard]] std::string suggestClasses(std::string_view name, bool onlyAssociations = false);

/// What all classes asked said together. The response holds everything that succeeded and is OK if
/// anything did; `failures` tells the rest. When nothing succeeded, the response is the first failure.
struct Answer {
  Response response;
  std::vector<ClassFailure> failures;
};

/// The host's operations by class name.
///
/// The class table says which library and provider serve a class. Each process group of the table
/// runs in a child process of its own, started on its first request and kept until the dispatcher
/// ends, as production brokers do: a group sees only its own state, and a provider that crashes ends
/// one operation with one clear error. Up-calls of providers come back here and are dispatched like
/// any request.
///
/// One thread at a time. Children inherit the environment at the time of their first request, so
/// selections that a library reads from there are made before.
class Dispatcher {
 public:
  /// A class whose library has no file here is answered with CMPI_RC_ERR_FAILED and a message that says so.
  explicit Dispatcher(LibraryFiles libraryFiles);
  ~Dispatcher();
  Dispatcher(const Dispatcher&) = delete;
  Dispatcher& operator=(const Dispatcher&) = delete;

  /// Instances of the class and of every class derived from it: "CIM_Processor" works as well.
  Answer enumerateInstances(const ObjectPath& classPath, const PropertyList& properties = {});
  Answer enumerateInstanceNames(const ObjectPath& classPath);

  /// Exactly one instance, else a failing status (CMPI_RC_ERR_NOT_FOUND for none).
  Answer getInstance(const ObjectPath& path, const PropertyList& properties = {});

  /// Without an association class (for references: result class) every association that the source's
  /// class takes part in is asked, else those that are the class named or derived from it. Providers
  /// get the exact name of their own class. Roles and result classes are tested here, by the class
  /// table, whatever providers do with them.
  Answer associators(const ObjectPath& source, const AssociationFilter& filter = {},
                     const PropertyList& properties = {});
  Answer associatorNames(const ObjectPath& source, const AssociationFilter& filter = {});
  Answer references(const ObjectPath& source, const AssociationFilter& filter = {},
                    const PropertyList& properties = {});
  Answer referenceNames(const ObjectPath& source, const AssociationFilter& filter = {});

  Answer perform(const Operation& operation);

  /// Sends the operation as it is to the providers that a broker would choose for it, and returns what they answer:
  /// nothing is completed, spelled or filtered here. Of an association operation these are the providers of the
  /// association classes that are the class named or derived from it, of all if there are none.
  Answer performAsIs(const Operation& operation);

 private:
  Answer performOnClasses(const Operation& operation);
  Answer performOnAssociations(const Operation& operation);
  Response performOn(const ClassDefinition& definition, const Operation& operation);
  Response upcall(const Operation& operation);

  LibraryFiles libraryFiles_;
  std::map<std::string_view, std::unique_ptr<ProviderProcess>> processes_;  ///< by group
  unsigned depth_ = 0;  ///< of operations in progress: an up-call nests
};

}  // namespace Corvcim

#endif
