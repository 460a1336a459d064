#ifndef HOST_CORVCIM_DRAWING_SVGLAYOUT_H
#define HOST_CORVCIM_DRAWING_SVGLAYOUT_H

#include <string>
#include <vector>

#include "host/corvcim/drawing/Machine.h"

namespace Corvcim {

enum class TextStyle { Title, Heading, Label, Note };

/// One line of text in a box. `x` and `y` are where its base line starts (or, if it is centred, has
/// its middle), from the box's upper left corner.
struct TextLine {
  TextStyle style;
  int x;
  int y;
  bool isCentred;
  std::string text;
};

/// A rectangle of the drawing; all lengths in pixels, the place from the corner of the box around it.
struct Box {
  enum class Style { Page, Processor, SharedCache, CacheBar, CoreGroup, Core };

  explicit Box(Style boxStyle) : style(boxStyle) {}

  Style style;
  int level = 0;  ///< of a cache: 1 to 3, 0 for any other
  bool isInUse = true;
  std::string tooltip;  ///< everything about the part, where the text in the box is short
  int x = 0;
  int y = 0;
  int width = 0;
  int height = 0;
  std::vector<TextLine> lines;
  std::vector<Box> inner;
};

/// Places everything: processors beside or below each other, in each its shared caches around the
/// cores that share them. Up to 32 cores each core shows its own caches; on larger machines cores
/// are small cells, and what they have in common stands once for each group.
Box layOut(const Machine& machine);

}  // namespace Corvcim

#endif
