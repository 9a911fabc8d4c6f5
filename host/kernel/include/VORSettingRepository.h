// Per-user settings, one file per repository in the user's configuration directory
// ($VOR_USER_SETTINGS_DIR, else $XDG_CONFIG_HOME/pfv, else ~/.config/pfv).
#pragma once

#include <map>
#include <string>

#include "VORTypes.h"
#include "VORUnicodeString.h"

class VORSettingRepository {
 public:
  // The repository of that name, read on first use; shared for the life of the process.
  static VORSettingRepository* GetRepository(const char* name);
  // Drops every repository from memory (unsaved changes are lost).
  static void Forget();

  // S_OK and the value when the key is present; E_FAIL and value untouched otherwise.
  HRESULT ReadSetting(const char* key, VORUnicodeString& value) const;
  HRESULT ReadSetting(const char* key, int& value) const;
  void WriteSetting(const char* key, const VORUnicodeString& value);
  void WriteSetting(const char* key, int value);
  void RemoveSetting(const char* key);
  // Writes the repository to disk atomically; E_FAIL when the file cannot be written.
  HRESULT SaveRepository();

  std::string FilePath() const;

 private:
  explicit VORSettingRepository(std::string name);
  void Load();

  std::string _name;
  std::map<std::string, std::string> _values;
};
