// The on-screen face of a VORViewer: paints its render list and forwards mouse, wheel, context
// and key events to the viewer's entry points, which do picking, preselection, manipulators,
// panning and zooming. After each event it repaints only the part of the window whose items
// changed, shows the viewer's balloons as tooltips and maps the viewer's cursor codes to shapes.
#pragma once

#include <QCursor>
#include <QMenu>
#include <QPointer>
#include <QWidget>
#include <vector>

#include "VORContext.h"
#include "VORQtScenePainter.h"
#include "VORViewer.h"

class VORQtViewerWidget : public QWidget {
  Q_OBJECT
 public:
  // Holds the viewer while the widget lives.
  explicit VORQtViewerWidget(VORViewer* viewer, QWidget* parent = nullptr);
  ~VORQtViewerWidget() override;

  VORViewer* GetViewer() const { return _viewer.get(); }

  // Fits everything shown into the window, and keeps it fitted through resizes until the view
  // is zoomed or panned.
  void FitAll();
  // Catches up with the viewer: repaints what changed (nothing when nothing did), cursor,
  // balloons. Called after every forwarded event, and once after the current step when the
  // viewer asks for redraws.
  void Sync();

  // Grid every cellSize model units (0, the default: none).
  void SetGridCellSize(double cellSize);
  double GetGridCellSize() const { return _gridCellSize; }
  void SetAntialiasing(bool on);

  // Pixel of a model point and model point of a pixel, in widget coordinates.
  QPointF ModelToPixel(double x, double y) const;
  VORMathPoint2D PixelToModel(const QPointF& pixel) const;

  // The contextual menu the viewer's subscribers build for a right click at pixel: a new menu
  // (owned by this widget) whose actions choose the dialog layer's push items; null when nobody
  // added an item.
  QMenu* BuildContextMenu(const QPointF& pixel, Qt::KeyboardModifiers modifiers = {});

  // The look of a viewer cursor code (8: a drop is allowed, a pointer with a green plus badge).
  static QCursor CursorFor(int code);

  // What the last paint did and the region the last Sync asked to repaint (empty: nothing;
  // the whole rectangle: everything), for tests and the status bar.
  const VORQtPaintStatistics& GetLastPaintStatistics() const { return _lastPaint; }
  QRect GetLastRepaintRequest() const { return _lastRequest; }
  // The balloon text shown as a tooltip (empty when none).
  QString GetBalloonText() const { return _balloonText; }

 signals:
  // After a Sync that changed the viewpoint (pan, zoom, fit).
  void viewChanged();
  // The pointer came over another activity: its one-line summary (empty when none).
  void hoveredActivity(const QString& summary);

 protected:
  void paintEvent(QPaintEvent* event) override;
  void resizeEvent(QResizeEvent* event) override;
  void mousePressEvent(QMouseEvent* event) override;
  void mouseMoveEvent(QMouseEvent* event) override;
  void mouseReleaseEvent(QMouseEvent* event) override;
  void wheelEvent(QWheelEvent* event) override;
  void contextMenuEvent(QContextMenuEvent* event) override;
  void leaveEvent(QEvent* event) override;
  void keyPressEvent(QKeyEvent* event) override;
  void keyReleaseEvent(QKeyEvent* event) override;

 private:
  // What an item looked like when last compared: enough to tell which parts of the window a
  // change touches.
  struct Snapshot {
    const void* rep;
    VORPrimitiveKind kind;
    int highlight;
    VORBox2D box;
  };
  void TakeSnapshot(const VORRenderList& list);
  // The pixel rectangle to repaint for the change from the snapshot to list; null when the whole
  // window must be repainted.
  bool ChangedArea(const VORRenderList& list, QRectF& area) const;
  void UpdateCursor();
  void UpdateBalloon();
  // The activity under pixel (none: null pixel) becomes the hovered one: whole name as the
  // tooltip, summary to the status bar.
  void UpdateHover(const QPointF* pixel);
  static int ModifiersOf(Qt::KeyboardModifiers modifiers);

  VORViewer_var _viewer;
  VORCallbackId _redrawCallback = 0;
  VORCallbackId _contextCallback = 0;
  VORHandle<VORContext> _pendingContext;
  VORQtScenePainter _painter;
  VORQtPaintStatistics _lastPaint;
  QRect _lastRequest;
  double _gridCellSize = 0.0;
  bool _antialias = true;
  bool _spaceDown = false;
  bool _keepFitted = false;  // fitted and not zoomed or panned since: resizes fit again
  bool _spacePanning = false;
  int _cursorCode = -1;
  QString _balloonText;
  VORBaseUnknown_var _hovered;
  QPointer<QMenu> _menu;

  // State at the last Sync.
  VORQtViewTransform _view;
  float _background[3] = {-1.0f, -1.0f, -1.0f};
  std::vector<Snapshot> _snapshot;
  bool _synced = false;
  bool _syncQueued = false;
};
