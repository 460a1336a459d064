#ifndef HOST_CORVCIM_OPERATIONS_DIRECTENUMERATION_H
#define HOST_CORVCIM_OPERATIONS_DIRECTENUMERATION_H

#include <optional>

#include "host/broker/Operation.h"
#include "host/corvcim/operations/Libraries.h"
#include "schema/ClassTable.h"

namespace Corvcim {

/// The class that an operation can be asked about without a process for its provider: enumerations of
/// one class that is no association. Such a provider depends on nothing that was asked before and
/// calls nobody, so a process of its own would only cost time. nullptr for any other operation.
const ClassDefinition* directClass(const Operation& operation);

/// Enumerates in this process, in which the library stays loaded. Nothing where the libraries do not have the class. A
/// provider that crashes ends this program with exit status 1, after one line that says so on standard error.
std::optional<Response> enumerateDirectly(const LibraryFiles& files, const ClassDefinition& definition,
                                          const Operation& operation);

}  // namespace Corvcim

#endif
