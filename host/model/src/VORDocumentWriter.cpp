// Writing .pprx documents with the DOM; saving goes through the kernel's atomic file write,
// keeping a backup.
#include <xercesc/dom/DOM.hpp>
#include <xercesc/framework/MemBufFormatTarget.hpp>
#include <xercesc/util/XMLUni.hpp>

#include <algorithm>
#include <charconv>
#include <stdexcept>

#include "VORFileIO.h"
#include "VORModelObjects.h"
#include "VORDocumentFormat.h"

using namespace xercesc;
using VORDocumentFormat::kVersion;
using VORDocumentFormat::Names;

namespace {

// ---------------------------------------------------------------- text helpers

std::u16string X(const char* s) {
  return VORXercesPlatform::FromUTF8(s);
}

std::string FormatDouble(double v) {
  char buf[64];
  auto r = std::to_chars(buf, buf + sizeof buf, v);
  return std::string(buf, r.ptr);
}

const char* AttributeTypeName(VORAttributeType t) {
  switch (t) {
    case VORAttributeLong:
      return "long";
    case VORAttributeDouble:
      return "double";
    case VORAttributeString:
      return "string";
    default:
      return "";
  }
}

// ---------------------------------------------------------------- saving

class Writer {
 public:
  explicit Writer(DOMDocument* doc) : _doc(doc) {}

  DOMElement* Element(DOMElement* parent, const char* tag) {
    DOMElement* e = _doc->createElement(_names(tag));
    parent->appendChild(e);
    return e;
  }
  void Set(DOMElement* e, const char* name, const std::string& value) {
    e->setAttribute(_names(name), reinterpret_cast<const XMLCh*>(X(value.c_str()).c_str()));
  }
  void Set(DOMElement* e, const char* name, const VORUnicodeString& value) {
    e->setAttribute(_names(name), reinterpret_cast<const XMLCh*>(value.ConvertToUTF16().c_str()));
  }
  void SetDouble(DOMElement* e, const char* name, double v) { Set(e, name, FormatDouble(v)); }
  void SetValue(DOMElement* e, const VORAttributeValue& v) {
    Set(e, "type", std::string(AttributeTypeName(v.type)));
    if (v.type == VORAttributeLong)
      Set(e, "value", std::to_string(v.longValue));
    else if (v.type == VORAttributeDouble)
      SetDouble(e, "value", v.doubleValue);
    else
      Set(e, "value", v.stringValue);
  }

  void Node(DOMElement* parent, VORGraphNodeImpl* n) {
    VORActivityImpl* a = n->AsActivity();
    DOMElement* e = Element(parent, a ? "activity" : "node");
    Set(e, "id", n->id);
    Set(e, "type", n->lateType);
    Set(e, "label", n->label);
    if (n->hasPosition) {
      SetDouble(e, "x", n->x);
      SetDouble(e, "y", n->y);
    }
    if (n->state != 0)
      Set(e, "state", std::to_string(n->state));
    if (n->width != 0)
      SetDouble(e, "width", n->width);
    if (n->height != 0)
      SetDouble(e, "height", n->height);
    if (a == nullptr)
      return;
    if (a->time != 0)
      SetDouble(e, "time", a->time);
    if (VORKindCast<VORStationImpl>(a) != nullptr)
      SetDouble(e, "cycleTime", a->stationCycleTime);
    for (auto& io : a->productIOs) {
      DOMElement* c = Element(e, io->input ? "input" : "output");
      Set(c, "id", io->id);
      Set(c, "item", io->Item()->id);
    }
    for (const VORModelLink& l : a->out) {
      const bool item = l.type == VORILinkableObject::ItemLink;
      DOMElement* c = Element(e, item ? "item" : "resource");
      Set(c, "ref", l.target->id);
      if (item && l.via != nullptr)
        Set(c, "via", l.via->id);
    }
    for (auto& [name, value] : a->attributes) {
      DOMElement* c = Element(e, "attribute");
      Set(c, "name", name);
      SetValue(c, value);
    }
    for (auto& [name, shown] : a->zitBltShown) {
      DOMElement* c = Element(e, "zitblt");
      Set(c, "name", name);
      Set(c, "shown", std::string(shown ? "1" : "0"));
    }
    std::vector<std::pair<std::uint64_t, std::pair<VORGraphNodeImpl*, VORGraphNodeImpl*>>> flows;
    for (auto& c : a->children) {
      Node(e, c.get());
      for (const VORFlowRef& r : c->next)
        flows.push_back({r.stamp, {c.get(), r.node}});
    }
    std::sort(flows.begin(), flows.end());
    for (auto& [stamp, f] : flows) {
      DOMElement* c = Element(e, "flow");
      Set(c, "from", f.first->id);
      Set(c, "to", f.second->id);
    }
  }

  void Product(DOMElement* parent, VORProductImpl* p) {
    DOMElement* e = Element(parent, "product");
    Set(e, "id", p->id);
    if (p->father)
      Set(e, "father", p->father->id);
    Set(e, "name", p->partNumber);
    if (!p->alias.IsEmpty())
      Set(e, "alias", p->alias);
    if (!p->shown)
      Set(e, "shown", std::string("0"));
    if (p->Reference() != p)
      Set(e, "reference", p->Reference()->id);
    if (p->isResource) {
      Set(e, "resourceClass", p->resourceClass);
      if (!p->planType.IsEmpty())
        Set(e, "planType", p->planType);
    }
    for (auto& c : p->children)
      Product(parent, c.get());
  }

 private:
  DOMDocument* _doc;
  Names _names;
};

}  // namespace

std::string VORProcess::SaveToString() {
  std::string error;
  VORXercesPlatform::Initialize(&error);
  static const XMLCh ls[] = {chLatin_L, chLatin_S, chNull};
  DOMImplementation* impl = DOMImplementationRegistry::getDOMImplementation(ls);
  DOMDocument* doc = impl->createDocument(
      nullptr, reinterpret_cast<const XMLCh*>(X("pprDocument").c_str()), nullptr);
  std::string result;
  try {
    Writer w(doc);
    DOMElement* top = doc->getDocumentElement();
    VORDocumentData& d = *_data;
    w.Set(top, "version", std::string(kVersion));
    if (!d.environment.empty())
      w.Set(top, "environment", d.environment);
    DOMElement* products = w.Element(top, "products");
    for (auto& p : d.rootProducts)
      w.Product(products, p.get());
    if (!d.assemblies.empty()) {
      DOMElement* assemblies = w.Element(top, "assemblies");
      for (auto& m : d.assemblies) {
        DOMElement* e = w.Element(assemblies, "assembly");
        w.Set(e, "id", m->id);
        w.Set(e, "name", m->name);
        for (VORModelObject* c : m->Targets(VORILinkableObject::ComponentLink))
          w.Set(w.Element(e, "component"), "ref", c->id);
      }
    }
    DOMElement* process = w.Element(top, "process");
    if (d.root)
      w.Node(process, d.root.get());
    if (!d.planTypes.empty() || !d.hubObjects.empty()) {
      DOMElement* planning = w.Element(top, "planning");
      for (auto& t : d.planTypes) {
        DOMElement* e = w.Element(planning, "planType");
        w.Set(e, "id", t->id);
        if (VORPlanTypeImpl* b = t->Base())
          w.Set(e, "base", b->id);
        for (auto& [key, value] : t->attributes) {
          DOMElement* a = w.Element(e, "attribute");
          if (!key.first.empty())
            w.Set(a, "key", key.first);
          w.Set(a, "name", key.second);
          w.Set(a, "value", value);
        }
        for (const VORModelLink& l : t->out) {
          if (l.type == VORPlanTypeImpl::BaseLink)
            continue;
          DOMElement* r = w.Element(e, "relation");
          w.Set(r, "name", l.type);
          w.Set(r, "to", l.target->id);
        }
      }
      for (auto& [id, h] : d.hubObjects) {
        if (h->attributes.empty())
          continue;
        DOMElement* e = w.Element(planning, "hubRecord");
        w.Set(e, "object", id);
        for (auto& [name, value] : h->attributes) {
          DOMElement* a = w.Element(e, "attribute");
          w.Set(a, "name", name);
          w.SetValue(a, value);
        }
      }
    }
    DOMLSSerializer* serializer = static_cast<DOMImplementationLS*>(impl)->createLSSerializer();
    serializer->getDomConfig()->setParameter(XMLUni::fgDOMWRTFormatPrettyPrint, true);
    DOMLSOutput* output = static_cast<DOMImplementationLS*>(impl)->createLSOutput();
    MemBufFormatTarget target(1 << 20);
    output->setByteStream(&target);
    output->setEncoding(reinterpret_cast<const XMLCh*>(X("UTF-8").c_str()));
    serializer->write(doc, output);
    result.assign(reinterpret_cast<const char*>(target.getRawBuffer()), target.getLen());
    output->release();
    serializer->release();
  } catch (...) {
    doc->release();
    throw;
  }
  doc->release();
  return result;
}

bool VORProcess::SaveAs(const std::string& path, std::string& error) {
  std::string content;
  try {
    content = SaveToString();
  } catch (const std::exception& e) {
    error = path + ": " + e.what();
    return false;
  } catch (const xercesc::DOMException&) {
    error = path + ": the document could not be written as XML";
    return false;
  }
  if (!VORWriteFileAtomically(path, content, error, true))
    return false;
  SetStorageName(path);
  _data->modified = false;
  return true;
}

bool VORProcess::Save(std::string& error) {
  if (GetStorageName().empty()) {
    error = "the document has no file name yet";
    return false;
  }
  return SaveAs(GetStorageName(), error);
}
