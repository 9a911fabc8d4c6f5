#include "QELBaseScrollListZitBltRep.h"

#include <cerrno>
#include <cmath>
#include <cstdio>
#include <cstdlib>

#include "QELIBIWCurveFasteningActivity.h"
#include "QELIBIWWeldingActivity.h"
#include "QELIListZitBltItem.h"
#include "QELIZitBltCBSubscriber.h"
#include "QELIZitBltMgr.h"
#include "QELPFViewerItemRepComponent.h"
#include "QELScrollListDrop.h"
#include "QELScrollListSelectionWatch.h"
#include "VORCommandHeader.h"
#include "VORDeferredDeletion.h"
#include "VORDlgContextualMenu.h"
#include "VOREnv.h"
#include "VORFrmEditor.h"
#include "VORISPPActivity.h"

namespace {
VORCSO* CurrentCSO() {
  VORFrmEditor* editor = VORFrmEditor::GetCurrentEditor();
  return editor != nullptr ? editor->GetCSO() : nullptr;
}

// The identifying value of an item: its first interface, here its identity.
VORBaseUnknown* IdentityOf(VORBaseUnknown* item) {
  return item != nullptr ? item->GetIdentity() : nullptr;
}

// Colours of the scroll bar: a light track and a dark scroller.
constexpr int kTrackColour = 10;
constexpr int kScrollerColour = 9;
constexpr int kScrollerThickness = 8;

// Cursor shapes while items are dragged.
constexpr int kCursorDragging = 5;
constexpr int kCursorDropAllowed = 8;
constexpr int kCursorAfterDrag = 25;
}  // namespace

bool QELIsBottomGroupLocation(const VORUnicodeString& location) {
  return QELIsAnyKeyword(location, {"leftbottom", "bottomleft", "bottommiddle", "leftmiddle",
                                    "rightbottom", "bottomright"});
}

bool QELIsTopGroupLocation(const VORUnicodeString& location) {
  return QELIsAnyKeyword(
      location, {"lefttop", "topleft", "topmiddle", "topright", "righttop", "rightmiddle"});
}

int QELBaseScrollListZitBltRep::RangeFromEnvironment(int fallback) {
  const char* text = VORGetEnv("ScrollListRange");
  if (text == nullptr)
    return fallback;
  // A whole decimal number of visible items; anything else (empty, "abc", "3x", zero, negative,
  // out of range) keeps the fallback rather than drawing a list that shows nothing.
  errno = 0;
  char* end = nullptr;
  const long value = std::strtol(text, &end, 10);
  if (end == text || *end != '\0' || errno == ERANGE || value < 1 || value > kMaxRange)
    return fallback;
  return static_cast<int>(value);
}

QELBaseScrollListZitBltRep::QELBaseScrollListZitBltRep(VORBaseUnknown* owner, int range)
    : _owner(owner), _range(RangeFromEnvironment(range)) {}

VOR2DManipulator* QELBaseScrollListZitBltRep::GetScrollManipulator() {
  // Made on first need (a scroll bar drawn, a script step): most lists of a level never scroll.
  if (_scrollManipulator != nullptr)
    return _scrollManipulator;
  _scrollManipulator = new VOR2DManipulator(this, "ScrollManip", nullptr, 1, 0);
  _scrollManipulator->SetDirection(VORMathVector2Df(0.0f, 1.0f));
  _scrollManipulator->SetPosition(VORMathAxis2D(
      VORMathPoint2D(0.0, 0.0), VORMathVector2Df(1.0f, 0.0f), VORMathVector2Df(0.0f, 1.0f)));
  VOREventPublisher* scroll = _scrollManipulator->GetEventPublisher();
  AddCallback(scroll, VORManipulator::kVORManipulate,
              [this](VORBaseUnknown*, VORNotification*, void*) { OnScrollbarManipulate(); });
  AddCallback(scroll, VORManipulator::kVORPreactivate,
              [this](VORBaseUnknown*, VORNotification*, void*) { OnScrollbarBalloonHelp(); });
  AddCallback(scroll, VORManipulator::kVOREndPreactivate,
              [this](VORBaseUnknown*, VORNotification*, void*) { OnScrollbarBalloonHide(); });
  AddCallback(scroll, VORManipulator::kVORActivate,
              [this](VORBaseUnknown*, VORNotification*, void*) { OnScrollbarBalloonHide(); });
  return _scrollManipulator;
}

VOR2DManipulator* QELBaseScrollListZitBltRep::GetItemManipulator() {
  // Made on first need (an item selected or dragged, a script step): a list nobody touches
  // carries no manipulator and no callbacks.
  if (_itemManipulator != nullptr)
    return _itemManipulator;
  _itemManipulator = new VOR2DManipulator(this, "ActivManip", nullptr, 2, 0);
  VOREventPublisher* items = _itemManipulator->GetEventPublisher();
  AddCallback(items, VORManipulator::kVORManipulate,
              [this](VORBaseUnknown*, VORNotification*, void*) { OnVORManipulate(); });
  AddCallback(items, VORManipulator::kVOREndManipulate,
              [this](VORBaseUnknown*, VORNotification*, void*) { OnVOREndManipulate(); });
  return _itemManipulator;
}

QELBaseScrollListZitBltRep::~QELBaseScrollListZitBltRep() {
  StopWatchingSelection();
  DeselectItems();
  // The item reps hold their components and the components their reps: break each pair.
  for (const QELIScrollListZitBltItemVisu_var& visual : _itemVisuals) {
    VORExtIVisu_var visu{VORBaseUnknown_var(visual.get())};
    if (!visu)
      continue;
    if (auto* rep = dynamic_cast<VOR2DBagRep*>(visu->GetRep())) {
      rep->SetObject(nullptr);
      if (VOR2DBagRep* father = rep->GetFather())
        father->DestroyChild(rep);
    }
    visu->ForgetRep();
  }
  _itemVisuals.clear();
  if (_balloon)
    _balloon->Hide(1);
  for (VOR2DManipulator* manipulator : {_itemManipulator, _scrollManipulator}) {
    if (manipulator == nullptr)
      continue;
    RemoveCallbacksOn(manipulator->GetEventPublisher());
    manipulator->RemoveAllElements();
    manipulator->SetFather(nullptr);
    VORCommandDeletion(manipulator);
  }
  _items.RemoveAll();
  _appended.RemoveAll();
}

void QELBaseScrollListZitBltRep::BuildRep(VORViewer* viewer) {
  if (viewer != nullptr) {
    _viewer = viewer;
    QELZitBltRep::BuildRep(viewer);
  }
  if (!GetZitBltBtn())
    return;
  // The selection set of the viewer's editor: the list starts watching it with its first item
  // rep, before which nothing of the list can be picked.
  if (!_cso)
    _cso = CurrentCSO();
  if (!_items.IsEmpty()) {
    ReFreshZitBltReps(GetLocation());
  } else if (!IsButtonGrey()) {
    SetZitbltButtonGrey(1);
  }
}

void QELBaseScrollListZitBltRep::WatchSelection() {
  if (_watchingSelection || !_cso)
    return;
  _watchingSelection = true;
  QELScrollListSelectionWatch::Add(_cso, this);
  InitCSOElem(_cso, 0);
}

void QELBaseScrollListZitBltRep::StopWatchingSelection() {
  if (!_watchingSelection)
    return;
  QELScrollListSelectionWatch::Remove(this);
  _watchingSelection = false;
}

bool QELBaseScrollListZitBltRep::IsItDuplicate(VORBaseUnknown* item) const {
  if (item == nullptr || _items.IsEmpty())
    return false;
  VORBaseUnknown* identity = IdentityOf(item);
  for (const VORBaseUnknown_var& listed : _items) {
    if (IdentityOf(listed.get()) == identity)
      return true;
  }
  return false;
}

bool QELBaseScrollListZitBltRep::AddItem(VORBaseUnknown* item, int state) {
  if (item == nullptr || IsItDuplicate(item))
    return false;
  _items.Append(VORBaseUnknown_var(item));
  _itemStates.push_back(state);
  _itemsAdded = 1;
  return true;
}

int QELBaseScrollListZitBltRep::GetItemState(int position) const {
  if (position < 1 || position > static_cast<int>(_itemStates.size()))
    return -1;
  return _itemStates[static_cast<size_t>(position - 1)];
}

void QELBaseScrollListZitBltRep::AppendItem(VORBaseUnknown* item, int kindFlag) {
  DrawPending();
  AddItem(item, kindFlag);
  // The kind is recorded even for a refused duplicate; other flags record none.
  if (kindFlag == 0 || kindFlag == 1)
    _kinds.push_back(kindFlag + 1);
}

void QELBaseScrollListZitBltRep::RestoreButtonColour() {
  if (IsButtonGrey())
    SetZitbltButtonGrey(0);  // in colour already: the icon need not be rebuilt
}

void QELBaseScrollListZitBltRep::AppendScrollList(VORBaseUnknown* item, bool noGreyChange,
                                                  int typeCode) {
  DrawPending();
  if (item == nullptr)
    return;
  _appended.Append(VORBaseUnknown_var(item));
  _appended.RemoveDuplicates();
  if (!GetZitBltBtn())
    return;
  if (_appended.Size() == 1 && !noGreyChange)
    RestoreButtonColour();
  const int last = _appended.Size();
  AddListItemRep(GetZitBltExpanded(), _appended[last], last, typeCode);
  ReDraw();
}

void QELBaseScrollListZitBltRep::AddListItemRep(VOR2DBagRep* bag, VORBaseUnknown* item, int index,
                                                int typeCode) {
  DrawPending();
  if (bag == nullptr || !QELIListZitBltItem_var(VORBaseUnknown_var(item)))
    return;
  auto component = VORHandle<QELPFViewerItemRepComponent>::Adopt(
      new QELPFViewerItemRepComponent(_owner, item, static_cast<unsigned int>(typeCode)));
  QELIScrollListZitBltItemVisu_var visual(component.get());
  WatchSelection();
  _itemVisuals.push_back(visual);
  visual->SetItemPos(index, GetLocation());
  visual->SetZitBltName(GetName());
  auto rep = VOR2DRep_var::Adopt(component->BuildRep());
  bag->AddChild(rep);
}

void QELBaseScrollListZitBltRep::ClearLists() {
  DrawPending();
  _items.RemoveAll();
  _itemStates.clear();
  _appended.RemoveAll();
}

void QELBaseScrollListZitBltRep::DeselectItems() {
  // Only paths through this list's item components are taken out of the selection: the rest
  // of what the planner selected stays. Nothing of this list is selected unless an item rep
  // rides on the item manipulator.
  VORCSO* cso = CurrentCSO();
  if (cso == nullptr || _itemManipulator == nullptr || _itemManipulator->GetElementCount() == 0)
    return;
  VORListValVORBaseUnknown_var ours;
  for (int i = 1; i <= cso->GetSize(); ++i) {
    if (ItemOfThisList(cso->GetElement(i)) != nullptr)
      ours.Append(VORBaseUnknown_var(cso->GetElement(i)));
  }
  for (const VORBaseUnknown_var& path : ours)
    cso->RemoveElement(path);
  _itemManipulator->RemoveAllElements();
}

void QELBaseScrollListZitBltRep::RemoveAllItems(unsigned char greyButton) {
  _drawPending = false;  // its reps would go at once
  DeselectItems();
  for (const QELIScrollListZitBltItemVisu_var& visual : _itemVisuals) {
    VORExtIVisu_var visu{VORBaseUnknown_var(visual.get())};
    if (!visu)
      continue;
    if (auto* rep = dynamic_cast<VOR2DBagRep*>(visu->GetRep())) {
      rep->EmptyBag();
      rep->SetObject(nullptr);
      if (VOR2DBagRep* father = rep->GetFather())
        father->DestroyChild(rep);
    }
    visu->ForgetRep();
  }
  _itemVisuals.clear();
  _kinds.clear();
  _itemsAdded = 0;
  ClearLists();
  EmptyExpandedBagRep();
  if (!GetZitBltBtn())
    return;
  if (greyButton == 1 && !IsButtonGrey())
    SetZitbltButtonGrey(1);
  // The track and the scroller go with the bag's other children.
  if (_scroller && _scrollManipulator != nullptr)
    _scrollManipulator->RemoveElement(_scroller);
  _scroller = NULL_var;
  _track = NULL_var;
  if (_expandedBag)
    _expandedBag->EmptyBag();
  ReDraw();
}

void QELBaseScrollListZitBltRep::RemoveScroller() {
  if (_scroller) {
    if (_scrollManipulator != nullptr)
      _scrollManipulator->RemoveElement(_scroller);
    if (VOR2DBagRep* father = _scroller->GetFather())
      father->DestroyChild(_scroller);
  }
  if (_track) {
    if (VOR2DBagRep* father = _track->GetFather())
      father->DestroyChild(_track);
  }
  _scroller = NULL_var;
  _track = NULL_var;
}

void QELBaseScrollListZitBltRep::ReFreshZitBltReps(const VORUnicodeString& location) {
  SetLocation(location);
  const VORListValVORBaseUnknown_var items = _items;
  const std::vector<int> states = _itemStates;
  const std::vector<int> kinds = _kinds;
  RemoveScroller();
  RemoveAllItems(0);
  for (int i = 1; i <= items.Size(); ++i) {
    const size_t at = static_cast<size_t>(i - 1);
    const int state = at < states.size() ? states[at] : -1;
    const bool kept = at < kinds.size() && kinds[at] == 2;
    AddItem(items[i], state);
    _kinds.push_back(kept ? 2 : 1);
  }
  if (!items.IsEmpty())
    DrawScrollList();
}

bool QELBaseScrollListZitBltRep::DeferDrawing() {
  // Only a hidden list drawn from scratch that does not scroll: what such a drawing changes
  // besides its reps (the first item, the button's colour) is done here, and its reps follow
  // the same drawing later, as nothing the drawing reads changes meanwhile.
  const int n = _items.Size();
  if (n == 0 || !GetZitBltBtn() || IsExpandedShown() || !_appended.IsEmpty() ||
      !_itemVisuals.empty() || (n > _range && !_scrollBarHidden))
    return false;
  _first = 1;
  RestoreButtonColour();
  _drawPending = true;
  ReDraw();
  return true;
}

void QELBaseScrollListZitBltRep::DrawPending() {
  if (!_drawPending)
    return;
  _drawPending = false;
  // The button took its colour when the drawing was deferred; it may have been greyed since.
  _keepButtonColour = true;
  DrawScrollList();
  _keepButtonColour = false;
}

void QELBaseScrollListZitBltRep::BeforeExpandedShown() {
  DrawPending();
}

void QELBaseScrollListZitBltRep::DrawScrollList() {
  DrawPending();
  if (!_keepButtonColour && DeferDrawing())
    return;
  const int n = _items.Size();
  const int r = _range;
  if (static_cast<long long>(_first) - 1 + r > n)
    _first = n - r + 1;
  int last = n;
  if (r >= n || _scrollBarHidden) {
    _first = 1;
  } else {
    last = _first - 1 + r;
    AddScroller();
  }
  const bool kindsCoverVisible = static_cast<int>(_kinds.size()) >= last;
  for (int i = 1; i <= n; ++i) {
    const bool kept = kindsCoverVisible && _kinds[static_cast<size_t>(i - 1)] == 2;
    AppendScrollList(_items[i], _keepButtonColour, kept ? kKeptItemCode : kItemCode);
  }
  if (_scrollBarHidden)
    return;
  const int visuals = GetItemVisualCount();
  if (visuals > 0 && _first >= 1 && static_cast<long long>(_first) <= visuals - r + 1LL) {
    const double dy = QELIsBottomGroupLocation(GetLocation())
                          ? kItemPitch
                          : (QELIsTopGroupLocation(GetLocation()) ? -kItemPitch : 0.0);
    for (int step = 1; step < _first; ++step)
      ShiftLabels(dy);
    UpdateShowModes();
  }
  ReDraw();
}

void QELBaseScrollListZitBltRep::ShiftLabels(double dy) {
  if (dy == 0.0)
    return;
  for (const QELIScrollListZitBltItemVisu_var& visual : _itemVisuals) {
    VORIVisu_var visu{VORBaseUnknown_var(visual.get())};
    auto* rep = visu ? dynamic_cast<VOR2DBagRep*>(visu->GetRep()) : nullptr;
    auto* label = rep != nullptr ? dynamic_cast<VOR2DBagRep*>(rep->GetChild(1)) : nullptr;
    if (label == nullptr)
      continue;
    VOR3x3Matrix m;
    label->GetMatrix(m);
    double tx = 0.0;
    double ty = 0.0;
    m.GetTranslation(tx, ty);
    m.SetTranslation(tx, ty + dy);
    label->SetMatrix(m);
  }
}

void QELBaseScrollListZitBltRep::UpdateShowModes() {
  int i = 0;
  const long long lastShown = static_cast<long long>(_first) + _range - 1;
  for (const QELIScrollListZitBltItemVisu_var& visual : _itemVisuals) {
    ++i;
    VORIVisu_var visu{VORBaseUnknown_var(visual.get())};
    auto* rep = visu ? dynamic_cast<VOR2DBagRep*>(visu->GetRep()) : nullptr;
    if (rep == nullptr)
      continue;
    if (VOR2DRep* label = rep->GetChild(1))
      label->SetShowMode(i < _first || i > lastShown ? 1 : 0);
    // The links stay with the first range slots, whichever items scrolled into them.
    if (VOR2DRep* link = rep->GetChild(2))
      link->SetShowMode(i > _range ? 1 : 0);
  }
}

void QELBaseScrollListZitBltRep::AddScroller() {
  const int n = _items.Size();
  const int r = _range;
  if (n <= r || _scrollBarHidden || !GetZitBltBtn())
    return;
  const double t = (_first - 1) * static_cast<double>(r) * kTrackPerItem / (n - r);
  const double length = kTrackPerItem * r;
  const VORUnicodeString& l = GetLocation();
  double x0 = 0.0, x1 = 0.0, y0 = 0.0, y1 = 0.0;  // outer and inner edge, start and end
  double sx0 = 0.0, sx1 = 0.0, sy = 0.0;          // the scroller
  if (QELIsAnyKeyword(l, {"bottommiddle", "bottomright", "bottomleft"})) {
    x0 = 0.0, x1 = 0.2, y0 = -5.0, y1 = -length - 5.0;
    sx0 = -0.75, sx1 = 0.95, sy = -(t + 5.0);
    _growsUp = 0;
  } else if (QELIsAnyKeyword(l, {"topmiddle", "topright", "topleft"})) {
    x0 = 0.0, x1 = 0.2, y0 = 5.0, y1 = length + 5.0;
    sx0 = -0.75, sx1 = 0.95, sy = t + 5.0;
    _growsUp = 1;
  } else if (QELIsKeyword(l, "lefttop")) {
    x0 = -5.0, x1 = -4.8, y0 = 0.0, y1 = length;
    sx0 = -5.75, sx1 = -4.05, sy = t;
    _growsUp = 1;
  } else if (QELIsKeyword(l, "righttop")) {
    x0 = 5.0, x1 = 4.8, y0 = 0.0, y1 = length;
    sx0 = 4.25, sx1 = 5.55, sy = t;
    _growsUp = 1;
  } else if (QELIsKeyword(l, "leftbottom")) {
    x0 = -5.0, x1 = -4.8, y0 = 0.0, y1 = -length;
    sx0 = -5.75, sx1 = -4.05, sy = -t;
    _growsUp = 0;
  } else if (QELIsKeyword(l, "rightbottom")) {
    x0 = 5.0, x1 = 4.8, y0 = 0.0, y1 = -length;
    sx0 = 4.25, sx1 = 5.55, sy = -t;
    _growsUp = 0;
  } else {
    return;  // "leftmiddle", "rightmiddle" and unknown keywords have no scroll bar
  }
  const float corners[8] = {static_cast<float>(x0), static_cast<float>(y0), static_cast<float>(x1),
                            static_cast<float>(y0), static_cast<float>(x1), static_cast<float>(y1),
                            static_cast<float>(x0), static_cast<float>(y1)};
  _track = VOR2DPolygonRep_var::Adopt(new VOR2DPolygonRep(corners, 4, 1));
  _track->SetColorIndex(kTrackColour);
  _scroller =
      VOR2DLineRep_var::Adopt(new VOR2DLineRep(static_cast<float>(sx0), static_cast<float>(sy),
                                               static_cast<float>(sx1), static_cast<float>(sy)));
  _scroller->SetColorIndex(kScrollerColour);
  _scroller->SetLineThickness(kScrollerThickness);
  GetZitBltExpanded()->AddChild(_track);
  GetZitBltExpanded()->AddChild(_scroller);
  GetScrollManipulator()->AddElement(_scroller);
}

void QELBaseScrollListZitBltRep::SetScrollPosition(double x, int first) {
  VORMathAxis2D axis;
  GetScrollManipulator()->GetPosition(axis);
  axis.origin.x = x;
  // A list that grows downwards reads its position negated.
  axis.origin.y = _growsUp ? first : -static_cast<double>(first);
  GetScrollManipulator()->SetPosition(axis);
}

void QELBaseScrollListZitBltRep::OnScrollbarManipulate() {
  VORMathAxis2D axis;
  GetScrollManipulator()->GetPosition(axis);
  const double x = axis.origin.x;
  double y = _growsUp ? axis.origin.y : -axis.origin.y;
  if (!(y >= 1.0)) {  // also catches a position that is not a number
    y = 1.0;
    SetScrollPosition(x, 1);
  }
  const int n = _items.Size();
  // Past the end snaps to the last window; a huge position must not overflow the conversion.
  const double beyond = static_cast<double>(n) + 1.0;
  _first = static_cast<int>(std::min(y, beyond));
  if (static_cast<long long>(_first) + _range - 1 <= n) {
    OnScrollerMoved();
    _previousFirst = _first;
  } else {
    _first = n - _range + 1;
    SetScrollPosition(x, _first);
  }
}

void QELBaseScrollListZitBltRep::OnScrollerMoved() {
  if (_first == _previousFirst)
    return;
  if (_first == 1) {
    ReFreshZitBltReps(GetLocation());
    return;
  }
  const int visuals = GetItemVisualCount();
  if (visuals == 0)
    return;
  const int m = visuals - _range + 1;
  if (_first > m)
    return;
  if (_first == m || std::abs(_first - _previousFirst) > 1) {
    ReFreshZitBltReps(GetLocation());
    return;
  }
  // One step: move the labels by one pitch instead of rebuilding the list.
  RemoveScroller();
  AddScroller();
  const bool back = _first <= _previousFirst;
  double dy = 0.0;
  if (QELIsBottomGroupLocation(GetLocation()))
    dy = back ? -kItemPitch : kItemPitch;
  else if (QELIsTopGroupLocation(GetLocation()))
    dy = back ? kItemPitch : -kItemPitch;
  ShiftLabels(dy);
  UpdateShowModes();
  ReDraw();
}

void QELBaseScrollListZitBltRep::OnScrollbarBalloonHelp() {
  if (!_viewer)
    return;
  if (!_balloon)
    _balloon = VORPVBalloon_var::Adopt(new VORPVBalloon(_viewer.get()));
  char text[32];
  std::snprintf(text, sizeof text, "Size = %d", _items.Size());
  _balloon->SetVisibility(1);
  _balloon->Show(VORUnicodeString(text));
}

void QELBaseScrollListZitBltRep::OnScrollbarBalloonHide() {
  if (_balloon)
    _balloon->Hide(1);
}

void QELBaseScrollListZitBltRep::OnZitBtnContextMenu(VORNotification* notif) {
  if (_items.Size() < static_cast<long long>(_range) + 1)
    return;
  auto* context = dynamic_cast<VORContext*>(notif);
  VORDlgContextualMenu* menu = VORDlgContextualMenu::FromContext(context);
  if (menu == nullptr)
    return;
  menu->RemoveAllItems();
  auto* item = new VORDlgPushItem(menu, "HideShowScrollBar");  // the menu holds its items
  item->SetTitle(VORUnicodeString(_scrollBarHidden ? "ShowScrollBar" : "HideScrollBar"));
  // One menu at a time: the entry of an earlier menu no longer reaches this list.
  if (_menuCallback != 0)
    RemoveCallback(_menuCallback);
  _menuCallback =
      AddCallback(item->GetEventPublisher(), VORDlgPushItem::GetMenuIActivateNotification(),
                  [this](VORBaseUnknown*, VORNotification*, void*) { HideShowNotif(); });
}

void QELBaseScrollListZitBltRep::HideShowNotif() {
  _scrollBarHidden = _scrollBarHidden ? 0 : 1;
  ReFreshZitBltReps(GetLocation());
}

void QELBaseScrollListZitBltRep::SetZitbltScrollBarHideState(unsigned char hidden) {
  _scrollBarHidden = hidden;
  ReFreshZitBltReps(GetLocation());
}

void QELBaseScrollListZitBltRep::SetScrollRange(int range) {
  // A range below one would show nothing and divide the track by zero.
  _range = range >= 1 ? range : 1;
  ReFreshZitBltReps(GetLocation());
}

int QELBaseScrollListZitBltRep::GetItemVisualCount() {
  DrawPending();
  return static_cast<int>(_itemVisuals.size());
}

VOR2DLineRep* QELBaseScrollListZitBltRep::GetScroller() {
  DrawPending();
  return _scroller.get();
}

VOR2DPolygonRep* QELBaseScrollListZitBltRep::GetScrollTrack() {
  DrawPending();
  return _track.get();
}

QELIScrollListZitBltItemVisu* QELBaseScrollListZitBltRep::GetItemVisual(int position) {
  if (position < 1 || position > GetItemVisualCount())
    return nullptr;
  return _itemVisuals[static_cast<size_t>(position - 1)].get();
}

QELIScrollListZitBltItemVisu* QELBaseScrollListZitBltRep::ItemOfThisList(
    VORPathElement* element) const {
  if (element == nullptr)
    return nullptr;
  for (int i = element->GetSize(); i >= 1; --i) {
    QELIScrollListZitBltItemVisu_var visual{VORBaseUnknown_var(element->GetElement(i))};
    if (visual && visual->GetZitBltName() == GetName() &&
        visual->GetAssociatedActivityNode() == _owner)
      return visual.get();
  }
  return nullptr;
}

void QELBaseScrollListZitBltRep::AddObjectToManip(VORPathElement* element) {
  VORIVisu_var visu{VORBaseUnknown_var(ItemOfThisList(element))};
  if (visu && visu->GetRep() != nullptr)
    GetItemManipulator()->AddElement(visu->GetRep());
}

void QELBaseScrollListZitBltRep::RemoveObjectToManip(VORPathElement* element) {
  VORIVisu_var visu{VORBaseUnknown_var(ItemOfThisList(element))};
  if (visu && visu->GetRep() != nullptr && _itemManipulator != nullptr)
    _itemManipulator->RemoveElement(visu->GetRep());
}

void QELBaseScrollListZitBltRep::ValidateAddRemElem(VORPathElement* element, int remove) {
  if (ItemOfThisList(element) == nullptr)
    return;
  if (remove == 0)
    AddObjectToManip(element);
  else
    RemoveObjectToManip(element);
}

void QELBaseScrollListZitBltRep::InitCSOElem(VORCSO* cso, int remove) {
  if (cso != nullptr) {
    _csoBusy = 1;
    for (int i = 1; i <= cso->GetSize(); ++i)
      ValidateAddRemElem(cso->GetElement(i), remove);
  }
  _csoBusy = 0;
}

void QELBaseScrollListZitBltRep::OnCSONotif(VORNotification* notif) {
  auto* change = dynamic_cast<VORCSOChangeNotification*>(notif);
  if (change == nullptr)
    return;
  for (const VORBaseUnknown_var& element : change->GetRemovedElements())
    ValidateAddRemElem(dynamic_cast<VORPathElement*>(element.get()), 1);
  for (const VORBaseUnknown_var& element : change->GetAddedElements())
    ValidateAddRemElem(dynamic_cast<VORPathElement*>(element.get()), 0);
}

std::vector<QELIScrollListZitBltItemVisu_var> QELBaseScrollListZitBltRep::DraggedItems() const {
  std::vector<QELIScrollListZitBltItemVisu_var> dragged;
  if (_itemManipulator == nullptr)
    return dragged;
  for (const VORHandle<VOR2DRep>& element : _itemManipulator->GetElements()) {
    QELIScrollListZitBltItemVisu_var visual{VORBaseUnknown_var(element->GetObject())};
    if (visual && visual->GetAssociatedPFItem() != nullptr)
      dragged.push_back(visual);
  }
  return dragged;
}

void QELBaseScrollListZitBltRep::JudgeDropTarget(const VORMathPoint2D& point) {
  _dropTarget = NULL_var;
  _dropRefusal = VORUnicodeString();
  const std::vector<QELIScrollListZitBltItemVisu_var> dragged = DraggedItems();
  // The dragged lines are under the pointer themselves: look through them.
  auto isDragged = [&dragged](VORBaseUnknown* element) {
    for (const QELIScrollListZitBltItemVisu_var& visual : dragged) {
      if (visual.Identity() == element->GetIdentity())
        return true;
    }
    return false;
  };
  for (const VORPathElement_var& path : _viewer->PickPathsAtModelPoint(point.x, point.y)) {
    if (path->SearchElement(isDragged))
      continue;
    if (VORISPPActivity_var activity = path->SearchElement<VORISPPActivity>(); activity) {
      _dropTarget = VORBaseUnknown_var(activity);
      break;
    }
  }
  bool refused = false;
  for (const QELIScrollListZitBltItemVisu_var& visual : dragged) {
    VORBaseUnknown* source = visual->GetAssociatedActivityNode();
    if (!_dropTarget || source == nullptr || source->GetIdentity() == _dropTarget.Identity())
      continue;  // back over its own activity, or over no activity: nothing to say
    VORUnicodeString message;
    if (QELScrollListDrop::Check(visual->GetAssociatedPFItem(), source, _dropTarget, message)) {
      _viewer->SetCursor(kCursorDropAllowed);
      _validTarget = 1;
    } else if (!refused) {
      _dropRefusal = message;
      refused = true;
    }
  }
  if (_validTarget)
    _dropRefusal = VORUnicodeString();
  // A refusal is said beside the pointer, so that a drop there never looks like nothing.
  if (!_dropRefusal.IsEmpty()) {
    if (!_dropBalloon)
      _dropBalloon = VORPVBalloon_var::Adopt(new VORPVBalloon(_viewer.get()));
    _dropBalloon->SetVisibility(1);
    _dropBalloon->Show(_dropRefusal, point);
  } else if (_dropBalloon) {
    _dropBalloon->Hide(1);
  }
}

void QELBaseScrollListZitBltRep::OnVORManipulate() {
  _csoBusy = 1;
  _validTarget = 0;
  if (!_viewer || _itemManipulator == nullptr || _itemManipulator->GetElementCount() == 0)
    return;
  _viewer->SetCursor(kCursorDragging);
  const VORMathPoint2D point = _itemManipulator->GetCurrentPoint();
  JudgeDropTarget(point);
  const auto px = static_cast<float>(point.x);
  const auto py = static_cast<float>(point.y);
  if (_itemDragX == 0.0f && _itemDragY == 0.0f) {
    _itemDragX = px;
    _itemDragY = py;
    return;
  }
  const double dx = px - _itemDragX;
  const double dy = py - _itemDragY;
  for (const VORHandle<VOR2DRep>& element : _itemManipulator->GetElements()) {
    auto* rep = dynamic_cast<VOR2DBagRep*>(element.get());
    if (rep == nullptr)
      continue;
    VOR3x3Matrix m;
    rep->GetMatrix(m);
    double tx = 0.0;
    double ty = 0.0;
    m.GetTranslation(tx, ty);
    m.SetTranslation(tx + dx, ty + dy);
    rep->SetMatrix(m);
    if (rep->GetSize() >= 2)
      rep->GetChild(2)->SetShowMode(1);
  }
  _itemsMoved = true;
  _itemDragX = px;
  _itemDragY = py;
  ReDraw();
}

void QELBaseScrollListZitBltRep::OnVOREndManipulate() {
  FinalizePertNodePosition();
}

bool QELBaseScrollListZitBltRep::Drop() {
  struct Move {
    VORBaseUnknown_var item;
    VORBaseUnknown_var source;
  };
  std::vector<Move> moves;
  const VORBaseUnknown_var target = _dropTarget;
  for (const QELIScrollListZitBltItemVisu_var& visual : DraggedItems()) {
    VORBaseUnknown* source = visual->GetAssociatedActivityNode();
    if (source == nullptr || source->GetIdentity() == target.Identity())
      continue;
    VORUnicodeString message;
    const bool allowed =
        QELScrollListDrop::Check(visual->GetAssociatedPFItem(), source, target, message);
    QELScrollListDrop::Announce(target, allowed, message);
    if (allowed)
      moves.push_back(
          {VORBaseUnknown_var(visual->GetAssociatedPFItem()), VORBaseUnknown_var(source)});
  }
  if (moves.empty())
    return false;
  // The item reps are rebuilt by the refresh: nothing may ride on the manipulator any more.
  GetItemManipulator()->RemoveAllElements();
  {
    const QELScrollListDrop::UndoStep step(target);
    for (const Move& move : moves)
      QELScrollListDrop::Reassign(move.item, move.source, target);
  }
  for (const Move& move : moves)
    QELScrollListDrop::Refresh(move.source);
  QELScrollListDrop::Refresh(target);
  return true;
}

void QELBaseScrollListZitBltRep::FinalizePertNodePosition() {
  VORHandle<QELBaseScrollListZitBltRep> self(this);
  if (_viewer)
    _viewer->SetCursor(kCursorAfterDrag);
  if (_dropBalloon)
    _dropBalloon->Hide(1);
  SendNotification(GetFather(), GetItemManipulator()->GetVOREndManipulate());
  const bool moved = _itemsMoved;
  _itemsMoved = false;
  _itemDragX = 0.0f;
  _itemDragY = 0.0f;
  // A drop over another activity is carried out (the lists concerned are rebuilt) or its
  // refusal said; anywhere else the dragged items simply go back to their places.
  const bool dropped = _dropTarget && Drop();
  if (VORCSO* cso = CurrentCSO())
    cso->Empty(1);
  _validTarget = 0;
  _csoBusy = 0;
  _dropTarget = NULL_var;
  _dropRefusal = VORUnicodeString();
  if (moved && !dropped)
    ReFreshZitBltReps(GetLocation());
}

void QELBaseScrollListZitBltRep::UpdateCycleTime(VORBaseUnknown* activity) {
  // Joining activities recompute their time from their joints or seams; others answer neither.
  if (QELIBIWWeldingActivity_var welding{VORBaseUnknown_var(activity)}; welding)
    welding->UpdateCycleTime();
  if (QELIBIWCurveFasteningActivity_var curve{VORBaseUnknown_var(activity)}; curve)
    curve->UpdateCycleTime();
}

VORNotifPropagation QELBaseScrollListZitBltRep::AnalyseNotification(VORCommand* from,
                                                                    VORNotification* notif) {
  VORHandle<QELBaseScrollListZitBltRep> self(this);
  QELZitBltRep::AnalyseNotification(from, notif);
  // The button's context menu offers the scroll bar entry instead of what others put there (the
  // button's manipulator hands the menu on to this rep, its father).
  if (notif != nullptr && _manipulator != nullptr && from == _manipulator &&
      dynamic_cast<VORContext*>(notif) != nullptr) {
    if (GetZitBltBtn())
      OnZitBtnContextMenu(notif);
    return VORNotifDontPropagate;
  }
  if (notif == nullptr || _manipulator == nullptr || from != _manipulator ||
      notif != _manipulator->GetVORManipulate())
    return VORNotifDontPropagate;
  double minX = 0.0, minY = 0.0, maxX = 0.0, maxY = 0.0;
  GetPositioningLimits(minX, minY, maxX, maxY);
  double x = 0.0;
  double y = 0.0;
  GetPoDPosition(x, y);
  const double cx = minX + (maxX - minX) * 0.5;
  const double cy = minY + (maxY - minY) * 0.5;
  const VORUnicodeString current = GetLocation();
  const std::string c = current.ConvertToUTF8();
  // On a centre line the middle keyword holds (rebuilt each time); elsewhere the quarter names
  // a corner, spelt after the side the ZitBlt came from.
  if (x == cx) {
    ReFreshZitBltReps(VORUnicodeString(y >= cy ? "topmiddle" : "bottommiddle"));
    return VORNotifDontPropagate;
  }
  if (y == cy) {
    ReFreshZitBltReps(VORUnicodeString(x <= cx ? "leftmiddle" : "rightmiddle"));
    return VORNotifDontPropagate;
  }
  const bool left = x < cx;
  const bool top = y > cy;
  const char* sideForm =
      left ? (top ? "lefttop" : "leftbottom") : (top ? "righttop" : "rightbottom");
  const char* edgeForm =
      left ? (top ? "topleft" : "bottomleft") : (top ? "topright" : "bottomright");
  if (c == sideForm || c == edgeForm)
    return VORNotifDontPropagate;
  const bool fromSide = c.find(left ? "left" : "right") != std::string::npos;
  ReFreshZitBltReps(VORUnicodeString(fromSide ? sideForm : edgeForm));
  return VORNotifDontPropagate;
}

extern "C" VORBaseUnknown* fctCreateQELBaseScrollListZitBltRep(VORBaseUnknown* owner) {
  return static_cast<VORCommand*>(
      new QELBaseScrollListZitBltRep(owner, QELBaseScrollListZitBltRep::kDefaultRange));
}
