#ifndef CORVANE_PLATFORM_BASE_ENVIRONMENT_H
#define CORVANE_PLATFORM_BASE_ENVIRONMENT_H

#include <optional>
#include <string>

namespace Tarn::Common {

/// The value of one of the documented environment overrides, such as "CORVANE_CONFIG".
///
/// Nothing when the variable is absent or empty, and always nothing in a process that runs with raised
/// privileges (set-user-id, set-group-id, file capabilities): there the environment belongs to the
/// caller, who must not choose which files a privileged process reads or writes.
std::optional<std::string> environmentOverride(const char* name);

}  // namespace Tarn::Common

#endif
