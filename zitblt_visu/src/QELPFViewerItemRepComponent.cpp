#include "QELPFViewerItemRepComponent.h"

#include <cmath>
#include <memory>

#include "QELArrowRepAdapter.h"
#include "QELIListZitBltItem.h"
#include "QELIListZitBltItemState.h"
#include "QELZitBltRep.h"
#include "VOR2DArcCircleRep.h"
#include "VOR2DImagePixelRep.h"
#include "VOR2DLineRep.h"
#include "VOR2DPointRep.h"
#include "VOR2DTextRep.h"
#include "VORIProduct.h"
#include "VORISPPProductIO.h"
#include "VORISpecObject.h"
#include "VORIVisProperties.h"

namespace {
bool Is(const std::string& location, std::initializer_list<const char*> keywords) {
  for (const char* k : keywords) {
    if (location == k)
      return true;
  }
  return false;
}

// Icons are 16 pixels (4 units at the image rep's pixel size); drawn at half size they stand as
// high as a label.
constexpr double kIconScale = 0.5;
// Length of an output's link mark, from the end of its label to the dot.
constexpr float kOutputLinkLength = 3.0f;

VORUnicodeString TypeNameOf(VORBaseUnknown* object) {
  VORUnicodeString type;
  if (VORISpecObject_var spec{VORBaseUnknown_var(object)}; spec)
    spec->GetTypeName(type);
  if (type.IsEmpty() && object != nullptr)
    type = VORUnicodeString(object->GetLateType());
  return type;
}

bool IsShown(VORBaseUnknown* product) {
  VORIVisProperties_var properties{VORBaseUnknown_var(product)};
  return !properties || properties->IsShown();
}
}  // namespace

QELPFViewerItemRepComponent::QELPFViewerItemRepComponent(VORBaseUnknown* owner,
                                                         VORBaseUnknown* item,
                                                         unsigned int typeCode)
    : _typeCode(typeCode), _owner(owner), _itemType(TypeNameOf(item)), _item(item) {}

VOR3x3Matrix QELPFViewerItemRepComponent::CreateMatrix(const double params[3]) {
  return VOR3x3Matrix::Rotation(params[0], params[1], params[2]);
}

void QELPFViewerItemRepComponent::SetItemPos(int index, const VORUnicodeString& location) {
  _position = index;
  _location = location;
}

void QELPFViewerItemRepComponent::LabelPlacement(const VORUnicodeString& location, int index,
                                                 float& x, float& y, int& anchor) {
  const std::string l = location.ConvertToUTF8();
  const auto i = static_cast<float>(index);
  x = 0.0f;
  y = 0.0f;
  anchor = 3;
  if (Is(l, {"lefttop", "leftmiddle"})) {
    x = -17.0f;
    y = 2.5f * i - 2.0f;
  } else if (l == "leftbottom") {
    x = -17.0f;
    y = -2.0f - 2.5f * i;
  } else if (Is(l, {"bottomleft", "bottommiddle"})) {
    x = -15.0f;
    y = -5.0f - 2.5f * i;
  } else if (l == "bottomright") {
    x = 8.0f;
    y = -5.0f - 2.5f * i;
    anchor = 0;
  } else if (Is(l, {"topleft", "topmiddle"})) {
    x = -15.0f;
    y = 2.5f * i + 5.0f;
  } else if (l == "topright") {
    x = 8.0f;
    y = 2.5f * i + 5.0f;
    anchor = 0;
  } else if (Is(l, {"righttop", "rightmiddle"})) {
    x = 8.0f;
    y = 2.5f * i - 2.0f;
    anchor = 0;
  } else if (l == "rightbottom") {
    x = 8.0f;
    y = -2.0f - 2.5f * i;
    anchor = 0;
  }
}

void QELPFViewerItemRepComponent::LinkEnds(const VORUnicodeString& location, int index,
                                           VORMathPoint2Df& start, VORMathPoint2Df& end) {
  const std::string l = location.ConvertToUTF8();
  const auto i = static_cast<float>(index);
  start = {0.0f, 0.0f};
  end = {0.0f, 0.0f};
  if (Is(l, {"lefttop", "leftmiddle"})) {
    start = {-9.0f, 2.5f * i - 2.0f};
    end = {-4.0f, -2.0f};
  } else if (l == "leftbottom") {
    start = {-9.0f, -2.0f - 2.5f * i};
    end = {-4.0f, -2.0f};
  } else if (Is(l, {"righttop", "rightmiddle"})) {
    start = {9.0f, 2.5f * i - 2.0f};
    end = {4.0f, -2.0f};
  } else if (l == "rightbottom") {
    start = {9.0f, -2.0f - 2.5f * i};
    end = {4.0f, -2.0f};
  } else if (Is(l, {"bottomleft", "bottommiddle"})) {
    start = {-5.0f, -5.0f - 2.5f * i};
    end = {-2.0f, -2.0f};
  } else if (l == "bottomright") {
    start = {5.0f, -5.0f - 2.5f * i};
    end = {2.0f, -2.0f};
  } else if (Is(l, {"topleft", "topmiddle"})) {
    start = {-5.0f, 2.5f * i + 5.0f};
    end = {-2.0f, 2.0f};
  } else if (l == "topright") {
    start = {5.0f, 2.5f * i + 5.0f};
    end = {2.0f, 2.0f};
  }
}

unsigned int QELPFViewerItemRepComponent::LinkAttributeWord(unsigned int typeCode) {
  // A one-pixel solid round-ended line in the type code's colour; codes that do not fit the
  // colour byte get colour 0xFD.
  return typeCode < 256 ? ((typeCode << 24) | 0x041400u) : 0xFD041400u;
}

VOR2DRep* QELPFViewerItemRepComponent::BuildRep() {
  VOR2DBagRep* rep = nullptr;
  if (_itemType == VORUnicodeString("ProductOutput")) {
    // Outputs show their label with its link mark; wrapped in a bag so that the label is the
    // rep's first child like every other item's.
    rep = new VOR2DBagRep();
    auto label = VOR2DBagRep_var::Adopt(GetLabelWithLinkRep(0));
    rep->AddChild(label);
  } else {
    rep = GetListItemRep();
  }
  rep->SetObject(static_cast<QELIScrollListZitBltItemVisu*>(this));
  KeepRep(rep);
  return rep;
}

VOR2DBagRep* QELPFViewerItemRepComponent::GetListItemRep() {
  auto* bag = new VOR2DBagRep();
  auto arrow = VOR2DBagRep_var::Adopt(GetArrowRep());
  const double identity[3] = {0.0, 0.0, 0.0};
  bag->SetMatrix(CreateMatrix(identity));
  float x = 0.0f;
  float y = 0.0f;
  int anchor = 3;
  LabelPlacement(_location, _position, x, y, anchor);
  auto label = VOR2DBagRep_var::Adopt(GetLabelRep(anchor));
  if (QELIListZitBltItemState_var state{_item}; state && state->CanAssignState(_item)) {
    const VORBox2D box = label->GetBoundingBox();
    auto marker = VOR2DPointRep_var::Adopt(new VOR2DPointRep(
        static_cast<float>(box.xmax + 1.0), static_cast<float>(box.ymax + 1.0), 4));
    label->AddChild(marker);
  }
  const double translation[3] = {0.0, x, y};
  label->SetMatrix(CreateMatrix(translation));
  bag->AddChild(label);
  bag->AddChild(arrow);
  return bag;
}

VOR2DRep* QELPFViewerItemRepComponent::CreateLabelRep(const VORUnicodeString& text,
                                                      const VORMathPoint2Df& at, int anchor) {
  return new VOR2DTextRep(text, at, anchor);
}

VOR2DBagRep* QELPFViewerItemRepComponent::GetLabelRep(int anchor) {
  VORUnicodeString text;
  QELIListZitBltItem_var listItem{_item};
  if (!listItem || listItem->GetItemName(text) < 0 || text.IsEmpty())
    text = VORUnicodeString("Item");
  auto* label = new VOR2DBagRep();
  label->SetObject(_item);
  auto textRep = VOR2DRep_var::Adopt(CreateLabelRep(text, VORMathPoint2Df(0.0f, 0.0f), anchor));
  label->AddChild(textRep);
  if (_itemType != VORUnicodeString("ProductInput"))
    return label;
  auto icon = VORPixelImage_var::Adopt(GetShowHiddenIcon());
  if (!icon)
    return label;
  icon->Convert(VORPixelImage::RGBA);
  icon->SetTransparency(0);
  auto image = VOR2DImagePixelRep_var::Adopt(
      new VOR2DImagePixelRep(VORMathPoint2Df(0.0f, 0.0f), icon, 1, 0, 0, 0));
  image->SetAlphaMode(1);
  // Beside the text on the side of the button: right of a label that ends at its anchor, after
  // the text of a label that starts there.
  const VORBox2D box = textRep->GetBoundingBox();
  const double x = anchor == 3 ? 5.0 - std::fabs(box.xmax) : std::fabs(box.xmax) + 1.0;
  auto iconBag = VOR2DBagRep_var::Adopt(new VOR2DBagRep());
  iconBag->SetMatrix(VOR3x3Matrix(kIconScale, 0.0, x, 0.0, kIconScale, 0.0));
  iconBag->AddChild(image);
  label->AddChild(iconBag);
  return label;
}

VOR2DBagRep* QELPFViewerItemRepComponent::GetLabelWithLinkRep(int anchor) {
  auto* label = GetLabelRep(anchor);
  const VORBox2D box = label->GetBoundingBox();
  const auto from = static_cast<float>(std::fabs(box.xmax));
  const float to = from + kOutputLinkLength;
  auto line = VOR2DLineRep_var::Adopt(new VOR2DLineRep(from, 1.0f, to, 1.0f));
  auto dot = VOR2DArcCircleRep_var::Adopt(
      new VOR2DArcCircleRep(VORMathPoint2Df(to, 1.0f), 0.5f, 0.0f, 6.2831855f, 1));
  line->SetColorIndex(static_cast<int>(_typeCode));
  dot->SetColorIndex(static_cast<int>(_typeCode));
  label->AddChild(line);
  label->AddChild(dot);
  const double placement[3] = {0.0, 6.0, 2.5 * (_position - 1) + 1.0};
  label->SetMatrix(CreateMatrix(placement));
  return label;
}

VOR2DBagRep* QELPFViewerItemRepComponent::GetArrowRep() {
  VORMathPoint2Df start;
  VORMathPoint2Df end;
  LinkEnds(_location, _position, start, end);
  auto* bag = new VOR2DBagRep();
  auto custom = VOR2DCustomRep_var::Adopt(new VOR2DCustomRep());
  const unsigned int word = LinkAttributeWord(_typeCode);
  custom->AddPrimitive(QELArrowRepAdapter::CreateOrthogonalLink(start, end), word, 255);
  custom->AddPrimitive(QELArrowRepAdapter::CreateArrow(start, end), word, 255);
  bag->AddChild(custom);
  return bag;
}

VORUnicodeString QELPFViewerItemRepComponent::FindDisplayStatus() {
  VORBaseUnknown_var product;
  if (VORISPPProductIO_var io{_item}; io)
    io->GetProduct(product);
  else
    product = _item;
  bool shown = false;
  bool hidden = false;
  VORListValVORBaseUnknown_var* children = nullptr;
  VORIProduct_var asProduct{product};
  if (asProduct && SUCCEEDED(asProduct->GetChildren(children)) && children != nullptr &&
      !children->IsEmpty()) {
    std::unique_ptr<VORListValVORBaseUnknown_var> owned(children);
    for (const VORBaseUnknown_var& child : *children)
      (IsShown(child) ? shown : hidden) = true;
  } else {
    delete children;
    if (product)
      (IsShown(product) ? shown : hidden) = true;
  }
  if (shown && hidden)
    return VORUnicodeString("PARTIAL");
  return VORUnicodeString(shown ? "SHOW" : "HIDDEN");
}

VORUnicodeString QELPFViewerItemRepComponent::GetIconName() {
  const std::string status = FindDisplayStatus().ConvertToUTF8();
  if (status == "SHOW")
    return VORUnicodeString("I_PODShownInputPart");
  if (status == "PARTIAL")
    return VORUnicodeString("I_PODPartiallyHiddenInputPart");
  return VORUnicodeString("I_PODHiddenInputPart");
}

VORPixelImage* QELPFViewerItemRepComponent::GetShowHiddenIcon() {
  return QELZitBltRep::LoadIconImage(GetIconName() + VORUnicodeString(".bmp"));
}
