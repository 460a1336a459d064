#ifndef CORVANE_TESTS_PLATFORM_INVENTORY_SCRATCH_H
#define CORVANE_TESTS_PLATFORM_INVENTORY_SCRATCH_H

#include <filesystem>
#include <string>

namespace Tarn::Inventory {

/// The machines of tests/fixtures, with the generated ones.
inline const std::string fixtures = CORVANE_BINARY_DIR "/tests/fixtures/";

/// A directory that is gone after the test.
class ScratchDirectory {
 public:
  ScratchDirectory();
  ScratchDirectory(const ScratchDirectory&) = delete;
  ScratchDirectory(ScratchDirectory&&) = delete;
  ScratchDirectory& operator=(const ScratchDirectory&) = delete;
  ScratchDirectory& operator=(ScratchDirectory&&) = delete;
  ~ScratchDirectory();

  /// Writes a file below it, with the directories that it needs; returns its name.
  std::string write(const std::string& path, const std::string& contents) const;

  std::string name() const { return directory_.string(); }

 private:
  std::filesystem::path directory_;
};

/// The contents of a file; the test fails where it cannot be read.
std::string contentsOf(const std::string& file);

}  // namespace Tarn::Inventory

#endif
