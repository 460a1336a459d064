#include "host/corvcim/drawing/TreeSvg.h"

#include <string_view>
#include <utility>

#include "host/corvcim/drawing/BoxGrid.h"
#include "host/corvcim/drawing/SvgLayout.h"
#include "host/corvcim/drawing/TreeText.h"

namespace Corvcim {
namespace {

struct Look {
  std::string_view fill;
  std::string_view stroke;
  int radius;
};

constexpr std::string_view offFill = "#ececec";
constexpr std::string_view offStroke = "#a0a0a0";

Look cacheLook(int level) {
  switch (level) {
    case 1:
      return {"#fdf1d3", "#cdb36b", 3};
    case 2:
      return {"#dff0e0", "#8dbb91", 3};
    case 3:
      return {"#d6e4f5", "#86a9d1", 3};
    default:
      return {"#e9e1f2", "#ab98c6", 3};
  }
}

Look lookOf(const Box& box) {
  switch (box.style) {
    case Box::Style::Page:
      return {"#ffffff", "none", 0};
    case Box::Style::Processor:
      return {"#f5f7f9", "#8a96a3", 6};
    case Box::Style::SharedCache:
      return {"#ffffff", cacheLook(box.level).stroke, 3};
    case Box::Style::CacheBar:
      return cacheLook(box.level);
    case Box::Style::CoreGroup:
      return {"none", "none", 0};
    case Box::Style::Core:
      return {"#ffffff", "#5b6770", 3};
  }
  return {"none", "none", 0};
}

constexpr std::string_view noteFill = "#4a5763";

std::string xmlEscaped(std::string_view text) {
  std::string result;
  for (const char c : text) {
    switch (c) {
      case '&':
        result += "&amp;";
        break;
      case '<':
        result += "&lt;";
        break;
      case '>':
        result += "&gt;";
        break;
      case '"':
        result += "&quot;";
        break;
      default:
        result += c;
    }
  }
  return result;
}

class Picture {
 public:
  explicit Picture(const Box& page) {
    const std::string width = std::to_string(page.width);
    const std::string height = std::to_string(page.height);
    svg_ = R"(<svg xmlns="http://www.w3.org/2000/svg" role="img" width=")" + width + "\" height=\"" + height +
           "\" viewBox=\"0 0 " + width + ' ' + height +
           "\" font-family=\"Helvetica, Arial, 'Liberation Sans', 'DejaVu Sans', sans-serif\" fill=\"#1c2733\">\n";
  }

  void describe(const std::string& title, const std::string& description) {
    svg_ += "  <title>" + xmlEscaped(title) + "</title>\n";
    svg_ += "  <desc>" + xmlEscaped(description) + "</desc>\n";
  }

  void add(const Box& box, int left, int top) {
    const int x = left + box.x;
    const int y = top + box.y;
    const bool hasTooltip = !box.tooltip.empty();
    if (hasTooltip) {
      svg_ += "  <g><title>" + xmlEscaped(box.tooltip) + "</title>\n";
    }
    addRectangle(box, x, y);
    for (const Box& inner : box.inner) {
      add(inner, x, y);
    }
    for (const TextLine& line : box.lines) {
      addText(line, x, y);
    }
    if (hasTooltip) {
      svg_ += "  </g>\n";
    }
  }

  std::string take() {
    svg_ += "</svg>\n";
    return std::move(svg_);
  }

 private:
  void addRectangle(const Box& box, int x, int y) {
    const Look look = lookOf(box);
    if (look.fill == "none" && look.stroke == "none") {
      return;
    }
    addNumbers("  <rect", {{"x", x}, {"y", y}, {"width", box.width}, {"height", box.height}, {"rx", look.radius}});
    addAttribute("fill", box.isInUse ? look.fill : offFill);
    addAttribute("stroke", box.isInUse ? look.stroke : offStroke);
    if (!box.isInUse) {
      addAttribute("stroke-dasharray", "4 3");
    }
    svg_ += "/>\n";
  }

  void addText(const TextLine& line, int x, int y) {
    addNumbers("  <text", {{"x", x + line.x}, {"y", y + line.y}});
    addAttribute("font-size", std::to_string(fontSize(line.style)));
    if (line.style == TextStyle::Title || line.style == TextStyle::Heading) {
      addAttribute("font-weight", "bold");
    }
    if (line.style == TextStyle::Note) {
      addAttribute("fill", noteFill);
    }
    if (line.isCentred) {
      addAttribute("text-anchor", "middle");
    }
    svg_ += '>';
    svg_ += xmlEscaped(line.text) + "</text>\n";
  }

  void addNumbers(std::string_view element, std::initializer_list<std::pair<std::string_view, int>> attributes) {
    svg_ += element;
    for (const auto& [name, value] : attributes) {
      addAttribute(name, std::to_string(value));
    }
  }

  void addAttribute(std::string_view name, std::string_view value) {
    svg_ += ' ';
    svg_ += name;
    svg_ += "=\"";
    svg_ += value;
    svg_ += '"';
  }

  std::string svg_;
};

}  // namespace

std::string drawTreeSvg(const Machine& machine) {
  const Box page = layOut(machine);
  Picture picture(page);
  picture.describe("Processors of " + machine.systemName, drawTreeText(machine, 0));
  picture.add(page, 0, 0);
  return picture.take();
}

}  // namespace Corvcim
