// Groups picked station and grouping activities of one chart level into one new grouping
// activity with its own grouping resource. Picks toggle; the dialog collects the names, the
// resource type and the cycle-time source; OK checks the selection (same level, same resource
// level, single entry, single exit, no path leaving and re-entering the selection) and builds
// the group as one undoable change through the model.
#pragma once

#include "QELFpaActivityGroupDlg.h"
#include "VORDocument.h"
#include "VORIIPDAdapter.h"
#include "VORIIPDAttributeMgt.h"
#include "VORIIPDDataMgt.h"
#include "VORISPPActivity.h"
#include "VORPathElementAgent.h"
#include "VORStateCommand.h"

class QELFpaPertGrpActCmd : public VORStateCommand {
  VOR_DECLARE_CLASS(QELFpaPertGrpActCmd, VORStateCommand)
 public:
  QELFpaPertGrpActCmd();

  void BuildGraph() override;
  VORString GetResourceFilename(int index = 0) const override;

  // Selection rules.
  bool ValidActivitiesSelection(VORDialogAgent* agent, void* data);
  virtual bool InitializeActForGroup(void* data);
  bool AddActivitiesToList(void* data);
  bool IsSameResourceLevel(VORISPPActivity* activity);
  VORListValVORUnicodeString GetListOfValidResourcesType();
  VORListValVORBaseUnknown_var GetValidChildrenOfParentObject(VORBaseUnknown* planType);
  bool ValidateSelection();
  void GetListActsWithprevActNotSelected(VORListValVORBaseUnknown_var& activities);
  void GetListActsWithNextActNotSelected(VORListValVORBaseUnknown_var& activities);
  // Re-entry walks from an outside neighbour: flag set when the walk meets the selection again.
  // A visited set keeps a cycle outside the selection from looping.
  void ChkBackwardInValidCases(const VORBaseUnknown_var& activity, int& flag);
  void ChkForwardInValidCases(const VORBaseUnknown_var& activity, int& flag);
  bool IsRuleOneViolated();
  bool IsRuleTwoViolated();

  // Group creation.
  bool CreateGroup(void* data);
  static VORString GetActivityTypeToCreate(const VORUnicodeString& text);
  void CopyList(const VORListValVORBaseUnknown_var& selection, const VORBaseUnknown_var& group);
  void GetCSOElements(VORListValVORBaseUnknown_var& activities);
  void MakeLinks(const VORBaseUnknown_var& group, const VORListValVORBaseUnknown_var& copies);
  void RemoveFlows(const VORBaseUnknown_var& group, const VORListValVORBaseUnknown_var& selection);
  void GetListActAfterStartAndBeforeStop(const VORListValVORBaseUnknown_var& activities,
                                         VORListValVORBaseUnknown_var& first,
                                         VORListValVORBaseUnknown_var& last);
  void CreateOneResource(const VORBaseUnknown_var& product);
  // snap(v) = trunc(v / 25) * 25 + 12.5: the chart grid.
  static double Snap(double v);

  const VORListValVORBaseUnknown_var& GetSelectedActivities() const { return _SelectedActivities; }
  QELFpaActivityGroupDlg* GetDialog() const { return _Dialog.get(); }

 protected:
  ~QELFpaPertGrpActCmd() override;

 private:
  // The activity behind the last element of the agent's selection, or null.
  VORISPPActivity_var LastPickedActivity() const;
  void FillResourceTypes();
  void PresetNames();
  void ShowMessage(const char* key, const char* defaultText) const;

  VORHandle<QELFpaActivityGroupDlg> _Dialog;
  VORDialogAgent_var _OKAgent;
  VORDialogAgent_var _CancelAgent;
  VORPathElementAgent_var _ActSel;
  VORISPPActivity_var _FirstActivity;
  VORBaseUnknown_var _ParentActivity;
  VORListValVORBaseUnknown_var _SelectedActivities;
  VORBaseUnknown_var _ResourceParent;
  int _ResourceParentKnown = 0;
  VORListValVORUnicodeString _AssignedResourceTypes;
  VORDocument_var _Document;
  bool _HubMode = false;
  bool _HasResources = false;
  VORIIPDAdapter_var _Adapter;
  VORIIPDDataMgt_var _DataMgt;
  VORIIPDAttributeMgt_var _AttributeMgt;
};
