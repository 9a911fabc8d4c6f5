#include "VORCCP_Actor.h"

#include "VORISPPActivity.h"
#include "VORSPPCopyServices.h"
#include "VORSelectionContext.h"

namespace {
struct Clipboard {
  VORListValVORBaseUnknown_var objects;
  bool open = true;
};
Clipboard& TheClipboard() {
  static auto* clipboard = new Clipboard();  // never destroyed: used until exit
  return *clipboard;
}

VORBaseUnknown_var LeafOf(const VORBaseUnknown_var& pathOrObject) {
  if (auto* path = dynamic_cast<VORPathElement*>(pathOrObject.get()))
    return VORBaseUnknown_var(path->GetLeaf());
  return pathOrObject;
}
}  // namespace

VORCCP_Actor::VORCCP_Actor(VORCSO* cso) : _cso(cso) {}

VORCSO* VORCCP_Actor::CSO() const {
  return _cso ? _cso.get() : VORSelectionContext::CSO();
}

bool VORCCP_Actor::Initialize() {
  return CSO() != nullptr;
}

void VORCCP_Actor::ReadCSO() {
  _objects.RemoveAll();
  VORCSO* cso = CSO();
  if (cso == nullptr)
    return;
  for (int i = 1; i <= cso->GetSize(); ++i)
    _objects.Append(VORBaseUnknown_var(cso->GetElement(i)->GetLeaf()));
}

bool VORCCP_Actor::AllActivities(const VORListValVORBaseUnknown_var& objects) const {
  if (objects.IsEmpty())
    return false;
  for (const VORBaseUnknown_var& o : objects) {
    VORISPPActivity_var activity(o);
    VORBaseUnknown_var father;
    if (!activity || activity->GetFatherActivity(father) != S_OK || !father)
      return false;  // not an activity, or the root
  }
  return true;
}

bool VORCCP_Actor::CanCopy() const {
  return _type == CopyType && AllActivities(_objects);
}

bool VORCCP_Actor::Copy() {
  if (!CanCopy())
    return false;
  Clipboard& c = TheClipboard();
  c.objects.RemoveAll();
  c.objects.Append(_objects);
  return true;
}

bool VORCCP_Actor::CanPaste(const VORListValVORBaseUnknown_var& targets) const {
  const Clipboard& c = TheClipboard();
  if (_type != PasteIntoType || targets.IsEmpty() || c.objects.IsEmpty())
    return false;
  for (const VORBaseUnknown_var& t : targets) {
    if (!VORSPPCopyServices::CanPasteInto(c.objects, LeafOf(t)))
      return false;
  }
  return true;
}

bool VORCCP_Actor::Paste(const VORListValVORBaseUnknown_var& targets) {
  if (!CanPaste(targets))
    return false;
  VORListValVORBaseUnknown_var allCopies;
  for (const VORBaseUnknown_var& t : targets) {
    VORListValVORBaseUnknown_var copies;
    if (FAILED(VORSPPCopyServices::CopyActivities(TheClipboard().objects, LeafOf(t), copies)))
      return false;
    allCopies.Append(copies);
  }
  if (VORCSO* cso = CSO()) {
    cso->Empty();
    cso->AddElements(allCopies);
  }
  return true;
}

bool VORCCP_Actor::CanCut() const {
  return (_type == CutType || _type == CopyType) && AllActivities(_objects);
}

bool VORCCP_Actor::Cut() {
  if (!CanCut())
    return false;
  // Removed objects must not stay selected or on the clipboard.
  if (VORCSO* cso = CSO()) {
    for (const VORBaseUnknown_var& o : _objects)
      cso->RemoveElement(o);
  }
  for (const VORBaseUnknown_var& o : _objects)
    TheClipboard().objects.RemoveValue(o);
  const bool removed = SUCCEEDED(VORSPPCopyServices::RemoveActivities(_objects));
  _objects.RemoveAll();
  return removed;
}

void VORCCP_Actor::OpenClipboard() {
  TheClipboard().objects.RemoveAll();
  TheClipboard().open = true;
}

void VORCCP_Actor::CloseClipboard() {
  TheClipboard().open = false;
}

const VORListValVORBaseUnknown_var& VORCCP_Actor::GetClipboard() {
  return TheClipboard().objects;
}
