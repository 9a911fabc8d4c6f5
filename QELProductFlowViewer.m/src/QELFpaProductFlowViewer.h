// The Product Flow Viewer window: one level of the process tree (the children of its root
// activity) as a PERT chart in a QELPertViewer, drawn by a QELPertController. One per editor;
// levels change in place (SetPertLevel). Answers QELIPertWindow (a data extension on the
// window's late type that hands out the controller).
#pragma once

#include "QELPertController.h"
#include "QELPertViewer.h"
#include "VOR2DRep.h"
#include "VORFrmWindow.h"
#include "VORIGENode.h"
#include "VORIProduct.h"
#include "VORLists.h"
#include "VORVisManager.h"

class QELFpaProductFlowViewer : public VORFrmWindow {
  VOR_DECLARE_CLASS(QELFpaProductFlowViewer, VORFrmWindow)
 public:
  // Joins the current layout, which takes the creator's reference.
  QELFpaProductFlowViewer(const VORString& name, VORFrmEditor* editor,
                          VORBaseUnknown_var& rootActivity);
  // Registers the window's extensions (QELIPertWindow); called by the module's initialisation.
  static void RegisterExtensions();

  VORBaseUnknown_var GetRootNode() const { return _rootNode; }
  void GetPertLevel(VORBaseUnknown_var& out) const { out = _rootNode; }
  QELPertController* GetPertController() const { return _controller; }
  QELPertViewer* GetPertViewer() const { return _viewer.get(); }

  // Shows the children of newRoot instead (the same root rebuilds the chart); the child whose
  // object is excluded stays out. The third argument is accepted and ignored.
  void SetPertLevel(VORBaseUnknown_var& newRoot, VORBaseUnknown* excluded, bool);

  // Builds the title "<file>\<level path><WindowTitle>" and shows it shortened to the width.
  void SetPFWindowName(const VORIGENode_var& node);
  void SetPertWindowName(const VORIGENode_var& node) { SetPFWindowName(node); }
  // The full title (the displayed one may be shortened).
  const VORUnicodeString& GetWindowTitle() const { return _windowTitle; }

  // A new list (the caller deletes it) of the children of parent that are graph nodes.
  VORListValVORBaseUnknown_var* GetProductFlowViewerNodes(VORBaseUnknown_var& parent);
  // Appends the nodes waiting to be placed to *ioList (nothing when either list is null): the
  // nodes that had never been placed in a chart when the window opened.
  void NodesForReArrangement(VORListValVORBaseUnknown_var*& ioList);

  void DeleteWindow() override;

  VORBaseUnknown_var GetChartRoot() const override { return _rootNode; }

  // Context-menu items of the chart (used by the model synchronisation).
  static void AddCenterGraph(VORNotification* notification);
  static void AddPreviewWindowItem(VORNotification* notification);

 protected:
  ~QELFpaProductFlowViewer() override;

 private:
  void UpdateGraph(VORBaseUnknown_var& root, VORBaseUnknown* excluded);
  void AttachZitBlts(VORBaseUnknown_var& node);
  void AttachZitBlt(VORBaseUnknown_var& node);
  void RemoveZitBlts(VORBaseUnknown_var& node);
  void RemoveZitBlt(VORBaseUnknown_var& node);
  void DeletePertNodes(VORBaseUnknown_var& node);
  void ResetPertNodeStates(VORBaseUnknown_var& node);
  void GetDisplayName(VORUnicodeString& out);
  void SetViewpoint();
  void OnResize(VORCommand*, VORNotification*, void*);
  void ReleaseController();

  // Model synchronisation (QELFpaProductFlowViewerSync.cpp).
  void AddCallbacks();
  void RemoveCallbacks();
  void ContextCB(VORCommand*, VORNotification* notification, void*);
  // --- model synchronisation, continued (ZitBlt work; QELFpaProductFlowViewerSync.cpp) ---
  void AddCallBackOnRootProduct();
  void AddCallbackOnMA();
  void RemoveProductStructureCB();
  void RemoveCammBackOnMA();
  void ONPertNodeModification(VORCommand*, VORNotification* notification, void*);
  void OnMAModifiedNotification(VORCommand*, VORNotification* notification, void*);
  void OnProductModification(VORCommand*, VORNotification* notification, void*);
  void FollowChildChange(VORNotification* notification);
  void GetInverslyLinkedActs(VORListValVORBaseUnknown_var& out, const VORBaseUnknown_var& assembly);
  void GetAllParentActivities(VORListValVORBaseUnknown_var& acts,
                              VORListValVORBaseUnknown_var& out);
  void ContextMenuFor3DWindow(VORNotification* notification);
  void GetSelectedElement(VORBaseUnknown_var& out);
  VORCallbackId _pertNodeCallback = 0;
  VORCallbackId _rootProductCallback = 0;
  int _maCallback = -1;
  VORHandle<VOREventPublisher> _maPublisher;
  // --- end of the model synchronisation declarations ---

  VORHandle<QELPertViewer> _viewer;
  VORDlgFrame* _windowFrame = nullptr;
  VORVisManager* _vismanager = nullptr;
  VOR2DViewpoint* _viewpoint = nullptr;
  VORBaseUnknown_var _rootNode;
  VOR2DRep_var _grid;
  VORUnicodeString _windowTitle;
  // Callback bookkeeping of the model synchronisation.
  int _callbackCount = 0;
  int _callbackState = 0;
  void* _callbackData = nullptr;
  QELPertController* _controller = nullptr;
  VORIProduct_var _rootProduct;
  VORListValVORBaseUnknown_var* _nodesForReArrangement = nullptr;
  VORCallbackId _contextCallback = 0;
  VORCallbackId _resizeCallback = 0;
};
