// Reading .pprx documents: the streaming parser builds a compact tree, the loader builds the
// model from it. Loading builds a complete new document or nothing.
#include <climits>
#include <cstdlib>

#include <algorithm>
#include <charconv>
#include <cmath>
#include <cstring>
#include <functional>
#include <stdexcept>
#include <unordered_map>
#include <unordered_set>

#include "VORFileIO.h"
#include "VORLateTypes.h"
#include "VORModelObjects.h"
#include "VORDocumentFormat.h"
#include "VORXmlTree.h"

using VORDocumentFormat::kVersion;

namespace {

// ---------------------------------------------------------------- loading

class LoadError : public std::runtime_error {
 public:
  using std::runtime_error::runtime_error;
};

using Node = VORXmlTree::Index;
constexpr Node kNone = VORXmlTree::kNone;

class Loader {
 public:
  Loader(const VORXmlTree& tree, std::string name, VORDocumentData& data)
      : _t(tree), _name(std::move(name)), _data(data) {}

  void Load() {
    const Node top = _t.Root();
    if (Tag(top) != "pprDocument")
      Fail(top, "the document element is <" + Tag(top) + ">, expected <pprDocument>");
    const std::string version = Attr(top, "version");
    if (version != kVersion)
      Fail(top, "unsupported document version '" + version + "'");
    _data.environment = Attr(top, "environment");
    Node products = kNone, assemblies = kNone, process = kNone, planning = kNone;
    for (Node e = _t.FirstChild(top); e != kNone; e = _t.Next(e)) {
      const std::string tag = Tag(e);
      Node* slot = tag == "products"     ? &products
                   : tag == "assemblies" ? &assemblies
                   : tag == "process"    ? &process
                   : tag == "planning"   ? &planning
                                         : nullptr;
      if (slot == nullptr)
        Fail(e, "unexpected element <" + tag + "> in <pprDocument>");
      if (*slot != kNone)
        Fail(e, "a second <" + tag + "> element");
      *slot = e;
    }
    if (process == kNone)
      Fail(top, "the document has no <process>");
    if (planning != kNone)
      LoadPlanTypes(planning);
    if (products != kNone)
      LoadProducts(products);
    if (assemblies != kNone)
      LoadAssemblies(assemblies);
    LoadProcess(process);
    if (planning != kNone)
      LoadHubRecords(planning);
  }

 private:
  [[noreturn]] void Fail(Node e, const std::string& message) {
    long line = 0, column = 0;
    _t.Position(e, line, column);
    throw LoadError(_name + ":" + std::to_string(line) + ":" + std::to_string(column) + ": " +
                    message);
  }

  std::string Tag(Node e) { return std::string(_t.Name(e)); }
  bool IsTag(Node e, const char* tag) { return _t.Name(e) == tag; }
  std::string Attr(Node e, const char* name) {
    const std::string_view* v = _t.Find(e, name);
    return v ? std::string(*v) : std::string();
  }
  // Attribute straight to the model's string type.
  VORUnicodeString Text(Node e, const char* name) { return VORUnicodeString(Attr(e, name)); }
  bool Has(Node e, const char* name) { return _t.Find(e, name) != nullptr; }
  std::string Required(Node e, const char* name) {
    if (!Has(e, name))
      Fail(e, "<" + Tag(e) + "> without the attribute '" + name + "'");
    return Attr(e, name);
  }
  // A finite number; the place and the text in the message otherwise.
  double Finite(Node e, const std::string& text, const std::string& what) {
    double v = 0;
    auto r = std::from_chars(text.data(), text.data() + text.size(), v);
    if (text.empty() || r.ptr != text.data() + text.size() ||
        (r.ec != std::errc() && r.ec != std::errc::result_out_of_range))
      Fail(e, what + " is not a number: '" + text + "'");
    if (r.ec != std::errc() || !std::isfinite(v))
      Fail(e, what + " is not a finite number: '" + text + "'");
    return v;
  }
  double Double(Node e, const char* name, double fallback, const std::string& id) {
    if (!Has(e, name))
      return fallback;
    return Finite(e, Attr(e, name), "'" + id + "': attribute '" + name + "'");
  }
  double Size(Node e, const char* name, const std::string& id) {
    const double v = Double(e, name, 0, id);
    if (v < 0)
      Fail(e, "'" + id + "': attribute '" + name + "' is negative: '" + Attr(e, name) + "'");
    return v;
  }
  long Long(Node e, const char* name, long fallback, const std::string& id) {
    if (!Has(e, name))
      return fallback;
    return ParseLong(e, Attr(e, name), name, id);
  }
  long ParseLong(Node e, const std::string& text, const char* name, const std::string& id) {
    long v = 0;
    auto r = std::from_chars(text.data(), text.data() + text.size(), v);
    if (text.empty() || r.ec != std::errc() || r.ptr != text.data() + text.size())
      Fail(e, "'" + id + "': attribute '" + name + "' is not an integer: '" + text + "'");
    return v;
  }

  // Registers o under the element's id, which must be new: one lookup for the test and the
  // insertion.
  void Register(Node e, VORModelObject* o) {
    std::string id = Required(e, "id");
    if (id.empty())
      Fail(e, "<" + Tag(e) + "> with an empty id");
    if (!_data.ids.try_emplace(id, o).second)
      Fail(e, "duplicate id '" + id + "'");
    o->id = std::move(id);
    o->data = &_data;
  }
  template <class T>
  T* Ref(Node e, const char* attribute, const char* what) {
    const std::string id = Required(e, attribute);
    VORModelObject* o = _data.Find(id);
    if (o == nullptr)
      Fail(e, std::string(what) + " '" + id + "' does not exist");
    T* t = VORKindCast<T>(o);
    if (t == nullptr)
      Fail(e, "'" + id + "' is not " + what);
    return t;
  }
  VORModelObject* ItemRef(Node e, const char* attribute) {
    const std::string id = Required(e, attribute);
    VORModelObject* o = _data.Find(id);
    if (o == nullptr)
      Fail(e, "item '" + id + "' does not exist");
    if (!VORKindCast<VORProductImpl>(o) && !VORKindCast<VORMfgAssemblyImpl>(o))
      Fail(e, "'" + id + "' is not an item (a product or an assembly)");
    return o;
  }
  static void Link(VORModelObject* s, VORModelObject* t, const std::string& type,
                   VORProductIOImpl* via = nullptr) {
    s->out.push_back({t, type, via});
    t->in.push_back(s);
  }
  void ExpectOnly(Node e, std::initializer_list<const char*> tags) {
    for (Node c = _t.FirstChild(e); c != kNone; c = _t.Next(c)) {
      if (std::none_of(tags.begin(), tags.end(), [&](const char* t) { return IsTag(c, t); }))
        Fail(c, "unexpected element <" + Tag(c) + "> in <" + Tag(e) + ">");
    }
  }

  VORAttributeValue TypedValue(Node e, const std::string& owner) {
    const std::string type = Required(e, "type");
    const std::string text = Required(e, "value");
    if (type == "long")
      return VORAttributeValue::Long(ParseLong(e, text, "value", owner));
    if (type == "double")
      return VORAttributeValue::Double(Finite(e, text, "'" + owner + "': value '" + text + "'"));
    if (type == "string")
      return VORAttributeValue::String(VORUnicodeString(text));
    Fail(e, "'" + owner + "': unknown value type '" + type + "'");
  }

  // -------- planning

  void LoadPlanTypes(Node planning) {
    ExpectOnly(planning, {"planType", "hubRecord"});
    std::vector<std::pair<Node, VORPlanTypeImpl*>> types;
    for (Node e = _t.FirstChild(planning); e != kNone; e = _t.Next(e)) {
      if (Tag(e) != "planType")
        continue;
      ExpectOnly(e, {"attribute", "relation"});
      auto t = VORHandle<VORPlanTypeImpl>::Adopt(new VORPlanTypeImpl());
      Register(e, t.get());
      for (Node a = _t.FirstChild(e); a != kNone; a = _t.Next(a)) {
        if (Tag(a) == "attribute")
          t->attributes[{Attr(a, "key"), Required(a, "name")}] = VORUnicodeString(Attr(a, "value"));
      }
      if (t->Name().IsEmpty())
        Fail(e, "plan type '" + t->id + "' has no name");
      _data.planTypes.push_back(t);
      types.push_back({e, t.get()});
    }
    for (auto& [e, t] : types) {
      if (Has(e, "base"))
        Link(t, Ref<VORPlanTypeImpl>(e, "base", "a plan type"), VORPlanTypeImpl::BaseLink);
      for (Node r = _t.FirstChild(e); r != kNone; r = _t.Next(r)) {
        if (Tag(r) != "relation")
          continue;
        const std::string rel = Required(r, "name");
        if (rel.empty() || rel == VORPlanTypeImpl::BaseLink)
          Fail(r, "plan type '" + t->id + "': bad relation name '" + rel + "'");
        Link(t, Ref<VORPlanTypeImpl>(r, "to", "a plan type"), rel);
      }
    }
    for (auto& [e, t] : types) {
      if (t->Base() == t)
        Fail(e, "plan type '" + t->id + "' is its own base");
      std::unordered_set<VORPlanTypeImpl*> seen;
      for (VORPlanTypeImpl* p = t; p != nullptr; p = p->Base()) {
        if (!seen.insert(p).second)
          Fail(e, "the bases of plan type '" + t->id + "' form a cycle through '" + p->id + "'");
      }
    }
  }

  void LoadHubRecords(Node planning) {
    for (Node e = _t.FirstChild(planning); e != kNone; e = _t.Next(e)) {
      if (Tag(e) != "hubRecord")
        continue;
      ExpectOnly(e, {"attribute"});
      const std::string id = Required(e, "object");
      if (_data.Find(id) == nullptr)
        Fail(e, "hub record of '" + id + "', which does not exist");
      if (_data.hubObjects.count(id))
        Fail(e, "a second hub record of '" + id + "'");
      auto h = VORHandle<VORHubObjectImpl>::Adopt(new VORHubObjectImpl());
      h->objectId = id;
      for (Node a = _t.FirstChild(e); a != kNone; a = _t.Next(a))
        h->attributes[Required(a, "name")] = TypedValue(a, id);
      _data.hubObjects.emplace(id, h);
    }
  }

  // -------- products

  void LoadProducts(Node products) {
    ExpectOnly(products, {"product"});
    std::vector<std::pair<Node, VORProductImpl*>> all;
    for (Node e = _t.FirstChild(products); e != kNone; e = _t.Next(e)) {
      auto p = VORHandle<VORProductImpl>::Adopt(new VORProductImpl());
      Register(e, p.get());
      p->partNumber = Text(e, "name");
      p->alias = VORUnicodeString(Attr(e, "alias"));
      p->shown = Long(e, "shown", 1, p->id) != 0;
      if (Has(e, "resourceClass")) {
        p->isResource = true;
        p->resourceClass = VORUnicodeString(Attr(e, "resourceClass"));
        p->planType = VORUnicodeString(Attr(e, "planType"));
        if (p->resourceClass.IsEmpty())
          Fail(e, "resource '" + p->id + "' with an empty resource class");
      }
      _keep.push_back(VORHandle<VORModelObject>(p.get()));
      all.push_back({e, p.get()});
    }
    for (auto& [e, p] : all) {
      if (Has(e, "father")) {
        p->father = Ref<VORProductImpl>(e, "father", "a product");
        if (p->father == p)
          Fail(e, "product '" + p->id + "' is its own father");
      }
      if (Has(e, "reference")) {
        VORProductImpl* r = Ref<VORProductImpl>(e, "reference", "a product");
        if (r != p)
          Link(p, r, VORILinkableObject::ReferenceLink);
      }
    }
    // The tree must be a tree: following fathers ends at a root.
    std::unordered_map<VORProductImpl*, int> state;  // 1 on the current path, 2 done
    state.reserve(all.size());
    for (auto& [e, p] : all) {
      std::vector<VORProductImpl*> path;
      VORProductImpl* q = p;
      while (q != nullptr && state[q] == 0) {
        state[q] = 1;
        path.push_back(q);
        q = q->father;
      }
      if (q != nullptr && state[q] == 1)
        Fail(e, "the product tree has a cycle through '" + q->id + "'");
      for (VORProductImpl* r : path)
        state[r] = 2;
    }
    for (auto& [e, p] : all) {
      if (p->Reference() != p && p->Reference()->Reference() != p->Reference())
        Fail(e, "product '" + p->id + "' refers to '" + p->Reference()->id +
                    "', which itself refers to another product");
      VORHandle<VORProductImpl> h(p);
      (p->father ? p->father->children : _data.rootProducts).push_back(h);
    }
  }

  // -------- assemblies

  void LoadAssemblies(Node assemblies) {
    ExpectOnly(assemblies, {"assembly"});
    std::vector<std::pair<Node, VORMfgAssemblyImpl*>> all;
    for (Node e = _t.FirstChild(assemblies); e != kNone; e = _t.Next(e)) {
      ExpectOnly(e, {"component"});
      auto m = VORHandle<VORMfgAssemblyImpl>::Adopt(new VORMfgAssemblyImpl());
      Register(e, m.get());
      m->name = VORUnicodeString(Attr(e, "name"));
      _data.assemblies.push_back(m);
      all.push_back({e, m.get()});
    }
    for (auto& [e, m] : all) {
      for (Node c = _t.FirstChild(e); c != kNone; c = _t.Next(c)) {
        VORModelObject* item = ItemRef(c, "ref");
        if (m->FindLink(item, VORILinkableObject::ComponentLink))
          Fail(c, "assembly '" + m->id + "' lists '" + item->id + "' twice");
        Link(m, item, VORILinkableObject::ComponentLink);
      }
    }
    for (auto& [e, m] : all) {
      // No assembly may contain itself.
      std::vector<VORModelObject*> stack;
      for (VORModelObject* t : m->Targets(VORILinkableObject::ComponentLink))
        stack.push_back(t);
      std::unordered_set<VORModelObject*> seen;
      while (!stack.empty()) {
        VORModelObject* o = stack.back();
        stack.pop_back();
        if (o == m)
          Fail(e, "assembly '" + m->id + "' contains itself");
        if (!seen.insert(o).second)
          continue;
        for (VORModelObject* t : o->Targets(VORILinkableObject::ComponentLink))
          stack.push_back(t);
      }
    }
  }

  // -------- process

  void LoadProcess(Node process) {
    ExpectOnly(process, {"activity"});
    Node e = _t.FirstChild(process);
    if (e == kNone || _t.Next(e) != kNone)
      Fail(process, "<process> must hold exactly one root activity");
    if (Attr(e, "type") != VORModelLateTypes::Root)
      Fail(e, "the root activity must be of type 'BIWActivityRoot', not '" + Attr(e, "type") + "'");
    auto root = VORHandle<VORRootImpl>::Adopt(new VORRootImpl(VORModelLateTypes::Root));
    _data.root = root;
    Register(e, root.get());
    LoadNodeBody(e, root.get());
  }

  VORGraphNodeImpl* MakeNode(Node e) {
    const std::string type = Required(e, "type");
    VORGraphNodeImpl* node = nullptr;
    if (IsTag(e, "activity")) {
      if (!VORModelLateTypes::IsActivityType(type) || type == VORModelLateTypes::Root)
        Fail(e, "unknown activity type '" + type + "'");
      if (type == VORModelLateTypes::Station)
        node = new VORStationImpl(type);
      else if (type == VORModelLateTypes::Grouping)
        node = new VORGroupingImpl(type);
      else
        node = new VORActivityImpl(type);
    } else {
      if (!VORModelLateTypes::IsControlNodeType(type))
        Fail(e, "unknown control node type '" + type + "'");
      node = new VORControlNodeImpl(type);
    }
    return node;
  }

  // <zitblt name="..." shown="0|1"/>: the visibility a planner chose for one ZitBlt.
  void LoadZitBltShown(Node c, VORActivityImpl* a) {
    const std::string name = Required(c, "name");
    const long shown = Long(c, "shown", 1, a->id);
    if (name.empty() || a->zitBltShown.count(name))
      Fail(c, "'" + a->id + "': ZitBlt '" + name + "' empty or given twice");
    if (shown != 0 && shown != 1)
      Fail(c, "'" + a->id + "': ZitBlt '" + name + "' shown is not 0 or 1");
    a->zitBltShown[name] = shown == 1;
  }

  void LoadNodeBody(Node e, VORGraphNodeImpl* node) {
    const std::string& id = node->id;
    node->label = Text(e, "label");
    if (Has(e, "x") || Has(e, "y")) {
      node->hasPosition = true;
      node->x = Double(e, "x", 0, id);
      node->y = Double(e, "y", 0, id);
    }
    // The range is checked on the wide value: narrowing first would wrap 2^32 + 2 to 2.
    const long state = Long(e, "state", 0, id);
    if (state < 0 || state > 2)
      Fail(e, "'" + id + "': node state " + std::to_string(state) + " is not 0, 1 or 2");
    node->state = static_cast<int>(state);
    node->width = Size(e, "width", id);
    node->height = Size(e, "height", id);
    VORActivityImpl* a = node->AsActivity();
    if (a == nullptr) {
      if (_t.FirstChild(e) != kNone)
        Fail(_t.FirstChild(e), "control node '" + id + "' cannot hold elements");
      return;
    }
    a->time = Double(e, "time", 0, id);
    if (Has(e, "cycleTime")) {
      if (VORKindCast<VORStationImpl>(a) == nullptr)
        Fail(e, "'" + id + "': only stations have a cycle time");
      a->stationCycleTime = Double(e, "cycleTime", 0, id);
    }
    std::vector<Node> flows;
    for (Node c = _t.FirstChild(e); c != kNone; c = _t.Next(c)) {
      if (IsTag(c, "activity") || IsTag(c, "node")) {
        auto child = VORHandle<VORGraphNodeImpl>::Adopt(MakeNode(c));
        Register(c, child.get());
        child->father = a;
        a->children.push_back(child);
        LoadNodeBody(c, child.get());
      } else if (IsTag(c, "input") || IsTag(c, "output")) {
        auto io = VORHandle<VORProductIOImpl>::Adopt(new VORProductIOImpl(IsTag(c, "input")));
        Register(c, io.get());
        io->activity = a;
        Link(io.get(), ItemRef(c, "item"), VORILinkableObject::IOItemLink);
        a->productIOs.push_back(io);
      } else if (IsTag(c, "item")) {
        VORModelObject* item = ItemRef(c, "ref");
        if (a->FindLink(item, VORILinkableObject::ItemLink))
          Fail(c, "'" + id + "': item '" + item->id + "' assigned twice");
        VORProductIOImpl* via = nullptr;
        if (Has(c, "via")) {
          via = Ref<VORProductIOImpl>(c, "via", "a product input");
          if (via->activity != a || !via->input)
            Fail(c, "'" + id + "': '" + via->id + "' is not a product input of this activity");
        }
        Link(a, item, VORILinkableObject::ItemLink, via);
      } else if (IsTag(c, "resource")) {
        auto* r = Ref<VORProductImpl>(c, "ref", "a resource");
        if (!r->isResource)
          Fail(c, "'" + id + "': '" + r->id + "' is a product, not a resource");
        if (a->FindLink(r, VORILinkableObject::ResourceLink))
          Fail(c, "'" + id + "': resource '" + r->id + "' assigned twice");
        Link(a, r, VORILinkableObject::ResourceLink);
      } else if (IsTag(c, "attribute")) {
        const std::string name = Required(c, "name");
        if (name.empty() || a->attributes.count(name))
          Fail(c, "'" + id + "': attribute '" + name + "' empty or given twice");
        a->attributes[name] = TypedValue(c, id);
      } else if (IsTag(c, "zitblt")) {
        LoadZitBltShown(c, a);
      } else if (IsTag(c, "flow")) {
        flows.push_back(c);
      } else {
        Fail(c, "unexpected element <" + Tag(c) + "> in activity '" + id + "'");
      }
    }
    for (Node f : flows) {
      const std::string from = Required(f, "from"), to = Required(f, "to");
      auto* a1 = VORKindCast<VORGraphNodeImpl>(_data.Find(from));
      auto* a2 = VORKindCast<VORGraphNodeImpl>(_data.Find(to));
      if (a1 == nullptr)
        Fail(f, "flow from '" + from + "', which is no activity of the document");
      if (a2 == nullptr)
        Fail(f, "flow to '" + to + "', which is no activity of the document");
      if (a1->father != a || a2->father != a)
        Fail(f, "flow '" + from + "' -> '" + to + "' does not join two children of '" + id + "'");
      if (a1 == a2)
        Fail(f, "flow from '" + from + "' to itself");
      for (const VORFlowRef& r : a1->next) {
        if (r.node == a2)
          Fail(f, "flow '" + from + "' -> '" + to + "' given twice");
      }
      const std::uint64_t stamp = _data.nextFlowStamp++;
      a1->next.push_back({a2, stamp});
      a2->previous.push_back({a1, stamp});
    }
  }

  const VORXmlTree& _t;
  std::string _name;
  VORDocumentData& _data;
  std::vector<VORHandle<VORModelObject>> _keep;  // products until the tree owns them
};

}  // namespace

namespace {
std::function<void(int)>& LoadProgress() {
  static std::function<void(int)> observer;
  return observer;
}
void Report(int percent) {
  if (LoadProgress())
    LoadProgress()(percent);
}
}  // namespace

void VORProcess::SetLoadProgress(std::function<void(int percent)> observer) {
  LoadProgress() = std::move(observer);
}

VORProcess* VORProcess::LoadFromString(const std::string& xml, const std::string& name,
                                       std::string& error) {
  VORModelLateTypes::Declare();
  // Parsing is most of the time; building the objects and checking them share the rest.
  VORXercesPlatform::ParseLimits limits;
  if (LoadProgress())
    limits.progress = [](double share) { Report(static_cast<int>(share * 60.0)); };
  Report(0);
  auto doc = VORHandle<VORProcess>::Adopt(new VORProcess());
  {
    VORXmlTree tree;
    if (!tree.Parse(xml, name, error, limits))
      return nullptr;
    Report(60);
    // At most one id per element: the index never rehashes while the loader fills it.
    doc->_data->ids.reserve(tree.Size());
    try {
      Loader loader(tree, name, *doc->_data);
      loader.Load();
    } catch (const LoadError& e) {
      error = e.what();
      return nullptr;
    }
  }
  Report(90);
  std::vector<std::string> problems;
  if (!VORModelChecker::Check(doc.get(), problems)) {
    error = name + ": inconsistent document: " + problems.front();
    return nullptr;
  }
  // Ids the loader did not use stay free for new objects.
  doc->_data->nextIdNumber = static_cast<long>(doc->_data->ids.size()) + 1;
  doc->_data->modified = false;
  Report(100);
  return doc.Detach();
}

VORProcess* VORProcess::Load(const std::string& path, std::string& error) {
  std::string content;
  if (!VORReadFile(path, content, error, std::size_t{64} << 20))
    return nullptr;
  // What a killed save left beside the document goes as soon as the document is opened.
  char real[PATH_MAX];
  const std::string file = ::realpath(path.c_str(), real) ? std::string(real) : path;
  VORRemoveStrayTemporaryFiles(file.substr(0, file.rfind('/') + (file.rfind('/') == 0)));
  VORProcess* doc = LoadFromString(content, path, error);
  if (doc != nullptr)
    doc->SetStorageName(path);
  return doc;
}
