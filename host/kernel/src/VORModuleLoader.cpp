#include "VORModuleLoader.h"

#include <dlfcn.h>

#include <map>
#include <sstream>

#include "VORBaseUnknown.h"
#include "VOREnv.h"

namespace {
std::string& ConfiguredPath() {
  static std::string path;
  return path;
}
std::map<std::string, void*>& Loaded() {
  static std::map<std::string, void*> loaded;
  return loaded;
}
std::string& LastErrorText() {
  static std::string text;
  return text;
}
bool IsPlainName(const std::string& name) {
  return !name.empty() && name.find('/') == std::string::npos &&
         name.find("..") == std::string::npos;
}
}  // namespace

namespace VORModuleLoader {

void SetSearchPath(const std::string& path) {
  ConfiguredPath() = path;
}

std::vector<std::string> SearchPath() {
  std::string joined;
  if (const char* env = VORGetEnv("VOR_MODULE_PATH"))
    joined = env;
  if (!ConfiguredPath().empty())
    joined += (joined.empty() ? "" : ":") + ConfiguredPath();
  std::vector<std::string> dirs;
  std::istringstream parts(joined);
  for (std::string dir; std::getline(parts, dir, ':');) {
    if (!dir.empty())
      dirs.push_back(dir);
  }
  return dirs;
}

void* LoadModule(const std::string& module) {
  if (auto it = Loaded().find(module); it != Loaded().end())
    return it->second;
  if (!IsPlainName(module)) {
    LastErrorText() = "invalid module name \"" + module + "\"";
    return nullptr;
  }
  const std::string file = "lib" + module + ".so";
  for (const std::string& dir : SearchPath()) {
    const std::string path = dir + "/" + file;
    void* handle = dlopen(path.c_str(), RTLD_NOW | RTLD_GLOBAL);
    if (handle == nullptr) {
      const char* why = dlerror();
      // A file that exists but cannot be loaded is worth reporting; keep looking anyway.
      LastErrorText() = why ? why : ("cannot load " + path);
      continue;
    }
    Loaded()[module] = handle;
    if (auto init = reinterpret_cast<void (*)()>(dlsym(handle, "VORInitModule")))
      init();
    return handle;
  }
  LastErrorText() = "module \"" + module + "\" not found (" + file + ")";
  return nullptr;
}

void* FindSymbol(const std::string& module, const std::string& symbol) {
  void* handle = LoadModule(module);
  if (handle == nullptr)
    return nullptr;
  dlerror();
  void* address = dlsym(handle, symbol.c_str());
  if (address == nullptr)
    LastErrorText() = "module \"" + module + "\" has no " + symbol;
  return address;
}

VORBaseUnknown* CreateObject(const std::string& module, const std::string& className) {
  if (className.empty()) {
    LastErrorText() = "empty class name";
    return nullptr;
  }
  auto factory =
      reinterpret_cast<VORBaseUnknown* (*)()>(FindSymbol(module, "fctCreate" + className));
  return factory ? factory() : nullptr;
}

std::string LastError() {
  return LastErrorText();
}

}  // namespace VORModuleLoader
