#include "VORTrace.h"

#include <cstdio>
#include <optional>
#include <sstream>
#include <unordered_set>

#include "VOREnv.h"

namespace {
VORTrace::Sink& CurrentSink() {
  static VORTrace::Sink sink;
  return sink;
}
std::optional<std::string>& Forced() {
  static std::optional<std::string> forced;
  return forced;
}
bool ListNames(const std::string& list, const std::string& channel) {
  std::string normalised = list;
  for (char& c : normalised) {
    if (c == ':')
      c = ',';
  }
  std::istringstream names(normalised);
  for (std::string name; std::getline(names, name, ',');) {
    if (name == channel || name == "all")
      return true;
  }
  return false;
}
}  // namespace

VORTrace::VORTrace(const char* channel, int, const char*, int) : _channel(channel ? channel : "") {}

bool VORTrace::IsActive() const {
  if (Forced())
    return ListNames(*Forced(), _channel);
  const char* env = VORGetEnv("VOR_TRACE");
  return env != nullptr && ListNames(env, _channel);
}

void VORTrace::TraPrint(const std::string& text) const {
  if (!IsActive())
    return;
  if (CurrentSink()) {
    CurrentSink()(_channel, text);
    return;
  }
  std::fprintf(stderr, "%s\n", text.c_str());
  std::fflush(stderr);
}

void VORTrace::SetSink(Sink sink) {
  CurrentSink() = std::move(sink);
}

void VORTrace::SetEnabledChannels(const std::string& channels) {
  if (channels.empty()) {
    Forced().reset();
  } else {
    Forced() = channels;
  }
}
