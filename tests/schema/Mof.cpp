#include "tests/schema/Mof.h"

#include <algorithm>
#include <cctype>
#include <fstream>
#include <iterator>
#include <stdexcept>

#include "schema/Names.h"

namespace Mof {
namespace {

class Reader {
 public:
  explicit Reader(std::string text) : text_(std::move(text)) { advance(); }

  [[nodiscard]] bool atEnd() const { return token_.empty(); }

  std::vector<Qualifier> qualifiers() {
    std::vector<Qualifier> result;
    if (!accept("[")) {
      return result;
    }
    do {
      result.push_back(qualifier());
    } while (accept(","));
    expect("]");
    return result;
  }

  Class classDeclaration() {
    Class result;
    result.qualifiers = qualifiers();
    expect("class");
    result.name = take();
    expect(":");
    result.parent = take();
    expect("{");
    while (!accept("}")) {
      result.properties.push_back(property());
    }
    expect(";");
    return result;
  }

 private:
  Qualifier qualifier() {
    Qualifier result;
    result.name = take();
    if (accept("(")) {
      result.values.push_back(literal());
      expect(")");
    } else if (accept("{")) {
      do {
        result.values.push_back(literal());
      } while (accept(","));
      expect("}");
    }
    return result;
  }

  Property property() {
    Property result;
    result.qualifiers = qualifiers();
    result.type = take();
    if (accept("REF")) {
      result.referenceClass = result.type;
      result.type = "ref";
    }
    result.name = take();
    if (accept("[")) {
      expect("]");
      result.type += "[]";
    }
    expect(";");
    return result;
  }

  std::string literal() {
    std::string result;
    if (!token_.starts_with('"')) {
      fail("a text");
    }
    while (token_.starts_with('"')) {
      result += take().substr(1);
    }
    return result;
  }

  bool accept(std::string_view token) {
    if (token_ != token) {
      return false;
    }
    advance();
    return true;
  }

  void expect(std::string_view token) {
    if (!accept(token)) {
      fail(token);
    }
  }

  std::string take() {
    std::string result = token_;
    advance();
    return result;
  }

  [[noreturn]] void fail(std::string_view wanted) const {
    const auto line = 1 + std::count(text_.begin(), text_.begin() + static_cast<std::ptrdiff_t>(position_), '\n');
    throw std::runtime_error("line " + std::to_string(line) + ": expected " + std::string(wanted) + ", found " +
                             token_);
  }

  void skipBlanksAndComments() {
    while (position_ < text_.size()) {
      if (text_.compare(position_, 2, "//") == 0) {
        position_ = std::min(text_.find('\n', position_), text_.size());
      } else if (std::isspace(static_cast<unsigned char>(text_[position_])) != 0) {
        ++position_;
      } else {
        return;
      }
    }
  }

  // A literal is kept with its opening quote only, which tells it from a name.
  void advance() {
    skipBlanksAndComments();
    const std::size_t start = position_;
    if (position_ == text_.size()) {
      token_.clear();
      return;
    }
    if (text_[start] == '"') {
      position_ = std::min(text_.find('"', start + 1), text_.size() - 1) + 1;
      token_ = text_.substr(start, position_ - 1 - start);
      return;
    }
    while (position_ < text_.size() && isNamePart(text_[position_])) {
      ++position_;
    }
    position_ = std::max(position_, start + 1);
    token_ = text_.substr(start, position_ - start);
  }

  static bool isNamePart(char letter) { return letter == '_' || std::isalnum(static_cast<unsigned char>(letter)) != 0; }

  std::string text_;
  std::string token_;
  std::size_t position_ = 0;
};

}  // namespace

std::vector<Class> readClasses(const std::string& file) {
  std::ifstream stream(file);
  if (!stream) {
    throw std::runtime_error("cannot open " + file);
  }
  Reader reader(std::string(std::istreambuf_iterator<char>(stream), {}));
  std::vector<Class> result;
  while (!reader.atEnd()) {
    result.push_back(reader.classDeclaration());
  }
  return result;
}

const Qualifier* find(const std::vector<Qualifier>& qualifiers, std::string_view name) {
  const auto found =
      std::ranges::find_if(qualifiers, [&](const Qualifier& each) { return Corvcim::sameName(each.name, name); });
  return found == qualifiers.end() ? nullptr : &*found;
}

std::string lowered(std::string_view text) {
  std::string result(text);
  std::ranges::transform(result, result.begin(), Corvcim::toLowerAscii);
  return result;
}

}  // namespace Mof
