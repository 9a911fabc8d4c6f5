// What the grouping and ungrouping commands ask of the process model, in the shape they ask it:
// neighbour and child lists as plain lists, the current editor's document and CSO, the
// planning look-ups of hub mode, and the error notification of a catalogue.
#pragma once

#include "VORDocument.h"
#include "VORLists.h"

class VORCSO;

namespace QELFpaGrouping {

// Activities before / after node (filter "Activity"); empty when it has no flows.
VORListValVORBaseUnknown_var Previous(VORBaseUnknown* node);
VORListValVORBaseUnknown_var Next(VORBaseUnknown* node);
// Children of an activity (filter null: every child, control nodes too).
VORListValVORBaseUnknown_var Children(VORBaseUnknown* activity, const char* filter = nullptr);
// Resources assigned to an activity (filter "Resource").
VORListValVORBaseUnknown_var Resources(VORBaseUnknown* activity);
VORListValVORBaseUnknown_var ChildProducts(VORBaseUnknown* product);
VORBaseUnknown_var FatherActivity(VORBaseUnknown* activity);
VORBaseUnknown_var FatherProduct(VORBaseUnknown* product);
// Same underlying object (null equals null).
bool SameObject(VORBaseUnknown* a, VORBaseUnknown* b);

VORDocument* CurrentDocument();
VORCSO* CurrentCSO();
// The CSO's leaves, in order.
VORListValVORBaseUnknown_var CSOLeaves();
// Empties the CSO and puts the objects into it, in order.
void FillCSO(const VORListValVORBaseUnknown_var& objects);

// Planning look-ups (hub mode): the plan type of a product, its "plantype_name" under "type",
// a plan type's attribute, the plan types allowed below one through "lumoplantypechild".
VORBaseUnknown_var PlanTypeOf(VORDocument* document, VORBaseUnknown* product);
VORUnicodeString PlanTypeNameOf(VORDocument* document, VORBaseUnknown* planType);
VORUnicodeString PlanTypeAttribute(VORDocument* document, VORBaseUnknown* planType,
                                   const char* name);
VORBaseUnknown_var FindPlanType(VORDocument* document, const VORUnicodeString& name);
VORListValVORBaseUnknown_var ValidChildPlanTypes(VORDocument* document, VORBaseUnknown* planType);
// The resource behind a product: the product itself when it is one, else its reference's.
VORBaseUnknown_var ResourceOf(VORBaseUnknown* product);
VORUnicodeString ResourcePlanTypeName(VORBaseUnknown* product);

// A blocking error notification: text and title ("title", default "Error") from catalog.
void ShowError(const char* catalog, const char* key, const char* defaultText);

}  // namespace QELFpaGrouping
