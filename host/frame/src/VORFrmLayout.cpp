#include "VORFrmLayout.h"

#include <algorithm>

#include "VORApplicationFrame.h"
#include "VORDeferredDeletion.h"
#include "VORFrmEditor.h"
#include "VORFrmWindow.h"

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
