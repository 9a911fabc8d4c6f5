// The lists of the bundled configuration following model changes through the subscribers.
#include "QELBaseScrollListZitBltRep.h"
#include "QELEZitBltCBSubscriber.h"
#include "QELIZitBltCBSubscriber.h"
#include "QELIZitBltMgr.h"
#include "QELOutputListZitBltCmd.h"
#include "QELStatesInputListZitBltCmd.h"
#include "QELZitBltConfiguration.h"
#include "QELZitBltRep.h"
#include "VORViewer.h"
#include "ZitBltListTestSupport.h"
#include "ZitBltTestSupport.h"

namespace {

class ZitBltListRefreshTest : public ::testing::Test {
 protected:
  void SetUp() override {
    ASSERT_NE(VORModuleLoader::LoadModule("QELZitBltModel"), nullptr);
    QELZitBltConfiguration::ForgetForTests();
    viewer = VORHandle<VORViewer>::Adopt(new VORViewer(nullptr, "v", 0, 800, 500, 0));
  }
  void TearDown() override {
    for (VORBaseUnknown* a : {line->group.get(), line->s1.get(), line->s2.get(), line->s3.get()})
      QELIZitBltMgr_var(VORBaseUnknown_var(a))->RemoveZitBlts();
    line.reset();
    viewer = NULL_var;
    VORDeferredDeletion::Drain();
    QELZitBltConfiguration::ForgetForTests();
  }
  void Build() {
    for (VORBaseUnknown* a : {line->group.get(), line->s1.get(), line->s2.get(), line->s3.get()})
      QELIZitBltMgr_var(VORBaseUnknown_var(a))->BuildZitBltReps(viewer);
  }
  // The items of a list ZitBlt: "<text>:<state>", or "(no list)".
  static std::vector<std::string> List(VORBaseUnknown* activity, const char* zitBlt) {
    QELZitBltRep* rep = nullptr;
    QELIZitBltMgr_var(VORBaseUnknown_var(activity))->GetZitBlt(zitBlt, &rep);
    QELBaseScrollListZitBltRep* list = rep != nullptr ? rep->GetScrollListRep() : nullptr;
    if (list == nullptr)
      return {"(no list)"};
    std::vector<std::string> lines;
    for (int i = 1; i <= list->GetItems().Size(); ++i)
      lines.push_back(ItemText(list->GetItems()[i]) + ":" + std::to_string(list->GetItemState(i)));
    return lines;
  }
  using Lines = std::vector<std::string>;

  std::unique_ptr<ListTestLine> line = std::make_unique<ListTestLine>();
  VORHandle<VORViewer> viewer;
};

TEST_F(ZitBltListRefreshTest, CommandsComeFromUpdateDataUnderTheirZitBltNames) {
  Build();
  QELIZitBltCBSubscriber_var subscriber(line->s1);
  QELBaseListZitBltCmd* command = nullptr;
  ASSERT_EQ(subscriber->GetUpdateCommand("ProductInput", &command), S_OK);
  EXPECT_NE(dynamic_cast<QELStatesInputListZitBltCmd*>(command), nullptr);
  EXPECT_EQ(command->GetPODName(), VORUnicodeString("ProductInput"));
  ASSERT_EQ(subscriber->GetUpdateCommand("ProductOutput", &command), S_OK);
  EXPECT_NE(dynamic_cast<QELOutputListZitBltCmd*>(command), nullptr);
  EXPECT_EQ(subscriber->GetUpdateCommand("BIWStationStatusBars", &command), E_FAIL)
      << "a status bar without UpdateData";
}

TEST_F(ZitBltListRefreshTest, AnInputAddedShowsInItsStationAndInTheGroupAbove) {
  ListTestLine& l = *line;
  Build();
  EXPECT_EQ(List(l.s1, "ProductInput"), Lines{});
  l.Input(l.s1, l.panel);
  EXPECT_EQ(List(l.s1, "ProductInput"), (Lines{"Panel:1"}));
  // The refresh climbs: what the station takes from outside is the group's input too.
  EXPECT_EQ(List(l.group, "ProductInput"), (Lines{"Panel:0"}));
  l.Output(l.s1, l.sub);
  EXPECT_EQ(List(l.group, "ProductOutput"), (Lines{"Sub:1"}));
  l.Input(l.s2, l.sub);
  l.door().AssignResource(l.s1, l.robot);
  EXPECT_EQ(List(l.s1, "ProductOutput"), (Lines{"Sub:0"}));
  EXPECT_EQ(List(l.s1, "Resource"), (Lines{"Robot:2"}));
  EXPECT_EQ(List(l.s2, "ProductInput"), (Lines{"Sub:1"}));
  // Sub is now made and used inside the group.
  l.Output(l.s2, l.floor);
  EXPECT_EQ(List(l.group, "ProductOutput"), (Lines{"Floor:1"}));
  EXPECT_EQ(List(l.group, "ProductInput"), (Lines{"Panel:0"}));
  // Other stations' lists are left alone.
  EXPECT_EQ(List(l.s3, "ProductInput"), Lines{});
  l.door().UnassignResource(l.s1, l.robot);
  EXPECT_EQ(List(l.s1, "Resource"), Lines{});
  // Undoing an input's removal brings its line back.
  VORChangeLog log;
  l.door().SetRecorder(&log);
  VORListValVORBaseUnknown_var* inputs = nullptr;
  VORISPPFlowMgt_var(l.s2)->GetProductInputs(inputs);
  l.door().RemoveProductIO((*inputs)[1]);
  delete inputs;
  l.door().SetRecorder(nullptr);
  EXPECT_EQ(List(l.s2, "ProductInput"), (Lines{"Sub:0"})) << "assigned, without an input now";
  l.door().Undo(log);
  EXPECT_EQ(List(l.s2, "ProductInput"), (Lines{"Sub:1"}));
}

TEST_F(ZitBltListRefreshTest, MutedCallbacksLeaveTheListsUntilTheyAreRefreshedByName) {
  ListTestLine& l = *line;
  Build();
  QELIZitBltCBSubscriber_var subscriber(l.s1);
  subscriber->SetCallbacksSuspended(true);
  l.Input(l.s1, l.panel);
  EXPECT_EQ(List(l.s1, "ProductInput"), Lines{});
  subscriber->SetCallbacksSuspended(false);
  QELIZitBltMgr_var(l.s1)->UpdateZitBlt("ProductInput");
  EXPECT_EQ(List(l.s1, "ProductInput"), (Lines{"Panel:1"}));
}

TEST_F(ZitBltListRefreshTest, AListCommandClassThatDoesNotLoadLeavesItsZitBltEmpty) {
  ZitBltStartupDir startup;
  startup.WriteConfig(
      "<C><ActivityZitBlt ActivityType=\"BIWActivityStation\">"
      "<ZitBlt Name=\"ProductInput\" Type=\"QELBaseScrollListZitBltRep\" "
      "LoadModule=\"QELZitBltVisu\" Location=\"lefttop\">"
      "<UpdateData CmdName=\"QELNoSuchListZitBltCmd\" LoadModule=\"QELZitBltModel\"/></ZitBlt>"
      "<ZitBlt Name=\"Resource\" Type=\"QELBaseScrollListZitBltRep\" "
      "LoadModule=\"QELZitBltVisu\" Location=\"bottommiddle\">"
      "<UpdateData CmdName=\"QELStatesResourceListZitBltCmd\" LoadModule=\"QELNoSuchModule\"/>"
      "</ZitBlt><ZitBlt Name=\"ProductOutput\" Type=\"QELBaseScrollListZitBltRep\" "
      "LoadModule=\"QELZitBltVisu\" Location=\"righttop\">"
      "<UpdateData CmdName=\"QELOutputListZitBltCmd\" LoadModule=\"QELZitBltModel\"/></ZitBlt>"
      "</ActivityZitBlt></C>");
  ListTestLine& l = *line;
  Build();
  QELBaseListZitBltCmd* command = nullptr;
  EXPECT_EQ(QELIZitBltCBSubscriber_var(l.s1)->GetUpdateCommand("ProductInput", &command), E_FAIL);
  EXPECT_EQ(QELIZitBltCBSubscriber_var(l.s1)->GetUpdateCommand("Resource", &command), E_FAIL);
  l.Input(l.s1, l.panel);
  l.door().AssignResource(l.s1, l.robot);
  l.Output(l.s1, l.floor);
  EXPECT_EQ(List(l.s1, "ProductInput"), Lines{});
  EXPECT_EQ(List(l.s1, "Resource"), Lines{});
  EXPECT_EQ(List(l.s1, "ProductOutput"), (Lines{"Floor:0"})) << "the others still work";
  QELIZitBltMgr_var(l.s1)->UpdateAllZitBlts();
  EXPECT_EQ(List(l.s1, "ProductInput"), Lines{});
}

// The bundled sample line: its stations and its grouping show inputs, outputs and resources.
TEST(ZitBltSampleLineListsTest, StationsAndTheRespotGroupListWhatAPlannerExpects) {
  ASSERT_NE(VORModuleLoader::LoadModule("QELZitBltModel"), nullptr);
  QELZitBltConfiguration::ForgetForTests();
  std::string error;
  auto doc = VORProcess_var::Adopt(
      VORProcess::Load(std::string(std::getenv("PFV_EXAMPLES")) + "/underbody.pprx", error));
  ASSERT_TRUE(doc) << error;
  auto viewer = VORHandle<VORViewer>::Adopt(new VORViewer(nullptr, "v", 0, 800, 500, 0));
  std::vector<QELIZitBltMgr_var> built;
  auto lines = [&](const char* id, const char* zitBlt) {
    VORBaseUnknown_var activity(doc->FindObject(id));
    QELIZitBltMgr_var manager(activity);
    manager->BuildZitBltReps(viewer);
    built.push_back(manager);
    QELZitBltRep* rep = nullptr;
    manager->GetZitBlt(zitBlt, &rep);
    QELBaseScrollListZitBltRep* list = rep ? rep->GetScrollListRep() : nullptr;
    std::vector<std::string> text;
    for (int i = 1; list != nullptr && i <= list->GetItems().Size(); ++i)
      text.push_back(ItemText(list->GetItems()[i]) + ":" + std::to_string(list->GetItemState(i)));
    return text;
  };
  using Lines = std::vector<std::string>;
  // FF010: two parts loaded, the floor assembly made (its last weld's output is the same item).
  EXPECT_EQ(lines("A7", "ProductInput"), (Lines{"Front floor panel:1", "Tunnel reinforcement:1"}));
  EXPECT_EQ(lines("A7", "ProductOutput"), (Lines{"Front floor assembly FF010:0"}));
  EXPECT_EQ(lines("A7", "Resource"), (Lines{"FF010:2"}));
  // The group: what its stations take from outside, and what it hands on.
  EXPECT_EQ(lines("A645", "ProductInput"), (Lines{"Underbody assembly UB060:0", "Battery tray 2:0",
                                                  "Underbody reinforcement 2:0"}));
  EXPECT_EQ(lines("A645", "ProductOutput"), (Lines{"Underbody assembly UB080:1"}));
  // A joining operation lists the inputs assigned to it (none here) and its resources.
  EXPECT_EQ(lines("A20", "ProductInput"), Lines{});
  EXPECT_EQ(lines("A20", "Resource"), (Lines{"FF010 robot R1:2", "FF010 gun G1:2"}));
  for (const QELIZitBltMgr_var& manager : built)
    manager->RemoveZitBlts();
  built.clear();
  doc = NULL_var;
  VORDeferredDeletion::Drain();
  QELZitBltConfiguration::ForgetForTests();
}

}  // namespace
