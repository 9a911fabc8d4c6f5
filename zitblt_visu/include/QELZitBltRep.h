// The on-screen form of one ZitBlt on one PERT node: a button bag holding the icon and an
// expanded bag holding what the opened ZitBlt shows, both carrying the same translation. A
// manipulator on the button toggles the ZitBlt on a click and slides it along one edge of its
// node within the positioning limits on a drag. Created by name ("fctCreateQELZitBltRep") by
// the ZitBlt manager, which sets its strings, calls BuildRep and places it.
#pragma once

#include <initializer_list>

#include <string_view>

#include "VOR2DBagRep.h"
#include "VORCommand.h"
#include "VORISO.h"
#include "VORModelForRep2D.h"
#include "VORPixelImage.h"
#include "VORUnicodeString.h"
#include "VORViewer.h"

class VOR2DManipulator;
class QELBaseScrollListZitBltRep;

// True when text is the ASCII keyword (a location or a ZitBlt name), without building a string.
bool QELIsKeyword(const VORUnicodeString& text, std::string_view keyword);
// True when text is one of the keywords.
bool QELIsAnyKeyword(const VORUnicodeString& text,
                     std::initializer_list<std::string_view> keywords);

// The one kept copy of text. The strings of a ZitBlt (name, location, priority, state, icon)
// come from the configuration and repeat on every node of a level: each rep points at a shared
// copy instead of owning four strings of its own. Kept for the life of the process; the set of
// texts is as small as the configuration.
const VORUnicodeString& QELSharedText(const VORUnicodeString& text);

class QELZitBltRep : public VORCommand {
  VOR_DECLARE_CLASS(QELZitBltRep, VORCommand)
 public:
  QELZitBltRep();

  // Creates the bags (shown through the current editor's interactive set when there is one),
  // the icon and the "ActivManip" manipulator. viewer is used to redraw (held).
  virtual void BuildRep(VORViewer* viewer);
  virtual void ExpandZitBlt();
  virtual void CollapseZitBlt();
  // Toggles open/closed; the flags are set before the virtual Expand/Collapse runs.
  virtual void ChangeBtnState();

  // A click on the button toggles the ZitBlt; a drag slides it within the limits. Both are then
  // sent on to the father command.
  VORNotifPropagation AnalyseNotification(VORCommand* from, VORNotification* notif) override;

  // The scroll-list form of this rep, for the list update commands; null for a plain ZitBlt.
  virtual QELBaseScrollListZitBltRep* GetScrollListRep() { return nullptr; }

  void SetName(const VORUnicodeString& name) { _name = &QELSharedText(name); }
  const VORUnicodeString& GetName() const { return *_name; }
  void SetLocation(const VORUnicodeString& location) { _location = &QELSharedText(location); }
  const VORUnicodeString& GetLocation() const { return *_location; }
  void SetPriority(const VORUnicodeString& priority) { _priority = &QELSharedText(priority); }
  VORUnicodeString GetPriority() const { return *_priority; }
  void SetInitialState(const VORUnicodeString& state) { _initialState = &QELSharedText(state); }
  VORUnicodeString GetInitialState() const { return *_initialState; }
  // The icon's base name (".bmp" is added); only read by BuildRep and SetZitbltButtonGrey.
  void SetIcon(const VORUnicodeString& icon) { _icon = &QELSharedText(icon); }
  VORUnicodeString GetIcon() const { return *_icon; }

  // 1 shows both bags, 0 hides both; other values are only stored.
  void SetStatus(unsigned char status);
  unsigned char GetStatus() const { return _status; }

  VOR2DBagRep* GetZitBltBtn() const { return _btnBag.get(); }
  // The expanded bag, made on first need (null before BuildRep): a closed ZitBlt that is never
  // opened or looked into carries none. It always has the button's translation.
  VOR2DBagRep* GetZitBltExpanded();
  // Whether the expanded bag is shown (there is none while it is hidden and never looked into).
  bool IsExpandedShown() const { return _expandedBag && _expandedBag->IsShown(); }
  // Sets both bags' matrix (the placement on the node).
  void SetBagsMatrix(const VOR3x3Matrix& matrix);
  // The button's manipulator, made on first need (a pick, a script step): most buttons of a
  // level are never touched. Null before BuildRep.
  VOR2DManipulator* GetManipulator();
  bool IsButtonCollapse() const { return _collapsed != 0; }
  // True while the button shows its icon in grey.
  bool IsButtonGrey() const { return _grey; }
  // The viewer given to BuildRep (null before).
  VORViewer* GetViewer() const { return _viewer.get(); }
  int GetButtonState() const { return _btnState; }

  // Rebuilds the button's icon, in grey when grey is 1. Keeps the old icon when the file is
  // missing or unreadable.
  void SetZitbltButtonGrey(unsigned char grey);

  // The bags' translation (no limit check).
  void SetPoDPosition(double x, double y);
  void GetPoDPosition(double& x, double& y) const;
  void TransfromPoD(double dx, double dy);

  // The node rectangle; stored widened by half the button (min x narrowed).
  void SetPositioningLimits(double xmin, double ymin, double xmax, double ymax);
  void GetPositioningLimits(double& xmin, double& ymin, double& xmax, double& ymax) const;
  bool IsVerticalLimitOn() const { return _verticalLimit != 0; }
  bool IsHorizontalLimitOn() const { return _horizontalLimit != 0; }

  // Icons are decoded once per process; this forgets them (tests that count live objects).
  static void ForgetIcons();
  // A copy of the icon file's image (one reference, the caller's; converted in place by its
  // users), found along the image search path; null when missing or unreadable.
  static VORPixelImage* LoadIconImage(const VORUnicodeString& fileName);

  // The base ZitBlt has no expanded content to empty: E_FAIL.
  HRESULT EmptyExpandedBagRep();

  // Asks the viewer the rep was built in to repaint (nothing before BuildRep).
  virtual void ReDraw();

 protected:
  ~QELZitBltRep() override;
  void SetTranslation(double x, double y);
  // The expanded bag's show mode: a hidden bag that does not exist yet stays so.
  void SetExpandedShowMode(int mode);
  // Called just before the expanded bag is shown (opened, or shown by its status).
  virtual void BeforeExpandedShown() {}
  // Whether BuildRep draws the button in grey from the start (an empty list) rather than in
  // colour and then in grey.
  virtual bool ButtonStartsGrey() const { return false; }

  int _btnState = 0;
  VOR2DBagRep_var _btnBag;
  VOR2DBagRep_var _expandedBag;              // see GetZitBltExpanded
  int _expandedShowMode = 0;                 // while there is no expanded bag
  VOR2DManipulator* _manipulator = nullptr;  // the creator's reference
  unsigned char _collapsed = 1;
  const VORUnicodeString* _icon = &QELSharedText(VORUnicodeString());
  VORViewer_var _viewer;
  const VORUnicodeString* _name = _icon;
  const VORUnicodeString* _location = _icon;
  const VORUnicodeString* _priority = _icon;
  const VORUnicodeString* _initialState = _icon;
  unsigned char _status = 1;
  float _lastDragX = 0.0f;
  float _lastDragY = 0.0f;
  float _minX = 0.0f;
  float _minY = 0.0f;
  float _maxX = 0.0f;
  float _maxY = 0.0f;
  unsigned char _verticalLimit = 0;
  unsigned char _horizontalLimit = 0;
  VORModelForRep2D_var _btnModel;
  VORModelForRep2D_var _expandedModel;
  VORISO_var _iso;  // the set the models were added to
  bool _grey = false;

 private:
  void SetShowMode(int mode);
  void RemoveModels();
  void DeleteManipulator();
};
VOR_DECLARE_HANDLE(QELZitBltRep);

// Offset of the icon from the ZitBlt's anchor for a location keyword and an icon of w x h.
void QELZitBltIconOffset(const VORUnicodeString& location, float w, float h, float& ox, float& oy);
