#ifndef HOST_CLI_RESULTS_JSONBUILDER_H
#define HOST_CLI_RESULTS_JSONBUILDER_H

#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

namespace Corvcim {

/// Writes JSON, indented by two blanks. Whatever bytes the texts hold, the result is valid: bytes
/// that are no UTF-8 become U+FFFD. The caller keeps begin and end in pairs and gives each member of
/// an object its key.
class JsonBuilder {
 public:
  void beginObject();
  void endObject();
  void beginArray();
  void endArray();
  void key(std::string_view name);

  void text(std::string_view value);
  void number(std::uint64_t value);
  void number(std::int64_t value);
  void number(double value);  ///< null for what JSON cannot say: infinities and NaN
  void boolean(bool value);
  void null();

  /// A member with a text.
  void member(std::string_view name, std::string_view value);

  /// The whole document with its line end.
  std::string take();

 private:
  void begin(char bracket);
  void end(char bracket);
  void startValue();
  void newLine();
  void appendText(std::string_view value);

  std::string json_;
  std::vector<bool> isEmpty_;  // of each open object or array
  bool hasKey_ = false;
};

}  // namespace Corvcim

#endif
