#include "VORQtViewerWidget.h"

#include <QContextMenuEvent>
#include <QKeyEvent>
#include <QMouseEvent>
#include <QPaintEvent>
#include <QPainter>
#include <QPixmap>
#include <QToolTip>
#include <QWheelEvent>
#include <functional>

#include "VORDeferredDeletion.h"
#include "VORDlgContextualMenu.h"
#include "VORPVBalloon.h"
#include "VORQtActivityInfo.h"
#include "VORQtStrings.h"

namespace {

// A pointer with a green badge holding a plus: "you may drop here".
QCursor DropAllowedCursor() {
  QPixmap pixmap(32, 32);
  pixmap.fill(Qt::transparent);
  QPainter p(&pixmap);
  p.setRenderHint(QPainter::Antialiasing);
  const QPointF arrow[7] = {{1, 1}, {1, 17}, {5, 13}, {8, 20}, {11, 19}, {8, 12}, {13, 12}};
  p.setPen(QPen(Qt::white, 1.5));
  p.setBrush(Qt::black);
  p.drawPolygon(arrow, 7);
  p.setPen(QPen(Qt::white, 1.5));
  p.setBrush(QColor(30, 160, 60));
  p.drawEllipse(QPointF(22, 22), 8.5, 8.5);
  p.setPen(QPen(Qt::white, 3.0, Qt::SolidLine, Qt::FlatCap));
  p.drawLine(QPointF(17, 22), QPointF(27, 22));
  p.drawLine(QPointF(22, 17), QPointF(22, 27));
  p.end();
  return QCursor(pixmap, 1, 1);
}

int ButtonOf(Qt::MouseButton button) {
  switch (button) {
    case Qt::LeftButton:
      return VORMouseLeft;
    case Qt::MiddleButton:
      return VORMouseMiddle;
    default:
      return VORMouseNone;
  }
}

void AddMenuItems(QMenu& menu, VORDlgControl* control, const VORHandle<VORContext>& context) {
  for (VORDlgControl* child : control->GetControls()) {
    if (!child->GetVisibility())
      continue;
    const QString title = child->GetTitle().IsEmpty() ? VORQtString(child->GetName())
                                                      : VORQtString(child->GetTitle());
    const std::string kind = child->GetKind();
    if (kind == "ContextualMenu") {
      QMenu* sub = menu.addMenu(title);
      AddMenuItems(*sub, child, context);
      sub->setEnabled(child->IsEffectivelySensitive());
    } else if (kind == "PushItem") {
      QAction* action = menu.addAction(title);
      action->setObjectName(VORQtString(child->GetName()));
      action->setEnabled(child->IsEffectivelySensitive());
      // The action keeps the notification (and so its menu and items) alive.
      VORHandle<VORDlgPushItem> item(child);
      QObject::connect(action, &QAction::triggered, [item, context]() {
        if (item)
          item->UserActivate();
        VORDeferredDeletion::Drain();
      });
    }
  }
}

}  // namespace

VORQtViewerWidget::VORQtViewerWidget(VORViewer* viewer, QWidget* parent)
    : QWidget(parent), _viewer(viewer) {
  setMouseTracking(true);
  setFocusPolicy(Qt::WheelFocus);
  setAttribute(Qt::WA_OpaquePaintEvent);
  setMinimumSize(120, 80);
  if (!_viewer)
    return;
  VOREventPublisher* publisher = _viewer->GetEventPublisher();
  _redrawCallback = publisher->AddCallback(
      VORViewer::kRedrawEvent,
      [this](VORBaseUnknown*, const std::string&, VORNotification*, void*, VORCallbackId) {
        // Commands may ask for many redraws in one step (one per node built): one Sync once
        // the step is over.
        if (_syncQueued)
          return;
        _syncQueued = true;
        QMetaObject::invokeMethod(
            this, [this]() { Sync(); }, Qt::QueuedConnection);
      },
      nullptr, this);
  _contextCallback = publisher->AddCallback(
      "VORContext",
      [this](VORBaseUnknown*, const std::string&, VORNotification* notification, void*,
             VORCallbackId) { _pendingContext = VORHandle<VORContext>(notification); },
      nullptr, this);
}

VORQtViewerWidget::~VORQtViewerWidget() {
  if (_viewer)
    _viewer->GetEventPublisher()->RemoveCallbacksOf(this);
}

void VORQtViewerWidget::SetGridCellSize(double cellSize) {
  _gridCellSize = cellSize > 0.0 ? cellSize : 0.0;
  update();
}

void VORQtViewerWidget::SetAntialiasing(bool on) {
  _antialias = on;
  update();
}

QPointF VORQtViewerWidget::ModelToPixel(double x, double y) const {
  const VORMathPoint2D p = _viewer->GetMain2DViewpoint()->ModelToPixel(x, y);
  return QPointF(p.x, p.y);
}

VORMathPoint2D VORQtViewerWidget::PixelToModel(const QPointF& pixel) const {
  return _viewer->GetMain2DViewpoint()->PixelToModel(pixel.x(), pixel.y());
}

void VORQtViewerWidget::FitAll() {
  if (!_viewer)
    return;
  // Framed on the widget's size as it is now, and again at each resize until the planner
  // zooms or pans himself.
  _viewer->SetGraphicSize(width(), height());
  _viewer->Reframe();
  _keepFitted = true;
  Sync();
}

int VORQtViewerWidget::ModifiersOf(Qt::KeyboardModifiers modifiers) {
  int out = 0;
  if (modifiers & Qt::ShiftModifier)
    out |= VORModShift;
  if (modifiers & Qt::ControlModifier)
    out |= VORModControl;
  if (modifiers & Qt::AltModifier)
    out |= VORModAlt;
  return out;
}

QCursor VORQtViewerWidget::CursorFor(int code) {
  switch (code) {
    case VORCursorDragging:
      return QCursor(Qt::ClosedHandCursor);
    case VORCursorDropAllowed: {
      static const QCursor drop = DropAllowedCursor();
      return drop;
    }
    default:
      return QCursor(Qt::ArrowCursor);
  }
}

void VORQtViewerWidget::TakeSnapshot(const VORRenderList& list) {
  _snapshot.clear();
  _snapshot.reserve(list.Items().size());
  for (const VORRenderItem& item : list.Items())
    _snapshot.push_back(Snapshot{item.rep, item.kind, item.highlight, item.box});
}

bool VORQtViewerWidget::ChangedArea(const VORRenderList& list, QRectF& area) const {
  const auto& items = list.Items();
  if (items.size() != _snapshot.size())
    return false;
  VORBox2D changed;
  for (size_t i = 0; i < items.size(); ++i) {
    const VORRenderItem& item = items[i];
    const Snapshot& before = _snapshot[i];
    if (item.rep == before.rep && item.kind == before.kind && item.highlight == before.highlight &&
        item.box == before.box)
      continue;
    changed.Extend(before.box);
    changed.Extend(item.box);
  }
  area = changed.IsEmpty() ? QRectF() : _view.ToPixels(changed);
  return true;
}

void VORQtViewerWidget::Sync() {
  _syncQueued = false;
  if (!_viewer)
    return;
  const VORQtViewTransform view = VORQtViewTransform::FromViewer(*_viewer);
  float bg[3];
  _viewer->GetBackgroundColor(bg[0], bg[1], bg[2]);
  const VORRenderList& list = _viewer->GetRenderList();
  const bool viewChangedNow = !_synced || view.centreX != _view.centreX ||
                              view.centreY != _view.centreY || view.scale != _view.scale ||
                              view.width != _view.width || view.height != _view.height;
  bool full = viewChangedNow || bg[0] != _background[0] || bg[1] != _background[1] ||
              bg[2] != _background[2];
  QRectF area;
  if (!full && !ChangedArea(list, area))
    full = true;
  if (full) {
    _lastRequest = rect();
    update();
  } else if (!area.isEmpty()) {
    // Room for line widths, highlight outlines and markers drawn at a minimum pixel size.
    _lastRequest = area.toAlignedRect().adjusted(-6, -6, 6, 6) & rect();
    update(_lastRequest);
  } else {
    _lastRequest = QRect();
  }
  TakeSnapshot(list);
  _view = view;
  std::copy(bg, bg + 3, _background);
  _synced = true;
  UpdateCursor();
  UpdateBalloon();
  if (viewChangedNow)
    emit viewChanged();
}

void VORQtViewerWidget::UpdateCursor() {
  int code = _viewer->GetCursor();
  if (_spaceDown && code == VORCursorDefault)
    code = -2;  // open hand while space is held
  if (code == _cursorCode)
    return;
  _cursorCode = code;
  setCursor(code == -2 ? QCursor(Qt::OpenHandCursor) : CursorFor(code));
}

void VORQtViewerWidget::UpdateBalloon() {
  QString text;
  QPointF at;
  for (VORPVBalloon* balloon : _viewer->GetBalloons()) {
    if (balloon->IsVisible()) {
      text = VORQtString(balloon->GetText());
      at = ModelToPixel(balloon->GetPosition().x, balloon->GetPosition().y);
      break;
    }
  }
  if (text == _balloonText)
    return;
  _balloonText = text;
  if (text.isEmpty())
    QToolTip::hideText();
  else
    QToolTip::showText(mapToGlobal(at.toPoint() + QPoint(12, 12)), text, this);
}

void VORQtViewerWidget::paintEvent(QPaintEvent* event) {
  QPainter painter(this);
  const QRectF area = event->rect();
  if (!_viewer) {
    painter.fillRect(area, palette().window());
    return;
  }
  painter.setRenderHint(QPainter::Antialiasing, _antialias);
  painter.setRenderHint(QPainter::TextAntialiasing, true);
  float r = 1.0f;
  float g = 1.0f;
  float b = 1.0f;
  _viewer->GetBackgroundColor(r, g, b);
  VORQtScenePainter::PaintBackground(painter, area, r, g, b);
  const VORQtViewTransform view = VORQtViewTransform::FromViewer(*_viewer);
  if (_gridCellSize > 0.0)
    VORQtScenePainter::PaintGrid(painter, view, area, _gridCellSize, QColor(200, 205, 215));
  _lastPaint = _painter.Paint(painter, _viewer->GetRenderList(), view, area);
}

void VORQtViewerWidget::resizeEvent(QResizeEvent* event) {
  QWidget::resizeEvent(event);
  if (_viewer) {
    _viewer->SetGraphicSize(width(), height());
    if (_keepFitted)
      _viewer->Reframe();
  }
  Sync();
}

void VORQtViewerWidget::mousePressEvent(QMouseEvent* event) {
  setFocus(Qt::MouseFocusReason);
  int button = ButtonOf(event->button());
  if (button == VORMouseLeft && _spaceDown) {
    button = VORMouseMiddle;
    _spacePanning = true;
  }
  if (button == VORMouseNone || !_viewer) {
    QWidget::mousePressEvent(event);
    return;
  }
  if (button == VORMouseMiddle)
    _keepFitted = false;
  _viewer->OnMousePress(event->position().x(), event->position().y(), button,
                        ModifiersOf(event->modifiers()));
  Sync();
  event->accept();
}

void VORQtViewerWidget::mouseMoveEvent(QMouseEvent* event) {
  if (!_viewer)
    return;
  _viewer->OnMouseMove(event->position().x(), event->position().y(),
                       ModifiersOf(event->modifiers()));
  Sync();
  if (event->buttons() == Qt::NoButton) {
    const QPointF pixel = event->position();
    UpdateHover(&pixel);
  }
  event->accept();
}

void VORQtViewerWidget::mouseReleaseEvent(QMouseEvent* event) {
  int button = ButtonOf(event->button());
  if (button == VORMouseLeft && _spacePanning) {
    button = VORMouseMiddle;
    _spacePanning = false;
  }
  if (button == VORMouseNone || !_viewer) {
    QWidget::mouseReleaseEvent(event);
    return;
  }
  _viewer->OnMouseRelease(event->position().x(), event->position().y(), button,
                          ModifiersOf(event->modifiers()));
  Sync();
  event->accept();
}

void VORQtViewerWidget::wheelEvent(QWheelEvent* event) {
  if (!_viewer || event->angleDelta().y() == 0) {
    QWidget::wheelEvent(event);
    return;
  }
  _keepFitted = false;
  _viewer->OnMouseWheel(event->position().x(), event->position().y(), event->angleDelta().y(),
                        ModifiersOf(event->modifiers()));
  Sync();
  event->accept();
}

QMenu* VORQtViewerWidget::BuildContextMenu(const QPointF& pixel, Qt::KeyboardModifiers modifiers) {
  if (!_viewer)
    return nullptr;
  _pendingContext = VORHandle<VORContext>();
  _viewer->OnContextMenu(pixel.x(), pixel.y(), ModifiersOf(modifiers));
  VORHandle<VORContext> context = _pendingContext;
  _pendingContext = VORHandle<VORContext>();
  Sync();
  VORHandle<VORDlgControl> menu(context ? context->GetContextualMenu() : nullptr);
  if (!menu || menu->GetControls().empty())
    return nullptr;
  delete _menu;
  _menu = new QMenu(this);
  AddMenuItems(*_menu, menu.get(), context);
  if (_menu->actions().isEmpty()) {
    delete _menu;
    return nullptr;
  }
  return _menu;
}

void VORQtViewerWidget::contextMenuEvent(QContextMenuEvent* event) {
  QMenu* menu = BuildContextMenu(event->pos(), event->modifiers());
  if (menu != nullptr)
    menu->popup(event->globalPos());
  event->accept();
}

void VORQtViewerWidget::UpdateHover(const QPointF* pixel) {
  VORBaseUnknown* activity = nullptr;
  if (pixel != nullptr && _viewer)
    activity = VORQtActivityInfo::ActivityOf(_viewer->PickPaths(pixel->x(), pixel->y()));
  if (activity == _hovered.get())
    return;
  _hovered = activity;
  setToolTip(VORQtActivityInfo::Name(activity));
  emit hoveredActivity(VORQtActivityInfo::Summary(activity));
}

void VORQtViewerWidget::leaveEvent(QEvent* event) {
  if (_viewer) {
    _viewer->OnMouseLeave();
    Sync();
  }
  UpdateHover(nullptr);
  QWidget::leaveEvent(event);
}

void VORQtViewerWidget::keyPressEvent(QKeyEvent* event) {
  if (event->key() == Qt::Key_Space && !event->isAutoRepeat()) {
    _spaceDown = true;
    UpdateCursor();
    event->accept();
    return;
  }
  if (event->key() == Qt::Key_Home || (event->key() == Qt::Key_F && event->modifiers() == 0)) {
    FitAll();
    event->accept();
    return;
  }
  QWidget::keyPressEvent(event);
}

void VORQtViewerWidget::keyReleaseEvent(QKeyEvent* event) {
  if (event->key() == Qt::Key_Space && !event->isAutoRepeat()) {
    _spaceDown = false;
    UpdateCursor();
    event->accept();
    return;
  }
  QWidget::keyReleaseEvent(event);
}
