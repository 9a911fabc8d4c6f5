// Dragging a list line onto another station in the window, with the mouse: the line follows
// the pointer, the cursor and a tooltip tell whether the node under it takes it, the status bar
// says what became of the drop, and Edit > Undo restores the document exactly.
#include <gtest/gtest.h>

#include <QAction>
#include <QTest>
#include <QToolTip>
#include <sstream>

#include "QELBaseScrollListZitBltRep.h"
#include "QELIListZitBltItem.h"
#include "QELIZitBltMgr.h"
#include "QtTestHelpers.h"
#include "VORDocument.h"
#include "VORExtIVisu.h"
#include "VORIGraphNodeLayout.h"
#include "VORQtDocumentTree.h"
#include "VORQtMainWindow.h"
#include "VORQtViewerWidget.h"
#include "VORScript.h"

namespace {

class ItemDragWindowTest : public ::testing::Test {
 protected:
  void SetUp() override {
    window = ShowMainWindow();
    widget = OpenSampleInViewer(*window);
    ASSERT_NE(widget, nullptr);
  }
  void TearDown() override {
    window.reset();
    QApplication::processEvents();
  }
  void Steps(const std::string& steps) {
    std::ostringstream out;
    VORScript script(window->Driver(), out);
    ASSERT_TRUE(script.Run(steps)) << out.str();
    window->AfterStep();
  }
  // The pixel of the centre of an item's label in a list of a node.
  QPoint LabelPixel(const char* node, const char* zitblt, const char* label) {
    QELIZitBltMgr_var manager{VORBaseUnknown_var(window->Driver().FindObject(node))};
    QELZitBltRep* rep = nullptr;
    manager->GetZitBlt(zitblt, &rep);
    QELBaseScrollListZitBltRep* list = rep->GetScrollListRep();
    for (int i = 1; i <= list->GetItemVisualCount(); ++i) {
      VORIVisu_var visu{VORBaseUnknown_var(list->GetItemVisual(i))};
      auto* item = dynamic_cast<VOR2DBagRep*>(visu->GetRep());
      auto* text = item ? dynamic_cast<VOR2DBagRep*>(item->GetChild(1)) : nullptr;
      VORUnicodeString name;
      QELIListZitBltItem_var(VORBaseUnknown_var(list->GetItemVisual(i)->GetAssociatedPFItem()))
          ->GetItemName(name);
      if (text == nullptr || name != VORUnicodeString(label))
        continue;
      VOR3x3Matrix m;
      for (const VOR2DBagRep* bag = text->GetFather(); bag != nullptr; bag = bag->GetFather()) {
        if (bag->GetMatrix() != nullptr)
          m = *bag->GetMatrix() * m;
      }
      const VORBox2D box = m.TransformBox(text->GetBoundingBox());
      return widget->ModelToPixel(box.CentreX(), box.CentreY()).toPoint();
    }
    ADD_FAILURE() << "no line " << label;
    return {};
  }
  QPoint NodePixel(const char* node) {
    double x = 0.0, y = 0.0;
    VORIGraphNodeLayout_var(VORBaseUnknown_var(window->Driver().FindObject(node)))
        ->GetPertPosition(x, y);
    return widget->ModelToPixel(x, y).toPoint();
  }
  // Clicks the line, then drags it to the pixel in a few moves; checks runs over the target
  // before the button is let go.
  void DragLine(QPoint from, QPoint to, const std::function<void()>& checks) {
    QTest::mouseClick(widget, Qt::LeftButton, Qt::NoModifier, from);
    QApplication::processEvents();
    QTest::mousePress(widget, Qt::LeftButton, Qt::NoModifier, from);
    for (int step = 1; step <= 4; ++step)
      QTest::mouseMove(widget, from + (to - from) * step / 4);
    checks();
    QTest::mouseRelease(widget, Qt::LeftButton, Qt::NoModifier, to);
    QApplication::processEvents();
  }
  std::string Saved() { return window->Driver().GetDocument()->SaveToString(); }

  std::unique_ptr<VORQtMainWindow> window;
  VORQtViewerWidget* widget = nullptr;
};

}  // namespace

TEST_F(ItemDragWindowTest, AnAllowedDropMovesTheLineAndUndoRestoresTheDocument) {
  Steps("expand \"FF010 Front floor\" ProductInput\n");
  const std::string before = Saved();
  const QPoint from = LabelPixel("FF010 Front floor", "ProductInput", "Tunnel reinforcement");
  const QPoint to = NodePixel("FF030 Front floor");
  DragLine(from, to, [&]() {
    EXPECT_EQ(widget->cursor().shape(), VORQtViewerWidget::CursorFor(VORCursorDropAllowed).shape());
    EXPECT_TRUE(QToolTip::text().isEmpty()) << "an allowed drop needs no words";
  });
  EXPECT_EQ(window->LastMessage(), "drop on \"FF030 Front floor\": allowed");
  EXPECT_NE(Saved(), before);
  QAction* undo = window->findChild<QAction*>("Undo");
  ASSERT_TRUE(undo->isEnabled());
  undo->trigger();
  EXPECT_EQ(Saved(), before);
  EXPECT_FALSE(undo->isEnabled()) << "the drop was one step";
}

TEST_F(ItemDragWindowTest, ARefusedDropSaysWhyWhileDraggingAndAfterwards) {
  Steps("expand \"FF020 Front floor\" ProductInput\n");
  const std::string before = Saved();
  const QPoint from = LabelPixel("FF020 Front floor", "ProductInput", "Front floor assembly FF010");
  const QPoint to = NodePixel("FF010 Front floor");
  DragLine(from, to, [&]() {
    EXPECT_EQ(widget->cursor().shape(), Qt::ClosedHandCursor);
    EXPECT_EQ(QToolTip::text(), "This product is produced by this activity");
  });
  EXPECT_EQ(window->LastMessage(),
            "drop on \"FF010 Front floor\": refused: This product is produced by this activity");
  EXPECT_EQ(Saved(), before);
  EXPECT_FALSE(window->findChild<QAction*>("Undo")->isEnabled());
}
