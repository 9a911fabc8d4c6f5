#include "QELPertClientVisuServices.h"

#include <cmath>

#include "QELFpaPertServices.h"
#include "QELPertNodeExtensions.h"
#include "VORIGraphNodeLayout.h"

namespace {

// Grid lines over the area of the viewer's other reps; no box of its own, never picked.
class QELPertGridRep : public VOR2DRep {
  VOR_DECLARE_CLASS(QELPertGridRep, VOR2DRep)
 public:
  explicit QELPertGridRep(VORViewer* viewer) : _viewer(viewer) { SetTag("PertGrid"); }
  bool HitTest(const VORMathPoint2D&, double) const override { return false; }

 protected:
  VORBox2D ComputeBoundingBox() const override { return VORBox2D(); }
  void FlattenShown(VORFlattenContext& context) const override {
    VORBox2D area;
    for (const VOR2DRep_var& rep : _viewer->GetReps()) {
      if (rep.get() != this && rep->IsShown())
        area.Extend(rep->GetBoundingBox());
    }
    if (area.IsEmpty())
      return;
    double cell = QELPertParameters::PERT_GRID_CELL_SIZE;
    if (!(cell > 0.0))
      return;
    area = area.Inflated(2.0 * cell);
    // Coarser lines rather than an unbounded number of them.
    while ((area.Width() + area.Height()) / cell > 2000.0)
      cell *= 2.0;
    const double x0 = std::floor(area.xmin / cell) * cell;
    const double y0 = std::floor(area.ymin / cell) * cell;
    const double x1 = std::ceil(area.xmax / cell) * cell;
    const double y1 = std::ceil(area.ymax / cell) * cell;
    auto line = [&](double ax, double ay, double bx, double by) {
      VORRenderItem& item = AddItem(context, VORPrimitiveKind::Line);
      item.color = VORColorFromIndex(QELPertParameters::GridColor);
      item.points = {context.matrix.Transform(ax, ay), context.matrix.Transform(bx, by)};
      item.box = VORBox2D(item.points[0].x, item.points[0].y, item.points[1].x, item.points[1].y);
    };
    for (double x = x0; x <= x1 + cell * 0.5; x += cell)
      line(x, y0, x, y1);
    for (double y = y0; y <= y1 + cell * 0.5; y += cell)
      line(x0, y, x1, y);
  }

 private:
  VORViewer* _viewer;
};

ViewerName& CurrentViewerName() {
  static ViewerName name = PertViewerClassic;
  return name;
}

double Snap(double v, double cell) {
  const double half = cell * 0.5;
  return std::floor((v - half) / cell + 0.5) * cell + half;
}

}  // namespace

VOR2DRep* QELPertClientVisuServices::CreateGrid(VOR2DViewer* viewer) {
  if (viewer == nullptr)
    return nullptr;
  auto* grid = new QELPertGridRep(viewer);
  grid->SetColorIndex(QELPertParameters::GridColor);
  viewer->AddRep(grid);
  return grid;
}

void QELPertClientVisuServices::SetViewerName(ViewerName& name) {
  CurrentViewerName() = name;
}

ViewerName QELPertClientVisuServices::GetViewerName() {
  return CurrentViewerName();
}

HRESULT QELPertClientVisuServices::SetChildPertPositions(VORIGENode_var& node,
                                                         GE_POSITION_INDEX index) {
  if (!node)
    return E_FAIL;
  if (index != 1)
    return E_INVALIDARG;
  VORListValVORBaseUnknown_var* children = nullptr;
  if (FAILED(node->GetChildren(children)) || children == nullptr) {
    delete children;
    return E_FAIL;
  }
  for (const VORBaseUnknown_var& child : *children) {
    QELEPertNodeExt* ext = QELEPertNodeExt::Of(child);
    if (ext == nullptr)
      continue;
    ext->ResetPosition();
    VORIGENode_var childNode(child);
    QELFpaPertBaseServices::InitNodePosition(childNode);
  }
  delete children;
  return S_OK;
}

HRESULT QELPertClientVisuServices::CalculateSnapPositionInPert(double& x, double& y,
                                                               GE_POSITION_INDEX,
                                                               const QELIPertNode_var&) {
  const double cell = QELPertParameters::PERT_GRID_CELL_SIZE;
  if (!(cell > 0.0) || !std::isfinite(x) || !std::isfinite(y))
    return E_FAIL;
  x = Snap(x, cell);
  y = Snap(y, cell);
  return S_OK;
}
