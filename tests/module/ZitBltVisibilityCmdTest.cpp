// Hiding and showing ZitBlts by name on the selected activities, through the headless driver:
// the dialog's buttons, "All" and its deliberate asymmetry, several activities at once, the
// warning without ZitBlts, one undoable change per click, and the visibility kept with the
// document across a save and a new opening of the viewer (as a script run by the pfv program).
#include <gtest/gtest.h>

#include <cstdio>
#include <cstdlib>

#include "QELIZitBltMgr.h"
#include "QELZitBltRep.h"
#include "RunProgram.h"
#include "VORDocument.h"
#include "VORDriver.h"
#include "VORFileIO.h"
#include "VORIZitBltVisibility.h"
#include "VORModelDoor.h"
#include "VORViewer.h"
#include "ViewerTestSupport.h"
#include "ZitBltTestSupport.h"

namespace {

constexpr const char* kDialog = "QELFpaZitBltHideShowDlg";

// Stations carry three ZitBlts, loadings one, groupings none.
std::string Config() {
  auto zitblt = [](const char* name, const char* location) {
    return std::string("<ZitBlt Name=\"") + name +
           "\" Type=\"QELZitBltRep\" LoadModule=\"QELZitBltVisu\" Location=\"" + location +
           "\" IconFile=\"I_Test\"/>\n";
  };
  return "<Config><ActivityZitBlt ActivityType=\"BIWActivityStation\">\n" +
         zitblt("Inputs", "lefttop") + zitblt("Outputs", "righttop") +
         zitblt("Resources", "bottommiddle") +
         "</ActivityZitBlt>\n<ActivityZitBlt ActivityType=\"BIWActivityLoading\">\n" +
         zitblt("Status", "topmiddle") + "</ActivityZitBlt></Config>\n";
}

class ZitBltVisibilityCmdTest : public ::testing::Test {
 protected:
  void SetUp() override {
    startup.WriteIcon("I_Test", 16, 8);
    startup.WriteConfig(Config());
    auto doc = VORProcess_var::Adopt(VORProcess::CreateNew("Line"));
    VORModelDoor& door = doc->GetDoor();
    for (const char* label : {"S1", "S2"})
      AddActivity(door, doc->GetRootProcess(), label);
    AddActivity(door, doc->GetRootProcess(), "L", "BIWActivityLoading");
    // Inside the collapsed grouping: no ZitBlts built by the viewer.
    AddActivity(door, AddActivity(door, doc->GetRootProcess(), "G", "BIWActivityGrouping"), "S3");
    file = startup.Path().string() + "/line.pprx";
    OpenInViewer(driver, doc, file);
  }

  // Selects the activities (the first one first) and starts the command.
  bool StartOn(std::initializer_list<const char*> labels) {
    bool first = true;
    for (const char* label : labels) {
      if (first && !driver.PickObject(label))
        return false;
      if (!first)
        driver.GetEditor()->GetCSO()->AddElement(driver.PathOf(label));
      first = false;
    }
    return driver.StartCommand("QELFpaCtxZitBltCmd");
  }
  std::string Dialog() const { return driver.DescribeDialog(kDialog); }
  bool Toggle(const char* button) { return driver.ToggleCheckButton(kDialog, button); }
  QELIZitBltMgr_var Manager(const char* label) const {
    return QELIZitBltMgr_var(VORBaseUnknown_var(driver.FindObject(label)));
  }
  int Status(const char* label, const char* name) const {
    unsigned char status = 9;
    Manager(label)->GetZitBltStatus(name, status);
    return status;
  }
  // Whether the ZitBlt shows on its node in the chart.
  bool Shown(const char* label, const char* name) const {
    QELZitBltRep* rep = nullptr;
    Manager(label)->GetZitBlt(name, &rep);
    return rep != nullptr && rep->GetZitBltBtn() != nullptr && rep->GetZitBltBtn()->IsShown();
  }
  std::string Button(const char* title, const char* value, int row) const {
    return std::string("    CheckButton \"\" title=\"") + title + "\" value=\"" + value + "\" at " +
           std::to_string(row) + ",0\n";
  }

  ZitBltStartupDir startup;
  std::string file;
  VORDriver driver;
};

TEST_F(ZitBltVisibilityCmdTest, OneNameHasNoAllButtonAndItsButtonSitsOnRowOne) {
  ASSERT_TRUE(StartOn({"L"})) << driver.LastError();
  EXPECT_EQ(Dialog(),
            "Dialog \"QELFpaZitBltHideShowDlg\" title=\"Show/Hide ZitBlts\"\n"
            "  Frame \"ZitBlts\" title=\"ZitBlts\" at 0,0\n" +
                Button("Status", "checked", 1));
  VORViewer* chart = driver.FindWindow("")->GetViewer();
  const int draws = chart->GetDrawRequestCount();
  ASSERT_TRUE(Toggle("Status")) << driver.LastError();
  EXPECT_GT(chart->GetDrawRequestCount(), draws) << "the chart is asked to repaint";
  EXPECT_EQ(Status("L", "Status"), 0);
  EXPECT_FALSE(Shown("L", "Status")) << "applied at once, before OK";
  EXPECT_FALSE(Toggle("All"));
  ASSERT_TRUE(driver.PressOK(kDialog));
  EXPECT_EQ(driver.GetRunningCommand(), nullptr);
  EXPECT_EQ(VORDlgDialog::FindShown(kDialog), nullptr);
}

TEST_F(ZitBltVisibilityCmdTest, SeveralNamesUnderAllWhichSetsEveryOne) {
  ASSERT_TRUE(StartOn({"S1"})) << driver.LastError();
  EXPECT_EQ(Dialog(),
            "Dialog \"QELFpaZitBltHideShowDlg\" title=\"Show/Hide ZitBlts\"\n"
            "  Frame \"ZitBlts\" title=\"ZitBlts\" at 0,0\n"
            "    CheckButton \"All\" title=\"All\" value=\"checked\" at 0,0\n" +
                Button("Inputs", "checked", 1) + Button("Outputs", "checked", 2) +
                Button("Resources", "checked", 3));
  ASSERT_TRUE(Toggle("All")) << driver.LastError();
  EXPECT_EQ(Dialog().find("value=\"checked\""), std::string::npos) << Dialog();
  for (const char* name : {"All", "Inputs", "Outputs", "Resources"})
    EXPECT_EQ(Status("S1", name), 0) << name;
  EXPECT_FALSE(Shown("S1", "Inputs"));
  EXPECT_FALSE(Shown("S1", "Resources"));
  EXPECT_TRUE(Shown("S2", "Inputs")) << "S2 was not selected";
  ASSERT_TRUE(Toggle("All"));
  EXPECT_EQ(Dialog().find("value=\"unchecked\""), std::string::npos) << Dialog();
  EXPECT_TRUE(Shown("S1", "Inputs"));
  EXPECT_TRUE(Shown("S1", "Resources"));
  ASSERT_TRUE(driver.CloseDialog(kDialog));
  EXPECT_EQ(driver.GetRunningCommand(), nullptr);
}

TEST_F(ZitBltVisibilityCmdTest, AllFollowsTheNamesOnlyWhenEveryOneAgrees) {
  ASSERT_TRUE(StartOn({"S1"})) << driver.LastError();
  VORDlgDialog* dialog = VORDlgDialog::FindShown(kDialog);
  auto all = [&] { return dialog->FindControl("All")->GetValueText().ConvertToUTF8(); };
  // Unchecking one name while "All" is checked leaves "All" checked.
  ASSERT_TRUE(Toggle("Outputs"));
  EXPECT_EQ(all(), "checked");
  EXPECT_FALSE(Shown("S1", "Outputs"));
  EXPECT_TRUE(Shown("S1", "Inputs"));
  // Unchecking the others too brings "All" into line.
  ASSERT_TRUE(Toggle("Inputs"));
  EXPECT_EQ(all(), "checked");
  ASSERT_TRUE(Toggle("Resources"));
  EXPECT_EQ(all(), "unchecked");
  // Checking names back: "All" is checked only with the last one.
  ASSERT_TRUE(Toggle("Inputs"));
  ASSERT_TRUE(Toggle("Outputs"));
  EXPECT_EQ(all(), "unchecked");
  ASSERT_TRUE(Toggle("Resources"));
  EXPECT_EQ(all(), "checked");
  EXPECT_EQ(Status("S1", "All"), 1) << "the names alone never set the activity's All";
  ASSERT_TRUE(driver.PressOK(kDialog));
}

TEST_F(ZitBltVisibilityCmdTest, SeveralActivitiesShowTheFirstOnesStatesAndAllTakeEachChange) {
  Manager("S2")->SetZitBltStatus("Inputs", 0);
  ASSERT_TRUE(StartOn({"S1", "S2", "L", "S3"})) << driver.LastError();
  EXPECT_NE(Dialog().find(Button("Inputs", "checked", 1)), std::string::npos) << Dialog();
  ASSERT_TRUE(Toggle("Outputs"));
  for (const char* label : {"S1", "S2"}) {
    EXPECT_FALSE(Shown(label, "Outputs")) << label;
    EXPECT_EQ(Status(label, "Outputs"), 0) << label;
  }
  EXPECT_TRUE(Shown("S1", "Inputs"));
  EXPECT_FALSE(Shown("S2", "Inputs")) << "only the name clicked changes";
  EXPECT_TRUE(Shown("L", "Status")) << "an activity without that name is skipped";
  EXPECT_EQ(Status("S3", "Outputs"), 0) << "also on an activity that no viewer shows";
  bool shown = true;
  VORIZitBltVisibility_var(VORBaseUnknown_var(driver.FindObject("S3")))
      ->GetZitBltShown("Outputs", shown);
  EXPECT_FALSE(shown);
  ASSERT_TRUE(Toggle("All"));
  EXPECT_EQ(Status("L", "All"), 0) << "All reaches every selected activity";
  EXPECT_EQ(Status("S2", "Inputs"), 0) << "with each name of the first one";
  EXPECT_EQ(Status("L", "Status"), 1) << "a ZitBlt the first activity does not name keeps its own";
  ASSERT_TRUE(driver.PressOK(kDialog));
}

TEST_F(ZitBltVisibilityCmdTest, TheChartsContextMenuOffersTheCommandOnASelectedActivity) {
  const std::string viewer = driver.FindWindow("")->GetName().str();
  ASSERT_TRUE(driver.PickObject("S2"));
  // Far from every node: nothing preselected, so the selected activity counts.
  ASSERT_TRUE(driver.OpenContextMenu(viewer, -500, -500)) << driver.LastError();
  EXPECT_NE(
      driver.DescribeMenu().find("PushItem \"QELFpaCtxZitBltCmd\" title=\"Show/Hide ZitBlts\""),
      std::string::npos)
      << driver.DescribeMenu();
  ASSERT_TRUE(driver.ChooseMenuItem("Show/Hide ZitBlts")) << driver.LastError();
  ASSERT_TRUE(Toggle("Inputs")) << driver.LastError();
  EXPECT_FALSE(Shown("S2", "Inputs"));
  ASSERT_TRUE(driver.PressOK(kDialog));
  ASSERT_TRUE(driver.PickObject("Line"));
  // The root activity has no ZitBlts: no item; the menu has only the host's Properties.
  ASSERT_TRUE(driver.OpenContextMenu(viewer, -500, -500)) << driver.LastError();
  EXPECT_EQ(driver.DescribeMenu().find("QELFpaCtxZitBltCmd"), std::string::npos)
      << driver.DescribeMenu();
  EXPECT_NE(driver.DescribeMenu().find("PushItem \"Properties\""), std::string::npos);
}

TEST_F(ZitBltVisibilityCmdTest, WithoutZitBltsOnTheFirstActivityAWarningEndsTheCommand) {
  const size_t before = driver.Notifications().size();
  ASSERT_TRUE(StartOn({"G", "S1"})) << driver.LastError();
  ASSERT_EQ(driver.Notifications().size(), before + 1);
  const VORDlgNotifyRecord& warning = driver.Notifications().back();
  EXPECT_EQ(warning.id, "NoZitBlt");
  EXPECT_EQ(warning.title, "Warning");
  EXPECT_EQ(warning.text, "No ZitBlts Present");
  EXPECT_EQ(warning.style, 0x10000200);
  EXPECT_EQ(VORDlgDialog::FindShown(kDialog), nullptr);
  EXPECT_EQ(driver.GetRunningCommand(), nullptr);
  EXPECT_TRUE(Shown("S1", "Inputs"));
}

TEST_F(ZitBltVisibilityCmdTest, AClickIsOneUndoableChangeOfTheDocument) {
  VORModelDoor& door = driver.GetDocument()->GetDoor();
  ASSERT_TRUE(StartOn({"S1", "S2"})) << driver.LastError();
  VORChangeLog log;
  VORChangeLog* outer = door.SetRecorder(&log);
  ASSERT_TRUE(Toggle("All"));
  door.SetRecorder(outer);
  EXPECT_TRUE(driver.GetDocument()->IsModified());
  bool shown = true;
  EXPECT_EQ(VORIZitBltVisibility_var(VORBaseUnknown_var(driver.FindObject("S2")))
                ->GetZitBltShown("Resources", shown),
            S_OK);
  EXPECT_FALSE(shown);
  VORChangeLog redo;
  door.Undo(log, &redo);
  for (const char* label : {"S1", "S2"}) {
    EXPECT_TRUE(Shown(label, "Outputs")) << label;
    EXPECT_EQ(Status(label, "All"), 1) << label;
  }
  door.Undo(redo);
  EXPECT_FALSE(Shown("S2", "Outputs"));
  EXPECT_EQ(Status("S1", "All"), 0);
  ASSERT_TRUE(driver.PressOK(kDialog));
}

TEST_F(ZitBltVisibilityCmdTest, TheChosenVisibilitySurvivesASaveAndANewOpening) {
  ::setenv("SCENARIO_DOC", file.c_str(), 1);
  const std::string saved = startup.Path().string() + "/saved.pprx";
  ::setenv("SCENARIO_SAVED", saved.c_str(), 1);
  ExpectScriptPrints(PFV_BINARY, VIEWER_DATA "/zitblt_visibility.pfvs",
                     VIEWER_DATA "/zitblt_visibility.expected",
                     {{saved, "SCENARIO_SAVED"}, {file, "SCENARIO_DOC"}});
}

}  // namespace
