#ifndef TESTS_LIBRARY_ELFFILE_H
#define TESTS_LIBRARY_ELFFILE_H

#include <string>
#include <vector>

/// What a shared object of this process's own class says of itself.
namespace Library {

struct DynamicSymbol {
  std::string name;
  unsigned char binding;
  bool defined;
};

struct ElfFile {
  explicit ElfFile(const std::string& path);

  std::vector<DynamicSymbol> symbols;
  std::vector<std::string> needed;
  std::string soname;
  bool hasTextRelocations = false;
  bool staysLoaded = false;  ///< marked so that dlclose does nothing
  bool hasExecutableStack = false;
};

}  // namespace Library

#endif
