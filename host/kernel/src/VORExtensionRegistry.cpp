#include "VORExtensionRegistry.h"

#include <fstream>
#include <map>
#include <sstream>
#include <string_view>
#include <utility>

#include "VOREnv.h"
#include "VORLateTypes.h"
#include "VORModuleLoader.h"

namespace {
using Key = std::pair<std::string, std::string>;  // late type, interface name

// Orders keys and (late type, interface) views alike: a query builds no strings.
struct KeyLess {
  using is_transparent = void;
  using View = std::pair<std::string_view, std::string_view>;
  static View AsView(const Key& k) { return {k.first, k.second}; }
  static View AsView(const View& v) { return v; }
  template <class A, class B>
  bool operator()(const A& a, const B& b) const {
    return AsView(a) < AsView(b);
  }
};

std::map<Key, VORExtensionRegistry::Entry>& Entries() {
  static std::map<Key, VORExtensionRegistry::Entry> entries;
  return entries;
}
// Answers of Find, good until the next registration or dictionary change.
std::map<Key, VORExtensionRegistry::Entry, KeyLess>& Answers() {
  static std::map<Key, VORExtensionRegistry::Entry, KeyLess> answers;
  return answers;
}
std::map<Key, std::string>& Dictionary() {
  static std::map<Key, std::string> dictionary;
  return dictionary;
}

VORExtensionRegistry::Entry FindRegistered(const std::vector<std::string>& chain,
                                           const std::string& iid) {
  for (const std::string& type : chain) {
    auto it = Entries().find({type, iid});
    if (it != Entries().end())
      return it->second;
  }
  return {};
}
}  // namespace

namespace VORExtensionRegistry {

void Register(const std::string& lateType, const VORInterfaceId& iid, VORExtensionFactory factory,
              VORExtensionKind kind) {
  Entries()[{lateType, std::string(iid.name)}] = Entry{factory, kind};
  Answers().clear();
}

void Unregister(const std::string& lateType, const VORInterfaceId& iid) {
  Entries().erase({lateType, std::string(iid.name)});
  Answers().clear();
}

static Entry Resolve(const std::string& lateType, const std::string& name);

Entry Find(std::string_view lateType, const VORInterfaceId& iid) {
  if (auto it = Answers().find(KeyLess::View(lateType, iid.name)); it != Answers().end())
    return it->second;
  Key key{std::string(lateType), std::string(iid.name)};
  Entry answer = Resolve(key.first, key.second);
  Answers()[std::move(key)] = answer;
  return answer;
}

static Entry Resolve(const std::string& lateType, const std::string& name) {
  const std::vector<std::string> chain = VORLateTypes::Chain(lateType);
  Entry found = FindRegistered(chain, name);
  if (found.factory != nullptr)
    return found;
  // Nothing registered yet: the module that provides it may not be loaded.
  for (const std::string& type : chain) {
    auto it = Dictionary().find({type, name});
    if (it == Dictionary().end())
      continue;
    if (VORModuleLoader::LoadModule(it->second) != nullptr)
      return FindRegistered(chain, name);
    return {};
  }
  return {};
}

bool LoadDictionary(const std::string& path) {
  std::ifstream in(path);
  if (!in)
    return false;
  std::map<Key, std::string> read;
  std::string line;
  while (std::getline(in, line)) {
    if (auto hash = line.find('#'); hash != std::string::npos)
      line.erase(hash);
    std::istringstream words(line);
    std::string type, iid, module;
    if (words >> type >> iid >> module)
      read[{type, iid}] = module;
  }
  for (auto& [key, module] : read)
    Dictionary()[key] = module;
  return true;
}

void LoadDictionaryFromStartupPath() {
  VORUnicodeString path = VORFindResource("VORModules.dic");
  if (!path.IsEmpty())
    LoadDictionary(path.ConvertToUTF8());
}

void ForgetAnswers() {
  Answers().clear();
}

void ClearDictionary() {
  Dictionary().clear();
}

}  // namespace VORExtensionRegistry
