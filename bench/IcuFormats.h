#pragma once

#include <unicode/dtitvfmt.h>
#include <unicode/msgfmt.h>
#include <unicode/numberformatter.h>
#include <unicode/smpdtfmt.h>

#include <memory>
#include <string>

// The formatting inside the charts and the month, done with ICU alone for the environment's language and
// zone: what no way of describing them can save. Everything answers in UTF-8, as a speaking reader wants it.
namespace bench {

class IcuIntervals {
 public:
  explicit IcuIntervals(const char* skeleton);
  std::string text(double start, double end) const;

 private:
  std::unique_ptr<icu::DateIntervalFormat> format_;
};

class IcuDates {
 public:
  explicit IcuDates(const char* skeleton);
  std::string text(double time) const;

 private:
  std::unique_ptr<icu::SimpleDateFormat> format_;
};

class IcuNumbers {
 public:
  static IcuNumbers decimals(int most);
  static IcuNumbers percent();
  std::string text(double value) const;
  icu::UnicodeString wideText(double value) const;

 private:
  explicit IcuNumbers(icu::number::LocalizedNumberFormatter formatter) : formatter_(std::move(formatter)) {}
  icu::number::LocalizedNumberFormatter formatter_;
};

class IcuMessage {
 public:
  explicit IcuMessage(const std::string& pattern);
  std::string text(const icu::UnicodeString& argument) const;

 private:
  std::unique_ptr<icu::MessageFormat> format_;
};

}  // namespace bench
