// The host's window kinds and the host commands that open and act on them.
#include "VORFrmWindowKinds.h"

#include <cmath>
#include <cstdio>
#include <filesystem>
#include <memory>

#include "VORApplicationFrame.h"
#include "VORCommandHeader.h"
#include "VORExtISelectShow.h"
#include "VORFrmPropertiesDlg.h"
#include "VORIGENode.h"
#include "VORIGraphNodeLayout.h"
#include "VORIProduct.h"
#include "VORISPPAbstractActivity.h"
#include "VORISpecObject.h"
#include "VORIVisProperties.h"
#include "VORSelectionContext.h"

namespace {
std::string Format(double v) {
  char buffer[32];
  std::snprintf(buffer, sizeof buffer, "%.1f", v);
  return buffer;
}

void CollectProducts(VORBaseUnknown* product, VORListValVORBaseUnknown_var& out) {
  VORIProduct_var p{VORBaseUnknown_var(product)};
  if (!p)
    return;
  out.Append(VORBaseUnknown_var(product));
  VORListValVORBaseUnknown_var* children = nullptr;
  if (SUCCEEDED(p->GetChildren(children, "VORIProduct")) && children != nullptr) {
    std::unique_ptr<VORListValVORBaseUnknown_var> owned(children);
    for (const VORBaseUnknown_var& c : *children)
      CollectProducts(c, out);
  }
}

std::string FileNameOf(VORFrmEditor* editor) {
  if (editor == nullptr)
    return std::string();
  return std::filesystem::path(editor->StorageName()).filename().string();
}
}  // namespace

VORUnicodeString VORFrmObjectLabel(VORBaseUnknown* object) {
  VORBaseUnknown_var o(object);
  VORUnicodeString label;
  if (VORIGENode_var node(o); node && SUCCEEDED(node->GetLabel(label)) && !label.IsEmpty())
    return label;
  if (VORISPPAbstractActivity_var a(o); a && SUCCEEDED(a->GetLabel(label)) && !label.IsEmpty())
    return label;
  if (VORIProduct_var p(o); p && SUCCEEDED(p->GetPartNumber(label)) && !label.IsEmpty())
    return label;
  if (VORISpecObject_var s(o); s)
    return s->GetId().ToUnicode();
  return object ? VORUnicodeString(object->IsA()) : VORUnicodeString("null");
}

QELFpaPertChartWindow::QELFpaPertChartWindow(const VORString& name, VORFrmEditor* editor,
                                             VORBaseUnknown* root)
    : VORFrmWindow(name, editor), _root(root) {}

std::vector<VORChartNode> VORFrmChartNodes(VORBaseUnknown* rootObject) {
  std::vector<VORChartNode> nodes;
  VORIGENode_var root{VORBaseUnknown_var(rootObject)};
  VORListValVORBaseUnknown_var* children = nullptr;
  if (!root || FAILED(root->GetChildren(children)) || children == nullptr)
    return nodes;
  std::unique_ptr<VORListValVORBaseUnknown_var> owned(children);
  for (const VORBaseUnknown_var& child : *children) {
    VORChartNode node;
    node.object = child;
    node.label = VORFrmObjectLabel(child);
    node.width = QELFpaPertChartWindow::DefaultNodeWidth;
    node.height = QELFpaPertChartWindow::DefaultNodeHeight;
    if (VORIGraphNodeLayout_var layout(child); layout) {
      node.positioned = layout->HasPertPosition();
      layout->GetPertPosition(node.x, node.y);
      double w = 0, h = 0;
      layout->GetPertNodeSize(w, h);
      if (w > 0 && h > 0) {
        node.width = w;
        node.height = h;
      }
    }
    nodes.push_back(node);
  }
  return nodes;
}

VORBaseUnknown_var QELFpaPertChartWindow::PickNode(double x, double y) const {
  const std::vector<VORChartNode> nodes = VORFrmChartNodes(_root);
  for (auto it = nodes.rbegin(); it != nodes.rend(); ++it) {
    if (it->positioned && std::fabs(x - it->x) <= it->width / 2 &&
        std::fabs(y - it->y) <= it->height / 2)
      return it->object;
  }
  return VORBaseUnknown_var();
}

std::string VORFrmWindow::DescribeContents() const {
  std::string text;
  for (const VORChartNode& node : VORFrmChartNodes(GetChartRoot())) {
    text += "  node \"" + node.label.ConvertToUTF8() + "\"";
    text += node.positioned ? " at (" + Format(node.x) + ", " + Format(node.y) + ")" : " unplaced";
    text += "\n";
  }
  return text;
}

VORNewInventorySpaceWnd::VORNewInventorySpaceWnd(const VORString& name, VORFrmEditor* editor)
    : VORFrmWindow(name, editor) {}

VORListValVORBaseUnknown_var VORNewInventorySpaceWnd::GetProducts() const {
  VORListValVORBaseUnknown_var products;
  auto* document = GetEditor() ? dynamic_cast<VORProcess*>(GetEditor()->GetDocument()) : nullptr;
  if (document == nullptr)
    return products;
  CollectProducts(document->GetRootProduct(), products);
  CollectProducts(document->GetResourceRoot(), products);
  return products;
}

bool VORNewInventorySpaceWnd::IsShown(VORBaseUnknown* product) const {
  VORIVisProperties_var vis{VORBaseUnknown_var(product)};
  return !vis || vis->IsShown();
}

bool VORNewInventorySpaceWnd::HideShow(VORBaseUnknown* product) {
  VORIVisProperties_var vis{VORBaseUnknown_var(product)};
  return vis && SUCCEEDED(vis->SetShown(!vis->IsShown()));
}

void VORNewInventorySpaceWnd::Reframe() {
  _centered = NULL_var;
  ++_reframes;
}

bool VORNewInventorySpaceWnd::CenterOn(VORBaseUnknown* object) {
  if (object == nullptr)
    return false;
  _centered = object;
  return true;
}

std::string VORNewInventorySpaceWnd::DescribeContents() const {
  std::string text;
  for (const VORBaseUnknown_var& p : GetProducts())
    text += "  product \"" + VORFrmObjectLabel(p).ConvertToUTF8() + "\" " +
            (IsShown(p) ? "shown" : "hidden") + "\n";
  if (_centered)
    text += "  centred on \"" + VORFrmObjectLabel(_centered).ConvertToUTF8() + "\"\n";
  return text;
}

namespace {
// A host command that does its work when activated.
class VORHostCommand : public VORCommand {
 public:
  VORHostCommand(const char* name, std::function<void(VORBaseUnknown*)> work,
                 VORBaseUnknown* argument)
      : VORCommand(nullptr, name), _work(std::move(work)), _argument(argument) {}
  VORStatusChangeRC Activate(VORCommand*, VORNotification*) override {
    _work(_argument.get());
    return VORStatusChangeRCCompleted;
  }

 private:
  std::function<void(VORBaseUnknown*)> _work;
  VORBaseUnknown_var _argument;
};

// The argument, else the first leaf of the PSO, else of the CSO.
VORBaseUnknown_var Target(VORBaseUnknown* argument) {
  if (argument != nullptr)
    return VORBaseUnknown_var(argument);
  for (VORSelectionSet* set : {static_cast<VORSelectionSet*>(VORSelectionContext::PSO()),
                               static_cast<VORSelectionSet*>(VORSelectionContext::CSO())}) {
    if (set != nullptr && !set->IsEmpty())
      return VORBaseUnknown_var(set->GetElement(1)->GetLeaf());
  }
  return VORBaseUnknown_var();
}

// What hide/show acts on: the argument, else what the first selected path's components give
// for it (VORISelectShow), else its leaf.
VORBaseUnknown_var HideShowTarget(VORBaseUnknown* argument) {
  if (argument != nullptr)
    return VORBaseUnknown_var(argument);
  for (VORSelectionSet* set : {static_cast<VORSelectionSet*>(VORSelectionContext::PSO()),
                               static_cast<VORSelectionSet*>(VORSelectionContext::CSO())}) {
    if (set != nullptr && !set->IsEmpty())
      return VORSelectShow::ElementForHideShow(set->GetElement(1));
  }
  return VORBaseUnknown_var();
}

// The current window when it is a product space of the current editor, else the last one.
VORNewInventorySpaceWnd* CurrentProductSpace() {
  VORFrmLayout* layout = VORFrmLayout::GetCurrentLayout();
  auto* current = dynamic_cast<VORNewInventorySpaceWnd*>(layout->GetCurrentWindow());
  if (current != nullptr)
    return current;
  VORNewInventorySpaceWnd* found = nullptr;
  for (VORFrmWindow* w : layout->GetWindowList()) {
    if (auto* space = dynamic_cast<VORNewInventorySpaceWnd*>(w);
        space != nullptr && w->GetEditor() == VORFrmEditor::GetCurrentEditor())
      found = space;
  }
  return found;
}

void Host(const char* id, std::function<void(VORBaseUnknown*)> work) {
  VORCommandHeader::RegisterHostClass(
      id, [id, work](VORBaseUnknown* argument) { return new VORHostCommand(id, work, argument); });
  auto header = VORCommandHeader_var::Adopt(new VORCommandHeader(id, "", id));
  VORCommandHeader::Declare(header);
}
}  // namespace

namespace VORFrmHostCommands {
void DeclareAll() {
  Host(TileWinH, [](VORBaseUnknown*) { VORFrmLayout::GetCurrentLayout()->TileHorizontally(); });
  Host(CenterGraph, [](VORBaseUnknown* argument) {
    if (VORNewInventorySpaceWnd* space = CurrentProductSpace())
      space->CenterOn(Target(argument));
  });
  Host(ReframeOn, [](VORBaseUnknown*) {
    if (VORNewInventorySpaceWnd* space = CurrentProductSpace())
      space->Reframe();
  });
  Host(HideShow, [](VORBaseUnknown* argument) {
    if (VORNewInventorySpaceWnd* space = CurrentProductSpace())
      space->HideShow(HideShowTarget(argument));
  });
  Host(PertChart, [](VORBaseUnknown* argument) {
    VORBaseUnknown_var root = Target(argument);
    VORFrmEditor* editor = VORFrmEditor::GetCurrentEditor();
    if (!VORIGENode_var(root) || editor == nullptr)
      return;
    const std::string label = VORFrmObjectLabel(root).ConvertToUTF8();
    auto* window = new QELFpaPertChartWindow(label + " PERT Chart", editor, root);
    window->SetTitle(label + " - PERT Chart");
  });
  Host(ProductSpace, [](VORBaseUnknown*) {
    VORFrmEditor* editor = VORFrmEditor::GetCurrentEditor();
    if (editor == nullptr)
      return;
    auto* window = new VORNewInventorySpaceWnd("Product Space", editor);
    window->SetTitle(FileNameOf(editor) + " - Product Space");
  });
  Host(Properties,
       [](VORBaseUnknown* argument) { VORFrmPropertiesDlg::Show(Target(argument).get()); });
  Host(PreviewWindow, [](VORBaseUnknown* argument) {
    VORBaseUnknown_var product = Target(argument);
    VORFrmEditor* editor = VORFrmEditor::GetCurrentEditor();
    if (!VORIProduct_var(product) || editor == nullptr)
      return;
    auto* window = new VORPreviewWindow("Preview", editor, product);
    window->SetTitle("Preview - " + VORFrmObjectLabel(product).ConvertToUTF8());
  });
}
}  // namespace VORFrmHostCommands
