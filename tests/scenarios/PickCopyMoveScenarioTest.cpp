// The pick-copy-move story of the scenario test module, driven only through the driver.
#include <gtest/gtest.h>

#include <memory>
#include <string>
#include <vector>

#include "SampleLine.h"
#include "TempDir.h"
#include "VORDriver.h"
#include "VORFrmWindowKinds.h"
#include "VORModelChecker.h"
#include "VORWorkbench.h"

namespace {
class PickCopyMoveScenario : public ::testing::Test {
 protected:
  void SetUp() override {
    ASSERT_EQ(SaveSampleLine(file), "");
    std::string error;
    ASSERT_TRUE(VORWorkbench::LoadFile(SCENARIO_DATA "/ScenarioWorkbench.txt", &error)) << error;
    ASSERT_TRUE(driver.OpenDocument(file)) << driver.LastError();
    driver.TakeEvents();
  }
  // Labels of the children of an activity, in order.
  std::string ChildrenOf(const std::string& label) {
    VORISPPChildManagement_var parent(VORBaseUnknown_var(driver.FindObject(label)));
    VORListValVORBaseUnknown_var* children = nullptr;
    parent->GetChildren(children, "Activity");
    std::unique_ptr<VORListValVORBaseUnknown_var> owned(children);
    std::string text;
    for (const auto& c : *children)
      text += (text.empty() ? "" : " ") + VORFrmObjectLabel(c).ConvertToUTF8();
    return text;
  }
  void ExpectModelHolds() {
    std::vector<std::string> problems;
    EXPECT_TRUE(VORModelChecker::Check(driver.GetDocument(), problems))
        << (problems.empty() ? "" : problems.front());
  }
  // Target S3, then sources S1, S2, S1 (removed again), S1 (back): sources S2, S1.
  void PickTargetAndSources() {
    ASSERT_TRUE(driver.StartCommand("ScenarioPick"));
    ASSERT_TRUE(driver.PickObject("L1"));  // a loading: the filter refuses it
    ASSERT_TRUE(driver.PickObject("S3"));
    for (const char* source : {"S1", "S2", "S1", "S1"})
      ASSERT_TRUE(driver.PickObject(source));
  }

  TempDir dir;
  std::string file = dir.Path() + "/line.pprx";
  VORDriver driver;
};
}  // namespace

TEST_F(PickCopyMoveScenario, PicksAreFilteredCollectedAndToggledWhileTheDialogIsShown) {
  ASSERT_TRUE(driver.StartCommand("ScenarioPick"));
  ASSERT_TRUE(driver.PickObject("L1"));
  EXPECT_EQ(driver.FindDialog("ScenarioPickDlg"), nullptr);
  ASSERT_TRUE(driver.PickObject("S3"));
  ASSERT_NE(driver.FindDialog("ScenarioPickDlg"), nullptr);
  EXPECT_FALSE(driver.PressOK()) << "no source yet";
  EXPECT_EQ(driver.LastError(), "OK is not available in \"ScenarioPickDlg\"");
  for (const char* source : {"S1", "S2", "S1", "S1"})
    ASSERT_TRUE(driver.PickObject(source));
  EXPECT_EQ(driver.DescribeCSO(), "cso: S3, S2, S1\n");
  EXPECT_EQ(driver.DescribeDialog("ScenarioPickDlg"),
            "Dialog \"ScenarioPickDlg\"\n"
            "  Frame \"FramePick\" at 0,0\n"
            "    Label \"EnterName\" at 0,0\n"
            "    Editor \"EditorName\" value=\"S3\" at 0,1\n"
            "    Label \"SelectAction\" at 1,0\n"
            "    Combo \"ComboAction\" value=\"copy\" at 1,1\n"
            "    CheckButton \"Confirm\" title=\"Confirm\" value=\"checked\" at 2,0\n");
  ASSERT_TRUE(driver.TypeText("ScenarioPickDlg", "EditorName", ""));
  EXPECT_FALSE(driver.PressOK()) << "an empty name disables OK";
  ASSERT_TRUE(driver.TypeText("ScenarioPickDlg", "EditorName", "Target station"));
  EXPECT_EQ(driver.TakeEvents(), (std::vector<std::string>{"command ScenarioPickCmd started",
                                                           "pick of \"L1\" refused"}));
}

TEST_F(PickCopyMoveScenario, TheCSOAnnouncesEveryPickInOrder) {
  std::vector<std::string> log;
  auto subscriber = VORCommand_var::Adopt(new VORCommand());
  subscriber->AddCallback(
      driver.GetEditor()->GetCSO()->GetEventPublisher(), "VORCSOChangeNotification",
      [&](VORBaseUnknown*, VORNotification* n, void*) {
        auto* change = static_cast<VORCSOChangeNotification*>(n);
        std::string entry;
        for (const auto& p : change->GetRemovedElements())
          entry +=
              "-" +
              VORFrmObjectLabel(static_cast<VORPathElement*>(p.get())->GetLeaf()).ConvertToUTF8() +
              " ";
        for (const auto& p : change->GetAddedElements())
          entry +=
              "+" +
              VORFrmObjectLabel(static_cast<VORPathElement*>(p.get())->GetLeaf()).ConvertToUTF8() +
              " ";
        log.push_back(entry);
      });
  PickTargetAndSources();
  EXPECT_EQ(log,
            (std::vector<std::string>{"+S3 ", "+S1 ", "+S2 ", "-S1 ", "+S1 ", "-S1 ", "+S1 "}));
}

TEST_F(PickCopyMoveScenario, OKCopiesTheSourcesIntoTheTargetAndReportsIt) {
  const std::string before = driver.GetDocument()->SaveToString();
  PickTargetAndSources();
  ASSERT_TRUE(driver.PressOK("ScenarioPickDlg")) << driver.LastError();
  EXPECT_EQ(driver.TakeEvents(),
            (std::vector<std::string>{"command ScenarioPickCmd started", "pick of \"L1\" refused",
                                      "notification \"Done\": 2 activities copied into S3",
                                      "command ScenarioPickCmd ended"}));
  EXPECT_EQ(ChildrenOf("Line"), "S1 S2 S3 L1");
  EXPECT_EQ(ChildrenOf("S3"), "S2 S1");
  EXPECT_EQ(driver.DescribeCSO(), "cso: S2, S1\n") << "the copies are selected";
  EXPECT_EQ(driver.GetRunningCommand(), nullptr);
  EXPECT_NE(driver.GetDocument()->SaveToString(), before);
  ExpectModelHolds();
}

TEST_F(PickCopyMoveScenario, MoveCutsTheSourcesWithTheirFlows) {
  PickTargetAndSources();
  ASSERT_TRUE(driver.ChooseComboLine("ScenarioPickDlg", "ComboAction", "move"));
  ASSERT_TRUE(driver.PressOK());
  EXPECT_EQ(ChildrenOf("Line"), "S3 L1");
  EXPECT_EQ(ChildrenOf("S3"), "S2 S1");
  const auto& last = driver.Notifications().back();
  EXPECT_EQ(last.title, "Done");
  EXPECT_EQ(last.text, "2 activities moved into S3");
  ExpectModelHolds();
}

TEST_F(PickCopyMoveScenario, CancelAndAnUncheckedConfirmationChangeNothing) {
  const std::string before = driver.GetDocument()->SaveToString();
  PickTargetAndSources();
  ASSERT_TRUE(driver.PressCancel());
  EXPECT_EQ(driver.GetRunningCommand(), nullptr);
  EXPECT_EQ(driver.GetDocument()->SaveToString(), before);

  PickTargetAndSources();
  ASSERT_TRUE(driver.ToggleCheckButton("ScenarioPickDlg", "Confirm"));
  ASSERT_TRUE(driver.PressOK());
  EXPECT_EQ(driver.Notifications().back().title, "Warning");
  EXPECT_EQ(driver.Notifications().back().text, "Nothing done: not confirmed.");
  EXPECT_EQ(driver.GetDocument()->SaveToString(), before);
}

TEST_F(PickCopyMoveScenario, AStationAlreadySelectedIsTakenAsTheTarget) {
  ASSERT_TRUE(driver.PickObject("S2"));
  ASSERT_TRUE(driver.StartCommand("ScenarioPick"));
  ASSERT_NE(driver.FindDialog("ScenarioPickDlg"), nullptr);
  ASSERT_TRUE(driver.PickObject("S2"));
  EXPECT_EQ(driver.Notifications().back().text, "The target cannot be a source.");
  EXPECT_EQ(driver.DescribeCSO(), "cso: S2\n");
}

TEST_F(PickCopyMoveScenario, CommandClassesComeFromTheModuleByNameAndUnknownNamesAreRefused) {
  EXPECT_FALSE(driver.StartCommand("ScenarioMissingClass"));
  EXPECT_NE(driver.LastError().find("fctCreateNoSuchCmd"), std::string::npos) << driver.LastError();
  EXPECT_FALSE(driver.StartCommand("ScenarioMissingModule"));
  EXPECT_NE(driver.LastError().find("NoSuchModule"), std::string::npos) << driver.LastError();
  EXPECT_EQ(driver.GetRunningCommand(), nullptr);
  ASSERT_TRUE(driver.StartCommand("ScenarioPick"));
  ASSERT_NE(driver.GetRunningCommand(), nullptr);
  EXPECT_TRUE(driver.GetRunningCommand()->IsAKindOf("VORStateCommand"));
}
