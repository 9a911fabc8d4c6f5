#include <gtest/gtest.h>
#include <stdlib.h>

#include <filesystem>
#include <fstream>

#include <xercesc/dom/DOMElement.hpp>

#include "QELZitBltConfiguration.h"
#include "StrX.h"
#include "TempDir.h"
#include "VORSettingRepository.h"

namespace {

namespace cfg = QELZitBltConfiguration;

class ZitBltConfigurationTest : public ::testing::Test {
 protected:
  void SetUp() override {
    _dir = _temp.Path();
    std::filesystem::create_directories(_dir / "first");
    std::filesystem::create_directories(_dir / "second");
    const char* old = getenv("VORStartupPath");
    _oldStartup = old ? old : "";
    setenv("VORStartupPath", ((_dir / "first").string() + ":" + (_dir / "second").string()).c_str(),
           1);
    setenv("VOR_USER_SETTINGS_DIR", (_dir / "settings").c_str(), 1);
    VORSettingRepository::Forget();
    cfg::ForgetForTests();
  }
  void TearDown() override {
    cfg::ForgetForTests();
    VORSettingRepository::Forget();
    setenv("VORStartupPath", _oldStartup.c_str(), 1);
  }
  std::string Write(const std::string& relative, const std::string& content) {
    std::ofstream(_dir / relative) << content;
    return (_dir / relative).string();
  }
  std::vector<std::string> Names(const std::string& type) {
    VORIDOMDocument_var doc;
    EXPECT_TRUE(cfg::LoadConfiguration(doc));
    std::vector<std::string> names;
    for (const auto& d : cfg::DefinitionsFor(doc, VORUnicodeString(type)))
      names.push_back(d.name.ConvertToUTF8());
    return names;
  }

  TempDir _temp;
  std::filesystem::path _dir;
  std::string _oldStartup;
};

constexpr const char* kConfig = R"(<?xml version="1.0"?>
<ZitBltConfiguration>
  <ActivityZitBlt ActivityType="BIWActivityStation">
    <ZitBlt Name="Inputs" Type="QELBaseScrollListZitBltRep" LoadModule="QELZitBltVisu"
            Location="lefttop" Priority="1" InitialState="Collapsed" IconFile="I_Input">
      <UpdateData CmdName="QELStatesInputListZitBltCmd" LoadModule="QELZitBltModel"/>
      <UpdateData CmdName="Second" LoadModule="Ignored"/>
    </ZitBlt>
    <Group><ZitBlt Name="Nested" Type="QELZitBltRep"/></Group>
  </ActivityZitBlt>
  <ActivityZitBlt ActivityType="biwactivitystation">
    <ZitBlt Name="WrongCase"/>
  </ActivityZitBlt>
  <ActivityZitBlt ActivityType="BIWActivityStation">
    <ZitBlt Name="Resources" Location="bottommiddle"/>
  </ActivityZitBlt>
  <ActivityZitBlt><ZitBlt Name="NoType"/></ActivityZitBlt>
</ZitBltConfiguration>)";

TEST_F(ZitBltConfigurationTest, BlocksMatchTheTypeExactlyAndKeepDocumentOrderAtAnyDepth) {
  Write("second/zitbltcfg.xml", kConfig);
  EXPECT_EQ(Names("BIWActivityStation"),
            (std::vector<std::string>{"Inputs", "Nested", "Resources"}));
  EXPECT_TRUE(Names("biwActivityStation").empty());
  // A block without ActivityType reads as the empty type, which no activity has.
  EXPECT_EQ(Names(""), std::vector<std::string>{"NoType"});

  VORIDOMDocument_var doc;
  ASSERT_TRUE(cfg::LoadConfiguration(doc));
  const auto& defs = cfg::DefinitionsFor(doc, "BIWActivityStation");
  ASSERT_EQ(defs.size(), 3u);
  EXPECT_EQ(defs[0].type, VORUnicodeString("QELBaseScrollListZitBltRep"));
  EXPECT_EQ(defs[0].location, VORUnicodeString("lefttop"));
  EXPECT_EQ(defs[0].iconFile, VORUnicodeString("I_Input"));
  EXPECT_TRUE(defs[0].hasUpdateData);
  EXPECT_EQ(defs[0].updateCmdName, VORUnicodeString("QELStatesInputListZitBltCmd"))
      << "only the first UpdateData";
  EXPECT_FALSE(defs[1].hasUpdateData);
  EXPECT_TRUE(defs[1].location.IsEmpty()) << "absent attributes read as empty";
  // The cached answers are the DOM's answers.
  for (const char* type : {"BIWActivityStation", "biwactivitystation", "Unknown"}) {
    const auto& cached = cfg::DefinitionsFor(doc, type);
    const auto plain = cfg::ReadDefinitions(doc, type);
    ASSERT_EQ(cached.size(), plain.size());
    for (size_t i = 0; i < plain.size(); ++i)
      EXPECT_EQ(cached[i].name, plain[i].name);
  }
}

TEST_F(ZitBltConfigurationTest, MissingOrBrokenFilesFailQuietlyAndAreRetriedUntilOneParses) {
  VORIDOMDocument_var doc;
  EXPECT_FALSE(cfg::LoadConfiguration(doc));
  Write("first/zitbltcfg.xml", "<ZitBltConfiguration><ActivityZitBlt>");  // ill-formed
  EXPECT_FALSE(cfg::LoadConfiguration(doc));
  EXPECT_FALSE(doc);
  Write("first/zitbltcfg.xml", kConfig);
  ASSERT_TRUE(cfg::LoadConfiguration(doc));
  VORIDOMDocument_var first = doc;
  // Once loaded, a changed file is not read again.
  Write("first/zitbltcfg.xml", "<other/>");
  VORIDOMDocument_var again;
  ASSERT_TRUE(cfg::LoadConfiguration(again));
  EXPECT_EQ(again.get(), first.get());

  unsetenv("VORStartupPath");
  cfg::ForgetForTests();
  EXPECT_FALSE(cfg::LoadConfiguration(doc));
}

TEST_F(ZitBltConfigurationTest, ADoctypeIsAcceptedWhenItNamesNothingExternal) {
  // Internal entities are expanded.
  Write("first/zitbltcfg.xml",
        "<?xml version=\"1.0\"?><!DOCTYPE z [<!ENTITY a \"aaaa\"><!ENTITY b \"&a;&a;&a;\">]>"
        "<z><ActivityZitBlt ActivityType=\"&b;\"><ZitBlt Name=\"N\"/></ActivityZitBlt></z>");
  VORIDOMDocument_var doc;
  ASSERT_TRUE(cfg::LoadConfiguration(doc));
  EXPECT_EQ(cfg::ReadDefinitions(doc, VORUnicodeString("aaaaaaaaaaaa")).size(), 1u);
  // Markup characters inside the internal subset's literals and comments do not end it.
  cfg::ForgetForTests();
  Write("first/zitbltcfg.xml",
        "<?xml version=\"1.0\"?><!DOCTYPE z [<!-- <z> ] --><!ENTITY a 'x>]y'>]>"
        "<z><ActivityZitBlt ActivityType=\"&a;\"><ZitBlt Name=\"N\"/></ActivityZitBlt></z>");
  ASSERT_TRUE(cfg::LoadConfiguration(doc));
  EXPECT_EQ(cfg::ReadDefinitions(doc, VORUnicodeString("x>]y")).size(), 1u);

  // An external DTD, an external entity (used or only declared) and an entity bomb are refused,
  // quietly, and nothing of the named file gets in.
  const std::string secret = Write("second/secret.txt", "TOP-SECRET");
  std::string bomb = "<?xml version=\"1.0\"?><!DOCTYPE z [<!ENTITY l0 \"lol\">";
  for (int i = 1; i <= 9; ++i) {
    bomb += "<!ENTITY l" + std::to_string(i) + " \"";
    for (int k = 0; k < 10; ++k)
      bomb += "&l" + std::to_string(i - 1) + ";";
    bomb += "\">";
  }
  bomb += "]><z>&l9;</z>";
  const std::vector<std::string> refused = {
      "<?xml version=\"1.0\"?><!DOCTYPE z SYSTEM \"" + secret + "\"><z/>",
      "<?xml version=\"1.0\"?><!DOCTYPE z PUBLIC \"-//x//y\" \"http://127.0.0.1:9/z.dtd\"><z/>",
      "<?xml version=\"1.0\"?><!DOCTYPE z [<!ENTITY s SYSTEM \"file://" + secret +
          "\">]><z><ActivityZitBlt ActivityType=\"x\">&s;</ActivityZitBlt></z>",
      "<?xml version=\"1.0\"?><!DOCTYPE z [<!ENTITY s SYSTEM \"" + secret + "\">]><z/>", bomb};
  for (const std::string& text : refused) {
    cfg::ForgetForTests();
    Write("first/zitbltcfg.xml", text);
    VORIDOMDocument_var none;
    EXPECT_FALSE(cfg::LoadConfiguration(none)) << text;
    EXPECT_FALSE(none);
  }

  // The status-bar file follows the same rules.
  const std::string bars = Write("second/StatusBarConfiguration.xml",
                                 "<!DOCTYPE s [<!ENTITY t \"Bars\">]><StatusBars Name=\"&t;\"/>");
  VORIDOMDocument_var parsed;
  ASSERT_TRUE(cfg::ParseConfigFile(VORUnicodeString(bars), parsed));
  EXPECT_EQ(VORXercesPlatform::ToUTF8(parsed->getDocumentElement()->getAttribute(
                VORXercesPlatform::FromUTF8("Name").c_str())),
            "Bars");
  Write("second/StatusBarConfiguration.xml",
        "<!DOCTYPE s [<!ENTITY t SYSTEM \"" + secret + "\">]><StatusBars Name=\"x\"/>");
  EXPECT_FALSE(cfg::ParseConfigFile(VORUnicodeString(bars), parsed));
}

TEST_F(ZitBltConfigurationTest, StatusBarFileComesFromTheSettingAsItStandsOrFromTheSearchPath) {
  EXPECT_TRUE(cfg::StatusBarConfigFile().IsEmpty());
  const std::string found = Write("second/StatusBarConfiguration.xml", "<StatusBars/>");
  EXPECT_EQ(cfg::StatusBarConfigFile().ConvertToUTF8(), found);

  VORSettingRepository* settings = VORSettingRepository::GetRepository("QELPFViewerSettings");
  settings->WriteSetting("XMLFileForStatusbar", VORUnicodeString(""));
  EXPECT_EQ(cfg::StatusBarConfigFile().ConvertToUTF8(), found) << "empty means absent";
  settings->WriteSetting("XMLFileForStatusbar", VORUnicodeString("Mine.xml"));
  EXPECT_EQ(cfg::StatusBarConfigFile().ConvertToUTF8(), "Mine.xml")
      << "not searched along the path";

  VORIDOMDocument_var doc;
  EXPECT_TRUE(cfg::ParseConfigFile(VORUnicodeString(found), doc));
  EXPECT_FALSE(cfg::ParseConfigFile(VORUnicodeString("Mine.xml"), doc));
  EXPECT_FALSE(cfg::ParseConfigFile(VORUnicodeString(), doc));
}

TEST(StrXTest, ConvertsParserStringsAndCopiesOwnTheirText) {
  ASSERT_TRUE(VORXercesPlatform::Initialize());
  std::u16string text = u"BIWStationStatusBars";
  StrX a(text.c_str());
  StrX b(a);
  StrX c(nullptr);
  c = b;
  EXPECT_STREQ(a, "BIWStationStatusBars");
  EXPECT_STREQ(c, "BIWStationStatusBars");
  EXPECT_NE(a.localForm(), c.localForm());
  EXPECT_STREQ(StrX(nullptr), "");
}

}  // namespace
