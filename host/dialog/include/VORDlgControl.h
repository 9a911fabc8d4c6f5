// Base of every dialog object. A headless control knows its kind, name, title, grid place,
// value, sensitivity and visibility, and its children, so that a GUI shell can build widgets
// from the tree and call the same "User..." entry points as the headless driver.
// Ownership: a control created with a parent control is owned by that parent (the parent takes
// the creator's reference). Windows (dialogs, notifications) are not: their creator keeps the
// reference and releases it with RequestDelayedDestruction; the parent only lists them.
#pragma once

#include <string>
#include <vector>

#include "VORCommand.h"
#include "VORDlgStyles.h"

class VORDlgControl;

// Base of the notifications of dialog objects; GetControl is the control that sent it.
class VORDlgNotification : public VORNotification {
  VOR_DECLARE_CLASS(VORDlgNotification, VORNotification)
 public:
  explicit VORDlgNotification(VORDlgControl* control) : _control(control) {}
  VORDlgControl* GetControl() const { return _control; }

 private:
  VORDlgControl* _control;
};

#define VOR_DECLARE_DLG_NOTIFICATION(Name)                                 \
  class Name : public VORDlgNotification {                                 \
    VOR_DECLARE_CLASS(Name, VORDlgNotification)                            \
   public:                                                                 \
    explicit Name(VORDlgControl* control) : VORDlgNotification(control) {} \
  };

VOR_DECLARE_DLG_NOTIFICATION(VORDlgDiaOKNotification)
VOR_DECLARE_DLG_NOTIFICATION(VORDlgDiaCANCELNotification)
VOR_DECLARE_DLG_NOTIFICATION(VORDlgWindCloseNotification)
VOR_DECLARE_DLG_NOTIFICATION(VORDlgEditModifyNotification)
VOR_DECLARE_DLG_NOTIFICATION(VORDlgComboSelectNotification)
VOR_DECLARE_DLG_NOTIFICATION(VORDlgCheckButtonModifyNotification)
VOR_DECLARE_DLG_NOTIFICATION(VORDlgListSelectNotification)
VOR_DECLARE_DLG_NOTIFICATION(VORDlgPushItemActivateNotification)
// Sent by every control (and on the global publisher) when something a view shows changed.
VOR_DECLARE_DLG_NOTIFICATION(VORDlgChangedNotification)

struct VORDlgGridConstraints {
  int row = 0;
  int column = 0;
  int rowSpan = 1;
  int columnSpan = 1;
  int attachment = 0;
};

class VORDlgControl : public VORCommand {
  VOR_DECLARE_CLASS(VORDlgControl, VORCommand)
 public:
  // ownedByParent: a parent control takes the creator's reference (false for windows).
  VORDlgControl(VORCommand* parent, const VORString& name, int style = 0,
                bool ownedByParent = true);

  // "Dialog", "Frame", "Label", "Editor", "Combo", "CheckButton", "SelectorList",
  // "ContextualMenu", "PushItem", "Notify", "Window".
  virtual const char* GetKind() const = 0;
  int GetStyle() const { return _style; }
  VORUnicodeString GetTitle() const { return _title; }
  virtual void SetTitle(const VORUnicodeString& title);
  // The value a view shows (editor text, selected combo line, "checked" ...); empty if none.
  virtual VORUnicodeString GetValueText() const { return VORUnicodeString(); }
  // Class names of the notifications this control sends.
  virtual std::vector<std::string> GetNotificationNames() const { return {}; }

  void SetGridConstraints(int row, int column, int rowSpan, int columnSpan, int attachment);
  void SetGridConstraints(const VORDlgGridConstraints& constraints);
  const VORDlgGridConstraints& GetGridConstraints() const { return _grid; }

  void SetSensitivity(bool on);
  bool GetSensitivity() const { return _sensitive; }
  // Sensitive, and every control above it too.
  bool IsEffectivelySensitive() const;
  virtual void SetVisibility(bool on);
  bool GetVisibility() const { return _visible; }

  // The controls below this one, in creation order (not held).
  std::vector<VORDlgControl*> GetControls() const;
  // The first control of that name at any depth below this one, or null.
  VORDlgControl* FindControl(const std::string& name) const;

 protected:
  ~VORDlgControl() override;
  // Takes child out of this control: it is no longer listed, and an owned child is released.
  // False when child is not below this control.
  bool RemoveControl(VORDlgControl* child);
  // Dispatches a new notification on the publisher and releases it (takes the creator's
  // reference).
  void Send(VORDlgNotification* notification);
  void Changed();

 private:
  int _style;
  VORUnicodeString _title;
  VORDlgGridConstraints _grid;
  bool _sensitive = true;
  bool _visible = true;
  std::vector<VORCommand_var> _owned;
};

VOR_DECLARE_HANDLE(VORDlgControl);

namespace VORDlg {
// Global publisher: "VORDlgDialogCreated", "VORDlgDialogDestroyed" events and every
// VORDlgChangedNotification, so that a shell can follow the dialogs without polling.
VOREventPublisher* GetGlobalPublisher();
// One line per control, indented by depth: kind "name" title=... value=... [insensitive]
// [hidden] at row,column.
std::string Describe(const VORDlgControl* control);
}  // namespace VORDlg
