// Dialog objects become Qt dialogs: what the user does in the widgets reaches the objects
// through their "User..." entry points, and what the objects change shows in the widgets.
#include <gtest/gtest.h>

#include <QCheckBox>
#include <QComboBox>
#include <QDialogButtonBox>
#include <QGroupBox>
#include <QLabel>
#include <QLineEdit>
#include <QListWidget>
#include <QMainWindow>
#include <QPushButton>
#include <QTest>

#include "QtTestHelpers.h"
#include "VORDlgCheckButton.h"
#include "VORDlgCombo.h"
#include "VORDlgEditor.h"
#include "VORDlgFrame.h"
#include "VORDlgSelectorList.h"
#include "VORQtDialogs.h"

namespace {
// A dialog like the module's: a frame on a grid with every control kind.
class SampleDialog : public VORDlgDialog {
 public:
  SampleDialog() : VORDlgDialog(nullptr, "SampleDlg", VORDlgWndBtnOKCancel) {}
  void Build() override {
    SetTitle("Sample");
    auto* frame = new VORDlgFrame(this, "Frame");
    frame->SetTitle("Group");
    label = new VORDlgLabel(frame, "Label");
    label->SetTitle("Name:");
    label->SetGridConstraints(0, 0, 1, 1, VORDlgAttach4Sides);
    editor = new VORDlgEditor(frame, "Editor");
    editor->SetGridConstraints(0, 1, 1, 1, VORDlgAttach4Sides);
    combo = new VORDlgCombo(frame, "Combo");
    combo->SetLine("Station");
    combo->SetLine("Grouping");
    combo->SetGridConstraints(1, 1, 1, 1, VORDlgAttach4Sides);
    check = new VORDlgCheckButton(frame, "Check");
    check->SetTitle("Visible");
    check->SetGridConstraints(2, 0, 1, 2, VORDlgAttach4Sides);
    list = new VORDlgSelectorList(frame, "List");
    list->SetLine("A");
    list->SetLine("B");
    list->SetLine("C");
    list->SetGridConstraints(3, 0, 1, 2, VORDlgAttach4Sides);
  }
  VORDlgLabel* label = nullptr;
  VORDlgEditor* editor = nullptr;
  VORDlgCombo* combo = nullptr;
  VORDlgCheckButton* check = nullptr;
  VORDlgSelectorList* list = nullptr;
};
}  // namespace

TEST(DialogWidgetTest, WidgetsFollowTheDialogObjectAndFeedItsUserEntryPoints) {
  QMainWindow main;
  VORQtDialogManager manager(&main);
  auto* dialog = new SampleDialog();
  dialog->Build();
  int oks = 0;
  int edits = 0;
  auto subscriber = VORCommand_var::Adopt(new VORCommand());
  subscriber->AddCallback(dialog->GetEventPublisher(), VORDlgDialog::GetDiaOKNotification(),
                          [&](VORBaseUnknown*, VORNotification*, void*) {
                            ++oks;
                            dialog->SetVisibility(false);
                          });
  subscriber->AddCallback(dialog->editor->GetEventPublisher(),
                          VORDlgEditor::GetEditModifyNotification(),
                          [&](VORBaseUnknown*, VORNotification*, void*) { ++edits; });
  EXPECT_EQ(manager.WidgetOf(dialog), nullptr) << "hidden dialogs have no window";
  dialog->SetVisibility(true);
  VORQtDialogWidget* widget = manager.WidgetOf(dialog);
  ASSERT_NE(widget, nullptr);
  EXPECT_TRUE(widget->isVisible());
  EXPECT_EQ(widget->windowTitle(), "Sample");
  EXPECT_TRUE(widget->isModal()) << "a dialog with OK and Cancel is modal";
  EXPECT_EQ(static_cast<QGroupBox*>(widget->WidgetFor("Frame"))->title(), "Group");
  EXPECT_EQ(static_cast<QLabel*>(widget->WidgetFor("Label"))->text(), "Name:");

  auto* edit = static_cast<QLineEdit*>(widget->WidgetFor("Editor"));
  QTest::keyClicks(edit, "G1");
  EXPECT_EQ(dialog->editor->GetText(), VORUnicodeString("G1"));
  EXPECT_EQ(edits, 2);
  auto* combo = static_cast<QComboBox*>(widget->WidgetFor("Combo"));
  ASSERT_EQ(combo->count(), 2);
  EXPECT_FALSE(combo->isEditable());
  combo->activated(1);
  EXPECT_EQ(dialog->combo->GetSelect(), 1);
  auto* check = static_cast<QCheckBox*>(widget->WidgetFor("Check"));
  QTest::mouseClick(check, Qt::LeftButton, Qt::NoModifier, QPoint(6, check->height() / 2));
  EXPECT_TRUE(dialog->check->IsChecked());
  auto* list = static_cast<QListWidget*>(widget->WidgetFor("List"));
  list->item(0)->setSelected(true);
  list->item(2)->setSelected(true);
  EXPECT_EQ(dialog->list->GetSelect(), (std::vector<int>{0, 2}));

  // Changes made by the command show at once.
  dialog->editor->SetText("Renamed");
  EXPECT_EQ(edit->text(), "Renamed");
  dialog->SetOKSensitivity(false);
  auto* buttons = widget->findChild<QDialogButtonBox*>();
  ASSERT_NE(buttons, nullptr);
  EXPECT_FALSE(buttons->button(QDialogButtonBox::Ok)->isEnabled());
  QTest::mouseClick(buttons->button(QDialogButtonBox::Ok), Qt::LeftButton);
  EXPECT_EQ(oks, 0) << "an insensitive OK does nothing";
  dialog->SetOKSensitivity(true);
  QTest::mouseClick(buttons->button(QDialogButtonBox::Ok), Qt::LeftButton);
  EXPECT_EQ(oks, 1);
  EXPECT_FALSE(widget->isVisible()) << "the object hid itself";

  QPointer<VORQtDialogWidget> gone(widget);
  subscriber = VORCommand_var();
  dialog->Release();
  QApplication::processEvents();
  QApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
  EXPECT_TRUE(gone.isNull()) << "the widget goes with its object";
}

TEST(DialogWidgetTest, NotificationsAreMessageBoxesWithTheirIconAndAreRecorded) {
  QMainWindow main;
  VORQtDialogManager manager(&main);
  EXPECT_EQ(&VORDlgNotify::GetPresenter(), &manager.Presenter());
  const size_t before = VORDlgNotify::Recorder().Records().size();
  auto* notify = new VORDlgNotify(nullptr, "NoZitBlt", VORDlgNfyWarning | VORDlgNfyOK);
  MessageBoxAnswerer seen;
  EXPECT_EQ(notify->DisplayBlocked("No ZitBlts Present", "Warning"), VORDlgNotifyOK);
  notify->Release();
  ASSERT_TRUE(seen.seen);
  EXPECT_EQ(seen.title, "Warning");
  EXPECT_EQ(seen.text, "No ZitBlts Present");
  EXPECT_EQ(seen.icon, QMessageBox::Warning);
  EXPECT_EQ(seen.objectName, "NoZitBlt");
  ASSERT_EQ(VORDlgNotify::Recorder().Records().size(), before + 1);
  EXPECT_EQ(VORDlgNotify::Recorder().Records().back().text, "No ZitBlts Present");
  EXPECT_EQ(VORQtNotifyPresenter::IconFor(VORDlgNfyError | VORDlgNfyOK), QMessageBox::Critical);
}
