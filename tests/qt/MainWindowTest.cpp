// The application window on the offscreen platform: a user opens the sample, starts a command
// from the Product Flow menu, clicks and drags chart nodes, answers a message box, pans and
// zooms; everything reaches the headless layers through the driver and the viewer.
#include <gtest/gtest.h>

#include <QAction>
#include <QFileInfo>
#include <QMdiArea>
#include <QMdiSubWindow>
#include <QMenu>
#include <QTest>
#include <QWheelEvent>
#include <cmath>
#include <memory>

#include "QtTestHelpers.h"
#include "TempDir.h"
#include "VOR2DBagRep.h"
#include "VOR2DManipulator.h"
#include "VOR2DPolygonRep.h"
#include "VOR2DTextRep.h"
#include "VORCommandHeader.h"
#include "VORDlgContextualMenu.h"
#include "VORFrmWindowKinds.h"
#include "VORIGENode.h"
#include "VORIGraphNodeLayout.h"
#include "VORISPPActivity.h"
#include "VORISpecObject.h"
#include "VORPVBalloon.h"
#include "VORPathElementAgent.h"
#include "VORQtApplication.h"
#include "VORQtMainWindow.h"
#include "VORQtDocumentTree.h"
#include "VORQtStrings.h"
#include "VORQtViewerWidget.h"
#include "VORStateCommand.h"
#include "VORWorkbench.h"

namespace {

// A command that waits for the pick of an activity and tells which one it got.
class PickTestCommand : public VORStateCommand {
 public:
  PickTestCommand() : VORStateCommand("PfvTestPickCmd") {}
  void BuildGraph() override {
    _agent = VORPathElementAgent_var::Adopt(new VORPathElementAgent("Activity"));
    _agent->SetElementType<VORISPPActivity>();
    VORDialogState* state = GetInitialState("Pick an activity");
    state->AddDialogAgent(_agent);
    AddTransition(state, nullptr, IsOutputSetCondition(_agent),
                  Action(this, &PickTestCommand::Tell));
  }
  bool Tell(void*) {
    auto* notify = new VORDlgNotify(nullptr, "Picked", VORDlgNfyInformation | VORDlgNfyOK);
    notify->DisplayBlocked(
        "Picked " + VORFrmObjectLabel(_agent->GetValuePath()->GetLeaf()).ConvertToUTF8(),
        "Pick Test");
    notify->RequestDelayedDestruction();
    return true;
  }

 private:
  VORPathElementAgent_var _agent;
};

class MainWindowTest : public ::testing::Test {
 protected:
  static void SetUpTestSuite() {
    VORCommandHeader::RegisterHostClass(
        "PfvTestPickCmd", [](VORBaseUnknown*) -> VORCommand* { return new PickTestCommand(); });
    VORWorkbench::Register({"PfvTestPickCmd", "Pick Test", "", "", "PfvTestPickCmd"});
  }

  void SetUp() override {
    window = std::make_unique<VORQtMainWindow>();
    window->resize(1200, 800);
    window->show();
    QApplication::processEvents();
  }

  void TearDown() override {
    manipulators.clear();
    subscriber = VORCommand_var();
    window.reset();
    QApplication::processEvents();
  }

  // A chart window whose viewer shows the first count activities of the sample's root at their
  // chart positions; dragging a node box moves it and stores its new position in the model.
  VORQtViewerWidget* OpenChart(int count) {
    EXPECT_TRUE(window->OpenDocument(QString::fromStdString(SamplePath())));
    VORFrmWindow* chart = new VORFrmWindow("Chart", window->Driver().GetEditor());
    auto viewer = VORViewer_var::Adopt(new VORViewer(chart->GetViewerFrame(), "V", 0, 800, 500, 0));
    viewer->SetViewerSelectable(true);
    chart->SetViewer(viewer);
    VORIGENode_var root(window->Driver().GetDocument()->GetRootProcess());
    VORListValVORBaseUnknown_var* children = nullptr;
    root->GetChildren(children);
    std::unique_ptr<VORListValVORBaseUnknown_var> owned(children);
    subscriber = VORCommand_var::Adopt(new VORCommand());
    for (int i = 1; i <= std::min(count, children->Size()); ++i) {
      VORBaseUnknown_var node = (*children)[i];
      VORIGraphNodeLayout_var layout(node);
      double x = 30.0 * i;
      double y = 0.0;
      if (layout->HasPertPosition())
        layout->GetPertPosition(x, y);
      auto bag = VORHandle<VOR2DBagRep>::Adopt(new VOR2DBagRep());
      bag->SetMatrix(VOR3x3Matrix::Translation(x, y));
      bag->SetObject(node);
      const float box[] = {-10, -5, 10, -5, 10, 5, -10, 5};
      bag->AddChild(VORHandle<VOR2DPolygonRep>::Adopt(new VOR2DPolygonRep(box, 4, 1)));
      bag->AddChild(VORHandle<VOR2DTextRep>::Adopt(
          new VOR2DTextRep(VORFrmObjectLabel(node), VORMathPoint2Df(0, 0), 2, 2.0)));
      viewer->AddRep(bag);
      auto manipulator =
          VORHandle<VOR2DManipulator>::Adopt(new VOR2DManipulator(nullptr, "Move", bag, 2, 1));
      subscriber->AddCallback(manipulator->GetEventPublisher(), VORManipulator::kVOREndManipulate,
                              [bag, node](VORBaseUnknown*, VORNotification*, void*) {
                                double tx = 0.0, ty = 0.0;
                                bag->GetMatrix()->GetTranslation(tx, ty);
                                VORIGraphNodeLayout_var(node)->SetPertPosition(tx, ty);
                              });
      manipulators.push_back(manipulator);
      nodes.push_back(node);
    }
    window->AfterStep();
    VORQtViewerWidget* widget = window->ViewerWidgetOf("Chart");
    EXPECT_NE(widget, nullptr);
    if (widget != nullptr) {
      window->MdiArea()->activeSubWindow()->showMaximized();
      QApplication::processEvents();
      widget->FitAll();
    }
    return widget;
  }

  QPoint NodePixel(VORQtViewerWidget* widget, int index) {
    double x = 0.0, y = 0.0;
    VORIGraphNodeLayout_var(nodes[index])->GetPertPosition(x, y);
    return widget->ModelToPixel(x, y).toPoint();
  }

  std::unique_ptr<VORQtMainWindow> window;
  std::vector<VORBaseUnknown_var> nodes;
  std::vector<VORHandle<VOR2DManipulator>> manipulators;
  VORCommand_var subscriber;
};

}  // namespace

TEST_F(MainWindowTest, OpensTheSampleIntoTheTreeAndKeepsItInTheRecentFiles) {
  const QString path = QFileInfo(QString::fromStdString(SamplePath())).absoluteFilePath();
  ASSERT_TRUE(window->OpenDocument(path));
  EXPECT_TRUE(window->windowTitle().contains("underbody.pprx"));
  EXPECT_FALSE(window->Tree()->findItems("Underbody line", Qt::MatchRecursive).isEmpty());
  EXPECT_FALSE(window->Tree()->findItems("Resources", Qt::MatchExactly).isEmpty());
  ASSERT_FALSE(window->RecentFiles().isEmpty());
  EXPECT_EQ(window->RecentFiles().front(), path);

  // A broken file: a message box names the file and the reason, and nothing else changes.
  MessageBoxAnswerer seen;
  EXPECT_FALSE(window->OpenDocument("/nonexistent/broken.pprx"));
  ASSERT_TRUE(seen.seen);
  EXPECT_EQ(seen.icon, QMessageBox::Critical);
  EXPECT_TRUE(seen.text.contains("/nonexistent/broken.pprx"));
  EXPECT_FALSE(seen.informative.isEmpty());
  EXPECT_EQ(window->RecentFiles().front(), path);
  EXPECT_TRUE(window->windowTitle().contains("underbody.pprx"));
}

TEST_F(MainWindowTest, AMenuCommandTakesAChartClickAndItsMessageIsAnswered) {
  VORQtViewerWidget* widget = OpenChart(4);
  ASSERT_NE(widget, nullptr);
  QAction* action = window->CommandAction("PfvTestPickCmd");
  ASSERT_NE(action, nullptr);
  EXPECT_TRUE(window->ProductFlowMenu()->actions().contains(action));
  EXPECT_FALSE(action->icon().isNull());
  EXPECT_TRUE(action->toolTip().contains("Pick Test"));

  action->trigger();
  EXPECT_EQ(window->PromptText(), "Pick Test: Pick an activity");

  MessageBoxAnswerer seen;
  QTest::mouseClick(widget, Qt::LeftButton, Qt::NoModifier, NodePixel(widget, 1));
  ASSERT_TRUE(seen.seen) << "the command's notification was shown";
  EXPECT_EQ(seen.title, "Pick Test");
  EXPECT_EQ(seen.text, "Picked " + VORQtString(VORFrmObjectLabel(nodes[1])));
  EXPECT_EQ(seen.icon, QMessageBox::Information);
  EXPECT_EQ(window->PromptText(), "Ready");
  EXPECT_EQ(window->Driver().GetRunningCommand(), nullptr);
}

TEST_F(MainWindowTest, AClickSelectsTheNodeInTheTreeAndATreeClickFeedsTheCommand) {
  VORQtViewerWidget* widget = OpenChart(4);
  ASSERT_NE(widget, nullptr);
  QTest::mouseClick(widget, Qt::LeftButton, Qt::NoModifier, NodePixel(widget, 2));
  const QString id = QString::fromStdString(VORISpecObject_var(nodes[2])->GetId().str());
  QTreeWidgetItem* item = window->Tree()->ItemOf(id);
  ASSERT_NE(item, nullptr);
  EXPECT_TRUE(item->isSelected());
  EXPECT_EQ(window->Driver().DescribeCSO(),
            "cso: " + VORFrmObjectLabel(nodes[2]).ConvertToUTF8() + "\n");

  // In the tree, a pick reaches the running command as one in the chart does.
  window->CommandAction("PfvTestPickCmd")->trigger();
  QTreeWidgetItem* other =
      window->Tree()->ItemOf(QString::fromStdString(VORISpecObject_var(nodes[3])->GetId().str()));
  ASSERT_NE(other, nullptr);
  window->Tree()->scrollToItem(other);
  MessageBoxAnswerer seen;
  QTest::mouseClick(window->Tree()->viewport(), Qt::LeftButton, Qt::NoModifier,
                    window->Tree()->visualItemRect(other).center());
  ASSERT_TRUE(seen.seen);
  EXPECT_EQ(seen.text, "Picked " + VORQtString(VORFrmObjectLabel(nodes[3])));
}

TEST_F(MainWindowTest, DraggingANodeMovesItInTheModelAndRepaintsAroundIt) {
  VORQtViewerWidget* widget = OpenChart(6);
  ASSERT_NE(widget, nullptr);
  double x0 = 0.0, y0 = 0.0;
  VORIGraphNodeLayout_var(nodes[0])->GetPertPosition(x0, y0);
  const QPoint from = NodePixel(widget, 0);
  const double scale = widget->GetViewer()->GetMain2DViewpoint()->GetScale();
  QTest::mousePress(widget, Qt::LeftButton, Qt::NoModifier, from);
  for (int step = 1; step <= 4; ++step)
    QTest::mouseMove(widget, from + QPoint(10 * step, 0));
  EXPECT_FALSE(widget->GetLastRepaintRequest().isEmpty());
  EXPECT_LT(widget->GetLastRepaintRequest().width(), widget->width())
      << "a drag step repaints around the node only";
  QTest::mouseRelease(widget, Qt::LeftButton, Qt::NoModifier, from + QPoint(40, 0));
  double x1 = 0.0, y1 = 0.0;
  VORIGraphNodeLayout_var(nodes[0])->GetPertPosition(x1, y1);
  EXPECT_NEAR(x1 - x0, 40.0 / scale, 1.0 / scale);
  EXPECT_NEAR(y1, y0, 1e-6);
  EXPECT_TRUE(window->Driver().GetDocument()->IsModified());
  EXPECT_TRUE(window->isWindowModified());
}

TEST_F(MainWindowTest, PanAndZoomKeepThePickedPointUnderTheCursor) {
  VORQtViewerWidget* widget = OpenChart(6);
  ASSERT_NE(widget, nullptr);
  const QPoint p = NodePixel(widget, 1);
  // The model point under the cursor.
  const VORMathPoint2D m = widget->PixelToModel(p);
  const double x = m.x;
  const double y = m.y;
  double x0 = 0.0, y0 = 0.0;
  VORIGraphNodeLayout_var(nodes[1])->GetPertPosition(x0, y0);
  const double scale = widget->GetViewer()->GetMain2DViewpoint()->GetScale();

  QWheelEvent wheel(QPointF(p), widget->mapToGlobal(QPointF(p)), QPoint(), QPoint(0, 240),
                    Qt::NoButton, Qt::NoModifier, Qt::NoScrollPhase, false);
  QApplication::sendEvent(widget, &wheel);
  EXPECT_GT(widget->GetViewer()->GetMain2DViewpoint()->GetScale(), scale * 1.1);
  EXPECT_NEAR(widget->ModelToPixel(x, y).x(), p.x(), 0.01);
  EXPECT_NEAR(widget->ModelToPixel(x, y).y(), p.y(), 0.01);

  // Middle-button drag: the content follows the pointer.
  QTest::mousePress(widget, Qt::MiddleButton, Qt::NoModifier, p);
  QTest::mouseMove(widget, p + QPoint(25, 15));
  QTest::mouseMove(widget, p + QPoint(50, 30));
  QTest::mouseRelease(widget, Qt::MiddleButton, Qt::NoModifier, p + QPoint(50, 30));
  EXPECT_NEAR(widget->ModelToPixel(x, y).x(), p.x() + 50, 0.01);
  EXPECT_NEAR(widget->ModelToPixel(x, y).y(), p.y() + 30, 0.01);

  // Space + left drag pans as well and moves no node.
  const QPoint q = p + QPoint(50, 30);
  QTest::keyPress(widget, Qt::Key_Space);
  QTest::mousePress(widget, Qt::LeftButton, Qt::NoModifier, q);
  QTest::mouseMove(widget, q + QPoint(-20, 0));
  QTest::mouseMove(widget, q + QPoint(-40, -10));
  QTest::mouseRelease(widget, Qt::LeftButton, Qt::NoModifier, q + QPoint(-40, -10));
  QTest::keyRelease(widget, Qt::Key_Space);
  EXPECT_NEAR(widget->ModelToPixel(x, y).x(), q.x() - 40, 0.01);
  EXPECT_NEAR(widget->ModelToPixel(x, y).y(), q.y() - 10, 0.01);
  double nx = 0.0, ny = 0.0;
  VORIGraphNodeLayout_var(nodes[1])->GetPertPosition(nx, ny);
  EXPECT_EQ(nx, x0) << "panning moves no node";

  // Fit all brings every node back into the window.
  widget->FitAll();
  for (size_t i = 0; i < nodes.size(); ++i)
    EXPECT_TRUE(widget->rect().contains(NodePixel(widget, static_cast<int>(i)))) << i;
}

TEST_F(MainWindowTest, ContextMenusBalloonsAndCursorsComeFromTheViewer) {
  VORQtViewerWidget* widget = OpenChart(3);
  ASSERT_NE(widget, nullptr);
  VORViewer* viewer = widget->GetViewer();
  int activations = 0;
  VORDlgPushItem* added = nullptr;
  subscriber->AddCallback(
      viewer->GetEventPublisher(), "VORContext", [&](VORBaseUnknown*, VORNotification* n, void*) {
        auto* menu = VORDlgContextualMenu::FromContext(static_cast<VORContext*>(n));
        added = new VORDlgPushItem(menu, "Count");
        added->SetTitle("Count me");
        subscriber->AddCallback(added->GetEventPublisher(),
                                VORDlgPushItem::GetMenuIActivateNotification(),
                                [&](VORBaseUnknown*, VORNotification*, void*) { ++activations; });
      });
  QMenu* menu = widget->BuildContextMenu(NodePixel(widget, 0));
  ASSERT_NE(menu, nullptr);
  ASSERT_EQ(menu->actions().size(), 1);
  EXPECT_EQ(menu->actions().front()->text(), "Count me");
  menu->actions().front()->trigger();
  EXPECT_EQ(activations, 1);

  auto balloon = VORHandle<VORPVBalloon>::Adopt(new VORPVBalloon(viewer));
  balloon->SetVisibility(1);
  balloon->Show("Size = 3");
  widget->Sync();
  EXPECT_EQ(widget->GetBalloonText(), "Size = 3");
  balloon->Hide(1);
  widget->Sync();
  EXPECT_EQ(widget->GetBalloonText(), "");

  viewer->SetCursor(VORCursorDropAllowed);
  widget->Sync();
  EXPECT_EQ(widget->cursor().shape(), Qt::BitmapCursor) << "drop allowed has its own look";
  EXPECT_FALSE(widget->cursor().pixmap().isNull());
  viewer->SetCursor(VORCursorDragging);
  widget->Sync();
  EXPECT_EQ(widget->cursor().shape(), Qt::ClosedHandCursor);
  viewer->SetCursor(VORCursorSelect);
  widget->Sync();
  EXPECT_EQ(widget->cursor().shape(), Qt::ArrowCursor);
}

TEST_F(MainWindowTest, ClosingAnMdiWindowDeletesTheFrameWindow) {
  VORQtViewerWidget* widget = OpenChart(2);
  ASSERT_NE(widget, nullptr);
  ASSERT_NE(window->Driver().FindWindow("Chart"), nullptr);
  window->MdiArea()->activeSubWindow()->close();
  window->AfterStep();
  EXPECT_EQ(window->Driver().FindWindow("Chart"), nullptr);
  EXPECT_TRUE(window->MdiArea()->subWindowList().isEmpty());
}

TEST_F(MainWindowTest, SavingAsKeepsTheFileAndAFailureSaysWhy) {
  VORQtViewerWidget* widget = OpenChart(2);
  ASSERT_NE(widget, nullptr);
  const QPoint from = NodePixel(widget, 0);
  QTest::mousePress(widget, Qt::LeftButton, Qt::NoModifier, from);
  QTest::mouseMove(widget, from + QPoint(20, 0));
  QTest::mouseMove(widget, from + QPoint(40, 0));
  QTest::mouseRelease(widget, Qt::LeftButton, Qt::NoModifier, from + QPoint(40, 0));
  ASSERT_TRUE(window->isWindowModified());

  TempDir dir;
  const QString copy = QString::fromStdString(dir.Path() + "/copy.pprx");
  ASSERT_TRUE(window->SaveDocumentAs(copy));
  EXPECT_TRUE(QFileInfo::exists(copy));
  EXPECT_FALSE(window->isWindowModified());
  EXPECT_EQ(window->RecentFiles().front(), copy);
  EXPECT_TRUE(window->windowTitle().startsWith("copy.pprx"));

  MessageBoxAnswerer seen;
  EXPECT_FALSE(window->SaveDocumentAs("/nonexistent-dir/x.pprx"));
  ASSERT_TRUE(seen.seen);
  EXPECT_EQ(seen.icon, QMessageBox::Critical);
  EXPECT_TRUE(seen.text.contains("/nonexistent-dir/x.pprx"));
  EXPECT_EQ(window->RecentFiles().front(), copy) << "a failed save changes nothing";
}
