#include "QELZitBltConfiguration.h"

#include <map>
#include <utility>

#include <xercesc/dom/DOMElement.hpp>
#include <xercesc/dom/DOMNodeList.hpp>

#include "VOREnv.h"
#include "VORISpecObject.h"
#include "VORSettingRepository.h"

namespace {

VORIDOMDocument_var& ZitBltDocument() {
  static VORIDOMDocument_var document;
  return document;
}
bool zitBltLoaded = false;

using Cache = std::map<VORUnicodeString, std::vector<QELZitBltDefinition>>;
// Per parsed document, which the entry keeps alive so that its address cannot be reused.
std::map<const VORIDOMDocument*, std::pair<VORIDOMDocument_var, Cache>>& Answers() {
  static std::map<const VORIDOMDocument*, std::pair<VORIDOMDocument_var, Cache>> answers;
  return answers;
}

// The answer given last: every activity of a level asks for the same type, and a type name
// compares in one step where the cache's tree would compare it at every level.
struct LastAnswer {
  const VORIDOMDocument* document = nullptr;
  VORUnicodeString activityType;
  const std::vector<QELZitBltDefinition>* definitions = nullptr;
};
LastAnswer& Last() {
  static LastAnswer last;
  return last;
}

const std::u16string& Xml(const char* text) {
  static std::map<std::string, std::u16string> converted;
  auto it = converted.find(text);
  if (it == converted.end())
    it = converted.emplace(text, VORXercesPlatform::FromUTF8(text)).first;
  return it->second;
}

// A configuration file found along VORStartupPath; empty when the variable is unset or no folder
// has the file.
VORUnicodeString FindOnStartupPath(const char* file) {
  const char* startup = VORGetEnv("VORStartupPath");
  if (startup == nullptr)
    return {};
  return VORFindPath(file, VORUnicodeString(startup));
}

VORUnicodeString Attribute(const xercesc::DOMElement* element, const char* name) {
  return VORUnicodeString::FromUTF16(element->getAttribute(Xml(name).c_str()));
}

}  // namespace

namespace QELZitBltConfiguration {

bool LoadConfiguration(VORIDOMDocument_var& document) {
  if (zitBltLoaded && ZitBltDocument()) {
    document = ZitBltDocument();
    return true;
  }
  VORIDOMDocument_var parsed;
  if (!ParseConfigFile(FindOnStartupPath("zitbltcfg.xml"), parsed))
    return false;
  ZitBltDocument() = parsed;
  zitBltLoaded = true;
  document = parsed;
  return true;
}

std::vector<QELZitBltDefinition> ReadDefinitions(const VORIDOMDocument_var& document,
                                                 const VORUnicodeString& activityType) {
  std::vector<QELZitBltDefinition> definitions;
  if (!document || document->getDocument() == nullptr)
    return definitions;
  const std::u16string wanted = activityType.ConvertToUTF16();
  xercesc::DOMNodeList* blocks =
      document->getDocument()->getElementsByTagName(Xml("ActivityZitBlt").c_str());
  for (XMLSize_t b = 0; b < blocks->getLength(); ++b) {
    auto* block = static_cast<xercesc::DOMElement*>(blocks->item(b));
    if (std::u16string_view(block->getAttribute(Xml("ActivityType").c_str())) != wanted)
      continue;
    xercesc::DOMNodeList* zitblts = block->getElementsByTagName(Xml("ZitBlt").c_str());
    for (XMLSize_t z = 0; z < zitblts->getLength(); ++z) {
      auto* element = static_cast<xercesc::DOMElement*>(zitblts->item(z));
      QELZitBltDefinition d;
      d.name = Attribute(element, "Name");
      d.type = Attribute(element, "Type");
      d.loadModule = Attribute(element, "LoadModule");
      d.location = Attribute(element, "Location");
      d.priority = Attribute(element, "Priority");
      d.initialState = Attribute(element, "InitialState");
      d.iconFile = Attribute(element, "IconFile");
      xercesc::DOMNodeList* updates = element->getElementsByTagName(Xml("UpdateData").c_str());
      if (updates->getLength() > 0) {
        auto* update = static_cast<xercesc::DOMElement*>(updates->item(0));
        d.hasUpdateData = true;
        d.updateCmdName = Attribute(update, "CmdName");
        d.updateLoadModule = Attribute(update, "LoadModule");
      }
      definitions.push_back(std::move(d));
    }
  }
  return definitions;
}

const std::vector<QELZitBltDefinition>& DefinitionsFor(const VORIDOMDocument_var& document,
                                                       const VORUnicodeString& activityType) {
  LastAnswer& last = Last();
  if (last.definitions != nullptr && last.document == document.get() &&
      last.activityType == activityType)
    return *last.definitions;
  auto& entry = Answers()[document.get()];
  if (!entry.first)
    entry.first = document;
  Cache& cache = entry.second;
  auto it = cache.find(activityType);
  if (it == cache.end())
    it = cache.emplace(activityType, ReadDefinitions(document, activityType)).first;
  // A map's values stay where they are while it grows.
  last = {document.get(), activityType, &it->second};
  return it->second;
}

const std::vector<QELZitBltDefinition>& DefinitionsForActivity(const VORIDOMDocument_var& document,
                                                               VORBaseUnknown* activity) {
  VORISpecObject_var spec{VORBaseUnknown_var(activity)};
  VORUnicodeString typeName;
  if (spec)
    spec->GetTypeName(typeName);
  return DefinitionsFor(document, typeName);
}

VORUnicodeString StatusBarConfigFile() {
  VORUnicodeString configured;
  if (VORSettingRepository* settings = VORSettingRepository::GetRepository("QELPFViewerSettings")) {
    settings->ReadSetting("XMLFileForStatusbar", configured);
  }
  // A configured name is used as it stands: it is not searched along VORStartupPath.
  if (!configured.IsEmpty())
    return configured;
  return FindOnStartupPath("StatusBarConfiguration.xml");
}

bool ParseConfigFile(const VORUnicodeString& path, VORIDOMDocument_var& document) {
  if (path.IsEmpty())
    return false;
  VORIDOMDocument_var parsed;
  if (FAILED(VORParseXMLFile(path.ConvertToUTF8(), parsed)) || !parsed)
    return false;
  document = parsed;
  return true;
}

void ForgetForTests() {
  ZitBltDocument() = NULL_var;
  zitBltLoaded = false;
  Last() = {};
  Answers().clear();
}

}  // namespace QELZitBltConfiguration
