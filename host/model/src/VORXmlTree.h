// A whole XML file read with the streaming parser into a compact tree: element and attribute
// names interned, attribute values as UTF-8 in one buffer, element positions as byte offsets
// turned into line and column only when a message needs them. A 55 MB document takes a few
// times its size, where a DOM takes ten.
#pragma once

#include <cstdint>
#include <string>
#include <string_view>
#include <unordered_map>
#include <vector>

#include "VORXercesPlatform.h"

class VORXmlTree {
 public:
  using Index = std::uint32_t;
  static constexpr Index kNone = ~Index{0};

  // Parses content (name stands for the file in messages) with the same hardening as the DOM
  // parse: raw text checked first, no DOCTYPE, nothing external, bounded depth and memory.
  // False with error = "<name>:<line>:<column>: <message>". content must outlive the tree.
  bool Parse(const std::string& content, const std::string& name, std::string& error,
             const VORXercesPlatform::ParseLimits& limits = {});

  Index Root() const { return _elements.empty() ? kNone : 0; }
  Index FirstChild(Index e) const { return _elements[e].firstChild; }
  Index Next(Index e) const { return _elements[e].nextSibling; }
  std::string_view Name(Index e) const { return _names[_elements[e].name]; }
  // The attribute's value, or nullptr when the element does not have it.
  const std::string_view* Find(Index e, std::string_view attribute) const;
  // Line and column (1-based) where the element's start tag begins.
  void Position(Index e, long& line, long& column) const;
  size_t Size() const { return _elements.size(); }

 private:
  friend class VORXmlTreeBuilder;
  struct Element {
    Index name, firstAttribute, attributeCount, firstChild, nextSibling, offset;
  };
  struct Attribute {
    Index name;
    std::string_view value;  // into _values
  };
  std::vector<Element> _elements;
  std::vector<Attribute> _attributes;
  std::vector<std::string> _names;
  std::vector<std::string> _values;  // chunks that never move once filled
  std::string_view _source;
};
