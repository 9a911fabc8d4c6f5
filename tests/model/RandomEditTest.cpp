// Random sequences of changes through the model's door: after every step the invariant checker
// accepts the document, and undoing the whole sequence gives back the starting document byte for
// byte. PFV_RANDOM_EDITS sets the number of steps (scripts/random-edits runs a long sequence).
#include <cstdlib>
#include <random>

#include "ModelTestSupport.h"

namespace {

namespace T = VORModelLateTypes;
using Pool = std::vector<VORBaseUnknown_var>;

class RandomEditor {
 public:
  RandomEditor(SmallLine& line, std::uint32_t seed) : _door(line.doc->GetDoor()), _random(seed) {
    _fathers = {line.root, line.s2, line.group};
    _nodes = {line.s1, line.s2, line.s3, line.load, line.weld, line.inner, line.start, line.stop};
    _activities = {line.s1, line.s2, line.s3, line.load, line.weld, line.inner, line.group};
    _products = {line.panel, line.bracket, line.floor};
    _resources = {line.robot, line.gun};
    _ios = {line.s2In, line.s2Out};
  }

  // One random change; returns its name and whether the door accepted it.
  std::string Step(bool& accepted) {
    HRESULT hr = S_OK;
    std::string what;
    switch (Below(14)) {
      case 0: {
        static const char* types[] = {T::Station, T::Loading, T::SpotWelding, T::Start, T::Stop};
        const char* type = types[Below(5)];
        VORBaseUnknown_var node;
        what = std::string("create ") + type;
        hr = _door.CreateNode(Pick(_fathers), type, node, static_cast<int>(Below(3)));
        if (SUCCEEDED(hr)) {
          _nodes.push_back(node);
          if (std::string(type) != T::Start && std::string(type) != T::Stop)
            _activities.push_back(node);
          if (std::string(type) == T::Station)
            _fathers.push_back(node);
        }
        break;
      }
      case 1:
        what = "remove node";
        hr = _door.RemoveNode(Pick(_nodes));
        break;
      case 2:
      case 3:
        what = "add flow";
        hr = _door.AddFlow(Pick(_nodes), Pick(_nodes));
        break;
      case 4:
        what = "remove flow";
        hr = _door.RemoveFlow(Pick(_nodes), Pick(_nodes));
        break;
      case 5:
        what = "assign item";
        hr = Below(2) ? _door.AssignItem(Pick(_activities), Pick(_products))
                      : _door.UnassignItem(Pick(_activities), Pick(_products));
        break;
      case 6:
        what = "assign resource";
        hr = Below(2) ? _door.AssignResource(Pick(_activities), Pick(_resources))
                      : _door.UnassignResource(Pick(_activities), Pick(_resources));
        break;
      case 7: {
        what = "product IO";
        VORBaseUnknown_var io;
        hr = _door.AddProductIO(Pick(_activities), Pick(_products), Below(2) == 0, io);
        if (SUCCEEDED(hr))
          _ios.push_back(io);
        break;
      }
      case 8:
        what = "remove product IO";
        hr = _door.RemoveProductIO(Pick(_ios));
        break;
      case 9: {
        what = "create product";
        VORBaseUnknown_var p;
        hr = _door.CreateProduct(Pick(_products), VORUnicodeString("Part"), p);
        if (SUCCEEDED(hr))
          _products.push_back(p);
        break;
      }
      case 10:
        what = "reparent product";
        hr = _door.ReparentProduct(Pick(_products), Pick(_products));
        break;
      case 11:
        what = "move";
        hr = _door.SetPertPosition(Pick(_nodes), Below(5) != 0, Below(2000) / 4.0,
                                   Below(2000) / 8.0);
        break;
      case 12:
        what = "time and label";
        hr = _door.SetActivityTime(Pick(_activities), Below(100) - 10.0);
        if (SUCCEEDED(hr))
          hr = _door.SetLabel(Pick(_nodes), VORUnicodeString("L" + std::to_string(Below(50))));
        break;
      default:
        what = "remove product";
        hr = _door.RemoveProduct(Pick(_products));
        break;
    }
    accepted = SUCCEEDED(hr);
    return what;
  }

 private:
  std::uint32_t Below(std::uint32_t n) {
    return std::uniform_int_distribution<std::uint32_t>(0, n - 1)(_random);
  }
  VORBaseUnknown* Pick(const Pool& pool) {
    return pool[Below(static_cast<std::uint32_t>(pool.size()))].get();
  }

  VORModelDoor& _door;
  std::mt19937 _random;
  Pool _fathers, _nodes, _activities, _products, _resources, _ios;
};

int Steps() {
  const char* text = std::getenv("PFV_RANDOM_EDITS");
  return text ? std::atoi(text) : 400;
}

}  // namespace

TEST(RandomEditTest, EveryStepKeepsTheInvariantsAndUndoingAllRestoresTheBytes) {
  for (std::uint32_t seed : {1u, 2u, 3u}) {
    SCOPED_TRACE("seed " + std::to_string(seed));
    SmallLine line;
    const std::string before = line.doc->SaveToString();
    VORModelDoor& door = line.doc->GetDoor();
    VORChangeLog log;
    door.SetRecorder(&log);
    RandomEditor editor(line, seed);
    int accepted = 0;
    const int steps = Steps();
    for (int i = 0; i < steps; ++i) {
      bool ok = false;
      const std::string what = editor.Step(ok);
      accepted += ok;
      std::vector<std::string> problems;
      ASSERT_TRUE(VORModelChecker::Check(line.doc.get(), problems))
          << "step " << i << " (" << what << "): " << problems.front();
    }
    EXPECT_GT(accepted, steps / 5) << "the sequence changed too little to prove anything";
    door.SetRecorder(nullptr);
    EXPECT_NE(line.doc->SaveToString(), before);
    door.Undo(log);
    std::vector<std::string> problems;
    EXPECT_TRUE(VORModelChecker::Check(line.doc.get(), problems));
    EXPECT_EQ(line.doc->SaveToString(), before);
  }
}
