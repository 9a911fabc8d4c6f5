// Chart picture writers by file extension, so that "pfv export" writes every format the build
// supports: the export command writes SVG itself and asks here for the others (PNG is
// registered by the window's source file when the Qt shell is built in).
#pragma once

#include <functional>
#include <string>
#include <vector>

class VORViewer;

// Writes the viewer's scene to path; false with a reason in error.
using PfvImageWriter =
    std::function<bool(VORViewer& viewer, const std::string& path, std::string& error)>;

// Registers writer for extension (lower case, without the dot; a later one replaces it).
// Returns true, for static initialisers.
bool PfvRegisterImageWriter(const std::string& extension, PfvImageWriter writer);
// The writer for the extension of path (case-insensitive), or null.
const PfvImageWriter* PfvFindImageWriter(const std::string& path);
// The registered extensions, sorted.
std::vector<std::string> PfvImageWriterExtensions();
