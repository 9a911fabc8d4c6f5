#include "VORExtISelectShow.h"

namespace VORSelectShow {
namespace {
// The deepest position of path whose element answers VORISelectShow (0 when none).
int Answering(VORPathElement* path, VORISelectShow_var& component) {
  for (int i = path != nullptr ? path->GetSize() : 0; i >= 1; --i) {
    component = VORISelectShow_var{VORBaseUnknown_var(path->GetElement(i))};
    if (component)
      return i;
  }
  return 0;
}
}  // namespace

VORPathElement_var PathToSelect(VORPathElement* path) {
  VORISelectShow_var component;
  const int at = Answering(path, component);
  VORBaseUnknown* element = at != 0 ? component->GetElement(path) : nullptr;
  if (element == nullptr)
    return VORPathElement_var(path);
  VORListValVORBaseUnknown_var elements;
  for (int i = 1; i <= at; ++i)
    elements.Append(VORBaseUnknown_var(path->GetElement(i)));
  if (element->GetIdentity() != path->GetElement(at)->GetIdentity())
    elements.Append(VORBaseUnknown_var(element));
  auto selected = VORPathElement_var::Adopt(new VORPathElement(elements));
  return selected->IsEqual(*path) ? VORPathElement_var(path) : selected;
}

VORBaseUnknown_var ElementForHideShow(VORPathElement* path) {
  if (path == nullptr)
    return VORBaseUnknown_var();
  VORISelectShow_var component;
  if (Answering(path, component) != 0) {
    VORBaseUnknown* element = nullptr;
    int flag = 0;
    if (SUCCEEDED(component->GetElementForHideShow(path, element, flag)) && element != nullptr)
      return VORBaseUnknown_var::Adopt(element);
  }
  return VORBaseUnknown_var(path->GetLeaf());
}
}  // namespace VORSelectShow
