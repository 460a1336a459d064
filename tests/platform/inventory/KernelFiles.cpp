#include "tests/platform/inventory/KernelFiles.h"

#include <stdexcept>

#include "platform/inventory/sources/firmware/FirmwareTables.h"
#include "platform/inventory/sources/live/LiveSource.h"
#include "platform/inventory/tree/PathForms.h"

namespace Tarn::Inventory {

namespace {

std::string directoryOf(unsigned int cpu) {
  return cpuDirectory + "cpu" + std::to_string(cpu) + '/';
}

std::string textOf(std::optional<int> number) {
  return number ? std::to_string(*number) : std::string();
}

}  // namespace

KernelFiles::KernelFiles() {
  Support::SmbiosEncoder nothing;
  nothing.end();
  firmware(nothing);
}

KernelFiles& KernelFiles::cpus(const std::string& list) {
  return file(cpuDirectory + "present", list + '\n').online(list);
}

KernelFiles& KernelFiles::online(const std::string& list) {
  return file(cpuDirectory + "online", list + '\n');
}

KernelFiles& KernelFiles::cpu(unsigned int number, const Cpu& cpu) {
  const std::string directory = directoryOf(number) + "topology/";
  attribute(directory + "physical_package_id", textOf(cpu.package));
  attribute(directory + "core_id", textOf(cpu.core));
  attribute(directory + "die_id", textOf(cpu.die));
  attribute(directory + "cluster_id", textOf(cpu.cluster));
  attribute(directory + "thread_siblings_list", cpu.siblings);
  attribute(directory + "core_siblings_list", cpu.packageSiblings);
  return *this;
}

KernelFiles& KernelFiles::cache(unsigned int cpu, unsigned int index, const Cache& cache) {
  const std::string directory = directoryOf(cpu) + "cache/index" + std::to_string(index) + '/';
  attribute(directory + "level", std::to_string(cache.level));
  attribute(directory + "type", cache.type);
  attribute(directory + "shared_cpu_list", cache.cpus);
  attribute(directory + "id", cache.id);
  attribute(directory + "size", cache.size);
  attribute(directory + "coherency_line_size", cache.lineSize);
  attribute(directory + "number_of_sets", cache.sets);
  attribute(directory + "ways_of_associativity", cache.ways);
  attribute(directory + "write_policy", cache.writePolicy);
  return *this;
}

KernelFiles& KernelFiles::maxFrequency(unsigned int cpu, const std::string& kilohertz) {
  return file(directoryOf(cpu) + "cpufreq/cpuinfo_max_freq", kilohertz + '\n');
}

KernelFiles& KernelFiles::x86Block(unsigned int cpu, const std::string& name) {
  cpuInfo_ += "processor\t: " + std::to_string(cpu) +
              "\nvendor_id\t: GenuineIntel\ncpu family\t: 6\nmodel\t\t: 85\nmodel name\t: " + name +
              "\nstepping\t: 7\ncpu MHz\t\t: 2100.000\nflags\t\t: fpu sse2 lm\n\n";
  return file("proc/cpuinfo", cpuInfo_);
}

KernelFiles& KernelFiles::firmware(const Support::SmbiosEncoder& tables) {
  return file(entryPointFile, tables.entryPoint()).file(tableFile, tables.table());
}

KernelFiles& KernelFiles::file(const std::string& path, const std::string& contents) {
  files_[path] = {contents, 0};
  return *this;
}

KernelFiles& KernelFiles::fail(const std::string& path, FileError error) {
  files_[path] = {"", error};
  return *this;
}

KernelFiles& KernelFiles::remove(const std::string& prefix) {
  std::erase_if(files_, [&prefix](const auto& file) { return file.first.starts_with(prefix); });
  return *this;
}

Tree KernelFiles::tree() const {
  MemoryFileSystem root(files_);
  return readLiveInventory(root);
}

void KernelFiles::attribute(const std::string& path, const std::string& value) {
  if (!value.empty()) {
    file(path, value + '\n');
  }
}

std::vector<std::string> pathsOf(const Tree& tree, NodeLexicon::NodeType type) {
  std::vector<std::string> paths;
  for (const NodeIndex index : tree.ofType(type)) {
    paths.emplace_back(tree.node(index).path());
  }
  return paths;
}

const Node& nodeAt(const Tree& tree, const std::string& path) {
  const NodeIndex index = tree.find(toInternalPath(path));
  if (index == noNode) {
    throw std::out_of_range("no node " + path);
  }
  return tree.node(index);
}

std::optional<unsigned int> numberAt(const Tree& tree, const std::string& path, NodeLexicon::Properties id) {
  const unsigned int* value = tree.number(nodeAt(tree, path), id);
  return value == nullptr ? std::nullopt : std::optional(*value);
}

std::optional<std::string> textAt(const Tree& tree, const std::string& path, NodeLexicon::Properties id) {
  const std::string* value = tree.text(nodeAt(tree, path), id);
  return value == nullptr ? std::nullopt : std::optional(*value);
}

}  // namespace Tarn::Inventory
