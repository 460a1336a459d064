#ifndef CORVANE_PLATFORM_INVENTORY_SOURCES_LIVE_NODEPATHS_H
#define CORVANE_PLATFORM_INVENTORY_SOURCES_LIVE_NODEPATHS_H

#include <optional>
#include <string>
#include <vector>

#include "platform/inventory/sources/kernel/Caches.h"
#include "platform/inventory/sources/kernel/Topology.h"

namespace Tarn::Inventory {

/// The printable paths of what the kernel knows, from its own numbers, so that a part has the same path
/// on every boot, whatever else is read or not:
///
///     P1             processor package 1
///     P1.C4          its core 4
///     P1.D1.C4       core 4 of its die 1 (die 0 is not mentioned)
///     P1.K2.C4       core 4 of its cluster 2 (likewise), where cores are numbered by cluster
///     P1.L1d.4       its L1 data cache 4; L1i, L2, L3 likewise
///     P@8  P1.C@8  P1.L2@8   the one that CPU 8 is the lowest of, where the kernel has no number, one
///                    that is not unique, or a number so long that the path would be
std::string processorPath(const Package& package);

/// The paths of a package's cores, in their order.
std::vector<std::string> corePaths(const std::string& processor, const std::vector<Core>& cores);

/// The paths of a package's caches, in their order.
std::vector<std::string> cachePaths(const std::string& processor, const std::vector<const Cache*>& caches);

/// "L1d", "L1i", "L2", ...; "L2x" where the kernel does not tell what the cache holds.
std::string cacheName(unsigned int level, std::optional<CacheContents> contents);
std::string cacheName(const Cache& cache);

}  // namespace Tarn::Inventory

#endif
