// An agent of a state command: it gets an output (a value and/or a notification) that fires the
// transitions conditioned on it. The plain dialog agent accepts on named notifications of other
// commands, typically a dialog's OK, Cancel or window-close notification.
#pragma once

#include <functional>

#include "VORCommand.h"

class VORDialogAgent;
class VORDialogState;

// Sent by an agent to its father (the state command) when its output is set.
class VORAgentOutputNotification : public VORNotification {
  VOR_DECLARE_CLASS(VORAgentOutputNotification, VORNotification)
 public:
  explicit VORAgentOutputNotification(VORDialogAgent* agent) : _agent(agent) {}
  VORDialogAgent* GetAgent() const { return _agent; }

 private:
  VORDialogAgent* _agent;
};

// Filter of an agent: the agent and the filter's data; true accepts the candidate value.
using VORAgentFilter = std::function<bool(VORDialogAgent* agent, void* data)>;

// A filter that calls a member function of object.
template <class C>
VORAgentFilter VORMethodFilter(C* object, bool (C::*method)(VORDialogAgent*, void*)) {
  return [object, method](VORDialogAgent* agent, void* data) {
    return (object->*method)(agent, data);
  };
}

class VORDialogAgent : public VORCommand {
  VOR_DECLARE_CLASS(VORDialogAgent, VORCommand)
 public:
  explicit VORDialogAgent(const VORString& name);

  // The output is set whenever sender's publisher dispatches a notification of that class name.
  void AcceptOnNotify(VORCommand* sender, const char* notificationName);
  void AcceptOnNotify(VOREventPublisher* publisher, const char* notificationName);

  bool IsOutputSet() const { return _outputSet; }
  // The value the agent took (the picked object for a path agent); null for a plain agent.
  VORBaseUnknown_var GetValue() const { return _value; }
  // The notification that set the output last (null when none).
  VORNotification* GetLastNotification() const { return _lastNotification.get(); }

  // Sets the output at once, as if the user had acted (for example to end a command whose
  // dialog could not be shown). It fires when the agent's state is or becomes current.
  void Accept() { SetOutput(nullptr, nullptr); }
  // A state command makes the agents of its current state active; notifications reaching an
  // inactive agent are ignored. Agents outside any state command are always active.
  bool IsActive() const { return _active; }
  void SetActive(bool active) { _active = active; }

  // Forgets the output and the value; notifications stay subscribed.
  virtual void Reset();
  // The engine clears the output flag once a transition consumed it; the value stays readable.
  void ClearOutput() { _outputSet = false; }

  // The resource file of the command's texts; the host's default for index 0 and above.
  virtual VORString GetResourceFilename(int index = 0) const;
  static const char* DefaultResourceFilename() { return "VORDialogEngine"; }

  // The state this agent was added to (set by VORDialogState::AddDialogAgent).
  VORDialogState* GetState() const { return _state; }
  void SetState(VORDialogState* state) { _state = state; }

 protected:
  ~VORDialogAgent() override;
  // Sets value and output and tells the father (the state command).
  void SetOutput(VORBaseUnknown* value, VORNotification* notification);
  void SetValue(VORBaseUnknown* value) { _value = value; }

 private:
  bool _outputSet = false;
  bool _active = true;
  VORBaseUnknown_var _value;
  VORHandle<VORNotification> _lastNotification;
  VORDialogState* _state = nullptr;
};

VOR_DECLARE_HANDLE(VORDialogAgent);
