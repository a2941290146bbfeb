#include <nlohmann/json.hpp>

#include "tests/apps/ProgramTest.h"
#include "tests/reader/Archives.h"

namespace ax::app {
namespace {

using Json = nlohmann::ordered_json;
using reader::testing::gzipped;
using reader::testing::zipped;

class WorkoutCommandsTest : public ProgramTest {
 protected:
  std::string sampleText(const std::string& name) const {
    std::ifstream in(sample("workouts/" + name), std::ios::binary);
    return {std::istreambuf_iterator<char>(in), std::istreambuf_iterator<char>()};
  }
  const std::string run1 = sampleText("morning-run.tcx");
  const std::string ride = sampleText("evening-ride.gpx");
};

// Two points of a track, a quarter of an hour apart.
std::string gpx(const std::string& day, const std::string& offset = "Z") {
  return "<gpx><trk><type>running</type><trkseg><trkpt lat='50' lon='10'><time>" + day + "T21:44:00" +
         offset + "</time></trkpt><trkpt lat='50.02' lon='10'><time>" + day + "T21:59:00" + offset +
         "</time></trkpt></trkseg></trk></gpx>";
}

TEST_F(WorkoutCommandsTest, OpenPackedFilesAsTheyOpenThemUnpacked) {
  const std::string spoken = run("speak -", run1).out;
  EXPECT_NE(spoken.find("Running"), std::string::npos);
  EXPECT_EQ(run("speak -", gzipped(run1)).out, spoken);
  EXPECT_EQ(run("speak -", zipped({{"run.tcx", run1}})).out, spoken);
  const Outcome list = run("speak -", zipped({{"run.tcx", run1}, {"ride.gpx", ride}}));
  EXPECT_EQ(list.code, 0);
  EXPECT_NE(list.out.find("Workouts, Total, 2"), std::string::npos) << list.out;
  EXPECT_EQ(run("speak - --workout 1", zipped({{"run.tcx", run1}, {"ride.gpx", ride}})).out, spoken);
  EXPECT_EQ(run("speak - --workout 3", zipped({{"run.tcx", run1}, {"ride.gpx", ride}})).err,
            "axvelto: -/run.tcx: there is no workout 3, at --workout, expected 1 to 2\n");
}

TEST_F(WorkoutCommandsTest, NameWhatAFileIsThatTheyCannotOpen) {
  const auto errorOf = [&](const std::string& command, const std::string& input = "") {
    const Outcome outcome = run(command, input);
    EXPECT_EQ(outcome.code, 2) << command;
    EXPECT_EQ(outcome.out, "");
    return outcome.err;
  };
  const std::string formats = "expected a scene or a workout in FIT, TCX or GPX\n";
  EXPECT_EQ(errorOf("speak -", "\x89PNG\r\n"), "axvelto: -: a PNG picture, " + formats);
  EXPECT_EQ(errorOf("speak -"), "axvelto: -: an empty file, " + formats);
  EXPECT_EQ(errorOf("speak /"),
            "axvelto: /: is a folder, expected a file; axvelto import makes a list of a folder\n");
  EXPECT_EQ(errorOf("speak a b"),
            "axvelto: one FILE at a time; import makes a list of several (axvelto --help tells the use)\n");
  const std::string locked = file("locked.tcx", run1);
  std::filesystem::permissions(locked, std::filesystem::perms::none);
  if (geteuid() != 0) {
    EXPECT_EQ(errorOf("speak " + locked),
              "axvelto: " + locked + ": may not be read, expected permission to read it\n");
  }
}

TEST_F(WorkoutCommandsTest, ImportAFolderAndGoOnBehindWhatCannotBeRead) {
  const std::string top = file("folder-of-workouts", "");
  std::filesystem::remove(top);
  std::filesystem::create_directories(top + "/2026");
  file("folder-of-workouts/2026/run.tcx", run1);
  file("folder-of-workouts/again.tcx.gz", gzipped(run1));
  file("folder-of-workouts/ride.gpx", ride);
  file("folder-of-workouts/.hidden", "x");
  const Outcome whole = run("import " + top);
  EXPECT_EQ(whole.code, 0) << whole.err;
  EXPECT_EQ(whole.err, "axvelto: " + top + "/again.tcx.gz: the same workout as in " + top +
                           "/2026/run.tcx, counted once\n");
  EXPECT_NE(run("speak -", whole.out).out.find("Workouts, Total, 2"), std::string::npos);

  const std::string ridden = top + "/ride.gpx";
  const Outcome twice = run("import " + ridden + " " + ridden);
  EXPECT_EQ(twice.out, run("import " + ridden).out) << "one file named twice";
  EXPECT_EQ(twice.err, "axvelto: " + ridden + ": the same workout as in " + ridden + ", counted once\n");

  if (geteuid() != 0) {
    const std::string locked = top + "/locked";
    std::filesystem::create_directory(locked);
    std::filesystem::permissions(locked, std::filesystem::perms::none);
    const Outcome others = run("import " + top);
    const std::string message =
        "axvelto: " + locked + ": the folder may not be read, expected permission to read it\n";
    EXPECT_EQ(others.code, 1);
    EXPECT_NE(others.err.find(message), std::string::npos) << others.err;
    EXPECT_EQ(others.out, whole.out);
    EXPECT_EQ(run("import " + locked).err, message);
    std::filesystem::remove(locked);
  }

  const std::string note = file("folder-of-workouts/note.txt", "Dear diary");
  const Outcome some = run("import " + top);
  EXPECT_EQ(some.code, 1);
  EXPECT_EQ(some.out, whole.out);
  EXPECT_NE(some.err.find(note + ": a plain text, expected a workout in FIT, TCX or GPX"), std::string::npos);
  EXPECT_EQ(run("import " + note).code, 2);
  EXPECT_EQ(run("import " + note + " " + note).code, 2) << "there is nothing to print";
}

TEST_F(WorkoutCommandsTest, TellTimesByTheClockThatIsAskedFor) {
  const std::string evening = gpx("2026-03-08", "-05:00");
  EXPECT_NE(run("speak -", evening).out.find("March 8, 2026 at 9:44"), std::string::npos);
  for (const char* command : {"speak -", "tree -", "graph -", "ask -", "page -", "audit -"}) {
    const Outcome outcome = run(std::string(command) + " --time-zone Asia/Tokyo", evening);
    EXPECT_EQ(outcome.code, 0) << command << outcome.err;
  }
  EXPECT_NE(run("speak - --time-zone Asia/Tokyo", evening).out.find("March 9, 2026 at 11:44"),
            std::string::npos);
  EXPECT_EQ(run("speak - --time-zone Mars/Olympus", evening).code, 2);
}

TEST_F(WorkoutCommandsTest, ReadADamagedFileWhenAsked) {
  const std::string cut = run1.substr(0, run1.size() / 2);
  EXPECT_EQ(run("speak -", cut).code, 2);
  const Outcome outcome = run("speak - --partial", cut);
  EXPECT_EQ(outcome.code, 0);
  EXPECT_NE(outcome.out.find("Running"), std::string::npos);
  EXPECT_NE(outcome.err.find("read as far as it goes"), std::string::npos);
}

}  // namespace
}  // namespace ax::app
