// Show/Hide ZitBlts in the application window: the command from the Product Flow menu on a
// station picked in the tree opens a real dialog with one check box per ZitBlt name; a click on
// a box hides that ZitBlt in the document at once, and "All" (with two names or more) sets every
// box; OK ends the command.
#include <gtest/gtest.h>

#include <QAction>
#include <QCheckBox>
#include <QDialogButtonBox>
#include <QPushButton>
#include <QTest>
#include <memory>

#include "QtTestHelpers.h"
#include "VORDocument.h"
#include "VORIZitBltVisibility.h"
#include "VORQtDialogs.h"
#include "VORQtDocumentTree.h"
#include "VORQtMainWindow.h"
#include "VORQtStrings.h"

namespace {

QCheckBox* BoxTitled(const QList<QCheckBox*>& boxes, const QString& title) {
  for (QCheckBox* box : boxes) {
    if (box->text() == title)
      return box;
  }
  return nullptr;
}

}  // namespace

TEST(ZitBltDialogWindowTest, TheMenuCommandOpensCheckBoxesThatHideZitBltsAtOnce) {
  auto window = std::make_unique<VORQtMainWindow>();
  window->resize(1000, 700);
  window->show();
  ASSERT_TRUE(window->OpenDocument(QString::fromStdString(SamplePath())));
  const char* station = "FF010 Front floor";
  ASSERT_TRUE(ClickTreeItem(*window, station));
  QAction* action = window->CommandAction("QELFpaCtxZitBltCmd");
  ASSERT_NE(action, nullptr) << "listed from the workbench file";
  ASSERT_TRUE(action->isEnabled()) << "the module is installed";
  action->trigger();
  QApplication::processEvents();

  VORDlgDialog* dialog = VORDlgDialog::FindShown("QELFpaZitBltHideShowDlg");
  ASSERT_NE(dialog, nullptr);
  VORQtDialogWidget* widget = window->Dialogs()->WidgetOf(dialog);
  ASSERT_NE(widget, nullptr);
  EXPECT_TRUE(widget->isVisible());
  EXPECT_EQ(widget->windowTitle(), "Show/Hide ZitBlts");
  const QList<QCheckBox*> boxes = widget->findChildren<QCheckBox*>();
  QCheckBox* all = BoxTitled(boxes, "All");
  const int names = static_cast<int>(boxes.size()) - (all != nullptr ? 1 : 0);
  ASSERT_GE(names, 1);
  EXPECT_EQ(all != nullptr, names >= 2) << "All only with two names or more";
  for (QCheckBox* box : boxes)
    EXPECT_TRUE(box->isChecked()) << VORQtUnicode(box->text()).ConvertToUTF8();

  QCheckBox* first = nullptr;
  for (QCheckBox* box : boxes) {
    if (box != all && first == nullptr)
      first = box;
  }
  first->click();
  QApplication::processEvents();
  EXPECT_FALSE(first->isChecked());
  VORIZitBltVisibility_var recorded(VORBaseUnknown_var(window->Driver().FindObject(station)));
  ASSERT_TRUE(recorded);
  bool shown = true;
  EXPECT_EQ(recorded->GetZitBltShown(VORQtUnicode(first->text()), shown), S_OK);
  EXPECT_FALSE(shown) << "applied at once";
  EXPECT_TRUE(window->Driver().GetDocument()->IsModified());

  if (all != nullptr) {
    all->click();  // checked -> unchecked: every box follows
    QApplication::processEvents();
    for (QCheckBox* box : boxes)
      EXPECT_FALSE(box->isChecked()) << VORQtUnicode(box->text()).ConvertToUTF8();
  }

  auto* buttons = widget->findChild<QDialogButtonBox*>();
  ASSERT_NE(buttons, nullptr);
  ASSERT_NE(buttons->button(QDialogButtonBox::Ok), nullptr);
  EXPECT_EQ(buttons->button(QDialogButtonBox::Cancel), nullptr);
  // A real click: the application drains deferred releases after each user event, which is
  // when the ended command lets its dialog go.
  QTest::mouseClick(buttons->button(QDialogButtonBox::Ok), Qt::LeftButton);
  QApplication::processEvents();
  EXPECT_EQ(window->Driver().GetRunningCommand(), nullptr);
  EXPECT_EQ(VORDlgDialog::FindShown("QELFpaZitBltHideShowDlg"), nullptr);
  window.reset();
  QApplication::processEvents();
}
