#ifndef TESTS_HOST_CORVCIM_PROGRAM_H
#define TESTS_HOST_CORVCIM_PROGRAM_H

#include <ostream>
#include <string>
#include <vector>

#include "platform/inventory/tree/Tree.h"

namespace Corvcim::Testing {

/// What a run of the program gave.
struct Finished {
  int status = 0;  ///< the exit status; the signal's number plus 128 where one ended it
  std::string output;
  std::string errors;

  friend bool operator==(const Finished&, const Finished&) = default;
  friend std::ostream& operator<<(std::ostream& stream, const Finished& run) {
    return stream << "exit status " << run.status << "\n--- output\n" << run.output << "--- errors\n" << run.errors;
  }
};

/// A directory that is there as long as this object.
class Directory {
 public:
  Directory();
  ~Directory();
  Directory(const Directory&) = delete;
  Directory& operator=(const Directory&) = delete;

  std::string file(const std::string& name) const { return path_ + '/' + name; }
  /// Writes a file there and gives its path.
  std::string write(const std::string& name, const std::string& contents) const;

 private:
  std::string path_;
};

/// The contents of a file; empty if it cannot be read.
std::string contentsOf(const std::string& file);

/// Runs the command with the shell, in an environment that says nothing about inventory or language.
/// "$corvcim" is the built program.
Finished shell(const std::string& command);

/// Runs the built program.
Finished corvcim(const std::vector<std::string>& arguments);

/// Runs the built program on a machine.
Finished corvcimOn(const Tarn::Inventory::Tree& machine, std::vector<std::string> arguments);

}  // namespace Corvcim::Testing

#endif
