#include <gtest/gtest.h>
#include <stdlib.h>

#include "TempDir.h"
#include "VOREnv.h"
#include "VORMsgCatalog.h"
#include "VORSettingRepository.h"

namespace {

class ResourceLookupTest : public ::testing::Test {
 protected:
  void SetUp() override {
    const char* old = getenv("VORStartupPath");
    _oldStartup = old ? old : "";
    setenv("VORStartupPath", (_first.Path() + ":" + _second.Path()).c_str(), 1);
    VORMsgCatalog::ClearCache();
  }
  void TearDown() override {
    setenv("VORStartupPath", _oldStartup.c_str(), 1);
    VORMsgCatalog::ClearCache();
  }
  TempDir _first, _second;
  std::string _oldStartup;
};

TEST_F(ResourceLookupTest, FindPathTakesTheFirstDirectoryHoldingARegularFile) {
  _second.Write("zitbltcfg.xml", "<second/>");
  EXPECT_EQ(VORFindResource("zitbltcfg.xml").ConvertToUTF8(), _second.Path() + "/zitbltcfg.xml");
  _first.Write("zitbltcfg.xml", "<first/>");
  EXPECT_EQ(VORFindResource("zitbltcfg.xml").ConvertToUTF8(), _first.Path() + "/zitbltcfg.xml");
  // A directory of that name is not a file.
  std::filesystem::create_directories(_first.Path() + "/folder.xml");
  EXPECT_TRUE(VORFindPath("folder.xml", VORUnicodeString(_first.Path())).IsEmpty());
  EXPECT_TRUE(VORFindPath("absent.xml", VORUnicodeString(_first.Path() + "::")).IsEmpty());
}

TEST_F(ResourceLookupTest, CatalogueTextsReplaceDefaultsAndTakeParameters) {
  _second.Write("msgcatalog/QELTestCmd.msg",
                "# comment\n"
                "title = \"Fehler\";\n"
                "ErrorMessage1 = \"Activity /p1 is not a station (/p2)\";\n"
                "Broken = \"never closed\n");
  VORListValVORUnicodeString params;
  params.Append("Station 10");
  params.Append("x");
  EXPECT_EQ(VORMsgCatalog::BuildMessage("QELTestCmd", "title", "Error"),
            VORUnicodeString("Fehler"));
  EXPECT_EQ(VORMsgCatalog::BuildMessage("QELTestCmd", "ErrorMessage1", "default", &params),
            VORUnicodeString("Activity Station 10 is not a station (x)"));
  EXPECT_EQ(VORMsgCatalog::BuildMessage("QELTestCmd", "Broken", "fallback"),
            VORUnicodeString("fallback"));
  EXPECT_EQ(VORMsgCatalog::BuildMessage("QELTestCmd", "Missing", "fallback"),
            VORUnicodeString("fallback"));
  EXPECT_EQ(VORMsgCatalog::BuildMessage("NoSuchCatalogue", "title", "Error"),
            VORUnicodeString("Error"));
}

TEST_F(ResourceLookupTest, EnvValueIsUntouchedWhenUnset) {
  VORString value("kept");
  unsetenv("PFV_TEST_UNSET_VARIABLE");
  EXPECT_EQ(VORGetEnvValue("PFV_TEST_UNSET_VARIABLE", value), E_FAIL);
  EXPECT_EQ(value, VORString("kept"));
  setenv("PFV_TEST_UNSET_VARIABLE", "7", 1);
  EXPECT_EQ(VORGetEnvValue("PFV_TEST_UNSET_VARIABLE", value), S_OK);
  EXPECT_EQ(value, VORString("7"));
  unsetenv("PFV_TEST_UNSET_VARIABLE");
}

TEST(SettingRepositoryTest, AbsentKeysLeaveValuesAloneAndSavedValuesComeBack) {
  TempDir home;
  setenv("VOR_USER_SETTINGS_DIR", (home.Path() + "/nested/dir").c_str(), 1);
  VORSettingRepository::Forget();
  VORSettingRepository* repo = VORSettingRepository::GetRepository("QELPFViewerSettings");
  ASSERT_NE(repo, nullptr);
  VORUnicodeString value("StatusBarConfiguration.xml");
  EXPECT_EQ(repo->ReadSetting("XMLFileForStatusbar", value), E_FAIL);
  EXPECT_EQ(value, VORUnicodeString("StatusBarConfiguration.xml"));

  repo->WriteSetting("XMLFileForStatusbar", VORUnicodeString("Mine.xml"));
  repo->WriteSetting("MultiLine", VORUnicodeString("a\nb\\c"));
  repo->WriteSetting("Count", 12);
  ASSERT_EQ(repo->SaveRepository(), S_OK);

  VORSettingRepository::Forget();
  repo = VORSettingRepository::GetRepository("QELPFViewerSettings");
  EXPECT_EQ(repo->ReadSetting("XMLFileForStatusbar", value), S_OK);
  EXPECT_EQ(value, VORUnicodeString("Mine.xml"));
  EXPECT_EQ(repo->ReadSetting("MultiLine", value), S_OK);
  EXPECT_EQ(value, VORUnicodeString("a\nb\\c"));
  int count = 0;
  EXPECT_EQ(repo->ReadSetting("Count", count), S_OK);
  EXPECT_EQ(count, 12);
  EXPECT_EQ(repo->ReadSetting("MultiLine", count), E_FAIL);
  EXPECT_EQ(count, 12);
  VORSettingRepository::Forget();
}

TEST(SettingRepositoryTest, KeysThatCouldNotBeReadBackAreRefused) {
  TempDir home;
  setenv("VOR_USER_SETTINGS_DIR", home.Path().c_str(), 1);
  VORSettingRepository::Forget();
  VORSettingRepository* repo = VORSettingRepository::GetRepository("Keys");
  for (const char* key : {"#comment", "a=b", "two\nlines", ""})
    repo->WriteSetting(key, VORUnicodeString("lost"));
  repo->WriteSetting(" kept#", VORUnicodeString("value"));
  VORUnicodeString value;
  for (const char* key : {"#comment", "a=b", "two\nlines", ""})
    EXPECT_EQ(repo->ReadSetting(key, value), E_FAIL) << "refused at once: " << key;
  ASSERT_EQ(repo->SaveRepository(), S_OK);
  VORSettingRepository::Forget();
  repo = VORSettingRepository::GetRepository("Keys");
  for (const char* key : {"#comment", "a=b", "two\nlines", ""})
    EXPECT_EQ(repo->ReadSetting(key, value), E_FAIL) << key;
  EXPECT_EQ(repo->ReadSetting(" kept#", value), S_OK);
  EXPECT_EQ(value, VORUnicodeString("value"));
  VORSettingRepository::Forget();
}

}  // namespace
