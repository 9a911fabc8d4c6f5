#include "QELPertViewer.h"

#include "VORIGENode.h"

QELPertViewer::QELPertViewer(VORCommand* parent, const VORString& name, int style, int width,
                             int height, int flags)
    : VORViewer(parent, name, style, width, height, flags) {}

VORBaseUnknown_var QELPertViewer::NodeAt(double px, double py) {
  for (const VORPathElement_var& path : PickPaths(px, py)) {
    // The innermost graph node of the path: an inner node before its super node.
    VORIGENode_var node = path->SearchElement<VORIGENode>();
    if (node)
      return VORBaseUnknown_var(node.Identity());
  }
  return VORBaseUnknown_var();
}
