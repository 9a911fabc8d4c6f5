// Lays out one chart level of the Product Flow Viewer: a level per child node from the
// precedence flows (longest path), an order within each level, a column per level over a
// square chart area, positions snapped to the grid, written into the nodes and announced.
// Flows that meet again through a longer path count as cyclic: nothing moves and a warning
// names the activity. One organiser serves one call of an entry point; released with deferred
// destruction.
#pragma once

#include "QELIPertNode.h"
#include "QELPertController.h"
#include "QELPertNotifications.h"
#include "VORIModelEvents.h"
#include "VORCommand.h"
#include <vector>

#include "VORLists.h"

class QELPFVNodeOrganiser : public VORCommand {
  VOR_DECLARE_CLASS(QELPFVNodeOrganiser, VORCommand)
 public:
  QELPFVNodeOrganiser();

  // Lays out every child of root. False for a null root or controller, or a controller
  // without viewer; true otherwise (also when nothing could be laid out).
  bool ArrangeNodes(VORBaseUnknown_var root, QELPertController* controller);
  // Places the nodes of newNodes and everything downstream of them where a full layout would
  // put them; other nodes keep their positions. False for a null root, controller or list, or a
  // controller without viewer.
  bool PositionNewNode(VORBaseUnknown_var root, VORListValVORBaseUnknown_var*& newNodes,
                       QELPertController* controller);
  // Appends node and, recursively, its successors to ioList (duplicates kept, no cycle guard).
  void GetActListForPosChange(VORBaseUnknown_var& node, VORListValVORBaseUnknown_var*& ioList);

  // Inspection after an entry point ran.
  bool IsCyclic() const { return _cyclic != 0; }
  const VORUnicodeString& GetCyclicActivityName() const { return _cyclicActivityName; }
  // Level list k (1-based) holds the nodes of level k - 1 in their final order; not owned.
  const VORListPtrVORListValVORBaseUnknown_var* GetLevelLists() const { return _levelLists; }

 protected:
  ~QELPFVNodeOrganiser() override;

 private:
  // Steps 1 to 5 shared by both entry points: false when the caller stops there.
  bool ComputeLevels(VORBaseUnknown_var& root);
  void InitialisePosList(int count);
  void GenerateNodeIndexes();
  void ArrangeActAsPerLevel();
  void CreateListOfLists();
  void ArrangeNextActsWithRespectToCurrActs();
  void GetViewerOrSuperNodeSize(float* width, float* height);
  void DispatchNotif(VORBaseUnknown_var node);
  void DisplayCyclicWarningDialog();
  void SetNodePosition(VORBaseUnknown_var& node, const QELIPertNode_var& pertNode, double x,
                       double y);
  // DispatchNotif with the node's QELIPertNode already at hand.
  void Announce(VORBaseUnknown_var& node, const QELIPertNode_var& pertNode);
  // SetNodePosition and Announce for a node the chart shows, through the interfaces the chart
  // holds; false, and nothing done, for a node it does not show.
  bool MoveThroughChart(VORBaseUnknown_var& node, double x, double y);
  template <class Moves>
  void PlaceColumn(VORListValVORBaseUnknown_var& list, double& x, double& y, float yStep,
                   Moves moves);
  // The position notification on the reference object's model events.
  void NotifyMove(VORBaseUnknown_var& node, const VORBaseUnknown_var& reference, double x,
                  double y);

  // The children, sorted by level once laid out; the handles of the later levels then live in
  // their level lists only.
  VORListValVORBaseUnknown_var* _childNodeList = nullptr;
  VORRawCollint* _levelList;
  VORRawCollint* _visitedList;
  int _cyclic = 0;
  VORUnicodeString _cyclicActivityName;
  VORListPtrVORListValVORBaseUnknown_var* _levelLists;
  QELPertController* _controller = nullptr;

  // Successor indexes (0-based) per child and the sorted order of the children, shared by the
  // steps; computed once per entry point.
  std::vector<std::vector<int>> _successors;
  std::vector<int> _order;
  // The model events of the last reference object announced to.
  VORBaseUnknown* _eventsOf = nullptr;
  VORIModelEvents_var _events;
  QELPertNotifySlot<QELPertPositionNotify> _moved;
};

// For programs that load the module by name (VORModuleLoader::FindSymbol): lays out the
// children of root in controller's chart with a fresh organiser. 0 when laid out, 1 when the
// flows are cyclic (nothing moved), -1 for bad arguments.
extern "C" int QELPFVArrangeChart(VORBaseUnknown* root, QELPertController* controller);
