#include "VOREnv.h"

#include <sys/stat.h>

#include <cstdlib>
#include <sstream>

const char* VORGetEnv(const char* name) {
  return name ? std::getenv(name) : nullptr;
}

HRESULT VORGetEnvValue(const char* name, VORString& value) {
  const char* v = VORGetEnv(name);
  if (v == nullptr)
    return E_FAIL;
  value = VORString(v);
  return S_OK;
}

VORUnicodeString VORFindPath(const VORUnicodeString& fileName, const VORUnicodeString& searchPath) {
  const std::string name = fileName.ConvertToUTF8();
  if (name.empty())
    return {};
  std::istringstream dirs(searchPath.ConvertToUTF8());
  for (std::string dir; std::getline(dirs, dir, ':');) {
    if (dir.empty())
      continue;
    const std::string path = dir + "/" + name;
    struct stat st {};
    if (::stat(path.c_str(), &st) == 0 && S_ISREG(st.st_mode))
      return VORUnicodeString(path);
  }
  return {};
}

VORUnicodeString VORFindResource(const VORUnicodeString& fileName) {
  const char* startup = VORGetEnv("VORStartupPath");
  if (startup == nullptr)
    return {};
  // Each startup directory is searched, then its conventional sub-folders.
  std::string expanded;
  std::istringstream dirs(startup);
  for (std::string dir; std::getline(dirs, dir, ':');) {
    if (dir.empty())
      continue;
    for (const char* sub : {"", "/msgcatalog", "/icons", "/config"}) {
      expanded += (expanded.empty() ? "" : ":") + dir + sub;
    }
  }
  return VORFindPath(fileName, VORUnicodeString(expanded));
}
