// The ZitBlt manager of one physical activity (data extension on "PhysicalActivity").
#pragma once

#include <utility>
#include <vector>

#include "QELIZitBltMgr.h"
#include "VOREventPublisher.h"
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
  void Announce();
  // The visibility kept with the document: recorded on every change of a status, applied to
  // the ZitBlts when they are built and again whenever the recorded one changes (undo, redo).
  void RecordStatus(const VORUnicodeString& name, unsigned char status);
  void ApplyRecordedStatuses(bool forgottenMeansShown);
  void FollowRecordedStatuses();
  void StopFollowingRecordedStatuses();

  bool _initialised = false;
  // ZitBlt name -> rep (the creator's reference), in configuration order.
  std::vector<std::pair<VORUnicodeString, QELZitBltRep*>> _zitBlts;
  unsigned char _overallStatus = 1;
  double _lastX = 0.0;
  double _lastY = 0.0;
  double _lastWidth = 0.0;
  double _lastHeight = 0.0;
  VORHandle<VOREventPublisher> _activityPublisher;  // while following the recorded statuses
  VORCallbackId _recordedCallback = 0;
  bool _recording = false;
};
