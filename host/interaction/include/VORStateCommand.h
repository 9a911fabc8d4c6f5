// A command written as a state chart: named states holding agents, transitions fired by an
// agent's output (or unconditionally), boolean actions. The chart is built by BuildGraph when
// the command is activated. A transition whose action returns false is not taken: the command
// stays in its state. Reaching the final state ends the command, or restarts it in repeat mode.
#pragma once

#include <functional>
#include <memory>
#include <vector>

#include "VORDialogAgent.h"

class VORPathElement;

using VORActionFn = std::function<bool(void* data)>;

class VORDialogState {
 public:
  explicit VORDialogState(const VORString& name) : _name(name) {}
  const VORString& GetName() const { return _name; }
  // The state holds the agent (one more reference) and makes its command the agent's father.
  void AddDialogAgent(VORDialogAgent* agent);
  const std::vector<VORDialogAgent_var>& GetAgents() const { return _agents; }

 private:
  friend class VORStateCommand;
  VORString _name;
  std::vector<VORDialogAgent_var> _agents;
  class VORStateCommand* _command = nullptr;
};

// Condition of a transition: an agent whose output is set, or nothing (always true).
struct VORCondition {
  VORDialogAgent* agent = nullptr;
};
inline VORCondition IsOutputSetCondition(VORDialogAgent* agent) {
  return VORCondition{agent};
}

struct VORTransition {
  VORDialogState* from;
  VORDialogState* to;  // null: the final state
  VORCondition condition;
  VORActionFn action;
  void* data;
};

// Sent on the command's publisher when it ends (cancelled or finished).
class VORCommandEndNotification : public VORNotification {
  VOR_DECLARE_CLASS(VORCommandEndNotification, VORNotification)
 public:
  VORCommandEndNotification(VORCommand* command, bool cancelled)
      : _command(command), _cancelled(cancelled) {}
  VORCommand* GetCommand() const { return _command; }
  bool IsCancelled() const { return _cancelled; }

 private:
  VORCommand* _command;
  bool _cancelled;
};

class VORStateCommand : public VORDialogAgent {
  VOR_DECLARE_CLASS(VORStateCommand, VORDialogAgent)
 public:
  // engineMode 64: an exclusive command (starting one cancels the running one); commandMode 0:
  // the default. Other values are kept and reported only.
  explicit VORStateCommand(const VORString& identifier, int engineMode = 64, int commandMode = 0);

  const VORString& GetIdentifier() const { return GetName(); }
  int GetEngineMode() const { return _engineMode; }
  int GetCommandMode() const { return _commandMode; }

  virtual void BuildGraph() {}

  // The initial state, created and named on the first call (later names are ignored).
  VORDialogState* GetInitialState(const VORString& name);
  VORDialogState* AddDialogState(const VORString& name);
  // to == null means the final state.
  VORTransition* AddTransition(VORDialogState* from, VORDialogState* to,
                               VORCondition condition = VORCondition{},
                               VORActionFn action = VORActionFn(), void* data = nullptr);
  // Binds a member action: Action(this, &MyCommand::DoIt).
  template <class C>
  static VORActionFn Action(C* object, bool (C::*method)(void*)) {
    return [object, method](void* data) { return (object->*method)(data); };
  }

  void SetRepeatMode(bool on) { _repeat = on; }
  bool GetRepeatMode() const { return _repeat; }

  VORDialogState* GetCurrentState() const { return _current; }
  bool IsRunning() const { return _running; }
  bool IsEnded() const { return _ended; }

  // Starts the command: builds the chart once, enters the initial state.
  VORStatusChangeRC Activate(VORCommand* from, VORNotification* notification) override;
  // Ends the command without running any action.
  VORStatusChangeRC Cancel(VORCommand* from, VORNotification* notification) override;
  // Offers a pick to the path agents of the current state, in order; true when one took it.
  bool OfferPath(VORPathElement* path);
  // Agent outputs arrive here.
  VORNotifPropagation AnalyseNotification(VORCommand* from, VORNotification* notification) override;

 protected:
  ~VORStateCommand() override;

 private:
  void Enter(VORDialogState* state, bool atStart);
  void Evaluate();
  void End(bool cancelled);
  void SetAgentsActive();

  int _engineMode;
  int _commandMode;
  bool _repeat = false;
  bool _built = false;
  bool _running = false;
  bool _ended = false;
  bool _evaluating = false;
  bool _pending = false;
  VORDialogState* _initial = nullptr;
  VORDialogState* _current = nullptr;
  std::vector<std::unique_ptr<VORDialogState>> _states;
  std::vector<std::unique_ptr<VORTransition>> _transitions;
};

VOR_DECLARE_HANDLE(VORStateCommand);
