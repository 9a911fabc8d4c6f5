// Restores the default node positions of the chart in the current Product Flow Viewer: expanded
// super nodes are collapsed for the layout and expanded again afterwards.
#pragma once

#include "QELPFVNodeOrganiser.h"
#include "QELPertNodeTraverser.h"
#include "VORStateCommand.h"

class QELFpaNodeOrganizeCmd : public VORStateCommand {
  VOR_DECLARE_CLASS(QELFpaNodeOrganizeCmd, VORStateCommand)
 public:
  QELFpaNodeOrganizeCmd();

  void BuildGraph() override;
  bool ArrangeNodesInViewer(void* data);
  VORString GetResourceFilename(int index = 0) const override;

 protected:
  ~QELFpaNodeOrganizeCmd() override;

 private:
  void CollapseAnySuperNodeIfExpanded(VORListValVORBaseUnknown_var* nodes,
                                      QELPertNodeTraverser* traverser);
  void ExpandAndOrganiseChildActivities(VORListValVORBaseUnknown_var* nodes,
                                        QELPertNodeTraverser* traverser);

  QELPFVNodeOrganiser* _organiser = nullptr;
  VORListValVORBaseUnknown_var* _collapsedNodes = nullptr;
};
