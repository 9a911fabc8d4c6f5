// Documents on disk: round trips, load errors that name the place, and saves that never lose
// the previous file.
#include "ModelTestSupport.h"

#include <algorithm>
#include <signal.h>
#include <sys/resource.h>
#include <sys/wait.h>
#include <unistd.h>

#include <csignal>
#include <cstdlib>
#include <random>
#include <set>

#include "VORModelGenerator.h"

namespace {

std::string Examples() {
  const char* dir = std::getenv("PFV_EXAMPLES");
  return dir ? dir : PFV_SOURCE_EXAMPLES;
}

// A valid document to break in small ways.
const char* kValid = R"(<?xml version="1.0" encoding="UTF-8"?>
<pprDocument version="1">
  <products>
    <product id="P1" name="Underbody" alias="PPRProduct"/>
    <product id="P2" father="P1" name="Panel"/>
    <product id="R1" name="Resources" alias="PPRResources"/>
    <product id="R2" father="R1" name="Robot" resourceClass="Robot"/>
  </products>
  <process>
    <activity id="A1" type="BIWActivityRoot" label="Line">
      <activity id="A2" type="BIWActivityStation" label="S1" cycleTime="45" x="12.5" y="12.5">
        <input id="IO1" item="P2"/>
        <item ref="P2" via="IO1"/>
        <resource ref="R2"/>
        <attribute name="Shift" type="long" value="2"/>
      </activity>
      <activity id="A3" type="BIWActivityStation" label="S2"/>
      <flow from="A2" to="A3"/>
    </activity>
  </process>
</pprDocument>
)";

}  // namespace

TEST(RoundTripTest, BothSamplesLoadCheckAndSaveToEqualDocuments) {
  for (const char* name : {"underbody.pprx", "underbody-hub.pprx"}) {
    SCOPED_TRACE(name);
    std::string error;
    VORProcess_var doc = VORProcess_var::Adopt(VORProcess::Load(Examples() + "/" + name, error));
    ASSERT_TRUE(doc) << error;
    std::vector<std::string> problems;
    EXPECT_TRUE(VORModelChecker::Check(doc.get(), problems));
    const VORProcessStatistics s = doc->GetStatistics();
    EXPECT_GE(s.activities, 100);
    EXPECT_EQ(s.controlNodes, 2);
    EXPECT_GT(s.resources, 50);
    EXPECT_GE(s.assemblies, 3);
    EXPECT_EQ(doc->IsHubMode(), std::string(name) == "underbody-hub.pprx");
    const std::string text = doc->SaveToString();
    VORProcess_var again = LoadText(text, error);
    ASSERT_TRUE(again) << error;
    EXPECT_EQ(DumpDocument(again.get()), DumpDocument(doc.get()));
    EXPECT_EQ(again->SaveToString(), text);
    EXPECT_EQ(text, TempDir::Read(Examples() + "/" + name)) << "the sample is in saved form";
  }
}

TEST(RoundTripTest, EveryStoredFeatureSurvivesSaveAndLoad) {
  SmallLine l;
  VORModelDoor& door = l.doc->GetDoor();
  door.SetEnvironmentName("IPDDocEnv");
  VORISPPAbstractActivity_var(l.s1)->SetLabel("Schweißen 1 <&> \"quoted\"");
  VORIGraphNodeLayout_var(l.s1)->SetPertPosition(0.1, -1e-7);
  VORIGraphNodeLayout_var(l.group)->SetPertNodeState(2);
  VORIGraphNodeLayout_var(l.group)->SetPertNodeSize(30, 15.25);
  VORIUserAttributes_var(l.s1)->SetAttributeValue("Note", VORAttributeValue::String("ä ✓"));
  VORIUserAttributes_var(l.s1)->SetAttributeValue("Rate", VORAttributeValue::Double(1.0 / 3));
  VORIVisProperties_var(l.bracket)->SetShown(false);
  door.SetReferenceProduct(l.floor, l.panel);
  VORBaseUnknown_var ma, t1, t2;
  door.CreateMfgAssembly("MA", ma);
  QELIMfgAssembly_var(ma)->AddComponent(l.panel);
  VORISPPItemMgt_var(l.s3)->AssignItem(ma);
  door.DefinePlanType("Robot", t1);
  door.DefinePlanType("Gun", t2);
  door.SetPlanTypeAttribute(t1, "type", "plantype_name", "Robot");
  door.AddPlanTypeRelation(t1, "lumoplantypechild", t2);
  door.SetPlanTypeBase(t2, t1);
  door.SetHubAttribute(l.robot, "Invest", VORAttributeValue::Long(-5));
  door.SetResourcePlanType(l.robot, "Robot");

  TempDir dir;
  const std::string path = dir.File("line.pprx");
  std::string error;
  ASSERT_TRUE(l.doc->SaveAs(path, error)) << error;
  EXPECT_FALSE(l.doc->IsModified());
  VORProcess_var again = VORProcess_var::Adopt(VORProcess::Load(path, error));
  ASSERT_TRUE(again) << error;
  EXPECT_EQ(again->GetStorageName(), path);
  EXPECT_EQ(DumpDocument(again.get()), DumpDocument(l.doc.get()));
  EXPECT_EQ(again->SaveToString(), l.doc->SaveToString());
  VORAttributeValue v;
  VORIIPDAttributeMgt_var(VORBaseUnknown_var(static_cast<VORIDocInit*>(again.get())))
      ->GetUserDefinedAttribute(again->FindObject(IdOf(l.robot)), "Invest", v);
  EXPECT_EQ(v.longValue, -5);
  std::vector<std::string> problems;
  EXPECT_TRUE(VORModelChecker::Check(again.get(), problems));
}

TEST(RoundTripTest, GeneratedLinesOfSeveralSizesRoundTrip) {
  for (int n : {40, 250}) {
    VORModelGeneratorOptions o;
    o.activities = n;
    o.hub = n > 100;
    o.seed = static_cast<std::uint32_t>(n);
    VORProcess_var doc = VORProcess_var::Adopt(VORModelGenerator::Generate(o));
    std::vector<std::string> problems;
    ASSERT_TRUE(VORModelChecker::Check(doc.get(), problems)) << problems.front();
    EXPECT_NEAR(doc->GetStatistics().activities, n, n / 4 + 8);
    std::string error;
    VORProcess_var again = LoadText(doc->SaveToString(), error);
    ASSERT_TRUE(again) << error;
    EXPECT_EQ(DumpDocument(again.get()), DumpDocument(doc.get()));
  }
}

TEST(LoadErrorTest, MessagesNameTheFileWithLineAndColumnOrTheOffendingId) {
  const std::vector<LoadRefusal> cases = {
      {"<flow from=\"A2\" to=\"A3\"/>", "<flow from=\"A2\" to=\"A3\">",
       "bad.pprx:19:7: expected end of tag 'flow'"},
      {"<product id=\"P2\"", "<product id=\"P1\"", "bad.pprx:5:5: duplicate id 'P1'"},
      {"to=\"A3\"/>", "to=\"A9\"/>", "bad.pprx:18:7: flow to 'A9', which is no activity"},
      {"<input id=\"IO1\" item=\"P2\"/>", "<input id=\"IO1\" item=\"P7\"/>",
       "item 'P7' does not exist"},
      {"<resource ref=\"R2\"/>", "<resource ref=\"P2\"/>", "'P2' is a product, not a resource"},
      {"father=\"P1\" name=\"Panel\"", "father=\"P2\" name=\"Panel\"",
       "product 'P2' is its own father"},
      {"name=\"Underbody\" alias", "father=\"P2\" name=\"Underbody\" alias", "cycle through"},
      {"cycleTime=\"45\"", "cycleTime=\"fast\"", "'A2': attribute 'cycleTime' is not a number"},
      {"type=\"long\" value=\"2\"", "type=\"long\" value=\"2.5\"",
       "'A2': attribute 'value' is not an integer"},
      {"type=\"long\"", "type=\"complex\"", "unknown value type 'complex'"},
      {"BIWActivityStation\" label=\"S2\"", "BIWActivityWarp\" label=\"S2\"",
       "unknown activity type 'BIWActivityWarp'"},
      {"version=\"1\"", "version=\"7\"", "unsupported document version '7'"},
      {"<item ref=\"P2\" via=\"IO1\"/>", "<item ref=\"P2\" via=\"A2\"/>",
       "'A2' is not a product input"},
      {"<flow from=\"A2\" to=\"A3\"/>", "<flow from=\"A2\" to=\"A1\"/>",
       "does not join two children"},
      {"</process>", "</process><extra/>", "unexpected element <extra>"},
  };
  ExpectRefusals(kValid, cases);
  std::string error;
  EXPECT_TRUE(LoadText(kValid, error)) << error;
  EXPECT_FALSE(VORProcess_var::Adopt(VORProcess::Load("/no/such/file.pprx", error)));
  EXPECT_NE(error.find("/no/such/file.pprx"), std::string::npos);
  EXPECT_FALSE(VORProcess_var::Adopt(VORProcess::Load("/dev/zero", error))) << "not a regular file";
}

TEST(SaveTest, FailedSaveLeavesThePreviousFileAndSavedOnesKeepABackup) {
  TempDir dir;
  const std::string path = dir.File("line.pprx");
  SmallLine l;
  std::string error;
  ASSERT_TRUE(l.doc->SaveAs(path, error)) << error;
  const std::string first = TempDir::Read(path);
  VORISPPAbstractActivity_var(l.s1)->SetLabel("changed");
  ASSERT_TRUE(l.doc->Save(error)) << error;
  EXPECT_EQ(TempDir::Read(path + ".bak"), first);
  const std::string second = TempDir::Read(path);
  EXPECT_NE(second, first);

  // A save that fails half-way (file-size limit, like a full disk) keeps the file intact.
  VORModelGeneratorOptions o;
  o.activities = 200;
  VORProcess_var big = VORProcess_var::Adopt(VORModelGenerator::Generate(o));
  pid_t child = ::fork();
  if (child == 0) {
    std::signal(SIGXFSZ, SIG_IGN);
    rlimit limit{4096, 4096};
    ::setrlimit(RLIMIT_FSIZE, &limit);
    std::string why;
    const bool ok = big->SaveAs(path, why);
    ::_exit(!ok && why.find(path) != std::string::npos ? 0 : 1);
  }
  int status = 0;
  ::waitpid(child, &status, 0);
  EXPECT_TRUE(WIFEXITED(status) && WEXITSTATUS(status) == 0)
      << "the save should fail, naming the path";
  EXPECT_EQ(TempDir::Read(path), second);
  VORProcess_var reloaded = VORProcess_var::Adopt(VORProcess::Load(path, error));
  ASSERT_TRUE(reloaded) << error;
  EXPECT_EQ(reloaded->SaveToString(), second);

  EXPECT_FALSE(l.doc->SaveAs(dir.File("no/such/dir/x.pprx"), error));
  EXPECT_NE(error.find("no/such/dir"), std::string::npos);
  VORProcess_var fresh = VORProcess_var::Adopt(VORProcess::CreateNew());
  EXPECT_FALSE(fresh->Save(error)) << "no file name yet";
}

// The bundled line looks like a real underbody line: sub-lines merge, stations load and join,
// one grouping with Start and Stop, every kind of resource.
TEST(SampleTest, TheUnderbodySampleHasTheShapeOfARealLine) {
  std::string error;
  VORProcess_var doc =
      VORProcess_var::Adopt(VORProcess::Load(Examples() + "/underbody.pprx", error));
  ASSERT_TRUE(doc) << error;
  VORListValVORBaseUnknown_var* top = nullptr;
  VORISPPChildManagement_var(doc->GetRootProcess())->GetChildren(top, "Activity");
  int stations = 0, merges = 0, groupings = 0;
  VORBaseUnknown_var stationFather;
  for (const VORBaseUnknown_var& a : *top) {
    VORListValVORBaseUnknown_var* list = nullptr;
    VORISPPFlowMgt_var(a)->GetPreviousActivities(list, "Activity");
    merges += list->Size() >= 2;
    delete list;
    const std::string type = VORISPPActivity_var(a)->GetActivityType().str();
    VORISPPChildManagement_var children(a);
    if (type == "BIWActivityStation") {
      ++stations;
      children->GetChildren(list, "BIWActivityLoading");
      EXPECT_EQ(list->Size(), 1);
      delete list;
      children->GetChildren(list, "PhysicalActivity");
      EXPECT_GE(list->Size(), 2) << "loading and at least one joining";
      delete list;
      // Stations can be grouped: their resources hang under one father product.
      VORISPPResourceManagement_var(a)->GetResources(list, "Resource");
      for (const VORBaseUnknown_var& r : *list) {
        VORBaseUnknown_var father;
        VORIProduct_var(r)->GetFatherProduct(father);
        if (!stationFather)
          stationFather = father;
        EXPECT_EQ(father, stationFather) << IdOf(a.get());
      }
      delete list;
    } else if (type == "BIWActivityGrouping") {
      ++groupings;
      children->GetChildren(list, "Start");
      EXPECT_EQ(list->Size(), 1);
      delete list;
      children->GetChildren(list, "Stop");
      EXPECT_EQ(list->Size(), 1);
      delete list;
    }
  }
  delete top;
  EXPECT_GE(stations, 25);
  EXPECT_GE(merges, 1);
  EXPECT_EQ(groupings, 1);
  std::set<std::string> classes;
  std::vector<VORBaseUnknown_var> stack{doc->GetResourceRoot()};
  while (!stack.empty()) {
    VORBaseUnknown_var p = stack.back();
    stack.pop_back();
    if (VORIResource_var r{p}) {
      VORUnicodeString cls;
      r->GetResourceClass(cls);
      classes.insert(Utf8(cls));
    }
    VORListValVORBaseUnknown_var* children = nullptr;
    VORIProduct_var(p)->GetChildren(children);
    for (const VORBaseUnknown_var& c : *children)
      stack.push_back(c);
    delete children;
  }
  for (const char* cls :
       {"Station", "Robot", "WeldGun", "Fixture", "Worker", "Transport", "Buffer"})
    EXPECT_EQ(classes.count(cls), 1u) << cls;
}

// Damaged files (truncated, bytes changed) never crash the loader: each either loads into a
// consistent document or fails with a message that names the file.
TEST(LoadErrorTest, DamagedFilesLoadConsistentlyOrFailNamingTheFile) {
  SmallLine l;
  VORISPPItemMgt_var(l.s3)->AssignItem(l.floor);
  const std::string good = l.doc->SaveToString();
  std::mt19937 rnd(11);
  int failures = 0;
  for (int i = 0; i < 400; ++i) {
    std::string text = good;
    if (i % 4 == 0) {
      text.resize(rnd() % text.size());
    } else {
      for (int k = 0; k < 1 + i % 3; ++k) {
        const char replacements[] = {'"', '<', '>', '/', 'A', '1', ' ', '&', 'x', '\0'};
        text[rnd() % text.size()] = replacements[rnd() % sizeof replacements];
      }
    }
    std::string error;
    VORProcess_var doc = LoadText(text, error);
    if (doc) {
      std::vector<std::string> problems;
      EXPECT_TRUE(VORModelChecker::Check(doc.get(), problems)) << problems.front();
    } else {
      ++failures;
      EXPECT_EQ(error.rfind("bad.pprx", 0), 0u) << error;
    }
  }
  EXPECT_GT(failures, 200);
}

TEST(LoadProgressTest, ALoadReportsRisingPercentagesToAHundredAndAFailedOneStopsShort) {
  VORModelGeneratorOptions o;
  o.activities = 3000;
  VORProcess_var doc = VORProcess_var::Adopt(VORModelGenerator::Generate(o));
  const std::string text = doc->SaveToString();
  std::vector<int> reports;
  VORProcess::SetLoadProgress([&](int percent) { reports.push_back(percent); });
  std::string error;
  VORProcess_var loaded = LoadText(text, error);
  ASSERT_TRUE(loaded) << error;
  ASSERT_GE(reports.size(), 4u) << "the parse itself reports along the way";
  EXPECT_EQ(reports.front(), 0);
  EXPECT_EQ(reports.back(), 100);
  EXPECT_TRUE(std::is_sorted(reports.begin(), reports.end()));

  reports.clear();
  EXPECT_FALSE(LoadText(text.substr(0, text.size() / 2), error));
  ASSERT_FALSE(reports.empty());
  EXPECT_LT(reports.back(), 100);

  VORProcess::SetLoadProgress({});
  reports.clear();
  LoadText(text, error);
  EXPECT_TRUE(reports.empty());
}
