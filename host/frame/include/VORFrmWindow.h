// A document window of the frame: a name, its editor, a displayed title, a rectangle (a change
// sends the size notification), a frame for its viewer, and DeleteWindow. A new window joins
// the current layout, which takes the creator's reference; DeleteWindow removes it and releases
// it through deferred destruction.
#pragma once

#include <string>

#include "VORCommand.h"
#include "VORDlgFrame.h"
#include "VORViewer.h"

class VORFrmEditor;
class VORViewer;

// Sent on the window's publisher after its rectangle changed.
class VORFrmWindowSizeNotification : public VORNotification {
  VOR_DECLARE_CLASS(VORFrmWindowSizeNotification, VORNotification)
};

struct VORRectangle {
  int x = 0;
  int y = 0;
  int width = 0;
  int height = 0;
};

class VORFrmWindow : public VORCommand {
  VOR_DECLARE_CLASS(VORFrmWindow, VORCommand)
 public:
  VORFrmWindow(const VORString& name, VORFrmEditor* editor);

  VORFrmEditor* GetEditor() const { return _editor; }
  // The displayed title (the name until set).
  VORUnicodeString GetTitle() const { return _title; }
  void SetTitle(const VORUnicodeString& title) { _title = title; }
  // (0, 0, 0, 0) until the layout places the window.
  VORRectangle GetRectangle() const { return _rectangle; }
  void SetRectangle(const VORRectangle& rectangle);
  static const char* GetSizeNotification() { return "VORFrmWindowSizeNotification"; }

  // The frame a viewer attaches to (owned by the window).
  VORDlgFrame* GetViewerFrame() const { return _viewerFrame.get(); }
  // The 2D viewer shown in the window: the one set, else the first viewer created in the viewer
  // frame; null when none. The window routes the viewer's selection clicks (VORViewerPick) to
  // the running command or to the editor's CSO, like the driver's picks.
  VORViewer* GetViewer();
  void SetViewer(VORViewer* viewer);
  virtual bool Has3DViewer() const { return false; }

  // Closes the window: leaves the layout and is released after the current event.
  virtual void DeleteWindow();
  bool IsDeleted() const { return _deleted; }

  // The activity whose children the window shows as a chart, or null (not a chart window).
  virtual VORBaseUnknown_var GetChartRoot() const { return VORBaseUnknown_var(); }
  // Lines a planner checks in a script ("print window"): by default the chart's nodes with
  // their positions when the window shows a chart, else nothing.
  virtual std::string DescribeContents() const;

 protected:
  ~VORFrmWindow() override;

 private:
  VORFrmEditor* _editor;  // not held: an editor outlives its windows
  VORUnicodeString _title;
  VORRectangle _rectangle;
  VORHandle<VORDlgFrame> _viewerFrame;
  VORHandle<VORViewer> _viewer;
  VORCallbackId _pickCallback = 0;
  bool _deleted = false;
};

VOR_DECLARE_HANDLE(VORFrmWindow);
