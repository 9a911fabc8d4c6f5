#include "ModelTestSupport.h"

namespace {

std::string Num(double v) {
  std::ostringstream s;
  s << v;
  return s.str();
}

void DumpNode(VORBaseUnknown* node, std::ostringstream& out) {
  VORIGENode_var g(node);
  VORIGraphNodeLayout_var layout(node);
  VORISpecObject_var spec(node);
  VORUnicodeString label, type;
  g->GetLabel(label);
  spec->GetTypeName(type);
  out << "node " << IdOf(node) << " " << Utf8(type) << " '" << Utf8(label) << "'";
  if (layout->HasPertPosition()) {
    double x = 0, y = 0;
    layout->GetPertPosition(x, y);
    out << " at " << Num(x) << "," << Num(y);
  }
  double w = 0, h = 0;
  layout->GetPertNodeSize(w, h);
  out << " state " << layout->GetPertNodeState() << " size " << Num(w) << "x" << Num(h) << "\n";
  VORISPPFlowMgt_var flows(node);
  VORListValVORBaseUnknown_var* list = nullptr;
  flows->GetPreviousActivities(list, "");
  out << "  prev " << Ids(list) << "\n";
  flows->GetNextActivities(list, "");
  out << "  next " << Ids(list) << "\n";
  VORISPPActivity_var activity(node);
  if (!activity)
    return;
  double t = 0;
  VORISPPAbstractActivity_var(node)->GetActivityTime(t);
  out << "  time " << Num(t);
  if (QELIBIWActivityStation_var station{VORBaseUnknown_var(node)}) {
    station->GetStationCycleTime(t);
    out << " cycle " << Num(t);
  }
  out << "\n";
  flows->GetProductIOs(list);
  for (const VORBaseUnknown_var& io : *list) {
    VORISPPProductIO_var p(io);
    VORBaseUnknown_var item;
    p->GetItem(item);
    out << "  " << (p->IsInput() ? "input " : "output ") << IdOf(io.get()) << " "
        << IdOf(item.get()) << "\n";
  }
  delete list;
  VORISPPItemMgt_var items(node);
  items->GetAssignedItems(list, "Item", 0);
  for (const VORBaseUnknown_var& i : *list) {
    VORBaseUnknown_var via;
    items->GetAssignmentInput(i.get(), via);
    out << "  item " << IdOf(i.get()) << " via " << (via ? IdOf(via.get()) : "-") << "\n";
  }
  delete list;
  VORISPPResourceManagement_var(node)->GetResources(list, "Resource");
  out << "  resources " << Ids(list) << "\n";
  VORIUserAttributes_var attrs(node);
  VORListValVORUnicodeString names;
  attrs->GetAttributeNames(names);
  for (const VORUnicodeString& n : names) {
    VORAttributeValue v;
    attrs->GetAttributeValue(n, v);
    out << "  attribute " << Utf8(n) << " " << v.type << " " << v.longValue << " "
        << Num(v.doubleValue) << " '" << Utf8(v.stringValue) << "'\n";
  }
  VORIZitBltVisibility_var zitBlts(node);
  VORListValVORUnicodeString shownNames;
  zitBlts->GetZitBltShownNames(shownNames);
  for (const VORUnicodeString& n : shownNames) {
    bool shown = false;
    zitBlts->GetZitBltShown(n, shown);
    out << "  zitblt " << Utf8(n) << " " << shown << "\n";
  }
  VORIGENode_var(node)->GetChildren(list);
  for (const VORBaseUnknown_var& c : *list)
    DumpNode(c.get(), out);
  delete list;
}

void DumpProduct(VORBaseUnknown* product, std::ostringstream& out) {
  VORIProduct_var p(product);
  VORUnicodeString name, alias;
  p->GetPartNumber(name);
  VORIAlias_var(product)->GetAlias(alias);
  VORBaseUnknown_var father, reference;
  p->GetFatherProduct(father);
  p->GetReferenceProduct(reference);
  out << "product " << IdOf(product) << " father " << (father ? IdOf(father.get()) : "-") << " '"
      << Utf8(name) << "' alias '" << Utf8(alias) << "' shown "
      << VORIVisProperties_var(product)->IsShown() << " ref " << IdOf(reference.get());
  if (VORIResource_var r{VORBaseUnknown_var(product)}) {
    VORUnicodeString cls, plan;
    r->GetResourceClass(cls);
    r->GetPlanTypeName(plan);
    out << " resource " << Utf8(cls) << " '" << Utf8(plan) << "'";
  }
  out << "\n";
  VORListValVORBaseUnknown_var* list = nullptr;
  p->GetChildren(list, "VORIProduct");
  for (const VORBaseUnknown_var& c : *list)
    DumpProduct(c.get(), out);
  delete list;
}

}  // namespace

std::string DumpDocument(VORProcess* doc) {
  std::ostringstream out;
  out << "environment '" << doc->GetEnvironment().str() << "'\n";
  VORBaseUnknown_var container;
  doc->GetContainer(VORDocument::PPRContainer, container);
  VORListValVORBaseUnknown_var* list = nullptr;
  VORIContainer_var(container)->ListMembers(VORIProduct::IID(), list);
  for (const VORBaseUnknown_var& p : *list)
    DumpProduct(p.get(), out);
  delete list;
  doc->GetContainer(VORDocument::BomContainer, container);
  VORIContainer_var(container)->ListMembers(QELIMfgAssembly::IID(), list);
  for (const VORBaseUnknown_var& m : *list) {
    VORListValVORBaseUnknown_var* components = nullptr;
    QELIMfgAssembly_var(m)->GetComponents(components);
    out << "assembly " << IdOf(m.get()) << " '" << Utf8(VORISPPItem_var(m)->GetDisplayName())
        << "' " << Ids(components) << "\n";
  }
  delete list;
  DumpNode(doc->GetRootProcess().get(), out);
  if (VORIIPDAdapter_var adapter{VORBaseUnknown_var(static_cast<VORIDocInit*>(doc))}) {
    VORIIPDAttributeMgt_var attributes(adapter);
    adapter->GetPlanTypes(list);
    for (const VORBaseUnknown_var& t : *list) {
      VORUnicodeString name, compclass, typeName;
      attributes->GetAttribute(t.get(), "name", name);
      attributes->GetAttribute(t.get(), "compclass", compclass);
      attributes->GetAttribute(t.get(), "plantype_name", "type", typeName);
      VORListValVORBaseUnknown_var* related = nullptr;
      attributes->GetRelatedObjects(t.get(), "lumoplantypechild", nullptr, related);
      out << "plantype " << IdOf(t.get()) << " '" << Utf8(name) << "' " << Utf8(compclass) << " "
          << Utf8(typeName) << " children " << Ids(related) << "\n";
    }
    delete list;
  }
  return out.str();
}

SmallLine::SmallLine() {
  doc = VORProcess_var::Adopt(VORProcess::CreateNew("Small line"));
  root = doc->GetRootProcess();
  VORISPPChildManagement_var children(root);
  children->CreateChild("BIWActivityStation", s1);
  children->CreateChild("BIWActivityStation", s2);
  children->CreateChild("BIWActivityStation", s3);
  children->CreateChild("BIWActivityGrouping", group);
  VORISPPAbstractActivity_var(s1)->SetLabel("S1");
  VORISPPAbstractActivity_var(s2)->SetLabel("S2");
  VORISPPAbstractActivity_var(s3)->SetLabel("S3");
  VORISPPAbstractActivity_var(group)->SetLabel("G");
  VORISPPFlowMgt_var(s1)->AddNextActivity(s2);
  VORISPPFlowMgt_var(s2)->AddNextActivity(s3);
  VORISPPFlowMgt_var(s1)->AddNextActivity(s3);
  VORISPPChildManagement_var(s2)->CreateChild("BIWActivityLoading", load);
  VORISPPChildManagement_var(s2)->CreateChild("BIWActivitySpotWelding", weld);
  VORISPPFlowMgt_var(load)->AddNextActivity(weld);
  VORISPPChildManagement_var inGroup(group);
  inGroup->CreateChild("Start", start);
  inGroup->CreateChild("BIWActivityStation", inner);
  inGroup->CreateChild("Stop", stop);
  VORISPPFlowMgt_var(start)->AddNextActivity(inner);
  VORISPPFlowMgt_var(inner)->AddNextActivity(stop);

  VORIProduct_var product(doc->GetRootProduct());
  product->AddChild("Panel", panel);
  product->AddChild("Bracket", bracket);
  product->AddChild("Floor assy", floor);
  VORIProduct_var resources(doc->GetResourceRoot());
  resources->AddChild("Cell", cell);
  VORIProduct_var(cell)->AddChild("Robot1", robot);
  VORIProduct_var(robot)->AddChild("Gun1", gun);
  VORBaseUnknown_var ppr, description;
  VORIPDServices::GetPPRContainer(doc.get(), ppr);
  VORIResourceFactory_var factory(ppr);
  factory->CreateResource("Robot", robot, "", description);
  factory->AttachResource(robot, description);
  factory->CreateResource("WeldGun", gun, "", description);
  factory->AttachResource(gun, description);

  VORISPPFlowMgt_var(s2)->AddProductInput(panel, s2In);
  VORISPPFlowMgt_var(s2)->AddProductOutput(floor, s2Out);
  VORISPPItemMgt_var(s2)->AssignItem(panel, s2In);
  VORISPPResourceManagement_var(weld)->AssignResource(robot);
  doc->SetModified(false);
}
