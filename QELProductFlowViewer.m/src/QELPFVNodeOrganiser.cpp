#include "QELPFVNodeOrganiser.h"

#include <algorithm>
#include <string>
#include <unordered_set>

#include <absl/container/flat_hash_map.h>

#include "QELIPertNodeExt.h"
#include "QELIPertPosition.h"
#include "QELPFVLayoutCore.h"
#include "QELPertClientVisuServices.h"
#include "QELPertNotifications.h"
#include "VORApplicationFrame.h"
#include "VORDlgNotify.h"
#include "VORDlgStyles.h"
#include "VOREnv.h"
#include "VORIGENode.h"
#include "VORIModelEvents.h"
#include "VORISPPActivity.h"
#include "VORISPPFlowMgt.h"
#include "VORMsgCatalog.h"
#include "VORTrace.h"

namespace {

const VORTrace& Trace() {
  static const VORTrace trace("QELProductFlowViewerTrace", 0, "STDERR", 1024);
  return trace;
}

constexpr const char* kCatalog = "QELFpaProductFlowViewer";

// How many lookups ahead a loop over a large level fetches its table entries.
constexpr size_t kFetchAhead = 8;

// Traced once per moved node: kept as a string rather than built from the literal each time.
const std::string& DispatchNotifLine() {
  static const std::string line = "QELPFVNodeOrganiser::DispatchNotif -->";
  return line;
}

// The chart rebuilds each link once when the layout is done, not once per moved end.
class MoveBatch {
 public:
  explicit MoveBatch(QELPertController* controller) : _controller(controller) {
    _controller->BeginMoves();
  }
  ~MoveBatch() { _controller->EndMoves(); }
  MoveBatch(const MoveBatch&) = delete;
  MoveBatch& operator=(const MoveBatch&) = delete;

 private:
  QELPertController* _controller;
};

}  // namespace

QELPFVNodeOrganiser::QELPFVNodeOrganiser()
    : VORCommand(nullptr, VORString()),
      _levelList(new VORRawCollint),
      _visitedList(new VORRawCollint),
      _levelLists(new VORListPtrVORListValVORBaseUnknown_var) {
  Trace().TraPrint("QELPFVNodeOrganiser::Constructor -->");
}

QELPFVNodeOrganiser::~QELPFVNodeOrganiser() {
  Trace().TraPrint("QELPFVNodeOrganiser::Destructor -->");
  _cyclic = 0;
  delete _childNodeList;
  delete _levelList;
  delete _visitedList;
  for (VORListValVORBaseUnknown_var* list : *_levelLists) {
    list->RemoveAll();
    delete list;
  }
  _levelLists->RemoveAll();
  delete _levelLists;
  _controller = nullptr;
}

void QELPFVNodeOrganiser::InitialisePosList(int count) {
  Trace().TraPrint("QELPFVNodeOrganiser::InitialisePosList -->");
  for (int i = 0; i < count; ++i) {
    _levelList->Append(0);
    _visitedList->Append(0);
  }
}

void QELPFVNodeOrganiser::GenerateNodeIndexes() {
  Trace().TraPrint("QELPFVNodeOrganiser::GenerateNodeIndexes -->");
  if (_childNodeList == nullptr || _childNodeList->Size() != _levelList->Size())
    return;
  const int n = _childNodeList->Size();
  const auto count = static_cast<size_t>(n);
  // The children and the far ends of their flows first, then the lookups: on a level far larger
  // than the cache every lookup misses it, and a lookup known in advance can be fetched ahead.
  std::vector<VORBaseUnknown*> identity(count);
  std::vector<VORBaseUnknown*> ends;
  ends.reserve(count * 2);
  std::vector<size_t> firstEnd(count + 1);
  for (size_t i = 0; i < count; ++i) {
    const VORBaseUnknown_var& child = (*_childNodeList)[static_cast<int>(i) + 1];
    identity[i] = child.Identity();
    firstEnd[i] = ends.size();
    if (VORISPPFlowMgt_var flows(child); flows)
      flows->ForEachNextActivity([&ends](VORBaseUnknown* s) { ends.push_back(s); });
  }
  firstEnd[count] = ends.size();
  // Index of each child (its first occurrence), by object identity.
  absl::flat_hash_map<VORBaseUnknown*, int> index;
  index.reserve(count);
  for (size_t i = 0; i < count; ++i) {
    if (i + kFetchAhead < count)
      index.prefetch(identity[i + kFetchAhead]);
    index.emplace(identity[i], static_cast<int>(i));
  }
  _successors.assign(count, {});
  for (size_t i = 0; i < count; ++i) {
    std::vector<int>& succ = _successors[i];
    for (size_t e = firstEnd[i]; e < firstEnd[i + 1]; ++e) {
      if (e + kFetchAhead < ends.size())
        index.prefetch(ends[e + kFetchAhead]);
      // A successor is usually handed over as its identity; asking for the identity touches
      // the successor. Live objects do not share addresses.
      auto it = index.find(ends[e]);
      if (it == index.end())
        it = index.find(ends[e]->GetIdentity());
      if (it != index.end())
        succ.push_back(it->second);
    }
  }
  // The walk itself (raising successors, reporting nodes met again) runs on the indexes.
  const QELPFVLayoutCore::Levels levels = QELPFVLayoutCore::ComputeLevels(_successors);
  for (int i = 1; i <= n; ++i)
    (*_levelList)[i] = levels.level[static_cast<size_t>(i - 1)];
  if (levels.cyclic) {
    _cyclic = 1;
    VORISPPActivity_var activity((*_childNodeList)[levels.cyclicIndex + 1]);
    if (activity)
      activity->GetName(_cyclicActivityName);
  }
}

void QELPFVNodeOrganiser::ArrangeActAsPerLevel() {
  Trace().TraPrint("QELPFVNodeOrganiser::ArrangeActAsPerLevel -->");
  const int n = _levelList->Size();
  if (_childNodeList == nullptr || n == 0 || _childNodeList->Size() != n)
    return;
  std::vector<int> level(static_cast<size_t>(n));
  for (int i = 1; i <= n; ++i)
    level[static_cast<size_t>(i - 1)] = (*_levelList)[i];
  // Sorted by level. The exchange sort would leave the higher levels in another order, but the
  // level lists rebuild those from the lowest level, which both sorts leave in child order; so
  // the organiser's results are the same, in linear time (the exchange sort's own order costs up
  // to n x levels swaps on lines stored lane by lane).
  _order = QELPFVLayoutCore::StableLevelOrder(level);
  // The handles move rather than being copied: a copy touches each object's reference count,
  // a cache miss per node once the level outgrows the cache.
  VORListValVORBaseUnknown_var sorted;
  sorted.Reserve(n);
  for (int p = 0; p < n; ++p) {
    const int from = _order[static_cast<size_t>(p)];
    sorted.Append(std::move((*_childNodeList)[from + 1]));
    (*_levelList)[p + 1] = level[static_cast<size_t>(from)];
  }
  std::swap(*_childNodeList, sorted);
}

void QELPFVNodeOrganiser::CreateListOfLists() {
  Trace().TraPrint("QELPFVNodeOrganiser::CreateListOfLists -->");
  const int n = _levelList->Size();
  if (_childNodeList == nullptr || n == 0)
    return;
  const int highest = (*_levelList)[n];
  int p = 1;
  for (int v = 0; v <= highest; ++v) {
    auto* list = new VORListValVORBaseUnknown_var;
    int end = p;
    while (end <= n && (*_levelList)[end] == v)
      ++end;
    list->Reserve(end - p);
    // Only the first level keeps this order: ArrangeNextActsWithRespectToCurrActs fills every
    // later list in its own order, so copying their handles here would only be undone.
    if (v == 0) {
      while (p < end)
        list->Append((*_childNodeList)[p++]);
    }
    p = end;
    _levelLists->Append(list);
  }
}

void QELPFVNodeOrganiser::ArrangeNextActsWithRespectToCurrActs() {
  Trace().TraPrint("QELPFVNodeOrganiser::ArrangeNextActsWithRespectToCurrActs -->");
  if (_levelLists->Size() < 2 || _order.empty())
    return;
  // Original (child-order) levels for the index computation.
  std::vector<int> level(_order.size());
  for (size_t p = 0; p < _order.size(); ++p)
    level[static_cast<size_t>(_order[p])] = (*_levelList)[static_cast<int>(p) + 1];
  const std::vector<std::vector<int>> lists =
      QELPFVLayoutCore::LevelLists(_successors, level, _order);
  // Handles by original index: the sorted child list holds child order[p] at p + 1.
  std::vector<VORBaseUnknown_var*> byIndex(_order.size());
  for (size_t p = 0; p < _order.size(); ++p)
    byIndex[static_cast<size_t>(_order[p])] = &(*_childNodeList)[static_cast<int>(p) + 1];
  // The later levels take their handles over from the child list: a copy would touch each
  // object's reference count, a cache miss per node on a large level. Each node is listed once.
  for (int k = 2; k <= _levelLists->Size(); ++k) {
    VORListValVORBaseUnknown_var* list = (*_levelLists)[k];
    list->RemoveAll();
    for (int node : lists[static_cast<size_t>(k - 1)])
      list->Append(std::move(*byIndex[static_cast<size_t>(node)]));
  }
}

void QELPFVNodeOrganiser::GetViewerOrSuperNodeSize(float* width, float* height) {
  Trace().TraPrint("QELPFVNodeOrganiser::GetViewerOrSuperNodeSize -->");
  const int n = _levelList->Size();
  if (n == 0)
    return;
  // The level list is sorted: the last entry is the highest level, equal levels are adjacent.
  const int highest = (*_levelList)[n];
  int widest = 0;
  for (int p = 1, run = 0; p <= n; ++p) {
    run = (p > 1 && (*_levelList)[p] == (*_levelList)[p - 1]) ? run + 1 : 1;
    widest = std::max(widest, run);
  }
  *width = static_cast<float>(highest * 50);
  *height = static_cast<float>(widest * 50);
  if (*width >= *height)
    *height = *width;
  else
    *width = *height;
}

bool QELPFVNodeOrganiser::ComputeLevels(VORBaseUnknown_var& root) {
  VORIGENode_var rootNode(root);
  if (!rootNode)
    return false;
  VORListValVORBaseUnknown_var* children = nullptr;
  if (FAILED(rootNode->GetChildren(children)) || children == nullptr || children->Size() == 0) {
    delete children;
    return false;
  }
  delete _childNodeList;
  _childNodeList = children;
  InitialisePosList(_childNodeList->Size());
  GenerateNodeIndexes();
  if (_cyclic != 0) {
    DisplayCyclicWarningDialog();
    return false;
  }
  ArrangeActAsPerLevel();
  CreateListOfLists();
  ArrangeNextActsWithRespectToCurrActs();
  return true;
}

void QELPFVNodeOrganiser::SetNodePosition(VORBaseUnknown_var& node,
                                          const QELIPertNode_var& pertNode, double x, double y) {
  pertNode->SetPosition(x, y, 1);
  if (QELIPertNodeExt_var ext(node); ext)
    ext->SetPosition(x, y, 1);
}

// One column, top down from (x, y): each node snapped, then the next one yStep lower. A node the
// chart shows moves through the chart, which holds its interfaces; a node moves() refuses keeps
// its place but still takes its slot.
template <class Moves>
void QELPFVNodeOrganiser::PlaceColumn(VORListValVORBaseUnknown_var& list, double& x, double& y,
                                      float yStep, Moves moves) {
  const QELIPertNode_var noNode;
  const int count = list.Size();
  for (int k = 1; k <= count; ++k) {
    // A move does enough for the next node's entry to arrive meanwhile, and not so much that
    // a farther one would still be in the cache when its turn comes.
    if (k < count && _controller != nullptr)
      _controller->PrefetchNode(list[k + 1].get());
    VORBaseUnknown_var& node = list[k];
    const bool move = moves(node);
    double snappedX = x;
    double snappedY = y;
    QELPertClientVisuServices::CalculateSnapPositionInPert(snappedX, snappedY, 1, noNode);
    if (move && MoveThroughChart(node, snappedX, snappedY)) {
      x = snappedX;
      y = snappedY + yStep;
      continue;
    }
    const QELIPertNode_var pertNode(node);
    if (!pertNode)
      continue;
    x = snappedX;
    y = snappedY;
    if (move) {
      SetNodePosition(node, pertNode, x, y);
      Announce(node, pertNode);
    }
    y += yStep;
  }
}

bool QELPFVNodeOrganiser::ArrangeNodes(VORBaseUnknown_var root, QELPertController* controller) {
  Trace().TraPrint("QELPFVNodeOrganiser::ArrangeNodes -->");
  if (!root || controller == nullptr)
    return false;
  if (!ComputeLevels(root))
    return true;
  _controller = controller;
  if (_controller->GetViewer() == nullptr)
    return false;

  float width = 300.0f;
  float height = 200.0f;
  GetViewerOrSuperNodeSize(&width, &height);
  const float side = width;
  const int highest = (*_levelList)[_levelList->Size()];
  const float xStep = highest > 0 ? side / static_cast<float>(highest) : 0.0f;
  double x = 0.0;
  double y = 0.0;
  // Inside an expanded super node (whose reference object is the chart root, not itself) the
  // columns start at the super node's own position.
  QELIPertPosition_var position(root);
  VORBaseUnknown_var reference;
  if (!position || FAILED(position->GetReferenceObject(reference)) || reference != root) {
    if (QELIPertNode_var rootPert(root); rootPert)
      rootPert->GetPosition(x, y, 1);
  }
  {
    const MoveBatch batch(_controller);
    for (VORListValVORBaseUnknown_var* list : *_levelLists) {
      const int count = list->Size();
      float yStep = 0.0f;
      if (count > 0) {
        yStep = side / static_cast<float>(count);
        y = side / static_cast<float>(2 * count);
      }
      PlaceColumn(*list, x, y, yStep, [](const VORBaseUnknown_var&) { return true; });
      x += xStep;
    }
  }
  _controller->GetViewer()->Reframe();
  return true;
}

void QELPFVNodeOrganiser::GetActListForPosChange(VORBaseUnknown_var& node,
                                                 VORListValVORBaseUnknown_var*& ioList) {
  Trace().TraPrint("QELPFVNodeOrganiser::GetActListForPosChange -->");
  if (!node || ioList == nullptr)
    return;
  // The recursion "append node; append all its successors; recurse into each" with an explicit
  // stack, so that long chains do not exhaust the call stack.
  struct Frame {
    VORListValVORBaseUnknown_var* next;
    int position;
  };
  auto successorsOf = [](const VORBaseUnknown_var& n) -> VORListValVORBaseUnknown_var* {
    VORISPPFlowMgt_var flows(n);
    VORListValVORBaseUnknown_var* next = nullptr;
    if (!flows || FAILED(flows->GetNextActivities(next, "Activity")) || next == nullptr ||
        next->Size() == 0) {
      delete next;
      return nullptr;
    }
    return next;
  };
  std::vector<Frame> stack;
  ioList->Append(node);
  if (auto* next = successorsOf(node)) {
    ioList->Append(*next);
    stack.push_back(Frame{next, 1});
  }
  while (!stack.empty()) {
    Frame& top = stack.back();
    if (top.position > top.next->Size()) {
      delete top.next;
      stack.pop_back();
      continue;
    }
    const VORBaseUnknown_var current = (*top.next)[top.position++];
    // One entry line per call of the recursion this loop stands for.
    Trace().TraPrint("QELPFVNodeOrganiser::GetActListForPosChange -->");
    if (!current)
      continue;
    ioList->Append(current);
    if (auto* next = successorsOf(current)) {
      ioList->Append(*next);
      stack.push_back(Frame{next, 1});  // invalidates top
    }
  }
}

bool QELPFVNodeOrganiser::PositionNewNode(VORBaseUnknown_var root,
                                          VORListValVORBaseUnknown_var*& newNodes,
                                          QELPertController* controller) {
  Trace().TraPrint("QELPFVNodeOrganiser::PositionNewNode -->");
  if (!root || controller == nullptr)
    return false;
  if (!ComputeLevels(root))
    return true;
  _controller = controller;
  if (_controller->GetViewer() == nullptr || newNodes == nullptr)
    return false;
  if (newNodes->Size() == 0)
    return true;

  // The level list (1-based) of each node: the level lists hold every child once.
  const int n = _childNodeList->Size();
  absl::flat_hash_map<VORBaseUnknown*, int> listOf;
  listOf.reserve(static_cast<size_t>(n));
  for (int k = 1; k <= _levelLists->Size(); ++k) {
    for (const VORBaseUnknown_var& node : *(*_levelLists)[k])
      listOf.emplace(node.Identity(), k);
  }
  // The chart area depends on the levels only, which no move changes.
  float width = 300.0f;
  float height = 200.0f;
  GetViewerOrSuperNodeSize(&width, &height);
  const float side = width;
  const int highest = (*_levelList)[n];
  const float xStep = highest > 0 ? side / static_cast<float>(highest) : 0.0f;
  for (VORBaseUnknown_var& newNode : *newNodes) {
    // What moves: the new node and everything downstream of it (the change list, as a set).
    std::unordered_set<VORBaseUnknown*> change;
    if (newNode) {
      std::vector<VORBaseUnknown_var> pending{newNode};
      change.insert(newNode.Identity());
      while (!pending.empty()) {
        VORBaseUnknown_var current = pending.back();
        pending.pop_back();
        if (VORISPPFlowMgt_var flows(current); flows) {
          flows->ForEachNextActivity([&](VORBaseUnknown* s) {
            if (change.insert(s->GetIdentity()).second)
              pending.emplace_back(s);
          });
        }
      }
    }
    double x = 0.0;
    double y = 0.0;
    auto found = newNode ? listOf.find(newNode.Identity()) : listOf.end();
    if (found != listOf.end()) {
      const MoveBatch batch(_controller);
      const int k0 = found->second;
      if (k0 > 1) {
        VORListValVORBaseUnknown_var* previous = (*_levelLists)[k0 - 1];
        if (previous->Size() > 0) {
          if (QELIPertNode_var first((*previous)[1]); first)
            first->GetPosition(x, y, 1);
        }
      }
      for (int k = k0; k <= _levelLists->Size(); ++k) {
        VORListValVORBaseUnknown_var* list = (*_levelLists)[k];
        const int count = list->Size();
        float yStep = 0.0f;
        if (count > 0) {
          yStep = side / static_cast<float>(count);
          y = side / static_cast<float>(2 * count);
        }
        x += xStep;
        PlaceColumn(*list, x, y, yStep, [&change](const VORBaseUnknown_var& node) {
          return change.count(node.Identity()) != 0;
        });
      }
    }
  }
  // Framed once when every new node is placed: each reframe visits the whole scene.
  _controller->GetViewer()->Reframe();
  return true;
}

void QELPFVNodeOrganiser::DispatchNotif(VORBaseUnknown_var node) {
  Announce(node, QELIPertNode_var(node));
}

void QELPFVNodeOrganiser::Announce(VORBaseUnknown_var& node, const QELIPertNode_var& pertNode) {
  Trace().TraPrint(DispatchNotifLine());
  if (!node)
    return;
  double x = 0.0;
  double y = 0.0;
  if (pertNode)
    pertNode->GetPosition(x, y, 1);
  if (_controller != nullptr)
    _controller->RefreshNodePositionInPert(node, true);
  QELIPertPosition_var position(node);
  if (!position)
    return;
  VORBaseUnknown_var reference;
  position->GetReferenceObject(reference);
  NotifyMove(node, reference, x, y);
}

bool QELPFVNodeOrganiser::MoveThroughChart(VORBaseUnknown_var& node, double x, double y) {
  VORBaseUnknown* known = nullptr;
  if (_controller == nullptr || _controller->MoveNodeTo(node, x, y, true, known) != S_OK)
    return false;
  Trace().TraPrint(DispatchNotifLine());
  VORBaseUnknown_var reference(known);
  if (!reference) {
    QELIPertPosition_var position(node);
    if (!position)
      return true;
    position->GetReferenceObject(reference);
  }
  NotifyMove(node, reference, x, y);
  return true;
}

void QELPFVNodeOrganiser::NotifyMove(VORBaseUnknown_var& node, const VORBaseUnknown_var& reference,
                                     double x, double y) {
  // The nodes of one level share their reference object: its events are looked up once.
  if (reference.Identity() != _eventsOf) {
    _eventsOf = reference.Identity();
    _events = VORIModelEvents_var(reference);
  }
  if (!_events)
    return;
  _moved.Dispatch(*_events, node, x, y);
}

void QELPFVNodeOrganiser::DisplayCyclicWarningDialog() {
  Trace().TraPrint("QELPFVNodeOrganiser::DisplayCyclicWarningDialog -->");
  VORApplicationFrame* frame = VORApplicationFrame::GetApplicationFrame();
  if (frame == nullptr)
    return;
  if (VORFindResource(VORUnicodeString(kCatalog) + VORUnicodeString(".msg")).IsEmpty())
    return;
  VORDlgNotify* notify = nullptr;
  if (VORGetEnv("ADL_ODT_OUT") == nullptr)
    notify = new VORDlgNotify(frame->GetMainWindow(), "Warning", VORDlgNfyWarning | VORDlgNfyOK);
  const VORUnicodeString title =
      VORMsgCatalog::BuildMessage(kCatalog, "CyclicError.Title", "Cyclic Precedence");
  VORUnicodeString message = VORMsgCatalog::BuildMessage(
      kCatalog, "CyclicError.Message",
      "The nodes cannot be laid out: the precedence flows are cyclic at the activity ");
  message.Append(_cyclicActivityName);
  if (notify != nullptr) {
    notify->DisplayBlocked(message, title);
    notify->RequestDelayedDestruction();
  }
}

extern "C" int QELPFVArrangeChart(VORBaseUnknown* root, QELPertController* controller) {
  auto organiser = VORHandle<QELPFVNodeOrganiser>::Adopt(new QELPFVNodeOrganiser());
  if (!organiser->ArrangeNodes(VORBaseUnknown_var(root), controller))
    return -1;
  return organiser->IsCyclic() ? 1 : 0;
}
