#include "host/corvcim/drawing/BoxGrid.h"

#include <algorithm>
#include <cmath>
#include <iterator>
#include <span>

#include "host/corvcim/text/Text.h"

namespace Corvcim {
namespace {

int takenWidth(std::span<const Box> row) {
  int width = 0;
  for (const Box& box : row) {
    width += (width == 0 ? 0 : boxGap) + box.width;
  }
  return width;
}

std::size_t equalWidths(std::span<const Box> boxes) {
  std::size_t length = 1;
  while (length < boxes.size() && boxes[length].width == boxes.front().width) {
    ++length;
  }
  return length;
}

/// As few rows as the limit allows, about equally long.
std::size_t evenColumns(std::size_t count, std::size_t limit) {
  const std::size_t rows = (count + limit - 1) / limit;
  return (count + rows - 1) / rows;
}

/// Boxes of different widths are different things: one row if that fits, else each kind begins a row.
std::vector<std::span<Box>> rowsOf(std::span<Box> boxes, int maxWidth) {
  const bool isMixed = !boxes.empty() && equalWidths(boxes) < boxes.size();
  if (isMixed && takenWidth(boxes) <= maxWidth) {
    return {boxes};
  }
  std::vector<std::span<Box>> rows;
  while (!boxes.empty()) {
    const std::size_t equal = equalWidths(boxes);
    const auto limit = static_cast<std::size_t>(std::max(1, (maxWidth + boxGap) / (boxes.front().width + boxGap)));
    const std::size_t columns = isMixed ? evenColumns(equal, limit) : columnsFor(equal, limit);
    for (std::size_t first = 0; first < equal; first += columns) {
      rows.push_back(boxes.subspan(first, std::min(columns, equal - first)));
    }
    boxes = boxes.subspan(equal);
  }
  return rows;
}

bool isContainer(const Box& box) {
  return box.style == Box::Style::Processor || box.style == Box::Style::SharedCache;
}

void placeRow(std::span<Box> row, Corner corner) {
  const int height = std::ranges::max_element(row, {}, &Box::height)->height;
  for (Box& box : row) {
    box.x = corner.x;
    box.y = corner.y;
    if (isContainer(box)) {
      box.height = height;
    }
    corner.x += box.width + boxGap;
  }
}

bool isAloneInRow(const Box& box, const std::vector<Box>& others) {
  return std::ranges::none_of(others, [&](const Box& other) { return &other != &box && other.y == box.y; });
}

}  // namespace

int fontSize(TextStyle style) {
  switch (style) {
    case TextStyle::Title:
      return 20;
    case TextStyle::Heading:
      return 15;
    case TextStyle::Label:
      return 12;
    case TextStyle::Note:
      return 11;
  }
  return 11;
}

int textWidth(TextStyle style, const std::string& text) {
  const bool isBold = style == TextStyle::Title || style == TextStyle::Heading;
  const double perCharacter = fontSize(style) * (isBold ? 0.66 : 0.6);
  return static_cast<int>(std::ceil(perCharacter * static_cast<double>(columns(text))));
}

std::string fitText(TextStyle style, const std::string& text, int width) {
  std::size_t length = columns(text);
  std::string fitting = text;
  while (length > 1 && textWidth(style, fitting) > width) {
    fitting = shorten(text, --length);
  }
  return fitting;
}

std::size_t columnsFor(std::size_t count, std::size_t limit) {
  constexpr std::size_t singleRow = 4;
  if (count <= std::min(limit, singleRow)) {
    return std::max<std::size_t>(count, 1);
  }
  const double ideal = std::sqrt(2.0 * static_cast<double>(count));
  std::size_t best = 1;
  double leastCost = HUGE_VAL;
  for (std::size_t columnCount = 1; columnCount <= std::min(count, limit); ++columnCount) {
    const std::size_t places = (count + columnCount - 1) / columnCount * columnCount;
    const double cost = 2.0 * static_cast<double>(places - count) + std::abs(static_cast<double>(columnCount) - ideal);
    if (cost < leastCost) {
      leastCost = cost;
      best = columnCount;
    }
  }
  return best;
}

void arrange(Box& parent, std::vector<Box> boxes, Corner corner, int maxWidth) {
  int bottom = corner.y;
  for (const std::span<Box> row : rowsOf(boxes, maxWidth)) {
    placeRow(row, {corner.x, bottom});
    bottom += std::ranges::max_element(row, {}, &Box::height)->height + boxGap;
    parent.width = std::max(parent.width, takenWidth(row) + 2 * corner.x);
  }
  parent.height = std::max(parent.height, bottom - (boxes.empty() ? 0 : boxGap) + corner.x);
  std::ranges::move(boxes, std::back_inserter(parent.inner));
}

void stretch(Box& box, int width) {
  box.width = width;
  for (Box& inner : box.inner) {
    const bool isHeader = inner.style == Box::Style::CacheBar && isContainer(box);
    const bool canGrow = isHeader || (isContainer(inner) && isAloneInRow(inner, box.inner));
    stretch(inner, canGrow ? width - 2 * inner.x : inner.width);
  }
}

}  // namespace Corvcim
