#include "VORDlgFrame.h"

#include <algorithm>

VORDlgFrame::VORDlgFrame(VORCommand* parent, const VORString& name, int style)
    : VORDlgControl(parent, name, style) {}

void VORDlgFrame::Attach4Sides(VORCommand* child) {
  if (child == nullptr || IsAttached4Sides(child))
    return;
  _attached.push_back(child);
  if (auto* control = dynamic_cast<VORDlgControl*>(child)) {
    VORDlgGridConstraints g = control->GetGridConstraints();
    g.attachment = VORDlgAttach4Sides;
    control->SetGridConstraints(g);
  }
}

void VORDlgFrame::ResetAttachment(VORCommand* child) {
  std::erase(_attached, child);
  if (auto* control = dynamic_cast<VORDlgControl*>(child)) {
    VORDlgGridConstraints g = control->GetGridConstraints();
    g.attachment = 0;
    control->SetGridConstraints(g);
  }
}

bool VORDlgFrame::IsAttached4Sides(VORCommand* child) const {
  return std::find(_attached.begin(), _attached.end(), child) != _attached.end();
}

VORDlgLabel::VORDlgLabel(VORCommand* parent, const VORString& name, int style)
    : VORDlgControl(parent, name, style) {}
