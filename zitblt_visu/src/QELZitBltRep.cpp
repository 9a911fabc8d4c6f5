#include "QELZitBltRep.h"

#include <algorithm>
#include <cstdint>
#include <map>
#include <set>

#include "VOR2DImagePixelRep.h"
#include "VOR2DManipulator.h"
#include "VORCommandHeader.h"
#include "VORDeferredDeletion.h"
#include "VORFrmEditor.h"
#include "VORPixelImage.h"

namespace {
// Keywords that put the button on the top or bottom edge: it slides along x.
bool IsHorizontalEdge(const VORUnicodeString& location) {
  return QELIsAnyKeyword(
      location, {"topleft", "topmiddle", "topright", "bottomleft", "bottommiddle", "bottomright"});
}

// The button bag: a pick on it asks the ZitBlt for its manipulator, which is made then.
class ButtonBag : public VOR2DBagRep {
 public:
  explicit ButtonBag(QELZitBltRep* owner) : _owner(owner) {}
  void ForgetOwner() { _owner = nullptr; }
  VORManipulator* PickManipulator() override {
    if (GetManipulator() == nullptr && _owner != nullptr)
      return _owner->GetManipulator();
    return GetManipulator();
  }

 private:
  QELZitBltRep* _owner;  // clears this before it goes or makes another bag
};

// Decoded icons by file name: every button gets its own copy (it is converted in place), but
// the search along the start-up path and the decoding happen once per icon. Failures are not
// kept, so an icon added later is found.
std::map<VORUnicodeString, VORPixelImage_var>& IconCache() {
  static std::map<VORUnicodeString, VORPixelImage_var> cache;
  return cache;
}

// The button images as drawn (converted to RGBA, opaque), in colour [0] and in grey [1], by
// icon name (without ".bmp"). Nothing changes a button's image once it is drawn, so every button of
// an icon shares them: a level of thousands of ZitBlts converts each icon twice, not once per
// button. Filed by the name's shared copy (QELSharedText), which lives as long as the process,
// so that finding them compares no text.
std::map<const VORUnicodeString*, VORPixelImage_var[2]>& ButtonImageCache() {
  static std::map<const VORUnicodeString*, VORPixelImage_var[2]> cache;
  return cache;
}

VORPixelImage* ButtonImage(const VORUnicodeString* icon, bool grey) {
  VORPixelImage_var& slot = ButtonImageCache()[icon][grey ? 1 : 0];
  if (!slot) {
    slot = VORPixelImage_var::Adopt(QELZitBltRep::LoadIconImage(*icon + VORUnicodeString(".bmp")));
    if (!slot)
      return nullptr;
    if (grey)
      slot->Convert(VORPixelImage::Grey);
    slot->Convert(VORPixelImage::RGBA);
    slot->SetTransparency(0);
  }
  return slot.get();
}

}  // namespace

bool QELIsKeyword(const VORUnicodeString& text, std::string_view keyword) {
  const std::u32string_view points = text.CodePoints();
  return points.size() == keyword.size() &&
         std::equal(points.begin(), points.end(), keyword.begin(),
                    [](char32_t a, char b) { return a == static_cast<unsigned char>(b); });
}

bool QELIsAnyKeyword(const VORUnicodeString& text,
                     std::initializer_list<std::string_view> keywords) {
  return std::any_of(keywords.begin(), keywords.end(),
                     [&text](std::string_view k) { return QELIsKeyword(text, k); });
}

const VORUnicodeString& QELSharedText(const VORUnicodeString& text) {
  static std::set<VORUnicodeString> texts;
  // The configuration hands the same copies to every node: a copy is known by where its code
  // points are, and then only compared with the kept text instead of searched in the set.
  static const VORUnicodeString* recent[256] = {};
  const std::u32string_view points = text.CodePoints();
  const auto where = reinterpret_cast<std::uintptr_t>(points.data());
  const VORUnicodeString*& slot = recent[(where * 0x9E3779B97F4A7C15u) >> 56];
  if (slot == nullptr || slot->CodePoints() != points)
    slot = &*texts.insert(text).first;
  return *slot;
}

VORPixelImage* QELZitBltRep::LoadIconImage(const VORUnicodeString& fileName) {
  auto& cache = IconCache();
  auto it = cache.find(fileName);
  if (it == cache.end()) {
    VORUnicodeString path;
    if (FAILED(VORGetImagePathName(fileName, path)))
      return nullptr;
    VORPixelImage_var image = VORPixelImage_var::Adopt(VORPixelImage::CreateFromFile(path, 0));
    if (!image)
      return nullptr;
    it = cache.emplace(fileName, image).first;
  }
  const VORPixelImage& original = *it->second;
  VORPixelImage* copy =
      VORPixelImage::Create(original.GetWidth(), original.GetHeight(), original.GetFormat());
  copy->Pixels() = original.GetPixels();
  return copy;
}

namespace {
VORISO* CurrentISO() {
  VORFrmEditor* editor = VORFrmEditor::GetCurrentEditor();
  return editor != nullptr ? editor->GetISO() : nullptr;
}
}  // namespace

void QELZitBltIconOffset(const VORUnicodeString& location, float w, float h, float& ox, float& oy) {
  // The halves are double products narrowed to float.
  const float hw = static_cast<float>(w * 0.5);
  const float hh = static_cast<float>(h * 0.5);
  auto is = [&location](std::initializer_list<std::string_view> keywords) {
    return QELIsAnyKeyword(location, keywords);
  };
  ox = 0.0f;
  oy = 0.0f;
  if (is({"lefttop", "leftbottom", "bottomright"})) {
    ox = -hw;
    oy = -hh;
  } else if (is({"leftmiddle"})) {
    ox = -hw;
  } else if (is({"righttop", "rightbottom", "bottomleft"})) {
    ox = hw;
    oy = -hh;
  } else if (is({"rightmiddle"})) {
    ox = hw;
  } else if (is({"topleft"})) {
    ox = hw;
    oy = hh;
  } else if (is({"topmiddle"})) {
    oy = hh;
  } else if (is({"topright"})) {
    ox = -hw;
    oy = hh;
  } else if (is({"bottommiddle"})) {
    oy = -hh;
  }
}

void QELZitBltRep::ForgetIcons() {
  IconCache().clear();
  ButtonImageCache().clear();
}

QELZitBltRep::QELZitBltRep() : VORCommand(nullptr, "QELZitBltRep") {}

QELZitBltRep::~QELZitBltRep() {
  DeleteManipulator();
  _verticalLimit = 0;
  _horizontalLimit = 0;
  RemoveModels();
}

void QELZitBltRep::DeleteManipulator() {
  if (_btnBag)
    static_cast<ButtonBag*>(_btnBag.get())->ForgetOwner();
  if (_manipulator == nullptr)
    return;
  // The manipulator holds the button bag: let go of it so that neither keeps the other alive.
  _manipulator->RemoveAllElements();
  _manipulator->SetFather(nullptr);
  VORCommandDeletion(_manipulator);
  _manipulator = nullptr;
}

void QELZitBltRep::RemoveModels() {
  if (_iso) {
    if (_expandedModel)
      _iso->RemoveElement(_expandedModel);
    if (_btnModel)
      _iso->RemoveElement(_btnModel);
  }
  _iso = NULL_var;
  _btnModel = NULL_var;
  _expandedModel = NULL_var;
}

void QELZitBltRep::BuildRep(VORViewer* viewer) {
  // A second build replaces the first: its models leave the interactive set.
  RemoveModels();
  DeleteManipulator();
  _btnBag = VOR2DBagRep_var::Adopt(new ButtonBag(this));
  _expandedBag = NULL_var;
  _expandedShowMode = 0;
  _viewer = viewer;

  if (VORISO* iso = CurrentISO()) {
    _iso = iso;
    _btnModel = VORModelForRep2D_var::Adopt(new VORModelForRep2D());
    _btnModel->SetRep(_btnBag);
    // In the set at once, after the button, so that the bag made later is drawn where it would
    // have been; a model without a rep draws and picks nothing.
    _expandedModel = VORModelForRep2D_var::Adopt(new VORModelForRep2D());
    iso->AddElement(_btnModel.get());
    iso->AddElement(_expandedModel.get());
  }

  SetZitbltButtonGrey(ButtonStartsGrey() ? 1 : 0);
  SetExpandedShowMode(_collapsed ? 1 : 0);

  // The button slides along the edge it was built on.
  const bool horizontal = IsHorizontalEdge(GetLocation());
  _horizontalLimit = horizontal ? 1 : 0;
  _verticalLimit = horizontal ? 0 : 1;
}

VOR2DManipulator* QELZitBltRep::GetManipulator() {
  if (_manipulator != nullptr || !_btnBag)
    return _manipulator;
  _manipulator = new VOR2DManipulator(this, "ActivManip", _btnBag, 1, 0);
  _manipulator->SetDirection(_horizontalLimit ? VORMathVector2Df(1.0f, 0.0f)
                                              : VORMathVector2Df(0.0f, 1.0f));
  return _manipulator;
}

VOR2DBagRep* QELZitBltRep::GetZitBltExpanded() {
  if (_expandedBag || !_btnBag)
    return _expandedBag.get();
  _expandedBag = VOR2DBagRep_var::Adopt(new VOR2DBagRep());
  _expandedBag->SetShowMode(_expandedShowMode);
  if (const VOR3x3Matrix* matrix = _btnBag->GetMatrix())
    _expandedBag->SetMatrix(*matrix);
  if (_expandedModel)
    _expandedModel->SetRep(_expandedBag);
  return _expandedBag.get();
}

void QELZitBltRep::SetExpandedShowMode(int mode) {
  if (_expandedBag || mode == 0) {
    if (VOR2DBagRep* expanded = GetZitBltExpanded())
      expanded->SetShowMode(mode);
  }
  _expandedShowMode = mode;
}

void QELZitBltRep::SetBagsMatrix(const VOR3x3Matrix& matrix) {
  if (_btnBag)
    _btnBag->SetMatrix(matrix);
  if (_expandedBag)
    _expandedBag->SetMatrix(matrix);
}

void QELZitBltRep::SetZitbltButtonGrey(unsigned char grey) {
  if (!_btnBag)
    return;
  VORPixelImage_var image(ButtonImage(_icon, grey == 1));
  if (!image)
    return;
  for (int i = _btnBag->GetSize(); i >= 1; --i)
    _btnBag->DestroyChild(_btnBag->GetChild(i));

  auto imageRep = VOR2DImagePixelRep_var::Adopt(
      new VOR2DImagePixelRep(VORMathPoint2Df(-2.0f, -2.0f), image, 1, 0, 0, 0));
  float xmin = 0.0f, ymin = 0.0f, xmax = 0.0f, ymax = 0.0f;
  imageRep->GetBoundingBox(xmin, ymin, xmax, ymax);
  float ox = 0.0f;
  float oy = 0.0f;
  QELZitBltIconOffset(GetLocation(), xmax - xmin, ymax - ymin, ox, oy);
  imageRep->Modify(VORMathPoint2Df(static_cast<float>(ox - 2.0), static_cast<float>(oy - 2.0)));
  imageRep->SetAlphaMode(1);

  _btnBag->AddChild(imageRep);
  _grey = grey == 1;
}

void QELZitBltRep::SetShowMode(int mode) {
  if (_btnBag && mode == 0)
    BeforeExpandedShown();
  if (_btnBag)
    SetExpandedShowMode(mode);
  ReDraw();
}

void QELZitBltRep::ExpandZitBlt() {
  _collapsed = 0;
  if (_btnBag) {
    BeforeExpandedShown();
    SetExpandedShowMode(0);
    if (_viewer)
      _viewer->Draw();
  }
}

void QELZitBltRep::CollapseZitBlt() {
  _collapsed = 1;
  if (_btnBag) {
    SetExpandedShowMode(1);
    if (_viewer)
      _viewer->Draw();
  }
}

void QELZitBltRep::ChangeBtnState() {
  if (_btnState != 0) {
    _collapsed = 1;
    _btnState = 0;
    CollapseZitBlt();
  } else {
    _collapsed = 0;
    _btnState = 1;
    ExpandZitBlt();
  }
}

void QELZitBltRep::ReDraw() {
  if (_viewer)
    _viewer->Draw();
}

void QELZitBltRep::SetStatus(unsigned char status) {
  _status = status;
  if (status != 0 && status != 1)
    return;
  // Shown means both bags, whatever the open/closed state says.
  const int mode = status == 1 ? 0 : 1;
  if (_btnBag)
    _btnBag->SetShowMode(mode);
  if (_btnBag && mode == 0)
    BeforeExpandedShown();
  if (_btnBag)
    SetExpandedShowMode(mode);
}

void QELZitBltRep::SetTranslation(double x, double y) {
  SetBagsMatrix(VOR3x3Matrix::Translation(x, y));
}

void QELZitBltRep::SetPoDPosition(double x, double y) {
  SetTranslation(x, y);
  ReDraw();
}

void QELZitBltRep::GetPoDPosition(double& x, double& y) const {
  if (!_btnBag || _btnBag->GetMatrix() == nullptr)
    return;
  _btnBag->GetMatrix()->GetTranslation(x, y);
}

void QELZitBltRep::TransfromPoD(double dx, double dy) {
  if (!_btnBag || _btnBag->GetMatrix() == nullptr)
    return;
  double x = 0.0;
  double y = 0.0;
  _btnBag->GetMatrix()->GetTranslation(x, y);
  // The step is added in single precision.
  SetTranslation(static_cast<float>(x) + static_cast<float>(dx),
                 static_cast<float>(y) + static_cast<float>(dy));
  ReDraw();
}

void QELZitBltRep::SetPositioningLimits(double xmin, double ymin, double xmax, double ymax) {
  if (!_btnBag)
    return;
  float bxmin = 0.0f, bymin = 0.0f, bxmax = 0.0f, bymax = 0.0f;
  _btnBag->GetBoundingBox(bxmin, bymin, bxmax, bymax);
  const float hbw = (bxmax - bxmin) * 0.5f;
  const float hbh = (bymax - bymin) * 0.5f;
  // Only min x is narrowed by the half button; the other three are widened. Kept so on purpose.
  _minX = static_cast<float>(xmin - hbw);
  _minY = static_cast<float>(ymin + hbh);
  _maxX = static_cast<float>(xmax + hbw);
  _maxY = static_cast<float>(ymax + hbh);
}

void QELZitBltRep::GetPositioningLimits(double& xmin, double& ymin, double& xmax,
                                        double& ymax) const {
  xmin = _minX;
  ymin = _minY;
  xmax = _maxX;
  ymax = _maxY;
}

HRESULT QELZitBltRep::EmptyExpandedBagRep() {
  return E_FAIL;
}

VORNotifPropagation QELZitBltRep::AnalyseNotification(VORCommand* from, VORNotification* notif) {
  // Forwarding to the father is always explicit: the notification goes no further by itself.
  constexpr VORNotifPropagation kHandled = VORNotifDontPropagate;
  if (notif == nullptr || _manipulator == nullptr || from != _manipulator)
    return kHandled;
  if (notif == _manipulator->GetVORActivate()) {
    ChangeBtnState();
    SendNotification(GetFather(), notif);
    return kHandled;
  }
  if (notif != _manipulator->GetVORManipulate())
    return kHandled;

  VORMathAxis2D axis;
  _manipulator->GetPosition(axis);
  float px = 0.0f;
  float py = 0.0f;
  axis.GetOrigin(px, py);
  // (0, 0) means no point was recorded yet: the first event only records it.
  if ((_lastDragX != 0.0f || _lastDragY != 0.0f) && _btnBag && _btnBag->GetMatrix() != nullptr) {
    const float dx = px - _lastDragX;
    const float dy = py - _lastDragY;
    double tx = 0.0;
    double ty = 0.0;
    _btnBag->GetMatrix()->GetTranslation(tx, ty);
    const float cx = static_cast<float>(tx) + dx;
    const float cy = static_cast<float>(ty) + dy;
    // A refused step keeps the old drag point: the next step carries the refused distance.
    if (_horizontalLimit && (cx > _maxX || cx < _minX))
      return kHandled;
    if (_verticalLimit && (cy > _maxY || cy < _minY))
      return kHandled;
    SetTranslation(cx, cy);
    ReDraw();
  }
  _lastDragX = px;
  _lastDragY = py;
  SendNotification(GetFather(), notif);
  return kHandled;
}

VOR_EXPORT_COMMAND_FACTORY_NOARG(QELZitBltRep)
