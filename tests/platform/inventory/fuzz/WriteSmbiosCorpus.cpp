// write_smbios_corpus DIRECTORY: writes the seeds of the SMBIOS fuzzer, one dump for each kind of table.

#include <cstdio>
#include <fstream>
#include <span>
#include <string>
#include <utility>

#include "tests/support/SmbiosEncoder.h"

namespace {

using namespace Support;

SmbiosEncoder machineOf(unsigned int majorNumber, unsigned int minorNumber,
                        std::optional<SmbiosEncoder::EntryPoint> kind = {}) {
  SmbiosEncoder encoder(majorNumber, minorNumber, kind);
  encoder.add(SmbiosSystem{});
  const std::uint16_t cache = encoder.add(SmbiosCache{});
  encoder.add(SmbiosProcessor{.caches = {cache, 0xFFFF, 0xFFFF}});
  encoder.add(emptySocket("CPU 2"));
  encoder.end();
  return encoder;
}

SmbiosEncoder machineOfSecondFields() {
  SmbiosEncoder encoder(3, 7);
  encoder.add(SmbiosCache{.maximumKiB = 4ULL << 20, .installedKiB = 4ULL << 20});
  encoder.add(SmbiosProcessor{.family = 0x101, .cores = 512, .coresEnabled = 510, .threads = 1024});
  encoder.end();
  return encoder;
}

SmbiosEncoder machineOfInactive() {
  SmbiosEncoder encoder(2, 8);
  encoder.add(SmbiosOther{.type = 126, .fields = "was", .strings = {"a processor"}});
  encoder.end();
  encoder.add(SmbiosProcessor{});
  return encoder;
}

/// A structure's length byte and the bytes around it, as broken firmware has them.
std::string broken(std::size_t offset, char byte) {
  std::string dump = machineOf(3, 4).dump();
  dump[32 + offset] = byte;
  return dump;
}

}  // namespace

int main(int argc, char** argv) {
  const std::span<char*> arguments(argv, static_cast<std::size_t>(argc));
  if (argc != 2) {
    std::fprintf(stderr, "usage: %s DIRECTORY\n", arguments[0]);
    return 2;
  }
  const std::pair<const char*, std::string> seeds[] = {
      {"legacy-2.0", machineOf(2, 0, SmbiosEncoder::EntryPoint::Legacy).dump()},
      {"version-2.1", machineOf(2, 1).dump()},
      {"version-2.3", machineOf(2, 3).dump()},
      {"version-2.5", machineOf(2, 5).dump()},
      {"version-2.8", machineOf(2, 8).dump()},
      {"version-3.0", machineOf(3, 0).dump()},
      {"version-3.7", machineOf(3, 7).dump()},
      {"second-fields", machineOfSecondFields().dump()},
      {"inactive", machineOfInactive().dump()},
      {"zero-length", broken(1, '\0')},
      {"too-long", broken(1, '\xff')},
      {"cut", machineOf(3, 4).dump().substr(0, 150)},
      {"table-only", machineOf(3, 4).table()},
  };
  for (const auto& [name, bytes] : seeds) {
    std::ofstream file(std::string(arguments[1]) + '/' + name, std::ios::binary);
    file << bytes;
    if (!file.flush()) {
      std::fprintf(stderr, "cannot write %s/%s\n", arguments[1], name);
      return 1;
    }
  }
}
