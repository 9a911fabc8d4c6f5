#include "VORFrmWindow.h"

#include "VORFrmLayout.h"
#include "VORFrmPick.h"

VORFrmWindow::VORFrmWindow(const VORString& name, VORFrmEditor* editor)
    : VORCommand(nullptr, name),
      _editor(editor),
      _title(name.ToUnicode()),
      _viewerFrame(VORHandle<VORDlgFrame>::Adopt(new VORDlgFrame(nullptr, "ViewerFrame"))) {
  VORFrmLayout::GetCurrentLayout()->AddWindow(this);
}

VORFrmWindow::~VORFrmWindow() = default;

VORViewer* VORFrmWindow::GetViewer() {
  if (!_viewer) {
    for (VORCommand* child : _viewerFrame->GetChildren()) {
      if (auto* viewer = dynamic_cast<VORViewer*>(child)) {
        SetViewer(viewer);
        break;
      }
    }
  }
  return _viewer.get();
}

void VORFrmWindow::SetViewer(VORViewer* viewer) {
  if (_viewer.get() == viewer)
    return;
  if (_viewer)
    RemoveCallback(_pickCallback);
  _pickCallback = 0;
  _viewer = viewer;
  if (!viewer)
    return;
  _pickCallback =
      AddCallback(viewer->GetEventPublisher(), VORViewer::kPickEvent,
                  [this](VORBaseUnknown*, VORNotification* n, void*) {
                    auto* pick = dynamic_cast<VORViewerPickNotification*>(n);
                    if (pick != nullptr)
                      VORFrmDispatchPick(_editor, pick->GetPaths(), pick->GetModifiers(),
                                         pick->GetMultiSelBehavior());
                  });
}

void VORFrmWindow::SetRectangle(const VORRectangle& r) {
  const VORRectangle old = _rectangle;
  _rectangle = r;
  if (old.width != r.width || old.height != r.height || old.x != r.x || old.y != r.y) {
    auto n = VORHandle<VORFrmWindowSizeNotification>::Adopt(new VORFrmWindowSizeNotification());
    DispatchNotification(n);
  }
}

void VORFrmWindow::DeleteWindow() {
  if (_deleted)
    return;
  _deleted = true;
  SetViewer(nullptr);
  VORFrmLayout::GetCurrentLayout()->RemoveWindow(this);
}
