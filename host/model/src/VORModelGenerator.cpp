// Synthetic body-shop lines. Sub-lines (front floor, rear floor, engine compartment...) build
// sub-assemblies station by station and merge into the main underbody line; every station
// loads parts and joins them with a few joining activities, and hands its assembly on.
#include "VORModelGenerator.h"

#include <algorithm>
#include <string>
#include <vector>

#include "VORModel.h"

namespace {

// A small deterministic generator (same numbers on every platform).
class Random {
 public:
  explicit Random(std::uint32_t seed) : _state(seed * 2654435761u + 1) {}
  std::uint32_t Next() {
    _state ^= _state << 13;
    _state ^= _state >> 17;
    _state ^= _state << 5;
    return _state;
  }
  int Below(int n) { return n <= 0 ? 0 : static_cast<int>(Next() % static_cast<std::uint32_t>(n)); }

 private:
  std::uint32_t _state;
};

const char* const kJoining[] = {
    "BIWActivitySpotWelding", "BIWActivitySpotWelding",         "BIWActivitySpotWelding",
    "BIWActivityStudWelding", "BIWActivitySpotGluing",          "BIWActivityArcWelding",
    "BIWActivityClinching",   "BIWActivityAdhesiveApplication", "BIWActivitySealantApplication"};

const char* JoiningVerb(const std::string& type) {
  if (type == "BIWActivitySpotWelding")
    return "Spot weld";
  if (type == "BIWActivityStudWelding")
    return "Stud weld";
  if (type == "BIWActivitySpotGluing")
    return "Spot glue";
  if (type == "BIWActivityArcWelding")
    return "Arc weld";
  if (type == "BIWActivityClinching")
    return "Clinch";
  if (type == "BIWActivityAdhesiveApplication")
    return "Apply adhesive";
  return "Apply sealant";
}

struct Branch {
  std::string code;  // "FF"
  std::string name;  // "Front floor"
  std::vector<std::string> parts;
};

const Branch kBranches[] = {
    {"FF",
     "Front floor",
     {"Front floor panel", "Tunnel reinforcement", "Seat cross member front",
      "Seat cross member rear", "Front floor side member LH", "Front floor side member RH",
      "Heel board", "Tunnel bracket"}},
    {"RF",
     "Rear floor",
     {"Rear floor panel", "Spare wheel well", "Rear cross member", "Rear side member LH",
      "Rear side member RH", "Rear floor extension", "Jack bracket", "Tow hook plate"}},
    {"EC",
     "Engine compartment",
     {"Front rail LH", "Front rail RH", "Dash panel", "Wheelhouse LH", "Wheelhouse RH",
      "Shock tower LH", "Shock tower RH", "Cowl panel"}},
    {"SS",
     "Side sill",
     {"Sill inner LH", "Sill inner RH", "Sill reinforcement LH", "Sill reinforcement RH",
      "A-pillar lower LH", "A-pillar lower RH"}},
};
const std::vector<std::string> kMainParts = {
    "Rear end panel",          "Front bumper beam", "Battery tray", "Fuel tank bracket",
    "Underbody reinforcement", "Crash box LH",      "Crash box RH", "Floor cross member centre",
    "Gear box support",        "Rear axle bracket"};

class Builder {
 public:
  explicit Builder(const VORModelGeneratorOptions& o)
      : _o(o),
        _rnd(o.seed),
        _doc(VORProcess::CreateNew(std::string(o.lineName) + " line",
                                   o.hub ? VORDocument::HubEnvironment : "")),
        _door(_doc->GetDoor()) {}

  VORProcess* Build() {
    _root = _doc->GetRootProcess();
    _products = _doc->GetRootProduct();
    _door.SetPartNumber(_products, std::string(_o.lineName));
    _resources = _doc->GetResourceRoot();
    _door.CreateProduct(_products, std::string("Sheet metal parts"), _partsFolder);
    _door.CreateProduct(_products, std::string("Sub-assemblies"), _assemblyFolder);
    if (_o.hub)
      BuildPlanTypes();
    _door.CreateProduct(_resources, std::string(_o.lineName) + " cell", _cell);
    MakeResource(_cell, "Resource", "Line");

    // About four activities per station (the station, a loading, one to three joinings).
    const int stations = std::max(6, _o.activities / 4);
    const int mainStations = std::max(2, stations / 4);
    const int branchCount = std::clamp((stations - mainStations) / 7, 2, 60);
    const int perBranch = std::max(1, (stations - mainStations) / branchCount);

    std::vector<VORBaseUnknown_var> branchEnds;
    std::vector<VORBaseUnknown_var> branchProducts;
    for (int b = 0; b < branchCount; ++b) {
      const Branch& kind = kBranches[b % 4];
      const std::string code = kind.code + (b < 4 ? std::string() : std::to_string(b / 4 + 1));
      VORBaseUnknown_var previous, assembly;
      const size_t firstPart = _loadedParts.size();
      for (int s = 0; s < perBranch; ++s) {
        VORBaseUnknown_var station =
            Station(code, kind.name, kind.parts, s, b, assembly, previous, branchCount);
        previous = station;
      }
      // The sub-line's manufacturing assembly: its parts, handled at its last station.
      VORBaseUnknown_var ma;
      _door.CreateMfgAssembly("MA " + kind.name + (b < 4 ? std::string() : " " + code), ma);
      for (size_t k = firstPart; k < _loadedParts.size(); ++k)
        _door.AddComponent(ma, _loadedParts[k]);
      _door.AssignItem(previous, ma);
      branchEnds.push_back(previous);
      branchProducts.push_back(assembly);
      Transport(previous, code);
    }
    // Main line: the first station takes every sub-line's assembly.
    VORBaseUnknown_var previous, assembly;
    for (int s = 0; s < mainStations; ++s) {
      VORBaseUnknown_var station =
          Station("UB", "Underbody", kMainParts, s, branchCount, assembly, previous, branchCount,
                  s == 0 ? &branchProducts : nullptr);
      if (s == 0) {
        for (auto& end : branchEnds)
          _door.AddFlow(end, station);
      }
      if (s == mainStations / 2)
        Buffer(station);
      previous = station;
    }
    if (_o.withGrouping)
      Group();
    _doc->SetModified(false);
    return _doc;
  }

 private:
  void MakeResource(const VORBaseUnknown_var& p, const char* cls, const char* planType) {
    _door.MakeResource(p, cls, _o.hub ? planType : "");
  }

  VORBaseUnknown_var Part(const std::string& name) {
    VORBaseUnknown_var p;
    _door.CreateProduct(_partsFolder ? _partsFolder : _products, name, p);
    return p;
  }

  VORBaseUnknown_var Station(const std::string& code, const std::string& branchName,
                             const std::vector<std::string>& parts, int index, int row,
                             VORBaseUnknown_var& assembly, const VORBaseUnknown_var& previous,
                             int rows, const std::vector<VORBaseUnknown_var>* merged = nullptr) {
    char number[16];
    std::snprintf(number, sizeof number, "%03d", (index + 1) * 10);
    const std::string name = code + number;
    VORBaseUnknown_var station;
    _door.CreateNode(_root, "BIWActivityStation", station);
    _door.SetLabel(station, name + " " + branchName);
    const double cycle = 40 + _rnd.Below(25);
    _door.SetStationCycleTime(station, cycle);
    _door.SetActivityTime(station, cycle);
    const double column = merged || code == "UB" ? (index + 12) : index;
    const double y = code == "UB" ? (rows / 2) : row;
    _door.SetPertPosition(station, true, column * 50.0 + 12.5, y * 37.5 + 12.5);
    _door.SetPertNodeSize(station, 30, 15);
    if (previous)
      _door.AddFlow(previous, station);

    // Loading: the incoming assembly (or assemblies) plus one or two new parts.
    VORBaseUnknown_var loading;
    _door.CreateNode(station, "BIWActivityLoading", loading);
    std::vector<VORBaseUnknown_var> incoming;
    if (merged)
      incoming = *merged;
    else if (assembly)
      incoming.push_back(assembly);
    const int newParts = 1 + _rnd.Below(2);
    std::vector<VORBaseUnknown_var> loaded;
    for (int k = 0; k < newParts; ++k) {
      const std::string& part = parts[static_cast<size_t>((index * 2 + k) % parts.size())];
      loaded.push_back(Part(part + (index * 2 + k >= static_cast<int>(parts.size())
                                        ? " " + std::to_string((index * 2 + k) / parts.size() + 1)
                                        : std::string())));
    }
    _loadedParts.insert(_loadedParts.end(), loaded.begin(), loaded.end());
    _door.SetLabel(loading, "Load " + name);
    _door.SetActivityTime(loading, 8 + _rnd.Below(6));
    _door.SetPertPosition(loading, true, 12.5, 12.5);
    for (auto& item : incoming) {
      VORBaseUnknown_var in, inLoad;
      _door.AddProductIO(station, item, true, in);
      _door.AssignItem(station, item, in);
      _door.AddProductIO(loading, item, true, inLoad);
    }
    for (auto& item : loaded) {
      VORBaseUnknown_var in, inLoad;
      _door.AddProductIO(station, item, true, in);
      _door.AssignItem(station, item, in);
      _door.AddProductIO(loading, item, true, inLoad);
      _door.AssignItem(loading, item, inLoad);
    }
    // The station's result.
    VORBaseUnknown_var result;
    _door.CreateProduct(_assemblyFolder, branchName + " assembly " + name, result);
    VORBaseUnknown_var out;
    _door.AddProductIO(station, result, false, out);
    assembly = result;

    // Joining: one to three activities with robots and guns.
    VORBaseUnknown_var stationResource;
    _door.CreateProduct(_cell, name, stationResource);
    MakeResource(stationResource, "Station", "Station");
    _door.AssignResource(station, stationResource);
    VORBaseUnknown_var fixture;
    _door.CreateProduct(stationResource, name + " fixture", fixture);
    MakeResource(fixture, "Fixture", "Fixture");
    _door.AssignResource(loading, fixture);  // the station itself keeps one level of resources
    if (index % 3 == 0) {
      VORBaseUnknown_var worker;
      _door.CreateProduct(stationResource, name + " operator", worker);
      MakeResource(worker, "Worker", "Worker");
      _door.AssignResource(loading, worker);
    }
    VORBaseUnknown_var last = loading;
    const int joins = 1 + _rnd.Below(3);
    for (int j = 0; j < joins; ++j) {
      const std::string type = kJoining[_rnd.Below(9)];
      VORBaseUnknown_var join;
      _door.CreateNode(station, type.c_str(), join);
      _door.SetLabel(join,
                     std::string(JoiningVerb(type)) + " " + name + "-" + std::to_string(j + 1));
      _door.SetActivityTime(join, 10 + _rnd.Below(20));
      _door.SetPertPosition(join, true, 12.5 + 50.0 * (j + 1), 12.5);
      _door.AddFlow(last, join);
      last = join;
      VORBaseUnknown_var robot, gun;
      _door.CreateProduct(stationResource, name + " robot R" + std::to_string(j + 1), robot);
      MakeResource(robot, "Robot", "Robot");
      _door.CreateProduct(robot, name + " gun G" + std::to_string(j + 1), gun);
      MakeResource(gun, "WeldGun", "WeldGun");
      _door.AssignResource(join, robot);
      _door.AssignResource(join, gun);
      if (j + 1 == joins) {
        VORBaseUnknown_var joinOut;
        _door.AddProductIO(join, result, false, joinOut);
      }
    }
    if (_o.hub) {
      _door.SetUserAttribute(station, "Shift", VORAttributeValue::Long(1 + index % 3));
      _door.SetUserAttribute(station, "Invest",
                             VORAttributeValue::Double(250000.0 + 1000.0 * index));
      _door.SetHubAttribute(stationResource, "Invest", VORAttributeValue::Double(1.2e5 + index));
      _door.SetHubAttribute(stationResource, "Responsible",
                            VORAttributeValue::String("Planner " + std::to_string(1 + index % 4)));
    }
    return station;
  }

  void Transport(const VORBaseUnknown_var& station, const std::string& code) {
    VORBaseUnknown_var transport;
    _door.CreateProduct(_cell, code + " transfer conveyor", transport);
    MakeResource(transport, "Transport", "Transport");
    _door.AssignResource(station, transport);
  }

  void Buffer(const VORBaseUnknown_var& station) {
    VORBaseUnknown_var buffer;
    _door.CreateProduct(_cell, "Underbody buffer", buffer);
    MakeResource(buffer, "Buffer", "Buffer");
    _door.AssignResource(station, buffer);
  }

  // Groups the last two main-line stations: copies them under a grouping activity with Start and
  // Stop, re-links the outside flows to the group and removes the originals.
  void Group() {
    VORListValVORBaseUnknown_var* children = nullptr;
    VORISPPChildManagement_var(_root)->GetChildren(children, "BIWActivityStation");
    if (children->Size() < 3) {
      delete children;
      return;
    }
    VORListValVORBaseUnknown_var selected;
    selected.Append((*children)[children->Size() - 1]);
    selected.Append((*children)[children->Size()]);
    delete children;
    VORISPPFlowMgt_var first(selected[1]);
    VORListValVORBaseUnknown_var* previous = nullptr;
    first->GetPreviousActivities(previous, "Activity");
    VORBaseUnknown_var group;
    _door.CreateNode(_root, "BIWActivityGrouping", group);
    _door.SetLabel(group, std::string("Respot group"));
    double x = 0, y = 0;
    VORIGraphNodeLayout_var(selected[1])->GetPertPosition(x, y);
    _door.SetPertPosition(group, true, x, y);
    _door.SetPertNodeState(group, 2);
    for (int i = 1; i <= previous->Size(); ++i) {
      _door.RemoveFlow((*previous)[i], selected[1]);
      _door.AddFlow((*previous)[i], group);
    }
    delete previous;
    VORListValVORBaseUnknown_var copies;
    VORSPPCopyServices::CopyActivities(selected, group, copies);
    VORBaseUnknown_var start, stop;
    _door.CreateNode(group, "Start", start, 1);
    _door.CreateNode(group, "Stop", stop);
    _door.SetPertPosition(start, true, -12.5, 12.5);
    _door.SetPertPosition(stop, true, 137.5, 12.5);
    _door.AddFlow(start, copies[1]);
    _door.AddFlow(copies[copies.Size()], stop);
    double cycle = 0;
    VORBaseUnknown_var groupResource;
    _door.CreateProduct(_cell, std::string("Respot group"), groupResource);
    MakeResource(groupResource, "Station", "Group");
    for (int i = 1; i <= copies.Size(); ++i) {
      double t = 0;
      QELIBIWActivityStation_var(copies[i])->GetStationCycleTime(t);
      cycle = std::max(cycle, t);
      VORListValVORBaseUnknown_var* res = nullptr;
      VORISPPResourceManagement_var(copies[i])->GetResources(res, "Station");
      for (int r = 1; r <= res->Size(); ++r)
        VORSPPReparentService::ReparentResource((*res)[r], groupResource, nullptr, nullptr);
      delete res;
    }
    _door.SetActivityTime(group, cycle);
    _door.AssignResource(group, groupResource);
    VORSPPCopyServices::RemoveActivities(selected);
  }

  void BuildPlanTypes() {
    struct Def {
      const char* name;
      const char* compclass;
    };
    const Def defs[] = {
        {"Line", "lumocompplantdefault"},    {"Station", "lumocompplantstation"},
        {"Group", "lumocompplantstation"},   {"Robot", "lumocompplantdefault"},
        {"WeldGun", "lumocompplantdefault"}, {"Fixture", "lumocompplantdefault"},
        {"Worker", "lumocompplantworker"},   {"Transport", "lumocompplanttransport"},
        {"Buffer", "lumocompplantbuffer"},   {"Organisation", "lumocomporgplant"}};
    for (const Def& d : defs) {
      VORBaseUnknown_var t;
      _door.DefinePlanType(d.name, t);
      _door.SetPlanTypeAttribute(t, "", "compclass", d.compclass);
      _door.SetPlanTypeAttribute(t, "type", "plantype_name", d.name);
      _planTypes.push_back(t);
    }
    auto T = [&](const char* name) {
      for (size_t i = 0; i < std::size(defs); ++i) {
        if (std::string(defs[i].name) == name)
          return _planTypes[i];
      }
      return VORBaseUnknown_var();
    };
    const char* rel = "lumoplantypechild";
    for (const char* c : {"Station", "Group", "Transport", "Buffer", "Worker"})
      _door.AddPlanTypeRelation(T("Line"), rel, T(c));
    for (const char* c : {"Station", "Robot", "Worker", "Fixture"})
      _door.AddPlanTypeRelation(T("Group"), rel, T(c));
    for (const char* c : {"Robot", "Fixture", "Worker"})
      _door.AddPlanTypeRelation(T("Station"), rel, T(c));
    _door.AddPlanTypeRelation(T("Robot"), rel, T("WeldGun"));
    _door.AddPlanTypeRelation(T("Fixture"), rel, T("Worker"));
  }

  const VORModelGeneratorOptions& _o;
  Random _rnd;
  VORProcess* _doc;
  VORModelDoor& _door;
  VORBaseUnknown_var _root, _products, _resources, _cell, _partsFolder, _assemblyFolder;
  std::vector<VORBaseUnknown_var> _planTypes;
  std::vector<VORBaseUnknown_var> _loadedParts;
};

}  // namespace

VORProcess* VORModelGenerator::Generate(const VORModelGeneratorOptions& options) {
  return Builder(options).Build();
}
