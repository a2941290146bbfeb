#include <gtest/gtest.h>
#include <zip.h>
#include <zlib.h>

#include <random>

#include "reader/importers/FileKind.h"
#include "reader/importers/Unpacking.h"
#include "reader/text/Fault.h"
#include "tests/reader/Archives.h"

namespace ax::reader::testing {
namespace {

struct Result {
  std::vector<std::pair<std::string, std::string>> files;
  std::vector<std::string> faults;
  std::string thrown;
};

Result unpackAll(const std::string& bytes, bool readsDamaged = false) {
  Result result;
  UnpackOptions options;
  options.readsDamaged = readsDamaged;
  options.onFault = [&](const std::string& file, const std::string& what, const std::string&) {
    result.faults.push_back(file + ": " + what);
  };
  try {
    unpack(bytes, "a", options, [&](const std::string& name, std::string_view unpacked) {
      result.files.emplace_back(name, unpacked);
    });
  } catch (const Fault& fault) {
    result.thrown = fault.what;
  }
  return result;
}

using Files = std::vector<std::pair<std::string, std::string>>;

TEST(UnpackingTest, HandsOverWhatIsPackedAndWhatIsNot) {
  EXPECT_EQ(unpackAll("plain").files, (Files{{"a", "plain"}}));
  EXPECT_EQ(unpackAll(gzipped("one") + gzipped(" two")).files, (Files{{"a", "one two"}}));
  const Files packed = {{"rides/b.tcx", "<b/>"},
                        {"__MACOSX/rides/b.tcx", "x"},
                        {".hidden", "x"},
                        {"c.fit.gz", gzipped("fit")},
                        {"empty/", ""}};
  EXPECT_EQ(unpackAll(zipped(packed)).files, (Files{{"a/rides/b.tcx", "<b/>"}, {"a/c.fit.gz", "fit"}}));
}

TEST(UnpackingTest, TellsWhatIsDamaged) {
  const std::string whole = gzipped(std::string(5000, 'x') + "end");
  const std::string cut = whole.substr(0, whole.size() - 9);
  EXPECT_EQ(unpackAll(cut).thrown, "the archive is cut off");
  const Result partial = unpackAll(cut, true);
  ASSERT_EQ(partial.files.size(), 1U);
  EXPECT_TRUE(partial.files[0].second.starts_with("xxx"));
  EXPECT_EQ(partial.faults.size(), 1U);
  std::string wrongSum = whole;
  wrongSum[whole.size() - 6] ^= 1;
  EXPECT_EQ(unpackAll(wrongSum).thrown, "the archive is damaged");

  const std::string two = zipped({{"a.tcx", std::string(300, 'a')}, {"b.tcx", "<b/>"}});
  std::string oneDamaged = two;
  oneDamaged[30 + 5] ^= 0x55;  // the first bytes of its data
  const Result rest = unpackAll(oneDamaged);
  EXPECT_EQ(rest.files, (Files{{"a/b.tcx", "<b/>"}}));
  EXPECT_EQ(rest.faults.size(), 1U);
  EXPECT_TRUE(unpackAll(two.substr(0, two.size() / 2)).thrown.starts_with("the archive cannot be opened"));
}

TEST(UnpackingTest, BoundsBombs) {
  const std::string large(60 << 20, '\0');
  const std::string bomb = gzipped(large);
  ASSERT_LT(bomb.size() * 200, large.size());
  EXPECT_EQ(unpackAll(bomb, true).thrown, "the archive unpacks to more than 16 MB");
  EXPECT_EQ(unpackAll(zipped({{"a", large}}), true).thrown, "the archive unpacks to more than 16 MB");
  const std::string share(7 << 20, '\0');
  EXPECT_EQ(unpackAll(zipped({{"a", share}, {"b", share}, {"c", share}})).thrown,
            "the archive unpacks to more than 16 MB")
      << "all files of an archive count together";
}

TEST(UnpackingTest, HoldsAgainstAnyBytes) {
  std::mt19937 random(20261123);
  const std::string packed[] = {gzipped(std::string(500, 'x') + "end"),
                                zipped({{"a.gz", gzipped("inner")}, {"b", std::string(200, 'b')}})};
  for (int run = 0; run < 2000; ++run) {
    std::string bytes = packed[run % 2];
    for (int i = random() % 4; i >= 0; --i)
      bytes[4 + random() % (bytes.size() - 4)] = static_cast<char>(random());
    if (run % 3 == 0) bytes.resize(4 + random() % (bytes.size() - 4));
    const Result result = unpackAll(bytes, run % 5 == 0);
    std::size_t size = 0;
    for (const auto& [name, unpacked] : result.files) size += unpacked.size();
    EXPECT_LE(size, std::size_t{16} << 20);
  }
}

TEST(FileKindTest, TellsFilesByTheirFirstBytes) {
  using namespace std::string_literals;
  const std::pair<std::string, std::string> names[] = {
      {"", "an empty file"},
      {"\x89PNG\r\n", "a PNG picture"},
      {"\xFF\xD8\xFF\xE0", "a JPEG picture"},
      {"%PDF-1.7", "a PDF document"},
      {"Dear diary", "a plain text"},
      {"\x01\x02\x00\x03"s, "a file of an unknown kind"},
      {" {\"format\": 1}", "a JSON text"},
      {"\xEF\xBB\xBF <gpx/>", "an XML text"},
      {"<\0g\0"s, "an XML text"},
      {gzipped("x"), "a gzip archive"},
      {"\x0E\x20\0\0\0\0\0\0.FIT\0\0"s, "a FIT file"},
  };
  for (const auto& [bytes, name] : names) EXPECT_EQ(nameOfKind(bytes), name);
}

}  // namespace
}  // namespace ax::reader::testing
