#include "VORLateTypes.h"

#include <unordered_map>

#include "VORExtensionRegistry.h"

namespace {
std::unordered_map<std::string, std::string>& Parents() {
  static std::unordered_map<std::string, std::string> parents;
  return parents;
}
}  // namespace

namespace VORLateTypes {

void Declare(const std::string& type, const std::string& parent) {
  Parents()[type] = parent;
  VORExtensionRegistry::ForgetAnswers();
}

std::string Parent(const std::string& type) {
  auto it = Parents().find(type);
  return it == Parents().end() ? std::string() : it->second;
}

std::vector<std::string> Chain(const std::string& type) {
  std::vector<std::string> chain;
  // Bounded walk: a declaration cycle must not hang the look-up.
  for (std::string t = type; !t.empty() && chain.size() < 64; t = Parent(t))
    chain.push_back(t);
  return chain;
}

bool IsKindOf(const std::string& type, const std::string& ancestor) {
  for (const std::string& t : Chain(type)) {
    if (t == ancestor)
      return true;
  }
  return false;
}

}  // namespace VORLateTypes
