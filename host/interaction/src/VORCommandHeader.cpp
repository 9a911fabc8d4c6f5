#include "VORCommandHeader.h"

#include <map>

#include "VORCommandEngine.h"
#include "VORModuleLoader.h"

namespace {
std::map<std::string, VORCommandHeader_var>& Declared() {
  static auto* declared = new std::map<std::string, VORCommandHeader_var>();  // never destroyed
  return *declared;
}
std::map<std::string, VORCommandHeader::HostFactory>& HostClasses() {
  static auto* classes = new std::map<std::string, VORCommandHeader::HostFactory>();
  return *classes;
}
}  // namespace

VORCommandHeader::VORCommandHeader(const VORString& id, const VORString& module,
                                   const VORString& className, VORBaseUnknown* argument, int state)
    : _id(id), _module(module), _className(className), _argument(argument), _state(state) {}

VORCommand* VORCommandHeader::CreateCommand() {
  _lastError.clear();
  if (!IsAvailable()) {
    _lastError = "command \"" + _id.str() + "\" is unavailable";
    return nullptr;
  }
  if (_module.IsEmpty()) {
    auto it = HostClasses().find(_className.str());
    if (it == HostClasses().end()) {
      _lastError = "no host class \"" + _className.str() + "\"";
      return nullptr;
    }
    return it->second(_argument.get());
  }
  if (_className.IsEmpty()) {
    _lastError = "empty class name";
    return nullptr;
  }
  auto factory = reinterpret_cast<VORCommandFactory>(
      VORModuleLoader::FindSymbol(_module.str(), "fctCreate" + _className.str()));
  if (factory == nullptr) {
    _lastError = VORModuleLoader::LastError();
    return nullptr;
  }
  VORBaseUnknown* object = factory(_argument.get());
  if (object == nullptr) {
    _lastError = "fctCreate" + _className.str() + " gave nothing";
    return nullptr;
  }
  auto* command = dynamic_cast<VORCommand*>(object);
  if (command == nullptr) {
    _lastError = _className.str() + " is not a command";
    object->Release();
  }
  return command;
}

VORCommand* VORCommandHeader::StartCommand() {
  VORCommand_var command = VORCommand_var::Adopt(CreateCommand());
  if (!command)
    return nullptr;
  VORCommandEngine::Start(command);
  return command.get();
}

void VORCommandHeader::Declare(VORCommandHeader* header) {
  if (header != nullptr)
    Declared()[header->GetID().str()] = header;
}

VORCommandHeader* VORCommandHeader::Find(const VORString& id) {
  auto it = Declared().find(id.str());
  return it == Declared().end() ? nullptr : it->second.get();
}

void VORCommandHeader::Undeclare(const VORString& id) {
  Declared().erase(id.str());
}

std::vector<VORString> VORCommandHeader::DeclaredIds() {
  std::vector<VORString> ids;
  for (const auto& [id, header] : Declared())
    ids.emplace_back(id);
  return ids;
}

void VORCommandHeader::RegisterHostClass(const VORString& className, HostFactory factory) {
  HostClasses()[className.str()] = std::move(factory);
}
