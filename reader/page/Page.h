#pragma once

#include <cstddef>
#include <string>
#include <vector>

#include "reader/snapshot/Snapshot.h"

namespace ax::reader {

// Screens as one HTML document that stands alone: it has no script, loads nothing, and says so in a policy
// that browsers hold it to. Each screen is its picture and, beside it, a list of what a listener meets, in
// reading order and with the picture's numbers: headings as headings, buttons as buttons, adjustables as
// sliders, charts as figures with a picture, a table of their elements and a player for
// their sound. Several screens have a table of contents. Main thread only.
class Page {
 public:
  enum class Sound { with, without };

  explicit Page(Sound sound = Sound::with) : hasSound_(sound == Sound::with) {}

  // Writes a screen in the language of the environment, which is to be the one that the snapshot was taken
  // in. The first one's language is that of the page around them.
  void add(const Snapshot& snapshot, const std::string& title);

  // Of one screen or more.
  std::string html() const;

 private:
  struct Screen {
    std::string title;
    std::string language;
    const char* direction;
    std::string section;  // as HTML, without its heading
  };

  bool hasSound_;
  std::vector<Screen> screens_;
  std::string heading_;   // in the language of the page
  std::string contents_;  // likewise
};

}  // namespace ax::reader
