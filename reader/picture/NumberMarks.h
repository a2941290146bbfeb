#pragma once

#include <cstdint>
#include <unordered_map>
#include <vector>

#include "platform/runtime/Geometry.h"

namespace ax::reader {

// Where the numbers of elements stand in a picture: inside their frames, beside one another.
class NumberMarks {
 public:
  // `fromTheRight` where the language is written so.
  explicit NumberMarks(bool fromTheRight) : fromTheRight_(fromTheRight) {}

  struct Mark {
    Rect rect;
    double fontSize;
  };

  // The place for a number of so many digits: free of earlier ones wherever the frame has room left, and
  // within the frame, if it must in smaller type.
  Mark place(const Rect& frame, std::size_t digits);

  static Size sizeOf(double fontSize, std::size_t digits);
  static constexpr double largestType = 11;

 private:
  bool isFree(const Rect& rect) const;
  void take(const Rect& rect);
  template <class Visit>
  static void eachCell(const Rect& rect, Visit&& visit);

  bool fromTheRight_;
  std::unordered_map<std::int64_t, std::vector<Rect>> taken_;  // by cells of the picture
};

}  // namespace ax::reader
