#include "QELPertSessionSettings.h"

#include <sstream>

#include "VORSettingRepository.h"

namespace {
VORSettingRepository* Repository() {
  return VORSettingRepository::GetRepository("QELPertSettings");
}
}  // namespace

QELPertSessionSettings* QELPertSessionSettings::Get() {
  static QELPertSessionSettings settings;
  return &settings;
}

bool QELPertSessionSettings::IsGridShown() const {
  int shown = 1;
  if (Repository()->ReadSetting("GridShown", shown) != S_OK)
    return true;
  return shown != 0;
}

void QELPertSessionSettings::SetGridShown(bool shown) {
  Repository()->WriteSetting("GridShown", shown ? 1 : 0);
}

HRESULT QELPertSessionSettings::GetBackgroundColor(double*& rgb) const {
  rgb = nullptr;
  VORUnicodeString text;
  if (Repository()->ReadSetting("BackgroundColor", text) != S_OK)
    return E_FAIL;
  std::istringstream in(text.ConvertToUTF8());
  double c[3] = {0.0, 0.0, 0.0};
  for (double& v : c) {
    if (!(in >> v) || v < 0.0 || v > 1.0)
      return E_FAIL;
  }
  std::string rest;
  if (in >> rest)
    return E_FAIL;
  rgb = new double[3]{c[0], c[1], c[2]};
  return S_OK;
}

void QELPertSessionSettings::SetBackgroundColor(double r, double g, double b) {
  std::ostringstream out;
  out << r << ' ' << g << ' ' << b;
  Repository()->WriteSetting("BackgroundColor", VORUnicodeString(out.str()));
}

void QELPertSessionSettings::ClearBackgroundColor() {
  Repository()->RemoveSetting("BackgroundColor");
}
