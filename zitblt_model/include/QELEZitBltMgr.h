// The ZitBlt manager of one physical activity (data extension on "PhysicalActivity").
#pragma once

#include <utility>
#include <vector>

#include "QELIZitBltMgr.h"
#include "VORExtension.h"

class QELEZitBltMgr : public VORExtension, public QELIZitBltMgr {
  VOR_DECLARE_CLASS(QELEZitBltMgr, VORExtension)
 public:
  QELEZitBltMgr() = default;

  int BuildZitBltReps(VORViewer* viewer) override;
  HRESULT GetZitBltNames(VORListValVORUnicodeString*& names) override;
  HRESULT SetZitBltStatus(const VORUnicodeString& name, unsigned char status) override;
  HRESULT GetZitBltStatus(const VORUnicodeString& name, unsigned char& status) override;
  HRESULT GetZitBlt(const VORUnicodeString& name, QELZitBltRep** rep) override;
  HRESULT RemoveZitBlts() override;
  void UpdateZitBltPositions() override;
  void UpdateZitBlt(const VORUnicodeString& name) override;
  bool LoadConfiguration(VORIDOMDocument_var& document) override;
  void UpdateAllZitBlts() override;

  // Translation of a ZitBlt anchored by location on a w x h node centred at (x, y).
  static void AnchorFor(const VORUnicodeString& location, double x, double y, double w, double h,
                        double& ax, double& ay);

 protected:
  ~QELEZitBltMgr() override;

 private:
  void BuildZitBlts();
  void Place(QELZitBltRep* rep, double x, double y, double w, double h);
  QELZitBltRep* Find(const VORUnicodeString& name) const;

  bool _initialised = false;
  // ZitBlt name -> rep (the creator's reference), in configuration order.
  std::vector<std::pair<VORUnicodeString, QELZitBltRep*>> _zitBlts;
  unsigned char _overallStatus = 1;
  double _lastX = 0.0;
  double _lastY = 0.0;
  double _lastWidth = 0.0;
  double _lastHeight = 0.0;
};
