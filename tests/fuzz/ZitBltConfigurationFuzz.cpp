// Any bytes as a ZitBlt configuration file: refused quietly, or parsed into a document whose
// cached answers equal the plain reading for every activity type it names.
#include <xercesc/dom/DOM.hpp>

#include <cstdint>
#include <set>
#include <string>

#include "FuzzSupport.h"
#include "VORModelInit.h"
#include "QELZitBltConfiguration.h"

namespace {
bool Same(const QELZitBltDefinition& a, const QELZitBltDefinition& b) {
  return a.name == b.name && a.type == b.type && a.loadModule == b.loadModule &&
         a.location == b.location && a.priority == b.priority && a.initialState == b.initialState &&
         a.iconFile == b.iconFile && a.hasUpdateData == b.hasUpdateData &&
         a.updateCmdName == b.updateCmdName && a.updateLoadModule == b.updateLoadModule;
}
}  // namespace

extern "C" int LLVMFuzzerInitialize(int*, char***) {
  VORInitModel();
  return 0;
}

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, size_t size) {
  const std::string path =
      pfvfuzz::WriteScratch("zitbltcfg.xml", reinterpret_cast<const char*>(data), size);
  VORIDOMDocument_var document;
  if (!QELZitBltConfiguration::ParseConfigFile(VORUnicodeString(path), document))
    return 0;
  std::set<VORUnicodeString> types = {VORUnicodeString("BIWActivityStation"), VORUnicodeString()};
  xercesc::DOMNodeList* blocks = document->getDocument()->getElementsByTagName(
      reinterpret_cast<const XMLCh*>(u"ActivityZitBlt"));
  for (XMLSize_t b = 0; b < blocks->getLength() && b < 8; ++b) {
    auto* block = static_cast<xercesc::DOMElement*>(blocks->item(b));
    types.insert(VORUnicodeString::FromUTF16(
        block->getAttribute(reinterpret_cast<const XMLCh*>(u"ActivityType"))));
  }
  for (int round = 0; round < 2; ++round) {  // the second round answers from the cache
    for (const VORUnicodeString& type : types) {
      const auto& cached = QELZitBltConfiguration::DefinitionsFor(document, type);
      const auto plain = QELZitBltConfiguration::ReadDefinitions(document, type);
      if (cached.size() != plain.size())
        pfvfuzz::Broken("the cache holds another number of definitions");
      for (size_t i = 0; i < plain.size(); ++i) {
        if (!Same(cached[i], plain[i]))
          pfvfuzz::Broken("a cached definition differs from the plain reading");
      }
    }
  }
  QELZitBltConfiguration::ForgetForTests();
  return 0;
}
