// Process-level set-up of the XML parser and the hardened DOM parse that every XML reader of
// the application uses: no DOCTYPE (so no entities, no external DTD; configuration files may
// have one that names nothing external), no network, no validation, bounded depth, memory and
// entity expansion, files read by us, errors with file, line and column.
#pragma once

#include <cstddef>
#include <functional>
#include <memory>
#include <stdexcept>
#include <string>

#include <xercesc/dom/DOMDocument.hpp>

// Thrown by the parser's panic handler instead of exiting the process.
class VORXercesPanic : public std::runtime_error {
 public:
  using std::runtime_error::runtime_error;
};

namespace VORXercesPlatform {
// Initialises the parser once per process (later calls do nothing), removes its network
// accessor and installs a panic handler that throws VORXercesPanic. False with a reason when
// the parser cannot start.
bool Initialize(std::string* error = nullptr);
// Terminates the parser; every DOM document must have been released before.
void Terminate();
bool IsInitialized();

struct ParseLimits {
  std::size_t maxFileBytes = std::size_t{64} << 20;
  std::size_t maxMemoryBytes = std::size_t{256} << 20;
  int maxDepth = 512;
  // Attributes of one element; checked on the raw text, before the parser builds any of them.
  int maxAttributes = 1024;
  // Accepts a DOCTYPE whose internal subset names nothing external (no external DTD, no
  // external entity); entity expansion stays bounded. Configuration files only.
  bool acceptInternalDoctype = false;
  // Called now and then during the parse with the share of the content read so far (0..1).
  std::function<void(double)> progress;
};

// A parsed document, released with its parser.
class Document {
 public:
  Document();
  ~Document();
  Document(Document&&) noexcept;
  Document& operator=(Document&&) noexcept;
  xercesc::DOMDocument* get() const;
  explicit operator bool() const { return get() != nullptr; }
  // Line and column (1-based) where element's start tag begins; false when unknown.
  bool ElementPosition(const xercesc::DOMElement* element, long& line, long& column) const;
  struct Impl;

 private:
  std::unique_ptr<Impl> _impl;
  friend Document ParseMemory(const std::string&, const std::string&, std::string&,
                              const ParseLimits&);
};

// Parses content; name stands for the file in messages. On failure an empty Document and
// error = "<name>:<line>:<column>: <message>".
Document ParseMemory(const std::string& content, const std::string& name, std::string& error,
                     const ParseLimits& limits = {});
// Reads path itself (regular file, size cap) then parses.
Document ParseFile(const std::string& path, std::string& error, const ParseLimits& limits = {});

// Checks the raw text before any parser sees it: no NUL byte, no DOCTYPE (unless
// limits.acceptInternalDoctype: the parse then refuses anything external), no element with more
// than limits.maxAttributes attributes, no nesting deeper than limits.maxDepth. False with
// error = "<name>:<line>:<column>: <what is wrong>".
bool CheckRawText(const std::string& content, const std::string& name, std::string& error,
                  const ParseLimits& limits);

// UTF-16 parser text <-> UTF-8.
std::string ToUTF8(const XMLCh* text);
std::u16string FromUTF8(const std::string& text);
}  // namespace VORXercesPlatform
