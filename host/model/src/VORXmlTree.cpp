#include "VORXmlTree.h"

#include <xercesc/framework/MemBufInputSource.hpp>
#include <xercesc/sax/SAXParseException.hpp>
#include <xercesc/sax2/Attributes.hpp>
#include <xercesc/sax2/DefaultHandler.hpp>
#include <xercesc/sax2/SAX2XMLReader.hpp>
#include <xercesc/sax2/XMLReaderFactory.hpp>
#include <xercesc/util/OutOfMemoryException.hpp>
#include <xercesc/util/SecurityManager.hpp>
#include <xercesc/util/XMLUni.hpp>

#include <algorithm>
#include <memory>

#include "VORXercesSupport.h"

using namespace xercesc;

namespace {
constexpr size_t kValueChunk = size_t{1} << 20;

struct NameHash {
  using is_transparent = void;
  size_t operator()(std::u16string_view s) const { return std::hash<std::u16string_view>{}(s); }
};

// Thrown out of the parser when the handler refuses what it sees.
struct Refusal {
  std::string message;
};
}  // namespace

class VORXmlTreeBuilder : public DefaultHandler {
 public:
  VORXmlTreeBuilder(VORXmlTree& tree, SAX2XMLReader& reader,
                    const VORXercesPlatform::ParseLimits& l)
      : _tree(tree), _reader(reader), _limits(l) {}

  void startElement(const XMLCh*, const XMLCh*, const XMLCh* qname, const Attributes& a) override {
    using Index = VORXmlTree::Index;
    if (static_cast<int>(_open.size()) >= _limits.maxDepth)
      throw Refusal{"elements nested deeper than " + std::to_string(_limits.maxDepth)};
    const Index self = static_cast<Index>(_tree._elements.size());
    // The parser is just past the start tag: its beginning is the last '<' before.
    const size_t end = std::min<size_t>(_reader.getSrcOffset(), _tree._source.size());
    const size_t begin = end == 0 ? 0 : _tree._source.rfind('<', end - 1);
    VORXmlTree::Element e{Intern(qname),
                          static_cast<Index>(_tree._attributes.size()),
                          static_cast<Index>(a.getLength()),
                          VORXmlTree::kNone,
                          VORXmlTree::kNone,
                          static_cast<Index>(begin == std::string_view::npos ? 0 : begin)};
    for (XMLSize_t i = 0; i < a.getLength(); ++i)
      _tree._attributes.push_back({Intern(a.getQName(i)), Store(a.getValue(i))});
    _tree._elements.push_back(e);
    if (!_open.empty()) {
      auto& [parent, last] = _open.back();
      if (last == VORXmlTree::kNone)
        _tree._elements[parent].firstChild = self;
      else
        _tree._elements[last].nextSibling = self;
      last = self;
    }
    _open.push_back({self, VORXmlTree::kNone});
    if (_limits.progress && ++_count % 4096 == 0)
      _limits.progress(static_cast<double>(end) / static_cast<double>(_tree._source.size()));
  }
  void endElement(const XMLCh*, const XMLCh*, const XMLCh*) override { _open.pop_back(); }

  void startDTD(const XMLCh*, const XMLCh*, const XMLCh*) override {
    throw Refusal{"a DOCTYPE is not allowed in this file"};
  }
  InputSource* resolveEntity(const XMLCh*, const XMLCh*) override { return nullptr; }
  void warning(const SAXParseException&) override {}
  void error(const SAXParseException& e) override { fatalError(e); }
  void fatalError(const SAXParseException& e) override {
    if (failed)
      return;
    failed = true;
    message = VORXercesPlatform::ToUTF8(e.getMessage());
    line = static_cast<long>(e.getLineNumber());
    column = static_cast<long>(e.getColumnNumber());
  }

  bool failed = false;
  std::string message;
  long line = 0, column = 0;

 private:
  VORXmlTree::Index Intern(const XMLCh* name) {
    std::u16string_view key(reinterpret_cast<const char16_t*>(name));
    auto it = _ids.find(key);
    if (it != _ids.end())
      return it->second;
    const auto id = static_cast<VORXmlTree::Index>(_tree._names.size());
    _tree._names.push_back(VORXercesPlatform::ToUTF8(name));
    _ids.emplace(std::u16string(key), id);
    return id;
  }
  std::string_view Store(const XMLCh* value) {
    const std::string text = VORXercesPlatform::ToUTF8(value);
    auto& chunks = _tree._values;
    if (chunks.empty() || chunks.back().size() + text.size() > chunks.back().capacity()) {
      chunks.emplace_back();
      chunks.back().reserve(std::max(kValueChunk, text.size()));
    }
    std::string& chunk = chunks.back();
    const size_t at = chunk.size();
    chunk += text;  // within the capacity: earlier views stay valid
    return std::string_view(chunk).substr(at, text.size());
  }

  VORXmlTree& _tree;
  SAX2XMLReader& _reader;
  const VORXercesPlatform::ParseLimits& _limits;
  std::vector<std::pair<VORXmlTree::Index, VORXmlTree::Index>> _open;  // element, last child
  std::unordered_map<std::u16string, VORXmlTree::Index, NameHash, std::equal_to<>> _ids;
  long _count = 0;
};

bool VORXmlTree::Parse(const std::string& content, const std::string& name, std::string& error,
                       const VORXercesPlatform::ParseLimits& limits) {
  *this = VORXmlTree();
  _source = content;
  error.clear();
  if (!VORXercesPlatform::Initialize(&error))
    return false;
  if (content.size() > limits.maxFileBytes) {
    error = name + ": file larger than " + std::to_string(limits.maxFileBytes) + " bytes";
    return false;
  }
  if (content.size() >= kNone) {
    error = name + ": file too large";
    return false;
  }
  if (!VORXercesPlatform::CheckRawText(content, name, error, limits))
    return false;
  // Every element starts with '<' and every attribute has its '=': counting them (a fast scan)
  // bounds both tables, so that neither is copied while it grows.
  _elements.reserve(static_cast<size_t>(std::count(content.begin(), content.end(), '<')));
  _attributes.reserve(static_cast<size_t>(std::count(content.begin(), content.end(), '=')));

  VORBudgetMemoryManager memory(limits.maxMemoryBytes);
  SecurityManager security;
  security.setEntityExpansionLimit(100);
  std::string refusal;
  bool failed = false;
  long line = 0, column = 0;
  try {
    std::unique_ptr<SAX2XMLReader> reader(XMLReaderFactory::createXMLReader(&memory));
    reader->setFeature(XMLUni::fgSAX2CoreNameSpaces, false);
    reader->setFeature(XMLUni::fgSAX2CoreNameSpacePrefixes, false);
    reader->setFeature(XMLUni::fgSAX2CoreValidation, false);
    reader->setFeature(XMLUni::fgXercesDynamic, false);
    reader->setFeature(XMLUni::fgXercesSchema, false);
    reader->setFeature(XMLUni::fgXercesLoadExternalDTD, false);
    reader->setFeature(XMLUni::fgXercesDisableDefaultEntityResolution, true);
    reader->setFeature(XMLUni::fgXercesCalculateSrcOfs, true);
    reader->setProperty(XMLUni::fgXercesSecurityManager, &security);
    VORXmlTreeBuilder builder(*this, *reader, limits);
    reader->setContentHandler(&builder);
    reader->setErrorHandler(&builder);
    reader->setEntityResolver(&builder);
    reader->setLexicalHandler(&builder);
    reader->setDTDHandler(&builder);
    const std::u16string id = VORXercesPlatform::FromUTF8(name);
    MemBufInputSource source(reinterpret_cast<const XMLByte*>(content.data()), content.size(),
                             reinterpret_cast<const XMLCh*>(id.c_str()), false, &memory);
    try {
      reader->parse(source);
    } catch (const Refusal& r) {
      refusal = r.message;
      const size_t at = std::min<size_t>(reader->getSrcOffset(), content.size());
      const size_t begin = at == 0 ? 0 : content.rfind('<', at - 1);
      Element where{0,     0,     0,
                    kNone, kNone, static_cast<Index>(begin == std::string::npos ? 0 : begin)};
      _elements.push_back(where);
      Position(static_cast<Index>(_elements.size() - 1), line, column);
    }
    failed = builder.failed;
    if (failed && refusal.empty()) {
      refusal = builder.message;
      line = builder.line;
      column = builder.column;
    }
  } catch (const OutOfMemoryException&) {
    error = name + ": refused, the document needs more than " +
            std::to_string(limits.maxMemoryBytes >> 20) + " MiB to parse";
  } catch (const XMLException& e) {
    error = name + ":" + std::to_string(e.getSrcLine()) +
            ":0: " + VORXercesPlatform::ToUTF8(e.getMessage());
  } catch (const VORXercesPanic& e) {
    error = name + ": " + e.what();
  }
  if (error.empty() && !refusal.empty())
    error = name + ":" + std::to_string(line) + ":" + std::to_string(column) + ": " + refusal;
  if (error.empty() && _elements.empty())
    error = name + ": no document element";
  if (!error.empty()) {
    *this = VORXmlTree();
    return false;
  }
  return true;
}

const std::string_view* VORXmlTree::Find(Index e, std::string_view attribute) const {
  const Element& element = _elements[e];
  for (Index i = element.firstAttribute; i < element.firstAttribute + element.attributeCount; ++i) {
    if (_names[_attributes[i].name] == attribute)
      return &_attributes[i].value;
  }
  return nullptr;
}

void VORXmlTree::Position(Index e, long& line, long& column) const {
  const size_t at = std::min<size_t>(_elements[e].offset, _source.size());
  line = 1;
  size_t lineStart = 0;
  for (size_t i = 0; i < at; ++i) {
    if (_source[i] == '\n') {
      ++line;
      lineStart = i + 1;
    }
  }
  column = 1;
  for (size_t i = lineStart; i < at; ++i)
    column += (static_cast<unsigned char>(_source[i]) & 0xC0) != 0x80;
}
