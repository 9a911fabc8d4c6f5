#include "VORStateCommand.h"

#include "VORCommandEngine.h"
#include "VORHSO.h"
#include "VORSelectionContext.h"
#include "VORPathElementAgent.h"

namespace {
// An unconditional cycle of states would never give control back; stop after this many steps.
constexpr int kMaxStepsPerEvent = 10000;
}  // namespace

void VORDialogState::AddDialogAgent(VORDialogAgent* agent) {
  if (agent == nullptr)
    return;
  for (const VORDialogAgent_var& a : _agents) {
    if (a.get() == agent)
      return;
  }
  _agents.emplace_back(agent);
  if (agent->GetState() == nullptr)
    agent->SetState(this);
  if (_command != nullptr)
    agent->SetFather(_command);
}

VORStateCommand::VORStateCommand(const VORString& identifier, int engineMode, int commandMode)
    : VORDialogAgent(identifier), _engineMode(engineMode), _commandMode(commandMode) {}

VORStateCommand::~VORStateCommand() {
  // Agents may outlive the command (deferred deletion): detach them first.
  for (auto& state : _states) {
    for (const VORDialogAgent_var& agent : state->_agents) {
      if (agent->GetFather() == this)
        agent->SetFather(nullptr);
    }
  }
}

VORDialogState* VORStateCommand::GetInitialState(const VORString& name) {
  if (_initial == nullptr)
    _initial = AddDialogState(name);
  return _initial;
}

VORDialogState* VORStateCommand::AddDialogState(const VORString& name) {
  _states.push_back(std::make_unique<VORDialogState>(name));
  _states.back()->_command = this;
  return _states.back().get();
}

VORTransition* VORStateCommand::AddTransition(VORDialogState* from, VORDialogState* to,
                                              VORCondition condition, VORActionFn action,
                                              void* data) {
  if (from == nullptr)
    return nullptr;
  _transitions.push_back(
      std::make_unique<VORTransition>(VORTransition{from, to, condition, std::move(action), data}));
  return _transitions.back().get();
}

VORStatusChangeRC VORStateCommand::Activate(VORCommand*, VORNotification*) {
  if (_running)
    return VORStatusChangeRCCompleted;
  VORStateCommand_var keep(this);
  if (!_built) {
    _built = true;
    BuildGraph();
  }
  if (_initial == nullptr) {
    _running = true;
    End(false);
    return VORStatusChangeRCCompleted;
  }
  _running = true;
  _ended = false;
  _evaluating = true;
  Enter(_initial, true);
  _evaluating = false;
  Evaluate();
  return VORStatusChangeRCCompleted;
}

VORStatusChangeRC VORStateCommand::Cancel(VORCommand*, VORNotification*) {
  if (_running)
    End(true);
  return VORStatusChangeRCCompleted;
}

void VORStateCommand::Enter(VORDialogState* state, bool atStart) {
  _current = state;
  SetAgentsActive();
  if (!atStart)
    return;
  for (const VORDialogAgent_var& agent : state->GetAgents()) {
    auto* pathAgent = dynamic_cast<VORPathElementAgent*>(agent.get());
    if (pathAgent != nullptr && pathAgent->GetCSOClient() != nullptr && !pathAgent->IsOutputSet())
      pathAgent->TakeCurrentSelection();
  }
}

bool VORStateCommand::OfferPath(VORPathElement* path) {
  if (!_running || _current == nullptr || path == nullptr)
    return false;
  VORStateCommand_var keep(this);
  // Copy: an accepted pick may move the command to another state.
  std::vector<VORDialogAgent_var> agents = _current->GetAgents();
  for (const VORDialogAgent_var& agent : agents) {
    if (auto* pathAgent = dynamic_cast<VORPathElementAgent*>(agent.get())) {
      if (pathAgent->OfferPath(path))
        return true;
    }
  }
  return false;
}

VORNotifPropagation VORStateCommand::AnalyseNotification(VORCommand* from,
                                                         VORNotification* notification) {
  auto* output = dynamic_cast<VORAgentOutputNotification*>(notification);
  if (output == nullptr)
    return VORDialogAgent::AnalyseNotification(from, notification);
  // An agent of another state keeps its output: it fires when its state becomes current.
  if (_running)
    Evaluate();
  return VORNotifDontPropagate;
}

void VORStateCommand::Evaluate() {
  if (_evaluating) {
    _pending = true;
    return;
  }
  VORStateCommand_var keep(this);
  _evaluating = true;
  bool again = true;
  for (int steps = 0; again && _running && steps < kMaxStepsPerEvent; ++steps) {
    again = false;
    _pending = false;
    for (const auto& t : _transitions) {
      if (t->from != _current)
        continue;
      VORDialogAgent* agent = t->condition.agent;
      if (agent != nullptr && !agent->IsOutputSet())
        continue;
      if (agent != nullptr)
        agent->ClearOutput();
      const bool accepted = t->action ? t->action(t->data) : true;
      if (!_running)
        break;
      if (!accepted)
        break;  // the command stays where it is
      if (t->to != nullptr) {
        Enter(t->to, false);
      } else if (_repeat) {
        for (auto& state : _states) {
          for (const VORDialogAgent_var& a : state->GetAgents())
            a->Reset();
        }
        Enter(_initial, false);
      } else {
        End(false);
        break;
      }
      again = true;
      break;
    }
    again = again || (_pending && _running);
  }
  _evaluating = false;
}

void VORStateCommand::SetAgentsActive() {
  for (auto& state : _states) {
    for (const VORDialogAgent_var& agent : state->GetAgents())
      agent->SetActive(false);
  }
  if (_running && _current != nullptr) {
    for (const VORDialogAgent_var& agent : _current->GetAgents())
      agent->SetActive(true);
  }
}

void VORStateCommand::End(bool cancelled) {
  VORStateCommand_var keep(this);
  // What the command's picks highlighted goes with it.
  if (VORHSO* hso = VORSelectionContext::HSO())
    hso->Empty();
  _running = false;
  _ended = true;
  _current = nullptr;
  SetAgentsActive();
  auto notification =
      VORHandle<VORCommandEndNotification>::Adopt(new VORCommandEndNotification(this, cancelled));
  DispatchNotification(notification);
  VORCommandEngine::CommandEnded(this, cancelled);
}
