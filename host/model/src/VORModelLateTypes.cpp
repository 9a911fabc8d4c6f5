// The model's late types, declared by VORInitModel.
#include <array>
#include <string_view>

#include "VORLateTypes.h"
#include "VORModelTypes.h"

namespace VORModelLateTypes {

namespace {
constexpr std::array<const char*, 7> kWelding = {
    SpotWelding,         StudWelding,        SpotGluing, ArcWelding,
    AdhesiveApplication, SealantApplication, Clinching};
}  // namespace

void Declare() {
  VORLateTypes::Declare(GraphNode, "");
  VORLateTypes::Declare(Activity, GraphNode);
  VORLateTypes::Declare(PhysicalActivity, Activity);
  VORLateTypes::Declare(Root, Activity);
  for (const char* t : {Station, Grouping, Loading})
    VORLateTypes::Declare(t, PhysicalActivity);
  for (const char* t : kWelding)
    VORLateTypes::Declare(t, PhysicalActivity);
  VORLateTypes::Declare(ControlNode, GraphNode);
  VORLateTypes::Declare(Start, ControlNode);
  VORLateTypes::Declare(Stop, ControlNode);
  VORLateTypes::Declare(ProductIO, "");
  VORLateTypes::Declare(ProductInput, ProductIO);
  VORLateTypes::Declare(ProductOutput, ProductIO);
  VORLateTypes::Declare(Product, "");
  VORLateTypes::Declare(MfgAssembly, "");
  VORLateTypes::Declare(Container, "");
}

bool IsActivityType(const std::string& type) {
  return type != Activity && type != PhysicalActivity && VORLateTypes::IsKindOf(type, Activity);
}

bool IsControlNodeType(const std::string& type) {
  return type != ControlNode && VORLateTypes::IsKindOf(type, ControlNode);
}

bool IsWeldingType(const std::string& type) {
  for (const char* t : kWelding) {
    if (type == t)
      return true;
  }
  return false;
}

}  // namespace VORModelLateTypes
