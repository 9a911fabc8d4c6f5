// The window kinds of the host: the document's process tree, the classic PERT chart of one
// level, the product space of a document, and the preview of one product.
#pragma once

#include <map>
#include <string>
#include <vector>

#include "VORFrmWindow.h"
#include "VORLists.h"

// The process tree of a document (opened with the document).
class VORFrmTreeWindow : public VORFrmWindow {
  VOR_DECLARE_CLASS(VORFrmTreeWindow, VORFrmWindow)
 public:
  VORFrmTreeWindow(const VORString& name, VORFrmEditor* editor) : VORFrmWindow(name, editor) {}
};

// A node of a chart window: the object, its centre and its size in model coordinates.
struct VORChartNode {
  VORBaseUnknown_var object;
  VORUnicodeString label;
  double x = 0;
  double y = 0;
  double width = 0;
  double height = 0;
  bool positioned = false;
};

// The child graph nodes of root read afresh from the document, in child order.
std::vector<VORChartNode> VORFrmChartNodes(VORBaseUnknown* root);

// The classic PERT chart: the child graph nodes of one activity at their stored positions.
class QELFpaPertChartWindow : public VORFrmWindow {
  VOR_DECLARE_CLASS(QELFpaPertChartWindow, VORFrmWindow)
 public:
  // Node size used when the document stores none.
  static constexpr double DefaultNodeWidth = 20.0;
  static constexpr double DefaultNodeHeight = 10.0;

  QELFpaPertChartWindow(const VORString& name, VORFrmEditor* editor, VORBaseUnknown* root);
  VORBaseUnknown_var GetRootNode() const { return _root; }
  VORBaseUnknown_var GetChartRoot() const override { return _root; }
  // The topmost (last) positioned node whose box holds (x, y); null when none.
  VORBaseUnknown_var PickNode(double x, double y) const;

 private:
  VORBaseUnknown_var _root;
};

// The product space: a document's products with their shown/hidden state, reframing and
// centring on an object.
class VORNewInventorySpaceWnd : public VORFrmWindow {
  VOR_DECLARE_CLASS(VORNewInventorySpaceWnd, VORFrmWindow)
 public:
  VORNewInventorySpaceWnd(const VORString& name, VORFrmEditor* editor);
  bool Has3DViewer() const override { return true; }

  // Every product of the document (resources included), depth first.
  VORListValVORBaseUnknown_var GetProducts() const;
  // Shown state of a product (true for objects without visual properties).
  bool IsShown(VORBaseUnknown* product) const;
  // Flips a product's shown state through the model (false when it has none).
  bool HideShow(VORBaseUnknown* product);
  // Fits every shown product / centres the view on object (recorded for the GUI and scripts).
  void Reframe();
  bool CenterOn(VORBaseUnknown* object);
  VORBaseUnknown* GetCenteredObject() const { return _centered.get(); }
  int GetReframeCount() const { return _reframes; }
  std::string DescribeContents() const override;

 private:
  VORBaseUnknown_var _centered;
  int _reframes = 0;
};

// The preview of one product, opened by the preview window command.
class VORPreviewWindow : public VORFrmWindow {
  VOR_DECLARE_CLASS(VORPreviewWindow, VORFrmWindow)
 public:
  VORPreviewWindow(const VORString& name, VORFrmEditor* editor, VORBaseUnknown* product)
      : VORFrmWindow(name, editor), _product(product) {}
  VORBaseUnknown* GetProduct() const { return _product.get(); }

 private:
  VORBaseUnknown_var _product;
};

// Host command ids declared by the frame.
namespace VORFrmHostCommands {
inline constexpr const char* TileWinH = "TileWinH";
inline constexpr const char* CenterGraph = "CenterGraph";
inline constexpr const char* ReframeOn = "ReframeOn";
inline constexpr const char* HideShow = "HideShow";
inline constexpr const char* PertChart = "PertChart";
inline constexpr const char* ProductSpace = "ProductSpace";
inline constexpr const char* PreviewWindow = "QELFpaPreviewWindowManagerCmd";
// The read-only properties of the argument, else of the first picked object (VORFrmPropertiesDlg).
inline constexpr const char* Properties = "Properties";
// Declares the headers above (VORInitFrame does it; again after a test cleared them).
void DeclareAll();
}  // namespace VORFrmHostCommands

// A label for an object: its graph-node or activity label, product part number, else its id.
VORUnicodeString VORFrmObjectLabel(VORBaseUnknown* object);
