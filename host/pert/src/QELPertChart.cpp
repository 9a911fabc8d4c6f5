#include "QELPertChart.h"

#include "QELFpaPertServices.h"
#include "VORIGENode.h"

QELPertController* QELPertBuildChart(const VORBaseUnknown_var& root, VORViewer* viewer,
                                     ViewerMode mode) {
  VORIGENode_var rootNode(root);
  VORListValVORBaseUnknown_var* children = nullptr;
  if (!rootNode || FAILED(rootNode->GetChildren(children)) || children == nullptr) {
    delete children;
    return nullptr;
  }
  auto* controller = new QELPertController(nullptr, root, viewer, PertViewerProductFlow, mode,
                                           mode == PertModeEditable, NULL_var);
  for (VORBaseUnknown_var& child : *children) {
    VORIGENode_var node(child);
    if (!node)
      continue;
    QELFpaPertBaseServices::InitNodePosition(node);
    controller->AddChildNode(child);
    controller->RefreshNodePositionInPert(child, false);
  }
  delete children;
  return controller;
}
