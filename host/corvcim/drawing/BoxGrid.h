#ifndef HOST_CORVCIM_DRAWING_BOXGRID_H
#define HOST_CORVCIM_DRAWING_BOXGRID_H

#include <cstddef>
#include <string>
#include <vector>

#include "host/corvcim/drawing/SvgLayout.h"

namespace Corvcim {

inline constexpr int boxPadding = 10;
inline constexpr int boxGap = 8;

/// The pixels that a text takes at most: no fonts are asked, so the estimate is a generous one.
int textWidth(TextStyle style, const std::string& text);

int fontSize(TextStyle style);

/// The text, shortened until it fits.
std::string fitText(TextStyle style, const std::string& text, int width);

/// How many of `count` equal boxes stand in a row, at most `limit`: twice as wide as high, with few
/// gaps in the last row.
std::size_t columnsFor(std::size_t count, std::size_t limit);

/// Where the first of several boxes goes, from the corner of the box around them. The distance from
/// the left is kept on the right and below as well.
struct Corner {
  int x;
  int y;
};

/// Puts the boxes into `parent`, in rows from the corner on, not wider than `maxWidth` where one box
/// alone is not, and makes the parent large enough for them. Boxes around others reach down to their
/// row's end.
void arrange(Box& parent, std::vector<Box> boxes, Corner corner, int maxWidth);

/// Makes the box that wide. Boxes around others that have a row for themselves, and the bars on top of
/// them, become as wide as there is room.
void stretch(Box& box, int width);

}  // namespace Corvcim

#endif
