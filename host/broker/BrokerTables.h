#ifndef CORVCIM_BROKER_TABLES_H
#define CORVCIM_BROKER_TABLES_H

#include <cmpift.h>

namespace Corvcim {

/// The four tables of every broker of this host. All slots are filled.
extern const CMPIBrokerFT brokerOperations;   ///< up-calls into other providers
extern const CMPIBrokerEncFT objectServices;  ///< making objects
extern const CMPIBrokerExtFT threadServices;  ///< threads, mutexes, conditions
extern const CMPIBrokerMemFT memoryServices;  ///< memory that lives as long as the request

}  // namespace Corvcim

#endif
