#include "platform/inventory/sources/kernel/Machine.h"

#include <array>
#include <cerrno>
#include <utility>

namespace Tarn::Inventory {

namespace {

constexpr const char* cpuInfoFile = "proc/cpuinfo";
constexpr std::size_t longestValue = 24;  // in messages

std::string reasonOf(FileError error) {
  return error == 0 ? "it holds no usable value" : describeError(error);
}

std::string remedyOf(FileError error, const std::string& otherwise) {
  if (error == 0) {
    return "correct the file if it was captured; on a running machine the kernel is at fault";
  }
  return error == EACCES || error == EPERM ? "run as root, or let this process read it" : otherwise;
}

std::string attributeOf(unsigned int cpu, std::string_view suffix) {
  return std::string(kernelCpuDirectory) + "/cpu" + std::to_string(cpu) + '/' + std::string(suffix);
}

// "name: value", or of a field's words "name: word" or "name: without word".
std::string fieldText(const CpuInfo& info, unsigned int cpu, std::string_view field) {
  const std::size_t slash = field.find('/');
  const std::string name = CpuInfo::fieldName(cpu, field.substr(0, slash));
  const std::string value(info.field(cpu, name));
  if (slash == std::string_view::npos || value.empty()) {
    return name + ": " + (value.empty() ? "(not there)" : value);
  }
  const std::string word(field.substr(slash + 1));
  const bool has = (' ' + value + ' ').find(' ' + word + ' ') != std::string::npos;
  return name + ": " + (has ? "" : "without ") + word;
}

}  // namespace

Machine::Machine(FileSystem& root, Detail detail)
    : detail_(detail),
      recorder_(detail == Detail::WithOrigins ? std::make_unique<RecordingFileSystem>(root, record_) : nullptr),
      cpuDirectory_((recorder_ ? *recorder_ : root).below(kernelCpuDirectory)),
      root_(recorder_ ? *recorder_ : root),
      cpus_(*cpuDirectory_) {
  std::string text;
  if (const FileError error = root_.files().read(cpuInfoFile, text)) {
    noteUnread(root.nameOf(cpuInfoFile), error, "mount proc on /proc");
  }
  cpuInfo_ = CpuInfo(std::move(text));
  if (const std::optional<CpuInfo::Misfit>& misfit = cpuInfo_.misfit()) {
    unread_.add(root.nameOf(cpuInfoFile) + ", line " + std::to_string(misfit->line),
                "\"" + misfit->name + "\" is " + misfit->value.substr(0, longestValue) +
                    ", more than this number can be; it is not used",
                "correct the number if the file was captured; on a running machine the kernel is at fault");
  }
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

Origin Machine::originIn(const std::string& file, std::string rule) const {
  return {root_.files().nameOf(file), rawOf(file), std::move(rule)};
}

Origin Machine::originInCpuDirectory(std::string_view file, std::string rule) const {
  return originIn(std::string(kernelCpuDirectory) + '/' + std::string(file), std::move(rule));
}

Origin Machine::originOfCpu(unsigned int cpu, std::string_view suffix, std::string rule) const {
  return originIn(attributeOf(cpu, suffix), std::move(rule));
}

Origin Machine::originOfCpus(const CpuSet& cpus, std::span<const std::string_view> suffixes, std::string_view field,
                             std::string rule) const {
  const auto hasField = [&](unsigned int cpu) { return !cpuInfo_.field(cpu, field).empty(); };
  for (const std::string_view suffix : suffixes) {
    for (const unsigned int cpu : cpus) {
      if (!rawOf(attributeOf(cpu, suffix)).empty()) {
        return originOfCpu(cpu, suffix, std::move(rule));
      }
    }
  }
  return !field.empty() && hasField(cpus.first()) ? originInCpuInfo(cpus.first(), std::array{field}, std::move(rule))
                                                  : originOfCpu(cpus.first(), suffixes.front(), std::move(rule));
}

Origin Machine::originInCpuInfo(unsigned int cpu, std::span<const std::string_view> fields, std::string rule) const {
  std::string raw;
  for (const std::string_view field : fields) {
    raw += (raw.empty() ? "" : "; ") + fieldText(cpuInfo_, cpu, field);
  }
  return {root_.files().nameOf(cpuInfoFile) + ", processor " + std::to_string(cpu), std::move(raw), std::move(rule)};
}

std::string Machine::rawOf(const std::string& file) const {
  const auto found = record_.files.find(file);
  return found == record_.files.end() ? std::string() : std::string(Attributes::valueOf(found->second.contents));
}

}  // namespace Tarn::Inventory
