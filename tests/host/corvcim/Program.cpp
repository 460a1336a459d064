#include "tests/host/corvcim/Program.h"

#include <sys/wait.h>

#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <sstream>
#include <stdexcept>

#include "platform/inventory/tree/JsonTree.h"

namespace Corvcim::Testing {
namespace {

std::string quotedForShell(const std::string& word) {
  std::string quoted = "'";
  for (const char c : word) {
    quoted += c == '\'' ? "'\\''" : std::string(1, c);
  }
  return quoted + "'";
}

}  // namespace

std::string contentsOf(const std::string& file) {
  std::ostringstream contents;
  contents << std::ifstream(file, std::ios::binary).rdbuf();
  return contents.str();
}

Directory::Directory() {
  std::string name = std::filesystem::temp_directory_path() / "corvcim-test-XXXXXX";
  if (mkdtemp(name.data()) == nullptr) {
    throw std::runtime_error("no temporary directory");
  }
  path_ = name;
}

Directory::~Directory() {
  std::error_code ignored;
  std::filesystem::remove_all(path_, ignored);
}

std::string Directory::write(const std::string& name, const std::string& contents) const {
  std::ofstream(file(name), std::ios::binary) << contents;
  return file(name);
}

Finished shell(const std::string& command) {
  const Directory directory;
  const std::string script = directory.write("script",
                                             "unset CORVANE_INVENTORY CORVANE_LANGUAGE CORVANE_TRACE\n"
                                             "export CORVANE_LOG=6000:none LC_ALL=C.UTF-8 CORVANE_CONFIG=" +
                                                 directory.write("configuration", "") +
                                                 "\n"
                                                 "corvcim=" CORVCIM_PROGRAM "\n" +
                                                 command + '\n');
  const std::string redirected =
      "bash " + script + " < /dev/null > " + directory.file("output") + " 2> " + directory.file("errors");
  const int status = std::system(redirected.c_str());
  return {WIFSIGNALED(status) ? 128 + WTERMSIG(status) : WEXITSTATUS(status), contentsOf(directory.file("output")),
          contentsOf(directory.file("errors"))};
}

Finished corvcim(const std::vector<std::string>& arguments) {
  std::string command = "\"$corvcim\"";
  for (const std::string& argument : arguments) {
    command += ' ' + quotedForShell(argument);
  }
  return shell(command);
}

Finished corvcimOn(const Tarn::Inventory::Tree& machine, std::vector<std::string> arguments) {
  const Directory directory;
  const std::string file = directory.write("machine.json", Tarn::Inventory::writeJson(machine));
  arguments.insert(arguments.begin(), {"--inventory", "json:" + file});
  return corvcim(arguments);
}

}  // namespace Corvcim::Testing
