// Draws one level of the process tree into a viewer: one node box with its label per child
// graph node of the window root, orthogonal arrows for the precedence flows between sibling
// boxes, and the inner charts of expanded super nodes inside their enlarged boxes. Every node
// it adds is announced with a QELPertAppInfoNotify (remove flag 0) on the root's model events,
// every node taken out of the chart with remove flag 1; dragging a box moves the node and
// dispatches QELPertPositionNotify there (during the drag and, snapped, at its end).
#pragma once

#include <list>
#include <memory>
#include <memory_resource>
#include <vector>

#include <absl/container/flat_hash_map.h>

#include "QELPertInlineList.h"
#include "QELPertNotifications.h"
#include "QELPertParameters.h"
#include "VOR2DBagRep.h"
#include "VOR2DCustomRep.h"
#include "VOR2DManipulator.h"
#include "VORCommand.h"
#include "VORIGENode.h"
#include "VORIGraphNodeLayout.h"
#include "VORIModelEvents.h"
#include "VORISPPFlowMgt.h"
#include "VORViewer.h"

class VORFrmWindow;
class QELEPertNodeExt;

class VOR2DTextRep;

class QELPertController : public VORCommand {
  VOR_DECLARE_CLASS(QELPertController, VORCommand)
 public:
  // window: the frame window that shows the chart (not held, may be null). viewer: not held,
  // must outlive the controller. editable: nodes can be dragged (with ViewerMode 1). extra is
  // accepted for the module's calls.
  QELPertController(VORFrmWindow* window, const VORBaseUnknown_var& root, VORViewer* viewer,
                    ViewerName name, ViewerMode mode, bool editable, VORBaseUnknown_var extra);

  VORViewer* GetViewer() const { return _viewer.get(); }
  VORFrmWindow* GetWindow() const { return _window; }
  VORBaseUnknown_var GetWindowRootNode() const { return _root; }
  // A new root: the chart must be empty (RemoveAllPertNodes) or it is emptied first.
  void SetWindowRootNode(VORBaseUnknown* root, VORBaseUnknown_var extra);

  // Adds the node box of a child graph node of the root (with the inner chart when the node is
  // an expanded super node) and its links to the boxes already there. S_FALSE when the node is
  // already drawn, E_INVALIDARG when it is no graph node.
  HRESULT AddChildNode(VORBaseUnknown_var& node);
  // Takes one node (and its inner chart) out of the chart.
  HRESULT RemoveChildNode(VORBaseUnknown_var& node);
  // Moves the node's box to its current position (QELIPertNodeExt) and redraws its links;
  // redraw asks the viewer to repaint.
  HRESULT RefreshNodePositionInPert(VORBaseUnknown_var& node, bool redraw);
  // For layouts: writes the node's position as QELIPertNode::SetPosition and
  // QELIPertNodeExt::SetPosition do, then moves its box as RefreshNodePositionInPert does, with
  // the interfaces the chart asked for when it drew the node. reference receives the object
  // whose model events hear of the node's moves (as QELIPertPosition::GetReferenceObject
  // answers; null when the chart does not know it). E_FAIL, and nothing is written, when the
  // node is not in the chart.
  HRESULT MoveNodeTo(VORBaseUnknown_var& node, double x, double y, bool redraw,
                     VORBaseUnknown*& reference);
  // For layouts that move many nodes: starts fetching the chart's entry of a node about to be
  // moved, so that finding it then does not wait on memory. Changes nothing.
  void PrefetchNode(VORBaseUnknown* node) const { _nodeIndex.prefetch(node); }
  void RemoveAllPertNodes();
  // Drops the node manipulator's subscriptions (before the controller is destroyed).
  void RemoveNodeManipCmdCB();
  // Rebuilds every link of the chart from the flows in the model.
  void RefreshLinks();

  // Between BeginMoves and EndMoves (calls nest), a node move marks its links and the repaint
  // as due instead of doing them: EndMoves rebuilds each marked link once, however many of its
  // ends moved, and asks for one repaint. For layouts that move every node of a level.
  void BeginMoves();
  void EndMoves();
  // Links rebuilt since the controller was made: what moves cost, for fan-out tests.
  unsigned long GetLinkRebuildCount() const { return _linkRebuilds; }

  // Super nodes (used by QELPertNodeTraverser).
  HRESULT ShowInnerNodes(VORBaseUnknown* superNode);
  HRESULT HideInnerNodes(VORBaseUnknown* superNode);
  // Rebuilds the node's box for its current state (enlarged when expanded).
  HRESULT UpdateNodeShape(VORBaseUnknown* node);

  // Inspection.
  bool IsInChart(VORBaseUnknown* node) const;
  VOR2DBagRep* GetNodeRep(VORBaseUnknown* node) const;
  int GetNodeCount() const { return static_cast<int>(_nodes.size()); }
  int GetLinkCount() const;
  VOR2DBagRep* GetChartRep() const { return _chart; }
  VORManipulator* GetNodeManipulator() const { return _manipulator; }

 protected:
  ~QELPertController() override;

 private:
  struct Level;
  struct Link;
  struct Node {
    VORBaseUnknown_var object;
    // The node's interfaces, asked once: casts are the dear part of drawing a node.
    VORIGENode_var graph;
    VORIGraphNodeLayout_var layout;
    VORISPPFlowMgt_var flow;
    QELEPertNodeExt* ext = nullptr;  // data extension: lives as long as the object
    VOR2DBagRep_var bag;
    Level* level = nullptr;        // the level the node is drawn in
    std::unique_ptr<Level> inner;  // set while the inner chart is shown
    QELPertInlineList<Link*, 2> links;
    double x = 0.0;  // chart position
    double y = 0.0;
    double w = 0.0;
    double h = 0.0;
    // The node's model events, followed for position changes made elsewhere (undo, redo).
    VORHandle<VOREventPublisher> events;
    VORCallbackId moved = 0;
  };
  struct Link {
    Node* from = nullptr;
    Node* to = nullptr;
    VOR2DCustomRep_var rep;
    bool due = false;  // in _dueLinks: to be rebuilt at EndMoves
  };
  struct Level {
    explicit Level(std::pmr::memory_resource* pool) : linkList(pool) {}
    VORBaseUnknown* owner = nullptr;  // root or super node (not held)
    Node* ownerNode = nullptr;        // null for the root level
    VOR2DBagRep_var links;
    VOR2DBagRep_var nodes;
    std::vector<Node*> members;
    std::pmr::list<Link> linkList;  // links never move once made
  };

  Node* Find(VORBaseUnknown* node) const;
  Node* AddNode(VORBaseUnknown* object, Level* level);
  void RemoveNode(Node* node, bool announce);
  void AddLinksOf(Node* node);
  void UpdateLink(Link* link);
  // UpdateLink now, or at EndMoves while moves are batched.
  void RefreshLink(Link* link);
  void ForgetDueLink(Link* link);
  void BuildShape(Node* node);
  void PlaceNode(Node* node);
  static void FitLabel(VOR2DTextRep& label, const VORUnicodeString& text, double boxWidth,
                       double boxHeight);
  void PlaceInnerNodes(Node* node);
  void ReadPosition(Node* node);
  void Refresh(Node* node, bool redraw);
  void ShiftInner(Node* node, double dx, double dy);
  void ResizeOwners(Node* node);
  void Announce(VORBaseUnknown* node, int removeRep);
  void DispatchPosition(Node* node);
  void OnManipulate(VORNotification* notification);
  void OnEndManipulate(VORNotification* notification);
  void FollowModel(Node* node);
  void UnfollowModel(Node* node);
  void OnModelMoved(Node* node);
  Node* DraggedNode() const;
  void ClearChart();

  VORFrmWindow* _window;
  VORViewer_var _viewer;  // held: the chart rep must be taken out of it at the end
  VORBaseUnknown_var _root;
  VORIModelEvents_var _rootEvents;
  QELPertNotifySlot<QELPertAppInfoNotify> _announced;
  ViewerName _name;
  ViewerMode _mode;
  bool _editable;
  VOR2DBagRep_var _chart;
  // Nodes and links are drawn from a pool: a chart of many nodes makes few heap blocks.
  std::pmr::unsynchronized_pool_resource _pool;
  std::unique_ptr<Level> _top;
  // Nodes in the order they were added (entries never move), found through a flat index: a
  // lookup per moved node costs one or two cache misses on a level of many thousands, where a
  // node-based map chased a chain of entries.
  std::pmr::list<Node> _nodes{&_pool};
  absl::flat_hash_map<VORBaseUnknown*, std::pmr::list<Node>::iterator> _nodeIndex;
  VOR2DManipulator_var _manipulator;
  double _dragStartX = 0.0;
  double _dragStartY = 0.0;
  int _moveBatches = 0;
  std::vector<Link*> _dueLinks;
  bool _drawDue = false;
  unsigned long _linkRebuilds = 0;
  VORUnicodeString _label;  // BuildShape's label text
};
