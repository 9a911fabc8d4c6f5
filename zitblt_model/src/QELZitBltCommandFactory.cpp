#include "QELZitBltCommandFactory.h"

#include "VORCommandHeader.h"
#include "VORDynamicCast.h"
#include "VORModuleLoader.h"

namespace {
VORString Narrow(const VORUnicodeString& s) {
  return VORString(s.ConvertToUTF8().c_str());
}

VORCommand* Create(VORCommandFactory& factory, const VORUnicodeString& id,
                   const VORUnicodeString& module, const VORUnicodeString& className,
                   VORBaseUnknown* activity) {
  if (factory == nullptr) {
    // Host classes (no module) and names that cannot be looked up go the header's way each time.
    if (module.IsEmpty() || className.IsEmpty()) {
      auto header = VORCommandHeader_var::Adopt(new VORCommandHeader(
          Narrow(id), Narrow(module), Narrow(className), activity, VORCommandHeader::Available));
      return header->CreateCommand();
    }
    // Modules stay loaded for the life of the process, so a factory found stays valid; a
    // failure is not kept, so a module added later is found.
    factory = reinterpret_cast<VORCommandFactory>(VORModuleLoader::FindSymbol(
        module.ConvertToUTF8(), "fctCreate" + className.ConvertToUTF8()));
    if (factory == nullptr)
      return nullptr;
  }
  VORBaseUnknown* object = factory(activity);
  if (object == nullptr)
    return nullptr;
  auto* command = VORDynamicCast<VORCommand>(object);
  if (command == nullptr)
    object->Release();
  return command;
}
}  // namespace

namespace QELZitBltCommandFactory {

VORCommand* CreateRep(const QELZitBltDefinition& d, VORBaseUnknown* activity) {
  return Create(d.repFactory, d.name, d.loadModule, d.type, activity);
}

VORCommand* CreateUpdateCommand(const QELZitBltDefinition& d, VORBaseUnknown* activity) {
  return Create(d.updateFactory, d.updateCmdName, d.updateLoadModule, d.updateCmdName, activity);
}

}  // namespace QELZitBltCommandFactory
