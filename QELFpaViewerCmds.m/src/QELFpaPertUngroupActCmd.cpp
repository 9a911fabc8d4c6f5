#include "QELFpaPertUngroupActCmd.h"

#include <algorithm>

#include "QELFpaGroupingSupport.h"
#include "QELFpaViewerCmdsTrace.h"
#include "QELIZitBltMgr.h"
#include "VORAssert.h"
#include "VORCCP_Actor.h"
#include "VORCSO.h"
#include "VORCommandHeader.h"
#include "VORIDocInit.h"
#include "VORIIPDAdapter.h"
#include "VORIIPDDataMgt.h"
#include "VORIProduct.h"
#include "VORISPPActivity.h"
#include "VORISPPFlowMgt.h"
#include "VORISPPProcessContainer.h"
#include "VORISPPResourceManagement.h"
#include "VORSPPReparentService.h"
#include "VORUndoHistory.h"

using namespace QELFpaGrouping;

namespace {
constexpr const char* Catalog = "QELFpaPertUngroupActCmd";

void Trace(const char* text) {
  QELFpaViewerCmdsTrace().TraPrint(text);
}

VORBaseUnknown_var ProcessContainerOf(VORDocument* document) {
  VORIDocInit_var DocInit(document);
  VOR_ASSERT_AT(NULL_var != DocInit, "QELFpaViewerCmds.m/src/QELFpaPertUngroupActCmd", 1);
  VORBaseUnknown_var container;
  DocInit->GetRootContainer(container);
  VORISPPProcessContainer_var processes(container);
  return processes ? VORBaseUnknown_var(processes) : VORBaseUnknown_var();
}

// The neighbours of the group, once each, without the group.
VORListValVORBaseUnknown_var Outside(VORListValVORBaseUnknown_var list, VORBaseUnknown* group) {
  list.RemoveDuplicates();
  list.RemoveValue(VORBaseUnknown_var(group));
  return list;
}

void Link(VORBaseUnknown* from, VORBaseUnknown* to) {
  if (VORISPPFlowMgt_var flows(from); flows)
    flows->AddNextActivity(to);
}

// Pairs from[i] -> to[i]; extra members of from go to the last of to, extra members of to come
// from the last of from. Nothing when either list is empty.
void PairByPosition(const VORListValVORBaseUnknown_var& from,
                    const VORListValVORBaseUnknown_var& to) {
  if (from.IsEmpty() || to.IsEmpty())
    return;
  const int common = std::min(from.Size(), to.Size());
  for (int i = 1; i <= common; ++i)
    Link(from[i], to[i]);
  for (int i = common + 1; i <= from.Size(); ++i)
    Link(from[i], to[to.Size()]);
  for (int i = common + 1; i <= to.Size(); ++i)
    Link(from[from.Size()], to[i]);
}
}  // namespace

QELFpaPertUngroupActCmd::QELFpaPertUngroupActCmd()
    : VORStateCommand("QELFpaPertUngroupActCmd", 64, 0) {}

QELFpaPertUngroupActCmd::~QELFpaPertUngroupActCmd() = default;

VORString QELFpaPertUngroupActCmd::GetResourceFilename(int index) const {
  if (index == 0)
    return VORString(Catalog);
  return VORStateCommand::GetResourceFilename(index - 1);
}

void QELFpaPertUngroupActCmd::BuildGraph() {
  Trace(" \n  QELFpaPertUngroupActCmd::BuildGraph -->");
  _ActSel = VORPathElementAgent_var::Adopt(new VORPathElementAgent("ActSel"));
  _ActSel->SetElementType<VORISPPActivity>();
  _ActSel->SetBehavior(VORAgentBehavior::SinglePick);
  _ActSel->SetFilter(VORMethodFilter(this, &QELFpaPertUngroupActCmd::ValidActivitiesSelection));
  VORDialogState* initial = GetInitialState("initialState");
  initial->AddDialogAgent(_ActSel);
  AddTransition(initial, nullptr, IsOutputSetCondition(_ActSel),
                Action(this, &QELFpaPertUngroupActCmd::UngroupActivity));
  SetRepeatMode(false);
}

bool QELFpaPertUngroupActCmd::ValidActivitiesSelection(VORDialogAgent* agent, void*) {
  VORISPPActivity_var activity(agent ? agent->GetValue() : VORBaseUnknown_var());
  return activity && activity->GetActivityType() == VORString("BIWActivityGrouping");
}

bool QELFpaPertUngroupActCmd::UngroupActivity(void*) {
  Trace(" \n  QELFpaPertUngroupActCmd::UngroupActivity -->");
  const VORBaseUnknown_var group = _ActSel->GetValue();
  VORDocument* document = CurrentDocument();
  if (document != nullptr && document->IsHubMode() && !IsValidQ9PTSRules(group)) {
    ShowError(Catalog, "ErrorMessage1", "Assigned resources are violating PTS");
    return false;
  }
  const VORListValVORBaseUnknown_var children = Children(group);
  const VORBaseUnknown_var father = FatherActivity(group);
  if (children.IsEmpty() || !father)
    return false;

  auto* process = dynamic_cast<VORProcess*>(document);
  VORUndoHistory* history = process ? &process->GetUndoHistory() : nullptr;
  if (history != nullptr)
    history->Begin("Ungroup Activity");
  VORListValVORBaseUnknown_var activities;
  for (const VORBaseUnknown_var& child : children) {
    if (VORISPPActivity_var(child))
      activities.Append(child);
  }
  FillCSO(activities);
  bool pasted = false;
  auto actor = VORCCP_Actor_var::Adopt(new VORCCP_Actor());
  if (actor->Initialize()) {
    actor->SetType(VORCCP_Actor::CopyType);
    actor->ReadCSO();
    if (actor->CanCopy())
      actor->Copy();
    actor->SetType(VORCCP_Actor::PasteIntoType);
    VORListValVORBaseUnknown_var targets;
    targets.Append(father);
    if (actor->CanPaste(targets))
      pasted = actor->Paste(targets);
  }
  VORListValVORBaseUnknown_var copies;
  GetCSOElements(copies);
  MakeLinks(group, copies);
  VORListValVORBaseUnknown_var groupOnly;
  groupOnly.Append(group);
  FillCSO(groupOnly);
  if (pasted && actor->Initialize()) {
    actor->SetType(VORCCP_Actor::CopyType);
    actor->ReadCSO();
    if (actor->CanCut()) {
      if (QELIZitBltMgr_var manager{group}; manager)
        manager->RemoveZitBlts();
      ReallocateGroupResourceFromActivity(group);
      actor->Cut();
    }
  }
  VORCCP_Actor::CloseClipboard();
  if (VORCSO* cso = CurrentCSO(); cso != nullptr)
    cso->Empty();
  if (history != nullptr)
    history->End();
  Trace(" \n  QELFpaPertUngroupActCmd::UngroupActivity <--");
  return true;
}

void QELFpaPertUngroupActCmd::GetCSOElements(VORListValVORBaseUnknown_var& activities) {
  for (const VORBaseUnknown_var& leaf : CSOLeaves()) {
    if (VORISPPActivity_var(leaf))
      activities.Append(leaf);
  }
}

void QELFpaPertUngroupActCmd::ChkIfActAlreadyHasPrevLinks(
    VORListValVORBaseUnknown_var& activities) {
  for (int i = activities.Size(); i >= 1; --i) {
    if (!Previous(activities[i]).IsEmpty())
      activities.RemovePosition(i);
  }
}

void QELFpaPertUngroupActCmd::ChkIfActAlreadyHasNextLinks(
    VORListValVORBaseUnknown_var& activities) {
  for (int i = activities.Size(); i >= 1; --i) {
    if (!Next(activities[i]).IsEmpty())
      activities.RemovePosition(i);
  }
}

void QELFpaPertUngroupActCmd::MakeLinks(const VORBaseUnknown_var& group,
                                        const VORListValVORBaseUnknown_var& copies) {
  const VORListValVORBaseUnknown_var previous = Outside(Previous(group), group);
  const VORListValVORBaseUnknown_var next = Outside(Next(group), group);
  if (copies.IsEmpty() || previous.IsEmpty() || next.IsEmpty())
    return;
  VORListValVORBaseUnknown_var first = copies;
  ChkIfActAlreadyHasPrevLinks(first);
  VORListValVORBaseUnknown_var last = copies;
  ChkIfActAlreadyHasNextLinks(last);
  PairByPosition(previous, first);
  PairByPosition(last, next);
  VORISPPFlowMgt_var groupFlows(group);
  if (!groupFlows)
    return;
  for (const VORBaseUnknown_var& p : previous)
    groupFlows->RemoveLink(p);
  for (const VORBaseUnknown_var& n : next)
    groupFlows->RemoveLink(n);
}

VORListValVORUnicodeString QELFpaPertUngroupActCmd::GetValidChildrenOfParentObject(
    VORBaseUnknown* planType) {
  VORListValVORUnicodeString names;
  VORDocument* document = CurrentDocument();
  for (const VORBaseUnknown_var& child : ValidChildPlanTypes(document, planType))
    names.Append(PlanTypeAttribute(document, child, "name"));
  return names;
}

bool QELFpaPertUngroupActCmd::IsValidQ9PTSRules(const VORBaseUnknown_var& group) {
  if (!VORISPPResourceManagement_var(group))
    return true;
  const VORListValVORBaseUnknown_var resources = Resources(group);
  if (resources.Size() != 1)
    return true;
  const VORListValVORBaseUnknown_var children = ChildProducts(resources[1]);
  if (children.IsEmpty())
    return true;
  VORDocument* document = CurrentDocument();
  ProcessContainerOf(document);
  const VORBaseUnknown_var parentType =
      VORBaseUnknown_var(FindPlanType(document, ResourcePlanTypeName(FatherProduct(resources[1]))));
  const VORListValVORUnicodeString valid = GetValidChildrenOfParentObject(parentType);
  for (const VORBaseUnknown_var& child : children) {
    const VORUnicodeString type = PlanTypeNameOf(document, PlanTypeOf(document, child));
    if (valid.Locate(type) == 0)
      return false;
  }
  return true;
}

void QELFpaPertUngroupActCmd::ReallocateGroupResourceFromActivity(const VORBaseUnknown_var& group) {
  const VORListValVORBaseUnknown_var resources = Resources(group);
  if (resources.Size() != 1)
    return;
  const VORBaseUnknown_var resource = resources[1];
  const VORListValVORBaseUnknown_var children = ChildProducts(resource);
  if (children.IsEmpty())
    return;
  VORDocument* document = CurrentDocument();
  const VORBaseUnknown_var processContainer = ProcessContainerOf(document);
  const VORBaseUnknown_var father = FatherProduct(resource);
  VORListValVORBaseUnknown_var* path = VORSPPReparentService::GetPathOf(father);
  for (const VORBaseUnknown_var& child : children)
    VORSPPReparentService::ReparentResource(child, father, path, processContainer);
  delete path;
  VORIIPDAdapter_var adapter(document);
  VORIIPDDataMgt_var dataMgt(document);
  if (adapter && dataMgt) {
    VORBaseUnknown_var hubObject;
    if (dataMgt->GetHubObject(resource, hubObject, false) == S_OK && hubObject)
      adapter->DeleteHubObject(hubObject);
  }
  if (VORISPPProcessContainer_var container(processContainer); container)
    container->RemoveResource(resource);
  if (VORIProduct_var fatherProduct(father); fatherProduct)
    fatherProduct->RemoveChild(resource);
}

VOR_EXPORT_COMMAND_FACTORY_NOARG(QELFpaPertUngroupActCmd)
