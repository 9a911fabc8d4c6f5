#include <gtest/gtest.h>

#include <memory>

#include "SampleLine.h"
#include "VORDlgFrame.h"
#include "VORApplicationFrame.h"
#include "VORCommandHeader.h"
#include "VORDeferredDeletion.h"
#include "VORFrmPropertiesDlg.h"
#include "VORFrmWindowKinds.h"
#include "VORIPDServices.h"
#include "VORIResourceFactory.h"
#include "VORISPPResourceManagement.h"
#include "VORIVisProperties.h"
#include "VORSelectionContext.h"

namespace {
class FrameTest : public ::testing::Test {
 protected:
  void SetUp() override {
    frame->CloseAll();
    editor = frame->OpenDocument(document);
  }
  void TearDown() override { frame->CloseAll(); }
  VORBaseUnknown_var Child(const char* label) {
    VORISPPChildManagement_var root(document->GetRootProcess());
    VORListValVORBaseUnknown_var* children = nullptr;
    root->GetChildren(children);
    std::unique_ptr<VORListValVORBaseUnknown_var> owned(children);
    for (const auto& c : *children) {
      if (VORFrmObjectLabel(c) == VORUnicodeString(label))
        return c;
    }
    return VORBaseUnknown_var();
  }

  VORApplicationFrame* frame = VORApplicationFrame::GetApplicationFrame();
  VORProcess_var document = MakeSampleLine();
  VORFrmEditor* editor = nullptr;
  VORFrmLayout* layout = VORFrmLayout::GetCurrentLayout();
};
}  // namespace

TEST_F(FrameTest, OpeningADocumentMakesItsEditorAndTreeWindowCurrent) {
  ASSERT_NE(editor, nullptr);
  EXPECT_EQ(VORFrmEditor::GetCurrentEditor(), editor);
  EXPECT_EQ(VORSelectionContext::CSO(), editor->GetCSO());
  ASSERT_EQ(layout->GetWindowList().size(), 1u);
  EXPECT_TRUE(layout->GetCurrentWindow()->IsAKindOf("VORFrmTreeWindow"));
  EXPECT_EQ(layout->GetCurrentWindow()->GetEditor(), editor);
}

TEST_F(FrameTest, TheCurrentWindowDecidesTheCurrentEditorAndDeletedWindowsAreReleasedLater) {
  VORProcess_var other = MakeSampleLine();
  VORFrmEditor* second = frame->OpenDocument(other);
  VORFrmWindow* first = layout->GetWindowList()[0];
  layout->SetCurrentWindow(first);
  EXPECT_EQ(VORFrmEditor::GetCurrentEditor(), editor);

  VORFrmWindow_var watched(layout->GetWindowList()[1]);
  EXPECT_EQ(watched->GetEditor(), second);
  const unsigned long refs = watched->RefCount();
  watched->DeleteWindow();
  EXPECT_EQ(layout->GetWindowList().size(), 1u);
  EXPECT_EQ(watched->RefCount(), refs) << "released only when the queue is drained";
  VORDeferredDeletion::Drain();
  EXPECT_EQ(watched->RefCount(), refs - 1);
}

TEST_F(FrameTest, TheLayoutAnnouncesWindowsJoiningLeavingAndBecomingCurrent) {
  std::vector<std::string> log;
  auto subscriber = VORCommand_var::Adopt(new VORCommand());
  subscriber->AddCallback(
      layout->GetEventPublisher(), "VORFrmLayoutNotification",
      [&](VORBaseUnknown*, VORNotification* n, void*) {
        auto* change = static_cast<VORFrmLayoutNotification*>(n);
        static const char* names[] = {"added", "removed", "current"};
        log.push_back(std::string(names[change->GetChange()]) + " " +
                      (change->GetWindow() ? change->GetWindow()->GetName().str() : "none"));
      });
  auto* space = new VORNewInventorySpaceWnd("Space", editor);
  layout->SetCurrentWindow(space);  // already current: no news
  space->DeleteWindow();
  EXPECT_EQ(log, (std::vector<std::string>{"added Space", "current Space", "removed Space",
                                           "current Process"}));
  VORDeferredDeletion::Drain();
}

TEST_F(FrameTest, TilingPlacesWindowsSideBySideAndSendsSizeNotifications) {
  int sizeNotifications = 0;
  VORFrmWindow* tree = layout->GetWindowList()[0];
  auto subscriber = VORCommand_var::Adopt(new VORCommand());
  subscriber->AddCallback(tree->GetEventPublisher(), VORFrmWindow::GetSizeNotification(),
                          [&](VORBaseUnknown*, VORNotification*, void*) { ++sizeNotifications; });
  new VORNewInventorySpaceWnd("Product Space", editor);
  VORCommandHeader::Find(VORFrmHostCommands::TileWinH)->StartCommand();
  EXPECT_EQ(layout->GetMDIState(), VORFrmLayout::MDITiled);
  const VORRectangle a = layout->GetWindowList()[0]->GetRectangle();
  const VORRectangle b = layout->GetWindowList()[1]->GetRectangle();
  EXPECT_EQ(a.width, 600);
  EXPECT_EQ(b.x, 600);
  EXPECT_EQ(b.height, 800);
  EXPECT_EQ(sizeNotifications, 1);
  VORDeferredDeletion::Drain();
}

TEST_F(FrameTest, ThePertChartCommandShowsTheLevelOfTheSelectedActivityAndPicksNodeBoxes) {
  editor->GetCSO()->AddElement(document->GetRootProcess());
  VORCommandHeader::Find(VORFrmHostCommands::PertChart)->StartCommand();
  auto* chart = dynamic_cast<QELFpaPertChartWindow*>(layout->GetCurrentWindow());
  ASSERT_NE(chart, nullptr);
  EXPECT_EQ(chart->GetTitle(), VORUnicodeString("Line - PERT Chart"));
  EXPECT_EQ(chart->DescribeContents(),
            "  node \"S1\" at (12.5, 12.5)\n"
            "  node \"S2\" at (62.5, 12.5)\n"
            "  node \"S3\" at (112.5, 12.5)\n"
            "  node \"L1\" at (12.5, 62.5)\n");
  EXPECT_TRUE(chart->PickNode(70, 16) == Child("S2"));
  EXPECT_TRUE(chart->PickNode(52.5, 7.5) == Child("S2")) << "the box edge still hits";
  EXPECT_FALSE(chart->PickNode(37.5, 12.5));

  editor->GetCSO()->Empty();
  editor->GetCSO()->AddElement(document->GetRootProduct());
  const size_t before = layout->GetWindowList().size();
  VORCommandHeader::Find(VORFrmHostCommands::PertChart)->StartCommand();
  EXPECT_EQ(layout->GetWindowList().size(), before) << "a product has no chart";
  VORDeferredDeletion::Drain();
}

TEST_F(FrameTest, TheProductSpaceHidesShowsAndCentresOnTheSelectedProduct) {
  VORCommandHeader::Find(VORFrmHostCommands::ProductSpace)->StartCommand();
  auto* space = dynamic_cast<VORNewInventorySpaceWnd*>(layout->GetCurrentWindow());
  ASSERT_NE(space, nullptr);
  EXPECT_TRUE(space->Has3DViewer());
  VORListValVORBaseUnknown_var products = space->GetProducts();
  ASSERT_GE(products.Size(), 3);
  VORBaseUnknown_var side = products[2];
  ASSERT_EQ(VORFrmObjectLabel(side), VORUnicodeString("Side panel"));

  editor->GetCSO()->AddElement(side);
  VORCommandHeader::Find(VORFrmHostCommands::HideShow)->StartCommand();
  EXPECT_FALSE(space->IsShown(side));
  EXPECT_FALSE(VORIVisProperties_var(side)->IsShown()) << "the state lives in the model";
  VORCommandHeader::Find(VORFrmHostCommands::CenterGraph)->StartCommand();
  EXPECT_EQ(space->GetCenteredObject(), side.get());
  VORCommandHeader::Find(VORFrmHostCommands::ReframeOn)->StartCommand();
  EXPECT_EQ(space->GetCenteredObject(), nullptr);
  EXPECT_EQ(space->GetReframeCount(), 1);
  VORDeferredDeletion::Drain();
}

TEST_F(FrameTest, PropertiesShowsThePickedObjectReadOnlyAndOKReleasesTheDialog) {
  VORBaseUnknown_var s1 = Child("S1");
  VORBaseUnknown_var s2 = Child("S2");
  VORISPPAbstractActivity_var(s2)->SetActivityTime(42.5);
  // A robot assigned to S2: a product made into a resource.
  VORIProduct_var body(document->GetRootProduct());
  VORBaseUnknown_var robot, container, description;
  body->AddChild("Robot R1", robot);
  ASSERT_TRUE(SUCCEEDED(VORIPDServices::GetPPRContainer(document, container)));
  VORIResourceFactory_var factory(container);
  ASSERT_TRUE(factory);
  ASSERT_TRUE(SUCCEEDED(factory->CreateResource("Robot", robot, "", description)));
  ASSERT_TRUE(SUCCEEDED(factory->AttachResource(robot, description)));
  ASSERT_TRUE(SUCCEEDED(VORISPPResourceManagement_var(s2)->AssignResource(robot)));

  // Started on the first picked object, through its declared header.
  editor->GetCSO()->AddElement(s2);
  VORCommandHeader* header = VORCommandHeader::Find(VORFrmHostCommands::Properties);
  ASSERT_NE(header, nullptr);
  header->StartCommand();
  VORFrmPropertiesDlg* shown = VORFrmPropertiesDlg::Current();
  ASSERT_NE(shown, nullptr);
  EXPECT_EQ(VORDlgDialog::FindShown("PropertiesDlg"), shown);
  EXPECT_FALSE(shown->HasCancelButton()) << "read-only: nothing to cancel";
  using Fields = std::vector<std::pair<std::string, std::string>>;
  EXPECT_EQ(shown->GetFields(), (Fields{{"Name", "S2"},
                                        {"Type", "BIWActivityStation"},
                                        {"Time", "42.5"},
                                        {"Cycle time", "0"},
                                        {"Inputs", ""},
                                        {"Outputs", "Roof"},
                                        {"Resources", "Robot R1"}}));
  // Every field is a label showing its value.
  bool sawValue = false;
  for (VORCommand* c : shown->GetChildren().front()->GetChildren()) {
    auto* label = dynamic_cast<VORDlgLabel*>(c);
    ASSERT_NE(label, nullptr);
    sawValue = sawValue || label->GetTitle().ConvertToUTF8() == "Robot R1";
  }
  EXPECT_TRUE(sawValue);

  // A second Properties replaces the first; OK hides it and releases it after the event.
  VORFrmPropertiesDlg::Show(s1);
  VORHandle<VORFrmPropertiesDlg> second(VORFrmPropertiesDlg::Current());
  ASSERT_TRUE(second);
  EXPECT_EQ(second->GetFields()[4], (std::pair<std::string, std::string>{"Inputs", "Side panel"}));
  EXPECT_EQ(VORDlgDialog::FindShown("PropertiesDlg"), second.get());
  EXPECT_TRUE(second->UserPressOK());
  EXPECT_EQ(VORFrmPropertiesDlg::Current(), nullptr);
  EXPECT_EQ(VORDlgDialog::FindShown("PropertiesDlg"), nullptr);
  const unsigned long refs = second->RefCount();
  VORDeferredDeletion::Drain();
  EXPECT_EQ(second->RefCount(), refs - 1);
  EXPECT_EQ(VORFrmPropertiesDlg::Show(nullptr), nullptr);
}
