#include "host/cli/results/JsonBuilder.h"

#include <charconv>
#include <cmath>

#include "host/cli/Text.h"
#include "platform/common/Hex.h"

namespace Corvcim {
namespace {

template <class Number>
void append(std::string& text, Number value) {
  char buffer[32];
  const auto result = std::to_chars(std::begin(buffer), std::end(buffer), value);
  text.append(buffer, result.ptr);
}

}  // namespace

void JsonBuilder::beginObject() {
  begin('{');
}

void JsonBuilder::endObject() {
  end('}');
}

void JsonBuilder::beginArray() {
  begin('[');
}

void JsonBuilder::endArray() {
  end(']');
}

void JsonBuilder::key(std::string_view name) {
  startValue();
  appendText(name);
  json_ += ": ";
  hasKey_ = true;
}

void JsonBuilder::text(std::string_view value) {
  startValue();
  appendText(value);
}

void JsonBuilder::number(std::uint64_t value) {
  startValue();
  append(json_, value);
}

void JsonBuilder::number(std::int64_t value) {
  startValue();
  append(json_, value);
}

void JsonBuilder::number(double value) {
  startValue();
  if (std::isfinite(value)) {
    append(json_, value);
  } else {
    json_ += "null";
  }
}

void JsonBuilder::boolean(bool value) {
  startValue();
  json_ += value ? "true" : "false";
}

void JsonBuilder::null() {
  startValue();
  json_ += "null";
}

void JsonBuilder::member(std::string_view name, std::string_view value) {
  key(name);
  text(value);
}

std::string JsonBuilder::take() {
  json_ += '\n';
  return std::move(json_);
}

void JsonBuilder::begin(char bracket) {
  startValue();
  json_ += bracket;
  isEmpty_.push_back(true);
}

void JsonBuilder::end(char bracket) {
  const bool wasEmpty = isEmpty_.back();
  isEmpty_.pop_back();
  if (!wasEmpty) {
    newLine();
  }
  json_ += bracket;
}

void JsonBuilder::startValue() {
  if (hasKey_) {
    hasKey_ = false;
    return;
  }
  if (isEmpty_.empty()) {
    return;
  }
  if (!isEmpty_.back()) {
    json_ += ',';
  }
  isEmpty_.back() = false;
  newLine();
}

void JsonBuilder::newLine() {
  json_ += '\n';
  json_.append(2 * isEmpty_.size(), ' ');
}

void JsonBuilder::appendText(std::string_view value) {
  json_ += '"';
  for (const char c : toValidUtf8(value)) {
    const auto byte = static_cast<unsigned char>(c);
    if (c == '"' || c == '\\') {
      json_ += '\\';
      json_ += c;
    } else if (c == '\n') {
      json_ += "\\n";
    } else if (c == '\t') {
      json_ += "\\t";
    } else if (byte < 0x20U || byte == 0x7FU) {
      json_ += "\\u00";
      Tarn::Common::appendHex(json_, byte);
    } else {
      json_ += c;
    }
  }
  json_ += '"';
}

}  // namespace Corvcim
