// A parsed XML document shared by reference: the platform's DOM handle over the hardened parser.
// Header-only so that readers of configuration files need nothing but the model's parser.
#pragma once

#include <string>
#include <utility>

#include "VORHandle.h"
#include "VORXercesPlatform.h"

class VORIDOMDocument : public VORBaseUnknown {
  VOR_DECLARE_CLASS(VORIDOMDocument, VORBaseUnknown)
 public:
  explicit VORIDOMDocument(VORXercesPlatform::Document document) : _document(std::move(document)) {}
  xercesc::DOMDocument* getDocument() const { return _document.get(); }
  xercesc::DOMElement* getDocumentElement() const {
    return _document ? _document.get()->getDocumentElement() : nullptr;
  }

 private:
  VORXercesPlatform::Document _document;
};
VOR_DECLARE_HANDLE(VORIDOMDocument);

// Parses the configuration file at path with the hardened parser: a DOCTYPE is accepted as long
// as it names nothing external, entity expansion is bounded, no validation. S_OK and the
// document, or E_FAIL with the reason in error (file, line and column when it parsed).
inline HRESULT VORParseXMLFile(const std::string& path, VORIDOMDocument_var& document,
                               std::string* error = nullptr) {
  std::string why;
  if (!VORXercesPlatform::Initialize(&why)) {
    if (error)
      *error = why;
    return E_FAIL;
  }
  VORXercesPlatform::ParseLimits limits;
  limits.acceptInternalDoctype = true;
  VORXercesPlatform::Document parsed = VORXercesPlatform::ParseFile(path, why, limits);
  if (!parsed) {
    if (error)
      *error = why;
    return E_FAIL;
  }
  document = VORIDOMDocument_var::Adopt(new VORIDOMDocument(std::move(parsed)));
  return S_OK;
}
