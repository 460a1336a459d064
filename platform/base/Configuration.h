#ifndef CORVANE_PLATFORM_BASE_CONFIGURATION_H
#define CORVANE_PLATFORM_BASE_CONFIGURATION_H

#include <map>
#include <string>
#include <string_view>
#include <vector>

namespace Tarn::Common {

/// One value and where it was written, for messages about it: "/etc/corvane/corvane.conf:7", "CORVANE_LOG".
struct Setting {
  std::string value;
  std::string where;
};

/// Something wrong with the configuration: where, and why it is not valid.
struct ConfigurationProblem {
  std::string where;
  std::string why;

  friend bool operator==(const ConfigurationProblem&, const ConfigurationProblem&) = default;
};

/// The agent's configuration file: lines of `key = value`, comment lines that begin with `#`, blank lines.
/// Of two lines with one key the later is in force. A line that is none of these, or has an unknown key, is
/// noted as a problem; the other lines are in force all the same.
class Configuration {
 public:
  /// Parses the text of a file; `file` is its name in messages.
  static Configuration parse(std::string_view text, const std::string& file);
  /// Reads a file. One that cannot be read is a problem and holds nothing.
  static Configuration read(const std::string& file);

  /// The setting of that key, or null where the file has none.
  [[nodiscard]] const Setting* find(std::string_view key) const;
  [[nodiscard]] const std::vector<ConfigurationProblem>& problems() const { return problems_; }

 private:
  void parseLine(std::string_view line, const std::string& where);

  std::map<std::string, Setting, std::less<>> settings_;
  std::vector<ConfigurationProblem> problems_;
};

/// The configuration of this process as it was at the first call (see ConfigurationFile::ofThisProcess), for settings
/// that stay as they are while the process runs. Safe from several threads. Its problems are reported by the logger,
/// which follows the file.
const Configuration& configuration();

}  // namespace Tarn::Common

#endif
