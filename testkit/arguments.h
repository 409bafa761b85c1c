/// Arguments for calls of widgets, cut from bytes.
#pragma once

#include <MW/records.h>
#include <brimol/input.h>
#include <brimol/scene.h>

#include <concepts>
#include <cstddef>
#include <cstdint>
#include <memory>
#include <memory_resource>
#include <span>
#include <string>
#include <type_traits>
#include <vector>

namespace brimol::test {

/// Turns bytes into arguments. Numbers are mostly small, now and then the ends of their type;
/// pointers are null or point to a block that is exactly as large as what stands in it, so that a
/// sanitizer sees who reads beyond. Where no byte is left, numbers are 0 and texts empty.
class Arguments {
 public:
  /// `blocks`: where they come from, which outlives this.
  explicit Arguments(std::span<const uint8_t> given,
                     std::pmr::memory_resource& blocks = *std::pmr::new_delete_resource())
      : rest(given), memory(blocks), kept(&blocks) {}

  bool isAtEnd() const { return rest.empty(); }
  /// Frees what the pointers that were taken point to.
  void forget() { kept.clear(); }

  /// The next byte.
  uint8_t byte();
  /// 0 up to, without it, `end`, of which there are at most 256.
  std::size_t below(std::size_t end) { return byte() % end; }
  /// The next bytes, as many as the first one says, or all.
  std::string bytes();
  std::string remaining();

  template <typename Type>
  std::remove_cvref_t<Type> take() {
    using Plain = std::remove_cvref_t<Type>;
    if constexpr (std::same_as<Plain, bool>) {
      return byte() % 2 != 0;
    } else if constexpr (std::integral<Plain>) {
      return static_cast<Plain>(number());
    } else if constexpr (std::is_pointer_v<Plain>) {
      return pointer<std::remove_cv_t<std::remove_pointer_t<Plain>>>();
    } else {
      return record(static_cast<Plain*>(nullptr));
    }
  }

 private:
  int32_t number();
  uint32_t unsignedNumber() { return static_cast<uint32_t>(number()); }
  char* text();
  template <typename Pointed>
  Pointed* pointer() {
    if constexpr (std::same_as<Pointed, char>) {
      return text();
    } else {
      // Handlers are not called without an event.
      if (!std::same_as<Pointed, MW::event_data> && byte() % 8 == 0) return nullptr;
      const std::pmr::polymorphic_allocator<Pointed> allocator(&memory);
      return keep(std::allocate_shared<Pointed>(allocator, take<Pointed>()));
    }
  }
  template <typename Pointed>
  Pointed* keep(std::shared_ptr<Pointed> block) {
    Pointed* const pointed = block.get();
    kept.push_back(std::move(block));
    return pointed;
  }

  // One for each record; the pointer, which is null, says which.
  SKIA_Rect record(const SKIA_Rect*);
  SKIA_Point record(const SKIA_Point*);
  SKIA_Text record(const SKIA_Text*);
  Event record(const Event*);
  MW::mouse_event record(const MW::mouse_event*);
  MW::kbd_event record(const MW::kbd_event*);
  MW::event_data record(const MW::event_data*);

  std::span<const uint8_t> rest;
  std::pmr::memory_resource& memory;
  std::pmr::vector<std::shared_ptr<const void>> kept;
};

}  // namespace brimol::test
