// Windows, the layout and the application frame.
#include "VORFrmWindow.h"

#include <algorithm>
#include <filesystem>

#include "VORApplicationFrame.h"
#include "VORCommandEngine.h"
#include "VORDeferredDeletion.h"
#include "VORDocument.h"
#include "VORExtensionRegistry.h"
#include "VORFrmLayout.h"
#include "VORFrmPick.h"
#include "VORFrmWindowKinds.h"

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

VORFrmLayout* VORFrmLayout::GetCurrentLayout() {
  return VORApplicationFrame::GetApplicationFrame()->GetLayout();
}

VORFrmLayout::~VORFrmLayout() = default;

std::vector<VORFrmWindow*> VORFrmLayout::GetWindowList() const {
  std::vector<VORFrmWindow*> list;
  for (const VORFrmWindow_var& w : _windows)
    list.push_back(w.get());
  return list;
}

VORListValVORBaseUnknown_var* VORFrmLayout::GetWindows() const {
  auto* list = new VORListValVORBaseUnknown_var;
  for (const VORFrmWindow_var& w : _windows)
    list->Append(VORBaseUnknown_var(w.get()));
  return list;
}

void VORFrmLayout::SetCurrentWindow(VORFrmWindow* window) {
  if (window != nullptr && std::none_of(_windows.begin(), _windows.end(),
                                        [window](const auto& w) { return w.get() == window; }))
    return;
  const bool changed = _current != window;
  _current = window;
  if (window != nullptr && window->GetEditor() != nullptr)
    VORFrmEditor::SetCurrentEditor(window->GetEditor());
  if (changed)
    Announce(window, VORFrmLayoutNotification::CurrentWindowChanged);
}

void VORFrmLayout::Announce(VORFrmWindow* window, VORFrmLayoutNotification::Change change) {
  auto n = VORHandle<VORFrmLayoutNotification>::Adopt(new VORFrmLayoutNotification(window, change));
  _publisher->Dispatch(n);
}

void VORFrmLayout::TileHorizontally() {
  if (_windows.empty())
    return;
  const int n = static_cast<int>(_windows.size());
  const int width = _clientArea.width / n;
  for (int i = 0; i < n; ++i)
    _windows[static_cast<size_t>(i)]->SetRectangle(
        VORRectangle{_clientArea.x + i * width, _clientArea.y, width, _clientArea.height});
  _mdiState = MDITiled;
}

void VORFrmLayout::AddWindow(VORFrmWindow* window) {
  _windows.push_back(VORFrmWindow_var::Adopt(window));
  if (_mdiState == MDIMaximized)
    window->SetRectangle(_clientArea);
  Announce(window, VORFrmLayoutNotification::WindowAdded);
  SetCurrentWindow(window);
}

void VORFrmLayout::RemoveWindow(VORFrmWindow* window) {
  auto it = std::find_if(_windows.begin(), _windows.end(),
                         [window](const auto& w) { return w.get() == window; });
  if (it == _windows.end())
    return;
  VORFrmWindow_var keep(window);
  VORCommandDeletion(it->Detach());
  _windows.erase(it);
  Announce(window, VORFrmLayoutNotification::WindowRemoved);
  if (_current == window)
    SetCurrentWindow(_windows.empty() ? nullptr : _windows.back().get());
}

VORApplicationFrame::VORApplicationFrame()
    : _mainWindow(VORHandle<VORFrmMainWindow>::Adopt(new VORFrmMainWindow())),
      _layout(VORFrmLayout_var::Adopt(new VORFrmLayout())),
      _publisher(VORHandle<VOREventPublisher>::Adopt(new VOREventPublisher(this))) {
  // Modules extend model objects on demand: the dictionary names the module of each extension.
  VORExtensionRegistry::LoadDictionaryFromStartupPath();
}

VORApplicationFrame::~VORApplicationFrame() = default;

VORApplicationFrame* VORApplicationFrame::GetApplicationFrame() {
  // Never destroyed: windows and editors may still be queued for deletion at exit.
  static VORApplicationFrame* frame = new VORApplicationFrame();
  return frame;
}

VORFrmEditor* VORApplicationFrame::OpenDocument(const std::string& path, std::string& error) {
  VORProcess_var document = VORProcess_var::Adopt(VORProcess::Load(path, error));
  if (!document)
    return nullptr;
  return OpenDocument(document);
}

VORFrmEditor* VORApplicationFrame::OpenDocument(VORDocument* document) {
  if (document == nullptr)
    return nullptr;
  _editors.push_back(VORFrmEditor_var::Adopt(new VORFrmEditor(document)));
  VORFrmEditor* editor = _editors.back().get();
  VORFrmEditor::SetCurrentEditor(editor);
  std::string name = std::filesystem::path(document->GetStorageName()).filename().string();
  if (name.empty())
    name = "Process";
  new VORFrmTreeWindow(name, editor);  // the layout holds it
  return editor;
}

void VORApplicationFrame::CloseEditor(VORFrmEditor* editor) {
  VORFrmEditor_var keep(editor);
  for (VORFrmWindow* w : _layout->GetWindowList()) {
    if (w->GetEditor() == editor)
      w->DeleteWindow();
  }
  std::erase_if(_editors, [editor](const VORFrmEditor_var& e) { return e.get() == editor; });
  if (VORFrmEditor::GetCurrentEditor() == editor)
    VORFrmEditor::SetCurrentEditor(_editors.empty() ? nullptr : _editors.back().get());
}

void VORApplicationFrame::CloseAll() {
  VORCommandEngine::CancelCurrent();
  for (VORFrmWindow* w : _layout->GetWindowList())
    w->DeleteWindow();
  VORFrmEditor::SetCurrentEditor(nullptr);
  _editors.clear();
  _layout->SetMDIState(VORFrmLayout::MDIMaximized);
  VORDeferredDeletion::Drain();
}
