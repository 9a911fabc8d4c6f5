// Opens the Product Flow Viewer on a picked process activity: refuses while the document's
// classic PERT chart is open, switches an open viewer of the same document to the picked
// level, else opens a viewer, lays its nodes out and registers the chart with the root process.
#pragma once

#include "QELPFVNodeOrganiser.h"
#include "VORPathElementAgent.h"
#include "VORStateCommand.h"

class QELFpaProductFlowViewerCmd : public VORStateCommand {
  VOR_DECLARE_CLASS(QELFpaProductFlowViewerCmd, VORStateCommand)
 public:
  QELFpaProductFlowViewerCmd();

  void BuildGraph() override;
  // The agent's filter: activities that are graph nodes.
  bool IsValidActivity(VORDialogAgent* agent, void* data);
  virtual bool CreateProductFlowViewer(void* data);
  VORString GetResourceFilename(int index = 0) const override;

 protected:
  ~QELFpaProductFlowViewerCmd() override;

 private:
  VORPathElementAgent* _selectionAgent = nullptr;
  QELPFVNodeOrganiser* _organiser = nullptr;
};
