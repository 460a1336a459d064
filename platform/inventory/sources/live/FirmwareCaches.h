#ifndef CORVANE_PLATFORM_INVENTORY_SOURCES_LIVE_FIRMWARECACHES_H
#define CORVANE_PLATFORM_INVENTORY_SOURCES_LIVE_FIRMWARECACHES_H

#include <optional>
#include <string>
#include <vector>

#include "platform/inventory/sources/firmware/Socket.h"
#include "platform/inventory/sources/kernel/Caches.h"
#include "platform/inventory/sources/smbios/Tables.h"
#include "platform/inventory/tree/Facts.h"
#include "platform/inventory/tree/Tree.h"
#include "platform/inventory/tree/TreeBuilder.h"

namespace Tarn::Inventory {

/// A cache as the firmware describes it. It can stand for the caches of all cores of a processor, with
/// their sizes added up; which cores share what it does not tell.
struct FirmwareCache {
  const Smbios::Cache* structure = nullptr;
  unsigned int level = 0;
  std::optional<CacheContents> contents;
};

/// The caches of the processor in the socket: those that its structure names, that are in the table, and
/// that are installed.
std::vector<FirmwareCache> cachesOf(const Socket& socket, const Smbios::Tables& tables);

/// The one of these that tells of the kernel's cache; nullptr where none does.
const FirmwareCache* findTwin(const std::vector<FirmwareCache>& caches, const Cache& cache);

/// The inventory's codes for what the structure says; absent where it does not, or has no code.
std::optional<unsigned int> writePolicyCode(const Smbios::Cache& cache);
std::optional<unsigned int> associativityCode(const Smbios::Cache& cache);

/// How these codes come about, for people.
inline constexpr const char* writePolicyRule =
    "bits 8 and 9: write-through, 0, is 2; write-back, 1, is 1; varying, 2, is 3";
inline constexpr const char* associativityRule =
    "direct-mapped, 3, is 1; fully associative, 6, is 2; 2 ways are 3, 4 are 4, 8 are 5, 16 are 6";

/// Puts the caches below the processor that was added last, for where the kernel shows none. Their paths
/// are the processor's with the cache's name: "P0.L2"; a second one of that name has its handle after it.
/// `offline` says that none of the processor's CPUs is online, and so its caches are offline as well; it is empty
/// where one is online, and where the kernel shows no CPUs.
void addFirmwareCaches(TreeBuilder& tree, const std::vector<FirmwareCache>& caches, const std::string& processor,
                       const Facts::Explain& offline);

/// Compares the firmware's caches of a processor with those that the kernel shows of it, one at least.
/// `cpuFiles` are the files below sys/devices/system/cpu.
void compareCaches(const std::vector<FirmwareCache>& firmware, const std::vector<const Cache*>& kernel,
                   const FileSystem& cpuFiles, const std::string& processor, std::vector<Disagreement>& disagreements);

}  // namespace Tarn::Inventory

#endif
