// Walks a controller's super nodes: shows or hides the inner chart of a node and changes its
// shape (state) for expanded or collapsed. Released with deferred destruction.
#pragma once

#include "QELPertParameters.h"
#include "VORCommand.h"
#include "VORIGENode.h"

class QELPertController;

class QELPertNodeTraverser : public VORCommand {
  VOR_DECLARE_CLASS(QELPertNodeTraverser, VORCommand)
 public:
  // The controller is not held (it outlives the traverser); null gives a traverser that does
  // nothing and answers E_FAIL.
  explicit QELPertNodeTraverser(QELPertController* controller);

  // Takes the inner nodes of node out of the chart (each announced with remove flag 1); the
  // node state is left as it is.
  HRESULT HideChildrenNodes(VORIGENode_var& node);
  // Draws the inner chart of node inside its box (each inner node announced).
  HRESULT ShowChildrenNodes(VORIGENode_var& node);
  // The node ChangePertNodeShape acts on.
  void SetModelNode(VORIGENode_var node) { _model = node; }
  VORIGENode_var GetModelNode() const { return _model; }
  // Stores the state in the document and redraws the node's box for it.
  HRESULT ChangePertNodeShape(PertNodeState state);

 protected:
  ~QELPertNodeTraverser() override = default;

 private:
  QELPertController* _controller;
  VORIGENode_var _model;
};
