// Process-level parser set-up and the hardened DOM parse.
#include "VORXercesPlatform.h"

#include <xercesc/dom/DOM.hpp>
#include <xercesc/framework/MemBufInputSource.hpp>
#include <xercesc/framework/MemoryManager.hpp>
#include <xercesc/framework/Wrapper4InputSource.hpp>
#include <xercesc/parsers/DOMLSParserImpl.hpp>
#include <xercesc/util/OutOfMemoryException.hpp>
#include <xercesc/util/PanicHandler.hpp>
#include <xercesc/util/XMLNetAccessor.hpp>
#include <xercesc/util/PlatformUtils.hpp>
#include <xercesc/util/SecurityManager.hpp>
#include <xercesc/util/TransService.hpp>
#include <xercesc/util/XMLUni.hpp>

#include <cstdlib>
#include <new>
#include <unordered_map>

#include "VORFileIO.h"
#include "VORUnicodeString.h"
#include "VORXercesSupport.h"

using namespace xercesc;

namespace {

bool gInitialized = false;

class ThrowingPanicHandler : public PanicHandler {
 public:
  void panic(const PanicReasons reason) override {
    throw VORXercesPanic(std::string("XML parser panic: ") + getPanicReasonString(reason));
  }
};

ThrowingPanicHandler& PanicHandlerInstance() {
  static ThrowingPanicHandler handler;
  return handler;
}

// Records the first error with its position.
class FirstErrorHandler : public DOMErrorHandler {
 public:
  bool handleError(const DOMError& e) override {
    if (e.getSeverity() == DOMError::DOM_SEVERITY_WARNING)
      return true;
    if (!failed) {
      failed = true;
      message = VORXercesPlatform::ToUTF8(e.getMessage());
      if (DOMLocator* l = e.getLocation()) {
        line = static_cast<long>(l->getLineNumber());
        column = static_cast<long>(l->getColumnNumber());
      }
    }
    return false;
  }
  bool failed = false;
  std::string message;
  long line = 0;
  long column = 0;
};

// Never resolves anything: no external entity, DTD or schema is ever read.
// Resolves nothing: remembers that something external was asked for, so that the parse is
// refused even where the parser would carry on without it.
class NullResolver : public DOMLSResourceResolver {
 public:
  DOMLSInput* resolveResource(const XMLCh*, const XMLCh*, const XMLCh*, const XMLCh*,
                              const XMLCh*) override {
    asked = true;
    return nullptr;
  }
  bool asked = false;
};

bool IsSet(const XMLCh* text) {
  return text != nullptr && *text != 0;
}

// True when the document type names an external DTD or declares an external entity.
bool NamesSomethingExternal(const DOMDocument* document) {
  const DOMDocumentType* type = document->getDoctype();
  if (type == nullptr)
    return false;
  if (IsSet(type->getSystemId()) || IsSet(type->getPublicId()))
    return true;
  const DOMNamedNodeMap* entities = type->getEntities();
  for (XMLSize_t i = 0; entities != nullptr && i < entities->getLength(); ++i) {
    const auto* entity = static_cast<const DOMEntity*>(entities->item(i));
    if (IsSet(entity->getSystemId()) || IsSet(entity->getPublicId()))
      return true;
  }
  return false;
}

// Bounds the nesting depth and remembers where each element starts (byte offset).
class DepthFilter : public DOMLSParserFilter {
 public:
  DepthFilter(int maxDepth) : _maxDepth(maxDepth) {}
  FilterAction startElement(DOMElement* element) override {
    if (++_depth > _maxDepth) {
      tooDeep = true;
      return FILTER_INTERRUPT;
    }
    if (parser != nullptr) {
      offsets[element] = parser->getSrcOffset();
      if (progress && total > 0 && ++_elements % 4096 == 0)
        progress(static_cast<double>(parser->getSrcOffset()) / static_cast<double>(total));
    }
    return FILTER_ACCEPT;
  }
  FilterAction acceptNode(DOMNode* node) override {
    if (node->getNodeType() == DOMNode::ELEMENT_NODE)
      --_depth;
    return FILTER_ACCEPT;
  }
  DOMNodeFilter::ShowType getWhatToShow() const override { return DOMNodeFilter::SHOW_ELEMENT; }

  DOMLSParserImpl* parser = nullptr;
  std::function<void(double)> progress;
  std::size_t total = 0;
  bool tooDeep = false;
  std::unordered_map<const DOMElement*, XMLFilePos> offsets;

 private:
  int _depth = 0;
  int _maxDepth;
  long _elements = 0;
};

std::string Where(const std::string& name, long line, long column) {
  return name + ":" + std::to_string(line) + ":" + std::to_string(column);
}

}  // namespace

struct VORXercesPlatform::Document::Impl {
  std::unique_ptr<VORBudgetMemoryManager> memory;
  std::unique_ptr<FirstErrorHandler> errors;
  std::unique_ptr<NullResolver> resolver;
  std::unique_ptr<DepthFilter> filter;
  std::unique_ptr<SecurityManager> security;
  DOMLSParser* parser = nullptr;
  DOMDocument* document = nullptr;
  std::string content;  // for positions

  ~Impl() {
    if (parser != nullptr)
      parser->release();  // releases the document too
  }
};

namespace VORXercesPlatform {

bool Initialize(std::string* error) {
  if (gInitialized)
    return true;
  try {
    XMLPlatformUtils::Initialize(XMLUni::fgXercescDefaultLocale, nullptr, &PanicHandlerInstance());
  } catch (const XMLException& e) {
    if (error)
      *error = "XML parser initialisation failed: " + ToUTF8(e.getMessage());
    return false;
  } catch (const std::exception& e) {
    if (error)
      *error = e.what();
    return false;
  }
  // No parser of this process may open a network connection.
  delete XMLPlatformUtils::fgNetAccessor;
  XMLPlatformUtils::fgNetAccessor = nullptr;
  gInitialized = true;
  return true;
}

void Terminate() {
  if (!gInitialized)
    return;
  XMLPlatformUtils::Terminate();
  gInitialized = false;
}

bool IsInitialized() {
  return gInitialized;
}

Document::Document() = default;
Document::~Document() = default;
Document::Document(Document&&) noexcept = default;
Document& Document::operator=(Document&&) noexcept = default;

bool Document::ElementPosition(const xercesc::DOMElement* element, long& line, long& column) const {
  line = column = 0;
  if (!_impl || element == nullptr)
    return false;
  auto it = _impl->filter->offsets.find(element);
  if (it == _impl->filter->offsets.end())
    return false;
  const std::string& text = _impl->content;
  size_t end = std::min<size_t>(static_cast<size_t>(it->second), text.size());
  size_t start = text.rfind('<', end == 0 ? 0 : end - 1);
  if (start == std::string::npos)
    start = 0;
  line = 1;
  size_t lineStart = 0;
  for (size_t i = 0; i < start; ++i) {
    if (text[i] == '\n') {
      ++line;
      lineStart = i + 1;
    }
  }
  column = static_cast<long>(start - lineStart) + 1;
  return true;
}

xercesc::DOMDocument* Document::get() const {
  return _impl ? _impl->document : nullptr;
}

Document ParseMemory(const std::string& content, const std::string& name, std::string& error,
                     const ParseLimits& limits) {
  Document result;
  error.clear();
  if (!Initialize(&error))
    return result;
  if (content.size() > limits.maxFileBytes) {
    error = name + ": file larger than " + std::to_string(limits.maxFileBytes) + " bytes";
    return result;
  }
  if (!CheckRawText(content, name, error, limits))
    return result;
  auto impl = std::make_unique<Document::Impl>();
  impl->memory = std::make_unique<VORBudgetMemoryManager>(limits.maxMemoryBytes);
  impl->errors = std::make_unique<FirstErrorHandler>();
  impl->resolver = std::make_unique<NullResolver>();
  impl->filter = std::make_unique<DepthFilter>(limits.maxDepth);
  impl->filter->progress = limits.progress;
  impl->filter->total = content.size();
  impl->security = std::make_unique<SecurityManager>();
  impl->security->setEntityExpansionLimit(100);
  try {
    static const XMLCh ls[] = {chLatin_L, chLatin_S, chNull};
    DOMImplementation* dom = DOMImplementationRegistry::getDOMImplementation(ls);
    DOMLSParser* parser = static_cast<DOMImplementationLS*>(dom)->createLSParser(
        DOMImplementationLS::MODE_SYNCHRONOUS, nullptr, impl->memory.get());
    impl->parser = parser;
    impl->filter->parser = dynamic_cast<DOMLSParserImpl*>(parser);
    DOMConfiguration* c = parser->getDomConfig();
    c->setParameter(XMLUni::fgDOMDisallowDoctype, !limits.acceptInternalDoctype);
    c->setParameter(XMLUni::fgXercesCalculateSrcOfs, true);
    // With a DOCTYPE accepted, an external DTD goes to the resolver, which refuses it.
    c->setParameter(XMLUni::fgXercesLoadExternalDTD, limits.acceptInternalDoctype);
    c->setParameter(XMLUni::fgXercesDisableDefaultEntityResolution, true);
    c->setParameter(XMLUni::fgDOMResourceResolver, impl->resolver.get());
    c->setParameter(XMLUni::fgXercesSecurityManager, impl->security.get());
    c->setParameter(XMLUni::fgDOMValidate, false);
    c->setParameter(XMLUni::fgDOMValidateIfSchema, false);
    c->setParameter(XMLUni::fgXercesSchema, false);
    c->setParameter(XMLUni::fgXercesDoXInclude, false);
    c->setParameter(XMLUni::fgDOMNamespaces, false);
    c->setParameter(XMLUni::fgDOMEntities, false);
    c->setParameter(XMLUni::fgDOMComments, false);
    c->setParameter(XMLUni::fgDOMElementContentWhitespace, false);
    c->setParameter(XMLUni::fgDOMErrorHandler, impl->errors.get());
    parser->setFilter(impl->filter.get());
    impl->filter->offsets.reserve(content.size() / 64);

    MemBufInputSource source(reinterpret_cast<const XMLByte*>(content.data()), content.size(),
                             FromUTF8(name).c_str(), false, impl->memory.get());
    Wrapper4InputSource input(&source, false, impl->memory.get());
    impl->document = parser->parse(&input);
  } catch (const OutOfMemoryException&) {
    error = name + ": refused, the document needs more than " +
            std::to_string(limits.maxMemoryBytes >> 20) + " MiB to parse";
  } catch (const XMLException& e) {
    error = Where(name, static_cast<long>(e.getSrcLine()), 0) + ": " + ToUTF8(e.getMessage());
  } catch (const DOMException& e) {
    error = name + ": " + ToUTF8(e.getMessage());
  } catch (const VORXercesPanic& e) {
    error = name + ": " + e.what();
  }
  if (impl->filter->tooDeep) {
    error = name + ": elements nested deeper than " + std::to_string(limits.maxDepth);
    return result;
  }
  const bool external = impl->resolver->asked ||
                        (impl->document != nullptr && NamesSomethingExternal(impl->document));
  if (external) {
    error = name + ": refers to an external DTD or entity, which is refused";
    return result;
  }
  if (!error.empty())
    return result;
  if (impl->errors->failed) {
    error = Where(name, impl->errors->line, impl->errors->column) + ": " + impl->errors->message;
    return result;
  }
  if (impl->document == nullptr || impl->document->getDocumentElement() == nullptr) {
    error = name + ": no document element";
    return result;
  }
  impl->content = content;
  result._impl = std::move(impl);
  return result;
}

Document ParseFile(const std::string& path, std::string& error, const ParseLimits& limits) {
  std::string content;
  if (!VORReadFile(path, content, error, limits.maxFileBytes))
    return {};
  return ParseMemory(content, path, error, limits);
}

std::string ToUTF8(const XMLCh* text) {
  std::string out;
  if (text == nullptr)
    return out;
  for (const XMLCh* p = text; *p != 0; ++p) {
    char32_t c = static_cast<char16_t>(*p);
    if (c >= 0xD800 && c < 0xDC00 && p[1] >= 0xDC00 && p[1] < 0xE000) {
      c = 0x10000 + ((c - 0xD800) << 10) + (static_cast<char16_t>(p[1]) - 0xDC00);
      ++p;
    } else if (c >= 0xD800 && c < 0xE000) {
      c = 0xFFFD;  // a lone surrogate
    }
    if (c < 0x80) {
      out += static_cast<char>(c);
    } else if (c < 0x800) {
      out += static_cast<char>(0xC0 | (c >> 6));
      out += static_cast<char>(0x80 | (c & 0x3F));
    } else if (c < 0x10000) {
      out += static_cast<char>(0xE0 | (c >> 12));
      out += static_cast<char>(0x80 | ((c >> 6) & 0x3F));
      out += static_cast<char>(0x80 | (c & 0x3F));
    } else {
      out += static_cast<char>(0xF0 | (c >> 18));
      out += static_cast<char>(0x80 | ((c >> 12) & 0x3F));
      out += static_cast<char>(0x80 | ((c >> 6) & 0x3F));
      out += static_cast<char>(0x80 | (c & 0x3F));
    }
  }
  return out;
}

std::u16string FromUTF8(const std::string& text) {
  return VORUnicodeString(text).ConvertToUTF16();
}

}  // namespace VORXercesPlatform
