// The application frame: its main window (the parent of dialogs and notifications), its layout
// and the open editors. One per process.
#pragma once

#include <string>
#include <vector>

#include "VORDlgControl.h"
#include "VORFrmEditor.h"
#include "VORFrmLayout.h"

// The main window as a dialog object: the parent that dialogs and notifications are given.
class VORFrmMainWindow : public VORDlgControl {
  VOR_DECLARE_CLASS(VORFrmMainWindow, VORDlgControl)
 public:
  VORFrmMainWindow() : VORDlgControl(nullptr, "MainWindow") {}
  const char* GetKind() const override { return "MainWindow"; }
};

class VORApplicationFrame : public VORBaseUnknown {
  VOR_DECLARE_CLASS(VORApplicationFrame, VORBaseUnknown)
 public:
  static VORApplicationFrame* GetApplicationFrame();

  VORFrmMainWindow* GetMainWindow() const { return _mainWindow.get(); }
  VORFrmLayout* GetLayout() const { return _layout.get(); }
  // Frame-wide events: VORFrmPickNotification after each pick.
  VOREventPublisher* GetEventPublisher() const { return _publisher.get(); }

  // Loads a process document into a new editor with its tree window, and makes it current.
  // Null and the reason in error when the file cannot be loaded (nothing changes then).
  VORFrmEditor* OpenDocument(const std::string& path, std::string& error);
  // Opens an already loaded document the same way.
  VORFrmEditor* OpenDocument(VORDocument* document);
  const std::vector<VORFrmEditor_var>& GetEditors() const { return _editors; }
  // Deletes the editor's windows and forgets it.
  void CloseEditor(VORFrmEditor* editor);
  // Closes every window and editor and cancels the running command (tests, end of a script).
  void CloseAll();

 protected:
  ~VORApplicationFrame() override;

 private:
  VORApplicationFrame();
  VORHandle<VORFrmMainWindow> _mainWindow;
  VORFrmLayout_var _layout;
  std::vector<VORFrmEditor_var> _editors;
  VORHandle<VOREventPublisher> _publisher;
};
