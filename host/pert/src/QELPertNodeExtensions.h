// The graph editor's node extensions: the data extension behind QELIPertNodeExt, seen by the
// rest of the graph editor, and their registration.
#pragma once

#include <utility>

#include "QELIPertNodeExt.h"
#include "VORIGraphNodeLayout.h"
#include "VORExtension.h"

class QELEPertNodeExt : public VORExtension, public QELIPertNodeExt {
  VOR_DECLARE_CLASS(QELEPertNodeExt, VORExtension)
 public:
  QELEPertNodeExt() = default;

  HRESULT GetPosition(double& x, double& y, GE_POSITION_INDEX index = 1) override;
  HRESULT SetPosition(double x, double y, GE_POSITION_INDEX index = 1) override;
  bool HasPosition() override { return _hasPosition; }
  void ResetPosition() override { _hasPosition = false; }
  int GetState(int query = 1) override;
  HRESULT SetState(int state) override;
  bool GetHiddenFlag() override { return _hidden; }

  // Graph-editor internals.
  bool HasProvisionalPosition() const { return _hasProvisional; }
  void GetProvisionalPosition(double& x, double& y) const {
    x = _px;
    y = _py;
  }
  void SetProvisionalPosition(double x, double y) {
    _px = x;
    _py = y;
    _hasProvisional = true;
  }
  void SetHiddenFlag(bool hidden) { _hidden = hidden; }
  // The chart root that shows the node; not held (a chart root outlives the nodes it shows,
  // and the controller clears it when it lets the node go).
  VORBaseUnknown* GetReference() const { return _reference; }
  void SetReference(VORBaseUnknown* reference) { _reference = reference; }
  // Size of the box the controller drew (0 when not drawn).
  void SetDrawnSize(double w, double h) {
    _drawnW = w;
    _drawnH = h;
  }
  void GetDrawnSize(double& w, double& h) const {
    w = _drawnW;
    h = _drawnH;
  }

  // The extension of node (created on first use); null for objects that are no graph nodes.
  static QELEPertNodeExt* Of(VORBaseUnknown* node);

  // True the first time only: whether a chart is the first to ask for this node.
  bool FirstAsked() { return !std::exchange(_asked, true); }

 private:
  bool _hasPosition = false;
  double _x = 0.0;
  double _y = 0.0;
  bool _hasProvisional = false;
  double _px = 0.0;
  double _py = 0.0;
  bool _hidden = false;
  VORBaseUnknown* _reference = nullptr;
  double _drawnW = 0.0;
  double _drawnH = 0.0;
  bool _asked = false;
};

// What QELIPertNode::SetPosition does with index 1, for callers that hold the node's extension
// and layout already: the working copy first (a chart that hears of the document change then
// knows it made it, see QELPertController::OnModelMoved), then one door change when the stored
// position really changes. E_FAIL without a layout.
HRESULT QELPertWritePosition(QELEPertNodeExt& ext, VORIGraphNodeLayout* layout, double x, double y);

// Registers QELIPertNodeExt, QELIPertNode and QELIPertPosition on graph nodes (VORInitPert).
void QELPertRegisterNodeExtensions();
