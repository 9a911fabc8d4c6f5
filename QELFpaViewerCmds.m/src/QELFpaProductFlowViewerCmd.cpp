#include "QELFpaProductFlowViewerCmd.h"

#include "QELFpaProductFlowViewer.h"
#include "QELFpaViewerCmdsTrace.h"
#include "QELIFPAAdapters.h"
#include "QELIPertWindow.h"
#include "VORApplicationFrame.h"
#include "VORAssert.h"
#include "VORCommandHeader.h"
#include "VORDlgNotify.h"
#include "VORDlgStyles.h"
#include "VORFrmWindowKinds.h"
#include "VORIGENode.h"
#include "VORISPPAbstractActivity.h"
#include "VORISPPActivity.h"
#include "VORISPPActivityRoot.h"

namespace {
void Trace(const char* text) {
  QELFpaViewerCmdsTrace().TraPrint(text);
}
}  // namespace

QELFpaProductFlowViewerCmd::QELFpaProductFlowViewerCmd()
    : VORStateCommand("QELFpaProductFlowViewerCmd", 64, 0) {}

QELFpaProductFlowViewerCmd::~QELFpaProductFlowViewerCmd() {
  if (_selectionAgent != nullptr) {
    _selectionAgent->RequestDelayedDestruction();
    _selectionAgent = nullptr;
  }
  if (_organiser != nullptr) {
    _organiser->RequestDelayedDestruction();
    _organiser = nullptr;
  }
}

VORString QELFpaProductFlowViewerCmd::GetResourceFilename(int) const {
  return VORDialogAgent::DefaultResourceFilename();
}

void QELFpaProductFlowViewerCmd::BuildGraph() {
  Trace(" \n  QELFpaProductFlowViewerCmd::BuildGraph -->");
  _selectionAgent = new VORPathElementAgent("Activity");
  _selectionAgent->SetElementType<VORISPPAbstractActivity>();
  _selectionAgent->AddCSOClient(this);
  _selectionAgent->SetBehavior(VORAgentBehavior::SinglePick);
  _selectionAgent->SetFilter(VORMethodFilter(this, &QELFpaProductFlowViewerCmd::IsValidActivity));
  VORDialogState* select = GetInitialState("SelectActivity");
  select->AddDialogAgent(_selectionAgent);
  AddTransition(select, nullptr, IsOutputSetCondition(_selectionAgent),
                Action(this, &QELFpaProductFlowViewerCmd::CreateProductFlowViewer));
  SetRepeatMode(false);
}

bool QELFpaProductFlowViewerCmd::IsValidActivity(VORDialogAgent* agent, void*) {
  if (agent == nullptr)
    return false;
  VORISPPActivity_var activity(agent->GetValue());
  VORIGENode_var node(activity);
  return node != NULL_var;
}

bool QELFpaProductFlowViewerCmd::CreateProductFlowViewer(void*) {
  Trace(" \n  QELFpaProductFlowViewerCmd::CreateProductFlowViewer -->");
  if (_selectionAgent == nullptr)
    return false;
  VORISPPActivity_var activity(_selectionAgent->GetValue());
  if (!activity)
    return false;
  VORBaseUnknown_var picked(activity);
  if (!picked)
    return false;

  VORFrmLayout* layout = VORFrmLayout::GetCurrentLayout();
  VORFrmEditor* editor = VORFrmEditor::GetCurrentEditor();
  if (layout == nullptr || editor == nullptr)
    return false;

  for (VORFrmWindow* window : layout->GetWindowList()) {
    if (window->IsAKindOf(QELFpaProductFlowViewer::ClassName()) && window->GetEditor() == editor) {
      auto* viewer = static_cast<QELFpaProductFlowViewer*>(window);
      VORBaseUnknown_var root = viewer->GetRootNode();
      if (!root)
        continue;
      if (root != picked) {
        viewer->SetPertLevel(picked, nullptr, false);
        return true;
      }
      layout->ActivateWindow(window);
      Trace(" \n  Window already exists for current Level");
      return true;
    }
    if (window->IsAKindOf(QELFpaPertChartWindow::ClassName()) && window->GetEditor() == editor) {
      VORApplicationFrame* frame = VORApplicationFrame::GetApplicationFrame();
      auto* notify =
          new VORDlgNotify(frame->GetMainWindow(), "Unexpected", VORDlgNfyError | VORDlgNfyOK);
      notify->DisplayBlocked("Please Close the PERT Chart and Try.", "Error");
      notify->RequestDelayedDestruction();
      return true;
    }
  }

  Trace("Creating the Product Flow Window");
  VORUnicodeString label;
  activity->GetName(label);
  const VORString name(label);

  VORBaseUnknown_var hRootProcess;
  if (VORISPPActivityRoot_var(picked))
    hRootProcess = picked;
  else
    activity->GetRootActivity(hRootProcess);
  VOR_ASSERT_AT(NULL_var != hRootProcess, "QELFpaViewerCmds.m/src/QELFpaProductFlowViewerCmd", 269);

  // The layout holds the window.
  auto* window = new QELFpaProductFlowViewer(name + "Product Flow Viewer", editor, picked);
  VORBaseUnknown_var root = window->GetRootNode();
  QELPertController* controller = nullptr;
  if (QELIPertWindow_var pertWindow(static_cast<VORFrmWindow*>(window)); pertWindow)
    controller = pertWindow->GetPertController();
  VORListValVORBaseUnknown_var* nodes = root ? window->GetProductFlowViewerNodes(root) : nullptr;
  auto* reArrangement = new VORListValVORBaseUnknown_var;
  window->NodesForReArrangement(reArrangement);

  if (root) {
    _organiser = new QELPFVNodeOrganiser();
    if (reArrangement != nullptr && nodes != nullptr && controller != nullptr) {
      if (nodes->Size() == reArrangement->Size())
        _organiser->ArrangeNodes(root, controller);
      else if (reArrangement->Size() > 0)
        _organiser->PositionNewNode(root, reArrangement, controller);
    }
  }
  delete reArrangement;
  delete nodes;

  QELIFPAAdapters_var adapters(hRootProcess);
  if (adapters) {
    QELFpaPertAdapter* adapter = nullptr;
    if (FAILED(adapters->CreatePertAdapter(adapter)) || adapter == nullptr) {
      Trace("ERROR: Could not create the PERT Adapter");
    } else {
      Trace("Created the PERT Adapter");
      adapters->SetPertAdapter(adapter);
      if (window->GetPertController() != nullptr)
        adapters->SetPertController(window->GetPertController());
      adapter->Release();
    }
  }
  Trace(" \n  Created Product FlowWindow <--");
  return true;
}

VOR_EXPORT_COMMAND_FACTORY_NOARG(QELFpaProductFlowViewerCmd)
