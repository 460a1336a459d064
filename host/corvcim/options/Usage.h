#ifndef HOST_CORVCIM_OPTIONS_USAGE_H
#define HOST_CORVCIM_OPTIONS_USAGE_H

#include <string>

#include "host/corvcim/options/Verbs.h"

namespace Corvcim {

/// The program's help: verbs, options, exit status, examples.
std::string programHelp();

/// The help of one verb.
std::string verbHelp(const VerbSyntax& verb);

/// The program's name and version.
std::string versionText();

}  // namespace Corvcim

#endif
