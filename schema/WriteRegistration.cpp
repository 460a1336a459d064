// Writes the registration files of both brokers: corvcpu_write_registration DIRECTORY VERSION

#include <exception>
#include <filesystem>
#include <fstream>
#include <iostream>
#include <stdexcept>
#include <string>

#include "schema/Registration.h"

namespace {

struct Unit {
  const char* file;
  const char* library;
};

// The computer system stands apart, because machines whose agent provides it leave it out.
constexpr Unit units[] = {{"corvane-cpu", "corvcpuprofileprovider"},
                          {"corvane-computersystem", "corvcomputersystemprovider"}};

void write(const std::filesystem::path& file, const std::string& text) {
  std::filesystem::create_directories(file.parent_path());
  std::ofstream stream(file, std::ios::binary);
  stream << text;
  stream.close();
  if (text.empty() || !stream) {
    throw std::runtime_error("cannot write " + file.string());
  }
}

}  // namespace

int main(int argc, char** argv) try {
  if (argc != 3) {
    throw std::invalid_argument("usage: corvcpu_write_registration DIRECTORY VERSION");
  }
  const std::filesystem::path directory = argv[1];
  for (const Unit& unit : units) {
    write(directory / "sfcb" / (std::string(unit.file) + ".reg"), Registration::forSfcb(unit.library));
    write(directory / "pegasus" / (std::string(unit.file) + ".mof"), Registration::forPegasus(unit.library, argv[2]));
  }
  return 0;
} catch (const std::exception& error) {
  std::cerr << error.what() << '\n';
  return 1;
}
