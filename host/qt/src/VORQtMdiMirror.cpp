#include "VORQtMdiMirror.h"

#include <QMdiArea>
#include <QMdiSubWindow>
#include <QMoveEvent>
#include <QPlainTextEdit>
#include <QResizeEvent>
#include <QTimer>
#include <algorithm>

#include "QELPertChart.h"
#include "QELPertViewer.h"
#include "VORFrmLayout.h"
#include "VORQtChartLegend.h"
#include "VORFrmWindowKinds.h"
#include "VORQtStrings.h"
#include "VORQtViewerWidget.h"
#include "VORViewer.h"

namespace {

// An MDI window showing one frame window; closing it deletes the frame window.
class VORQtMdiWindow : public QMdiSubWindow {
 public:
  explicit VORQtMdiWindow(VORFrmWindow* window) : _window(window) {
    setAttribute(Qt::WA_DeleteOnClose);
    setObjectName(VORQtString(window->GetName()));
  }
  VORFrmWindow* Window() const { return _window.get(); }
  bool hasViewer = false;

 protected:
  void closeEvent(QCloseEvent* event) override {
    if (_window && !_window->IsDeleted())
      _window->DeleteWindow();
    QMdiSubWindow::closeEvent(event);
  }
  // The frame window knows its place (its title is shortened to its width).
  void resizeEvent(QResizeEvent* event) override {
    QMdiSubWindow::resizeEvent(event);
    TellRectangle();
  }
  void moveEvent(QMoveEvent* event) override {
    QMdiSubWindow::moveEvent(event);
    TellRectangle();
  }
  void TellRectangle() {
    if (_window && !_window->IsDeleted())
      _window->SetRectangle(VORRectangle{x(), y(), width(), height()});
  }

 private:
  VORFrmWindow_var _window;
};

VORViewer* ViewerOf(VORFrmWindow* window) {
  return window ? dynamic_cast<VORViewer*>(window->GetViewer()) : nullptr;
}

}  // namespace

VORFrmWindow* VORQtMdiMirror::WindowOf(QMdiSubWindow* sub) {
  auto* mdi = dynamic_cast<VORQtMdiWindow*>(sub);
  return mdi != nullptr && !mdi->Window()->IsDeleted() ? mdi->Window() : nullptr;
}

void VORQtMdiMirror::Clear() {
  for (auto& [window, entry] : _windows) {
    if (entry.sub)
      delete entry.sub;
    if (entry.cleanup)
      entry.cleanup();
  }
  _windows.clear();
}

QWidget* VORQtMdiMirror::MakeWindowWidget(VORFrmWindow* window) {
  // The classic chart window keeps no viewer of its own: it gets the graph editor's chart of
  // its level, drawn as the export draws it, so that it can be seen and picked in.
  if (auto* chart = dynamic_cast<QELFpaPertChartWindow*>(window);
      chart != nullptr && ViewerOf(window) == nullptr) {
    auto viewer = VORHandle<QELPertViewer>::Adopt(new QELPertViewer(
        window->GetViewerFrame(), "PERT Chart", QELPertParameters::PERT_VIEWER_STYLE, 800, 500,
        QELPertParameters::PERT_VIEWER_FLAGS));
    auto controller = VORHandle<QELPertController>::Adopt(
        QELPertBuildChart(chart->GetChartRoot(), viewer, PertModeEditable));
    if (controller) {
      viewer->SetViewerSelectable(true);
      window->SetViewer(viewer);
      _windows[window].cleanup = [controller]() { controller->RemoveAllPertNodes(); };
    }
  }
  if (VORViewer* viewer = ViewerOf(window)) {
    auto* widget = new VORQtViewerWidget(viewer);
    widget->setObjectName(VORQtString(window->GetName()) + "Viewer");
    // A chart of activities says what its colours mean.
    if (dynamic_cast<QELPertViewer*>(viewer) != nullptr)
      new VORQtChartLegend(widget);
    if (onNewChart)
      onNewChart(*widget);
    return widget;
  }
  // A window without a 2D viewer shows what it describes to a planner.
  auto* text = new QPlainTextEdit();
  text->setReadOnly(true);
  text->setPlainText(VORQtString(window->DescribeContents()));
  return text;
}

void VORQtMdiMirror::Sync() {
  VORFrmLayout* layout = VORFrmLayout::GetCurrentLayout();
  const QRect client = _mdi->viewport()->rect();
  layout->SetClientArea(VORRectangle{0, 0, client.width(), client.height()});
  const std::vector<VORFrmWindow*> windows = layout->GetWindowList();
  for (auto it = _windows.begin(); it != _windows.end();) {
    VORFrmWindow* window = it->first;
    const bool present = std::find(windows.begin(), windows.end(), window) != windows.end();
    if (present && !window->IsDeleted()) {
      ++it;
      continue;
    }
    if (it->second.sub)
      delete it->second.sub;
    if (it->second.cleanup)
      it->second.cleanup();
    it = _windows.erase(it);
  }
  for (VORFrmWindow* window : windows) {
    if (dynamic_cast<VORFrmTreeWindow*>(window) != nullptr || window->IsDeleted())
      continue;
    Entry& entry = _windows[window];
    auto* sub = static_cast<VORQtMdiWindow*>(entry.sub.data());
    const bool hasViewer = ViewerOf(window) != nullptr;
    if (sub == nullptr) {
      entry.window = window;
      sub = new VORQtMdiWindow(window);
      sub->setWidget(MakeWindowWidget(window));
      sub->hasViewer = ViewerOf(window) != nullptr;
      _mdi->addSubWindow(sub);
      sub->resize(std::max(400, _mdi->width() * 3 / 4), std::max(300, _mdi->height() * 3 / 4));
      // The layout's MDI state says how a new window is placed.
      if (layout->GetMDIState() == VORFrmLayout::MDIMaximized) {
        sub->showMaximized();
      } else {
        sub->show();
        if (layout->GetMDIState() == VORFrmLayout::MDITiled)
          _mdi->tileSubWindows();
      }
      entry.sub = sub;
      // A chart opens framed on its whole scene (again once the window has its final size).
      if (auto* viewer = qobject_cast<VORQtViewerWidget*>(sub->widget())) {
        viewer->FitAll();
        QTimer::singleShot(0, viewer, [viewer]() { viewer->FitAll(); });
      }
    } else if (sub->hasViewer != hasViewer) {
      sub->setWidget(MakeWindowWidget(window));
      sub->hasViewer = hasViewer;
    } else if (auto* text = qobject_cast<QPlainTextEdit*>(sub->widget())) {
      const QString contents = VORQtString(window->DescribeContents());
      if (text->toPlainText() != contents)
        text->setPlainText(contents);
    }
    sub->setWindowTitle(VORQtString(window->GetTitle()));
  }
  if (auto it = _windows.find(layout->GetCurrentWindow()); it != _windows.end() && it->second.sub) {
    if (_mdi->activeSubWindow() != it->second.sub)
      _mdi->setActiveSubWindow(it->second.sub);
  }
}

VORQtViewerWidget* VORQtMdiMirror::CurrentViewerWidget() const {
  QMdiSubWindow* sub = _mdi->activeSubWindow();
  if (sub == nullptr && !_mdi->subWindowList().isEmpty())
    sub = _mdi->subWindowList().constLast();
  return sub ? qobject_cast<VORQtViewerWidget*>(sub->widget()) : nullptr;
}

VORQtViewerWidget* VORQtMdiMirror::ViewerWidgetOf(VORFrmWindow* window) const {
  auto it = _windows.find(window);
  if (it == _windows.end() || !it->second.sub)
    return nullptr;
  return qobject_cast<VORQtViewerWidget*>(it->second.sub->widget());
}

void VORQtMdiMirror::ForEachViewerWidget(
    const std::function<void(VORQtViewerWidget&)>& visit) const {
  for (const auto& [window, entry] : _windows) {
    if (entry.sub)
      if (auto* viewer = qobject_cast<VORQtViewerWidget*>(entry.sub->widget()))
        visit(*viewer);
  }
}
