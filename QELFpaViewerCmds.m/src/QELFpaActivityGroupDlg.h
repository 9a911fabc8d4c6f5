// The grouping dialog: the new grouping activity's name, its grouping resource's name and plant
// type, the activity type and where the group's cycle time comes from. OK is sensitive while
// the activity name is not empty (the grouping command also sets it; the last one wins).
#pragma once

#include "VORDlgCombo.h"
#include "VORDlgDialog.h"
#include "VORDlgEditor.h"

class QELFpaActivityGroupDlg : public VORDlgDialog {
  VOR_DECLARE_CLASS(QELFpaActivityGroupDlg, VORDlgDialog)
 public:
  // Created hidden, child of the application's main window.
  QELFpaActivityGroupDlg();

  void Build() override;

  void SetActivityName(const VORUnicodeString& name);
  void SetResourceName(const VORUnicodeString& name);
  void ClearResourceTypes();
  void AddResourceType(const VORUnicodeString& type);
  // Empty when the control is missing (or the combo empty).
  VORUnicodeString GetActivityName() const;
  VORUnicodeString GetResourceName() const;
  VORUnicodeString GetResourceType() const;
  VORUnicodeString GetActivityType() const;
  VORUnicodeString GetCycleTimeSource() const;

 protected:
  ~QELFpaActivityGroupDlg() override;

 private:
  void ActivityNameModified();

  VORDlgEditor* _activityName = nullptr;
  VORDlgEditor* _resourceName = nullptr;
  VORDlgCombo* _resourceType = nullptr;
  VORDlgCombo* _activityType = nullptr;
  VORDlgCombo* _cycleTime = nullptr;
};
