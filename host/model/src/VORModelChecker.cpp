// The invariant checker: walks the document once and checks every cross reference both ways.
#include "VORModelChecker.h"

#include <algorithm>
#include <functional>
#include <string_view>
#include <unordered_set>

#include "VORModelObjects.h"

namespace {

class Checker {
 public:
  Checker(VORDocumentData& d, std::vector<std::string>& problems) : _d(d), _problems(problems) {}

  bool Run() {
    const size_t before = _problems.size();
    if (!_d.root)
      Problem("the document has no root process");
    const std::vector<VORModelObject*> all = _d.AllObjects();
    _objects.reserve(all.size());
    for (VORModelObject* o : all) {
      if (!_objects.insert(o).second)
        Problem("object '" + o->id + "' is reachable twice");
    }
    CheckIds();
    if (_d.root)
      CheckNode(_d.root.get(), nullptr);
    CheckProducts();
    for (VORModelObject* o : _objects)
      CheckLinks(o);
    CheckAssemblyCycles();
    for (auto& [id, h] : _d.hubObjects) {
      if (_d.Find(id) == nullptr)
        Problem("hub record of '" + id + "', which is not in the document");
    }
    return _problems.size() == before;
  }

 private:
  void Problem(std::string text) { _problems.push_back(std::move(text)); }

  // Every object named, in the index under its own name, and nothing else in the index: when
  // each entry of the index names a distinct object of the document by that object's id and
  // there are as many entries as objects, ids are unique and complete without a lookup per id.
  bool IdsHold() const {
    if (_d.ids.size() != _objects.size())
      return false;
    for (const VORModelObject* o : _objects) {
      if (o->id.empty() || o->data != &_d)
        return false;
    }
    for (const auto& [id, o] : _d.ids) {
      if (o == nullptr || o->id != id || _objects.count(o) == 0)
        return false;
    }
    return true;
  }

  void CheckIds() {
    if (IdsHold())
      return;
    // Something is wrong: name every problem.
    std::unordered_set<std::string_view> seen;  // views of the objects' own ids
    for (VORModelObject* o : _objects) {
      if (o->id.empty())
        Problem("an object of type '" + o->lateType.str() + "' has no id");
      else if (!seen.insert(o->id).second)
        Problem("id '" + o->id + "' is used twice");
      if (o->data != &_d)
        Problem("'" + o->id + "' does not know its document");
      if (_d.Find(o->id) != o)
        Problem("'" + o->id + "' is missing from the id index");
    }
    if (_d.ids.size() != _objects.size())
      Problem("the id index holds " + std::to_string(_d.ids.size()) + " entries for " +
              std::to_string(_objects.size()) + " objects");
  }

  void CheckNode(VORGraphNodeImpl* n, VORActivityImpl* father) {
    if (n->father != father)
      Problem("'" + n->id + "' has a wrong father");
    auto checkSide = [&](const std::vector<VORFlowRef>& refs, bool forward) {
      // Most nodes have a few flows: a scan finds a repeated one without allocating.
      constexpr size_t kScanned = 16;
      std::unordered_set<VORGraphNodeImpl*> seen;
      for (size_t i = 0; i < refs.size(); ++i) {
        const VORFlowRef& r = refs[i];
        // The message is built only for a problem: a large document has millions of refs.
        auto what = [&] {
          return "flow between '" + n->id + "' and '" +
                 (r.node ? r.node->id : std::string("null")) + "'";
        };
        if (r.node == nullptr || _objects.count(r.node) == 0) {
          Problem("dangling " + what());
          continue;
        }
        if (r.node->father != n->father || r.node == n)
          Problem(what() + " does not join two siblings");
        const bool repeated =
            refs.size() <= kScanned ? GivenBefore(refs, i) : !seen.insert(r.node).second;
        if (repeated)
          Problem(what() + " is given twice");
        const auto& other = forward ? r.node->previous : r.node->next;
        if (std::none_of(other.begin(), other.end(),
                         [&](const VORFlowRef& x) { return x.node == n && x.stamp == r.stamp; }))
          Problem(what() + " is known at one end only");
      }
    };
    checkSide(n->next, true);
    checkSide(n->previous, false);
    VORActivityImpl* a = n->AsActivity();
    if (a == nullptr)
      return;
    for (auto& io : a->productIOs) {
      if (io->activity != a)
        Problem("product IO '" + io->id + "' does not know its activity '" + a->id + "'");
      if (io->Item() == nullptr)
        Problem("product IO '" + io->id + "' has no item");
    }
    for (auto& c : a->children)
      CheckNode(c.get(), a);
  }

  void CheckProducts() {
    for (auto& p : _d.rootProducts) {
      if (p->father != nullptr)
        Problem("root product '" + p->id + "' has a father");
      std::unordered_set<VORProductImpl*> path;
      CheckProduct(p.get(), path);
    }
    for (const char* alias : {VORDocument::RootProductAlias}) {
      int count = 0;
      for (auto& p : _d.rootProducts)
        count += p->alias == VORUnicodeString(alias);
      if (count > 1)
        Problem(std::string("more than one root product is aliased '") + alias + "'");
    }
  }

  void CheckProduct(VORProductImpl* p, std::unordered_set<VORProductImpl*>& path) {
    if (!path.insert(p).second) {
      Problem("the product tree has a cycle through '" + p->id + "'");
      return;
    }
    for (auto& c : p->children) {
      if (c->father != p)
        Problem("product '" + c->id + "' has a wrong father");
      CheckProduct(c.get(), path);
    }
    path.erase(p);
  }

  void CheckLinks(VORModelObject* o) {
    _targets.clear();
    for (const VORModelLink& l : o->out) {
      if (l.target == nullptr || _objects.count(l.target) == 0) {
        Problem("dangling " + l.type.str() + " link from '" + o->id + "'");
        continue;
      }
      _targets.push_back(l.target);
      auto what = [&] { return l.type.str() + " link '" + o->id + "' -> '" + l.target->id + "'"; };
      if (l.type == VORILinkableObject::ResourceLink) {
        auto* r = VORKindCast<VORProductImpl>(l.target);
        if (VORKindCast<VORActivityImpl>(o) == nullptr || r == nullptr || !r->isResource)
          Problem(what() + " does not assign a resource to an activity");
      } else if (l.type == VORILinkableObject::ItemLink) {
        if (VORKindCast<VORActivityImpl>(o) == nullptr || !l.target->Is(VORKindItem))
          Problem(what() + " does not assign an item to an activity");
        if (l.via != nullptr &&
            (_objects.count(l.via) == 0 || l.via->activity != VORKindCast<VORActivityImpl>(o)))
          Problem(what() + " was made with an input that is not the activity's");
      }
    }
    // Each target as often as o points at it: equal targets side by side.
    std::sort(_targets.begin(), _targets.end(), std::less<>());
    for (size_t i = 0; i < _targets.size();) {
      VORModelObject* target = _targets[i];
      size_t end = i;
      while (end < _targets.size() && _targets[end] == target)
        ++end;
      const auto count = static_cast<long>(end - i);
      if (std::count(target->in.begin(), target->in.end(), o) != count)
        Problem("links from '" + o->id + "' to '" + target->id + "' are known at one end only");
      i = end;
    }
    for (VORModelObject* s : o->in) {
      if (s == nullptr || _objects.count(s) == 0)
        Problem("'" + o->id + "' is pointed at by an object that is not in the document");
      else if (s->LinkIndex(o, nullptr) < 0)
        Problem("'" + o->id + "' lists '" + s->id + "' as pointing at it, which it does not");
    }
  }

  void CheckAssemblyCycles() {
    for (auto& m : _d.assemblies) {
      std::vector<VORModelObject*> stack = m->Targets(VORILinkableObject::ComponentLink);
      std::unordered_set<VORModelObject*> seen;
      while (!stack.empty()) {
        VORModelObject* o = stack.back();
        stack.pop_back();
        if (o == m.get()) {
          Problem("assembly '" + m->id + "' contains itself");
          break;
        }
        if (!seen.insert(o).second)
          continue;
        for (VORModelObject* t : o->Targets(VORILinkableObject::ComponentLink))
          stack.push_back(t);
      }
    }
  }

  // True when refs[i] names a node that an earlier ref names too.
  static bool GivenBefore(const std::vector<VORFlowRef>& refs, size_t i) {
    return std::any_of(refs.begin(), refs.begin() + static_cast<long>(i),
                       [&](const VORFlowRef& r) { return r.node == refs[i].node; });
  }

  VORDocumentData& _d;
  std::vector<std::string>& _problems;
  std::unordered_set<VORModelObject*> _objects;
  std::vector<VORModelObject*> _targets;  // of the object CheckLinks looks at
};

}  // namespace

bool VORModelChecker::Check(VORProcess* document, std::vector<std::string>& problems) {
  if (document == nullptr) {
    problems.push_back("no document");
    return false;
  }
  return Checker(document->Data(), problems).Run();
}
