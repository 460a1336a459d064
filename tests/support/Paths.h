#ifndef TESTS_SUPPORT_PATHS_H
#define TESTS_SUPPORT_PATHS_H

#include <string>

#include "host/broker/Instance.h"

/// Object paths as clients write them and as the library answers them.
namespace Support {

inline const std::string testNameSpace = "root/test";

Corvcim::NamedValue textKey(const std::string& name, const std::string& value);

/// A path without keys or host in the test's namespace.
Corvcim::ObjectPath classPath(const std::string& className);

// Paths as the library hands them out, with the host name of the scripted system.

Corvcim::ObjectPath processorPath(const std::string& deviceId);
Corvcim::ObjectPath cachePath(const std::string& deviceId);
Corvcim::ObjectPath corePath(const std::string& instanceId);
/// Of the processor with that DeviceID.
Corvcim::ObjectPath capabilitiesPath(const std::string& deviceId);
Corvcim::ObjectPath associationPath(const std::string& className, const std::string& firstEnd,
                                    const Corvcim::ObjectPath& first, const std::string& secondEnd,
                                    const Corvcim::ObjectPath& second);

/// As the provider of computer systems answers it: without host name.
Corvcim::ObjectPath systemPath(const std::string& name);
Corvcim::Instance systemInstance(const std::string& name);

/// The same object as a client may name it: another host, or no namespace.
Corvcim::ObjectPath withHost(Corvcim::ObjectPath path, const std::string& host);
Corvcim::ObjectPath withoutNameSpace(Corvcim::ObjectPath path);

}  // namespace Support

#endif
