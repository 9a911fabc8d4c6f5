// The Properties dialog: the picked object's name, type, times, product inputs, product outputs
// and resources, read-only, one line per field. One is shown at a time; OK or closing the window
// hides it and releases it through deferred destruction. Started by the host command
// "Properties" (VORFrmHostCommands::Properties), which the viewers offer in their contextual menu.
#pragma once

#include <string>
#include <utility>
#include <vector>

#include "VORDlgDialog.h"

class VORFrmPropertiesDlg : public VORDlgDialog {
  VOR_DECLARE_CLASS(VORFrmPropertiesDlg, VORDlgDialog)
 public:
  // Shows the properties of object, replacing the dialog shown before. Null (nothing shown)
  // when object is null.
  static VORFrmPropertiesDlg* Show(VORBaseUnknown* object);
  // The dialog shown now, or null.
  static VORFrmPropertiesDlg* Current();

  // The fields in the order shown: "Name", "Type", "Time", "Cycle time", "Inputs", "Outputs",
  // "Resources" with their text ("" when the object has no such property).
  const std::vector<std::pair<std::string, std::string>>& GetFields() const { return _fields; }
  VORBaseUnknown* GetObject() const { return _object.get(); }

  void Build() override;

 protected:
  ~VORFrmPropertiesDlg() override;

 private:
  explicit VORFrmPropertiesDlg(VORBaseUnknown* object);
  void Close();

  VORBaseUnknown_var _object;
  std::vector<std::pair<std::string, std::string>> _fields;
};
