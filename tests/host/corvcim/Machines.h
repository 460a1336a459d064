#ifndef TESTS_HOST_CORVCIM_MACHINES_H
#define TESTS_HOST_CORVCIM_MACHINES_H

#include "platform/inventory/tree/Tree.h"

namespace Corvcim::Testing {

// Inventories of machines that look like real ones.

/// A desk machine: one processor with two cores, private L1 and L2, a shared L3.
Tarn::Inventory::Tree twoCoreMachine();

/// Two processors with 64 cores and 128 threads each; every 8 cores share an L3.
Tarn::Inventory::Tree dualSocketServer();

/// Two processors with four cores; the first lies in the NUMA nodes 0 and 1, of which each has an L3, the second in 2.
Tarn::Inventory::Tree numaServer();

/// Two big cores with two threads each, and four small ones that share an L2.
Tarn::Inventory::Tree hybridLaptop();

/// Four cores of which one is offline, a cache of which nobody says who shares it, and an empty socket.
Tarn::Inventory::Tree smallBoard();

/// A machine whose model says that it is virtual.
Tarn::Inventory::Tree virtualMachine();

/// One core, no caches, and texts with quotes, line ends, escape sequences and markup in them.
Tarn::Inventory::Tree strangeTexts();

}  // namespace Corvcim::Testing

#endif
