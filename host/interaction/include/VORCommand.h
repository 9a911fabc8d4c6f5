// Node of the command tree: commands, agents, dialogs and reps. Notifications travel from a
// sender up the father chain while each receiver asks for propagation; a command's own event
// publisher delivers notifications to subscribers. Commands are released with deferred
// destruction (RequestDelayedDestruction), never deleted directly.
#pragma once

#include <vector>

#include <absl/container/inlined_vector.h>

#include "VOREventSubscriber.h"
#include "VORString.h"

using VORStatusChangeRC = int;
inline constexpr VORStatusChangeRC VORStatusChangeRCCompleted = 0;
inline constexpr VORStatusChangeRC VORStatusChangeRCAborted = 1;

// What AnalyseNotification asks SendNotification to do next.
enum VORNotifPropagation { VORNotifDontPropagate = 0, VORNotifPropagate = 1 };

class VORCommand;
// Most commands have no child or one (a rep and its manipulator): no storage of their own.
using VORCommandChildren = absl::InlinedVector<VORCommand*, 2>;

class VORCommand : public VOREventSubscriber {
  VOR_DECLARE_CLASS(VORCommand, VOREventSubscriber)
 public:
  // father is not held: a father outlives its children or detaches them when it dies.
  explicit VORCommand(VORCommand* father = nullptr, const VORString& name = VORString());

  const VORString& GetName() const { return _name; }
  void SetName(const VORString& name) { _name = name; }
  VORCommand* GetFather() const { return _father; }
  void SetFather(VORCommand* father);
  // The commands whose father this is, in order of attachment (not held).
  const VORCommandChildren& GetChildren() const { return _children; }

  // Delivers notification to `to`, then to its fathers while each answers VORNotifPropagate.
  // The sender seen by every receiver is this command.
  void SendNotification(VORCommand* to, VORNotification* notification);
  // Default: nothing handled, propagate to the father.
  virtual VORNotifPropagation AnalyseNotification(VORCommand* from, VORNotification* notification);

  virtual VORStatusChangeRC Activate(VORCommand* from, VORNotification* notification);
  virtual VORStatusChangeRC Desactivate(VORCommand* from, VORNotification* notification);
  virtual VORStatusChangeRC Cancel(VORCommand* from, VORNotification* notification);

  // The command's notification dispatcher (created on first use, owned by the command).
  VOREventPublisher* GetEventPublisher();
  // Dispatches notification on this command's publisher under its class name.
  int DispatchNotification(VORNotification* notification);

  // Queues the release of the creator's reference; the event loop drains the queue.
  void RequestDelayedDestruction();

 protected:
  ~VORCommand() override;

 private:
  VORString _name;
  VORCommand* _father = nullptr;
  VORCommandChildren _children;
  VORHandle<VOREventPublisher> _publisher;
};

VOR_DECLARE_HANDLE(VORCommand);
