#include "host/corvcim/drawing/TreeText.h"

#include <utility>

#include "host/corvcim/drawing/TreeOutline.h"
#include "host/corvcim/text/Text.h"

namespace Corvcim {
namespace {

std::string lineOf(const OutlineItem& item) {
  std::string line = item.label;
  const char* separator = ": ";
  for (const std::string& detail : item.details) {
    line += separator + detail;
    separator = "; ";
  }
  return line;
}

class Drawing {
 public:
  explicit Drawing(std::size_t width) : width_(width) {}

  void add(const OutlineItem& item, const std::string& branch, const std::string& indent) {
    const std::string line = branch + lineOf(item);
    text_ += width_ == 0 ? line : shorten(line, width_);
    text_ += '\n';
    for (std::size_t i = 0; i < item.below.size(); ++i) {
      const bool isLast = i + 1 == item.below.size();
      add(item.below[i], indent + (isLast ? "└─ " : "├─ "), indent + (isLast ? "   " : "│  "));
    }
  }

  std::string take() { return std::move(text_); }

 private:
  std::size_t width_;
  std::string text_;
};

}  // namespace

std::string drawTreeText(const Machine& machine, std::size_t width) {
  Drawing drawing(width);
  drawing.add(outlineOf(machine), "", "");
  return drawing.take();
}

}  // namespace Corvcim
