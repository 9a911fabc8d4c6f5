#include "QELListZitBltCmdHelpers.h"

#include "QELBaseScrollListZitBltRep.h"
#include "VORISPPItem.h"
#include "VORISPPProductIO.h"
#include "VORISpecObject.h"
#include "VORScratchList.h"

VORUnicodeString QELTypeNameOf(VORBaseUnknown* object) {
  VORUnicodeString typeName;
  if (VORISpecObject_var spec{VORBaseUnknown_var(object)}; spec)
    spec->GetTypeName(typeName);
  return typeName;
}

bool QELIsItemOfType(VORBaseUnknown* object, std::initializer_list<const char*> types) {
  if (!VORISPPItem_var(VORBaseUnknown_var(object)))
    return false;
  const VORUnicodeString typeName = QELTypeNameOf(object);
  for (const char* type : types) {
    if (typeName == VORUnicodeString(type))
      return true;
  }
  return false;
}

void QELAppendAssignedInputs(VORISPPFlowMgt* flow, VORListValVORBaseUnknown_var& assigned,
                             QELBaseScrollListZitBltRep* rep,
                             QELIListZitBltItemState::AssignState state) {
  VORScratchList inputs;
  if (flow == nullptr || FAILED(flow->AppendProductInputs(*inputs)))
    return;
  for (const VORBaseUnknown_var& input : *inputs) {
    VORISPPProductIO_var io(input);
    VORBaseUnknown_var item;
    if (io)
      io->GetItem(item);
    const int position = item ? assigned.Locate(item) : 0;
    if (position == 0)
      continue;
    rep->AppendItem(input.get(), state);
    assigned.RemovePosition(position);
  }
}
