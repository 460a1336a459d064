#include "host/cli/BoxGrid.h"

#include <algorithm>
#include <cmath>
#include <iterator>
#include <span>
#include <utility>

#include "host/cli/Text.h"

namespace Corvcim {
namespace {

bool haveEqualWidths(const std::vector<Box>& boxes) {
  return std::ranges::all_of(boxes, [&](const Box& box) { return box.width == boxes.front().width; });
}

int takenWidth(std::span<const Box> row) {
  int width = 0;
  for (const Box& box : row) {
    width += (width == 0 ? 0 : boxGap) + box.width;
  }
  return width;
}

/// How many of the boxes come into the next row.
std::size_t rowLength(std::span<const Box> boxes, int maxWidth) {
  std::size_t length = 1;
  while (length < boxes.size() && takenWidth(boxes.first(length + 1)) <= maxWidth) {
    ++length;
  }
  return length;
}

std::vector<std::span<Box>> rowsOf(std::vector<Box>& boxes, int maxWidth) {
  std::vector<std::span<Box>> rows;
  std::span<Box> rest = boxes;
  std::size_t columns = 0;
  if (!boxes.empty() && haveEqualWidths(boxes)) {
    const int limit = std::max(1, (maxWidth + boxGap) / (boxes.front().width + boxGap));
    columns = columnsFor(boxes.size(), static_cast<std::size_t>(limit));
  }
  while (!rest.empty()) {
    const std::size_t length = columns == 0 ? rowLength(rest, maxWidth) : std::min(columns, rest.size());
    rows.push_back(rest.first(length));
    rest = rest.subspan(length);
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
