#include "VORBaseUnknown.h"

#include <cstddef>
#include <cstdint>
#include <typeinfo>
#include <string_view>
#include <typeindex>
#include <unordered_map>
#include <utility>

#include <absl/container/inlined_vector.h>

#include "VORAssert.h"
#include "VORExtension.h"
#include "VORExtensionRegistry.h"

namespace {
long liveInstances = 0;

// Answers of interface casts per (complete type, interface): where the interface sits from the
// start of the complete object, or kNoInterface. Offsets are fixed per complete type, so the
// costly dynamic_cast (which compares type names across shared libraries) runs once per pair.
constexpr std::ptrdiff_t kNoInterface = PTRDIFF_MIN;
struct CastKey {
  std::type_index type;
  std::string_view iid;
  bool operator==(const CastKey&) const = default;
};
struct CastKeyHash {
  size_t operator()(const CastKey& k) const noexcept {
    return k.type.hash_code() * 31u + std::hash<std::string_view>()(k.iid);
  }
};

// In front of the answers: recent answers found by the addresses of the type's record and of
// the interface's name. Equal addresses mean an equal pair, so a hit needs no name hashing or
// comparison (the answers compare names, as each library has its own records). Both addresses
// are hashed: one library's interface names lie close together, and a type asked for several of
// them in turn must not keep evicting its own answers. Each set holds two answers, the last
// used first, so that two pairs that meet in one set still both stay.
struct RecentCast {
  const std::type_info* type = nullptr;
  const char* iid = nullptr;
  std::size_t iidLength = 0;
  std::ptrdiff_t offset = 0;
  bool Is(const std::type_info* t, const VORInterfaceId& id) const {
    return type == t && iid == id.name.data() && iidLength == id.name.size();
  }
};
constexpr int kRecentSetBits = 9;
struct RecentSet {
  RecentCast ways[2];
};

long answerLookups = 0;

std::ptrdiff_t AnswerOf(VORBaseUnknown* object, const VORInterfaceId& iid, const char* complete) {
  ++answerLookups;
  // Never destroyed: casts may run while statics of other libraries are torn down.
  static auto* answers = new std::unordered_map<CastKey, std::ptrdiff_t, CastKeyHash>();
  const CastKey key{std::type_index(typeid(*object)), iid.name};
  auto it = answers->find(key);
  if (it == answers->end()) {
    void* seen = iid.cast(object);
    const std::ptrdiff_t offset = seen ? static_cast<char*>(seen) - complete : kNoInterface;
    it = answers->emplace(key, offset).first;
  }
  return it->second;
}

void* CachedCast(VORBaseUnknown* object, const VORInterfaceId& iid) {
  // The base interface answers the identity, which is no fixed offset for extensions.
  if (iid.name == VORBaseUnknown::IID().name)
    return iid.cast(object);
  static RecentSet recent[std::size_t{1} << kRecentSetBits];
  auto* complete = static_cast<char*>(dynamic_cast<void*>(object));
  const std::type_info* type = &typeid(*object);
  const std::uintptr_t mix =
      (reinterpret_cast<std::uintptr_t>(type) ^
       reinterpret_cast<std::uintptr_t>(iid.name.data()) * 0x9E3779B97F4A7C15u) *
      0xC2B2AE3D27D4EB4Fu;
  RecentSet& set = recent[mix >> (64 - kRecentSetBits)];
  if (!set.ways[0].Is(type, iid)) {
    if (set.ways[1].Is(type, iid))
      std::swap(set.ways[0], set.ways[1]);
    else {
      set.ways[1] = set.ways[0];
      set.ways[0] =
          RecentCast{type, iid.name.data(), iid.name.size(), AnswerOf(object, iid, complete)};
    }
  }
  const std::ptrdiff_t offset = set.ways[0].offset;
  return offset == kNoInterface ? nullptr : complete + offset;
}
}  // namespace

// The data extensions of one object, created on first query. A node of a chart carries half a
// dozen, asked for on every move of the node: they sit in the set itself, and names are first
// matched by address (an interface's name is one string in the process), then by text.
class VORExtensionSet {
 public:
  ~VORExtensionSet() {
    // Destroy in reverse order of creation: later extensions may rely on earlier ones.
    for (auto it = _items.rbegin(); it != _items.rend(); ++it)
      delete it->second;
  }
  VORExtension* Find(std::string_view iid) const {
    for (const auto& [name, ext] : _items) {
      if (name.data() == iid.data() && name.size() == iid.size())
        return ext;
    }
    for (const auto& [name, ext] : _items) {
      if (name == iid)
        return ext;
    }
    return nullptr;
  }
  void Add(std::string_view iid, VORExtension* ext) { _items.emplace_back(iid, ext); }

 private:
  absl::InlinedVector<std::pair<std::string_view, VORExtension*>, 6> _items;
};

VORBaseUnknown::VORBaseUnknown() {
  ++liveInstances;
}

VORBaseUnknown::~VORBaseUnknown() {
  --liveInstances;
}

long VORBaseUnknown::LiveInstances() {
  return liveInstances;
}

long VORBaseUnknown::CastAnswerLookups() {
  return answerLookups;
}

unsigned long VORBaseUnknown::AddRef() {
  VOR_ASSERT(_refCount > 0);
  return ++_refCount;
}

unsigned long VORBaseUnknown::Release() {
  VOR_ASSERT(_refCount > 0);
  if (--_refCount == 0) {
    delete this;
    return 0;
  }
  return _refCount;
}

HRESULT VORBaseUnknown::QueryInterface(const VORInterfaceId& iid, void** out) {
  *out = nullptr;
  if (void* self = CachedCast(this, iid)) {
    AddRef();
    *out = self;
    return S_OK;
  }
  VORExtension* ext = FindDataExtension(iid);
  if (ext == nullptr) {
    VORExtensionRegistry::Entry entry = VORExtensionRegistry::Find(GetLateType(), iid);
    if (entry.factory == nullptr)
      return E_NOINTERFACE;
    ext = entry.factory();
    if (ext == nullptr)
      return E_NOINTERFACE;
    ext->Attach(this, entry.kind);
    if (entry.kind == VORExtensionKind::Data) {
      if (!_extensions)
        _extensions = std::make_unique<VORExtensionSet>();
      _extensions->Add(iid.name, ext);
    }
  } else {
    ext->AddRef();
  }
  void* seen = CachedCast(ext, iid);
  if (seen == nullptr) {
    ext->Release();
    return E_NOINTERFACE;
  }
  *out = seen;
  return S_OK;
}

VORExtension* VORBaseUnknown::FindDataExtension(const VORInterfaceId& iid) {
  return _extensions ? _extensions->Find(iid.name) : nullptr;
}
