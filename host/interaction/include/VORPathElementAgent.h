// Agent that takes picked objects of one element type (an interface): single pick, or repeated
// picks collected into one selection. Accepted picks update the current CSO and highlight (HSO);
// the highlight is emptied when the command ends. As a CSO client the agent takes what is
// already selected when its command starts; when it can take none of it (say, the level a
// viewer was opened on), its first pick starts a new selection instead of joining that one.
#pragma once

#include "VORDialogAgent.h"
#include "VORPathElement.h"

class VORCSO;

// Behaviour words of the path agent. The repeated-picks bit is 0x040000.
namespace VORAgentBehavior {
inline constexpr int SinglePick = 0x800800;     // one pick replaces the CSO
inline constexpr int RepeatedPicks = 0x840800;  // every pick joins the CSO (also 8652800)
inline constexpr int RepeatedBit = 0x040000;
}  // namespace VORAgentBehavior

class VORPathElementAgent : public VORDialogAgent {
  VOR_DECLARE_CLASS(VORPathElementAgent, VORDialogAgent)
 public:
  explicit VORPathElementAgent(const VORString& name);

  // Only paths holding an element that answers T are taken; the value is the first such
  // element from the leaf upwards. Default: the leaf, whatever it is.
  template <class T>
  void SetElementType() {
    SetElementTest([](VORBaseUnknown* o) { return VORHandle<T>(o) != nullptr; });
  }
  void SetElementTest(std::function<bool(VORBaseUnknown*)> test) { _elementTest = std::move(test); }
  void SetBehavior(int word) { _behavior = word; }
  int GetBehavior() const { return _behavior; }
  bool IsRepeated() const { return (_behavior & VORAgentBehavior::RepeatedBit) != 0; }
  // With a client, the agent takes the current CSO when client starts.
  void AddCSOClient(VORCommand* client) { _csoClient = client; }
  VORCommand* GetCSOClient() const { return _csoClient; }
  void SetFilter(VORAgentFilter filter, void* data = nullptr);

  // The paths taken since the last Reset, in pick order. A new list, or null when there is
  // none; the caller deletes it.
  VORListValVORBaseUnknown_var* GetListOfSelectedPaths() const;
  // The path of the last pick (null when none).
  VORPathElement* GetValuePath() const;
  // The CSO that the agent feeds: the current editor's.
  VORCSO* GetCSO() const;

  // A pick offered by the engine; true when taken (type and filter passed).
  bool OfferPath(VORPathElement* path);
  // Takes the acceptable elements of the current CSO; true when any was taken.
  bool TakeCurrentSelection();

  void Reset() override;

 protected:
  ~VORPathElementAgent() override;

 private:
  VORBaseUnknown_var ElementOf(VORPathElement* path) const;
  bool Try(VORPathElement* path, bool updateCSO);

  std::function<bool(VORBaseUnknown*)> _elementTest;
  int _behavior = VORAgentBehavior::SinglePick;
  VORCommand* _csoClient = nullptr;
  VORAgentFilter _filter;
  void* _filterData = nullptr;
  VORListValVORBaseUnknown_var _selectedPaths;
  // The CSO held only what this agent refused when its command started.
  bool _selectionRefused = false;
};

VOR_DECLARE_HANDLE(VORPathElementAgent);
