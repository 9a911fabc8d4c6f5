// Any bytes as a settings file and as a message catalogue: read without harm; a setting the
// repository accepts comes back unchanged after a save and a fresh read.
#include <cstdint>
#include <cstdlib>
#include <string>

#include "FuzzSupport.h"
#include "VORMsgCatalog.h"
#include "VORSettingRepository.h"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, size_t size) {
  const char* bytes = reinterpret_cast<const char*>(data);
  ::setenv("VOR_USER_SETTINGS_DIR", pfvfuzz::Scratch().c_str(), 1);
  ::setenv("VORStartupPath", pfvfuzz::Scratch().c_str(), 1);
  pfvfuzz::WriteScratch("Fuzz.ini", bytes, size);
  pfvfuzz::WriteScratch("Fuzz.msg", bytes, size);

  VORMsgCatalog::ClearCache();
  VORListValVORUnicodeString parameters;
  parameters.Append(VORUnicodeString("one"));
  parameters.Append(VORUnicodeString("/p1"));
  for (const char* key : {"Title", "Error.NoFile", "#", ""})
    VORMsgCatalog::BuildMessage("Fuzz", key, VORUnicodeString("/p2 /p1"), &parameters);

  // The input's first line (without its NULs) as a key, the rest as the value.
  std::string text(bytes, size);
  const size_t newline = text.find('\n');
  std::string key = text.substr(0, newline);
  key = key.substr(0, key.find('\0'));
  const std::string value = newline == std::string::npos ? "" : text.substr(newline + 1);
  VORSettingRepository::Forget();
  VORSettingRepository* repo = VORSettingRepository::GetRepository("Fuzz");
  repo->WriteSetting(key.c_str(), VORUnicodeString(value));
  VORUnicodeString written;
  const bool accepted = repo->ReadSetting(key.c_str(), written) == S_OK;
  if (repo->SaveRepository() != S_OK)
    pfvfuzz::Broken("the settings could not be saved");
  VORSettingRepository::Forget();
  repo = VORSettingRepository::GetRepository("Fuzz");
  VORUnicodeString read;
  if (accepted && (repo->ReadSetting(key.c_str(), read) != S_OK || !(read == written)))
    pfvfuzz::Broken("the setting '" + key + "' did not come back");
  VORSettingRepository::Forget();
  return 0;
}
