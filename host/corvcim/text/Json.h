#ifndef HOST_CORVCIM_TEXT_JSON_H
#define HOST_CORVCIM_TEXT_JSON_H

#include <nlohmann/json.hpp>
#include <string>

#include "host/corvcim/text/Text.h"

namespace Corvcim {

/// JSON whose members keep the order in which they were set.
using OrderedJson = nlohmann::ordered_json;

/// The value on one line. Bytes that are not UTF-8 become U+FFFD.
inline std::string jsonLine(const OrderedJson& json) {
  return json.dump(-1, ' ', false, OrderedJson::error_handler_t::replace);
}

/// The value as a document: indented by two blanks, with a line end.
inline std::string jsonDocument(const OrderedJson& json) {
  return json.dump(2, ' ', false, OrderedJson::error_handler_t::replace) + '\n';
}

/// A list as a document, as jsonDocument writes it. Only one element at a time is held as JSON.
template <class Elements, class Convert>
std::string jsonListDocument(const Elements& elements, Convert convert) {
  std::string text = "[";
  for (const auto& element : elements) {
    text += text.size() == 1 ? "\n  " : ",\n  ";
    for (const char c : convert(element).dump(2, ' ', false, OrderedJson::error_handler_t::replace)) {
      text += c;
      text += c == '\n' ? "  " : "";
    }
  }
  return text + (text.size() == 1 ? "]\n" : "\n]\n");
}

/// null for an empty text.
inline OrderedJson textOrNull(std::string_view text) {
  return text.empty() ? OrderedJson() : OrderedJson(text);
}

}  // namespace Corvcim

#endif
