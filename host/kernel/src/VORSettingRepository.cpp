#include "VORSettingRepository.h"

#include <sys/stat.h>

#include <memory>
#include <sstream>

#include "VOREnv.h"
#include "VORFileIO.h"

namespace {
std::map<std::string, std::unique_ptr<VORSettingRepository>>& Repositories() {
  static std::map<std::string, std::unique_ptr<VORSettingRepository>> repositories;
  return repositories;
}

std::string SettingsDirectory() {
  if (const char* dir = VORGetEnv("VOR_USER_SETTINGS_DIR"))
    return dir;
  if (const char* xdg = VORGetEnv("XDG_CONFIG_HOME"); xdg && *xdg)
    return std::string(xdg) + "/pfv";
  if (const char* home = VORGetEnv("HOME"))
    return std::string(home) + "/.config/pfv";
  return ".pfv";
}

void MakeDirectories(const std::string& dir) {
  for (size_t at = dir.find('/', 1);; at = dir.find('/', at + 1)) {
    ::mkdir(dir.substr(0, at).c_str(), 0755);
    if (at == std::string::npos)
      break;
  }
}

// Values are stored one per line as key=value; backslash escapes keep newlines on one line.
std::string Escape(const std::string& s) {
  std::string out;
  for (char c : s) {
    if (c == '\\')
      out += "\\\\";
    else if (c == '\n')
      out += "\\n";
    else
      out.push_back(c);
  }
  return out;
}
std::string Unescape(const std::string& s) {
  std::string out;
  for (size_t i = 0; i < s.size(); ++i) {
    if (s[i] == '\\' && i + 1 < s.size()) {
      ++i;
      out.push_back(s[i] == 'n' ? '\n' : s[i]);
    } else {
      out.push_back(s[i]);
    }
  }
  return out;
}
}  // namespace

VORSettingRepository* VORSettingRepository::GetRepository(const char* name) {
  if (name == nullptr || *name == '\0')
    return nullptr;
  auto& slot = Repositories()[name];
  if (!slot) {
    slot.reset(new VORSettingRepository(name));
    slot->Load();
  }
  return slot.get();
}

void VORSettingRepository::Forget() {
  Repositories().clear();
}

VORSettingRepository::VORSettingRepository(std::string name) : _name(std::move(name)) {}

std::string VORSettingRepository::FilePath() const {
  return SettingsDirectory() + "/" + _name + ".ini";
}

void VORSettingRepository::Load() {
  std::string content, error;
  if (!VORReadFile(FilePath(), content, error, 4 << 20))
    return;
  std::istringstream lines(content);
  for (std::string line; std::getline(lines, line);) {
    auto eq = line.find('=');
    if (eq == std::string::npos || line.empty() || line[0] == '#')
      continue;
    _values[line.substr(0, eq)] = Unescape(line.substr(eq + 1));
  }
}

HRESULT VORSettingRepository::ReadSetting(const char* key, VORUnicodeString& value) const {
  auto it = _values.find(key ? key : "");
  if (it == _values.end())
    return E_FAIL;
  value = VORUnicodeString(it->second);
  return S_OK;
}

HRESULT VORSettingRepository::ReadSetting(const char* key, int& value) const {
  auto it = _values.find(key ? key : "");
  if (it == _values.end())
    return E_FAIL;
  try {
    size_t used = 0;
    int parsed = std::stoi(it->second, &used);
    if (used != it->second.size())
      return E_FAIL;
    value = parsed;
    return S_OK;
  } catch (const std::exception&) {
    return E_FAIL;
  }
}

void VORSettingRepository::WriteSetting(const char* key, const VORUnicodeString& value) {
  std::string k = key ? key : "";
  // Keys the file could not give back are refused: '=' ends a key, '#' starts a comment line.
  if (k.empty() || k.find_first_of("=\n") != std::string::npos || k[0] == '#')
    return;
  _values[k] = value.ConvertToUTF8();
}

void VORSettingRepository::WriteSetting(const char* key, int value) {
  WriteSetting(key, VORUnicodeString(std::to_string(value)));
}

void VORSettingRepository::RemoveSetting(const char* key) {
  _values.erase(key ? key : "");
}

HRESULT VORSettingRepository::SaveRepository() {
  std::string content;
  for (const auto& [k, v] : _values)
    content += k + "=" + Escape(v) + "\n";
  MakeDirectories(SettingsDirectory());
  std::string error;
  return VORWriteFileAtomically(FilePath(), content, error, false) ? S_OK : E_FAIL;
}
