// The Product Flow Viewer in the window as a planner meets it: the chart fitted on opening with
// readable labels, hovering a node, and undo / redo of a node drag and of an organise.
#include <gtest/gtest.h>

#include <QAction>
#include <QMdiArea>
#include <QMdiSubWindow>
#include <QTest>
#include <cmath>
#include <map>
#include <memory>

#include "QELPertController.h"
#include "QELPertViewer.h"
#include "QtTestHelpers.h"
#include "VORIGENode.h"
#include "VORIGraphNodeLayout.h"
#include "VORQtDocumentTree.h"
#include "VORQtMainWindow.h"
#include "VORQtStrings.h"
#include "VORQtViewerWidget.h"

namespace {

struct Place {
  bool has = false;
  double x = 0.0;
  double y = 0.0;
  friend bool operator==(const Place&, const Place&) = default;
};

class ChartWindowTest : public ::testing::Test {
 protected:
  void SetUp() override { window = ShowMainWindow(); }
  void TearDown() override {
    window.reset();
    QApplication::processEvents();
  }

  VORQtViewerWidget* OpenViewer() { return OpenSampleInViewer(*window); }

  std::map<VORBaseUnknown*, Place> Places(const char* level) {
    std::map<VORBaseUnknown*, Place> places;
    VORIGENode_var node(VORBaseUnknown_var(window->Driver().FindObject(level)));
    VORListValVORBaseUnknown_var* children = nullptr;
    node->GetChildren(children);
    std::unique_ptr<VORListValVORBaseUnknown_var> owned(children);
    for (const VORBaseUnknown_var& child : *children) {
      VORIGraphNodeLayout_var layout(child);
      Place& p = places[child.get()];
      p.has = layout->HasPertPosition();
      layout->GetPertPosition(p.x, p.y);
    }
    return places;
  }

  void DragBy(VORQtViewerWidget* widget, QPoint from, QPoint by) {
    QTest::mousePress(widget, Qt::LeftButton, Qt::NoModifier, from);
    for (int step = 1; step <= 4; ++step)
      QTest::mouseMove(widget, from + by * step / 4);
    QTest::mouseRelease(widget, Qt::LeftButton, Qt::NoModifier, from + by);
    QApplication::processEvents();
  }

  QAction* Action(const char* name) { return window->findChild<QAction*>(name); }

  std::unique_ptr<VORQtMainWindow> window;
};

}  // namespace

TEST_F(ChartWindowTest, ANewChartIsFittedToItsWindowWithLabelsReadable) {
  VORQtViewerWidget* widget = OpenViewer();
  ASSERT_NE(widget, nullptr) << "the viewer window is in the MDI area";
  EXPECT_TRUE(window->MdiArea()->activeSubWindow()->windowTitle().contains("Product Flow Viewer"));
  VORViewer* viewer = widget->GetViewer();
  const VORBox2D scene = viewer->GetSceneBox();
  const QPointF a = widget->ModelToPixel(scene.xmin, scene.ymax);
  const QPointF b = widget->ModelToPixel(scene.xmax, scene.ymin);
  const QRectF drawn(a, b);
  EXPECT_TRUE(QRectF(widget->rect()).adjusted(-1, -1, 1, 1).contains(drawn))
      << "the whole level is in view: " << drawn.x() << "," << drawn.y() << " " << drawn.width()
      << "x" << drawn.height() << " in " << widget->width() << "x" << widget->height();
  EXPECT_TRUE(drawn.width() > 0.85 * widget->width() || drawn.height() > 0.85 * widget->height())
      << "and it fills the window: " << drawn.width() << "x" << drawn.height() << " in "
      << widget->width() << "x" << widget->height();

  // The 30 stations of the line have boxes of 30 x 15: their labels are readable at this scale
  // (the grouping's default box is smaller).
  const double scale = viewer->GetMain2DViewpoint()->GetScale();
  int labels = 0;
  int readable = 0;
  for (const VORRenderItem& item : viewer->GetRenderList().Items()) {
    if (item.kind != VORPrimitiveKind::Text || item.tag != "PertLabel")
      continue;
    ++labels;
    readable += item.textHeight * scale >= 7.0;
  }
  EXPECT_EQ(labels, 31);
  EXPECT_GE(readable, 30);
}

TEST_F(ChartWindowTest, HoveringANodeTellsItsNameKindAndCycleTime) {
  VORQtViewerWidget* widget = OpenViewer();
  ASSERT_NE(widget, nullptr);
  VORBaseUnknown* node = window->Driver().FindObject("EC010 Engine compartment");
  ASSERT_NE(node, nullptr);
  double x = 0.0, y = 0.0;
  VORIGraphNodeLayout_var(node)->GetPertPosition(x, y);
  QTest::mouseMove(widget, widget->ModelToPixel(x, y).toPoint());
  EXPECT_EQ(window->HoverText().toStdString(),
            "EC010 Engine compartment - Station (BIWActivityStation), cycle time 50 s");
  EXPECT_EQ(widget->toolTip().toStdString(), "EC010 Engine compartment")
      << "the whole name, though elided";
  QTest::mouseMove(widget, QPoint(2, 2));
  EXPECT_EQ(window->HoverText().toStdString(), "") << "nothing under the pointer";
}

TEST_F(ChartWindowTest, UndoAndRedoOfADragRestoreThePositionExactlyAndTheChartFollows) {
  VORQtViewerWidget* widget = OpenViewer();
  ASSERT_NE(widget, nullptr);
  auto* pert = dynamic_cast<QELPertViewer*>(widget->GetViewer());
  ASSERT_NE(pert, nullptr);
  VORBaseUnknown* node = window->Driver().FindObject("FF010 Front floor");
  ASSERT_NE(node, nullptr);
  EXPECT_FALSE(Action("Undo")->isEnabled()) << "nothing done yet";
  double x0 = 0.0, y0 = 0.0;
  VORIGraphNodeLayout_var(node)->GetPertPosition(x0, y0);
  const QPoint from = widget->ModelToPixel(x0, y0).toPoint();
  const int cells =
      static_cast<int>(std::ceil(2.0 * 25.0 * pert->GetMain2DViewpoint()->GetScale()));
  DragBy(widget, from, QPoint(0, cells));
  double x1 = 0.0, y1 = 0.0;
  VORIGraphNodeLayout_var(node)->GetPertPosition(x1, y1);
  ASSERT_NE(y1, y0);
  window->Driver().GetDocument()->SetModified(false);
  window->AfterStep();

  ASSERT_TRUE(Action("Undo")->isEnabled());
  Action("Undo")->trigger();
  double x = 0.0, y = 0.0;
  VORIGraphNodeLayout_var(node)->GetPertPosition(x, y);
  EXPECT_EQ(x, x0);
  EXPECT_EQ(y, y0);
  EXPECT_EQ(pert->NodeAt(from.x(), from.y()).get(), node) << "the box is back where it was";
  EXPECT_TRUE(window->isWindowModified());
  EXPECT_TRUE(window->windowTitle().contains("[*]"));
  EXPECT_FALSE(Action("Undo")->isEnabled()) << "the drag was one step";

  ASSERT_TRUE(Action("Redo")->isEnabled());
  Action("Redo")->trigger();
  VORIGraphNodeLayout_var(node)->GetPertPosition(x, y);
  EXPECT_EQ(x, x1);
  EXPECT_EQ(y, y1);
  const QPoint moved = widget->ModelToPixel(x1, y1).toPoint();
  EXPECT_EQ(pert->NodeAt(moved.x(), moved.y()).get(), node);
  EXPECT_FALSE(Action("Redo")->isEnabled());
}

TEST_F(ChartWindowTest, UndoOfAnOrganiseRestoresEveryPositionOfTheLevel) {
  VORQtViewerWidget* widget = OpenViewer();
  ASSERT_NE(widget, nullptr);
  const auto stored = Places("Underbody line");
  // A node dragged out of place first, so that the organise surely moves something.
  VORBaseUnknown* node = window->Driver().FindObject("RF010 Rear floor");
  ASSERT_NE(node, nullptr);
  const Place p = stored.at(node);
  DragBy(widget, widget->ModelToPixel(p.x, p.y).toPoint(), QPoint(0, 200));
  const auto dragged = Places("Underbody line");
  ASSERT_NE(dragged, stored);

  ASSERT_TRUE(window->StartCommand("QELFpaNodeOrganizeCmd"))
      << VORQtString(window->Driver().LastError()).toStdString();
  QApplication::processEvents();
  const auto organised = Places("Underbody line");
  ASSERT_NE(organised, dragged) << "the organiser moved the dragged node";

  Action("Undo")->trigger();
  EXPECT_EQ(Places("Underbody line"), dragged) << "the whole organise is one step";
  Action("Undo")->trigger();
  EXPECT_EQ(Places("Underbody line"), stored);
  Action("Redo")->trigger();
  Action("Redo")->trigger();
  EXPECT_EQ(Places("Underbody line"), organised);
}
