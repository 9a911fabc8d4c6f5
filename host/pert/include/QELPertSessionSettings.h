// The session's graph-editor settings, kept in the settings repository "QELPertSettings":
// key "GridShown" (1 or 0, grid shown when absent) and "BackgroundColor" ("r g b", each 0..1).
#pragma once

#include "VORTypes.h"

class QELPertSessionSettings {
 public:
  static QELPertSessionSettings* Get();

  bool IsGridShown() const;
  void SetGridShown(bool shown);
  // S_OK and a new array of three components that the caller frees (delete[]); E_FAIL and
  // null when no colour is set or the stored text is not three numbers in 0..1.
  HRESULT GetBackgroundColor(double*& rgb) const;
  void SetBackgroundColor(double r, double g, double b);
  void ClearBackgroundColor();

 private:
  QELPertSessionSettings() = default;
};
