// Precedence flows between sibling graph nodes, and the product inputs/outputs of an activity.
// Control nodes answer the flow part; their product IO calls fail with E_NOTIMPL.
#pragma once

#include <type_traits>

#include "VORHandle.h"
#include "VORLists.h"

class VORISPPFlowMgt : public virtual VORBaseUnknown {
  VOR_DECLARE_INTERFACE(VORISPPFlowMgt)
 public:
  // New lists the caller deletes, in link order. filter "Activity" keeps activities only
  // (control nodes are skipped); null or "" keeps every graph node.
  virtual HRESULT GetPreviousActivities(VORListValVORBaseUnknown_var*& previous,
                                        const char* filter = "Activity") = 0;
  virtual HRESULT GetNextActivities(VORListValVORBaseUnknown_var*& next,
                                    const char* filter = "Activity") = 0;
  // The same nodes in the same order, handed one by one to visit without building a list: for
  // callers that walk the flows of every node of a level. visit must not change the flows.
  template <class Visit>
  void ForEachPreviousActivity(Visit&& visit, const char* filter = "Activity") {
    VisitActivities(false, &CallVisit<Visit>, &visit, filter);
  }
  template <class Visit>
  void ForEachNextActivity(Visit&& visit, const char* filter = "Activity") {
    VisitActivities(true, &CallVisit<Visit>, &visit, filter);
  }
  // Links this -> next. E_INVALIDARG when next is not a sibling graph node or is this node;
  // S_FALSE (no change) when the link exists.
  virtual HRESULT AddNextActivity(VORBaseUnknown* next) = 0;
  // Removes the link between this node and other, whichever way it goes. S_FALSE when none.
  virtual HRESULT RemoveLink(VORBaseUnknown* other) = 0;

  // Product inputs / outputs ("ProductInput" / "ProductOutput" objects answering
  // VORISPPProductIO), new lists the caller deletes, in creation order.
  virtual HRESULT GetProductInputs(VORListValVORBaseUnknown_var*& inputs) = 0;
  virtual HRESULT GetProductOutputs(VORListValVORBaseUnknown_var*& outputs) = 0;
  // As GetProductInputs, appended to a list the caller holds (untouched on failure).
  virtual HRESULT AppendProductInputs(VORListValVORBaseUnknown_var& inputs) = 0;
  // Inputs then outputs.
  virtual HRESULT GetProductIOs(VORListValVORBaseUnknown_var*& productIOs) = 0;
  // item: a product or a manufacturing assembly of the same document. Emits kind 29.
  virtual HRESULT AddProductInput(VORBaseUnknown* item, VORBaseUnknown_var& productInput) = 0;
  virtual HRESULT AddProductOutput(VORBaseUnknown* item, VORBaseUnknown_var& productOutput) = 0;
  // Removes an input or output of this activity; item assignments made with it stay, without
  // their input.
  // Emits kind 29.
  virtual HRESULT RemoveProductIO(VORBaseUnknown* productIO) = 0;

 protected:
  // next: the next activities, else the previous ones. The default walks the new list.
  virtual void VisitActivities(bool next, void (*visit)(void*, VORBaseUnknown*), void* context,
                               const char* filter) {
    VORListValVORBaseUnknown_var* list = nullptr;
    if (SUCCEEDED(next ? GetNextActivities(list, filter) : GetPreviousActivities(list, filter)) &&
        list != nullptr) {
      for (const VORBaseUnknown_var& node : *list)
        visit(context, node.get());
    }
    delete list;
  }

 private:
  template <class Visit>
  static void CallVisit(void* context, VORBaseUnknown* node) {
    (*static_cast<std::remove_reference_t<Visit>*>(context))(node);
  }
};
VOR_DECLARE_HANDLE(VORISPPFlowMgt);
