#ifndef CORVANE_PLATFORM_INSTRUMENTATION_MACHINE_H
#define CORVANE_PLATFORM_INSTRUMENTATION_MACHINE_H

#include <memory>
#include <string>

#include "platform/instrumentation/Attributes.h"
#include "platform/instrumentation/CpuInfo.h"
#include "platform/instrumentation/FileSystem.h"
#include "platform/instrumentation/UnreadLog.h"

namespace Tarn::Inventory {

/// A machine as the live source reads it: its files, its /proc/cpuinfo, and the account of what could
/// not be read.
class Machine {
 public:
  explicit Machine(FileSystem& root);

  Attributes& root() { return root_; }  ///< paths from the root on
  Attributes& cpus() { return cpus_; }  ///< paths below sys/devices/system/cpu
  const CpuInfo& cpuInfo() const { return cpuInfo_; }
  UnreadLog& unread() { return unread_; }

  /// Notes that a file could not be read. The remedy is for a file that is not there or not usable; for
  /// one that this process may not read there is only one.
  void noteUnread(const std::string& file, FileError error, const std::string& remedy);

  /// Notes that what stands at cpuN/`suffix` could not be read, for the reason of the last call to cpus().
  void noteUnreadOfCpu(unsigned int cpu, const std::string& suffix, const std::string& remedy);

  /// As above, for another reason.
  void noteUnreadOfCpu(unsigned int cpu, const std::string& suffix, const std::string& reason,
                       const std::string& remedy);

 private:
  std::unique_ptr<FileSystem> cpuDirectory_;
  Attributes root_;
  Attributes cpus_;
  CpuInfo cpuInfo_;
  UnreadLog unread_;
};

}  // namespace Tarn::Inventory

#endif
