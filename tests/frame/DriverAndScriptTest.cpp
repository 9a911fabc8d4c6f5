#include <gtest/gtest.h>

#include <cstdlib>
#include <sstream>

#include "SampleLine.h"
#include "TempDir.h"
#include "VORDlgCheckButton.h"
#include "VORDlgFrame.h"
#include "VORDriver.h"
#include "VORScript.h"

namespace {
class DriverTest : public ::testing::Test {
 protected:
  void SetUp() override { ASSERT_EQ(SaveSampleLine(file), ""); }
  TempDir dir;
  std::string file = dir.Path() + "/line.pprx";
};
}  // namespace

TEST_F(DriverTest, AnUnreadableDocumentGivesAClearErrorAndOpensNothing) {
  VORDriver driver;
  const std::string bad = dir.Write("bad.pprx", "<Process><unclosed></Process>");
  EXPECT_FALSE(driver.OpenDocument(bad));
  EXPECT_NE(driver.LastError().find("bad.pprx"), std::string::npos) << driver.LastError();
  EXPECT_FALSE(driver.OpenDocument(dir.Path() + "/missing.pprx"));
  EXPECT_EQ(driver.GetEditor(), nullptr);
  EXPECT_EQ(driver.DescribeWindows(), "no windows\n");
}

TEST_F(DriverTest, WithoutACommandAPickIsAPlainSelectionWithTheObjectsAbove) {
  VORDriver driver;
  ASSERT_TRUE(driver.OpenDocument(file)) << driver.LastError();
  ASSERT_TRUE(driver.PickObject("S2"));
  EXPECT_EQ(driver.DescribeCSO(), "cso: S2\n");
  VORPathElement* path = driver.GetEditor()->GetCSO()->GetElement(1);
  ASSERT_EQ(path->GetSize(), 2);
  EXPECT_EQ(path->GetRoot(), driver.GetDocument()->GetRootProcess().get());
  ASSERT_TRUE(driver.PickObject("Roof"));
  EXPECT_EQ(driver.DescribeCSO(), "cso: Roof\n");
  EXPECT_FALSE(driver.PickObject("Nowhere"));
  EXPECT_EQ(driver.LastError(), "no object \"Nowhere\"");
}

TEST_F(DriverTest, StepsThatCannotBeDoneSayWhy) {
  VORDriver driver;
  ASSERT_TRUE(driver.OpenDocument(file));
  EXPECT_FALSE(driver.StartCommand("NoSuchCommand"));
  EXPECT_EQ(driver.LastError(), "unknown command \"NoSuchCommand\"");
  EXPECT_FALSE(driver.PressOK());
  EXPECT_FALSE(driver.CancelCommand());
  EXPECT_FALSE(driver.OpenContextMenu("", 0, 0));
  EXPECT_FALSE(driver.ChooseMenuItem("CenterGraph"));
  EXPECT_FALSE(driver.PickInChart("", 12.5, 12.5));
  EXPECT_EQ(driver.LastError(), "\"line.pprx\" shows no chart");
}

TEST_F(DriverTest, AChartPickAndADragGoThroughTheChartWindow) {
  VORDriver driver;
  ASSERT_TRUE(driver.OpenDocument(file));
  ASSERT_TRUE(driver.PickObject("Line"));
  ASSERT_TRUE(driver.StartCommand("PertChart"));
  ASSERT_TRUE(driver.PickInChart("Line - PERT Chart", 60, 10));
  EXPECT_EQ(driver.DescribeCSO(), "cso: S2\n");
  ASSERT_TRUE(driver.PickInChart("", 37.5, 40));
  EXPECT_EQ(driver.DescribeCSO(), "cso:\n") << "a click on the background";
  ASSERT_TRUE(driver.Drag("", 62.5, 12.5, 62.5, 37.5));
  EXPECT_NE(driver.DescribeWindow("").find("node \"S2\" at (62.5, 37.5)"), std::string::npos)
      << driver.DescribeWindow("");
  EXPECT_EQ(driver.TakeEvents(),
            (std::vector<std::string>{"command PertChart started", "command PertChart ended",
                                      "click on the background"}));
}

TEST(ScriptTest, SplitsWordsWithQuotesCommentsAndEnvironmentValues) {
  ::setenv("PFV_SCRIPT_TEST_VALUE", "a b", 1);
  std::vector<std::string> words;
  std::string error;
  ASSERT_TRUE(VORScript::Split("type  Dlg \"Editor Name\" x${PFV_SCRIPT_TEST_VALUE}y # note", words,
                               error));
  EXPECT_EQ(words, (std::vector<std::string>{"type", "Dlg", "Editor Name", "xa by"}));
  ASSERT_TRUE(VORScript::Split("type Dlg E \"\"", words, error));
  EXPECT_EQ(words.back(), "") << "an empty quoted word is a word";
  EXPECT_FALSE(VORScript::Split("pick \"S1", words, error));
  EXPECT_EQ(error, "unclosed quote");
}

TEST_F(DriverTest, AScriptStopsAtTheFirstBadLineAndNamesIt) {
  struct Case {
    const char* line;
    const char* error;
  } cases[] = {{"jump S1", "line 2: error: unknown step \"jump\""},
               {"pick-at 1 x", "line 2: error: \"x\" is not a number"},
               {"pick", "line 2: error: usage: pick <object id or label>"},
               {"pick Nowhere", "line 2: error: no object \"Nowhere\""},
               {"print nonsense", "line 2: error: cannot print \"nonsense\""}};
  for (const Case& c : cases) {
    VORDriver driver;
    std::ostringstream out;
    VORScript script(driver, out);
    EXPECT_FALSE(script.Run("open " + file + "\n" + c.line + "\nprint windows\n"));
    const std::string text = out.str();
    EXPECT_NE(text.find(c.error), std::string::npos) << text;
    EXPECT_EQ(text.find("window 1"), std::string::npos) << "nothing runs after the error";
  }
}

TEST_F(DriverTest, AScriptPrintsWindowsSelectionAndTheModelCheck) {
  VORDriver driver;
  std::ostringstream out;
  VORScript script(driver, out);
  ASSERT_TRUE(script.Run("open " + file +
                         "\n"
                         "pick S1\n"
                         "print cso\n"
                         "start ProductSpace\n"
                         "print windows\n"
                         "print check\n"))
      << out.str();
  EXPECT_EQ(out.str(), "> open " + file +
                           "\n"
                           "> pick S1\n"
                           "> print cso\n"
                           "cso: S1\n"
                           "> start ProductSpace\n"
                           "command ProductSpace started\n"
                           "command ProductSpace ended\n"
                           "> print windows\n"
                           "window 1: VORFrmTreeWindow \"line.pprx\"\n"
                           "window 2: VORNewInventorySpaceWnd \"line.pprx - Product Space\" "
                           "[current]\n"
                           "> print check\n"
                           "model check: ok\n");
}

TEST_F(DriverTest, ToggleFindsACheckButtonByItsNameOrElseByItsTitle) {
  VORDriver driver;
  auto dialog = VORHandle<VORDlgDialog>::Adopt(new VORDlgDialog(nullptr, "Dlg", 0x40401));
  auto* frame = new VORDlgFrame(dialog.get(), "Frame");
  auto* untitled = new VORDlgCheckButton(frame, "");  // only a title, as a ZitBlt name has
  untitled->SetTitle("Resource");
  auto* named = new VORDlgCheckButton(frame, "Resource");  // a name wins over a title
  named->SetTitle("Other");
  (new VORDlgLabel(frame, "Label"))->SetTitle("Label");
  dialog->SetVisibility(true);

  ASSERT_TRUE(driver.ToggleCheckButton("Dlg", "Resource")) << driver.LastError();
  EXPECT_TRUE(named->IsChecked());
  EXPECT_FALSE(untitled->IsChecked());
  auto* titled = new VORDlgCheckButton(frame, "");
  titled->SetTitle("Front floor");
  ASSERT_TRUE(driver.ToggleCheckButton("Dlg", "Front floor")) << driver.LastError();
  EXPECT_TRUE(titled->IsChecked());

  EXPECT_FALSE(driver.ToggleCheckButton("Dlg", "Label"));
  EXPECT_EQ(driver.LastError(), "\"Label\" is not a check button");
  EXPECT_FALSE(driver.ToggleCheckButton("Dlg", "Nothing"));
  EXPECT_EQ(driver.LastError(), "no check button \"Nothing\" in \"Dlg\"");
  dialog->SetVisibility(false);
}
