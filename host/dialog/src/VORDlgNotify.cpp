#include "VORDlgNotify.h"

namespace {
std::shared_ptr<VORDlgNotifyPresenter>& Installed() {
  static std::shared_ptr<VORDlgNotifyPresenter> presenter;
  return presenter;
}
}  // namespace

int VORDlgNotifyRecorder::Present(const VORDlgNotify& notify) {
  _records.push_back(VORDlgNotifyRecord{notify.GetName().str(), notify.GetTitle().ConvertToUTF8(),
                                        notify.GetText().ConvertToUTF8(), notify.GetStyle()});
  return VORDlgNotifyOK;
}

VORDlgNotify::VORDlgNotify(VORCommand* parent, const VORString& id, int style)
    : VORDlgControl(parent, id, style, false) {
  SetVisibility(false);
}

int VORDlgNotify::DisplayBlocked(const VORUnicodeString& message, const VORUnicodeString& title) {
  VORDlgControl_var keep(this);
  _text = message;
  SetTitle(title);
  SetVisibility(true);
  const int answer = GetPresenter().Present(*this);
  SetVisibility(false);
  return answer;
}

void VORDlgNotify::SetPresenter(std::shared_ptr<VORDlgNotifyPresenter> presenter) {
  Installed() = std::move(presenter);
}

VORDlgNotifyPresenter& VORDlgNotify::GetPresenter() {
  if (Installed())
    return *Installed();
  return Recorder();
}

VORDlgNotifyRecorder& VORDlgNotify::Recorder() {
  static VORDlgNotifyRecorder recorder;
  return recorder;
}
