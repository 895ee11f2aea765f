#pragma once

#include "forms/controls/Control.h"

#include <array>
#include <utility>

namespace quendra::forms {

/// "PicMenu(2)": a control array's element is named by array and index.
inline Text ElementName(TextView array, std::size_t index) {
  return Text(array) + u"(" + DecimalText(static_cast<std::int64_t>(index)) + u")";
}

template <typename Kind, typename ContainerOf, std::size_t... index>
std::array<Kind, sizeof...(index)> MakeControls(TextView name, ContainerOf containerOf,
                                                std::index_sequence<index...>) {
  return {{Kind(containerOf(index), ElementName(name, index))...}};
}

/// A control array in one container.
template <typename Kind, std::size_t count>
std::array<Kind, count> ControlArray(Container& container, TextView name) {
  return MakeControls<Kind>(
      name, [&](std::size_t) -> Container& { return container; }, std::make_index_sequence<count>());
}

/// A control array with each element on the element of another array that has the same index.
template <typename Kind, typename Holder, std::size_t count>
std::array<Kind, count> ControlArrayOn(std::array<Holder, count>& holders, TextView name) {
  return MakeControls<Kind>(
      name, [&](std::size_t index) -> Container& { return holders[index]; },
      std::make_index_sequence<count>());
}

} // namespace quendra::forms
