#ifndef TESTS_HOST_CORVCIM_EXPECTED_H
#define TESTS_HOST_CORVCIM_EXPECTED_H

#include <string>

#include "tests/host/corvcim/Program.h"

namespace Corvcim::Testing {

// What the built program is expected to print.

/// What the libraries call a machine whose inventory has no name.
std::string host();

/// The name of this machine, as the libraries have it for the live inventory.
std::string thisHost();

/// The object path of a part, by its path in the inventory.
std::string processorPath(const std::string& identifier);
std::string cachePath(const std::string& identifier);
std::string corePath(const std::string& identifier);

/// The object path of the computer system with this name.
std::string systemPath(const std::string& name = host());

/// A run that printed the output, and nothing to standard error.
Finished success(const std::string& output);

/// A run that failed with that one line, and printed nothing else.
Finished failed(const std::string& error);

}  // namespace Corvcim::Testing

#endif
