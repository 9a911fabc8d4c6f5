// The grouping command's interaction and selection rules; group creation is in
// QELFpaPertGrpActCreate.cpp.
#include "QELFpaPertGrpActCmd.h"

#include <unordered_set>

#include "QELFpaGroupingSupport.h"
#include "QELFpaViewerCmdsTrace.h"
#include "VORCSO.h"
#include "VORCommandHeader.h"
#include "VORHSO.h"
#include "VORIProduct.h"
#include "VORISPPResourceManagement.h"
#include "VORSelectionContext.h"

using namespace QELFpaGrouping;

namespace {
constexpr const char* Catalog = "QELFpaPertGrpActCmd";
constexpr int RepeatedActivityPicks = 8652800;

void Trace(const char* text) {
  QELFpaViewerCmdsTrace().TraPrint(text);
}

VORISPPActivity_var ActivityOfPath(VORPathElement* path) {
  if (path == nullptr)
    return VORISPPActivity_var();
  path->InitToLeafElement();
  return VORISPPActivity_var(path->NextFatherElement());
}

bool IsIn(const VORListValVORBaseUnknown_var& list, VORBaseUnknown* object) {
  return list.Locate(VORBaseUnknown_var(object)) != 0;
}

// The re-entry walk: from activity along neighbours (previous or next), flag set on reaching a
// member of the selection. Each activity is walked once.
void Walk(const VORBaseUnknown_var& activity, int& flag,
          const VORListValVORBaseUnknown_var& selection, bool backward,
          std::unordered_set<VORBaseUnknown*>& visited) {
  std::vector<VORBaseUnknown_var> stack{activity};
  while (!stack.empty() && flag == 0) {
    VORBaseUnknown_var p = stack.back();
    stack.pop_back();
    if (!p || !visited.insert(p->GetIdentity()).second)
      continue;
    const VORListValVORBaseUnknown_var neighbours = backward ? Previous(p) : Next(p);
    // Depth first in list order: push in reverse.
    for (int i = 1; i <= neighbours.Size(); ++i) {
      if (IsIn(selection, neighbours[i])) {
        flag = 1;
        return;
      }
    }
    for (int i = neighbours.Size(); i >= 1; --i)
      stack.push_back(neighbours[i]);
  }
}

// Members of selection with at least one neighbour outside it, in selection order.
void WithOutsideNeighbour(const VORListValVORBaseUnknown_var& selection, bool backward,
                          VORListValVORBaseUnknown_var& result) {
  for (const VORBaseUnknown_var& a : selection) {
    const VORListValVORBaseUnknown_var neighbours = backward ? Previous(a) : Next(a);
    for (const VORBaseUnknown_var& n : neighbours) {
      if (!IsIn(selection, n)) {
        result.Append(a);
        break;
      }
    }
  }
}

// Single entry (backward) / single exit: the outside neighbours of the selection are one, or
// they all lead to exactly one activity. No outside neighbour at all violates the rule.
bool SingleBoundaryViolated(const VORListValVORBaseUnknown_var& selection, bool backward) {
  VORListValVORBaseUnknown_var outside;
  for (const VORBaseUnknown_var& a : selection) {
    for (const VORBaseUnknown_var& n : backward ? Previous(a) : Next(a)) {
      if (!IsIn(selection, n))
        outside.Append(n);
    }
  }
  outside.RemoveDuplicates();
  if (outside.Size() == 1)
    return false;
  VORListValVORBaseUnknown_var joined;
  for (const VORBaseUnknown_var& o : outside)
    joined.Append(backward ? Next(o) : Previous(o));
  joined.RemoveDuplicates();
  return joined.Size() != 1;
}
}  // namespace

QELFpaPertGrpActCmd::QELFpaPertGrpActCmd() : VORStateCommand("QELFpaPertGrpActCmd", 64, 0) {
  Trace(" \n  QELFpaPertGrpActCmd::Constructor -->");
  _Dialog = VORHandle<QELFpaActivityGroupDlg>::Adopt(new QELFpaActivityGroupDlg());
  _Dialog->Build();
  _Dialog->SetVisibility(false);
  _Document = VORDocument_var(CurrentDocument());
  if (_Document && _Document->IsHubMode()) {
    _HubMode = true;
    _Adapter = VORIIPDAdapter_var(_Document);
    _DataMgt = VORIIPDDataMgt_var(_Document);
    _AttributeMgt = VORIIPDAttributeMgt_var(_Document);
  }
  Trace(" \n  QELFpaPertGrpActCmd::Constructor <--");
}

QELFpaPertGrpActCmd::~QELFpaPertGrpActCmd() {
  // The handle holds the creator's reference: releasing it destroys the dialog.
  if (_Dialog)
    _Dialog->SetVisibility(false);
}

VORString QELFpaPertGrpActCmd::GetResourceFilename(int index) const {
  if (index == 0)
    return VORString(Catalog);
  return VORStateCommand::GetResourceFilename(index - 1);
}

void QELFpaPertGrpActCmd::BuildGraph() {
  Trace(" \n  QELFpaPertGrpActCmd::BuildGraph -->");
  _OKAgent = VORDialogAgent_var::Adopt(new VORDialogAgent("OK"));
  _OKAgent->AcceptOnNotify(_Dialog.get(), VORDlgDialog::GetDiaOKNotification());
  _CancelAgent = VORDialogAgent_var::Adopt(new VORDialogAgent("Cancel"));
  _CancelAgent->AcceptOnNotify(_Dialog.get(), VORDlgDialog::GetWindCloseNotification());
  _CancelAgent->AcceptOnNotify(_Dialog.get(), VORDlgDialog::GetDiaCANCELNotification());
  _ActSel = VORPathElementAgent_var::Adopt(new VORPathElementAgent("ActSel"));
  _ActSel->SetElementType<VORISPPActivity>();
  _ActSel->AddCSOClient(this);
  _ActSel->SetBehavior(RepeatedActivityPicks);
  _ActSel->SetFilter(VORMethodFilter(this, &QELFpaPertGrpActCmd::ValidActivitiesSelection));

  VORDialogState* initial = GetInitialState("initialState");
  initial->AddDialogAgent(_ActSel);
  VORDialogState* selectOK = AddDialogState("SelectOK");
  selectOK->AddDialogAgent(_CancelAgent);
  selectOK->AddDialogAgent(_OKAgent);
  selectOK->AddDialogAgent(_ActSel);
  AddTransition(initial, selectOK, IsOutputSetCondition(_ActSel),
                Action(this, &QELFpaPertGrpActCmd::InitializeActForGroup));
  AddTransition(selectOK, selectOK, IsOutputSetCondition(_ActSel),
                Action(this, &QELFpaPertGrpActCmd::AddActivitiesToList));
  AddTransition(selectOK, nullptr, IsOutputSetCondition(_CancelAgent));
  AddTransition(selectOK, nullptr, IsOutputSetCondition(_OKAgent),
                Action(this, &QELFpaPertGrpActCmd::CreateGroup));
  SetRepeatMode(false);
}

VORISPPActivity_var QELFpaPertGrpActCmd::LastPickedActivity() const {
  VORCSO* cso = _ActSel ? _ActSel->GetCSO() : nullptr;
  if (cso == nullptr || cso->IsEmpty())
    return VORISPPActivity_var();
  return ActivityOfPath(cso->GetElement(cso->GetSize()));
}

bool QELFpaPertGrpActCmd::ValidActivitiesSelection(VORDialogAgent* agent, void*) {
  auto* pathAgent = dynamic_cast<VORPathElementAgent*>(agent);
  VORISPPActivity_var activity(ActivityOfPath(pathAgent ? pathAgent->GetValuePath() : nullptr));
  if (!activity)
    return false;
  const VORString type = activity->GetActivityType();
  return type == VORString("BIWActivityStation") || type == VORString("BIWActivityGrouping");
}

void QELFpaPertGrpActCmd::FillResourceTypes() {
  if (_HubMode) {
    const VORListValVORUnicodeString types = GetListOfValidResourcesType();
    if (types.IsEmpty())
      return;
    _Dialog->ClearResourceTypes();
    for (const VORUnicodeString& t : types)
      _Dialog->AddResourceType(t);
  } else {
    _Dialog->ClearResourceTypes();
    _Dialog->AddResourceType(VORUnicodeString("DefaultResource"));
  }
}

void QELFpaPertGrpActCmd::PresetNames() {
  _Dialog->SetActivityName(VORUnicodeString("GroupActivity"));
  if (_HasResources)
    _Dialog->SetResourceName(VORUnicodeString("GroupResource"));
}

void QELFpaPertGrpActCmd::ShowMessage(const char* key, const char* defaultText) const {
  ShowError(Catalog, key, defaultText);
}

bool QELFpaPertGrpActCmd::InitializeActForGroup(void*) {
  Trace(" \n  QELFpaPertGrpActCmd::InitializeActForGroup -->");
  VORCSO* cso = _ActSel ? _ActSel->GetCSO() : nullptr;
  if (cso == nullptr)
    return false;
  bool sameLevel = true;
  bool sameResources = true;
  if (!cso->IsEmpty()) {
    _FirstActivity = ActivityOfPath(cso->GetElement(1));
    sameResources = IsSameResourceLevel(_FirstActivity.get());
    _SelectedActivities.Append(VORBaseUnknown_var(_FirstActivity));
    _ParentActivity = FatherActivity(_FirstActivity);
    for (int i = 2; i <= cso->GetSize(); ++i) {
      VORISPPActivity_var activity = ActivityOfPath(cso->GetElement(i));
      if (!activity)
        continue;
      _SelectedActivities.Append(VORBaseUnknown_var(activity));
      if (!SameObject(FatherActivity(activity), _ParentActivity)) {
        sameLevel = false;
        break;
      }
      if (!sameResources)
        continue;
      sameResources = IsSameResourceLevel(activity);
      if (!sameResources)
        break;
      if (_HasResources)
        FillResourceTypes();
    }
  }
  _ActSel->Reset();
  if (sameLevel && sameResources) {
    if (_SelectedActivities.Size() >= 2)
      PresetNames();
    else
      _Dialog->SetOKSensitivity(false);
    _Dialog->SetVisibility(true);
    return true;
  }
  if (sameLevel)
    ShowMessage("ErrorMessage4",
                "Resources Assigned to the Activities selected are not at same level.");
  else
    ShowMessage("ErrorMessage1", "Activities selected are not at same level.");
  return false;
}

bool QELFpaPertGrpActCmd::AddActivitiesToList(void*) {
  Trace(" \n  QELFpaPertGrpActCmd::AddActivitiesToList -->");
  VORCSO* cso = _ActSel->GetCSO();
  if (cso == nullptr || cso->IsEmpty())
    return true;
  VORPathElement_var picked(cso->GetElement(cso->GetSize()));
  VORISPPActivity_var activity = ActivityOfPath(picked.get());
  if (!activity)
    return true;
  if (!_FirstActivity)
    _FirstActivity = activity;
  VORBaseUnknown_var object(activity);
  if (_SelectedActivities.Locate(object) == 0) {
    _SelectedActivities.Append(object);
  } else {
    _SelectedActivities.RemoveValue(object);
    if (VORHSO* hso = VORSelectionContext::HSO())
      hso->RemoveElement(picked.get());
    cso->RemoveElement(picked.get());
    if (_SelectedActivities.Size() < 2)
      _Dialog->SetOKSensitivity(false);
  }
  bool sameLevel = true;
  if (_SelectedActivities.Size() < 2) {
    if (!_ParentActivity)
      _ParentActivity = FatherActivity(activity);
  } else {
    PresetNames();
    _Dialog->SetOKSensitivity(true);
    sameLevel = SameObject(FatherActivity(activity), _ParentActivity);
  }
  bool sameResources = true;
  if (sameLevel) {
    sameResources = IsSameResourceLevel(activity.get());
    if (sameResources && _HasResources)
      FillResourceTypes();
  }
  _ActSel->Reset();
  if (!sameLevel) {
    ShowMessage("ErrorMessage1", "Activities selected are not at same level.");
    return false;
  }
  if (!sameResources) {
    ShowMessage("ErrorMessage4",
                "Resources Assigned to the Activities selected are not at same level.");
    return false;
  }
  return true;
}

bool QELFpaPertGrpActCmd::IsSameResourceLevel(VORISPPActivity* activity) {
  VORISPPResourceManagement_var management(activity);
  if (!management)
    return true;
  VORListValVORBaseUnknown_var* resources = nullptr;
  management->GetResources(resources, "Resource");
  if (resources == nullptr)
    return true;
  const VORListValVORBaseUnknown_var list = std::move(*resources);
  delete resources;
  for (const VORBaseUnknown_var& resource : list) {
    _HasResources = true;
    VORBaseUnknown_var father;
    if (VORIProduct_var product(resource); product) {
      if (_HubMode) {
        VORBaseUnknown_var planType = PlanTypeOf(_Document.get(), resource);
        if (planType) {
          const VORUnicodeString type = PlanTypeNameOf(_Document.get(), planType);
          if (_AssignedResourceTypes.Locate(type) == 0)
            _AssignedResourceTypes.Append(type);
        }
      }
      product->GetFatherProduct(father);
    }
    if (_ResourceParentKnown == 0) {
      _ResourceParent = father;
      _ResourceParentKnown = 1;
    }
    if (!SameObject(father, _ResourceParent))
      return false;
  }
  return true;
}

VORListValVORBaseUnknown_var QELFpaPertGrpActCmd::GetValidChildrenOfParentObject(
    VORBaseUnknown* planType) {
  return ValidChildPlanTypes(_Document.get(), planType);
}

VORListValVORUnicodeString QELFpaPertGrpActCmd::GetListOfValidResourcesType() {
  VORListValVORUnicodeString result;
  VORBaseUnknown_var parentType =
      FindPlanType(_Document.get(), ResourcePlanTypeName(_ResourceParent));
  const VORListValVORBaseUnknown_var candidates = GetValidChildrenOfParentObject(parentType);
  const int assigned = _AssignedResourceTypes.Size();
  for (const VORBaseUnknown_var& candidate : candidates) {
    const VORUnicodeString name = PlanTypeAttribute(_Document.get(), candidate, "name");
    VORListValVORUnicodeString allowed;
    for (const VORBaseUnknown_var& g : GetValidChildrenOfParentObject(candidate))
      allowed.Append(PlanTypeAttribute(_Document.get(), g, "name"));
    int count = 0;
    for (const VORUnicodeString& type : _AssignedResourceTypes) {
      if (allowed.Locate(type) != 0)
        ++count;
    }
    if (count == assigned && result.Locate(name) == 0)
      result.Append(name);
  }
  return result;
}

void QELFpaPertGrpActCmd::GetListActsWithprevActNotSelected(
    VORListValVORBaseUnknown_var& activities) {
  WithOutsideNeighbour(_SelectedActivities, true, activities);
}

void QELFpaPertGrpActCmd::GetListActsWithNextActNotSelected(
    VORListValVORBaseUnknown_var& activities) {
  WithOutsideNeighbour(_SelectedActivities, false, activities);
}

void QELFpaPertGrpActCmd::ChkBackwardInValidCases(const VORBaseUnknown_var& activity, int& flag) {
  if (flag != 0 || !activity || _SelectedActivities.IsEmpty())
    return;
  std::unordered_set<VORBaseUnknown*> visited;
  Walk(activity, flag, _SelectedActivities, true, visited);
}

void QELFpaPertGrpActCmd::ChkForwardInValidCases(const VORBaseUnknown_var& activity, int& flag) {
  if (flag != 0 || !activity || _SelectedActivities.IsEmpty())
    return;
  std::unordered_set<VORBaseUnknown*> visited;
  Walk(activity, flag, _SelectedActivities, false, visited);
}

bool QELFpaPertGrpActCmd::IsRuleOneViolated() {
  return SingleBoundaryViolated(_SelectedActivities, true);
}

bool QELFpaPertGrpActCmd::IsRuleTwoViolated() {
  return SingleBoundaryViolated(_SelectedActivities, false);
}

bool QELFpaPertGrpActCmd::ValidateSelection() {
  Trace(" \n  QELFpaPertGrpActCmd:: ValidateSelection");
  int reentry = 0;
  VORListValVORBaseUnknown_var entering;
  GetListActsWithprevActNotSelected(entering);
  for (const VORBaseUnknown_var& a : entering) {
    for (const VORBaseUnknown_var& p : Previous(a)) {
      if (!IsIn(_SelectedActivities, p))
        ChkBackwardInValidCases(p, reentry);
    }
  }
  if (reentry == 0) {
    VORListValVORBaseUnknown_var leaving;
    GetListActsWithNextActNotSelected(leaving);
    for (const VORBaseUnknown_var& a : leaving) {
      for (const VORBaseUnknown_var& n : Next(a)) {
        if (!IsIn(_SelectedActivities, n))
          ChkForwardInValidCases(n, reentry);
      }
    }
  }
  if (reentry == 0 && !IsRuleOneViolated() && !IsRuleTwoViolated())
    return true;
  ShowMessage("ErrorMessage2", "Improper selection of activities for grouping");
  return false;
}

VOR_EXPORT_COMMAND_FACTORY_NOARG(QELFpaPertGrpActCmd)
