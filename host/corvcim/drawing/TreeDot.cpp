#include "host/corvcim/drawing/TreeDot.h"

#include <string_view>
#include <utility>

#include "host/corvcim/drawing/TreeOutline.h"

namespace Corvcim {
namespace {

std::string_view fillOf(const OutlineItem& item) {
  if (!item.isInUse) {
    return "#eeeeee";
  }
  switch (item.kind) {
    case OutlineItem::Kind::System:
      return "#ffffff";
    case OutlineItem::Kind::Processor:
      return "#e9edf2";
    case OutlineItem::Kind::Cache:
      return "#d6e4f5";
    case OutlineItem::Kind::Core:
      return "#dff0e0";
    case OutlineItem::Kind::Note:
      return "#fdf1d3";
  }
  return "#ffffff";
}

/// Text inside a quoted DOT string; there only quotes and backslashes need care.
std::string dotEscaped(const std::string& text) {
  std::string result;
  for (const char c : text) {
    if (c == '"' || c == '\\') {
      result += '\\';
    }
    result += c;
  }
  return result;
}

class Graph {
 public:
  std::string write(const OutlineItem& system) {
    text_ =
        "digraph corvcim {\n"
        "  graph [rankdir=LR, ranksep=0.4, nodesep=0.12, bgcolor=white, fontname=\"Helvetica\"];\n"
        "  node [shape=box, style=\"filled,rounded\", fontname=\"Helvetica\", fontsize=11, color=\"#5b6770\", "
        "margin=\"0.12,0.06\"];\n"
        "  edge [arrowhead=none, tailport=e, headport=w, color=\"#5b6770\"];\n";
    add(system);
    text_ += "}\n";
    return std::move(text_);
  }

 private:
  unsigned int add(const OutlineItem& item) {
    const unsigned int number = count_++;
    text_ += "  n" + std::to_string(number) + " [label=\"" + dotEscaped(item.label);
    for (const std::string& detail : item.details) {
      text_ += "\\n" + dotEscaped(detail);
    }
    text_ += "\", fillcolor=\"";
    text_ += fillOf(item);
    text_ += "\"];\n";
    for (const OutlineItem& below : item.below) {
      const unsigned int other = add(below);
      text_ += "  n" + std::to_string(number) + " -> n" + std::to_string(other) + ";\n";
    }
    return number;
  }

  std::string text_;
  unsigned int count_ = 0;
};

}  // namespace

std::string drawTreeDot(const Machine& machine) {
  return Graph().write(outlineOf(machine));
}

}  // namespace Corvcim
