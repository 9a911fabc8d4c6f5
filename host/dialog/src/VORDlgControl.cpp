#include "VORDlgControl.h"

#include <sstream>

VORDlgControl::VORDlgControl(VORCommand* parent, const VORString& name, int style,
                             bool ownedByParent)
    : VORCommand(parent, name), _style(style) {
  if (auto* owner = dynamic_cast<VORDlgControl*>(parent); owner != nullptr && ownedByParent)
    owner->_owned.push_back(VORCommand_var::Adopt(this));
}

VORDlgControl::~VORDlgControl() {
  // Owned children go first, while this control can still be their father.
  while (!_owned.empty()) {
    VORCommand_var last = std::move(_owned.back());
    _owned.pop_back();
  }
}

void VORDlgControl::SetTitle(const VORUnicodeString& title) {
  _title = title;
  Changed();
}

void VORDlgControl::SetGridConstraints(int row, int column, int rowSpan, int columnSpan,
                                       int attachment) {
  SetGridConstraints(VORDlgGridConstraints{row, column, rowSpan, columnSpan, attachment});
}

void VORDlgControl::SetGridConstraints(const VORDlgGridConstraints& constraints) {
  _grid = constraints;
  Changed();
}

void VORDlgControl::SetSensitivity(bool on) {
  _sensitive = on;
  Changed();
}

bool VORDlgControl::IsEffectivelySensitive() const {
  for (const VORDlgControl* c = this; c != nullptr;
       c = dynamic_cast<const VORDlgControl*>(c->GetFather())) {
    if (!c->_sensitive)
      return false;
  }
  return true;
}

void VORDlgControl::SetVisibility(bool on) {
  _visible = on;
  Changed();
}

std::vector<VORDlgControl*> VORDlgControl::GetControls() const {
  std::vector<VORDlgControl*> controls;
  for (VORCommand* child : GetChildren()) {
    if (auto* control = dynamic_cast<VORDlgControl*>(child))
      controls.push_back(control);
  }
  return controls;
}

VORDlgControl* VORDlgControl::FindControl(const std::string& name) const {
  for (VORDlgControl* child : GetControls()) {
    if (child->GetName().str() == name)
      return child;
    if (VORDlgControl* below = child->FindControl(name))
      return below;
  }
  return nullptr;
}

bool VORDlgControl::RemoveControl(VORDlgControl* child) {
  if (child == nullptr || child->GetFather() != this)
    return false;
  VORCommand_var keep(child);
  child->SetFather(nullptr);
  for (auto it = _owned.begin(); it != _owned.end(); ++it) {
    if (it->get() == child) {
      _owned.erase(it);
      break;
    }
  }
  Changed();
  return true;
}

void VORDlgControl::Send(VORDlgNotification* notification) {
  auto keep = VORHandle<VORDlgNotification>::Adopt(notification);
  VORDlgControl_var self(this);
  DispatchNotification(notification);
}

void VORDlgControl::Changed() {
  auto notification =
      VORHandle<VORDlgChangedNotification>::Adopt(new VORDlgChangedNotification(this));
  VORDlg::GetGlobalPublisher()->Dispatch(notification);
}

namespace VORDlg {

VOREventPublisher* GetGlobalPublisher() {
  // Never destroyed: dialogs released at exit still announce it.
  static auto* publisher = new VORHandle<VOREventPublisher>(
      VORHandle<VOREventPublisher>::Adopt(new VOREventPublisher()));
  return *publisher;
}

namespace {
void DescribeInto(const VORDlgControl* control, int depth, std::ostringstream& out) {
  out << std::string(static_cast<size_t>(depth) * 2, ' ') << control->GetKind() << " \""
      << control->GetName().str() << "\"";
  if (!control->GetTitle().IsEmpty())
    out << " title=\"" << control->GetTitle() << "\"";
  if (!control->GetValueText().IsEmpty())
    out << " value=\"" << control->GetValueText() << "\"";
  if (!control->GetSensitivity())
    out << " [insensitive]";
  if (!control->GetVisibility())
    out << " [hidden]";
  const VORDlgGridConstraints& g = control->GetGridConstraints();
  if (depth > 0)
    out << " at " << g.row << "," << g.column;
  out << "\n";
  for (const VORDlgControl* child : control->GetControls())
    DescribeInto(child, depth + 1, out);
}
}  // namespace

std::string Describe(const VORDlgControl* control) {
  std::ostringstream out;
  if (control != nullptr)
    DescribeInto(control, 0, out);
  return out.str();
}

}  // namespace VORDlg
