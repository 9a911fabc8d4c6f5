// The frame's layout: its windows in order of creation, the current window, the MDI state and
// the tiling of the windows. Holds the windows until they are deleted.
#pragma once

#include <vector>

#include "VOREventPublisher.h"
#include "VORFrmWindow.h"
#include "VORLists.h"

// Sent on the layout's publisher when a window joins or leaves it or becomes current, so that a
// GUI can follow the windows without polling.
class VORFrmLayoutNotification : public VORNotification {
  VOR_DECLARE_CLASS(VORFrmLayoutNotification, VORNotification)
 public:
  enum Change { WindowAdded, WindowRemoved, CurrentWindowChanged };
  VORFrmLayoutNotification(VORFrmWindow* window, Change change)
      : _window(window), _change(change) {}
  // The window concerned (null when no window is current any more).
  VORFrmWindow* GetWindow() const { return _window.get(); }
  Change GetChange() const { return _change; }

 private:
  VORFrmWindow_var _window;
  Change _change;
};

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

  // Dispatches VORFrmLayoutNotification.
  VOREventPublisher* GetEventPublisher() const { return _publisher.get(); }

  // Used by VORFrmWindow.
  void AddWindow(VORFrmWindow* window);
  void RemoveWindow(VORFrmWindow* window);

 protected:
  ~VORFrmLayout() override;

 private:
  void Announce(VORFrmWindow* window, VORFrmLayoutNotification::Change change);

  VORHandle<VOREventPublisher> _publisher =
      VORHandle<VOREventPublisher>::Adopt(new VOREventPublisher(this));
  std::vector<VORFrmWindow_var> _windows;
  VORFrmWindow* _current = nullptr;
  int _mdiState = MDIMaximized;
  VORRectangle _clientArea{0, 0, 1200, 800};
};

VOR_DECLARE_HANDLE(VORFrmLayout);
