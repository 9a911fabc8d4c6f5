#include "QELEZitBltMgr.h"

#include "QELBaseListZitBltCmd.h"
#include "QELIPertNode.h"
#include "QELIZitBltCBSubscriber.h"
#include "QELPertNotifications.h"
#include "QELZitBltCommandFactory.h"
#include "QELZitBltConfiguration.h"
#include "QELZitBltRep.h"
#include "VORDeferredDeletion.h"
#include "VORDynamicCast.h"
#include "VORIModelEvents.h"
#include "VORISPPActivity.h"
#include "VORISpecObject.h"
#include "VORIZitBltVisibility.h"
#include "VORModify.h"

namespace {
// The names whose refresh climbs to the parent activity's status bars.
bool IsStatusBar(const VORUnicodeString& name) {
  return QELIsAnyKeyword(name, {"BIWStationStatusBars", "BIWPointFasteningStatusBars",
                                "BIWCurveFasteningStatusBars", "BIWGroupingStatusBars"});
}
}  // namespace

namespace {
// The node's centre as the chart draws it: its placed position, or the provisional one the chart
// gave a node that was never placed. False when the activity is no PERT node.
bool NodeGeometry(VORBaseUnknown* activity, double& x, double& y, double& w, double& h) {
  QELIPertNode_var node{VORBaseUnknown_var(activity)};
  if (!node)
    return false;
  if (node->GetPosition(x, y, 1) == S_FALSE)
    node->GetPosition(x, y, 0);
  node->GetSize(w, h);
  return true;
}
}  // namespace

QELEZitBltMgr::~QELEZitBltMgr() {
  StopFollowingRecordedStatuses();
  for (auto& entry : _zitBlts)
    VORCommandDeletion(entry.second);
}

bool QELEZitBltMgr::LoadConfiguration(VORIDOMDocument_var& document) {
  return QELZitBltConfiguration::LoadConfiguration(document);
}

QELZitBltRep* QELEZitBltMgr::Find(const VORUnicodeString& name) const {
  for (const auto& entry : _zitBlts) {
    if (entry.first == name)
      return entry.second;
  }
  return nullptr;
}

void QELEZitBltMgr::BuildZitBlts() {
  VORBaseUnknown* activity = GetExtendedObject();
  VORIDOMDocument_var document;
  LoadConfiguration(document);
  // The subscriber comes first so that the update commands exist before the reps.
  QELIZitBltCBSubscriber_var subscriber{VORBaseUnknown_var(activity)};
  if (subscriber && !subscriber->IsSubscribed())
    subscriber->Subscribe();
  if (!document)
    return;
  const std::vector<QELZitBltDefinition>& definitions =
      QELZitBltConfiguration::DefinitionsForActivity(document, activity);
  _zitBlts.reserve(definitions.size());
  for (const QELZitBltDefinition& d : definitions) {
    VORCommand* created = QELZitBltCommandFactory::CreateRep(d, activity);
    auto* rep = VORDynamicCast<QELZitBltRep>(created);
    if (rep == nullptr) {
      VORCommandDeletion(created);  // not a ZitBlt (or nothing): skipped
      continue;
    }
    if (Find(d.name) != nullptr) {
      VORCommandDeletion(rep);  // one ZitBlt per name: the first is kept
      continue;
    }
    rep->SetName(d.name);
    rep->SetLocation(d.location);
    rep->SetPriority(d.priority);
    rep->SetInitialState(d.initialState);
    rep->SetIcon(d.iconFile);
    _zitBlts.emplace_back(d.name, rep);
    QELBaseListZitBltCmd* command = nullptr;
    if (subscriber && SUCCEEDED(subscriber->GetUpdateCommand(d.name, &command)) && command)
      command->Activate(rep, nullptr);
  }
  ApplyRecordedStatuses(false);
  FollowRecordedStatuses();
}

int QELEZitBltMgr::BuildZitBltReps(VORViewer* viewer) {
  if (viewer == nullptr)
    return 1;
  if (!_initialised) {
    BuildZitBlts();
    _initialised = true;
  }
  double x = 0.0, y = 0.0, w = 0.0, h = 0.0;
  NodeGeometry(GetExtendedObject(), x, y, w, h);
  _lastX = x;
  _lastY = y;
  _lastWidth = w;
  _lastHeight = h;
  for (auto& entry : _zitBlts) {
    QELZitBltRep* rep = entry.second;
    rep->BuildRep(viewer);
    if (rep->GetZitBltBtn() != nullptr)
      Place(rep, x, y, w, h);
    // New bags are shown: a hidden ZitBlt stays hidden across a rebuild.
    if (rep->GetStatus() != 1)
      rep->SetStatus(rep->GetStatus());
    if (!rep->IsButtonCollapse())
      rep->ChangeBtnState();
  }
  return 1;
}

void QELEZitBltMgr::AnchorFor(const VORUnicodeString& location, double x, double y, double w,
                              double h, double& ax, double& ay) {
  // Offsets are single precision; the button extent is fixed at 0 so that the anchor is the
  // corner or edge midpoint itself. Paired keywords ("lefttop"/"topleft") come out the same.
  const float hw = static_cast<float>(w / 2.0);
  const float hh = static_cast<float>(h / 2.0);
  const float button = 0.0f;
  auto is = [&location](std::initializer_list<std::string_view> keywords) {
    return QELIsAnyKeyword(location, keywords);
  };
  float dx = 0.0f;
  float dy = 0.0f;
  if (is({"lefttop", "topleft"})) {
    dx = -hw + button / 2;
    dy = hh - button / 2;
  } else if (is({"leftmiddle"})) {
    dx = -hw + button / 2;
  } else if (is({"leftbottom", "bottomleft"})) {
    dx = -hw + button / 2;
    dy = -hh + button / 2;
  } else if (is({"righttop", "topright"})) {
    dx = hw - button / 2;
    dy = hh - button / 2;
  } else if (is({"rightmiddle"})) {
    dx = hw - button / 2;
  } else if (is({"rightbottom", "bottomright"})) {
    dx = hw - button / 2;
    dy = -hh + button / 2;
  } else if (is({"topmiddle"})) {
    dy = hh - button / 2;
  } else if (is({"bottommiddle"})) {
    dy = -hh + button / 2;
  }
  ax = x + dx;
  ay = y + dy;
}

void QELEZitBltMgr::Place(QELZitBltRep* rep, double x, double y, double w, double h) {
  if (rep->GetZitBltBtn() == nullptr)
    return;
  rep->SetPositioningLimits(x - w / 2, y - h / 2, x + w / 2, y + h / 2);
  double ax = 0.0;
  double ay = 0.0;
  AnchorFor(rep->GetLocation(), x, y, w, h, ax, ay);
  VOR3x3Matrix matrix;
  matrix.SetTranslation(ax, ay);
  rep->SetBagsMatrix(matrix);
}

HRESULT QELEZitBltMgr::GetZitBltNames(VORListValVORUnicodeString*& names) {
  if (!_initialised) {
    BuildZitBlts();
    _initialised = true;
  }
  names = new VORListValVORUnicodeString();
  for (const auto& entry : _zitBlts)
    names->Append(entry.first);
  return S_OK;
}

HRESULT QELEZitBltMgr::SetZitBltStatus(const VORUnicodeString& name, unsigned char status) {
  // An activity that no viewer shows yet gets its ZitBlts first, so that a change made to
  // several selected activities is kept for each of them.
  if (!_initialised) {
    BuildZitBlts();
    _initialised = true;
  }
  HRESULT result = S_OK;
  if (name == VORUnicodeString("All")) {
    // Only the overall status: the ZitBlts keep their own (the visibility dialog sets each name
    // after "All").
    _overallStatus = status;
    RecordStatus(name, status);
  } else if (QELZitBltRep* rep = Find(name)) {
    rep->SetStatus(status);
    RecordStatus(name, status);
  } else {
    result = E_FAIL;
  }
  Announce();
  return result;
}

void QELEZitBltMgr::Announce() {
  // A status shows or hides bags without a redraw of its own: one for the whole change (the
  // reps share their viewer, and the viewer coalesces requests).
  if (!_zitBlts.empty())
    _zitBlts.front().second->ReDraw();
  VORBaseUnknown* activity = GetExtendedObject();
  if (VORIModelEvents_var events{VORBaseUnknown_var(activity)}; events) {
    auto modify =
        VORHandle<VORModify>::Adopt(new VORModify(activity, VORBaseUnknown::ClassId(), 1));
    events->Dispatch(modify);
    auto info = VORHandle<QELPertAppInfoNotify>::Adopt(
        new QELPertAppInfoNotify(VORBaseUnknown_var(activity)));
    events->Dispatch(info);
  }
}

void QELEZitBltMgr::RecordStatus(const VORUnicodeString& name, unsigned char status) {
  if (status > 1)
    return;  // stored with no effect on the chart: nothing to keep
  VORIZitBltVisibility_var recorded{VORBaseUnknown_var(GetExtendedObject())};
  if (!recorded)
    return;
  _recording = true;
  recorded->SetZitBltShown(name, status == 1);
  _recording = false;
}

void QELEZitBltMgr::ApplyRecordedStatuses(bool forgottenMeansShown) {
  VORIZitBltVisibility_var recorded{VORBaseUnknown_var(GetExtendedObject())};
  if (!recorded)
    return;
  bool shown = true;
  if (recorded->GetZitBltShown("All", shown) == S_OK)
    _overallStatus = shown ? 1 : 0;
  else if (forgottenMeansShown)
    _overallStatus = 1;
  for (auto& entry : _zitBlts) {
    shown = true;
    if (recorded->GetZitBltShown(entry.first, shown) != S_OK && !forgottenMeansShown)
      continue;
    const unsigned char status = shown ? 1 : 0;
    if (entry.second->GetStatus() != status)
      entry.second->SetStatus(status);
  }
}

void QELEZitBltMgr::FollowRecordedStatuses() {
  VORIModelEvents_var events{VORBaseUnknown_var(GetExtendedObject())};
  if (!events || _recordedCallback != 0 || !VORIZitBltVisibility_var(events))
    return;
  // Only this activity's own changes arrive here: one callback per activity with ZitBlts.
  _activityPublisher = events->GetEventPublisher();
  _recordedCallback = _activityPublisher->AddCallback(
      VORModify::ClassName(),
      [this](VORBaseUnknown*, const std::string&, VORNotification* n, void*, VORCallbackId) {
        auto* modify = VORDynamicCast<VORModify>(n);
        if (_recording || modify == nullptr || modify->GetWhat() != "zitblt")
          return;
        ApplyRecordedStatuses(true);
        Announce();
      },
      nullptr, this);
}

void QELEZitBltMgr::StopFollowingRecordedStatuses() {
  if (_recordedCallback != 0 && _activityPublisher)
    _activityPublisher->RemoveCallback(_recordedCallback);
  _recordedCallback = 0;
  _activityPublisher = NULL_var;
}

HRESULT QELEZitBltMgr::GetZitBltStatus(const VORUnicodeString& name, unsigned char& status) {
  if (name == VORUnicodeString("All")) {
    status = _overallStatus;
    return S_OK;
  }
  QELZitBltRep* rep = Find(name);
  if (rep == nullptr)
    return E_FAIL;
  status = rep->GetStatus();
  return S_OK;
}

HRESULT QELEZitBltMgr::GetZitBlt(const VORUnicodeString& name, QELZitBltRep** rep) {
  if (rep == nullptr)
    return E_FAIL;
  *rep = Find(name);
  return *rep != nullptr ? S_OK : E_FAIL;
}

HRESULT QELEZitBltMgr::RemoveZitBlts() {
  StopFollowingRecordedStatuses();
  if (QELIZitBltCBSubscriber_var subscriber{VORBaseUnknown_var(GetExtendedObject())};
      subscriber && subscriber->IsSubscribed())
    subscriber->Unsubscribe();
  for (auto& entry : _zitBlts)
    VORCommandDeletion(entry.second);
  _zitBlts.clear();
  _initialised = false;
  _overallStatus = 0;  // not back to 1: kept so
  return S_OK;
}

void QELEZitBltMgr::UpdateZitBltPositions() {
  double x = 0.0, y = 0.0, w = 0.0, h = 0.0;
  if (!NodeGeometry(GetExtendedObject(), x, y, w, h))
    return;
  if (_lastX == 0.0 && _lastY == 0.0) {
    // Never placed: only remember the geometry.
    _lastX = x;
    _lastY = y;
    _lastWidth = w;
    _lastHeight = h;
    return;
  }
  const bool sameSize = w == _lastWidth && h == _lastHeight;
  for (auto& entry : _zitBlts) {
    QELZitBltRep* rep = entry.second;
    rep->SetPositioningLimits(x - w / 2, y - h / 2, x + w / 2, y + h / 2);
    if (sameSize) {
      rep->TransfromPoD(x - _lastX, y - _lastY);
      continue;
    }
    // Keep the free position at the same relative place of the resized rectangle.
    const double oldLeft = _lastX - _lastWidth / 2;
    const double oldRight = _lastX + _lastWidth / 2;
    const double oldTop = _lastY + _lastHeight / 2;
    const double oldBottom = _lastY - _lastHeight / 2;
    double px = 0.0;
    double py = 0.0;
    rep->GetPoDPosition(px, py);
    if (oldLeft == oldRight || oldTop == oldBottom)
      continue;  // a degenerate old box gives no relative place
    const double nx = (x - w / 2) + ((oldLeft - px) / (oldLeft - oldRight)) * w;
    const double ny = (y + h / 2) - ((oldTop - py) / (oldTop - oldBottom)) * h;
    rep->SetPoDPosition(nx, ny);
  }
  _lastX = x;
  _lastY = y;
  _lastWidth = w;
  _lastHeight = h;
}

void QELEZitBltMgr::UpdateZitBlt(const VORUnicodeString& name) {
  VORBaseUnknown* activity = GetExtendedObject();
  QELIZitBltCBSubscriber_var subscriber{VORBaseUnknown_var(activity)};
  if (!subscriber)
    return;
  QELZitBltRep* rep = Find(name);
  QELBaseListZitBltCmd* command = nullptr;
  if (FAILED(subscriber->GetUpdateCommand(name, &command)) || command == nullptr)
    return;
  command->UpdateList(rep != nullptr ? rep->GetScrollListRep() : nullptr);
  if (!IsStatusBar(name))
    return;
  VORISPPActivity_var spp{VORBaseUnknown_var(activity)};
  VORBaseUnknown_var father;
  if (spp)
    spp->GetFatherActivity(father);
  if (QELIZitBltMgr_var parent(father); parent) {
    parent->UpdateZitBlt("BIWStationStatusBars");
    parent->UpdateZitBlt("BIWGroupingStatusBars");
  }
}

void QELEZitBltMgr::UpdateAllZitBlts() {
  VORListValVORUnicodeString* names = nullptr;
  GetZitBltNames(names);
  if (names == nullptr)
    return;
  for (const VORUnicodeString& name : *names)
    UpdateZitBlt(name);
  delete names;
}
