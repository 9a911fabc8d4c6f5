// Dissolves a picked grouping activity: its activities are copied back onto its level and
// linked to its outside neighbours by position (the first activities to its predecessors, the
// last ones to its successors), the resources under its grouping resource go back to that
// resource's father, the grouping resource disappears and the group is cut. One undoable
// change; in hub mode refused when a returned resource's plant type is not allowed there.
#pragma once

#include "VORLists.h"
#include "VORPathElementAgent.h"
#include "VORStateCommand.h"

class QELFpaPertUngroupActCmd : public VORStateCommand {
  VOR_DECLARE_CLASS(QELFpaPertUngroupActCmd, VORStateCommand)
 public:
  QELFpaPertUngroupActCmd();

  void BuildGraph() override;
  VORString GetResourceFilename(int index = 0) const override;

  bool ValidActivitiesSelection(VORDialogAgent* agent, void* data);
  bool UngroupActivity(void* data);
  bool IsValidQ9PTSRules(const VORBaseUnknown_var& group);
  // Names of the plan types allowed below planType.
  VORListValVORUnicodeString GetValidChildrenOfParentObject(VORBaseUnknown* planType);
  void GetCSOElements(VORListValVORBaseUnknown_var& activities);
  void MakeLinks(const VORBaseUnknown_var& group, const VORListValVORBaseUnknown_var& copies);
  static void ChkIfActAlreadyHasPrevLinks(VORListValVORBaseUnknown_var& activities);
  static void ChkIfActAlreadyHasNextLinks(VORListValVORBaseUnknown_var& activities);
  void ReallocateGroupResourceFromActivity(const VORBaseUnknown_var& group);

 protected:
  ~QELFpaPertUngroupActCmd() override;

 private:
  VORPathElementAgent_var _ActSel;
};
