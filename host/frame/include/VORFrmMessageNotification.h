// A message for the planner that is neither a blocking notification nor the end of a command
// (the verdict on a dropped list item, for instance). Announced on the application frame's
// publisher: the driver records its text as an event line, which a script prints after its
// step and the window shows in its status bar.
#pragma once

#include <string>
#include <utility>

#include "VORApplicationFrame.h"
#include "VORNotification.h"

class VORFrmMessageNotification : public VORNotification {
  VOR_DECLARE_CLASS(VORFrmMessageNotification, VORNotification)
 public:
  explicit VORFrmMessageNotification(std::string text) : _text(std::move(text)) {}
  const std::string& GetText() const { return _text; }

  static void Announce(const std::string& text) {
    auto n = VORHandle<VORFrmMessageNotification>::Adopt(new VORFrmMessageNotification(text));
    VORApplicationFrame::GetApplicationFrame()->GetEventPublisher()->Dispatch(n);
  }

 private:
  std::string _text;
};
