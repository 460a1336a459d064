#include "platform/instrumentation/Machine.h"

#include <cerrno>
#include <utility>

namespace Tarn::Inventory {

namespace {

constexpr const char* cpuInfoFile = "proc/cpuinfo";

std::string reasonOf(FileError error) {
  return error == 0 ? "it holds no usable value" : describeError(error);
}

std::string remedyOf(FileError error, const std::string& otherwise) {
  return error == EACCES || error == EPERM ? "run as root, or let this process read it" : otherwise;
}

}  // namespace

Machine::Machine(FileSystem& root)
    : cpuDirectory_(root.below("sys/devices/system/cpu")), root_(root), cpus_(*cpuDirectory_) {
  std::string text;
  if (const FileError error = root.read(cpuInfoFile, text)) {
    noteUnread(root.nameOf(cpuInfoFile), error, "mount proc on /proc");
  }
  cpuInfo_ = CpuInfo(std::move(text));
}

void Machine::noteUnread(const std::string& file, FileError error, const std::string& remedy) {
  unread_.add(file, reasonOf(error), remedyOf(error, remedy));
}

void Machine::noteUnreadOfCpu(unsigned int cpu, const std::string& suffix, const std::string& remedy) {
  noteUnreadOfCpu(cpu, suffix, reasonOf(cpus_.error()), remedyOf(cpus_.error(), remedy));
}

void Machine::noteUnreadOfCpu(unsigned int cpu, const std::string& suffix, const std::string& reason,
                              const std::string& remedy) {
  unread_.addForCpu(cpuDirectory_->nameOf("cpu"), cpu, '/' + suffix, reason, remedy);
}

}  // namespace Tarn::Inventory
