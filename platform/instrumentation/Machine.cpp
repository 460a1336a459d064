#include "platform/instrumentation/Machine.h"

#include <utility>

namespace Tarn::Inventory {

namespace {

constexpr const char* cpuInfoFile = "proc/cpuinfo";

std::string reasonOf(const Attributes& attributes) {
  return attributes.error() == 0 ? "it holds no usable value" : describeError(attributes.error());
}

}  // namespace

Machine::Machine(FileSystem& root)
    : cpuDirectory_(root.below("sys/devices/system/cpu")), root_(root), cpus_(*cpuDirectory_) {
  std::string text;
  if (const FileError error = root.read(cpuInfoFile, text)) {
    unread_.add(root.nameOf(cpuInfoFile), describeError(error), "mount proc on /proc, readable for this process");
  }
  cpuInfo_ = CpuInfo(std::move(text));
}

void Machine::noteUnread(const Attributes& attributes, std::string remedy) {
  unread_.add(attributes.fileName(), reasonOf(attributes), std::move(remedy));
}

void Machine::noteUnreadOfCpu(unsigned int cpu, const std::string& suffix, std::string remedy) {
  noteUnreadOfCpu(cpu, suffix, reasonOf(cpus_), std::move(remedy));
}

void Machine::noteUnreadOfCpu(unsigned int cpu, const std::string& suffix, std::string reason, std::string remedy) {
  unread_.addForCpu(cpuDirectory_->nameOf("cpu"), cpu, '/' + suffix, std::move(reason), std::move(remedy));
}

}  // namespace Tarn::Inventory
