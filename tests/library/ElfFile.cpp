#include "tests/library/ElfFile.h"

#include <elf.h>
#include <link.h>

#include <cstring>
#include <filesystem>
#include <fstream>
#include <stdexcept>

namespace Library {

namespace {

/// The file's bytes, read as its structures; what lies outside of it is refused.
class Bytes {
 public:
  explicit Bytes(const std::string& path) {
    bytes_.resize(static_cast<std::size_t>(std::filesystem::file_size(path)));
    std::ifstream(path, std::ios::binary).read(bytes_.data(), static_cast<std::streamsize>(bytes_.size()));
  }

  template <class T>
  std::vector<T> read(std::size_t offset, std::size_t count) const {
    if (offset > bytes_.size() || count > (bytes_.size() - offset) / sizeof(T)) {
      throw std::runtime_error("not a whole ELF file");
    }
    std::vector<T> values(count);
    std::memcpy(values.data(), bytes_.data() + offset, count * sizeof(T));
    return values;
  }

  std::string text(std::size_t offset) const {
    if (offset >= bytes_.size()) {
      throw std::runtime_error("not a whole ELF file");
    }
    return bytes_.data() + offset;
  }

 private:
  std::vector<char> bytes_;
};

unsigned char bindingOf(unsigned char info) {
  return static_cast<unsigned char>(info >> 4);
}

}  // namespace

ElfFile::ElfFile(const std::string& path) {
  const Bytes bytes(path);
  const auto header = bytes.read<ElfW(Ehdr)>(0, 1).front();
  const auto sections = bytes.read<ElfW(Shdr)>(header.e_shoff, header.e_shnum);
  for (const ElfW(Shdr) & section : sections) {
    const bool symbolTable = section.sh_type == SHT_DYNSYM;
    if (!symbolTable && section.sh_type != SHT_DYNAMIC) {
      continue;
    }
    const std::size_t strings = sections.at(section.sh_link).sh_offset;
    if (symbolTable) {
      for (const auto& symbol : bytes.read<ElfW(Sym)>(section.sh_offset, section.sh_size / sizeof(ElfW(Sym)))) {
        symbols.push_back(
            {bytes.text(strings + symbol.st_name), bindingOf(symbol.st_info), symbol.st_shndx != SHN_UNDEF});
      }
      continue;
    }
    for (const auto& entry : bytes.read<ElfW(Dyn)>(section.sh_offset, section.sh_size / sizeof(ElfW(Dyn)))) {
      switch (entry.d_tag) {
        case DT_NEEDED:
          needed.push_back(bytes.text(strings + entry.d_un.d_val));
          break;
        case DT_SONAME:
          soname = bytes.text(strings + entry.d_un.d_val);
          break;
        case DT_TEXTREL:
          hasTextRelocations = true;
          break;
        case DT_FLAGS:
          hasTextRelocations |= (entry.d_un.d_val & DF_TEXTREL) != 0;
          break;
        case DT_FLAGS_1:
          staysLoaded = (entry.d_un.d_val & DF_1_NODELETE) != 0;
          break;
        default:
          break;
      }
    }
  }
  for (const auto& segment : bytes.read<ElfW(Phdr)>(header.e_phoff, header.e_phnum)) {
    hasExecutableStack |= segment.p_type == PT_GNU_STACK && (segment.p_flags & PF_X) != 0;
  }
}

}  // namespace Library
