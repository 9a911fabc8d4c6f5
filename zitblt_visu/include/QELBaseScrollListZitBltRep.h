// The ZitBlt rep of list ZitBlts: the expanded bag shows the ZitBlt's items (product inputs,
// product outputs, resources) as a list of item reps 2.5 units apart, of which the scroll range
// are visible at a time; a thin scroll bar with a draggable scroller picks the first visible
// item. Selected items of the list are carried by an item manipulator so that they can be
// dragged onto another activity; sliding the ZitBlt round its node re-derives its location
// keyword; the button's context menu hides or shows the scroll bar; a balloon tells the size.
// Created by name ("fctCreateQELBaseScrollListZitBltRep", the argument is the node's activity);
// the list update commands fill it with AppendItem and draw it with DrawScrollList.
#pragma once

#include <vector>

#include "QELIScrollListZitBltItemVisu.h"
#include "QELZitBltRep.h"
#include "VOR2DLineRep.h"
#include "VOR2DManipulator.h"
#include "VOR2DPolygonRep.h"
#include "VORCSO.h"
#include "VORLists.h"
#include "VORPVBalloon.h"
#include "VORPathElement.h"

class QELBaseScrollListZitBltRep : public QELZitBltRep {
  VOR_DECLARE_CLASS(QELBaseScrollListZitBltRep, QELZitBltRep)
 public:
  // The scroll range used when "ScrollListRange" is not a whole number from 1 to kMaxRange.
  static constexpr int kDefaultRange = 5;
  static constexpr int kMaxRange = 1000;
  // Distance between two items, and track length per visible item.
  static constexpr double kItemPitch = 2.5;
  static constexpr double kTrackPerItem = 3.0;
  // Link colours: items kept from a previous drawing (kind 2) and ordinary ones.
  static constexpr int kKeptItemCode = 247;
  static constexpr int kItemCode = 249;

  // owner: the activity of the PERT node (not held; it outlives its ZitBlts). range: the number
  // of visible items unless "ScrollListRange" gives a valid one.
  QELBaseScrollListZitBltRep(VORBaseUnknown* owner, int range);

  // With a viewer: the base build, the context menu of the button, the selection watch, and
  // the list drawn (or the button greyed when the list is empty).
  void BuildRep(VORViewer* viewer) override;
  // The base behaviour, then the location keyword follows a slide round the node.
  VORNotifPropagation AnalyseNotification(VORCommand* from, VORNotification* notif) override;
  QELBaseScrollListZitBltRep* GetScrollListRep() override { return this; }

  // Records an item (null and duplicates refused) without drawing it. kindFlag is the item's
  // assignment state: 0 and 1 also record the kinds 1 and 2, even for a refused duplicate.
  void AppendItem(VORBaseUnknown* item, int kindFlag);
  // Draws one more item at the end of the drawn list (nothing without an expanded bag).
  void AppendScrollList(VORBaseUnknown* item, bool noGreyChange, int typeCode);
  // Creates the item's visual component and adds its rep to bag (items that are no list items
  // are skipped).
  void AddListItemRep(VOR2DBagRep* bag, VORBaseUnknown* item, int index, int typeCode);
  // Rebuilds the whole list for a location keyword.
  void ReFreshZitBltReps(const VORUnicodeString& location);
  // Draws every item, the scroll bar when needed, and shows the visible window.
  void DrawScrollList();
  // Builds the track and the scroller for the current first item (only when scrolling is
  // possible and the scroll bar is not hidden).
  void AddScroller();
  // Destroys every item rep and empties the lists; greys the button when greyButton is 1.
  void RemoveAllItems(unsigned char greyButton);
  void ClearLists();

  // Sets the number of visible items and redraws the list.
  void SetScrollRange(int range);
  int GetScrollRange() const { return _range; }
  // 1 hides the scroll bar and shows every item; redraws the list.
  void SetZitbltScrollBarHideState(unsigned char hidden);
  unsigned char GetZitbltScrollBarHideState() const { return _scrollBarHidden; }

  // Notification callbacks.
  void OnScrollbarManipulate();
  void OnScrollerMoved();
  void OnScrollbarBalloonHelp();
  void OnScrollbarBalloonHide();
  void OnZitBtnContextMenu(VORNotification* notif);
  void HideShowNotif();

  // Selection: selected items of this list ride on the item manipulator.
  void InitCSOElem(VORCSO* cso, int remove);
  void OnCSONotif(VORNotification* notif);
  void ValidateAddRemElem(VORPathElement* element, int remove);
  void AddObjectToManip(VORPathElement* element);
  void RemoveObjectToManip(VORPathElement* element);
  bool IsItDuplicate(VORBaseUnknown* item) const;
  // The item component a path goes through when it names an item of this list, else null.
  QELIScrollListZitBltItemVisu* ItemOfThisList(VORPathElement* element) const;

  // Dragging the selected items.
  void OnVORManipulate();
  void OnVOREndManipulate();
  void FinalizePertNodePosition();

  // Asks the activity to recompute its welding and curve-fastening cycle times.
  static void UpdateCycleTime(VORBaseUnknown* activity);

  // State, for the list commands, scripts and tests.
  VORBaseUnknown* GetOwner() const { return _owner; }
  const VORListValVORBaseUnknown_var& GetItems() const { return _items; }
  // The assignment state an item was appended with (1-based position in GetItems), -1 if none.
  int GetItemState(int position) const;
  const std::vector<int>& GetItemKinds() const { return _kinds; }
  int GetFirst() const { return _first; }
  int GetPreviousFirst() const { return _previousFirst; }
  bool GrowsUp() const { return _growsUp != 0; }
  bool HasValidTarget() const { return _validTarget != 0; }
  // The activity under the items being dragged (null between drags).
  VORBaseUnknown* GetDropTarget() const { return _dropTarget.get(); }
  // Why the activity under the dragged items refuses them (empty when it accepts them or
  // there is none); also shown in a balloon beside the pointer.
  const VORUnicodeString& GetDropRefusal() const { return _dropRefusal; }
  // The item reps and the scroll bar; a list whose drawing waits (see DeferDrawing) is drawn
  // first.
  int GetItemVisualCount();
  // 1-based; null out of range.
  QELIScrollListZitBltItemVisu* GetItemVisual(int position);
  VOR2DLineRep* GetScroller();
  VOR2DPolygonRep* GetScrollTrack();
  // True while the list's reps wait for the list to be shown (tests).
  bool IsDrawingDeferred() const { return _drawPending; }
  // The scroller's and the selected items' manipulators, made with their callbacks on first
  // call: a list that never scrolls nor has an item picked carries neither.
  VOR2DManipulator* GetScrollManipulator();
  VOR2DManipulator* GetItemManipulator();
  // True once the manipulators exist (tests).
  bool HasScrollManipulator() const { return _scrollManipulator != nullptr; }
  bool HasItemManipulator() const { return _itemManipulator != nullptr; }
  // True while the list follows its editor's selection (from its first item rep on).
  bool IsWatchingSelection() const { return _watchingSelection; }
  VORPVBalloon* GetBalloon() const { return _balloon.get(); }
  // The range "ScrollListRange" gives, or fallback when it is unset or not a valid range.
  static int RangeFromEnvironment(int fallback);

 protected:
  ~QELBaseScrollListZitBltRep() override;
  void BeforeExpandedShown() override;
  bool ButtonStartsGrey() const override { return _items.IsEmpty(); }

 private:
  // A hidden list that does not scroll is drawn when it is first shown or looked at: its item
  // reps are most of what a level of collapsed lists would cost. True when deferred.
  bool DeferDrawing();
  // Carries out a deferred drawing.
  void DrawPending();
  // Routes the selection's changes to this list (from its first item rep), and stops.
  void WatchSelection();
  void StopWatchingSelection();
  void RemoveScroller();
  // Shows the items first..first+range-1 and the links of the first range items.
  void UpdateShowModes();
  // Shifts the label of every item rep by dy.
  void ShiftLabels(double dy);
  // Puts the scroll manipulator back where it reads as first.
  void SetScrollPosition(double x, int first);
  void RestoreButtonColour();
  // Takes the items of this list out of the selection before their reps go.
  void DeselectItems();
  // The list item and the component of each dragged item rep.
  std::vector<QELIScrollListZitBltItemVisu_var> DraggedItems() const;
  // The verdict on the activity under the pointer: cursor, balloon, valid target.
  void JudgeDropTarget(const VORMathPoint2D& point);
  // Carries out the drop on the current target, or announces its refusal; true when it was
  // carried out.
  bool Drop();
  // Appends item with its state unless it is null or listed; true when appended.
  bool AddItem(VORBaseUnknown* item, int state);

  VORListValVORBaseUnknown_var _items;
  std::vector<int> _itemStates;  // parallel to _items
  VORListValVORBaseUnknown_var _appended;
  VOR2DManipulator* _itemManipulator = nullptr;    // the creator's reference
  VOR2DManipulator* _scrollManipulator = nullptr;  // the creator's reference
  VORListValVORBaseUnknown_var _otherObjects;
  unsigned char _csoBusy = 0;
  unsigned char _itemsAdded = 0;
  unsigned char _growsUp = 0;
  unsigned char _scrollBarHidden = 0;
  VORBaseUnknown* _owner;
  int _first = 1;
  int _range;
  int _previousFirst = 1;
  VORPVBalloon_var _balloon;
  VOR2DLineRep_var _scroller;
  VOR2DPolygonRep_var _track;
  std::vector<QELIScrollListZitBltItemVisu_var> _itemVisuals;
  std::vector<int> _kinds;

  unsigned char _validTarget = 0;
  bool _watchingSelection = false;
  bool _drawPending = false;
  bool _keepButtonColour = false;  // while a deferred drawing is carried out
  VORCSO_var _cso;                 // the viewer's selection set, taken at BuildRep
  bool _itemsMoved = false;
  float _itemDragX = 0.0f;
  float _itemDragY = 0.0f;
  VORCallbackId _menuCallback = 0;
  VORBaseUnknown_var _dropTarget;  // the activity under the dragged items
  VORUnicodeString _dropRefusal;
  VORPVBalloon_var _dropBalloon;
};
VOR_DECLARE_HANDLE(QELBaseScrollListZitBltRep);

// Location keywords whose lists grow downwards from the anchor ("leftmiddle" scrolls with them)
// and upwards ("rightmiddle" with these).
bool QELIsBottomGroupLocation(const VORUnicodeString& location);
bool QELIsTopGroupLocation(const VORUnicodeString& location);
