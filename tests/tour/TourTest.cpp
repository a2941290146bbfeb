#include <gtest/gtest.h>

#include "platform/accessibility/CategoryRegistration.h"
#include "platform/formatting/StringTable.h"
#include "reader/audit/AuditReport.h"
#include "tests/tour/Samples.h"

// Every sample screen in every language, searched for what a listener would stumble over.
namespace ax::tour {

namespace {

constexpr const char* locales[] = {"en_US", "de_DE", "fr_FR", "es_ES", "ja_JP", "ar_EG"};

std::vector<std::string> tableFolders() {
  std::vector<std::string> folders;
  for (const char* folder : {"../share/axvelto/Host", "../share/axvelto/Platform", "../share/axvelto/Reader",
                             "../lib/AXVelto/resources/Accessibility"}) {
    folders.push_back(formatting::resourceFolderBeside(reinterpret_cast<const void*>(&tableFolders), folder));
  }
  return folders;
}

reader::AuditScreen audited(const std::filesystem::path& file, const std::string& locale) {
  Presented sample(file, locale);
  EXPECT_EQ(sample.snapshot.timesRaised(), 0u) << file.filename();
  EXPECT_TRUE(sample.run->hostFaults().empty()) << file.filename();
  reader::ShownContent shown = reader::readShownContent(sample.snapshot, sample.run->screen());
  reader::AuditScreen screen = reader::readAuditScreen(std::move(sample.snapshot), std::move(shown),
                                                       reader::LanguageWords(tableFolders()));
  screen.file = file.filename();
  screen.names = {sample.scene->names.begin(), sample.scene->names.end()};
  return screen;
}

}  // namespace

TEST(TourTest, SpeaksEveryScreenInEveryLanguageWithoutAFault) {
  ASSERT_FALSE(sampleScenes().empty());
  for (const auto& file : sampleScenes()) {
    reader::Audit audit;
    for (const char* locale : locales) {
      audit.screens.push_back(audited(file, locale));
      EXPECT_FALSE(audit.screens.back().elements.empty()) << file.filename() << " in " << locale;
    }
    reader::AuditReport report;
    report.add(audit, {});
    EXPECT_TRUE(report.holds()) << report.text();
  }
}

TEST(TourTest, NamesTheTargetOfEveryCategory) {
  std::string samples;
  for (const auto& file : sampleScenes()) samples += fileText(file);
  const Presented started(sampleScenes().front(), "");
  const auto& requests = ValidationManager::sharedInstance()->installationRequests();
  EXPECT_EQ(requests.size(), 65u);
  for (const InstallationRequest& request : requests) {
    ASSERT_TRUE(request.installed) << request.category;
    const std::string target = categoryTargetClassName(*Class::named(request.category));
    EXPECT_NE(samples.find("\"" + target + "\""), std::string::npos) << target;
  }
}

}  // namespace ax::tour
