#ifndef HOST_CLI_USAGE_H
#define HOST_CLI_USAGE_H

#include <string>

#include "host/cli/Verbs.h"

namespace Corvcim {

/// The program's help: verbs, options, exit status, examples.
std::string programHelp();

/// The help of one verb.
std::string verbHelp(const VerbSyntax& verb);

/// The program's name and version.
std::string versionText();

}  // namespace Corvcim

#endif
