// The headless driver: does what a user does, through the same entry points as the GUI. Tests,
// "pfv script" and the Qt shell use it. Every step ends like a user event: the deferred
// destruction queue is drained. Steps return false with a reason in LastError() when they
// cannot be done (unknown object, no such dialog, insensitive button ...).
#pragma once

#include <string>
#include <vector>

#include "VORApplicationFrame.h"
#include "VORDlgDialog.h"
#include "VORDlgNotify.h"
#include "VORPathElement.h"

class VORDriver {
 public:
  // Starts from an empty frame; notifications go to the recorder from here on.
  VORDriver();
  // Closes everything the driver opened.
  ~VORDriver();
  VORDriver(const VORDriver&) = delete;
  VORDriver& operator=(const VORDriver&) = delete;

  const std::string& LastError() const { return _error; }

  // Documents.
  bool OpenDocument(const std::string& path);
  VORFrmEditor* GetEditor() const;
  VORProcess* GetDocument() const;
  bool SaveDocument(const std::string& path);
  // Writes the window's viewer scene as SVG (empty window: the current one).
  bool ExportWindow(const std::string& window, const std::string& path);

  // Commands: a workbench command id or a declared host command id.
  bool StartCommand(const std::string& id);
  bool CancelCommand();
  VORCommand* GetRunningCommand() const;

  // Undo and redo of the current document, one step per user command; false with a reason when
  // there is nothing to undo or redo.
  bool Undo();
  bool Redo();
  // Ends the current undo step unless a command is running (the GUI calls it after each user
  // event; every driver step does it).
  void EndUndoStep();

  // A pick in the tree: the object by id (or by label), with the objects above it.
  bool PickObject(const std::string& idOrLabel);
  // Makes the current selection exactly these objects (by id or label, with the objects above
  // them), in this order; nothing changes when one is unknown.
  bool SelectObjects(const std::vector<std::string>& idsOrLabels);
  // A click in a window (by title or name, empty: the current window) at a model point: through
  // the window's viewer when it has one, else on the chart window's node boxes. A click on the
  // background empties the selection (without a command) and is reported as an event.
  bool PickInChart(const std::string& window, double x, double y);
  // The object's path (root first), or null when unknown.
  VORPathElement_var PathOf(const std::string& idOrLabel);
  VORBaseUnknown* FindObject(const std::string& idOrLabel) const;

  // Dialogs: the shown dialog of that name (empty: the last shown one).
  bool PressOK(const std::string& dialog = std::string());
  bool PressCancel(const std::string& dialog = std::string());
  bool CloseDialog(const std::string& dialog = std::string());
  bool TypeText(const std::string& dialog, const std::string& editor, const std::string& text);
  // Chooses a line of a combo, or of a selector list (the line becomes its only selection).
  bool ChooseComboLine(const std::string& dialog, const std::string& combo,
                       const std::string& line);
  bool ToggleCheckButton(const std::string& dialog, const std::string& button);
  VORDlgDialog* FindDialog(const std::string& name) const;

  // Context menu of a window at a point (empty window: the current one), then one of its items
  // by name or title.
  bool OpenContextMenu(const std::string& window, double x, double y);
  bool ChooseMenuItem(const std::string& item);
  // A drag from one model point to another: a manipulator drag in the window's viewer, or the
  // chart node under the first point moved by the difference.
  bool Drag(const std::string& window, double x0, double y0, double x1, double y1);

  // Windows.
  VORFrmWindow* FindWindow(const std::string& titleOrName) const;
  bool ActivateWindow(const std::string& titleOrName);
  bool CloseWindow(const std::string& titleOrName);

  // What happened since the last call, one line each: "notification \"title\": text",
  // "command <id> ended" / "cancelled", "command <id> started", and the texts of
  // VORFrmMessageNotification.
  std::vector<std::string> TakeEvents();
  const std::vector<VORDlgNotifyRecord>& Notifications() const;
  int DrainDeferred();

  // State a planner checks.
  std::string DescribeWindows() const;
  std::string DescribeWindow(const std::string& titleOrName) const;
  std::string DescribeCSO() const;
  std::string DescribeDialog(const std::string& name) const;
  std::string DescribeMenu() const;

 private:
  bool Fail(const std::string& why);
  bool Step(bool ok);
  VORDlgControl* FindControl(const std::string& dialog, const std::string& control);
  bool OfferPick(VORPathElement* path);
  void CollectNotifications();

  std::string _error;
  std::vector<std::string> _events;
  size_t _notificationsSeen = 0;
  unsigned int _engineCallback = 0;
  unsigned int _pickCallback = 0;
  unsigned int _messageCallback = 0;
  VORHandle<VORDlgControl> _menu;
};
