#include "bench/Report.h"

#include <cstdio>

namespace bench {

namespace {

template <class... A>
std::string print(const char* format, A... arguments) {
  char text[256];
  std::snprintf(text, sizeof text, format, arguments...);
  return text;
}

std::string verdict(const Row& row) {
  if (!row.bound) return "";
  return row.isMet() ? "met" : "MISSED";
}

// A ratio below 1 reads better the other way round.
std::string times(double ratio) {
  if (ratio <= 0) return "";
  return ratio < 0.67 ? print("1/%.1f", 1 / ratio) : print("%.2f", ratio);
}

std::string quoted(const std::string& text) {
  std::string result = "\"";
  for (char c : text) result.append(c == '"' || c == '\\' ? "\\" : "").push_back(c);
  return result + "\"";
}

}  // namespace

std::string asText(const std::vector<Row>& rows, const std::vector<std::string>& notes) {
  const char* line = "%-42s %10s %-5s  %-26s %10s  %8s  %8s  %s\n";
  std::string text = print(line, "operation", "ours", "", "against", "", "ratio", "bound", "");
  for (const Row& row : rows) {
    text += print(line, row.operation.c_str(), print("%.2f", row.ours).c_str(), row.unit.c_str(),
                  row.against.c_str(), print("%.2f", row.other).c_str(), times(row.ratio()).c_str(),
                  row.bound ? times(*row.bound).c_str() : "", verdict(row).c_str());
  }
  for (const std::string& note : notes) text += note + "\n";
  return text;
}

std::string asJson(const std::vector<Row>& rows, const std::vector<std::string>& notes) {
  std::string text = "{\"rows\": [";
  for (const Row& row : rows) {
    if (&row != &rows.front()) text += ",";
    text += "\n  {\"operation\": " + quoted(row.operation) + ", \"unit\": " + quoted(row.unit);
    text += print(", \"ours\": %.4g, \"against\": ", row.ours) + quoted(row.against);
    text += print(", \"other\": %.4g, \"ratio\": %.4g", row.other, row.ratio());
    if (row.bound)
      text += print(", \"bound\": %.4g, \"met\": %s", *row.bound, row.isMet() ? "true" : "false");
    text += "}";
  }
  text += "\n], \"notes\": [";
  for (const std::string& note : notes) text += (&note == &notes.front() ? "" : ", ") + quoted(note);
  return text + "]}\n";
}

}  // namespace bench
