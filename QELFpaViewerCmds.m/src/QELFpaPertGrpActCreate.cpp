// Group creation of the grouping command: the new grouping activity after the anchor, copies of
// the selected activities inside it with Start and Stop, the outside flows re-linked to it, its
// place, cycle time and grouping resource, then the sources cut. The whole of it is one step of
// the document's undo history; the chart follows through model notifications.
#include <algorithm>
#include <cmath>
#include <cstdint>
#include <string>

#include "QELFpaGroupingSupport.h"
#include "QELFpaPertGrpActCmd.h"
#include "QELFpaViewerCmdsTrace.h"
#include "QELIBIWActivityStation.h"
#include "QELIZitBltMgr.h"
#include "QELProcessGroupUtils.h"
#include "VORAssert.h"
#include "VORCCP_Actor.h"
#include "VORCSO.h"
#include "VORIDocInit.h"
#include "VORIGENode.h"
#include "VORIGraphNodeLayout.h"
#include "VORIModelEvents.h"
#include "VORIPDServices.h"
#include "VORIProduct.h"
#include "VORIResource.h"
#include "VORIResourceFactory.h"
#include "VORISPPAbstractActivity.h"
#include "VORISPPChildManagement.h"
#include "VORISPPFlowMgt.h"
#include "VORISPPProcessContainer.h"
#include "VORISPPResourceManagement.h"
#include "VORPrdMultiImportNotif.h"
#include "VORSPPGroupingServices.h"
#include "VORSPPLinkServices.h"
#include "VORSPPReparentService.h"
#include "VORUndoHistory.h"

using namespace QELFpaGrouping;

namespace {
constexpr double GridCell = 25.0;
constexpr double GridOffset = 12.5;

void Trace(const char* text) {
  QELFpaViewerCmdsTrace().TraPrint(text);
}

bool IsIn(const VORListValVORBaseUnknown_var& list, VORBaseUnknown* object) {
  return list.Locate(VORBaseUnknown_var(object)) != 0;
}

// Links from -> to when no such link exists yet.
void LinkIfFree(VORBaseUnknown* from, VORBaseUnknown* to) {
  if (VORSPPLinkServices::AreAllreadyLinked(from, to) != 1)
    return;
  if (VORISPPFlowMgt_var flows(from); flows)
    flows->AddNextActivity(to);
}

void Unlink(VORBaseUnknown* a, VORBaseUnknown* b) {
  if (VORISPPFlowMgt_var flows(a); flows)
    flows->RemoveLink(b);
}

bool PositionOf(VORBaseUnknown* node, double& x, double& y) {
  VORIGraphNodeLayout_var layout(node);
  if (!layout || !layout->HasPertPosition())
    return false;
  layout->GetPertPosition(x, y);
  return true;
}

void SetPosition(VORBaseUnknown* node, double x, double y) {
  if (VORIGraphNodeLayout_var layout(node); layout)
    layout->SetPertPosition(x, y);
}

VORUnicodeString NodeName(VORBaseUnknown* node) {
  VORUnicodeString name;
  if (VORIGENode_var n(node); n)
    n->GetLabel(name);
  return name;
}

bool NameContains(const VORUnicodeString& name, const char* part) {
  return name.ConvertToUTF8().find(part) != std::string::npos;
}

// The resource class handed to the factory for a plan type's "compclass".
VORUnicodeString ResourceClassOf(const VORUnicodeString& compclass) {
  static const std::pair<const char*, const char*> table[] = {
      {"lumocompplantbuffer", "Buffer"},
      {"lumocompplantinterlacedtransport", "InterlacedTransport"},
      {"lumocomporgplant", "OrgResource"},
      {"lumocompplantstation", "Station"},
      {"lumocompplantdefault", "Resource"},
      {"lumocompplanttransport", "Transport"},
      {"lumocompplanttransporttool", "TransportTool"},
      {"lumocompplantworker", "Worker"},
  };
  const std::string value = compclass.ConvertToUTF8();
  for (const auto& [key, resourceClass] : table) {
    if (value == key)
      return VORUnicodeString(resourceClass);
  }
  return compclass;
}

VORBaseUnknown_var ProcessContainerOf(VORDocument* document) {
  VORIDocInit_var init(document);
  VORBaseUnknown_var container;
  if (init)
    init->GetRootContainer(container);
  VORISPPProcessContainer_var processes(container);
  return processes ? VORBaseUnknown_var(processes) : VORBaseUnknown_var();
}
}  // namespace

double QELFpaPertGrpActCmd::Snap(double v) {
  return static_cast<double>(static_cast<std::int32_t>(v / GridCell)) * GridCell + GridOffset;
}

VORString QELFpaPertGrpActCmd::GetActivityTypeToCreate(const VORUnicodeString& text) {
  return text == VORUnicodeString("Grouping Activity") ? VORString("BIWActivityGrouping")
                                                       : VORString("");
}

bool QELFpaPertGrpActCmd::CreateGroup(void*) {
  Trace(" \n  QELFpaPertGrpActCmd::CreateGroup -->");
  const VORUnicodeString resourceType = _Dialog->GetResourceType();
  if (_HubMode && resourceType.IsEmpty() && _HasResources) {
    ShowMessage("ErrorMessage5",
                "new Q9 resource type is not possible for this selection (Violation of PTS Rules)");
    return false;
  }
  if (_SelectedActivities.Size() < 2 || !ValidateSelection())
    return true;

  VORBaseUnknown_var entry;
  for (const VORBaseUnknown_var& a : _SelectedActivities) {
    entry = a;
    bool selectedBefore = false;
    for (const VORBaseUnknown_var& p : Previous(a))
      selectedBefore = selectedBefore || IsIn(_SelectedActivities, p);
    if (!selectedBefore)
      break;
  }
  const VORListValVORBaseUnknown_var entryPrevious = Previous(entry);
  if (entryPrevious.IsEmpty()) {
    ShowMessage("ErrorMessage3", "Selected Activities not linked properly.");
    return true;
  }
  const VORBaseUnknown_var anchor = entryPrevious[1];

  auto* process = dynamic_cast<VORProcess*>(_Document.get());
  VORUndoHistory* history = process ? &process->GetUndoHistory() : nullptr;
  if (history != nullptr)
    history->Begin("Group Activities");
  const VORListValVORBaseUnknown_var selection = _SelectedActivities;
  VORBaseUnknown_var group = QELProcessGroupUtils::CreateAfterOperation(
      anchor, GetActivityTypeToCreate(_Dialog->GetActivityType()), selection);
  if (group) {
    double sumX = 0;
    double sumY = 0;
    for (const VORBaseUnknown_var& a : selection) {
      double x = 0;
      double y = 0;
      if (PositionOf(a, x, y)) {
        sumX += x;
        sumY += y;
      }
    }
    const double count = selection.Size();
    SetPosition(group, Snap(sumX / count), Snap(sumY / count));
    CopyList(selection, group);
    VORISPPAbstractActivity_var abstract(group);
    if (abstract)
      abstract->SetLabel(_Dialog->GetActivityName());

    VORISPPChildManagement_var children(group);
    VORListValVORBaseUnknown_var* list = nullptr;
    if (children && SUCCEEDED(children->GetChildren(list)) && list != nullptr && abstract) {
      double time = 0;
      if (_Dialog->GetCycleTimeSource() == VORUnicodeString("parent")) {
        if (VORISPPAbstractActivity_var father(FatherActivity(group)); father)
          father->GetActivityTime(time);
      } else {
        for (const VORBaseUnknown_var& child : *list) {
          double t = 0;
          if (QELIBIWActivityStation_var station(child); station)
            station->GetStationCycleTime(t);
          else if (VORISPPAbstractActivity_var activity(child); activity)
            activity->GetActivityTime(t);
          time = std::max(time, t);
        }
      }
      abstract->SetActivityTime(time);
    }
    delete list;

    VORBaseUnknown_var groupResource;
    if (_HasResources) {
      bool first = true;
      VORListValVORBaseUnknown_var* path = nullptr;
      VORBaseUnknown_var processContainer;
      for (const VORBaseUnknown_var& child : Children(group)) {
        for (const VORBaseUnknown_var& resource : Resources(child)) {
          if (first) {
            first = false;
            VORBaseUnknown_var father = FatherProduct(resource);
            if (VORIProduct_var f(father); f)
              f->AddChild(_Dialog->GetResourceName(), groupResource);
            processContainer = ProcessContainerOf(_Document.get());
            if (groupResource)
              path = VORSPPReparentService::GetPathOf(groupResource);
            if (_ResourceParent && groupResource) {
              VORIModelEvents_var events(_ResourceParent);
              if (VORIProduct_var(_ResourceParent) && events) {
                // The product tree shows the new grouping resource.
                VORListValVORBaseUnknown_var added;
                added.Append(groupResource);
                auto notification =
                    VORHandle<VORPrdMultiImportNotif>::Adopt(new VORPrdMultiImportNotif(added));
                events->Dispatch(notification.get());
              }
              CreateOneResource(groupResource);
            }
          }
          if (resource && groupResource)
            VORSPPReparentService::ReparentResource(resource, groupResource, path,
                                                    processContainer);
        }
      }
      delete path;
    }
    if (VORISPPResourceManagement_var management(group); management && _HasResources)
      management->AssignResource(groupResource);
  }
  if (history != nullptr)
    history->End();
  Trace(" \n  QELFpaPertGrpActCmd::CreateGroup <--");
  return true;
}

void QELFpaPertGrpActCmd::CopyList(const VORListValVORBaseUnknown_var& selection,
                                   const VORBaseUnknown_var& group) {
  FillCSO(selection);
  auto actor = VORCCP_Actor_var::Adopt(new VORCCP_Actor());
  if (actor->Initialize()) {
    actor->SetType(VORCCP_Actor::CopyType);
    actor->ReadCSO();
    if (actor->CanCopy())
      actor->Copy();
    actor->SetType(VORCCP_Actor::PasteIntoType);
    VORPathElement_var pPath = VORMakePath(group);
    VOR_ASSERT_AT(pPath != NULL_var, "QELFpaViewerCmds.m/src/QELFpaPertGrpActCmd", 1);
    VORListValVORBaseUnknown_var targets;
    targets.Append(VORBaseUnknown_var(pPath));
    if (actor->CanPaste(targets))
      actor->Paste(targets);
  }
  VORListValVORBaseUnknown_var copies;
  GetCSOElements(copies);
  MakeLinks(group, copies);
  RemoveFlows(group, selection);

  if (VORCSO* cso = CurrentCSO(); cso != nullptr) {
    cso->Empty();
    for (const VORBaseUnknown_var& source : selection) {
      if (QELIZitBltMgr_var manager{VORBaseUnknown_var(source)}; manager)
        manager->RemoveZitBlts();
      cso->AddElement(source);
    }
  }
  if (actor->Initialize()) {
    actor->SetType(VORCCP_Actor::CopyType);
    actor->ReadCSO();
    if (actor->CanCut())
      actor->Cut();
  }
  VORCCP_Actor::CloseClipboard();
  VORCCP_Actor::OpenClipboard();
  VORCCP_Actor::CloseClipboard();
}

void QELFpaPertGrpActCmd::GetCSOElements(VORListValVORBaseUnknown_var& activities) {
  for (const VORBaseUnknown_var& leaf : CSOLeaves()) {
    if (VORISPPActivity_var(leaf))
      activities.Append(leaf);
  }
}

void QELFpaPertGrpActCmd::GetListActAfterStartAndBeforeStop(
    const VORListValVORBaseUnknown_var& activities, VORListValVORBaseUnknown_var& first,
    VORListValVORBaseUnknown_var& last) {
  for (const VORBaseUnknown_var& a : activities) {
    if (Previous(a).IsEmpty())
      first.Append(a);
    if (Next(a).IsEmpty())
      last.Append(a);
  }
}

void QELFpaPertGrpActCmd::MakeLinks(const VORBaseUnknown_var& group,
                                    const VORListValVORBaseUnknown_var& copies) {
  const VORListValVORBaseUnknown_var children = Children(group);
  double minX = 0;
  double maxX = 0;
  double sumY = 0;
  bool anyPosition = false;
  VORBaseUnknown_var start;
  VORBaseUnknown_var stop;
  for (const VORBaseUnknown_var& child : children) {
    double x = 0;
    double y = 0;
    if (PositionOf(child, x, y)) {
      minX = anyPosition ? std::min(minX, x) : x;
      maxX = anyPosition ? std::max(maxX, x) : x;
      anyPosition = true;
      sumY += y;
    }
    if (!VORISPPActivity_var(child)) {
      const VORUnicodeString name = NodeName(child);
      if (NameContains(name, "Start"))
        start = child;
      else if (NameContains(name, "Stop"))
        stop = child;
    }
  }
  const double y = children.IsEmpty() ? GridOffset : Snap(sumY / children.Size());
  if (start)
    SetPosition(start, minX - GridCell, y);
  if (stop)
    SetPosition(stop, maxX + GridCell, y);
  VORListValVORBaseUnknown_var first;
  VORListValVORBaseUnknown_var last;
  GetListActAfterStartAndBeforeStop(copies, first, last);
  if (start) {
    for (const VORBaseUnknown_var& a : first)
      LinkIfFree(start, a);
  }
  if (stop) {
    for (const VORBaseUnknown_var& a : last)
      LinkIfFree(a, stop);
  }
}

void QELFpaPertGrpActCmd::RemoveFlows(const VORBaseUnknown_var& group,
                                      const VORListValVORBaseUnknown_var& selection) {
  for (const VORBaseUnknown_var& a : selection) {
    const VORListValVORBaseUnknown_var previous = Previous(a);
    if (previous.IsEmpty())
      return;
    for (const VORBaseUnknown_var& p : previous) {
      if (IsIn(selection, p) || SameObject(p, group))
        continue;
      Unlink(a, p);
      LinkIfFree(p, group);
    }
    const VORListValVORBaseUnknown_var next = Next(a);
    if (next.IsEmpty())
      return;
    for (const VORBaseUnknown_var& n : next) {
      if (IsIn(selection, n) || SameObject(n, group))
        continue;
      Unlink(a, n);
      LinkIfFree(group, n);
    }
  }
}

void QELFpaPertGrpActCmd::CreateOneResource(const VORBaseUnknown_var& product) {
  if (!product)
    return;
  VORBaseUnknown_var container;
  auto* process = dynamic_cast<VORProcess*>(_Document.get());
  VORIPDServices::GetPPRContainer(process, container);
  VORIResourceFactory_var factory(container);
  if (!factory)
    return;
  const VORUnicodeString parentType = ResourcePlanTypeName(_ResourceParent);
  VORUnicodeString resourceClass;
  if (_HubMode)
    resourceClass = ResourceClassOf(
        PlanTypeAttribute(_Document.get(), FindPlanType(_Document.get(), parentType), "compclass"));
  const VORUnicodeString type = _Dialog->GetResourceType();
  VORIProduct_var p(product);
  VORBaseUnknown_var reference;
  if (p)
    p->GetReferenceProduct(reference);
  if (!VORIResource_var(reference)) {
    VORBaseUnknown_var description;
    if (SUCCEEDED(factory->CreateResource(resourceClass, product, type, description)))
      factory->AttachResource(product, description);
    if (p)
      p->GetReferenceProduct(reference);
  }
  if (VORIResource_var resource(reference); resource)
    resource->SetName(_Dialog->GetResourceName());
}
