// Trace channels. Off by default; a channel is on when the environment variable VOR_TRACE
// names it (a ',' or ':' separated list; "all" for every channel). Lines go to stderr, or to
// a sink that tests install to capture them.
#pragma once

#include <functional>
#include <string>

class VORTrace {
 public:
  // mode, output ("STDERR") and buffer size are accepted for the module's calls; output is
  // always stderr here and each line is flushed at once.
  VORTrace(const char* channel, int mode = 0, const char* output = "STDERR", int bufferSize = 1024);

  bool IsActive() const;
  // Writes text followed by a newline when the channel is on.
  void TraPrint(const std::string& text) const;
  const std::string& Channel() const { return _channel; }

  using Sink = std::function<void(const std::string& channel, const std::string& line)>;
  // Replaces the output for every channel; an empty sink restores stderr.
  static void SetSink(Sink sink);
  // Forces channels on or off regardless of the environment (tests); empty resets to the
  // environment.
  static void SetEnabledChannels(const std::string& channels);

 private:
  std::string _channel;
};
