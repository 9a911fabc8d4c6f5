#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "VORCommandHeader.h"
#include "VORDeferredDeletion.h"
#include "VORDlgCheckButton.h"
#include "VORDlgCombo.h"
#include "VORDlgContextualMenu.h"
#include "VORDlgDialog.h"
#include "VORDlgEditor.h"
#include "VORDlgFrame.h"
#include "VORDlgNotify.h"
#include "VORDlgSelectorList.h"

namespace {
// A small dialog like the grouping dialog: a frame with a label, an editor, two combos and a
// check button.
class SampleDialog : public VORDlgDialog {
 public:
  SampleDialog() : VORDlgDialog(nullptr, "SampleDialog", 265217) {}
  void Build() override {
    auto* frame = new VORDlgFrame(this, "Frame", 0x80001);
    frame->SetGridConstraints(0, 0, 1, 1, VORDlgAttach4Sides);
    (new VORDlgLabel(frame, "EnterName"))->SetTitle("Name");
    name = new VORDlgEditor(frame, "EditorName");
    name->SetGridConstraints(0, 1, 1, 1, 30);
    types = new VORDlgCombo(frame, "ComboType");
    types->SetGridConstraints(1, 1, 1, 1, 30);
    check = new VORDlgCheckButton(frame, "All");
    check->SetGridConstraints(2, 0, 1, 1, 30);
  }
  VORDlgEditor* name = nullptr;
  VORDlgCombo* types = nullptr;
  VORDlgCheckButton* check = nullptr;
};

// Records the class names of what a control's publisher dispatches.
class Recorder {
 public:
  void Listen(VORDlgControl* control, const char* name) {
    _subscriber->AddCallback(
        control->GetEventPublisher(), name,
        [this](VORBaseUnknown*, VORNotification* n, void*) { seen.emplace_back(n->IsA()); });
  }
  std::vector<std::string> seen;

 private:
  VORCommand_var _subscriber = VORCommand_var::Adopt(new VORCommand());
};
}  // namespace

TEST(DialogTest, TheControlTreeDescribesKindsNamesPlacesValuesAndSensitivity) {
  auto dialog = VORHandle<SampleDialog>::Adopt(new SampleDialog());
  dialog->Build();
  dialog->name->SetText("GroupActivity");
  dialog->types->SetLine("Grouping Activity");
  dialog->check->SetSensitivity(false);
  EXPECT_EQ(VORDlg::Describe(dialog),
            "Dialog \"SampleDialog\" [hidden]\n"
            "  Frame \"Frame\" at 0,0\n"
            "    Label \"EnterName\" title=\"Name\" value=\"Name\" at 0,0\n"
            "    Editor \"EditorName\" value=\"GroupActivity\" at 0,1\n"
            "    Combo \"ComboType\" value=\"Grouping Activity\" at 1,1\n"
            "    CheckButton \"All\" value=\"unchecked\" [insensitive] at 2,0\n");
  EXPECT_EQ(dialog->FindControl("ComboType"), dialog->types);
  EXPECT_EQ(dialog->FindControl("Nothing"), nullptr);
  EXPECT_EQ(dialog->GetNotificationNames(),
            (std::vector<std::string>{"VORDlgWindCloseNotification", "VORDlgDiaOKNotification",
                                      "VORDlgDiaCANCELNotification"}));
}

TEST(DialogTest, ADialogDestroysTheControlsItOwnsButNotItsChildWindows) {
  const long before = VORBaseUnknown::LiveInstances();
  {
    auto dialog = VORHandle<SampleDialog>::Adopt(new SampleDialog());
    dialog->Build();
    auto* notify = new VORDlgNotify(dialog, "Unexpected");
    dialog.Reset();
    EXPECT_EQ(notify->GetFather(), nullptr);
    notify->RequestDelayedDestruction();
    VORDeferredDeletion::Drain();
  }
  EXPECT_EQ(VORBaseUnknown::LiveInstances(), before);
}

TEST(DialogTest, ButtonsSendTheirNotificationsOnlyWhenShownPresentAndSensitive) {
  auto dialog = VORHandle<SampleDialog>::Adopt(new SampleDialog());
  Recorder recorder;
  recorder.Listen(dialog, "VORDlgNotification");
  EXPECT_FALSE(dialog->UserPressOK()) << "hidden";
  dialog->SetVisibility(true);
  dialog->SetOKSensitivity(false);
  EXPECT_FALSE(dialog->UserPressOK());
  dialog->SetOKSensitivity(true);
  EXPECT_TRUE(dialog->UserPressOK());
  EXPECT_TRUE(dialog->UserPressCancel());
  EXPECT_TRUE(dialog->UserCloseWindow());
  EXPECT_EQ(recorder.seen,
            (std::vector<std::string>{"VORDlgDiaOKNotification", "VORDlgDiaCANCELNotification",
                                      "VORDlgWindCloseNotification"}));

  auto okOnly = VORHandle<VORDlgDialog>::Adopt(new VORDlgDialog(nullptr, "OKOnly", 0x40401));
  okOnly->SetVisibility(true);
  EXPECT_FALSE(okOnly->UserPressCancel());
  EXPECT_EQ(VORDlgDialog::FindShown("OKOnly"), okOnly.get());
  EXPECT_EQ(VORDlgDialog::FindShown(), okOnly.get()) << "the last shown one";
}

TEST(DialogTest, ComboSelectsItsFirstLineAndUsersChooseByIndexOrText) {
  auto dialog = VORHandle<SampleDialog>::Adopt(new SampleDialog());
  dialog->Build();
  VORDlgCombo* combo = dialog->types;
  Recorder recorder;
  recorder.Listen(combo, VORDlgCombo::GetComboSelectNotification());
  EXPECT_EQ(combo->GetSelect(), -1);
  EXPECT_EQ(combo->GetSelectedLine(), VORUnicodeString(""));
  combo->SetLine("children");
  combo->SetLine("parent");
  EXPECT_EQ(combo->GetSelectedLine(), VORUnicodeString("children"));
  EXPECT_TRUE(combo->UserSelect(VORUnicodeString("parent")));
  EXPECT_FALSE(combo->UserSelect(VORUnicodeString("nobody")));
  EXPECT_FALSE(combo->UserSelect(2));
  EXPECT_EQ(combo->GetSelect(), 1);
  combo->ClearLine();
  EXPECT_EQ(combo->GetSelect(), -1);
  EXPECT_EQ(recorder.seen.size(), 1u);
}

TEST(DialogTest, EditorsAndCheckButtonsNotifyUserChangesButNotProgrammaticOnes) {
  auto dialog = VORHandle<SampleDialog>::Adopt(new SampleDialog());
  dialog->Build();
  Recorder recorder;
  recorder.Listen(dialog->name, VORDlgEditor::GetEditModifyNotification());
  recorder.Listen(dialog->check, VORDlgCheckButton::GetChkBModifyNotification());
  dialog->name->SetText("quiet");
  dialog->check->SetState(VORDlgCheck);
  dialog->check->SetState(12345);  // not a state: ignored
  EXPECT_TRUE(dialog->check->IsChecked());
  EXPECT_TRUE(recorder.seen.empty());

  EXPECT_TRUE(dialog->name->UserSetText("typed"));
  EXPECT_TRUE(dialog->check->UserToggle());
  EXPECT_EQ(dialog->check->GetState(), VORDlgUncheck);
  dialog->SetSensitivity(false);  // an insensitive ancestor blocks the user
  EXPECT_FALSE(dialog->check->UserToggle());
  EXPECT_EQ(recorder.seen, (std::vector<std::string>{"VORDlgEditModifyNotification",
                                                     "VORDlgCheckButtonModifyNotification"}));
  EXPECT_EQ(dialog->name->GetText(), VORUnicodeString("typed"));
}

TEST(DialogTest, SelectorListKeepsValidRowsInOrder) {
  auto list = VORHandle<VORDlgSelectorList>::Adopt(new VORDlgSelectorList(nullptr, "L"));
  list->SetLine("a");
  list->SetLine("b");
  list->SetLine("c");
  EXPECT_TRUE(list->UserSelect({2, 7, 0, 2, -1}));
  EXPECT_EQ(list->GetSelect(), (std::vector<int>{0, 2}));
  EXPECT_EQ(list->GetValueText(), VORUnicodeString("a, c"));
}

TEST(DialogTest, ASingleSelectionListKeepsOneRowAndTellsItsVisibleSize) {
  auto list = VORHandle<VORDlgSelectorList>::Adopt(
      new VORDlgSelectorList(nullptr, "L", VORDlgLstSingleSelection));
  for (const char* line : {"A", "B", "C"})
    list->SetLine(line);
  EXPECT_TRUE(list->UserSelect({2, 1}));
  EXPECT_EQ(list->GetSelect(), std::vector<int>{1}) << "the first in row order";
  EXPECT_EQ(list->GetVisibleColumns(), 0) << "the view chooses until told";
  list->SetVisibleSize(15, 7);
  EXPECT_EQ(list->GetVisibleColumns(), 15);
  EXPECT_EQ(list->GetVisibleLines(), 7);
}

TEST(NotifyTest, TheRecorderKeepsTitleTextAndStyleAndAnswersOKUntilAnotherPresenterIsSet) {
  VORDlgNotify::Recorder().Clear();
  auto notify = VORHandle<VORDlgNotify>::Adopt(new VORDlgNotify(nullptr, "NoZitBlt", 0x10000200));
  EXPECT_EQ(notify->DisplayBlocked("No ZitBlts Present", "Warning"), VORDlgNotifyOK);
  ASSERT_EQ(VORDlgNotify::Recorder().Records().size(), 1u);
  const VORDlgNotifyRecord& r = VORDlgNotify::Recorder().Records()[0];
  EXPECT_EQ(r.id, "NoZitBlt");
  EXPECT_EQ(r.title, "Warning");
  EXPECT_EQ(r.text, "No ZitBlts Present");
  EXPECT_EQ(r.style, 0x10000200);

  struct Refuser : VORDlgNotifyPresenter {
    int Present(const VORDlgNotify& n) override {
      shown = n.GetText().ConvertToUTF8();
      return VORDlgNotifyCancel;
    }
    std::string shown;
  };
  auto refuser = std::make_shared<Refuser>();
  VORDlgNotify::SetPresenter(refuser);
  EXPECT_EQ(notify->DisplayBlocked("again", "Error"), VORDlgNotifyCancel);
  EXPECT_EQ(refuser->shown, "again");
  VORDlgNotify::SetPresenter(nullptr);
  EXPECT_EQ(notify->DisplayBlocked("third", "Error"), VORDlgNotifyOK);
  EXPECT_EQ(VORDlgNotify::Recorder().Records().size(), 2u);
}

TEST(ContextMenuTest, APushItemWithAHeaderStartsItsCommandWhenChosen) {
  int runs = 0;
  struct Run : VORCommand {
    explicit Run(int* n) : _n(n) {}
    VORStatusChangeRC Activate(VORCommand*, VORNotification*) override {
      ++*_n;
      return VORStatusChangeRCCompleted;
    }
    int* _n;
  };
  VORCommandHeader::RegisterHostClass("RunCmd", [&](VORBaseUnknown*) { return new Run(&runs); });
  auto context = VORHandle<VORContext>::Adopt(new VORContext(nullptr, 1, 2));
  VORDlgContextualMenu* menu = VORDlgContextualMenu::FromContext(context);
  ASSERT_NE(menu, nullptr);
  EXPECT_EQ(VORDlgContextualMenu::FromContext(context), menu) << "one menu per context";
  auto* item = new VORDlgPushItem(menu, "CenterGraph");
  item->SetCommandHeader(
      VORHandle<VORCommandHeader>::Adopt(new VORCommandHeader("C", "", "RunCmd")));
  EXPECT_TRUE(item->UserActivate());
  EXPECT_EQ(runs, 1);
  VORDeferredDeletion::Drain();
}
