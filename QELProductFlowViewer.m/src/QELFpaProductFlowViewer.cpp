#include "QELFpaProductFlowViewer.h"

#include <algorithm>
#include <string>

#include "QELFpaPertServices.h"
#include "QELIFPAAdapters.h"
#include "QELIZitBltMgr.h"
#include "QELIPertNodeExt.h"
#include "QELIPertPosition.h"
#include "QELIPertWindow.h"
#include "QELPertClientVisuServices.h"
#include "QELPertParameters.h"
#include "QELPertSessionSettings.h"
#include "VORAssert.h"
#include "VORContext.h"
#include "VORDlgContextualMenu.h"
#include "VORExtensionRegistry.h"
#include "VORFrmEditor.h"
#include "VORISPPActivity.h"
#include "VORMsgCatalog.h"
#include "VORTrace.h"

namespace {

constexpr const char* kModule = "QELProductFlowViewer.m/src/QELFpaProductFlowViewer";

const VORTrace& Trace() {
  static const VORTrace trace("QELProductFlowViewerTrace", 0, "STDERR", 1024);
  return trace;
}

// The window's QELIPertWindow: hands out the window's controller.
class TIEQELIPertWindowQELFpaProductFlowViewer : public VORExtension, public QELIPertWindow {
  VOR_DECLARE_CLASS(TIEQELIPertWindowQELFpaProductFlowViewer, VORExtension)
 public:
  QELPertController* GetPertController() override {
    auto* window = dynamic_cast<QELFpaProductFlowViewer*>(GetExtendedObject());
    return window != nullptr ? window->GetPertController() : nullptr;
  }
};

VORExtension* CreateTIEQELIPertWindowQELFpaProductFlowViewer() {
  return new TIEQELIPertWindowQELFpaProductFlowViewer();
}

// Children of a graph node (a new list or null).
VORListValVORBaseUnknown_var* ChildrenOf(VORBaseUnknown* node) {
  VORIGENode_var graphNode(node);
  VORListValVORBaseUnknown_var* children = nullptr;
  if (!graphNode || FAILED(graphNode->GetChildren(children))) {
    delete children;
    return nullptr;
  }
  return children;
}

void AddNavigationItem(VORNotification* notification, const char* headerId) {
  auto* context = dynamic_cast<VORContext*>(notification);
  VORCommandHeader* header = VORCommandHeader::Find(headerId);
  if (VORFrmEditor::GetCurrentEditor() == nullptr || header == nullptr || !header->IsAvailable() ||
      context == nullptr)
    return;
  VORDlgContextualMenu* menu = VORDlgContextualMenu::FromContext(context);
  if (menu == nullptr)
    return;
  auto* item = new VORDlgPushItem(menu, headerId);  // the menu holds its items
  item->SetCommandHeader(header);
}

}  // namespace

void QELFpaProductFlowViewer::RegisterExtensions() {
  VORExtensionRegistry::Register(QELFpaProductFlowViewer::ClassName(), QELIPertWindow::IID(),
                                 &CreateTIEQELIPertWindowQELFpaProductFlowViewer,
                                 VORExtensionKind::Data);
}

QELFpaProductFlowViewer::QELFpaProductFlowViewer(const VORString& name, VORFrmEditor* editor,
                                                 VORBaseUnknown_var& rootActivity)
    : VORFrmWindow(name, editor),
      _rootNode(rootActivity),
      _nodesForReArrangement(new VORListValVORBaseUnknown_var) {
  Trace().TraPrint("QELFpaProductFlowViewer::Constructor -->");

  _windowFrame = GetViewerFrame();
  VOR_ASSERT_AT(NULL != _windowFrame, kModule, 213);

  _viewer = VORHandle<QELPertViewer>::Adopt(
      new QELPertViewer(_windowFrame, "ProductFlow Viewer ", QELPertParameters::PERT_VIEWER_STYLE,
                        800, 500, QELPertParameters::PERT_VIEWER_FLAGS));
  if (editor != nullptr && editor->GetISO() != nullptr)
    editor->GetISO()->AddViewer(_viewer.get());
  _viewer->SetViewerSelectable(true);
  SetViewer(_viewer.get());

  QELPertSessionSettings* settings = QELPertSessionSettings::Get();
  if (settings == nullptr || settings->IsGridShown())
    _grid = VOR2DRep_var::Adopt(QELPertClientVisuServices::CreateGrid(_viewer.get()));
  double* rgb = nullptr;
  if (settings != nullptr && SUCCEEDED(settings->GetBackgroundColor(rgb)) && rgb != nullptr)
    _viewer->SetBackgroundColor(static_cast<float>(rgb[0]), static_cast<float>(rgb[1]),
                                static_cast<float>(rgb[2]));
  delete[] rgb;

  _windowFrame->Attach4Sides(_viewer.get());
  _viewpoint = _viewer->GetMain2DViewpoint();
  VOR_ASSERT_AT(NULL != _viewpoint, kModule, 262);
  _viewer->SetMultiSelBehavior(1);
  _vismanager = VORVisManager::GetVisManager();
  VOR_ASSERT_AT(NULL != _vismanager, kModule, 270);
  ViewerName viewerName = PertViewerProductFlow;
  QELPertClientVisuServices::SetViewerName(viewerName);

  VORIGENode_var parentNode(_rootNode);
  VOR_ASSERT_AT(NULL_var != parentNode, kModule, 279);
  if (VORListValVORBaseUnknown_var* nodes = GetProductFlowViewerNodes(_rootNode)) {
    for (VORBaseUnknown_var& child : *nodes) {
      VORIGENode_var node(child);
      bool created = false;
      QELFpaPertBaseServices::GetPertExtension(node, created);
      // A node never placed in a chart is new: it waits for the organiser.
      if (QELFpaPertBaseServices::InitNodePosition(node) == S_OK)
        _nodesForReArrangement->Append(child);
    }
    delete nodes;
  }

  _controller = nullptr;
  UpdateGraph(_rootNode, nullptr);
  SetPFWindowName(parentNode);
  SetViewpoint();
  AttachZitBlts(_rootNode);

  if (editor != nullptr) {
    _vismanager->AttachHSOTo(editor->GetHSO(), _viewpoint);
    _vismanager->AttachPSOTo(editor->GetPSO(), _viewpoint);
  }
  AddCallbacks();
  _contextCallback = AddCallback(_viewer->GetEventPublisher(), VORContext::ClassName(),
                                 &QELFpaProductFlowViewer::ContextCB);
  _resizeCallback =
      AddCallback(GetEventPublisher(), GetSizeNotification(), &QELFpaProductFlowViewer::OnResize);
  Trace().TraPrint("QELFpaProductFlowViewer::Constructor <--");
}

QELFpaProductFlowViewer::~QELFpaProductFlowViewer() {
  Trace().TraPrint("QELFpaProductFlowViewer::Destructor -->");
  RemoveCallbacks();
  RemoveZitBlts(_rootNode);
  _rootProduct = NULL_var;
  _callbackCount = 0;
  _callbackState = 0;
  _callbackData = nullptr;
  // Deleted by DeleteWindow; a window destroyed without it still lets its controller go.
  ReleaseController();
  if (_windowFrame != nullptr && _viewer)
    _windowFrame->ResetAttachment(_viewer.get());
  _vismanager = nullptr;
  _viewpoint = nullptr;
  if (_grid && _viewer)
    _viewer->RemoveRep(_grid);
  _grid = NULL_var;
  if (_nodesForReArrangement != nullptr) {
    _nodesForReArrangement->RemoveAll();
    delete _nodesForReArrangement;
    _nodesForReArrangement = nullptr;
  }
  // The window's editor may be gone by now (closing a document deletes its windows first, but
  // they are released after the editor); DeleteWindow left its ISO already.
  if (VORFrmEditor* editor = VORFrmEditor::GetCurrentEditor();
      editor != nullptr && editor->GetISO() != nullptr)
    editor->GetISO()->RemoveViewer(_viewer.get());
  SetViewer(nullptr);
  _viewer = nullptr;
  QELPertParameters::PERT_GRID_CELL_SIZE = 25.0;
  QELPertParameters::PERT_LABEL_HEIGHT = 2.0;
  Trace().TraPrint("QELFpaProductFlowViewer::Destructor -->");
}

void QELFpaProductFlowViewer::ReleaseController() {
  if (_controller == nullptr)
    return;
  // The root process forgets a controller that is going away.
  VORISPPActivity_var activity(_rootNode);
  VORBaseUnknown_var rootProcess;
  if (activity && SUCCEEDED(activity->GetRootActivity(rootProcess))) {
    QELIFPAAdapters_var adapters(rootProcess);
    if (adapters && adapters->GetPertController() == _controller)
      adapters->SetPertController(nullptr);
  }
  _controller->RemoveNodeManipCmdCB();
  _controller->RequestDelayedDestruction();
  _controller = nullptr;
}

void QELFpaProductFlowViewer::UpdateGraph(VORBaseUnknown_var& root, VORBaseUnknown* excluded) {
  VORIGENode_var rootGraphNode(root);
  if (!rootGraphNode)
    return;
  if (_controller == nullptr) {
    _controller = new QELPertController(this, root, _viewer.get(), PertViewerProductFlow,
                                        PertModeEditable, true, NULL_var);
  } else {
    _controller->RemoveAllPertNodes();
    _controller->SetWindowRootNode(root.get(), NULL_var);
    _viewer->SetViewerSelectable(true);
  }
  QELIPertPosition_var ParentNode(root);
  VOR_ASSERT_AT(NULL_var != ParentNode, kModule, 1216);
  VORListValVORBaseUnknown_var* nodes = GetProductFlowViewerNodes(root);
  // One batch: each link is drawn once, when the whole level is in, not once per end added.
  _controller->BeginMoves();
  for (VORBaseUnknown_var& node : *nodes) {
    if (!node || (excluded != nullptr && node.Identity() == excluded->GetIdentity()))
      continue;
    _controller->AddChildNode(node);
    _controller->RefreshNodePositionInPert(node, false);
  }
  _controller->EndMoves();
  delete nodes;
}

void QELFpaProductFlowViewer::SetPertLevel(VORBaseUnknown_var& newRoot, VORBaseUnknown* excluded,
                                           bool) {
  if (_rootNode) {
    VORIGENode_var oldgraphLevel(_rootNode);
    VOR_ASSERT_AT(NULL_var != oldgraphLevel, kModule, 1284);
    DeletePertNodes(_rootNode);
    RemoveCallbacks();
  }
  _rootNode = newRoot;
  AddCallbacks();
  VORIGENode_var pertNode(newRoot);
  VOR_ASSERT_AT(NULL_var != pertNode, kModule, 1295);
  QELPertClientVisuServices::SetChildPertPositions(pertNode, 1);
  SetPFWindowName(pertNode);
  UpdateGraph(newRoot, excluded);
}

void QELFpaProductFlowViewer::SetPFWindowName(const VORIGENode_var& node) {
  Trace().TraPrint("QELFpaProductFlowViewer::SetPFWindowName -->");
  VORFrmEditor* editor = VORFrmEditor::GetCurrentEditor();
  if (!node || editor == nullptr || editor->GetDocument() == nullptr)
    return;
  // The file name: what follows the last path separator ("\" as stored by the host, "/" here).
  const VORUnicodeString storage(editor->StorageName());
  const int cut = std::max(storage.ReverseFind("\\"), storage.ReverseFind("/"));
  const VORUnicodeString fileName =
      cut < 0 ? storage : storage.SubString(cut + 1, storage.GetLengthInChar() - cut - 1);

  VORUnicodeString path;
  node->GetLabel(path);
  VORIGENode_var current(node);
  for (;;) {
    VORBaseUnknown_var parent;
    current->GetParentNode(parent);
    VORIGENode_var parentNode(parent);
    if (!parentNode)
      break;
    VORUnicodeString label;
    parentNode->GetLabel(label);
    path = label + VORUnicodeString("\\") + path;
    current = parentNode;
  }
  _windowTitle = fileName + VORUnicodeString("\\") + path +
                 VORMsgCatalog::BuildMessage("QELFpaProductFlowViewer", "WindowTitle",
                                             " - Product Flow Viewer");
  Trace().TraPrint("Getting the Display Name");
  VORUnicodeString display;
  GetDisplayName(display);
  Trace().TraPrint("Setting the name to WIndow");
  SetTitle(display);
  Trace().TraPrint("QELFpaProductFlowViewer::SetPFWindowName <--");
}

void QELFpaProductFlowViewer::GetDisplayName(VORUnicodeString& out) {
  const int length = _windowTitle.GetLengthInChar();
  int width = GetRectangle().width;
  if (width == 0 && _viewer) {
    float w = 0.0f;
    float h = 0.0f;
    _viewer->GetGraphicSize(w, h);
    width = static_cast<int>(w);
  }
  if (width < 10 * length) {
    const int k = width / 20;
    out = _windowTitle.SubString(0, k) + VORUnicodeString("...") +
          _windowTitle.SubString(length - k, k);
  } else {
    out = _windowTitle;
  }
}

void QELFpaProductFlowViewer::OnResize(VORCommand*, VORNotification*, void*) {
  Trace().TraPrint("QELFpaProductFlowViewer::OnResize -->");
  VORUnicodeString display;
  GetDisplayName(display);
  SetTitle(display);
  Trace().TraPrint("QELFpaProductFlowViewer::OnResize <--");
}

void QELFpaProductFlowViewer::SetViewpoint() {
  Trace().TraPrint("QELFpaProductFlowViewer::SetViewpoint -->");
  if (_viewer)
    _viewer->Reframe();
  Trace().TraPrint("QELFpaProductFlowViewer::SetViewpoint <--");
}

VORListValVORBaseUnknown_var* QELFpaProductFlowViewer::GetProductFlowViewerNodes(
    VORBaseUnknown_var& iParentNode) {
  VOR_ASSERT_AT(NULL_var != iParentNode, kModule, 1500);
  auto* nodes = new VORListValVORBaseUnknown_var;
  if (VORListValVORBaseUnknown_var* children = ChildrenOf(iParentNode)) {
    for (VORBaseUnknown_var& child : *children) {
      if (VORIGENode_var(child))
        nodes->Append(child);
    }
    delete children;
  }
  return nodes;
}

void QELFpaProductFlowViewer::NodesForReArrangement(VORListValVORBaseUnknown_var*& ioList) {
  if (ioList == nullptr || _nodesForReArrangement == nullptr)
    return;
  ioList->Append(*_nodesForReArrangement);
}

void QELFpaProductFlowViewer::AttachZitBlts(VORBaseUnknown_var& node) {
  VORListValVORBaseUnknown_var* children = GetProductFlowViewerNodes(node);
  for (VORBaseUnknown_var& child : *children) {
    AttachZitBlt(child);
    QELIPertNodeExt_var ext(child);
    if (ext && ext->GetState(1) == PertNodeExpanded)
      AttachZitBlts(child);
  }
  delete children;
}

void QELFpaProductFlowViewer::AttachZitBlt(VORBaseUnknown_var& node) {
  QELIZitBltMgr_var manager(node);
  if (VORISPPActivity_var(node) && manager)
    manager->BuildZitBltReps(_viewer.get());
}

void QELFpaProductFlowViewer::RemoveZitBlts(VORBaseUnknown_var& node) {
  if (!node)
    return;
  if (VORListValVORBaseUnknown_var* children = ChildrenOf(node)) {
    for (VORBaseUnknown_var& child : *children) {
      if (VORIGENode_var(child))
        RemoveZitBlt(child);
    }
    delete children;
  }
}

void QELFpaProductFlowViewer::RemoveZitBlt(VORBaseUnknown_var& node) {
  QELIZitBltMgr_var manager(node);
  if (manager)
    manager->RemoveZitBlts();
}

void QELFpaProductFlowViewer::DeletePertNodes(VORBaseUnknown_var& node) {
  if (VORListValVORBaseUnknown_var* children = ChildrenOf(node)) {
    // The count advances the text as a character offset (kept from the original trace).
    static const std::string text = "No.Of Children : ";
    Trace().TraPrint(
        text.substr(std::min<size_t>(static_cast<size_t>(children->Size()), text.size())));
    for (VORBaseUnknown_var& child : *children)
      DeletePertNodes(child);
    delete children;
  }
  RemoveZitBlt(node);
  if (_vismanager != nullptr && _viewpoint != nullptr)
    _vismanager->DetachFrom(_viewpoint, 1);
}

void QELFpaProductFlowViewer::ResetPertNodeStates(VORBaseUnknown_var& node) {
  if (VORListValVORBaseUnknown_var* children = ChildrenOf(node)) {
    static const std::string text = "No.Of Children : ";
    Trace().TraPrint(
        text.substr(std::min<size_t>(static_cast<size_t>(children->Size()), text.size())));
    for (VORBaseUnknown_var& child : *children)
      ResetPertNodeStates(child);
    delete children;
  }
}

void QELFpaProductFlowViewer::DeleteWindow() {
  if (IsDeleted())
    return;
  Trace().TraPrint("QELFpaProductFlowViewer::DeleteWindow -->");
  if (_rootNode) {
    ResetPertNodeStates(_rootNode);
    DeletePertNodes(_rootNode);
  }
  if (_grid && _viewer)
    _viewer->RemoveRep(_grid);
  ViewerName viewerName = PertViewerClassic;
  QELPertClientVisuServices::SetViewerName(viewerName);
  if (GetEditor() != nullptr && GetEditor()->GetISO() != nullptr)
    GetEditor()->GetISO()->RemoveViewer(_viewer.get());
  VORFrmWindow::DeleteWindow();
  ReleaseController();
  Trace().TraPrint("QELFpaProductFlowViewer::DeleteWindow <--");
}

void QELFpaProductFlowViewer::AddCenterGraph(VORNotification* notification) {
  AddNavigationItem(notification, "CenterGraph");
}

void QELFpaProductFlowViewer::AddPreviewWindowItem(VORNotification* notification) {
  AddNavigationItem(notification, "QELFpaPreviewWindowManagerCmd");
}
