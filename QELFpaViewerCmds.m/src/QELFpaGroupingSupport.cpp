#include "QELFpaGroupingSupport.h"

#include "VORApplicationFrame.h"
#include "VORCSO.h"
#include "VORDlgNotify.h"
#include "VORFrmEditor.h"
#include "VORIIPDAdapter.h"
#include "VORIIPDAttributeMgt.h"
#include "VORIPDServices.h"
#include "VORIProduct.h"
#include "VORIResource.h"
#include "VORISPPActivity.h"
#include "VORISPPChildManagement.h"
#include "VORISPPFlowMgt.h"
#include "VORISPPResourceManagement.h"
#include "VORMsgCatalog.h"
#include "VORPathElement.h"

namespace QELFpaGrouping {

namespace {
// Moves a returned list into a value (the callee made it, we delete it).
VORListValVORBaseUnknown_var Take(VORListValVORBaseUnknown_var* list) {
  VORListValVORBaseUnknown_var result;
  if (list != nullptr) {
    result = std::move(*list);
    delete list;
  }
  return result;
}

// The list that object answers through the interface's getter (empty when it has no such
// interface).
template <typename Var, typename Interface>
VORListValVORBaseUnknown_var Ask(VORBaseUnknown* object,
                                 HRESULT (Interface::*getter)(VORListValVORBaseUnknown_var*&,
                                                              const char*),
                                 const char* filter) {
  Var answerer(object);
  VORListValVORBaseUnknown_var* list = nullptr;
  if (answerer)
    (answerer.get()->*getter)(list, filter);
  return Take(list);
}
}  // namespace

VORListValVORBaseUnknown_var Previous(VORBaseUnknown* node) {
  return Ask<VORISPPFlowMgt_var>(node, &VORISPPFlowMgt::GetPreviousActivities, "Activity");
}

VORListValVORBaseUnknown_var Next(VORBaseUnknown* node) {
  return Ask<VORISPPFlowMgt_var>(node, &VORISPPFlowMgt::GetNextActivities, "Activity");
}

VORListValVORBaseUnknown_var Children(VORBaseUnknown* activity, const char* filter) {
  return Ask<VORISPPChildManagement_var>(activity, &VORISPPChildManagement::GetChildren, filter);
}

VORListValVORBaseUnknown_var Resources(VORBaseUnknown* activity) {
  return Ask<VORISPPResourceManagement_var>(activity, &VORISPPResourceManagement::GetResources,
                                            "Resource");
}

VORListValVORBaseUnknown_var ChildProducts(VORBaseUnknown* product) {
  return Ask<VORIProduct_var>(product, &VORIProduct::GetChildren, "VORIProduct");
}

VORBaseUnknown_var FatherActivity(VORBaseUnknown* activity) {
  VORBaseUnknown_var father;
  if (VORISPPActivity_var a(activity); a)
    a->GetFatherActivity(father);
  return father;
}

VORBaseUnknown_var FatherProduct(VORBaseUnknown* product) {
  VORBaseUnknown_var father;
  if (VORIProduct_var p(product); p)
    p->GetFatherProduct(father);
  return father;
}

bool SameObject(VORBaseUnknown* a, VORBaseUnknown* b) {
  if (a == nullptr || b == nullptr)
    return a == b;
  return a->GetIdentity() == b->GetIdentity();
}

VORDocument* CurrentDocument() {
  VORFrmEditor* editor = VORFrmEditor::GetCurrentEditor();
  return editor ? editor->GetDocument() : nullptr;
}

VORCSO* CurrentCSO() {
  VORFrmEditor* editor = VORFrmEditor::GetCurrentEditor();
  return editor ? editor->GetCSO() : nullptr;
}

VORListValVORBaseUnknown_var CSOLeaves() {
  VORCSO* cso = CurrentCSO();
  return cso ? Take(cso->GetLeaves()) : VORListValVORBaseUnknown_var();
}

void FillCSO(const VORListValVORBaseUnknown_var& objects) {
  VORCSO* cso = CurrentCSO();
  if (cso == nullptr)
    return;
  cso->Empty();
  cso->AddElements(objects);
}

VORBaseUnknown_var PlanTypeOf(VORDocument* document, VORBaseUnknown* product) {
  VORBaseUnknown_var planType;
  VORIIPDAdapter_var adapter(document);
  if (adapter && product != nullptr && adapter->GetPlanType(product, planType) != S_OK)
    planType = nullptr;
  return planType;
}

VORUnicodeString PlanTypeNameOf(VORDocument* document, VORBaseUnknown* planType) {
  VORUnicodeString value;
  VORIIPDAttributeMgt_var attributes(document);
  if (attributes && planType != nullptr)
    attributes->GetAttribute(planType, VORUnicodeString("plantype_name"), VORUnicodeString("type"),
                             value);
  return value;
}

VORUnicodeString PlanTypeAttribute(VORDocument* document, VORBaseUnknown* planType,
                                   const char* name) {
  VORUnicodeString value;
  VORIIPDAttributeMgt_var attributes(document);
  if (attributes && planType != nullptr)
    attributes->GetAttribute(planType, VORUnicodeString(name), value);
  return value;
}

VORBaseUnknown_var FindPlanType(VORDocument* document, const VORUnicodeString& name) {
  VORBaseUnknown_var planType;
  VORIIPDAdapter_var adapter(document);
  if (!adapter || VORIPDServices::GetPlanTypeUnknowObject(name, 0, adapter, planType) != S_OK)
    planType = nullptr;
  return planType;
}

VORListValVORBaseUnknown_var ValidChildPlanTypes(VORDocument* document, VORBaseUnknown* planType) {
  VORIIPDAttributeMgt_var attributes(document);
  VORListValVORBaseUnknown_var* related = nullptr;
  if (attributes && planType != nullptr)
    attributes->GetRelatedObjects(planType, VORUnicodeString("lumoplantypechild"),
                                  VORIIPDAttributeMgt::Recursive, related);
  return Take(related);
}

VORBaseUnknown_var ResourceOf(VORBaseUnknown* product) {
  if (VORIResource_var r(product); r)
    return VORBaseUnknown_var(r);
  VORBaseUnknown_var reference;
  if (VORIProduct_var p(product); p)
    p->GetReferenceProduct(reference);
  VORIResource_var r(reference);
  return r ? VORBaseUnknown_var(r) : VORBaseUnknown_var();
}

VORUnicodeString ResourcePlanTypeName(VORBaseUnknown* product) {
  VORUnicodeString name;
  if (VORIResource_var r(ResourceOf(product)); r)
    r->GetPlanTypeName(name);
  return name;
}

void ShowError(const char* catalog, const char* key, const char* defaultText) {
  VORApplicationFrame* frame = VORApplicationFrame::GetApplicationFrame();
  auto* notify = new VORDlgNotify(frame->GetMainWindow(), key, VORDlgNfyError | VORDlgNfyOK);
  notify->DisplayBlocked(VORMsgCatalog::BuildMessage(catalog, key, VORUnicodeString(defaultText)),
                         VORMsgCatalog::BuildMessage(catalog, "title", VORUnicodeString("Error")));
  notify->RequestDelayedDestruction();
}

}  // namespace QELFpaGrouping
