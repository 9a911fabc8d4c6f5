// The viewer's synchronisation with the process model: the chart's node notifications (moves,
// nodes shown and hidden, children added to or removed from the level), manufacturing-assembly
// changes, product show changes refreshing the "ProductInput" ZitBlts, and the context menu.
#include <memory>

#include "QELFpaProductFlowViewer.h"
#include "QELIMfgAssembly.h"
#include "QELIMfgAssemblyModificationEvents.h"
#include "QELIPertNodeExt.h"
#include "QELIPertPosition.h"
#include "QELIZitBltMgr.h"
#include "QELPertNotifications.h"
#include "VORAssert.h"
#include "VORCommandHeader.h"
#include "VORContext.h"
#include "VORDlgContextualMenu.h"
#include "VORDocument.h"
#include "VORFrmEditor.h"
#include "VORFrmLayout.h"
#include "VORFrmWindowKinds.h"
#include "VORIAlias.h"
#include "VORIContainer.h"
#include "VORILinkableObject.h"
#include "VORIModelEvents.h"
#include "VORIProduct.h"
#include "VORISPPActivity.h"
#include "VORISPPFlowMgt.h"
#include "VORISPPItemMgt.h"
#include "VORISPPProductIO.h"
#include "VORLateTypes.h"
#include "VORSPPActivityNotification.h"
#include "VORShowNotif.h"
#include "VORWorkbench.h"

namespace {

constexpr const char* kModule = "QELProductFlowViewer.m/src/QELFpaProductFlowViewer";

std::unique_ptr<VORListValVORBaseUnknown_var> Owned(VORListValVORBaseUnknown_var* list) {
  return std::unique_ptr<VORListValVORBaseUnknown_var>(list);
}

bool IsKindOf(VORBaseUnknown* object, const char* type) {
  return object != nullptr && VORLateTypes::IsKindOf(object->GetLateType(), type);
}

// The father activity of an activity, or null.
VORBaseUnknown_var FatherOf(const VORBaseUnknown_var& activity) {
  VORBaseUnknown_var father;
  if (VORISPPActivity_var spp(activity); spp)
    spp->GetFatherActivity(father);
  return father;
}

// Adds a menu item that runs the declared command header id (when it exists and is available),
// on argument when one is given.
void AddHostItem(VORNotification* notification, const char* id,
                 VORBaseUnknown* argument = nullptr) {
  auto* context = dynamic_cast<VORContext*>(notification);
  VORCommandHeader* header = VORCommandHeader::Find(id);
  if (context == nullptr || header == nullptr || !header->IsAvailable())
    return;
  if (VORDlgContextualMenu* menu = VORDlgContextualMenu::FromContext(context)) {
    auto* item = new VORDlgPushItem(menu, id);  // the menu holds its items
    if (argument == nullptr) {
      item->SetCommandHeader(header);
    } else {
      item->SetCommandHeader(VORCommandHeader_var::Adopt(new VORCommandHeader(
          header->GetID(), header->GetModule(), header->GetClassName(), argument)));
    }
  }
}

// Adds a menu item that starts a workbench command (when its module is installed), titled as in
// the menus.
void AddWorkbenchItem(VORNotification* notification, const char* id) {
  auto* context = dynamic_cast<VORContext*>(notification);
  const VORWorkbenchCommand* command = VORWorkbench::Find(id);
  if (context == nullptr || command == nullptr || !VORWorkbench::IsInstalled(*command))
    return;
  if (VORDlgContextualMenu* menu = VORDlgContextualMenu::FromContext(context)) {
    auto header = VORCommandHeader_var::Adopt(VORWorkbench::CreateHeader(id));
    auto* item = new VORDlgPushItem(menu, id);  // the menu holds its items
    item->SetTitle(VORUnicodeString(command->title.c_str()));
    item->SetCommandHeader(header.get());
  }
}

}  // namespace

// Refreshes one ZitBlt of every activity of a level that a product change concerns.
class QELFpaPFVRefreshServices {
 public:
  explicit QELFpaPFVRefreshServices(const VORISPPActivity_var& root) : _root(root) {}

  void Refresh(const VORBaseUnknown_var& product, const VORUnicodeString& zitBltName) {
    VORListValVORBaseUnknown_var products;
    CollectProducts(product, products);
    VORListValVORBaseUnknown_var objects = products;
    CollectAssemblies(products, objects);
    VORListValVORBaseUnknown_var activities;
    CollectActivities(objects, activities);
    CollectParents(activities);
    for (VORBaseUnknown_var& activity : activities) {
      if (QELIZitBltMgr_var manager(activity); manager)
        manager->UpdateZitBlt(zitBltName);
    }
  }

 private:
  // The product's ancestors and the product itself.
  static void CollectProducts(const VORBaseUnknown_var& product,
                              VORListValVORBaseUnknown_var& out) {
    VORBaseUnknown_var current = product;
    for (int guard = 0; current && guard < 100000; ++guard) {
      out.Append(current);
      VORBaseUnknown_var father;
      if (VORIProduct_var p(current); p)
        p->GetFatherProduct(father);
      current = father;
    }
  }
  // The assemblies pointing to the products, and those pointing to them in turn.
  static void CollectAssemblies(const VORListValVORBaseUnknown_var& products,
                                VORListValVORBaseUnknown_var& out) {
    VORListValVORBaseUnknown_var pending = products;
    for (int i = 1; i <= pending.Size() && i < 100000; ++i) {
      VORILinkableObject_var linkable(pending[i]);
      VORListValVORBaseUnknown_var* pointing = nullptr;
      if (!linkable || FAILED(linkable->GetPointingObjects(pointing)) || pointing == nullptr)
        continue;
      auto owned = Owned(pointing);
      for (VORBaseUnknown_var& object : *pointing) {
        if (QELIMfgAssembly_var(object) && out.Locate(object) == 0) {
          out.Append(object);
          pending.Append(object);
        }
      }
    }
    out.RemoveDuplicates();
  }
  // Activities linked to an object whose items contain it. Only the "VORProcess_first_assigned"
  // behaviour occurs: the links are not filtered by type.
  static void CollectActivities(const VORListValVORBaseUnknown_var& objects,
                                VORListValVORBaseUnknown_var& out) {
    for (const VORBaseUnknown_var& object : objects) {
      VORILinkableObject_var linkable(object);
      VORListValVORBaseUnknown_var* linked = nullptr;
      if (!linkable || FAILED(linkable->GetLinkedObjects(linked)) || linked == nullptr)
        continue;
      auto owned = Owned(linked);
      for (VORBaseUnknown_var& candidate : *linked) {
        VORISPPItemMgt_var items(candidate);
        if (!items || !VORISPPActivity_var(candidate) || out.Locate(candidate) != 0)
          continue;
        VORListValVORBaseUnknown_var* assigned = nullptr;
        if (FAILED(items->GetAssignedItems(assigned, "Item")) || assigned == nullptr)
          continue;
        auto ownedItems = Owned(assigned);
        if (assigned->Locate(object) != 0)
          out.Append(candidate);
      }
    }
  }
  static void CollectParents(VORListValVORBaseUnknown_var& activities) {
    const int count = activities.Size();
    for (int i = 1; i <= count; ++i) {
      for (VORBaseUnknown_var father = FatherOf(activities[i]); father; father = FatherOf(father)) {
        if (activities.Locate(father) != 0)
          break;
        activities.Append(father);
      }
    }
  }

  VORISPPActivity_var _root;
};

void QELFpaProductFlowViewer::AddCallbacks() {
  QELIPertPosition_var modelNode(_rootNode);
  VOR_ASSERT_AT(NULL_var != modelNode, kModule, 357);
  // The controller dispatches the chart's notifications on the chart root's own dispatcher;
  // after a level switch the new root is not yet the controller's, so subscribe there directly.
  // The sender is not needed: the lambda form spares a cast per node notification.
  if (VORIModelEvents_var events(_rootNode); events)
    _pertNodeCallback = AddCallback(events->GetEventPublisher(), VORNotification::ClassName(),
                                    [this](VORBaseUnknown*, VORNotification* n, void* data) {
                                      ONPertNodeModification(nullptr, n, data);
                                    });
  AddCallBackOnRootProduct();
  AddCallbackOnMA();
}

void QELFpaProductFlowViewer::AddCallBackOnRootProduct() {
  VORFrmEditor* editor = VORFrmEditor::GetCurrentEditor();
  VORDocument* document = editor != nullptr ? editor->GetDocument() : nullptr;
  if (document == nullptr || !document->IsAKindOf("VORProcess"))
    return;
  VORBaseUnknown_var containerObject;
  document->GetContainer(VORDocument::PPRContainer, containerObject);
  VORIContainer_var container(containerObject);
  VORListValVORBaseUnknown_var* members = nullptr;
  if (!container || FAILED(container->ListMembers(VORIProduct::IID(), members)) || !members)
    return;
  auto owned = Owned(members);
  for (VORBaseUnknown_var& member : *members) {
    VORIAlias_var alias(member);
    VORUnicodeString name;
    if (alias && SUCCEEDED(alias->GetAlias(name)) &&
        name == VORUnicodeString(VORDocument::RootProductAlias)) {
      _rootProduct = VORIProduct_var(member);
      break;
    }
  }
  if (VORIModelEvents_var events(_rootProduct); events)
    _rootProductCallback = AddCallback(events->GetEventPublisher(), VORShowNotif::ClassName(),
                                       &QELFpaProductFlowViewer::OnProductModification);
}

void QELFpaProductFlowViewer::AddCallbackOnMA() {
  VORDocument* document = GetEditor() != nullptr ? GetEditor()->GetDocument() : nullptr;
  if (document == nullptr)
    return;
  VORBaseUnknown_var container;
  document->GetContainer(VORDocument::BomContainer, container);
  QELIMfgAssemblyModificationEvents_var events(container);
  if (!events || events->GetEventPublisher() == nullptr)
    return;
  _maPublisher = events->GetEventPublisher();
  _maCallback =
      static_cast<int>(AddCallback(_maPublisher, QELMfgNotificationDispatcher::GetMfgModified(),
                                   &QELFpaProductFlowViewer::OnMAModifiedNotification));
}

void QELFpaProductFlowViewer::RemoveCallbacks() {
  QELIPertPosition_var modelNode(_rootNode);
  VOR_ASSERT_AT(NULL_var != modelNode, kModule, 636);
  if (_pertNodeCallback != 0)
    RemoveCallback(_pertNodeCallback);
  _pertNodeCallback = 0;
  RemoveProductStructureCB();
  RemoveCammBackOnMA();
}

void QELFpaProductFlowViewer::RemoveProductStructureCB() {
  if (_rootProduct && _rootProductCallback != 0)
    RemoveCallback(_rootProductCallback);
  _rootProductCallback = 0;
}

void QELFpaProductFlowViewer::RemoveCammBackOnMA() {
  if (_maPublisher && _maCallback != -1) {
    RemoveCallback(static_cast<VORCallbackId>(_maCallback));
    _maCallback = -1;
  }
  _maPublisher = NULL_var;
}

void QELFpaProductFlowViewer::ONPertNodeModification(VORCommand*, VORNotification* notification,
                                                     void*) {
  if (notification == nullptr)
    return;
  if (auto* moved = dynamic_cast<QELPertPositionNotify*>(notification)) {
    if (QELIZitBltMgr_var manager(moved->GetNode()); manager)
      manager->UpdateZitBltPositions();
    if (_vismanager != nullptr)
      _vismanager->Commit();
  } else if (auto* info = dynamic_cast<QELPertAppInfoNotify*>(notification)) {
    VORBaseUnknown_var node = info->GetNode();
    if (QELIPertNodeExt_var ext(node); ext) {
      if (info->GetRemoveRep() == 0 && !ext->GetHiddenFlag())
        AttachZitBlt(node);
      else if (QELIZitBltMgr_var manager(node); manager)
        manager->RemoveZitBlts();
    }
    if (_vismanager != nullptr)
      _vismanager->Commit();
  } else if (dynamic_cast<VORSPPActivityNotification*>(notification) != nullptr) {
    FollowChildChange(notification);
  }
}

void QELFpaProductFlowViewer::FollowChildChange(VORNotification* notification) {
  // A child added to or removed from the level: the chart takes the node in (to be placed by the
  // next organise) or drops it; the node notifications that follow attach or remove its ZitBlts.
  auto* change = static_cast<VORSPPActivityNotification*>(notification);
  if (_controller == nullptr || change->GetKind() != SPPChildActivityChanged ||
      change->GetFather() == nullptr || change->GetSon() == nullptr ||
      change->GetFather()->GetIdentity() != _rootNode.Identity())
    return;
  VORBaseUnknown_var son(change->GetSon());
  VORBaseUnknown_var father;
  if (VORIGENode_var node(son); node)
    node->GetParentNode(father);
  const bool isChild = father && father.Identity() == _rootNode.Identity();
  const bool inChart = _controller->IsInChart(son);
  if (isChild && !inChart) {
    _controller->AddChildNode(son);
    _controller->RefreshNodePositionInPert(son, true);
    if (_nodesForReArrangement != nullptr)
      _nodesForReArrangement->Append(son);
  } else if (!isChild && inChart) {
    if (_nodesForReArrangement != nullptr)
      _nodesForReArrangement->RemoveValue(son);
    _controller->RemoveChildNode(son);
  }
  if (_vismanager != nullptr)
    _vismanager->Commit();
}

void QELFpaProductFlowViewer::GetInverslyLinkedActs(VORListValVORBaseUnknown_var& out,
                                                    const VORBaseUnknown_var& assembly) {
  VORILinkableObject_var linkable(assembly);
  VORListValVORBaseUnknown_var* linked = nullptr;
  if (!linkable || FAILED(linkable->GetLinkedObjects(linked)) || linked == nullptr)
    return;
  auto owned = Owned(linked);
  for (VORBaseUnknown_var& object : *linked) {
    if (VORISPPActivity_var(object))
      out.Append(object);
  }
}

void QELFpaProductFlowViewer::GetAllParentActivities(VORListValVORBaseUnknown_var& acts,
                                                     VORListValVORBaseUnknown_var& out) {
  for (VORBaseUnknown_var& activity : acts) {
    for (VORBaseUnknown_var father = FatherOf(activity); father; father = FatherOf(father))
      out.Append(father);
  }
}

void QELFpaProductFlowViewer::OnMAModifiedNotification(VORCommand*, VORNotification* notification,
                                                       void*) {
  auto* update = dynamic_cast<QELMfgUpdateNotification*>(notification);
  if (update == nullptr || update->GetModifiedAssembly() == nullptr)
    return;
  VORBaseUnknown_var assembly(update->GetModifiedAssembly());
  VORListValVORBaseUnknown_var activities;
  GetInverslyLinkedActs(activities, assembly);
  if (update->GetEvent() == VORString("MADeleting")) {
    for (VORBaseUnknown_var& activity : activities) {
      VORISPPItemMgt_var items(activity);
      VORListValVORBaseUnknown_var* assigned = nullptr;
      if (items && SUCCEEDED(items->GetAssignedItems(assigned, "Item")) && assigned != nullptr) {
        auto owned = Owned(assigned);
        if (assigned->Locate(assembly) != 0)
          items->UnassignItem(assembly);
      }
      VORISPPFlowMgt_var flows(activity);
      VORListValVORBaseUnknown_var* ios = nullptr;
      if (!flows || FAILED(flows->GetProductIOs(ios)) || ios == nullptr)
        continue;
      auto ownedIOs = Owned(ios);
      for (VORBaseUnknown_var& io : *ios) {
        VORISPPProductIO_var productIO(io);
        VORBaseUnknown_var product;
        if (productIO && SUCCEEDED(productIO->GetProduct(product)) && product &&
            product.Identity() == assembly.Identity())
          flows->RemoveProductIO(io);
      }
    }
  }
  VORListValVORBaseUnknown_var all = activities;
  GetAllParentActivities(activities, all);
  all.RemoveDuplicates();
  for (VORBaseUnknown_var& activity : all) {
    if (QELIZitBltMgr_var manager(activity); manager)
      manager->UpdateAllZitBlts();
  }
}

void QELFpaProductFlowViewer::OnProductModification(VORCommand*, VORNotification* notification,
                                                    void*) {
  auto* show = dynamic_cast<VORShowNotif*>(notification);
  if (show == nullptr)
    return;
  VORBaseUnknown_var product(show->GetObject());
  if (!VORIProduct_var(product))
    return;
  QELFpaPFVRefreshServices refresh{VORISPPActivity_var(_rootNode)};
  refresh.Refresh(product, "ProductInput");
}

void QELFpaProductFlowViewer::GetSelectedElement(VORBaseUnknown_var& out) {
  out = NULL_var;
  VORFrmEditor* editor = VORFrmEditor::GetCurrentEditor();
  if (editor == nullptr)
    return;
  if (VORPSO* pso = editor->GetPSO(); pso != nullptr && !pso->IsEmpty()) {
    out = VORBaseUnknown_var(pso->GetElement(1)->GetLeaf());
  } else if (VORCSO* cso = editor->GetCSO(); cso != nullptr && !cso->IsEmpty()) {
    out = VORBaseUnknown_var(cso->GetElement(cso->GetSize() >= 2 ? 2 : 1)->GetLeaf());
  }
  // A list item's visualisation stands for its object: that replacement comes with the list
  // items (the scroll list ZitBlts).
}

void QELFpaProductFlowViewer::ContextMenuFor3DWindow(VORNotification* notification) {
  if (notification == nullptr)
    return;
  VORBaseUnknown_var selected;
  GetSelectedElement(selected);
  VORBaseUnknown* object = selected.Identity();
  if (IsKindOf(object, "ASMPRODUCT") || IsKindOf(object, "QELMfgAssy") ||
      IsKindOf(object, "BIWLocatingPoint") || IsKindOf(object, "BIWFastener") ||
      IsKindOf(object, "BIWClampingPoint")) {
    VORFrmLayout* layout = VORFrmLayout::GetCurrentLayout();
    if (layout->GetMDIState() == 2) {
      if (VORCommandHeader* tile = VORCommandHeader::Find(VORFrmHostCommands::TileWinH))
        tile->StartCommand();
    }
    VORFrmEditor* editor = VORFrmEditor::GetCurrentEditor();
    const bool selection =
        editor != nullptr && ((editor->GetPSO() != nullptr && !editor->GetPSO()->IsEmpty()) ||
                              (editor->GetCSO() != nullptr && !editor->GetCSO()->IsEmpty()));
    VORFrmWindow* previous = layout->GetCurrentWindow();
    VORFrmWindow* examined = nullptr;
    for (VORFrmWindow* window : layout->GetWindowList()) {
      if (!window->IsAKindOf("VORNewInventorySpaceWnd") || !window->Has3DViewer())
        continue;
      examined = window;
      if (selection && editor != nullptr && window->GetEditor() != nullptr &&
          window->GetEditor()->GetDocument() == editor->GetDocument()) {
        AddCenterGraph(notification);
        AddHostItem(notification, VORFrmHostCommands::ReframeOn);
        AddHostItem(notification, VORFrmHostCommands::HideShow);
        break;
      }
    }
    layout->SetCurrentWindow(examined != nullptr ? examined : previous);
  }
  AddHostItem(notification, VORFrmHostCommands::Properties, object);
  // The grouping commands on the activities they work on; the picked one is their first pick.
  if (IsKindOf(object, "BIWActivityStation") || IsKindOf(object, "BIWActivityGrouping"))
    AddWorkbenchItem(notification, "QELFpaPertGrpActCmd");
  if (IsKindOf(object, "BIWActivityGrouping"))
    AddWorkbenchItem(notification, "QELFpaPertUngroupActCmd");
  if (IsKindOf(object, "ASMPRODUCT"))
    AddPreviewWindowItem(notification);
  // A selected activity with ZitBlts: hide and show them by name.
  if (VORISPPActivity_var(selected) && QELIZitBltMgr_var(selected))
    AddWorkbenchItem(notification, "QELFpaCtxZitBltCmd");
}

void QELFpaProductFlowViewer::ContextCB(VORCommand*, VORNotification* notification, void*) {
  ContextMenuFor3DWindow(notification);
}
