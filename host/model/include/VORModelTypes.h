// Names and small value types shared by the process, product and resource model: late types,
// modification kinds, typed attribute values.
#pragma once

#include <string>

#include "VORTypes.h"
#include "VORUnicodeString.h"

// Kinds of VORSPPActivityNotification. The numbers are fixed: list commands compare them.
enum SPPModifyKind : int {
  SPPModifyNone = 0,
  SPPChildActivityChanged = 3,   // a child activity was added to or removed from the father
  SPPActivityDeleted = 8,        // the son (= father) activity was deleted
  SPPResourceAssigned = 15,      // son: the resource
  SPPResourceUnassigned = 16,    // son: the resource
  SPPItemAssigned = 17,          // son: the item
  SPPItemUnassigned = 18,        // son: the item
  SPPProductIOChanged = 29,      // son: the product input or output added or removed
  SPPProductOutputChanged = 39,  // son: the product output whose item changed
};

// Type codes of typed attribute values (user-defined attributes).
enum VORAttributeType : int {
  VORAttributeNone = 0,
  VORAttributeLong = 3,
  VORAttributeDouble = 6,
  VORAttributeString = 14,
};

struct VORAttributeValue {
  VORAttributeType type = VORAttributeNone;
  long longValue = 0;
  double doubleValue = 0.0;
  VORUnicodeString stringValue;

  static VORAttributeValue Long(long v) { return {VORAttributeLong, v, 0.0, {}}; }
  static VORAttributeValue Double(double v) { return {VORAttributeDouble, 0, v, {}}; }
  static VORAttributeValue String(const VORUnicodeString& v) {
    return {VORAttributeString, 0, 0.0, v};
  }
  friend bool operator==(const VORAttributeValue&, const VORAttributeValue&) = default;
};

// Late type names of the model (declared when vor_model is loaded).
namespace VORModelLateTypes {
inline constexpr const char* GraphNode = "SPPGraphNode";
inline constexpr const char* Activity = "SPPActivity";
inline constexpr const char* PhysicalActivity = "PhysicalActivity";
inline constexpr const char* Root = "BIWActivityRoot";
inline constexpr const char* Station = "BIWActivityStation";
inline constexpr const char* Grouping = "BIWActivityGrouping";
inline constexpr const char* Loading = "BIWActivityLoading";
inline constexpr const char* SpotWelding = "BIWActivitySpotWelding";
inline constexpr const char* StudWelding = "BIWActivityStudWelding";
inline constexpr const char* SpotGluing = "BIWActivitySpotGluing";
inline constexpr const char* ArcWelding = "BIWActivityArcWelding";
inline constexpr const char* AdhesiveApplication = "BIWActivityAdhesiveApplication";
inline constexpr const char* SealantApplication = "BIWActivitySealantApplication";
inline constexpr const char* Clinching = "BIWActivityClinching";
inline constexpr const char* ControlNode = "SPPControlNode";
inline constexpr const char* Start = "Start";
inline constexpr const char* Stop = "Stop";
inline constexpr const char* ProductInput = "ProductInput";
inline constexpr const char* ProductOutput = "ProductOutput";
inline constexpr const char* ProductIO = "SPPProductIO";
inline constexpr const char* Product = "ASMPRODUCT";
inline constexpr const char* MfgAssembly = "QELMfgAssy";
inline constexpr const char* Container = "SPPContainer";

// Declares the model's late types (idempotent; VORInitModel does it).
void Declare();
// True for the activity types the model can create (everything under "SPPActivity").
bool IsActivityType(const std::string& type);
// True for "Start", "Stop" and other "SPPControlNode" kinds.
bool IsControlNodeType(const std::string& type);
// True for the welding family ("BIWActivitySpotWelding" ... "BIWActivityClinching").
bool IsWeldingType(const std::string& type);
}  // namespace VORModelLateTypes

// Type filters understood by the model's list queries.
namespace VORModelFilters {
inline constexpr const char* Activity = "Activity";  // objects answering VORISPPActivity
inline constexpr const char* Item = "Item";          // objects answering VORISPPItem
inline constexpr const char* Resource = "Resource";  // products that are resources
inline constexpr const char* Product = "VORIProduct";
}  // namespace VORModelFilters
