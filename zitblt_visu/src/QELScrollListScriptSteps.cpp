// Script steps that drive and print the ZitBlt lists of a chart without a screen: open and close
// a ZitBlt, print a list, scroll it, open its button's context menu, show its balloon, click an
// item, drag it onto another activity, slide the ZitBlt round its node. Registered by the ZitBlt
// model module's initialisation.
#include <cstdio>
#include <functional>
#include <memory>

#include "QELScrollListScriptSteps.h"

#include "QELBaseScrollListZitBltRep.h"
#include "QELIZitBltMgr.h"
#include "QELPFViewerItemRepComponent.h"
#include "VOR2DCustomRep.h"
#include "VOR2DPointRep.h"
#include "VOR2DTextRep.h"
#include "VORDriver.h"
#include "VORExtIVisu.h"
#include "VORFrmLayout.h"
#include "VORFrmWindowKinds.h"
#include "VORIGraphNodeLayout.h"
#include "VORScript.h"

namespace {
using Words = std::vector<std::string>;

std::string Number(double v) {
  char buffer[32];
  std::snprintf(buffer, sizeof buffer, "%g", v);
  return buffer;
}

std::string Point(const VORMathPoint2D& p) {
  return "(" + Number(p.x) + ", " + Number(p.y) + ")";
}

// The rep's frame mapped to its top bag's father frame (the model): the matrices of every bag
// from the rep's father up, applied to points of the rep's father frame.
VOR3x3Matrix ToModel(const VOR2DRep* rep) {
  VOR3x3Matrix m;
  for (const VOR2DBagRep* bag = rep->GetFather(); bag != nullptr; bag = bag->GetFather()) {
    if (bag->GetMatrix() != nullptr)
      m = *bag->GetMatrix() * m;
  }
  return m;
}

VORMathPoint2D BoxCentreInModel(const VOR2DRep* rep) {
  const VORBox2D box = ToModel(rep).TransformBox(rep->GetBoundingBox());
  return {box.CentreX(), box.CentreY()};
}

struct Target {
  VORBaseUnknown* node = nullptr;
  QELZitBltRep* rep = nullptr;
  std::string window;  // title of the window whose viewer shows the ZitBlt
};

// Finds the node's ZitBlt (words[1], words[2]) and the window that shows it.
bool Find(VORDriver& driver, const Words& words, size_t count, const char* usage, Target& target,
          std::string& error) {
  if (words.size() != count) {
    error = std::string("usage: ") + usage;
    return false;
  }
  target.node = driver.FindObject(words[1]);
  if (target.node == nullptr) {
    error = "no object \"" + words[1] + "\"";
    return false;
  }
  QELIZitBltMgr_var manager{VORBaseUnknown_var(target.node)};
  if (!manager || FAILED(manager->GetZitBlt(VORUnicodeString(words[2].c_str()), &target.rep)) ||
      target.rep == nullptr) {
    error = "\"" + words[1] + "\" has no ZitBlt \"" + words[2] + "\"";
    return false;
  }
  for (VORFrmWindow* w : VORFrmLayout::GetCurrentLayout()->GetWindowList()) {
    if (target.rep->GetViewer() != nullptr && w->GetViewer() == target.rep->GetViewer()) {
      target.window = w->GetTitle().ConvertToUTF8();
      return true;
    }
  }
  error = "ZitBlt \"" + words[2] + "\" of \"" + words[1] + "\" is not shown in a window";
  return false;
}

bool FindList(VORDriver& driver, const Words& words, size_t count, const char* usage,
              Target& target, QELBaseScrollListZitBltRep*& list, std::string& error) {
  if (!Find(driver, words, count, usage, target, error))
    return false;
  list = target.rep->GetScrollListRep();
  if (list == nullptr) {
    error = "ZitBlt \"" + words[2] + "\" of \"" + words[1] + "\" shows no list";
    return false;
  }
  return true;
}

bool DriverStep(VORDriver& driver, bool ok, std::string& error) {
  if (!ok)
    error = driver.LastError();
  return ok;
}

VOR2DBagRep* ItemRep(QELIScrollListZitBltItemVisu* visual) {
  VORIVisu_var visu{VORBaseUnknown_var(visual)};
  return visu ? dynamic_cast<VOR2DBagRep*>(visu->GetRep()) : nullptr;
}

// The label bag of an item rep (its first child) and the text rep in it.
VOR2DBagRep* LabelOf(VOR2DBagRep* item) {
  return item != nullptr ? dynamic_cast<VOR2DBagRep*>(item->GetChild(1)) : nullptr;
}
VOR2DTextRep* TextOf(VOR2DBagRep* label) {
  if (label == nullptr)
    return nullptr;
  for (const VOR2DRep_var& child : label->GetChildren()) {
    if (auto* text = dynamic_cast<VOR2DTextRep*>(child.get()))
      return text;
  }
  return nullptr;
}

std::string PolylineText(const VOR2DGP* primitive, const VOR3x3Matrix& m) {
  auto* polyline = dynamic_cast<const VOR2DPolylineGP*>(primitive);
  std::string text;
  if (polyline == nullptr)
    return text;
  for (const VORMathPoint2Df& p : polyline->GetPoints())
    text += (text.empty() ? "" : " ") + Point(m.Transform(p.x, p.y));
  return text;
}

std::string DescribeItem(QELBaseScrollListZitBltRep* list, int i) {
  QELIScrollListZitBltItemVisu* visual = list->GetItemVisual(i);
  VOR2DBagRep* item = ItemRep(visual);
  VOR2DBagRep* label = LabelOf(item);
  VOR2DTextRep* text = TextOf(label);
  if (item == nullptr || label == nullptr || text == nullptr)
    return "  item " + std::to_string(i) + ": not drawn\n";
  const int position = list->GetItems().Locate(VORBaseUnknown_var(visual->GetAssociatedPFItem()));
  const std::vector<int>& kinds = list->GetItemKinds();
  const int kind = position >= 1 && position <= static_cast<int>(kinds.size())
                       ? kinds[static_cast<size_t>(position - 1)]
                       : 1;
  // Positions in the expanded bag's frame: through the item rep's own matrix.
  VOR3x3Matrix itemFrame;
  item->GetMatrix(itemFrame);
  VOR3x3Matrix labelFrame;
  label->GetMatrix(labelFrame);
  double lx = 0.0;
  double ly = 0.0;
  (itemFrame * labelFrame).GetTranslation(lx, ly);
  std::string line = "  item " + std::to_string(i) + " \"" + text->GetText().ConvertToUTF8() +
                     "\": kind " + std::to_string(kind) + ", state " +
                     std::to_string(list->GetItemState(position)) + ", " +
                     (label->IsShown() ? "shown" : "hidden") + ", label " + Point({lx, ly}) +
                     ", anchor " + std::to_string(text->GetAnchor());
  bool icon = false;
  for (const VOR2DRep_var& child : label->GetChildren()) {
    if (dynamic_cast<VOR2DPointRep*>(child.get()) != nullptr)
      line += ", marker";
    if (dynamic_cast<VOR2DBagRep*>(child.get()) != nullptr)
      icon = true;
  }
  if (icon) {
    if (auto* component = dynamic_cast<QELPFViewerItemRepComponent*>(visual))
      line += ", icon \"" + component->GetIconName().ConvertToUTF8() + "\"";
  }
  auto* arrow = dynamic_cast<VOR2DBagRep*>(item->GetChild(2));
  auto* custom = arrow != nullptr ? dynamic_cast<VOR2DCustomRep*>(arrow->GetChild(1)) : nullptr;
  if (custom != nullptr && custom->GetPrimitiveCount() >= 2) {
    VOR3x3Matrix arrowFrame;
    arrow->GetMatrix(arrowFrame);
    const VOR3x3Matrix m = itemFrame * arrowFrame;
    line += ", link " + PolylineText(custom->GetPrimitive(1), m) + ", arrow " +
            PolylineText(custom->GetPrimitive(2), m);
  }
  return line + "\n";
}

std::string DescribeList(VORBaseUnknown* node, QELBaseScrollListZitBltRep* list) {
  const char* bar = list->GetZitbltScrollBarHideState() ? "hidden"
                    : list->GetScroller() != nullptr    ? "shown"
                                                        : "none";
  std::string text = "list \"" + list->GetName().ConvertToUTF8() + "\" of \"" +
                     VORFrmObjectLabel(node).ConvertToUTF8() +
                     "\": " + std::to_string(list->GetItems().Size()) + " items, range " +
                     std::to_string(list->GetScrollRange()) + ", first " +
                     std::to_string(list->GetFirst()) + ", scroll bar " + bar;
  if (list->IsButtonGrey())
    text += ", grey";
  text += "\n";
  for (int i = 1; i <= list->GetItemVisualCount(); ++i)
    text += DescribeItem(list, i);
  return text;
}

// expand / collapse: a click on the button.
bool ClickButton(VORDriver& driver, const Words& words, bool open, std::string& error) {
  Target t;
  if (!Find(driver, words, 3, open ? "expand <node> <zitblt>" : "collapse <node> <zitblt>", t,
            error))
    return false;
  if (t.rep->IsButtonCollapse() != open) {
    error = "ZitBlt \"" + words[2] + "\" of \"" + words[1] + "\" is already " +
            (open ? "open" : "closed");
    return false;
  }
  const VORMathPoint2D at = BoxCentreInModel(t.rep->GetZitBltBtn());
  return DriverStep(driver, driver.PickInChart(t.window, at.x, at.y), error);
}

bool PrintList(VORDriver& driver, const Words& words, std::ostream& out, std::string& error) {
  // The words are "print list <node> <zitblt>".
  const Words rest(words.begin() + 1, words.end());
  Target t;
  QELBaseScrollListZitBltRep* list = nullptr;
  if (!FindList(driver, rest, 3, "print list <node> <zitblt>", t, list, error))
    return false;
  out << DescribeList(t.node, list);
  return true;
}

bool Scroll(VORDriver& driver, const Words& words, std::string& error) {
  Target t;
  QELBaseScrollListZitBltRep* list = nullptr;
  if (!FindList(driver, words, 4, "scroll <node> <zitblt> <first>", t, list, error))
    return false;
  char* end = nullptr;
  const double first = std::strtod(words[3].c_str(), &end);
  if (words[3].empty() || *end != '\0') {
    error = "\"" + words[3] + "\" is not a number";
    return false;
  }
  if (list->GetScroller() == nullptr) {
    error = "list \"" + words[2] + "\" of \"" + words[1] + "\" has no scroll bar";
    return false;
  }
  // A drag of the scroller from where the manipulator stands to where it reads as `first`.
  VOR2DManipulator* m = list->GetScrollManipulator();
  VORMathAxis2D axis;
  m->GetPosition(axis);
  const double target = list->GrowsUp() ? first : -first;
  const VORMathPoint2D from = BoxCentreInModel(list->GetScroller());
  const VORMathPoint2D to{from.x, from.y + (target - axis.origin.y)};
  VORViewer_var viewer(list->GetViewer());
  m->PointerPress(viewer, from, 0, list->GetScroller());
  m->PointerDrag(to, 0);
  m->PointerRelease(to, 0);
  driver.DrainDeferred();
  return true;
}

bool ContextZitBlt(VORDriver& driver, const Words& words, std::string& error) {
  Target t;
  if (!Find(driver, words, 3, "context-zitblt <node> <zitblt>", t, error))
    return false;
  const VORMathPoint2D at = BoxCentreInModel(t.rep->GetZitBltBtn());
  return DriverStep(driver, driver.OpenContextMenu(t.window, at.x, at.y), error);
}

bool Balloon(VORDriver& driver, const Words& words, std::ostream& out, std::string& error) {
  Target t;
  QELBaseScrollListZitBltRep* list = nullptr;
  if (!FindList(driver, words, 3, "balloon <node> <zitblt>", t, list, error))
    return false;
  if (list->GetScroller() == nullptr) {
    error = "list \"" + words[2] + "\" of \"" + words[1] + "\" has no scroll bar";
    return false;
  }
  VOR2DManipulator* m = list->GetScrollManipulator();
  const VORMathPoint2D at = BoxCentreInModel(list->GetScroller());
  if (m->IsPreactivated())
    m->EndPreactivate(list->GetViewer(), at, 0);
  m->Preactivate(list->GetViewer(), at, 0);
  VORPVBalloon* balloon = list->GetBalloon();
  out << "balloon: " << (balloon && balloon->IsVisible() ? balloon->GetText().ConvertToUTF8() : "")
      << "\n";
  return true;
}

// The centre of the shown label of the item words[3] of an open list.
bool ItemLabelCentre(QELBaseScrollListZitBltRep* list, const Words& words, VORMathPoint2D& at,
                     std::string& error) {
  if (list->IsButtonCollapse()) {
    error = "list \"" + words[2] + "\" of \"" + words[1] + "\" is closed";
    return false;
  }
  for (int i = 1; i <= list->GetItemVisualCount(); ++i) {
    VOR2DBagRep* label = LabelOf(ItemRep(list->GetItemVisual(i)));
    VOR2DTextRep* text = TextOf(label);
    if (text == nullptr || text->GetText() != VORUnicodeString(words[3].c_str()))
      continue;
    if (!label->IsShown()) {
      error = "item \"" + words[3] + "\" is scrolled out of view";
      return false;
    }
    at = BoxCentreInModel(text);
    return true;
  }
  error = "list \"" + words[2] + "\" of \"" + words[1] + "\" has no item \"" + words[3] + "\"";
  return false;
}

bool PickItem(VORDriver& driver, const Words& words, std::string& error) {
  Target t;
  QELBaseScrollListZitBltRep* list = nullptr;
  VORMathPoint2D at;
  if (!FindList(driver, words, 4, "pick-item <node> <zitblt> <item label>", t, list, error) ||
      !ItemLabelCentre(list, words, at, error))
    return false;
  return DriverStep(driver, driver.PickInChart(t.window, at.x, at.y), error);
}

// A click on the item, then a drag of it onto the centre of the target's node; the list says
// its verdict on the drop (an event line) before carrying it out.
bool DragItem(VORDriver& driver, const Words& words, std::string& error) {
  Target t;
  QELBaseScrollListZitBltRep* list = nullptr;
  VORMathPoint2D at;
  if (!FindList(driver, words, 5, "drag-item <node> <zitblt> <item label> <target node>", t, list,
                error) ||
      !ItemLabelCentre(list, words, at, error))
    return false;
  VORBaseUnknown* target = driver.FindObject(words[4]);
  if (target == nullptr) {
    error = "no object \"" + words[4] + "\"";
    return false;
  }
  VORIGraphNodeLayout_var layout{VORBaseUnknown_var(target)};
  if (!layout || !layout->HasPertPosition()) {
    error = "\"" + words[4] + "\" is not placed in the chart";
    return false;
  }
  if (!driver.PickInChart(t.window, at.x, at.y))
    return DriverStep(driver, false, error);
  if (list->GetItemManipulator()->GetElementCount() == 0) {
    error = "item \"" + words[3] + "\" cannot be dragged";
    return false;
  }
  double x = 0.0;
  double y = 0.0;
  layout->GetPertPosition(x, y);
  return DriverStep(driver, driver.Drag(t.window, at.x, at.y, x, y), error);
}

bool Slide(VORDriver& driver, const Words& words, std::string& error) {
  Target t;
  if (!Find(driver, words, 5, "slide <node> <zitblt> <dx> <dy>", t, error))
    return false;
  double d[2] = {0.0, 0.0};
  for (int k = 0; k < 2; ++k) {
    char* end = nullptr;
    d[k] = std::strtod(words[3 + static_cast<size_t>(k)].c_str(), &end);
    if (words[3 + static_cast<size_t>(k)].empty() || *end != '\0') {
      error = "\"" + words[3 + static_cast<size_t>(k)] + "\" is not a number";
      return false;
    }
  }
  const VORMathPoint2D at = BoxCentreInModel(t.rep->GetZitBltBtn());
  return DriverStep(driver, driver.Drag(t.window, at.x, at.y, at.x + d[0], at.y + d[1]), error);
}

}  // namespace

void QELRegisterScrollListScriptSteps() {
  VORScript::RegisterStep("expand", [](VORDriver& d, const Words& w, std::ostream&,
                                       std::string& e) { return ClickButton(d, w, true, e); });
  VORScript::RegisterStep("collapse", [](VORDriver& d, const Words& w, std::ostream&,
                                         std::string& e) { return ClickButton(d, w, false, e); });
  VORScript::RegisterStep("print list", PrintList);
  VORScript::RegisterStep("scroll", [](VORDriver& d, const Words& w, std::ostream&,
                                       std::string& e) { return Scroll(d, w, e); });
  VORScript::RegisterStep("context-zitblt", [](VORDriver& d, const Words& w, std::ostream&,
                                               std::string& e) { return ContextZitBlt(d, w, e); });
  VORScript::RegisterStep("balloon", Balloon);
  VORScript::RegisterStep("pick-item", [](VORDriver& d, const Words& w, std::ostream&,
                                          std::string& e) { return PickItem(d, w, e); });
  VORScript::RegisterStep("drag-item", [](VORDriver& d, const Words& w, std::ostream&,
                                          std::string& e) { return DragItem(d, w, e); });
  VORScript::RegisterStep("slide", [](VORDriver& d, const Words& w, std::ostream&, std::string& e) {
    return Slide(d, w, e);
  });
}
