// Shared by the ZitBlt tests: a temporary start-up directory searched before the bundled
// resources, icons of a chosen size written into it, and a command that counts what its child
// reps send on.
#pragma once

#include <gtest/gtest.h>
#include <stb/stb_image_write.h>
#include <unistd.h>

#include <filesystem>
#include <fstream>
#include <string>
#include <vector>

#include "QELZitBltConfiguration.h"
#include "TempDir.h"
#include "VORCommand.h"
#include "VORDeferredDeletion.h"
#include "VORManipulator.h"

class ZitBltStartupDir {
 public:
  ZitBltStartupDir() : _dir(_temp.Path()) {
    std::filesystem::create_directories(_dir / "icons");
    const char* old = getenv("VORStartupPath");
    _old = old ? old : "";
    setenv("VORStartupPath", (_dir.string() + (_old.empty() ? "" : ":" + _old)).c_str(), 1);
    QELZitBltConfiguration::ForgetForTests();
  }
  ~ZitBltStartupDir() {
    QELZitBltConfiguration::ForgetForTests();
    setenv("VORStartupPath", _old.c_str(), 1);
  }
  // A red icon of width x height pixels (4 pixels per model unit).
  void WriteIcon(const std::string& name, int width, int height) const {
    std::vector<unsigned char> pixels(static_cast<size_t>(width * height * 3), 0);
    for (size_t i = 0; i < pixels.size(); i += 3)
      pixels[i] = 200;
    stbi_write_bmp((_dir / "icons" / (name + ".bmp")).c_str(), width, height, 3, pixels.data());
  }
  void WriteConfig(const std::string& xml) const { std::ofstream(_dir / "zitbltcfg.xml") << xml; }
  const std::filesystem::path& Path() const { return _dir; }

 private:
  TempDir _temp;
  std::filesystem::path _dir;
  std::string _old;
};

// Counts the manipulator notifications that reach it, by kind.
class NotificationCounter : public VORCommand {
 public:
  VORNotifPropagation AnalyseNotification(VORCommand*, VORNotification* n) override {
    auto* m = dynamic_cast<VORManipulatorNotification*>(n);
    if (m != nullptr)
      events.push_back(m->GetEventName());
    return VORNotifDontPropagate;
  }
  std::vector<std::string> events;
};
