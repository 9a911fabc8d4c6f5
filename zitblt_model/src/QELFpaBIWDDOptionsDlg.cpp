#include "QELFpaBIWDDOptionsDlg.h"

#include "VORApplicationFrame.h"
#include "VORDlgFrame.h"
#include "VORDlgStyles.h"
#include "VORFrmEditor.h"
#include "VORFrmLayout.h"
#include "VORMsgCatalog.h"

namespace {
constexpr const char* kCatalog = "QELFpaBIWDDOptionsDlg";
constexpr const char* kFrame = "Select Item To Replace";
constexpr int kFrameStyle = 0x80001;
}  // namespace

QELFpaBIWDDOptionsDlg::QELFpaBIWDDOptionsDlg(VORBaseUnknown* document,
                                             std::function<void(int)> answer)
    : VORDlgDialog(VORApplicationFrame::GetApplicationFrame()->GetMainWindow(), kName,
                   VORDlgWndBtnOKCancel),
      _document(document != nullptr ? document->GetIdentity() : nullptr),
      _answer(std::move(answer)) {
  SetTitle(VORMsgCatalog::BuildMessage(kCatalog, "Title", VORUnicodeString(kName)));
  SetVisibility(false);
  VOREventPublisher* self = GetEventPublisher();
  AddCallback(self, GetDiaOKNotification(), [this](VORBaseUnknown*, VORNotification* n, void*) {
    Finish(GetChosenPosition(), n);
  });
  for (const char* event : {GetDiaCANCELNotification(), GetWindCloseNotification()})
    AddCallback(self, event, [this](VORBaseUnknown*, VORNotification* n, void*) { Finish(0, n); });
  _layoutCallback = AddCallback(
      VORFrmLayout::GetCurrentLayout()->GetEventPublisher(), VORFrmLayoutNotification::ClassName(),
      [this](VORBaseUnknown*, VORNotification* n, void*) { OnLayoutChange(n); });
}

QELFpaBIWDDOptionsDlg::~QELFpaBIWDDOptionsDlg() {
  // Never answered (torn down with everything else): the client still hears of it.
  if (_answer)
    std::exchange(_answer, nullptr)(0);
}

void QELFpaBIWDDOptionsDlg::Build() {
  auto* frame = new VORDlgFrame(this, kFrame, kFrameStyle);
  frame->SetTitle(VORUnicodeString(kFrame));
  frame->SetGridConstraints(1, 0, 1, 1, VORDlgAttach4Sides);
  _list = new VORDlgSelectorList(frame, kListName, VORDlgLstSingleSelection);
  _list->SetGridConstraints(0, 0, 1, 1, VORDlgAttach4Sides);
  _list->SetVisibleSize(kListColumns, kListLines);
}

void QELFpaBIWDDOptionsDlg::AppendItem(const VORUnicodeString& line) {
  if (_list == nullptr)
    return;
  _list->SetLine(line);
  _list->SetSelect({0});
}

int QELFpaBIWDDOptionsDlg::GetChosenPosition() const {
  if (_list == nullptr || _list->GetSelect().empty())
    return 0;
  return _list->GetSelect().front() + 1;
}

void QELFpaBIWDDOptionsDlg::Finish(int position, VORNotification* notification) {
  if (!_answer)
    return;
  VORHandle<QELFpaBIWDDOptionsDlg> self(this);
  std::exchange(_answer, nullptr)(position);
  if (_layoutCallback != 0)
    RemoveCallback(std::exchange(_layoutCallback, 0));
  if (notification != nullptr && GetFather() != nullptr)
    SendNotification(GetFather(), notification);
  SetVisibility(false);
  RequestDelayedDestruction();
}

void QELFpaBIWDDOptionsDlg::OnLayoutChange(VORNotification* notification) {
  auto* change = dynamic_cast<VORFrmLayoutNotification*>(notification);
  if (change == nullptr || change->GetChange() != VORFrmLayoutNotification::WindowRemoved)
    return;
  for (VORFrmWindow* window : VORFrmLayout::GetCurrentLayout()->GetWindowList()) {
    VORFrmEditor* editor = window->GetEditor();
    if (window != change->GetWindow() && editor != nullptr && editor->GetDocument() != nullptr &&
        editor->GetDocument()->GetIdentity() == _document)
      return;
  }
  Finish(0, nullptr);
}
