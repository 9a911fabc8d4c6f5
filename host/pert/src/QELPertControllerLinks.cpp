// The chart's links: drawn between the facing edges of their nodes, rebuilt once per batch of
// moves rather than once per moving end.
#include <cmath>

#include "QELPertController.h"
#include "QELPertClientVisuServices.h"
#include "VORISPPFlowMgt.h"

namespace {

// Arrow head at q pointing along x, barbs of length 2 at 18 degrees from the shaft.
void ArrowHead(const VORMathPoint2Df& p, const VORMathPoint2Df& q, VORMathPoint2Df (&points)[3]) {
  const float d = q.x >= p.x ? 1.0f : -1.0f;
  const double angle = 2.82744;
  const auto ax = static_cast<float>(d * std::cos(angle));
  const auto ay = static_cast<float>(d * std::sin(angle));
  const auto bx = static_cast<float>(d * std::cos(-angle));
  const auto by = static_cast<float>(d * std::sin(-angle));
  points[0] = {q.x + 2.0f * bx, q.y + 2.0f * by};
  points[1] = q;
  points[2] = {q.x + 2.0f * ax, q.y + 2.0f * ay};
}

}  // namespace

void QELPertController::AddLinksOf(Node* node) {
  VORISPPFlowMgt* flow = node->flow.get();
  if (flow == nullptr)
    return;
  auto link = [this](Node* from, Node* to) {
    if (from == to || from->level != to->level)
      return;
    for (Link* existing : from->links) {
      if (existing->from == from && existing->to == to)
        return;
    }
    Link* l = &from->level->linkList.emplace_back();
    l->from = from;
    l->to = to;
    l->rep = VOR2DCustomRep_var::Adopt(new VOR2DCustomRep());
    l->rep->SetTag("PertLink");
    from->level->links->AddChild(l->rep);
    from->links.push_back(l);
    to->links.push_back(l);
    // Within a batch (a chart being filled) the link is drawn once, when its ends are placed.
    RefreshLink(l);
  };
  // Visited in place: a list per node and direction would be allocated for nothing.
  flow->ForEachNextActivity(
      [&](VORBaseUnknown* n) {
        if (Node* other = Find(n))
          link(node, other);
      },
      "");
  flow->ForEachPreviousActivity(
      [&](VORBaseUnknown* p) {
        if (Node* other = Find(p))
          link(other, node);
      },
      "");
}

void QELPertController::UpdateLink(Link* link) {
  double ox = 0.0;
  double oy = 0.0;
  if (link->from->level->ownerNode != nullptr) {
    ox = link->from->level->ownerNode->x;
    oy = link->from->level->ownerNode->y;
  }
  const Node* a = link->from;
  const Node* b = link->to;
  // From the right edge of the source to the left edge of the target; mirrored when the
  // target lies to the left.
  const bool forward = b->x >= a->x;
  const double side = forward ? 1.0 : -1.0;
  const VORMathPoint2Df p(static_cast<float>(a->x - ox + side * a->w * 0.5),
                          static_cast<float>(a->y - oy));
  const VORMathPoint2Df q(static_cast<float>(b->x - ox - side * b->w * 0.5),
                          static_cast<float>(b->y - oy));
  const auto m = static_cast<float>((p.x + q.x) * 0.5);
  const VORMathPoint2Df route[4] = {p, {m, p.y}, {m, q.y}, q};
  VORMathPoint2Df head[3];
  ArrowHead(p, q, head);
  ++_linkRebuilds;
  // A link drawn before keeps its two polylines: only their points change.
  if (link->rep->GetPrimitiveCount() == 2 && link->rep->ModifyPolyline(1, route, 4) &&
      link->rep->ModifyPolyline(2, head, 3))
    return;
  const std::uint32_t word =
      VOR2DGraphicAttribute::Pack(QELPertParameters::LinkColor, 4, 1, 4, false, true);
  link->rep->RemoveAllPrimitives();
  link->rep->ReservePrimitives(2);
  link->rep->AddPrimitive(new VOR2DPolylineGP(route, 4, 1), word, 255);
  link->rep->AddPrimitive(new VOR2DPolylineGP(head, 3, 1), word, 255);
}

void QELPertController::RefreshLink(Link* link) {
  if (_moveBatches == 0) {
    UpdateLink(link);
    return;
  }
  if (!link->due) {
    link->due = true;
    _dueLinks.push_back(link);
  }
}

void QELPertController::ForgetDueLink(Link* link) {
  if (link->due)
    std::erase(_dueLinks, link);
  link->due = false;
}

void QELPertController::BeginMoves() {
  ++_moveBatches;
}

void QELPertController::EndMoves() {
  if (_moveBatches == 0 || --_moveBatches > 0)
    return;
  std::vector<Link*> due;
  due.swap(_dueLinks);
  for (Link* link : due) {
    link->due = false;
    UpdateLink(link);
  }
  if (_drawDue && _viewer)
    _viewer->Draw();
  _drawDue = false;
}

void QELPertController::RefreshLinks() {
  std::vector<Level*> levels{_top.get()};
  for (Node& node : _nodes) {
    node.links.clear();
    if (node.inner)
      levels.push_back(node.inner.get());
  }
  _dueLinks.clear();
  for (Level* level : levels) {
    level->linkList.clear();
    level->links->EmptyBag();
  }
  for (Node& node : _nodes)
    AddLinksOf(&node);
}
