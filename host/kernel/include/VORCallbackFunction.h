// The callable an event publisher keeps per callback. Like a move-only std::function, but a
// callable of up to kInlineSize bytes (a subscriber with a member-function pointer, a lambda
// holding a few pointers or a std::function) lives inside it: a chart registers tens of
// callbacks per node, and a heap block for each of them made opening a large level slow.
#pragma once

#include <cstddef>
#include <new>
#include <string>
#include <type_traits>
#include <utility>

#include "VORNotification.h"

using VORCallbackId = unsigned int;  // 0 means none

class VORCallbackFunction {
 public:
  // publisher, event name, notification, client data, callback id
  using Signature = void(VORBaseUnknown* publisher, const std::string& event,
                         VORNotification* notification, void* clientData, VORCallbackId id);
  static constexpr std::size_t kInlineSize = 40;

  VORCallbackFunction() noexcept = default;
  VORCallbackFunction(std::nullptr_t) noexcept {}  // NOLINT(google-explicit-constructor)

  template <class F, class = std::enable_if_t<
                         !std::is_same_v<std::decay_t<F>, VORCallbackFunction> &&
                         std::is_invocable_r_v<void, std::decay_t<F>&, VORBaseUnknown*,
                                               const std::string&, VORNotification*, void*,
                                               VORCallbackId>>>
  VORCallbackFunction(F&& f) {  // NOLINT(google-explicit-constructor)
    using Callable = std::decay_t<F>;
    if constexpr (std::is_pointer_v<Callable> || std::is_member_pointer_v<Callable>) {
      if (f == nullptr)
        return;
    }
    if constexpr (FitsInline<Callable>()) {
      ::new (static_cast<void*>(_storage)) Callable(std::forward<F>(f));
      _ops = &InlineOps<Callable>;
    } else {
      *reinterpret_cast<Callable**>(_storage) = new Callable(std::forward<F>(f));
      _ops = &HeapOps<Callable>;
    }
  }

  VORCallbackFunction(VORCallbackFunction&& other) noexcept { TakeFrom(other); }
  VORCallbackFunction& operator=(VORCallbackFunction&& other) noexcept {
    if (this != &other) {
      Reset();
      TakeFrom(other);
    }
    return *this;
  }
  VORCallbackFunction& operator=(std::nullptr_t) noexcept {
    Reset();
    return *this;
  }
  VORCallbackFunction(const VORCallbackFunction&) = delete;
  VORCallbackFunction& operator=(const VORCallbackFunction&) = delete;
  ~VORCallbackFunction() { Reset(); }

  explicit operator bool() const noexcept { return _ops != nullptr; }

  void operator()(VORBaseUnknown* publisher, const std::string& event,
                  VORNotification* notification, void* clientData, VORCallbackId id) const {
    _ops->call(const_cast<unsigned char*>(_storage), publisher, event, notification, clientData,
               id);
  }

 private:
  struct Ops {
    void (*call)(void* storage, VORBaseUnknown*, const std::string&, VORNotification*, void*,
                 VORCallbackId);
    void (*move)(void* from, void* to) noexcept;  // leaves from destroyed
    void (*destroy)(void* storage) noexcept;
  };

  template <class C>
  static constexpr bool FitsInline() {
    return sizeof(C) <= kInlineSize && alignof(C) <= alignof(std::max_align_t) &&
           std::is_nothrow_move_constructible_v<C>;
  }

  template <class C>
  static constexpr Ops InlineOps = {
      [](void* s, VORBaseUnknown* p, const std::string& e, VORNotification* n, void* d,
         VORCallbackId id) { (*static_cast<C*>(s))(p, e, n, d, id); },
      [](void* from, void* to) noexcept {
        ::new (to) C(std::move(*static_cast<C*>(from)));
        static_cast<C*>(from)->~C();
      },
      [](void* s) noexcept { static_cast<C*>(s)->~C(); }};

  template <class C>
  static constexpr Ops HeapOps = {
      [](void* s, VORBaseUnknown* p, const std::string& e, VORNotification* n, void* d,
         VORCallbackId id) { (**static_cast<C**>(s))(p, e, n, d, id); },
      [](void* from, void* to) noexcept { *static_cast<C**>(to) = *static_cast<C**>(from); },
      [](void* s) noexcept { delete *static_cast<C**>(s); }};

  void TakeFrom(VORCallbackFunction& other) noexcept {
    if (other._ops != nullptr) {
      other._ops->move(other._storage, _storage);
      _ops = other._ops;
      other._ops = nullptr;
    }
  }
  void Reset() noexcept {
    if (_ops != nullptr) {
      const Ops* ops = _ops;
      _ops = nullptr;
      ops->destroy(_storage);
    }
  }

  alignas(std::max_align_t) unsigned char _storage[kInlineSize];
  const Ops* _ops = nullptr;
};
