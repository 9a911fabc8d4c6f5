#include "QELFpaNodeOrganizeCmd.h"

#include "QELFpaProductFlowViewer.h"
#include "QELFpaViewerCmdsTrace.h"
#include "QELIPertNodeExt.h"
#include "QELIPertWindow.h"
#include "VORCommandHeader.h"
#include "VORFrmLayout.h"
#include "VORIGENode.h"

namespace {
void Trace(const char* text) {
  QELFpaViewerCmdsTrace().TraPrint(text);
}
}  // namespace

QELFpaNodeOrganizeCmd::QELFpaNodeOrganizeCmd() : VORStateCommand("QELFpaNodeOrganizeCmd", 64, 0) {
  Trace(" \n  QELFpaNodeOrganizeCmd::Constructor -->");
  Trace(" \n  QELFpaNodeOrganizeCmd::Constructor <--");
}

QELFpaNodeOrganizeCmd::~QELFpaNodeOrganizeCmd() {
  Trace(" \n  QELFpaNodeOrganizeCmd::Destructor -->");
  if (_organiser != nullptr) {
    _organiser->RequestDelayedDestruction();
    _organiser = nullptr;
  }
  delete _collapsedNodes;
  _collapsedNodes = nullptr;
  Trace(" \n  QELFpaNodeOrganizeCmd::Destructor <--");
}

VORString QELFpaNodeOrganizeCmd::GetResourceFilename(int) const {
  return VORDialogAgent::DefaultResourceFilename();
}

void QELFpaNodeOrganizeCmd::BuildGraph() {
  Trace(" \n  QELFpaNodeOrganizeCmd::BuildGraph -->");
  VORDialogState* state = GetInitialState("Default node positions");
  AddTransition(state, nullptr, VORCondition{},
                Action(this, &QELFpaNodeOrganizeCmd::ArrangeNodesInViewer));
  SetRepeatMode(false);
}

bool QELFpaNodeOrganizeCmd::ArrangeNodesInViewer(void*) {
  Trace(" \n  QELFpaNodeOrganizeCmd::ArrangeNodesInViewer -->");
  VORFrmLayout* layout = VORFrmLayout::GetCurrentLayout();
  if (layout == nullptr)
    return false;
  VORFrmWindow* window = layout->GetCurrentWindow();
  if (window == nullptr || !window->IsAKindOf(QELFpaProductFlowViewer::ClassName()))
    return true;
  auto* viewer = static_cast<QELFpaProductFlowViewer*>(window);
  VORBaseUnknown_var root = viewer->GetRootNode();
  QELPertController* controller = nullptr;
  if (QELIPertWindow_var pertWindow(static_cast<VORFrmWindow*>(viewer)); pertWindow)
    controller = pertWindow->GetPertController();
  auto* traverser = new QELPertNodeTraverser(controller);

  if (root && controller != nullptr) {
    if (_organiser != nullptr)
      _organiser->RequestDelayedDestruction();
    _organiser = new QELPFVNodeOrganiser();
    if (VORIGENode_var rootNode(root); rootNode) {
      VORListValVORBaseUnknown_var* children = nullptr;
      if (SUCCEEDED(rootNode->GetChildren(children)) && children != nullptr && children->Size() > 0)
        CollapseAnySuperNodeIfExpanded(children, traverser);
      delete children;
      _organiser->ArrangeNodes(root, controller);
      ExpandAndOrganiseChildActivities(_collapsedNodes, traverser);
    }
  }
  traverser->RequestDelayedDestruction();
  return true;
}

void QELFpaNodeOrganizeCmd::CollapseAnySuperNodeIfExpanded(VORListValVORBaseUnknown_var* nodes,
                                                           QELPertNodeTraverser* traverser) {
  Trace(" \n  QELFpaNodeOrganizeCmd::CollapseAnySuperNodeIfExpanded -->");
  if (nodes == nullptr || traverser == nullptr)
    return;
  if (_collapsedNodes == nullptr)
    _collapsedNodes = new VORListValVORBaseUnknown_var;
  _collapsedNodes->RemoveAll();
  for (VORBaseUnknown_var& node : *nodes) {
    QELIPertNodeExt_var ext(node);
    if (!ext || ext->GetState(1) != PertNodeExpanded)
      continue;
    VORIGENode_var graphNode(node);
    traverser->HideChildrenNodes(graphNode);
    traverser->SetModelNode(graphNode);
    traverser->ChangePertNodeShape(PertNodeCollapsed);
    _collapsedNodes->Append(node);
  }
}

void QELFpaNodeOrganizeCmd::ExpandAndOrganiseChildActivities(VORListValVORBaseUnknown_var* nodes,
                                                             QELPertNodeTraverser* traverser) {
  Trace(" \n  QELFpaNodeOrganizeCmd::ExpandAndOrganiseChildActivities -->");
  if (nodes == nullptr || traverser == nullptr || nodes->Size() == 0)
    return;
  for (VORBaseUnknown_var& node : *nodes) {
    QELIPertNodeExt_var ext(node);
    if (!ext || ext->GetState(1) != PertNodeCollapsed)
      continue;
    VORIGENode_var graphNode(node);
    traverser->ShowChildrenNodes(graphNode);
    traverser->SetModelNode(graphNode);
    traverser->ChangePertNodeShape(PertNodeExpanded);
  }
}

VOR_EXPORT_COMMAND_FACTORY_NOARG(QELFpaNodeOrganizeCmd)
