// The frame's layout: its windows in order of creation, the current window, the MDI state and
// the tiling of the windows. Holds the windows until they are deleted.
#pragma once

#include <vector>

#include "VORFrmWindow.h"
#include "VORLists.h"

class VORFrmLayout : public VORBaseUnknown {
  VOR_DECLARE_CLASS(VORFrmLayout, VORBaseUnknown)
 public:
  // MDI states: windows free, tiled, one maximised.
  enum MDIState { MDINormal = 0, MDITiled = 1, MDIMaximized = 2 };

  // The application frame's layout (never null).
  static VORFrmLayout* GetCurrentLayout();

  std::vector<VORFrmWindow*> GetWindowList() const;
  // The windows as handles, in order. A new list; the caller deletes it.
  VORListValVORBaseUnknown_var* GetWindows() const;
  VORFrmWindow* GetCurrentWindow() const { return _current; }
  // Makes window current (its editor becomes the current editor). Ignored for a window that is
  // not in the layout.
  void SetCurrentWindow(VORFrmWindow* window);
  void ActivateWindow(VORFrmWindow* window) { SetCurrentWindow(window); }

  int GetMDIState() const { return _mdiState; }
  void SetMDIState(int state) { _mdiState = state; }
  // Places the windows side by side over the frame's client area; MDI state becomes tiled.
  void TileHorizontally();
  VORRectangle GetClientArea() const { return _clientArea; }
  void SetClientArea(const VORRectangle& area) { _clientArea = area; }

  // Used by VORFrmWindow.
  void AddWindow(VORFrmWindow* window);
  void RemoveWindow(VORFrmWindow* window);

 protected:
  ~VORFrmLayout() override;

 private:
  std::vector<VORFrmWindow_var> _windows;
  VORFrmWindow* _current = nullptr;
  int _mdiState = MDIMaximized;
  VORRectangle _clientArea{0, 0, 1200, 800};
};

VOR_DECLARE_HANDLE(VORFrmLayout);
