#include "VORFrmPropertiesDlg.h"

#include <memory>
#include <sstream>

#include "QELIBIWActivityStation.h"
#include "VORApplicationFrame.h"
#include "VORDeferredDeletion.h"
#include "VORDlgFrame.h"
#include "VORFrmWindowKinds.h"
#include "VORISPPAbstractActivity.h"
#include "VORISPPFlowMgt.h"
#include "VORISPPProductIO.h"
#include "VORISPPResourceManagement.h"
#include "VORISpecObject.h"

namespace {

VORHandle<VORFrmPropertiesDlg>& Shown() {
  static auto* shown = new VORHandle<VORFrmPropertiesDlg>();  // never destroyed
  return *shown;
}

std::string Number(double value) {
  std::ostringstream text;
  text << value;
  return text.str();
}

// The labels of a list, comma-separated; a product IO stands for its product.
std::string Labels(VORListValVORBaseUnknown_var* list) {
  std::unique_ptr<VORListValVORBaseUnknown_var> owned(list);
  std::string text;
  if (list == nullptr)
    return text;
  for (const VORBaseUnknown_var& item : *list) {
    VORBaseUnknown_var shown = item;
    if (VORISPPProductIO_var io(item); io) {
      VORBaseUnknown_var product;
      if (SUCCEEDED(io->GetProduct(product)) && product)
        shown = product;
    }
    if (!text.empty())
      text += ", ";
    text += VORFrmObjectLabel(shown.get()).ConvertToUTF8();
  }
  return text;
}

std::vector<std::pair<std::string, std::string>> FieldsOf(VORBaseUnknown* object) {
  VORBaseUnknown_var o(object);
  std::string type;
  if (VORISpecObject_var spec(o); spec) {
    VORUnicodeString name;
    if (SUCCEEDED(spec->GetTypeName(name)))
      type = name.ConvertToUTF8();
  }
  std::string time;
  if (VORISPPAbstractActivity_var activity(o); activity) {
    double value = 0.0;
    if (SUCCEEDED(activity->GetActivityTime(value)))
      time = Number(value);
  }
  std::string cycleTime;
  if (QELIBIWActivityStation_var station(o); station) {
    double value = 0.0;
    if (SUCCEEDED(station->GetStationCycleTime(value)))
      cycleTime = Number(value);
  }
  std::string inputs;
  std::string outputs;
  if (VORISPPFlowMgt_var flows(o); flows) {
    VORListValVORBaseUnknown_var* list = nullptr;
    if (SUCCEEDED(flows->GetProductInputs(list)))
      inputs = Labels(list);
    list = nullptr;
    if (SUCCEEDED(flows->GetProductOutputs(list)))
      outputs = Labels(list);
  }
  std::string resources;
  if (VORISPPResourceManagement_var management(o); management) {
    VORListValVORBaseUnknown_var* list = nullptr;
    if (SUCCEEDED(management->GetResources(list)))
      resources = Labels(list);
  }
  return {{"Name", VORFrmObjectLabel(object).ConvertToUTF8()},
          {"Type", type},
          {"Time", time},
          {"Cycle time", cycleTime},
          {"Inputs", inputs},
          {"Outputs", outputs},
          {"Resources", resources}};
}

}  // namespace

VORFrmPropertiesDlg::VORFrmPropertiesDlg(VORBaseUnknown* object)
    : VORDlgDialog(VORApplicationFrame::GetApplicationFrame()->GetMainWindow(), "PropertiesDlg",
                   VORDlgWndBtnOK),
      _object(object),
      _fields(FieldsOf(object)) {
  SetTitle("Properties - " + _fields.front().second);
  for (const char* closing : {GetDiaOKNotification(), GetWindCloseNotification()}) {
    AddCallback(GetEventPublisher(), closing,
                [this](VORBaseUnknown*, VORNotification*, void*) { Close(); });
  }
}

VORFrmPropertiesDlg::~VORFrmPropertiesDlg() = default;

VORFrmPropertiesDlg* VORFrmPropertiesDlg::Show(VORBaseUnknown* object) {
  if (object == nullptr)
    return nullptr;
  if (VORFrmPropertiesDlg* previous = Current())
    previous->Close();
  Shown() = VORHandle<VORFrmPropertiesDlg>::Adopt(new VORFrmPropertiesDlg(object));
  Shown()->Build();
  Shown()->SetVisibility(true);
  return Shown().get();
}

VORFrmPropertiesDlg* VORFrmPropertiesDlg::Current() {
  return Shown().get();
}

void VORFrmPropertiesDlg::Build() {
  auto* frame = new VORDlgFrame(this, "PropertiesFrame");
  frame->SetGridConstraints(0, 0, 1, 1, VORDlgAttach4Sides);
  int row = 0;
  for (const auto& [field, value] : _fields) {
    auto* name = new VORDlgLabel(frame, field);
    name->SetTitle(field);
    name->SetGridConstraints(row, 0, 1, 1, 0);
    auto* text = new VORDlgLabel(frame, field + "Value");
    text->SetTitle(value);
    text->SetGridConstraints(row, 1, 1, 1, 0);
    ++row;
  }
}

void VORFrmPropertiesDlg::Close() {
  if (Shown().get() != this)
    return;
  SetVisibility(false);
  RemoveCallbacksOn(GetEventPublisher());
  VORCommandDeletion(Shown().Detach());
}
