#include "platform/inventory/sources/snapshot/Masking.h"

#include <algorithm>
#include <array>
#include <string_view>

#include "platform/base/Ascii.h"
#include "platform/inventory/sources/kernel/SystemModel.h"
#include "platform/inventory/sources/snapshot/SmbiosMask.h"

namespace Tarn::Inventory {

namespace {

constexpr std::string_view entryPointPath = "sys/firmware/dmi/tables/smbios_entry_point";
constexpr std::string_view tablePath = "sys/firmware/dmi/tables/DMI";
constexpr std::string_view cpuInfoPath = "proc/cpuinfo";

// The kernel's texts of the firmware tables, by file. What is not listed identifies the machine, or its
// name is new and nobody knows; modalias and uevent repeat the others.
constexpr std::string_view dmiDirectory = "sys/class/dmi/id/";
constexpr std::array dmiOfTheKind = {
    std::string_view("bios_date"),       std::string_view("bios_release"),        std::string_view("bios_vendor"),
    std::string_view("bios_version"),    std::string_view("board_name"),          std::string_view("board_vendor"),
    std::string_view("board_version"),   std::string_view("chassis_type"),        std::string_view("chassis_vendor"),
    std::string_view("chassis_version"), std::string_view("ec_firmware_release"), std::string_view("product_family"),
    std::string_view("product_name"),    std::string_view("product_version"),     std::string_view("sys_vendor"),
};
static_assert(std::ranges::is_sorted(dmiOfTheKind));

// Other files that hold nothing but an identifier, by how their paths end.
constexpr std::array identifierFiles = {
    std::string_view("/ppin"),  // beside a processor's topology: its inventory number
    std::string_view("/serial-number"),
    std::string_view("proc/sys/kernel/hostname"),
    std::string_view("sys/hypervisor/uuid"),
};

// Values in /proc/cpuinfo, by what stands before them on the line.
struct CpuInfoValue {
  std::string_view name;
  std::string_view begin;  ///< how its line begins
  std::string_view mark;   ///< what the value follows
  std::string_view end;    ///< what follows the value; empty: the line's end
};
constexpr std::array cpuInfoValues = {
    CpuInfoValue{"Serial", "Serial", ":", ""},                              // Arm
    CpuInfoValue{"identification", "processor ", "identification =", ","},  // s390: the machine's
    CpuInfoValue{"identification", "identification", ":", ""},              // the same of newer kernels
};

// Replaces every character but the blanks; false where there is nothing that identifies: nothing at all,
// zeros, or a mask.
bool maskText(std::string& contents, std::size_t begin, std::size_t length) {
  const auto isBlank = [](char c) { return c == ' ' || c == '\t' || c == '\n' || c == '\r' || c == '\0'; };
  const std::string_view text = std::string_view(contents).substr(begin, length);
  const bool isEmpty = std::ranges::all_of(text, [&](char c) { return isBlank(c) || c == '0' || c == 'X'; });
  if (isEmpty || isPlaceholder(Common::trimmed(text.substr(0, text.find('\n'))))) {
    return false;
  }
  for (std::size_t i = begin; i < begin + text.size(); ++i) {
    contents[i] = isBlank(contents[i]) ? contents[i] : 'X';
  }
  return true;
}

bool identifies(std::string_view path) {
  if (path.starts_with(dmiDirectory)) {
    return !std::ranges::binary_search(dmiOfTheKind, path.substr(dmiDirectory.size()));
  }
  return std::ranges::any_of(identifierFiles, [path](std::string_view ending) { return path.ends_with(ending); });
}

bool maskInLine(std::string& contents, std::size_t begin, std::size_t end, const CpuInfoValue& value) {
  const std::string_view line = std::string_view(contents).substr(begin, end - begin);
  const std::size_t mark = line.starts_with(value.begin) ? line.find(value.mark) : std::string_view::npos;
  if (mark == std::string_view::npos) {
    return false;
  }
  const std::size_t from = mark + value.mark.size();
  const std::size_t to = value.end.empty() ? line.size() : std::min(line.find(value.end, from), line.size());
  return maskText(contents, begin + from, to - from);
}

void maskCpuInfo(std::string& contents, std::vector<std::string>& notes) {
  for (const CpuInfoValue& value : cpuInfoValues) {
    bool any = false;
    for (std::size_t begin = 0; begin < contents.size();) {
      const std::size_t end = std::min(contents.find('\n', begin), contents.size());
      any = maskInLine(contents, begin, end, value) || any;
      begin = end + 1;
    }
    if (any) {
      notes.emplace_back(cpuInfoPath).append(": ").append(value.name);
    }
  }
}

}  // namespace

std::vector<std::string> maskIdentifiers(MemoryFileSystem::Files& files) {
  std::vector<std::string> notes;
  for (auto& [path, entry] : files) {
    if (path == cpuInfoPath) {
      maskCpuInfo(entry.contents, notes);
    } else if (path == tablePath) {
      const auto entryPoint = files.find(entryPointPath);
      const std::string_view bytes = entryPoint == files.end() ? std::string_view() : entryPoint->second.contents;
      for (const std::string& note : maskTable(bytes, entry.contents)) {
        notes.emplace_back(path).append(": ").append(note);
      }
    } else if (identifies(path) && maskText(entry.contents, 0, entry.contents.size())) {
      notes.push_back(path);
    }
  }
  return notes;
}

}  // namespace Tarn::Inventory
