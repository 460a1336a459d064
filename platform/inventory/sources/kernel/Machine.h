#ifndef CORVANE_PLATFORM_INVENTORY_SOURCES_KERNEL_MACHINE_H
#define CORVANE_PLATFORM_INVENTORY_SOURCES_KERNEL_MACHINE_H

#include <memory>
#include <span>
#include <string>
#include <string_view>

#include "platform/inventory/sources/files/FileSystem.h"
#include "platform/inventory/sources/files/RecordingFileSystem.h"
#include "platform/inventory/sources/kernel/Attributes.h"
#include "platform/inventory/sources/kernel/CpuInfo.h"
#include "platform/inventory/tree/Tree.h"
#include "platform/inventory/tree/UnreadLog.h"

namespace Tarn::Inventory {

/// Where the kernel describes its CPUs, a path from the root on.
inline constexpr const char* kernelCpuDirectory = "sys/devices/system/cpu";

/// A machine as the live source reads it: its files, its /proc/cpuinfo, and the account of what could
/// not be read.
class Machine {
 public:
  /// With Detail::WithOrigins it keeps what is read, so that origins can show the raw data.
  explicit Machine(FileSystem& root, Detail detail = Detail::Values);
  Machine(const Machine&) = delete;
  Machine(Machine&&) = delete;
  Machine& operator=(const Machine&) = delete;
  Machine& operator=(Machine&&) = delete;
  ~Machine() = default;

  Detail detail() const { return detail_; }

  Attributes& root() { return root_; }  ///< paths from the root on
  Attributes& cpus() { return cpus_; }  ///< paths below kernelCpuDirectory
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

  /// The origin of a value that came from this file, a path from the root on.
  Origin originIn(const std::string& file, std::string rule) const;

  /// The same for a file of all CPUs, such as "online".
  Origin originInCpuDirectory(std::string_view file, std::string rule) const;

  /// The same for cpuN/`suffix`.
  Origin originOfCpu(unsigned int cpu, std::string_view suffix, std::string rule) const;

  /// The same for several CPUs of which one, with one of these suffixes, gave the value: the first that
  /// could be read, else that field of /proc/cpuinfo.
  Origin originOfCpus(const CpuSet& cpus, std::span<const std::string_view> suffixes, std::string_view field,
                      std::string rule) const;

  /// The origin of a value that came from these fields of the CPU's block in /proc/cpuinfo. "flags/lm"
  /// stands for whether the field flags has the word lm.
  Origin originInCpuInfo(unsigned int cpu, std::span<const std::string_view> fields, std::string rule) const;

 private:
  std::string rawOf(const std::string& file) const;

  Detail detail_;
  RecordingFileSystem::Record record_;  // empty unless origins are asked for
  std::unique_ptr<FileSystem> recorder_;
  std::unique_ptr<FileSystem> cpuDirectory_;
  Attributes root_;
  Attributes cpus_;
  CpuInfo cpuInfo_;
  UnreadLog unread_;
};

}  // namespace Tarn::Inventory

#endif
