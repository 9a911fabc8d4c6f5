// Draws one item of a ZitBlt list (a product input, product output or resource) as a small bag
// placed in the list's expanded bag: its label (with, for product inputs, an icon telling
// whether the input part is shown, hidden or partly hidden), and a link from the label to the
// ZitBlt's button. The label is the bag's first child and the link its second: the scroll list
// shifts the first when scrolling and hides the second outside the visible window.
//
// Picking: the item bag stands for this component and the label for the item, so a click on a
// label gives the path (component, item).
#pragma once

#include "QELIScrollListZitBltItemVisu.h"
#include "VOR2DBagRep.h"
#include "VOR2DCustomRep.h"
#include "VOR3x3Matrix.h"
#include "VORExtIVisu.h"
#include "VORPixelImage.h"

class QELPFViewerItemRepComponent : public VORExtIVisu, public QELIScrollListZitBltItemVisu {
  VOR_DECLARE_CLASS(QELPFViewerItemRepComponent, VORExtIVisu)
 public:
  // owner: the node's activity (held); item: the list item (held); typeCode: the link colour.
  // The item type starts as the item's type name ("ProductInput", "ProductOutput" ...).
  QELPFViewerItemRepComponent(VORBaseUnknown* owner, VORBaseUnknown* item, unsigned int typeCode);

  // A product output gets its label with a link mark; every other item its label and the link
  // to the button. A new bag (one reference for the caller), also kept (GetRep).
  VOR2DRep* BuildRep() override;

  void SetItemPos(int index, const VORUnicodeString& location) override;
  int GetItemIndex() const override { return _position; }
  VORUnicodeString GetItemLocation() const override { return _location; }
  void SetItemType(const VORUnicodeString& type) override { _itemType = type; }
  VORUnicodeString GetItemType() const override { return _itemType; }
  void SetZitBltName(const VORUnicodeString& name) override { _zitBltName = name; }
  VORUnicodeString GetZitBltName() const override { return _zitBltName; }
  unsigned int GetTypeCode() const override { return _typeCode; }
  VORBaseUnknown* GetAssociatedActivityNode() const override { return _owner.get(); }
  VORBaseUnknown* GetAssociatedPFItem() const override { return _item.get(); }

  // A rotation by params[0] then a translation (params[1], params[2]).
  static VOR3x3Matrix CreateMatrix(const double params[3]);

  // The parts (each a new rep for the caller).
  VOR2DBagRep* GetListItemRep();
  VOR2DBagRep* GetLabelRep(int anchor);
  VOR2DBagRep* GetLabelWithLinkRep(int anchor);
  VOR2DRep* CreateLabelRep(const VORUnicodeString& text, const VORMathPoint2Df& at, int anchor);
  VOR2DBagRep* GetArrowRep();

  // "SHOW", "HIDDEN" or "PARTIAL" for a product input's parts.
  VORUnicodeString FindDisplayStatus();
  // The icon name of the display status.
  VORUnicodeString GetIconName();
  // The display-status icon (a new image for the caller), null when its file is missing.
  VORPixelImage* GetShowHiddenIcon();

  // Label translation and anchor of item index in a list at location.
  static void LabelPlacement(const VORUnicodeString& location, int index, float& x, float& y,
                             int& anchor);
  // Start (beside the label) and end (beside the button) of item index's link.
  static void LinkEnds(const VORUnicodeString& location, int index, VORMathPoint2Df& start,
                       VORMathPoint2Df& end);
  // The packed graphic attribute word of the link for a type code.
  static unsigned int LinkAttributeWord(unsigned int typeCode);

 protected:
  ~QELPFViewerItemRepComponent() override = default;

 private:
  unsigned int _typeCode;
  int _position = 0;
  VORUnicodeString _location;
  VORBaseUnknown_var _owner;
  VORUnicodeString _itemType;
  VORBaseUnknown_var _item;
  VORUnicodeString _zitBltName;
};
VOR_DECLARE_HANDLE(QELPFViewerItemRepComponent);
