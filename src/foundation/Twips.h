#pragma once

namespace quendra::foundation {

/// Forms are laid out on a grid of pixels of 15 twips.
constexpr int Px(int pixels) { return pixels * 15; }

} // namespace quendra::foundation
