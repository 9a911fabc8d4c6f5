#include "QELPertController.h"

#include <algorithm>
#include <cmath>

#include "QELIPertNode.h"
#include "QELPertActivityColors.h"
#include "QELIPertPosition.h"
#include "QELPertClientVisuServices.h"
#include "QELPertNodeExtensions.h"
#include "QELPertNotifications.h"
#include "QELPertViewer.h"
#include "VOR2DPolygonRep.h"
#include "VOR2DTextRep.h"
#include "VORIGENode.h"
#include "VORIModelEvents.h"
#include "VORModify.h"
#include "VORISPPActivity.h"
#include "VORISPPFlowMgt.h"
#include "VORTextMetric.h"

namespace {

VORBaseUnknown* Key(VORBaseUnknown* object) {
  return object ? object->GetIdentity() : nullptr;
}

std::vector<VORMathPoint2Df> BoxPoints(double w, double h) {
  const auto hw = static_cast<float>(w * 0.5);
  const auto hh = static_cast<float>(h * 0.5);
  return {{-hw, -hh}, {hw, -hh}, {hw, hh}, {-hw, hh}};
}

}  // namespace

QELPertController::QELPertController(VORFrmWindow* window, const VORBaseUnknown_var& root,
                                     VORViewer* viewer, ViewerName name, ViewerMode mode,
                                     bool editable, VORBaseUnknown_var)
    : VORCommand(nullptr, "QELPertController"),
      _window(window),
      _viewer(viewer),
      _name(name),
      _mode(mode),
      _editable(editable) {
  _chart = VOR2DBagRep_var::Adopt(new VOR2DBagRep());
  _chart->SetTag("PertChart");
  _top = std::make_unique<Level>(&_pool);
  _top->links = VOR2DBagRep_var::Adopt(new VOR2DBagRep());
  _top->nodes = VOR2DBagRep_var::Adopt(new VOR2DBagRep());
  _chart->AddChild(_top->links);
  _chart->AddChild(_top->nodes);
  if (_viewer) {
    _viewer->AddRep(_chart);
    if (auto* pertViewer = dynamic_cast<QELPertViewer*>(_viewer.get()))
      pertViewer->SetController(this);
  }
  if (_editable && _mode == PertModeEditable) {
    _manipulator =
        VOR2DManipulator_var::Adopt(new VOR2DManipulator(this, "PertNodeManip", nullptr, 1, 0));
    AddCallback(_manipulator->GetEventPublisher(), VORManipulator::kVORManipulate,
                [this](VORBaseUnknown*, VORNotification* n, void*) { OnManipulate(n); });
    AddCallback(_manipulator->GetEventPublisher(), VORManipulator::kVOREndManipulate,
                [this](VORBaseUnknown*, VORNotification* n, void*) { OnEndManipulate(n); });
  }
  SetWindowRootNode(root, NULL_var);
}

QELPertController::~QELPertController() {
  ClearChart();
  if (_manipulator) {
    _manipulator->RemoveAllElements();
    _manipulator->SetFather(nullptr);
  }
  if (_viewer) {
    _viewer->RemoveRep(_chart);
    if (auto* pertViewer = dynamic_cast<QELPertViewer*>(_viewer.get());
        pertViewer && pertViewer->GetController() == this)
      pertViewer->SetController(nullptr);
  }
}

void QELPertController::SetWindowRootNode(VORBaseUnknown* root, VORBaseUnknown_var) {
  if (!_nodes.empty())
    RemoveAllPertNodes();
  _root = root ? root->GetIdentity() : nullptr;
  _rootEvents = VORIModelEvents_var(_root);
  _top->owner = _root.get();
  if (QELEPertNodeExt* ext = QELEPertNodeExt::Of(_root))
    ext->SetReference(_root);
}

QELPertController::Node* QELPertController::Find(VORBaseUnknown* node) const {
  // Most callers hold the identity itself: a pointer that is a key is that object's identity
  // (live objects do not share addresses), and asking for the identity first would touch the
  // object, a cache miss per node on a large level.
  auto it = _nodeIndex.find(node);
  if (it == _nodeIndex.end())
    it = _nodeIndex.find(Key(node));
  // As with the owning pointers the map held before: finding a node does not freeze it.
  return it == _nodeIndex.end() ? nullptr : &*it->second;
}

bool QELPertController::IsInChart(VORBaseUnknown* node) const {
  return Find(node) != nullptr;
}

VOR2DBagRep* QELPertController::GetNodeRep(VORBaseUnknown* node) const {
  Node* n = Find(node);
  return n ? n->bag.get() : nullptr;
}

int QELPertController::GetLinkCount() const {
  size_t ends = 0;
  for (const Node& node : _nodes)
    ends += node.links.size();
  return static_cast<int>(ends / 2);
}

void QELPertController::ReadPosition(Node* node) {
  QELEPertNodeExt* ext = node->ext;
  double x = 0.0;
  double y = 0.0;
  if (ext != nullptr && ext->GetPosition(x, y, 1) != S_OK && ext->HasProvisionalPosition())
    ext->GetProvisionalPosition(x, y);
  node->x = x;
  node->y = y;
}

HRESULT QELPertController::AddChildNode(VORBaseUnknown_var& node) {
  VORIGENode_var graphNode(node);
  if (!graphNode)
    return E_INVALIDARG;
  if (Find(node) != nullptr)
    return S_FALSE;
  // A child of a super node whose inner chart is shown goes into that chart.
  Level* level = _top.get();
  VORBaseUnknown_var parent;
  if (graphNode->GetParentNode(parent) == S_OK && parent && Key(parent) != Key(_root)) {
    if (Node* owner = Find(parent); owner != nullptr && owner->inner)
      level = owner->inner.get();
  }
  Node* added = AddNode(node, level);
  if (level->ownerNode != nullptr)
    ResizeOwners(added);
  return S_OK;
}

QELPertController::Node* QELPertController::AddNode(VORBaseUnknown* object, Level* level) {
  auto [entry, added] = _nodeIndex.try_emplace(Key(object));
  if (added)
    entry->second = _nodes.emplace(_nodes.end());
  Node* node = &*entry->second;
  node->object = Key(object);
  node->level = level;
  node->graph = VORIGENode_var(node->object);
  node->layout = VORIGraphNodeLayout_var(node->object);
  node->flow = VORISPPFlowMgt_var(node->object);
  node->ext = QELEPertNodeExt::Of(node->object);
  level->members.push_back(node);
  ReadPosition(node);
  FollowModel(node);

  node->bag = VOR2DBagRep_var::Adopt(new VOR2DBagRep());
  node->bag->SetTag("PertNode");
  node->bag->SetObject(node->object);
  node->bag->ReserveChildren(2);  // the box and the label
  // No points yet: BuildShape gives the box its size.
  auto box = VORHandle<VOR2DPolygonRep>::Adopt(new VOR2DPolygonRep(nullptr, 0, 1));
  // Filled by the kind of activity, so that a station is told from a loading at a glance.
  VORISPPActivity_var activity(node->object);
  // The activity type is the late type (VORISPPActivity), read here without a copy.
  box->SetFillColorIndex(
      QELPertActivityColors::FillColorOf(activity ? node->object->GetLateType() : ""));
  box->SetColorIndex(QELPertParameters::NodeBorderColor);
  node->bag->AddChild(box);
  auto label = VORHandle<VOR2DTextRep>::Adopt(new VOR2DTextRep(
      VORUnicodeString(), VORMathPoint2Df(), 2, QELPertParameters::PERT_LABEL_HEIGHT));
  label->SetTag("PertLabel");
  label->SetColorIndex(QELPertParameters::NodeBorderColor);
  node->bag->AddChild(label);
  level->nodes->AddChild(node->bag);
  if (_manipulator)
    _manipulator->AddElement(node->bag);

  if (node->ext != nullptr) {
    node->ext->SetReference(_root);
    node->ext->SetHiddenFlag(false);
  }
  BuildShape(node);
  PlaceNode(node);
  AddLinksOf(node);
  Announce(object, 0);

  if (node->layout && node->layout->GetPertNodeState() == PertNodeExpanded)
    ShowInnerNodes(object);
  return node;
}

void QELPertController::BuildShape(Node* node) {
  const double labelHeight = QELPertParameters::PERT_LABEL_HEIGHT;
  auto* box = static_cast<VOR2DPolygonRep*>(node->bag->GetChild(1));
  auto* label = static_cast<VOR2DTextRep*>(node->bag->GetChild(2));
  // Read into one string kept for every node: a copy assignment reuses its buffer.
  static const VORUnicodeString noLabel;
  VORUnicodeString& text = _label;
  text = noLabel;
  if (node->graph)
    node->graph->GetLabel(text);
  label->SetText(text);
  label->SetHeight(labelHeight);

  // The document's size when it has one, else the default widened for the label.
  double w = 0.0;
  double h = 0.0;
  if (node->layout)
    node->layout->GetPertNodeSize(w, h);
  if (w <= 0.0 || h <= 0.0) {
    const double labelWidth = VORTextMetric::TextWidth(text.GetLengthInChar(), labelHeight);
    w = std::max(QELPertParameters::PERT_NODE_WIDTH, labelWidth + 2.0 * labelHeight);
    h = QELPertParameters::PERT_NODE_HEIGHT;
  }
  const int state = node->layout ? node->layout->GetPertNodeState() : PertNodeNone;
  double labelY = 0.0;
  if (node->inner && !node->inner->members.empty()) {
    // Enlarged box centred on the node, holding the inner chart and the label above it.
    const double margin = QELPertParameters::PERT_SUPER_NODE_MARGIN;
    double hw = w * 0.5;
    double hh = h * 0.5;
    for (Node* m : node->inner->members) {
      hw = std::max(hw, std::fabs(m->x - node->x) + m->w * 0.5 + margin);
      hh = std::max(hh, std::fabs(m->y - node->y) + m->h * 0.5 + margin + labelHeight);
    }
    w = 2.0 * hw;
    h = 2.0 * hh;
    labelY = hh - 0.5 - labelHeight * 0.5;
  }
  node->w = w;
  node->h = h;
  // An expanded super node keeps its label at the chart's label height, above the inner chart.
  const bool expanded = node->inner && !node->inner->members.empty();
  FitLabel(*label, text, w, expanded ? labelHeight / QELPertParameters::PERT_LABEL_BOX_RATIO : h);
  box->Modify(BoxPoints(w, h));
  // A super node (expanded or collapsed) has a double-weight border.
  box->SetLineThickness(state == PertNodeNone ? 1 : 2);
  label->Modify(VORMathPoint2Df(0.0f, static_cast<float>(labelY)));
  if (node->ext != nullptr)
    node->ext->SetDrawnSize(w, h);
}

void QELPertController::FitLabel(VOR2DTextRep& label, const VORUnicodeString& text, double boxWidth,
                                 double boxHeight) {
  // As large as the box allows, so that a chart fitted to its window stays readable; smaller
  // down to a floor when that saves the whole name; elided below the floor.
  const double room = std::max(boxWidth - 2.0 * QELPertParameters::PERT_LABEL_PADDING, 0.0);
  const double largest = boxHeight * QELPertParameters::PERT_LABEL_BOX_RATIO;
  const double smallest = largest * QELPertParameters::PERT_LABEL_SHRINK_FLOOR;
  const int length = std::max(text.GetLengthInChar(), 1);
  const double fitting = room / (length * VORTextMetric::kCharWidthRatio);
  const double height = std::max(std::min(largest, fitting), smallest);
  label.SetHeight(std::max(height, QELPertParameters::PERT_LABEL_HEIGHT));
  label.SetMaxWidth(room);
}

void QELPertController::PlaceNode(Node* node) {
  double ox = 0.0;
  double oy = 0.0;
  if (node->level->ownerNode != nullptr) {
    ox = node->level->ownerNode->x;
    oy = node->level->ownerNode->y;
  }
  node->bag->SetMatrix(VOR3x3Matrix::Translation(node->x - ox, node->y - oy));
}

void QELPertController::Announce(VORBaseUnknown* node, int removeRep) {
  VORIModelEvents* events = _rootEvents.get();
  if (events == nullptr)
    return;
  _announced.Dispatch(*events, VORBaseUnknown_var(node), nullptr, removeRep);
}

void QELPertController::DispatchPosition(Node* node) {
  QELIPertPosition_var position(node->object);
  VORBaseUnknown_var reference;
  if (!position || position->GetReferenceObject(reference) != S_OK)
    return;
  VORIModelEvents_var events(reference);
  if (!events)
    return;
  auto notification = VORHandle<QELPertPositionNotify>::Adopt(
      new QELPertPositionNotify(node->object, node->x, node->y));
  events->Dispatch(notification);
}

HRESULT QELPertController::RefreshNodePositionInPert(VORBaseUnknown_var& object, bool redraw) {
  Node* node = Find(object);
  if (node == nullptr)
    return E_FAIL;
  Refresh(node, redraw);
  return S_OK;
}

HRESULT QELPertController::MoveNodeTo(VORBaseUnknown_var& object, double x, double y, bool redraw,
                                      VORBaseUnknown*& reference) {
  reference = nullptr;
  Node* node = Find(object);
  if (node == nullptr || node->ext == nullptr)
    return E_FAIL;
  QELPertWritePosition(*node->ext, node->layout.get(), x, y);
  node->ext->SetPosition(x, y, 1);
  Refresh(node, redraw);
  // What QELIPertPosition answers first; null leaves the caller to ask it.
  reference = node->ext->GetReference();
  return S_OK;
}

void QELPertController::Refresh(Node* node, bool redraw) {
  const double oldX = node->x;
  const double oldY = node->y;
  ReadPosition(node);
  if (node->inner && (node->x != oldX || node->y != oldY))
    ShiftInner(node, node->x - oldX, node->y - oldY);
  PlaceNode(node);
  for (Link* link : node->links)
    RefreshLink(link);
  ResizeOwners(node);
  if (redraw && _viewer) {
    if (_moveBatches > 0)
      _drawDue = true;
    else
      _viewer->Draw();
  }
}

void QELPertController::ShiftInner(Node* node, double dx, double dy) {
  if (!node->inner)
    return;
  // Inner boxes are placed relative to their super node: only their positions follow.
  for (Node* m : node->inner->members) {
    m->x += dx;
    m->y += dy;
    if (m->ext != nullptr)
      m->ext->SetPosition(m->x, m->y, 1);
    ShiftInner(m, dx, dy);
  }
}

void QELPertController::ResizeOwners(Node* node) {
  for (Node* owner = node->level->ownerNode; owner != nullptr; owner = owner->level->ownerNode) {
    BuildShape(owner);
    for (Link* link : owner->links)
      RefreshLink(link);
  }
}

HRESULT QELPertController::ShowInnerNodes(VORBaseUnknown* superNode) {
  Node* node = Find(superNode);
  if (node == nullptr)
    return E_FAIL;
  if (node->inner)
    return S_FALSE;
  VORIGENode_var graphNode(node->object);
  VORListValVORBaseUnknown_var* children = nullptr;
  if (!graphNode || FAILED(graphNode->GetChildren(children)) || children == nullptr) {
    delete children;
    return E_FAIL;
  }
  auto level = std::make_unique<Level>(&_pool);
  level->owner = node->object;
  level->ownerNode = node;
  level->links = VOR2DBagRep_var::Adopt(new VOR2DBagRep());
  level->nodes = VOR2DBagRep_var::Adopt(new VOR2DBagRep());
  node->bag->AddChild(level->links);
  node->bag->AddChild(level->nodes);
  node->inner = std::move(level);

  // Inner nodes never placed get a row; then the inner chart is centred on its super node so
  // that it moves with it.
  std::vector<VORBaseUnknown*> shown;
  VORBox2D extent;
  int unplaced = 0;
  for (const VORBaseUnknown_var& child : *children) {
    VORIGENode_var childNode(child);
    QELEPertNodeExt* ext = QELEPertNodeExt::Of(child);
    if (!childNode || ext == nullptr || Find(child) != nullptr)
      continue;
    double x = 0.0;
    double y = 0.0;
    if (ext->GetPosition(x, y, 1) != S_OK) {
      x = 2.0 * QELPertParameters::PERT_GRID_CELL_SIZE * unplaced++;
      y = 0.0;
      ext->SetPosition(x, y, 1);
    }
    extent.Extend(x, y);
    shown.push_back(child);
  }
  delete children;
  if (!shown.empty()) {
    const double dx = node->x - extent.CentreX();
    const double dy = node->y - extent.CentreY();
    for (VORBaseUnknown* child : shown) {
      QELEPertNodeExt* ext = QELEPertNodeExt::Of(child);
      double x = 0.0;
      double y = 0.0;
      ext->GetPosition(x, y, 1);
      if (dx != 0.0 || dy != 0.0)
        ext->SetPosition(x + dx, y + dy, 1);
      AddNode(child, node->inner.get());
    }
  }
  BuildShape(node);
  for (Link* link : node->links)
    UpdateLink(link);
  ResizeOwners(node);
  return S_OK;
}

void QELPertController::RemoveNode(Node* node, bool announce) {
  if (node->inner) {
    std::vector<Node*> members = node->inner->members;
    for (Node* m : members)
      RemoveNode(m, announce);
  }
  // Links touching the node go from both ends and from their level.
  Level* level = node->level;
  for (Link* link : std::vector<Link*>(node->links.begin(), node->links.end())) {
    Node* other = link->from == node ? link->to : link->from;
    other->links.Remove(link);
    ForgetDueLink(link);
    level->links->RemoveChild(link->rep);
    level->linkList.remove_if([link](const Link& l) { return &l == link; });
  }
  node->links.clear();
  std::erase(level->members, node);
  if (_manipulator)
    _manipulator->RemoveElement(node->bag);
  level->nodes->RemoveChild(node->bag);
  VORBaseUnknown_var object = node->object;
  UnfollowModel(node);
  if (QELEPertNodeExt* ext = node->ext) {
    ext->SetReference(nullptr);
    ext->SetDrawnSize(0.0, 0.0);
    ext->SetHiddenFlag(announce);
  }
  if (auto it = _nodeIndex.find(Key(object)); it != _nodeIndex.end()) {
    _nodes.erase(it->second);
    _nodeIndex.erase(it);
  }
  if (announce)
    Announce(object, 1);
}

HRESULT QELPertController::HideInnerNodes(VORBaseUnknown* superNode) {
  Node* node = Find(superNode);
  if (node == nullptr)
    return E_FAIL;
  if (!node->inner)
    return S_FALSE;
  std::vector<Node*> members = node->inner->members;
  for (Node* m : members)
    RemoveNode(m, true);
  node->bag->RemoveChild(node->inner->links);
  node->bag->RemoveChild(node->inner->nodes);
  node->inner.reset();
  BuildShape(node);
  for (Link* link : node->links)
    UpdateLink(link);
  ResizeOwners(node);
  return S_OK;
}

HRESULT QELPertController::UpdateNodeShape(VORBaseUnknown* object) {
  Node* node = Find(object);
  if (node == nullptr)
    return E_FAIL;
  BuildShape(node);
  for (Link* link : node->links)
    UpdateLink(link);
  ResizeOwners(node);
  return S_OK;
}

HRESULT QELPertController::RemoveChildNode(VORBaseUnknown_var& object) {
  Node* node = Find(object);
  if (node == nullptr)
    return S_FALSE;
  Node* owner = node->level->ownerNode;
  RemoveNode(node, true);
  if (owner != nullptr) {
    BuildShape(owner);
    for (Link* link : owner->links)
      UpdateLink(link);
    ResizeOwners(owner);
  }
  return S_OK;
}

void QELPertController::ClearChart() {
  for (Node& node : _nodes) {
    UnfollowModel(&node);
    if (QELEPertNodeExt* ext = node.ext) {
      ext->SetReference(nullptr);
      ext->SetDrawnSize(0.0, 0.0);
      ext->SetHiddenFlag(false);
    }
  }
  if (_manipulator)
    _manipulator->RemoveAllElements();
  _dueLinks.clear();
  _nodeIndex.clear();
  _nodes.clear();
  _top->members.clear();
  _top->linkList.clear();
  _top->nodes->EmptyBag();
  _top->links->EmptyBag();
}

void QELPertController::RemoveAllPertNodes() {
  // The window removes what it attached to the nodes itself: no announcements here.
  if (_viewer)
    _viewer->ClearPreselection();
  ClearChart();
}

void QELPertController::RemoveNodeManipCmdCB() {
  if (_manipulator)
    RemoveCallbacksOn(_manipulator->GetEventPublisher());
}

void QELPertController::FollowModel(Node* node) {
  VORIModelEvents_var events(node->object);
  if (!events)
    return;
  node->events = events->GetEventPublisher();
  if (!node->events)
    return;
  node->moved = node->events->AddCallback(
      VORModify::ClassName(),
      [this, node](VORBaseUnknown*, const std::string&, VORNotification* n, void*, VORCallbackId) {
        if (auto* modify = dynamic_cast<VORModify*>(n); modify && modify->GetWhat() == "position")
          OnModelMoved(node);
      });
}

void QELPertController::UnfollowModel(Node* node) {
  if (node->events)
    node->events->RemoveCallback(node->moved);
  node->events = VORHandle<VOREventPublisher>();
  node->moved = 0;
}

void QELPertController::OnModelMoved(Node* node) {
  if (!node->layout || node->ext == nullptr)
    return;
  const bool has = node->layout->HasPertPosition();
  double x = node->x;
  double y = node->y;
  if (has)
    node->layout->GetPertPosition(x, y);
  // A drag or the organiser moved the node through the chart, which already holds the new
  // position; a change made elsewhere (undo, redo, a script) moves the box, its links and its
  // ZitBlts here.
  double cx = 0.0;
  double cy = 0.0;
  if (has && node->ext->HasPosition() && node->ext->GetPosition(cx, cy, 1) == S_OK && cx == x &&
      cy == y)
    return;
  if (has)
    node->ext->SetPosition(x, y, 1);
  else
    node->ext->ResetPosition();
  VORBaseUnknown_var object = node->object;
  RefreshNodePositionInPert(object, true);
  DispatchPosition(node);
}

QELPertController::Node* QELPertController::DraggedNode() const {
  if (!_manipulator || _manipulator->GetPressedElement() == nullptr)
    return nullptr;
  return Find(_manipulator->GetPressedElement()->GetObject());
}

void QELPertController::OnManipulate(VORNotification* notification) {
  auto* step = dynamic_cast<VORManipulatorNotification*>(notification);
  Node* node = DraggedNode();
  if (step == nullptr || node == nullptr)
    return;
  QELEPertNodeExt* ext = node->ext;
  if (ext == nullptr)
    return;
  ext->SetPosition(node->x + step->GetDelta().x, node->y + step->GetDelta().y, 1);
  VORBaseUnknown_var object = node->object;
  RefreshNodePositionInPert(object, true);
  DispatchPosition(node);
}

void QELPertController::OnEndManipulate(VORNotification*) {
  Node* node = DraggedNode();
  if (node == nullptr)
    return;
  double x = node->x;
  double y = node->y;
  QELPertClientVisuServices::CalculateSnapPositionInPert(x, y, 1, QELIPertNode_var());
  // The snapped position goes into the document: one change for the node and each inner node.
  QELIPertNode_var pertNode(node->object);
  if (pertNode)
    pertNode->SetPosition(x, y, 1);
  VORBaseUnknown_var object = node->object;
  RefreshNodePositionInPert(object, true);
  std::vector<Node*> inner;
  if (node->inner)
    inner = node->inner->members;
  for (size_t i = 0; i < inner.size(); ++i) {
    QELIPertNode_var m(inner[i]->object);
    if (m)
      m->SetPosition(inner[i]->x, inner[i]->y, 1);
    if (inner[i]->inner)
      inner.insert(inner.end(), inner[i]->inner->members.begin(), inner[i]->inner->members.end());
  }
  DispatchPosition(node);
}
