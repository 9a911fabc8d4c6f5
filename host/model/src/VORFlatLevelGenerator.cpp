// Flat generated levels: the shape of the large lines the viewer has to open and organise fast.
#include <string>
#include <vector>

#include "VORModel.h"
#include "VORModelGenerator.h"

VORProcess* VORModelGenerator::GenerateFlatLevel(int stations, bool withParts,
                                                 const char* lineName) {
  constexpr int kLanes = 4;
  VORProcess* doc = VORProcess::CreateNew(lineName);
  VORModelDoor& door = doc->GetDoor();
  VORBaseUnknown_var root = doc->GetRootProcess();
  const int length = stations / kLanes;
  std::vector<VORBaseUnknown_var> nodes(static_cast<size_t>(length * kLanes));
  VORBaseUnknown_var parts, assemblies, cell;
  if (withParts) {
    door.CreateProduct(doc->GetRootProduct(), VORUnicodeString("Parts"), parts);
    door.CreateProduct(doc->GetRootProduct(), VORUnicodeString("Assemblies"), assemblies);
    door.CreateProduct(doc->GetResourceRoot(), VORUnicodeString("Cell"), cell);
    door.MakeResource(cell, VORUnicodeString("Resource"), VORUnicodeString(""));
  }
  for (size_t i = 0; i < nodes.size(); ++i) {
    const std::string n = std::to_string(i + 1);
    door.CreateNode(root, "BIWActivityStation", nodes[i]);
    door.SetLabel(nodes[i], VORUnicodeString("S" + n));
    if (!withParts)
      continue;
    VORBaseUnknown_var part, assembly, resource, in, out;
    door.CreateProduct(parts, VORUnicodeString("Part " + n), part);
    door.AddProductIO(nodes[i], part, true, in);
    door.AssignItem(nodes[i], part, in);
    door.CreateProduct(assemblies, VORUnicodeString("Assembly " + n), assembly);
    door.AddProductIO(nodes[i], assembly, false, out);
    door.CreateProduct(cell, VORUnicodeString("Station " + n), resource);
    door.MakeResource(resource, VORUnicodeString("Station"), VORUnicodeString(""));
    door.AssignResource(nodes[i], resource);
  }
  auto at = [&](int lane, int step) { return nodes[static_cast<size_t>(lane * length + step)]; };
  for (int lane = 0; lane < kLanes; ++lane) {
    for (int step = 0; step + 1 < length; ++step) {
      door.AddFlow(at(lane, step), at(lane, step + 1));
      if (step % 10 == 9)
        door.AddFlow(at(lane, step), at((lane + 1) % kLanes, step + 1));
    }
  }
  return doc;
}
