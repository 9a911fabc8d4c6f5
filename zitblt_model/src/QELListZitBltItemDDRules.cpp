#include "QELListZitBltItemDDRules.h"

#include <memory>
#include <unordered_set>

#include "QELIBIWItemInfo.h"
#include "QELIMfgAssembly.h"
#include "VORISPPActivity.h"
#include "VORISPPFlowMgt.h"
#include "VORISPPItem.h"
#include "VORISPPItemMgt.h"
#include "VORISPPProductIO.h"
#include "VORISpecObject.h"
#include "VORModelTypes.h"
#include "VORUndoHistory.h"

namespace QELItemDD {

VORUnicodeString TypeRefusal(const VORUnicodeString& fromType, const VORUnicodeString& toType) {
  return VORUnicodeString("Product Input can not be ReAssigned from " + fromType.ConvertToUTF8() +
                          " to " + toType.ConvertToUTF8());
}

bool IsActivity(VORBaseUnknown* object) {
  return static_cast<bool>(VORISPPActivity_var{VORBaseUnknown_var(object)});
}

bool TypeNameOf(VORBaseUnknown* object, VORUnicodeString& type) {
  VORISpecObject_var spec{VORBaseUnknown_var(object)};
  return spec && SUCCEEDED(spec->GetTypeName(type));
}

bool ReadActivityTypes(VORBaseUnknown* from, VORBaseUnknown* to, VORUnicodeString& fromType,
                       VORUnicodeString& toType, VORUnicodeString& message) {
  if (!IsActivity(from) || !IsActivity(to)) {
    message = VORUnicodeString(kNotAnActivity);
    return false;
  }
  return TypeNameOf(from, fromType) && TypeNameOf(to, toType);
}

bool IsStationOrGrouping(const VORUnicodeString& type) {
  return type == VORUnicodeString(VORModelLateTypes::Station) ||
         type == VORUnicodeString(VORModelLateTypes::Grouping);
}

bool IsStationGroupingOrLoading(const VORUnicodeString& type) {
  return IsStationOrGrouping(type) || type == VORUnicodeString(VORModelLateTypes::Loading);
}

bool IsWelding(const VORUnicodeString& type) {
  return VORModelLateTypes::IsWeldingType(type.ConvertToUTF8());
}

VORBaseUnknown_var ItemOf(VORBaseUnknown* productIO) {
  VORBaseUnknown_var item;
  if (VORISPPProductIO_var io{VORBaseUnknown_var(productIO)}; io)
    io->GetItem(item);
  return item;
}

VORUnicodeString NameOf(VORBaseUnknown* item) {
  VORUnicodeString name;
  if (VORISPPItem_var asItem{VORBaseUnknown_var(item)}; asItem)
    asItem->GetName(name);
  return name;
}

namespace {
using List = std::unique_ptr<VORListValVORBaseUnknown_var>;

bool OutputsCarry(VORBaseUnknown* activity, const void* item) {
  VORISPPFlowMgt_var flow{VORBaseUnknown_var(activity)};
  VORListValVORBaseUnknown_var* outputs = nullptr;
  if (!flow || FAILED(flow->GetProductOutputs(outputs)))
    return false;
  const List owned(outputs);
  for (const VORBaseUnknown_var& output : *outputs) {
    if (ItemOf(output).Identity() == item)
      return true;
  }
  return false;
}

// Collects the components of assembly at every depth (an assembly met twice is walked once).
void Components(VORBaseUnknown* assembly, std::unordered_set<const void*>& seen,
                VORListValVORBaseUnknown_var& out) {
  QELIMfgAssembly_var mfg{VORBaseUnknown_var(assembly)};
  VORListValVORBaseUnknown_var* components = nullptr;
  if (!mfg || FAILED(mfg->GetComponents(components)) || components == nullptr)
    return;
  const List owned(components);
  for (const VORBaseUnknown_var& component : *components) {
    if (!seen.insert(component.Identity()).second)
      continue;
    out.Append(component);
    Components(component, seen, out);
  }
}
}  // namespace

bool AcceptsInputOf(VORBaseUnknown* to, VORBaseUnknown* item) {
  if (item == nullptr)
    return true;
  const void* identity = item->GetIdentity();
  // What the activity declares itself, then what each of its listed activities produces.
  if (OutputsCarry(to, identity))
    return false;
  QELIBIWItemInfo_var info{VORBaseUnknown_var(to)};
  VORListValVORBaseUnknown_var* activities = nullptr;
  if (!info || FAILED(info->GetActivityList(activities)) || activities == nullptr)
    return true;
  const List owned(activities);
  for (const VORBaseUnknown_var& activity : *activities) {
    if (OutputsCarry(activity, identity))
      return false;
  }
  return true;
}

bool AcceptsAssembly(VORBaseUnknown* to, VORBaseUnknown* assembly) {
  VORISPPItemMgt_var items{VORBaseUnknown_var(to)};
  if (!items)
    return true;
  std::unordered_set<const void*> seen{assembly->GetIdentity()};
  VORListValVORBaseUnknown_var components;
  Components(assembly, seen, components);
  for (const VORBaseUnknown_var& component : components) {
    if (items->IsItemAssigned(component))
      return false;
  }
  return true;
}

namespace {
VORProcess* DocumentOf(VORBaseUnknown* object) {
  VORISpecObject_var spec{VORBaseUnknown_var(object)};
  return spec ? spec->GetDocument() : nullptr;
}
}  // namespace

AllOrNothing::AllOrNothing(VORBaseUnknown* object) {
  if (VORProcess* document = DocumentOf(object)) {
    _door = &document->GetDoor();
    _outer = _door->SetRecorder(&_log);
  }
}

AllOrNothing::~AllOrNothing() {
  if (_door == nullptr)
    return;
  _door->SetRecorder(_outer);
  if (!_committed)
    _door->Undo(_log);
}

void AllOrNothing::Commit() {
  if (_door == nullptr || _committed)
    return;
  _committed = true;
  _door->SetRecorder(_outer);
  if (_outer != nullptr)
    _outer->Append(std::move(_log));
  _log.Clear();
}

UndoStep::UndoStep(VORBaseUnknown* object, const char* name) : _document(DocumentOf(object)) {
  if (_document)
    _document->GetUndoHistory().Begin(name);
}

UndoStep::~UndoStep() {
  if (_document)
    _document->GetUndoHistory().End();
}

}  // namespace QELItemDD
