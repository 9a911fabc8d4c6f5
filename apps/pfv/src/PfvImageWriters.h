// Chart picture writers by file extension, so that "pfv export" writes every format the build
// supports: the export command writes SVG itself and asks here for the others (PNG and
// PDF are registered by PfvRegisterCommands when the Qt shell is built in).
#pragma once

#include <functional>
#include <memory>
#include <string>
#include <vector>

class VORViewer;

// Writes the viewer's scene to path; false with a reason in error.
using PfvImageWriter =
    std::function<bool(VORViewer& viewer, const std::string& path, std::string& error)>;

// Registers writer for extension (lower case, without the dot; a later one replaces it).
bool PfvRegisterImageWriter(const std::string& extension, PfvImageWriter writer);
// The writer for the extension of path (case-insensitive), or null.
const PfvImageWriter* PfvFindImageWriter(const std::string& path);
// The registered extensions, sorted.
std::vector<std::string> PfvImageWriterExtensions();

// Writers of documents of several charts (PDF when the window is built in): a contents page,
// then one chart per page, written when finished.
class PfvBookWriter {
 public:
  virtual ~PfvBookWriter() = default;
  virtual void AddContents(const std::vector<std::string>& titles) = 0;
  virtual void AddChart(const std::string& title, VORViewer& viewer) = 0;
  virtual bool Finish(const std::string& path, std::string& error) = 0;
};
using PfvBookWriterFactory =
    std::function<std::unique_ptr<PfvBookWriter>(const std::string& documentTitle)>;
bool PfvRegisterBookWriter(const std::string& extension, PfvBookWriterFactory factory);
// The factory for the extension of path (case-insensitive), or null.
const PfvBookWriterFactory* PfvFindBookWriter(const std::string& path);
