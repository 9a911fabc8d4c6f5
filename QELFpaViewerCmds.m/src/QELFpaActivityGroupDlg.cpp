#include "QELFpaActivityGroupDlg.h"

#include "VORApplicationFrame.h"
#include "VORDlgFrame.h"
#include "VORDlgStyles.h"
#include "VORMsgCatalog.h"

namespace {
constexpr const char* Catalog = "QELFpaActivityGroupDlg";
constexpr int DialogStyle = 265217;  // OK and Cancel
constexpr int FrameStyle = 0x80001;

// The label's text comes from the dialog's catalogue under the label's name.
void AddLabel(VORDlgFrame* frame, const char* name, int row) {
  auto* label = new VORDlgLabel(frame, name);
  label->SetTitle(VORMsgCatalog::BuildMessage(Catalog, name, VORUnicodeString(name)));
  label->SetGridConstraints(row, 0, 1, 1, VORDlgAttach4Sides);
}

template <class Control>
Control* Place(Control* control, int row) {
  control->SetGridConstraints(row, 1, 1, 1, VORDlgAttach4Sides);
  return control;
}

VORUnicodeString TextOf(const VORDlgEditor* editor) {
  return editor ? editor->GetText() : VORUnicodeString();
}

VORUnicodeString LineOf(const VORDlgCombo* combo) {
  return combo ? combo->GetSelectedLine() : VORUnicodeString();
}
}  // namespace

QELFpaActivityGroupDlg::QELFpaActivityGroupDlg()
    : VORDlgDialog(VORApplicationFrame::GetApplicationFrame()->GetMainWindow(), Catalog,
                   DialogStyle) {
  SetTitle(VORMsgCatalog::BuildMessage(Catalog, "Title", VORUnicodeString("Group Activities")));
  SetVisibility(false);
}

QELFpaActivityGroupDlg::~QELFpaActivityGroupDlg() = default;

void QELFpaActivityGroupDlg::Build() {
  auto* frame = new VORDlgFrame(this, "FrameActivityDlg", FrameStyle);
  frame->SetGridConstraints(0, 0, 1, 1, VORDlgAttach4Sides);
  AddLabel(frame, "EnterActivityName", 0);
  _activityName = Place(new VORDlgEditor(frame, "EditorActivityName"), 0);
  AddLabel(frame, "EnterResourceName", 1);
  _resourceName = Place(new VORDlgEditor(frame, "EditorResourceName"), 1);
  AddLabel(frame, "SelectResourceType", 2);
  _resourceType = Place(new VORDlgCombo(frame, "ComboResourceType", VORDlgCmbDropDown), 2);
  AddLabel(frame, "SelectActivityType", 3);
  _activityType = Place(new VORDlgCombo(frame, "ComboActivityType", VORDlgCmbDropDown), 3);
  _activityType->SetLine(VORUnicodeString("Grouping Activity"));
  AddLabel(frame, "SelectCycleTime", 4);
  _cycleTime = Place(new VORDlgCombo(frame, "ComboCycleTime", VORDlgCmbDropDown), 4);
  _cycleTime->SetLine(VORUnicodeString("children"));
  _cycleTime->SetLine(VORUnicodeString("parent"));
  AddCallback(_activityName->GetEventPublisher(), VORDlgEditor::GetEditModifyNotification(),
              [this](VORBaseUnknown*, VORNotification*, void*) { ActivityNameModified(); });
}

void QELFpaActivityGroupDlg::ActivityNameModified() {
  SetOKSensitivity(!TextOf(_activityName).IsEmpty());
}

void QELFpaActivityGroupDlg::SetActivityName(const VORUnicodeString& name) {
  if (_activityName != nullptr)
    _activityName->SetText(name);
}

void QELFpaActivityGroupDlg::SetResourceName(const VORUnicodeString& name) {
  if (_resourceName != nullptr)
    _resourceName->SetText(name);
}

void QELFpaActivityGroupDlg::ClearResourceTypes() {
  if (_resourceType != nullptr)
    _resourceType->ClearLine();
}

void QELFpaActivityGroupDlg::AddResourceType(const VORUnicodeString& type) {
  if (_resourceType != nullptr)
    _resourceType->SetLine(type);
}

VORUnicodeString QELFpaActivityGroupDlg::GetActivityName() const {
  return TextOf(_activityName);
}

VORUnicodeString QELFpaActivityGroupDlg::GetResourceName() const {
  return TextOf(_resourceName);
}

VORUnicodeString QELFpaActivityGroupDlg::GetResourceType() const {
  return LineOf(_resourceType);
}

VORUnicodeString QELFpaActivityGroupDlg::GetActivityType() const {
  return LineOf(_activityType);
}

VORUnicodeString QELFpaActivityGroupDlg::GetCycleTimeSource() const {
  return LineOf(_cycleTime);
}
