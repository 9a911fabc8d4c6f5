// Input an attacker or a damaged disk could hand the readers: every refusal says what is wrong
// and where, and nothing half-read is ever accepted.
#include "ModelTestSupport.h"

#include <sys/wait.h>
#include <unistd.h>

#include <xercesc/dom/DOM.hpp>

#include "VORXercesPlatform.h"

namespace {

// Line 1 .. 12; the station A2 starts on line 6, column 7.
const char* kDocument = R"(<?xml version="1.0" encoding="UTF-8"?>
<pprDocument version="1">
  <products><product id="P1" name="Body"/></products>
  <process>
    <activity id="A1" type="BIWActivityRoot" label="Line">
      <activity id="A2" type="BIWActivityStation" label="S1" cycleTime="45" x="1" y="2">
        <attribute name="Load" type="double" value="0.5"/>
      </activity>
      <activity id="A3" type="BIWActivityStation" label="S2"/>
    </activity>
  </process>
</pprDocument>
)";

std::string ManyAttributes(int count) {
  std::string text = "<a>\n<b";
  for (int i = 0; i < count; ++i)
    text += " a" + std::to_string(i) + "=\"1\"";
  return text + "/>\n</a>\n";
}

}  // namespace

TEST(HostileNumbersTest, NonFiniteNumbersNegativeSizesAndWideStatesAreRefusedWithThePlace) {
  const std::vector<LoadRefusal> cases = {
      {"x=\"1\"", "x=\"nan\"", "bad.pprx:6:7: 'A2': attribute 'x' is not a finite number: 'nan'"},
      {"y=\"2\"", "y=\"-inf\"", "bad.pprx:6:7: 'A2': attribute 'y' is not a finite number"},
      {"cycleTime=\"45\"", "cycleTime=\"infinity\"", "attribute 'cycleTime' is not a finite"},
      {"x=\"1\"", "x=\"1e999\"", "attribute 'x' is not a finite number"},
      {"label=\"S1\"", "label=\"S1\" time=\"NAN\"", "attribute 'time' is not a finite number"},
      {"value=\"0.5\"", "value=\"nan\"", "bad.pprx:7:9: 'A2': value 'nan' is not a finite number"},
      {"label=\"S1\"", "label=\"S1\" width=\"-3\"", "'A2': attribute 'width' is negative: '-3'"},
      {"label=\"S1\"", "label=\"S1\" height=\"-0.5\"", "attribute 'height' is negative"},
      {"label=\"S1\"", "label=\"S1\" state=\"4294967298\"", "node state 4294967298 is not 0, 1"},
      {"label=\"S1\"", "label=\"S1\" state=\"-4294967295\"", "node state -4294967295 is not"},
  };
  ExpectRefusals(kDocument, cases);
  // Negative times are kept: the model accepts them as offsets.
  std::string error;
  VORProcess_var doc =
      LoadText(Replace(kDocument, "label=\"S1\"", "label=\"S1\" time=\"-2.5\" state=\"2\""), error);
  ASSERT_TRUE(doc) << error;
  EXPECT_NE(doc->SaveToString().find("time=\"-2.5\""), std::string::npos);
}

TEST(HostileBytesTest, ANulByteAnywhereIsRefusedWithItsPlace) {
  const std::string valid = kDocument;
  std::string error;
  ASSERT_TRUE(LoadText(valid, error)) << error;
  // A zero-filled tail, as a crash during a write on some file systems leaves it.
  EXPECT_FALSE(LoadText(valid + std::string(4096, '\0'), error));
  EXPECT_NE(error.find("bad.pprx:13:1: a NUL byte"), std::string::npos) << error;
  std::string inside = valid;
  inside[valid.find("S2")] = '\0';
  EXPECT_FALSE(LoadText(inside, error));
  EXPECT_NE(error.find("bad.pprx:9:"), std::string::npos) << error;
  EXPECT_FALSE(VORXercesPlatform::ParseMemory(std::string("<a/>\0", 5), "c.xml", error));
  EXPECT_NE(error.find("c.xml:1:5: a NUL byte"), std::string::npos) << error;
}

TEST(HostileStructureTest, RefusalsSayWhatIsWrongAndWhere) {
  std::string error;
  // Too many attributes on one element: refused before the parser builds them, in every reader.
  EXPECT_FALSE(VORXercesPlatform::ParseMemory(ManyAttributes(300000), "cfg.xml", error));
  EXPECT_NE(error.find("cfg.xml:2:1: an element with more than"), std::string::npos) << error;
  EXPECT_TRUE(VORXercesPlatform::ParseMemory(ManyAttributes(200), "cfg.xml", error)) << error;
  EXPECT_FALSE(LoadText(ManyAttributes(300000), error));
  EXPECT_NE(error.find("bad.pprx:2:1: an element with more than"), std::string::npos) << error;

  const std::string doctype = "<?xml version=\"1.0\"?>\n<!DOCTYPE pprDocument>\n<pprDocument/>";
  EXPECT_FALSE(LoadText(doctype, error));
  EXPECT_NE(error.find("bad.pprx:2:1: a DOCTYPE is not allowed"), std::string::npos) << error;
  EXPECT_FALSE(VORXercesPlatform::ParseMemory(doctype, "cfg.xml", error));
  EXPECT_NE(error.find("DOCTYPE is not allowed"), std::string::npos) << error;

  std::string deep = "<pprDocument version=\"1\">\n<process>";
  for (int i = 0; i < 600; ++i)
    deep += "<activity>";
  EXPECT_FALSE(LoadText(deep, error));
  EXPECT_NE(error.find("bad.pprx:2:"), std::string::npos) << error;
  EXPECT_NE(error.find("nested deeper than 512"), std::string::npos) << error;
  EXPECT_FALSE(VORXercesPlatform::ParseMemory(deep, "cfg.xml", error));
  EXPECT_NE(error.find("cfg.xml:2:"), std::string::npos) << error;

  const std::string planning = R"(<planning>
    <planType id="T1" base="T2"><attribute name="name" value="Line"/></planType>
    <planType id="T2" base="T1"><attribute name="name" value="Station"/></planType>
  </planning>
</pprDocument>)";
  EXPECT_FALSE(LoadText(Replace(kDocument, "</pprDocument>", planning), error));
  EXPECT_NE(error.find("the bases of plan type 'T1' form a cycle"), std::string::npos) << error;
}

TEST(HostileXmlTest, BillionLaughsAndExternalEntitiesAreRefusedAtOnce) {
  TempDir dir;
  const std::string secret = dir.Write("secret.txt", "TOP-SECRET-CONTENT");
  std::string laughs = "<?xml version=\"1.0\"?>\n<!DOCTYPE lolz [\n<!ENTITY lol \"lol\">\n";
  for (int i = 1; i <= 9; ++i) {
    laughs += "<!ENTITY lol" + std::to_string(i) + " \"";
    for (int k = 0; k < 10; ++k)
      laughs += i == 1 ? "&lol;" : "&lol" + std::to_string(i - 1) + ";";
    laughs += "\">\n";
  }
  laughs += "]>\n<pprDocument version=\"1\">&lol9;</pprDocument>\n";
  const std::string xxe = "<?xml version=\"1.0\"?>\n<!DOCTYPE d [<!ENTITY x SYSTEM \"file://" +
                          secret + "\">]>\n<pprDocument version=\"1\">&x;</pprDocument>\n";
  const std::string dtd =
      "<?xml version=\"1.0\"?>\n<!DOCTYPE d SYSTEM \"http://127.0.0.1:9/x.dtd\">\n"
      "<pprDocument version=\"1\"/>\n";
  for (const std::string& text : {laughs, xxe, dtd}) {
    std::string error;
    VORProcess_var doc = LoadText(text, error);
    EXPECT_FALSE(doc);
    EXPECT_NE(error.find("bad.pprx:"), std::string::npos) << error;
    EXPECT_EQ(error.find("TOP-SECRET"), std::string::npos);
  }
}

TEST(StaleTemporaryFileTest, OpeningADocumentRemovesWhatKilledSavesLeftBeside) {
  TempDir dir;
  const std::string path = dir.Write("line.pprx", kDocument);
  pid_t child = ::fork();
  if (child == 0)
    ::_exit(0);
  ::waitpid(child, nullptr, 0);
  const std::string stale = dir.Write("line.pprx.vortmp." + std::to_string(child), "torn");
  std::string error;
  VORProcess_var doc = VORProcess_var::Adopt(VORProcess::Load(path, error));
  ASSERT_TRUE(doc) << error;
  EXPECT_NE(::access(stale.c_str(), F_OK), 0) << "the dead save's file is gone";
}
