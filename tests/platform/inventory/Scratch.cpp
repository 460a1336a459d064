#include "tests/platform/inventory/Scratch.h"

#include <cstdlib>
#include <fstream>
#include <iterator>
#include <stdexcept>

namespace Tarn::Inventory {

ScratchDirectory::ScratchDirectory() {
  std::string name = (std::filesystem::temp_directory_path() / "corvane-XXXXXX").string();
  if (::mkdtemp(name.data()) == nullptr) {
    throw std::runtime_error("no directory for the test");
  }
  directory_ = name;
}

ScratchDirectory::~ScratchDirectory() {
  std::error_code ignored;
  std::filesystem::remove_all(directory_, ignored);
}

std::string ScratchDirectory::write(const std::string& path, const std::string& contents) const {
  const std::filesystem::path file = directory_ / path;
  std::filesystem::create_directories(file.parent_path());
  std::ofstream stream(file, std::ios::binary);
  stream << contents;
  if (!stream.flush()) {
    throw std::runtime_error("cannot write " + file.string());
  }
  return file.string();
}

std::string contentsOf(const std::string& file) {
  std::ifstream stream(file, std::ios::binary);
  if (!stream) {
    throw std::runtime_error("cannot read " + file);
  }
  return {std::istreambuf_iterator<char>(stream), std::istreambuf_iterator<char>()};
}

}  // namespace Tarn::Inventory
