#include "reader/picture/PictureStyle.h"

namespace ax::reader {

void openPicture(Markup& svg, const Rect& area, const std::string& name) {
  const std::string box = markupNumber(area.x) + " " + markupNumber(area.y) + " " + markupNumber(area.width) +
                          " " + markupNumber(area.height);
  svg.open("svg", {{"xmlns", "http://www.w3.org/2000/svg"},
                   {"viewBox", box},
                   {"width", area.width},
                   {"height", area.height},
                   {"role", "img"},
                   {"aria-label", name},
                   {"font-family", "system-ui, sans-serif"}});
}

}  // namespace ax::reader
