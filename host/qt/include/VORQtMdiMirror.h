// The MDI area as a mirror of the frame layout: one sub-window per frame window (the tree
// window excepted), a chart widget for a window with a 2D viewer and a read-only description
// for the others. Closing a sub-window deletes its frame window.
#pragma once

#include <QPointer>
#include <functional>
#include <map>

#include "VORFrmWindow.h"

class QMdiArea;
class QMdiSubWindow;
class QWidget;
class VORQtViewerWidget;

class VORQtMdiMirror {
 public:
  explicit VORQtMdiMirror(QMdiArea* mdi) : _mdi(mdi) {}
  ~VORQtMdiMirror() { Clear(); }
  VORQtMdiMirror(const VORQtMdiMirror&) = delete;
  VORQtMdiMirror& operator=(const VORQtMdiMirror&) = delete;

  // Adds and removes sub-windows to match the layout, refreshes titles and descriptions, and
  // activates the layout's current window. A new chart is fitted to its window.
  void Sync();
  // Deletes every sub-window and what was built for it (the window goes first).
  void Clear();
  // The frame window a sub-window shows, or null (another widget, or a deleted window).
  static VORFrmWindow* WindowOf(QMdiSubWindow* sub);

  // The chart widget of the active sub-window (else the last one), or null.
  VORQtViewerWidget* CurrentViewerWidget() const;
  // The chart widget of a frame window, or null.
  VORQtViewerWidget* ViewerWidgetOf(VORFrmWindow* window) const;
  void ForEachViewerWidget(const std::function<void(VORQtViewerWidget&)>& visit) const;
  // Called with each chart widget the mirror makes (the window listens to its hovering).
  std::function<void(VORQtViewerWidget&)> onNewChart;

 private:
  QWidget* MakeWindowWidget(VORFrmWindow* window);

  struct Entry {
    VORFrmWindow_var window;
    QPointer<QMdiSubWindow> sub;
    std::function<void()> cleanup;  // what the mirror built for the window, undone at its end
  };
  QMdiArea* _mdi;
  std::map<VORFrmWindow*, Entry> _windows;
};
